// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Refuses the n-th call of a description, for every n, and looks at what is
// left: a code that callers know, no object, no output, and a road that works
// the next time.

#include <functional>

#include "source/aaf/NewAAFFromMovie.h"
#include "tests/unit/aaf/support/AAFTest.h"

namespace NMA::Impl {
namespace {

// A code that no part of the module makes, so that it is known when it comes
// back.
const HRESULT kRefusal = static_cast<HRESULT>(0x8012FFFEu);

class FaultSweepTest : public AAFTest {
protected:
    // The richest clip: native or provider picture, alpha, two kinds of sound,
    // two timecode tracks, vendor colour.
    void MakeClip() {
        clip.reset(new FakeClip("\\media\\a clip.mov", host, &journal));
        clip->sound.resize(2);
        clip->sound[1].qtTrack = 9;
        clip->sound[1].native = 0;
        if (syntheticTimecode) {
            return;
        }
        clip->timecode.resize(2);
        clip->timecode[1].qtTrack = 4;
        clip->color().hasVendorMetadata = true;
        clip->setAlpha(true, false);
        MakeNative(code);
    }
    // Runs one description; gives its result.
    NCFRESULT Describe() {
        MakeClip();
        IAAFFile* const untouched = reinterpret_cast<IAAFFile*>(this);
        IAAFFile* out = untouched;
        const NCFRESULT result = NewAAFFromMovie(Media(), Console(), &out, host.factory());
        if (result >= 0) {
            EXPECT_NE(out, untouched);
            out->Release();
        } else {
            EXPECT_EQ(out, untouched);
        }
        clip.reset();
        return result;
    }
    // What a refused AAF call may come to.
    static bool IsDocumented(NCFRESULT result) {
        return result == NCF_OK || result == kRefusal || result == NCF_E_FAIL ||
               result == NCF_E_UNEXPECTED || result == NMA_E_AAF_ADD || result == NMA_E_AAF_QUERY ||
               result == NMA_E_AAF_CREATE ||
               // A look-up failed for what is there: the second registration does.
               result == AAFRESULT_INVALID_PARAM;
    }
    void Sweep() {
        ASSERT_EQ(Describe(), NCF_OK);
        aaf.clearJournal();
        const int start = aaf.callCount();
        ASSERT_EQ(Describe(), NCF_OK);
        const int calls = aaf.callCount() - start;
        ASSERT_GT(calls, 100);
        int passedOver = 0;
        for (int n = 1; n <= calls; ++n) {
            aaf.clearRefusals();
            aaf.clearJournal();
            aaf.refuseCall(n, kRefusal);
            const int before = aaf.liveObjects();
            const NCFRESULT result = Describe();
            const std::string& refused = aaf.journal().lines().at(static_cast<std::size_t>(n - 1));
            ASSERT_TRUE(aaf.hasRefused()) << n;
            EXPECT_TRUE(IsDocumented(result)) << std::hex << result << " for " << refused;
            if (result == NCF_OK) {
                ++passedOver;
                EXPECT_TRUE(MayBePassedOver(refused)) << refused;
            }
            EXPECT_EQ(aaf.liveObjects(), before) << "objects are left after " << refused;
            aaf.clearRefusals();
            EXPECT_EQ(Describe(), NCF_OK) << "after " << refused;
        }
        EXPECT_GT(passedOver, 0);
    }
    // Calls whose failure a description goes on after.
    static bool MayBePassedOver(const std::string& line) {
        for (const char* piece :
             {"AppendComment 'Video' ", "AppendComment 'Image Aspect Ratio'",
              "AppendComment 'Audio Format'", ".SetPhysicalNum", ".SetTransferCharacteristic",
              ".SetColorPrimaries", ".NextOne", ".LookupPropertyDef", ".LookupContainerDef",
              ".LookupTypeDef 0E040301"}) {
            if (line.find(piece) != std::string::npos) {
                return true;
            }
        }
        return false;
    }

    const char* code = "cdci";
    bool syntheticTimecode = false;
};

TEST_F(FaultSweepTest, EveryAAFCallOfANativeClip) {
    Sweep();
}

TEST_F(FaultSweepTest, EveryAAFCallOfAnMpegClip) {
    code = "mpeg";
    Sweep();
}

TEST_F(FaultSweepTest, EveryAAFCallOfAProviderClip) {
    syntheticTimecode = true;
    Sweep();
}

TEST_F(FaultSweepTest, EveryComponentOfTheHost) {
    ASSERT_EQ(Describe(), NCF_OK);
    for (const GUID& component :
         {COMPID_INCFNMAEditorSettings, QTWrapper::CompID_QuickTimeWrapper, NCFCompID_NCFString}) {
        for (int n = 1; n <= 40; ++n) {
            host.clearRefusals();
            host.refuseCreation(component, NCF_E_OUTOFMEMORY, n);
            const NCFRESULT result = Describe();
            EXPECT_TRUE(result == NCF_OK || result == NCF_E_OUTOFMEMORY ||
                        result == NCF_E_POINTER || result == NCF_E_UNEXPECTED ||
                        result == NCF_E_FAIL || result == NCF_E_INVALIDARG)
                << std::hex << result;
            host.clearRefusals();
            EXPECT_EQ(Describe(), NCF_OK);
        }
    }
}

TEST_F(FaultSweepTest, EveryQuestionToTheClip) {
    for (const char* operation :
         {"SetEditRate", "SetMovieLength", "GetContentForHash", "GetEditRate", "GetMovieLength",
          "GetTimeCodeTrackCount", "GetTimecodeTrackQTId", "GetVideoTrackCount",
          "GetAudioTrackCount", "GetAudioTrackQTId", "IsAudioSampleProviderMedia",
          "GetAudioTrackMetadata", "CalculateAudioTrackLengthInSamples",
          "IsVideoSampleProviderMedia", "GetColorDetails", "GetGeometryDetails"}) {
        MakeClip();
        clip->failures[operation] = NCF_E_ACCESSDENIED;
        IAAFFile* out = nullptr;
        EXPECT_EQ(NewAAFFromMovie(Media(), Console(), &out, host.factory()), NCF_E_ACCESSDENIED)
            << operation;
        EXPECT_EQ(out, nullptr);
        clip.reset();
    }
}

}  // namespace
}  // namespace NMA::Impl
