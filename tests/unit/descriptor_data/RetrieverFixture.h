// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <map>

#include "source/descriptor_data/QuickTimeToAAFInfoRetriever.h"
#include "tests/unit/descriptor_data/AAFInfoFile.h"
#include "tests/unit/descriptor_data/FakePicture.h"

inline constexpr char kGetInfo[] = "QuickTimeToAAFInfoRetriever::GetInfoFromImageDescription";

inline constexpr ncfUInt32 Code(const char (&text)[5]) {
    return static_cast<ncfUInt32>(text[0]) << 24 | static_cast<ncfUInt32>(text[1]) << 16 |
           static_cast<ncfUInt32>(text[2]) << 8 | static_cast<ncfUInt32>(text[3]);
}

// The values of an entry by name, so that a test can leave one out.
using Values = std::map<std::string, std::string>;

inline Values CommonValues() {
    return {{"PictureEssenceCoding", "060e2b34-04010101-04010202-02010100"},
            {"EssenceContainerLabel", "060e2b34-04010101-0d010301-02020101"},
            {"FrameLayout", "1"},
            {"ImageStartOffset", "3"},
            {"ImageAlignmentOffset", "4"},
            {"StoredWidth", "720"},
            {"StoredHeight", "256"},
            {"SampledWidth", "718"},
            {"DisplayWidth", "716"},
            {"DisplayHeight", "243"},
            {"DisplayYOffset", "13"},
            {"AspectRatio",
             "<types:Numerator>4</types:Numerator>"
             "<types:Denominator>3</types:Denominator>"},
            {"VideoLineMap", "<rp210:Element>7</rp210:Element><rp210:Element>270</rp210:Element>"}};
}

inline Values CDCIValues() {
    Values values = CommonValues();
    values.insert({{"ComponentDepth", "10"},
                   {"HorizontalSubsampling", "2"},
                   {"VerticalSubsampling", "2"},
                   {"ColorSiting", "4"},
                   {"ColorRange", "897"},
                   {"BlackRefLevel", "64"},
                   {"WhiteReflevel", "940"}});
    return values;
}

inline Values MPEG2Values() {
    Values values = CDCIValues();
    values.insert({{"ProfileAndLevel", "0x82"}, {"BitRate", "50000000"}, {"MaxGOP", "15"}});
    return values;
}

inline Values RGBAValues() {
    Values values = CommonValues();
    values.insert({{"ComponentMinRef", "1"},
                   {"ComponentMaxRef", "254"},
                   {"PixelLayout",
                    "<rp210:RGBALayout><rp210:Code>B</rp210:Code><rp210:Depth>8</rp210:Depth>"
                    "</rp210:RGBALayout>"}});
    return values;
}

class RetrieverTest : public AAFInfoFile {
protected:
    ~RetrieverTest() override { ShutDownInfoRetriever(); }

    static std::string Join(const Values& values) {
        std::string joined;
        for (const auto& [name, value] : values) {
            joined += Value(name, value);
        }
        return joined;
    }
    // The mapper knows "code" as 1; the descriptor file is the test's.
    NCFRESULT Init(const std::string& entries,
                   const std::string& mapping = "<FourCharMapping FourChar='code' vcid='1'/>") {
        MakeItTheModulesFolder();
        Write("map.xml", "<Map>" + mapping + "</Map>");
        Write("info.xml", Document(entries));
        return QuickTimeToAAFInfoRetriever::Init(&host.console(), host.factory(), "map.xml",
                                                 "info.xml");
    }
    NCFRESULT GetInfo() {
        id_ = 77;
        return QuickTimeToAAFInfoRetriever::GetInstance()->GetInfoFromImageDescription(
            &clip_, &info_, &id_);
    }
    // The same for a caller that wants the id alone.
    NCFRESULT GetInfoWithoutRecord() {
        id_ = 77;
        return QuickTimeToAAFInfoRetriever::GetInstance()->GetInfoFromImageDescription(
            &clip_, nullptr, &id_);
    }
    NCFRESULT InitAndGetInfo(const std::string& kind, const Values& values) {
        EXPECT_EQ(Init(Entry("1", kind, Join(values))), NCF_OK);
        return GetInfo();
    }
    static bool IsMPEG() { return QuickTimeToAAFInfoRetriever::GetInstance()->IsMPEGDescriptor(); }
    static bool IsRGBA() { return QuickTimeToAAFInfoRetriever::GetInstance()->IsRGBADescriptor(); }

    struct Clip {
        FakePicture clip;
        Clip() {
            clip.code = Code("code");
            clip.vendor = Code("appl");
            clip.width = 720;
            clip.height = 486;
            clip.layout = 1;
        }
    };
    Clip holder_;
    FakePicture& clip_ = holder_.clip;
    AAFInfo info_;
    ncfUInt32 id_ = 77;
};
