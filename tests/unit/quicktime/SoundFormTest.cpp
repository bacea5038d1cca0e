// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include <gtest/gtest.h>

#include <cstdlib>

#include "reference_host/quicktime/SoundForm.h"

namespace {

struct Sound {
    AVCodecParameters* parameters = avcodec_parameters_alloc();
    AVStream stream{};
    Sound(AVCodecID codec, int channels, int rate) {
        parameters->codec_type = AVMEDIA_TYPE_AUDIO;
        parameters->codec_id = codec;
        parameters->ch_layout.nb_channels = channels;
        parameters->sample_rate = rate;
        stream.codecpar = parameters;
    }
    ~Sound() { avcodec_parameters_free(&parameters); }
    Sound(const Sound&) = delete;
    Sound& operator=(const Sound&) = delete;
};

TEST(SoundForm, TellsEveryKindOfLinearSound) {
    struct Row {
        AVCodecID codec;
        ncfUInt32 bits, flags;
        bool big;
    };
    for (const Row& row :
         {Row{AV_CODEC_ID_PCM_U8, 8, 8, false}, Row{AV_CODEC_ID_PCM_S16LE, 16, 12, false},
          Row{AV_CODEC_ID_PCM_S16BE, 16, 14, true}, Row{AV_CODEC_ID_PCM_S24LE, 24, 12, false},
          Row{AV_CODEC_ID_PCM_S32BE, 32, 14, true}, Row{AV_CODEC_ID_PCM_F32LE, 32, 9, false},
          Row{AV_CODEC_ID_PCM_F64BE, 64, 11, true}}) {
        host::SoundForm form;
        ASSERT_TRUE(host::ReadSoundForm(Sound(row.codec, 3, 96000).stream, form));
        EXPECT_EQ(form.formatId, 0x6C70636Du);
        EXPECT_EQ(form.bitsPerChannel, row.bits);
        EXPECT_EQ(form.formatFlags, row.flags);
        EXPECT_EQ(form.isBigEndian, row.big);
        EXPECT_EQ(form.bytesPerPacket, row.bits / 8 * 3);
        EXPECT_EQ(form.framesPerPacket, 1u);
        EXPECT_TRUE(form.isConstantBitRate);
        EXPECT_EQ(form.sampleRate, 96000.0);
    }
}

TEST(SoundForm, KnowsLinearSoundThatIsNotStoredFrameAfterFrame) {
    host::SoundForm form;
    ASSERT_TRUE(host::ReadSoundForm(Sound(AV_CODEC_ID_PCM_S16LE, 2, 48000).stream, form));
    EXPECT_TRUE(form.isStoredPlain);
    for (const AVCodecID codec : {AV_CODEC_ID_PCM_BLURAY, AV_CODEC_ID_PCM_DVD}) {
        Sound disc(codec, 2, 48000);
        disc.parameters->bits_per_coded_sample = 24;
        ASSERT_TRUE(host::ReadSoundForm(disc.stream, form));
        EXPECT_EQ(form.formatId, 0x6C70636Du);
        EXPECT_EQ(form.bitsPerChannel, 24u);
        EXPECT_EQ(form.bytesPerPacket, 6u);
        EXPECT_EQ(form.formatFlags, 14u);
        EXPECT_TRUE(form.isBigEndian);
        EXPECT_TRUE(form.isConstantBitRate);
        EXPECT_FALSE(form.isStoredPlain);
        disc.parameters->bits_per_coded_sample = 0;
        ASSERT_TRUE(host::ReadSoundForm(disc.stream, form));
        EXPECT_EQ(form.bitsPerChannel, 16u);
    }
    ASSERT_TRUE(host::ReadSoundForm(Sound(AV_CODEC_ID_PCM_S16LE_PLANAR, 2, 48000).stream, form));
    EXPECT_EQ(form.formatId, 0x6C70636Du);
    EXPECT_EQ(form.formatFlags, 44u);
    EXPECT_FALSE(form.isStoredPlain);
}

TEST(SoundForm, TellsCompressedSoundByItsCode) {
    Sound aac(AV_CODEC_ID_AAC, 2, 44100);
    aac.parameters->frame_size = 1024;
    host::SoundForm form;
    ASSERT_TRUE(host::ReadSoundForm(aac.stream, form));
    EXPECT_EQ(form.formatId, 0x61616320u);
    EXPECT_EQ(form.bitsPerChannel, 0u);
    EXPECT_EQ(form.bytesPerPacket, 0u);
    EXPECT_EQ(form.framesPerPacket, 1024u);
    EXPECT_FALSE(form.isConstantBitRate);
    Sound other(AV_CODEC_ID_QDM2, 2, 44100);
    other.parameters->codec_tag = MKTAG('Q', 'D', 'M', '2');
    ASSERT_TRUE(host::ReadSoundForm(other.stream, form));
    EXPECT_EQ(form.formatId, 0x51444D32u);
}

TEST(SoundForm, RefusesNumbersThatMakeNoSense) {
    host::SoundForm form;
    EXPECT_FALSE(host::ReadSoundForm(Sound(AV_CODEC_ID_AAC, 0, 48000).stream, form));
    EXPECT_FALSE(host::ReadSoundForm(Sound(AV_CODEC_ID_AAC, 2, 0).stream, form));
    EXPECT_FALSE(host::ReadSoundForm(Sound(AV_CODEC_ID_AAC, 1025, 48000).stream, form));
    EXPECT_TRUE(host::ReadSoundForm(Sound(AV_CODEC_ID_AAC, 1024, 48000).stream, form));
    Sound video(AV_CODEC_ID_AAC, 2, 48000);
    video.parameters->codec_type = AVMEDIA_TYPE_VIDEO;
    EXPECT_FALSE(host::ReadSoundForm(video.stream, form));
}

}  // namespace
