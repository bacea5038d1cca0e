// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include <gtest/gtest.h>

#include "reference_host/quicktime/CodecNames.h"

namespace {

constexpr ncfUInt32 Number(const char (&text)[5]) {
    return static_cast<ncfUInt32>(static_cast<unsigned char>(text[0])) << 24 |
           static_cast<ncfUInt32>(static_cast<unsigned char>(text[1])) << 16 |
           static_cast<ncfUInt32>(static_cast<unsigned char>(text[2])) << 8 |
           static_cast<ncfUInt32>(static_cast<unsigned char>(text[3]));
}

TEST(CodecNames, KnowsCodesFamiliesAndTheLibrarysOwn) {
    std::string name;
    EXPECT_EQ(host::CodecName(Number("apch"), name), NCF_OK);
    EXPECT_EQ(name, "Apple ProRes 422 HQ");
    EXPECT_EQ(host::CodecName(Number("xdvc"), name), NCF_OK);
    EXPECT_EQ(name, "XDCAM EX");
    EXPECT_EQ(host::CodecName(Number("ai15"), name), NCF_OK);
    EXPECT_EQ(name, "AVC-Intra 100");
    EXPECT_EQ(host::CodecName(Number("MAC6"), name), NCF_OK);
    EXPECT_FALSE(name.empty());
}

TEST(CodecNames, KnowsCodesOfOtherContainers) {
    for (const ncfUInt32 code :
         {Number("FMP4"), Number("XVID"), Number("DX50"), Number("WMV3"), Number("MJPG")}) {
        std::string name;
        EXPECT_EQ(host::CodecName(code, name), NCF_OK);
        EXPECT_FALSE(name.empty()) << code;
    }
}

// A stream's tag comes first where it names a member of a family; a tag that
// nobody knows, or none, leaves the codec itself.
TEST(CodecNames, NamesAStreamByTagOrCodec) {
    const auto nameOf = [](AVMediaType type, AVCodecID codec, ncfUInt32 tag) {
        AVCodecParameters form{};
        form.codec_type = type;
        form.codec_id = codec;
        form.codec_tag = tag;
        return host::CodecNameOf(form);
    };
    EXPECT_EQ(nameOf(AVMEDIA_TYPE_VIDEO, AV_CODEC_ID_PRORES, MKTAG('a', 'p', 'c', 'o')),
              "Apple ProRes 422 Proxy");
    EXPECT_EQ(nameOf(AVMEDIA_TYPE_VIDEO, AV_CODEC_ID_H264, 0x1B), "H.264");
    EXPECT_EQ(nameOf(AVMEDIA_TYPE_VIDEO, AV_CODEC_ID_H264, MKTAG('H', '2', '6', '4')), "H.264");
    EXPECT_EQ(nameOf(AVMEDIA_TYPE_VIDEO, AV_CODEC_ID_MPEG4, MKTAG('F', 'M', 'P', '4')),
              "MPEG-4 Video");
    EXPECT_EQ(nameOf(AVMEDIA_TYPE_AUDIO, AV_CODEC_ID_PCM_S16LE, 1), "Linear PCM");
    // One of many: the codec tells no more than the family.
    EXPECT_NE(nameOf(AVMEDIA_TYPE_VIDEO, AV_CODEC_ID_PRORES, 0), "Apple ProRes 422 HQ");
    for (const AVCodecID codec : {AV_CODEC_ID_PRORES, AV_CODEC_ID_DVVIDEO, AV_CODEC_ID_MP2,
                                  AV_CODEC_ID_BMP, AV_CODEC_ID_PSD, AV_CODEC_ID_HUFFYUV}) {
        EXPECT_FALSE(nameOf(avcodec_get_type(codec), codec, 0).empty()) << codec;
    }
    EXPECT_EQ(nameOf(AVMEDIA_TYPE_VIDEO, AV_CODEC_ID_NONE, 0), "");
}

TEST(CodecNames, GivesACodeOfMoviesForATagThatIsNoText) {
    AVCodecParameters form{};
    form.codec_type = AVMEDIA_TYPE_VIDEO;
    form.codec_id = AV_CODEC_ID_H264;
    form.codec_tag = 0x1B;
    EXPECT_EQ(host::CodecCode(form), Number("avc1"));
    form.codec_tag = MKTAG('H', '2', '6', '4');
    EXPECT_EQ(host::CodecCode(form), Number("H264"));
    form.codec_tag = 0;
    form.codec_id = AV_CODEC_ID_BMP;
    EXPECT_EQ(host::CodecCode(form), Number("WRLE"));
    form.codec_id = AV_CODEC_ID_PSD;
    EXPECT_EQ(host::CodecCode(form), Number("8BPS"));
    form.codec_id = AV_CODEC_ID_HUFFYUV;
    EXPECT_EQ(host::CodecCode(form), Number("HFYU"));
    form.codec_id = AV_CODEC_ID_XBM;
    EXPECT_EQ(host::CodecCode(form), Number("xbm "));
    form.codec_id = AV_CODEC_ID_NONE;
    EXPECT_EQ(host::CodecCode(form), 0u);
}

TEST(CodecNames, LeavesAnUnknownCodeEmpty) {
    std::string name = "before";
    EXPECT_EQ(host::CodecName(Number("q?z!"), name), NCF_OK);
    EXPECT_TRUE(name.empty());
}

TEST(CodecNames, RefusesCodesThatAreNoText) {
    std::string name = "before";
    EXPECT_EQ(host::CodecName(0, name), NCF_E_INVALIDARG);
    EXPECT_EQ(host::CodecName(0x61620063, name), NCF_E_INVALIDARG);
    EXPECT_EQ(host::CodecName(0x6162637F, name), NCF_E_INVALIDARG);
    EXPECT_EQ(name, "before");
}

}  // namespace
