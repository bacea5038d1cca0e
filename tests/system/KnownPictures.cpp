// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "tests/system/KnownPictures.h"

#include <algorithm>
#include <cctype>

#include "tests/system/Facts.h"

namespace {

std::string Braced(std::string id) {
    std::transform(id.begin(), id.end(), id.begin(),
                   [](unsigned char c) { return static_cast<char>(std::toupper(c)); });
    return "{" + id + "}";
}

// The identifier of a definition whose name a reader's dictionary may know.
std::string IdIn(const std::string& definition) {
    const std::size_t brace = definition.find('{');
    return brace == std::string::npos ? definition : definition.substr(brace);
}

std::string SitingName(ncfUInt32 siting) {
    switch (siting) {
        case 0:
            return "CoSiting (0)";
        case 255:
            return "UnknownSiting (255)";
        default:
            return "siting " + std::to_string(siting);
    }
}

const KnownCode* CodeOf(const KnownRecord& record) {
    for (const KnownCode& code : KnownCodes()) {
        if (std::string(code.code) == record.code) {
            return &code;
        }
    }
    return nullptr;
}

}  // namespace

void ExpectKnownPicture(const cliphost::TreeNode& tree, const KnownRecord& record,
                        const std::string& what) {
    SCOPED_TRACE(what);
    const auto pictures = Pictures(tree);
    ASSERT_EQ(pictures.size(), 1u);
    const cliphost::TreeNode& picture = pictures[0];
    EXPECT_EQ(picture.title,
              record.kind == KnownKind::kMPEG2 ? "MPEGVideoDescriptor" : "CDCIDescriptor");
    const auto expectNumber = [&](const char* name, long long value) {
        EXPECT_EQ(Fact(picture, name), std::to_string(value)) << name;
    };
    EXPECT_EQ(Fact(picture, "FrameLayout"),
              record.frameLayout == 1 ? "SeparateFields (1)" : "FullFrame (0)");
    expectNumber("StoredWidth", record.storedWidth);
    expectNumber("StoredHeight", record.storedHeight);
    expectNumber("SampledHeight", record.storedHeight);
    expectNumber("DisplayHeight", record.displayHeight);
    EXPECT_EQ(Fact(picture, "VideoLineMap"), "[" + std::to_string(record.firstLines[0]) + ", " +
                                                 std::to_string(record.firstLines[1]) + "]");
    EXPECT_EQ(Fact(picture, "ImageAspectRatio"),
              std::to_string(record.aspect[0]) + "/" + std::to_string(record.aspect[1]));

    const KnownCode* const code = CodeOf(record);
    ASSERT_NE(code, nullptr) << "no facts for " << record.code;
    EXPECT_EQ(Fact(picture, "Compression"), Braced(code->coding));
    EXPECT_EQ(IdIn(Fact(picture, "ContainerFormat")), Braced(code->container));
    expectNumber("ComponentWidth", code->depth);
    expectNumber("HorizontalSubsampling", code->horizontalSubsampling);
    expectNumber("VerticalSubsampling", code->verticalSubsampling);
    EXPECT_EQ(Fact(picture, "ColorSiting"), SitingName(code->siting));
    // The cell that names a codec is for pictures that come decoded.
    EXPECT_TRUE(Column(tree, "Video").empty());
}

const KnownRecord* FindRecord(const std::string& code, ncfUInt32 width, ncfUInt32 height,
                              ncfUInt32 fields) {
    for (const KnownRecord& record : KnownRecords()) {
        if (code == record.code && record.width == width && record.height == height &&
            (record.fields == fields || record.fields == 0)) {
            return &record;
        }
    }
    ADD_FAILURE() << "no record for " << code << " " << width << "x" << height;
    return nullptr;
}
