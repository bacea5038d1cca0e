// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Values that are too long for a line, as they are shown and as they are compared.

#include "reference_host/cliphost/AafTree.h"
#include "reference_host/cliphost/TreeDifferences.h"
#include "tests/unit/aaf_library/objects/TransientFile.h"

namespace {

using aaf_test::As;
using aaf_test::Ptr;
using cliphost::FactOf;
using cliphost::LongValues;
using cliphost::ObjectReader;

class AafLongValues : public aaf_test::TransientFile {
protected:
    // A sound with so many bytes of peaks, the last of which is this.
    Ptr<IAAFObject> Sound(std::size_t size, aafUInt8 last) {
        const auto sound = Make<IAAFPCMDescriptor>(AUID_AAFPCMDescriptor);
        EXPECT_EQ(AAFRESULT_SUCCESS, sound->Initialize());
        std::vector<aafUInt8> bytes(size, 7);
        bytes.back() = last;
        aafUInt32 written = 0;
        EXPECT_EQ(AAFRESULT_SUCCESS, sound->WritePeakEnvelopeData(static_cast<aafUInt32>(size),
                                                                  bytes.data(), &written));
        return As<IAAFObject>(sound);
    }
    // A picture with so many lines in its map, the last of which is this.
    Ptr<IAAFObject> Picture(std::size_t count, aafInt32 last) {
        const auto picture = Make<IAAFCDCIDescriptor>(AUID_AAFCDCIDescriptor);
        EXPECT_EQ(AAFRESULT_SUCCESS, picture->Initialize());
        std::vector<aafInt32> lines(count, 7);
        lines.back() = last;
        EXPECT_EQ(AAFRESULT_SUCCESS, As<IAAFDigitalImageDescriptor>(picture)->SetVideoLineMap(
                                         static_cast<aafUInt32>(count), lines.data()));
        return As<IAAFObject>(picture);
    }
    static std::string Peaks(IAAFObject* sound, LongValues form) {
        return FactOf(ObjectReader(form).Read(sound), "PeakEnvelopeData");
    }
    static std::string Lines(IAAFObject* picture, LongValues form) {
        return FactOf(ObjectReader(form).Read(picture), "VideoLineMap");
    }
};

TEST_F(AafLongValues, OfStreamsAreShownByTheirSize) {
    EXPECT_EQ(Peaks(Sound(200'001, 1), LongValues::Cut), "200001 bytes");
}

TEST_F(AafLongValues, OfStreamsAreComparedToTheLastByte) {
    const std::string one = Peaks(Sound(200'001, 1), LongValues::Digested);
    EXPECT_EQ(one.rfind("200001 bytes, digest ", 0), 0u) << one;
    EXPECT_EQ(one, Peaks(Sound(200'001, 1), LongValues::Digested));
    EXPECT_NE(one, Peaks(Sound(200'001, 2), LongValues::Digested));
}

TEST_F(AafLongValues, OfListsAreShownByTheirFirstElements) {
    const std::string lines = Lines(Picture(1000, 1), LongValues::Cut);
    EXPECT_NE(lines.find("7, 7, ... 1000 in all]"), std::string::npos) << lines;
    EXPECT_EQ(lines, Lines(Picture(1000, 2), LongValues::Cut));
}

TEST_F(AafLongValues, OfListsAreComparedToTheLastElement) {
    const std::string one = Lines(Picture(1000, 1), LongValues::Digested);
    EXPECT_EQ(one, Lines(Picture(1000, 1), LongValues::Digested));
    EXPECT_NE(one, Lines(Picture(1000, 2), LongValues::Digested));
    EXPECT_NE(one, Lines(Picture(1001, 1), LongValues::Digested));
    EXPECT_EQ(Lines(Picture(64, 1), LongValues::Digested), Lines(Picture(64, 1), LongValues::Cut))
        << "that is short enough";
}

TEST_F(AafLongValues, AreReadFromTheStartWhereverTheLastReaderStopped) {
    const Ptr<IAAFObject> sound = Sound(10, 1);
    EXPECT_EQ(Peaks(sound, LongValues::Digested), Peaks(sound, LongValues::Digested));
}

TEST_F(AafLongValues, OfAnObjectAloneAreReadWithoutWhatItHolds) {
    const auto header = As<IAAFObject>(header_);
    const cliphost::TreeNode alone = ObjectReader().ReadAlone(header);
    EXPECT_EQ(alone.title, "Header");
    EXPECT_FALSE(alone.facts.empty());
    EXPECT_TRUE(alone.branches.empty());
}

}  // namespace
