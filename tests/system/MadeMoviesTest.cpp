// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Descriptions of the movies that FFmpeg makes (tests/support/movies_ffmpeg).
// What is expected follows from the command that made the movie, and was
// compared with what ffprobe says of it.

#include "reference_host/util/text/FileUrl.h"
#include "tests/system/Facts.h"
#include "tests/system/KnownPictures.h"
#include "tests/system/SystemTest.h"

namespace {

// A picture that the data files know: the code and raster that FFmpeg wrote.
struct NativeMovie {
    const char* file;
    const char* code;
    ncfUInt32 width;
    ncfUInt32 height;
    ncfUInt32 fields;
    const char* rateAndLength;
};

constexpr NativeMovie kNative[] = {
    {"dv_ntsc.mov", "dvc ", 720, 480, 1, "30000/1001 x 2"},
    {"dv_pal.mov", "dvcp", 720, 576, 1, "25/1 x 2"},
    {"dvcpro_pal.mov", "dvpp", 720, 576, 2, "25/1 x 2"},
    {"dvcpro50_ntsc.mov", "dv5n", 720, 480, 2, "30000/1001 x 2"},
    {"dvcpro50_pal.mov", "dv5p", 720, 576, 2, "25/1 x 2"},
    {"dvcprohd_1080i50.mov", "dvh5", 1440, 1080, 2, "25/1 x 2"},
    {"dvcprohd_1080i60.mov", "dvh6", 1280, 1080, 2, "30000/1001 x 2"},
    {"dvcprohd_720p60.mov", "dvhp", 960, 720, 1, "60000/1001 x 2"},
    {"v210.mov", "v210", 1920, 1080, 1, "25/1 x 2"},
    {"v210_720.mov", "v210", 1280, 720, 1, "50/1 x 2"},
    {"2vuy.mov", "2vuy", 1280, 720, 1, "25/1 x 2"},
    {"2vuy_ntsc.mov", "2vuy", 720, 486, 1, "30000/1001 x 2"},
    {"imx50_pal.mov", "mx5p", 720, 576, 2, "25/1 x 2"},
    {"imx50_ntsc.mov", "mx5n", 720, 486, 2, "30000/1001 x 2"},
    {"xdcam_hd422_1080i50.mov", "xd5c", 1920, 1080, 2, "25/1 x 2"},
    {"xdcam_hd422_720p50.mov", "xd5a", 1280, 720, 1, "50/1 x 2"},
    {"xdcam_ex_1080i50.mov", "xdvc", 1920, 1080, 2, "25/1 x 2"},
    {"xdcam_ex_1080p25.mov", "xdve", 1920, 1080, 1, "25/1 x 2"},
    {"hdv_1080i50.mov", "hdv3", 1440, 1080, 2, "25/1 x 2"},
    {"avc_intra100_1080p25.mov", "ai12", 1920, 1080, 1, "25/1 x 2"},
    {"avc_intra50_720p50.mov", "ai5q", 960, 720, 1, "50/1 x 2"},
    {"prores_vendor_apl0.mov", "apch", 1920, 1080, 1, "25/1 x 2"},
    {"prores_4444_alpha.mov", "ap4h", 1280, 720, 1, "25/1 x 2"},
    {"prores_with_pcm.mov", "apch", 1920, 1080, 1, "25/1 x 5"},
};

class MadeMovies : public SystemTest {};

TEST_F(MadeMovies, OfKnownCodesAreNative) {
    for (const NativeMovie& movie : kNative) {
        SCOPED_TRACE(movie.file);
        const KnownRecord* const record =
            FindRecord(movie.code, movie.width, movie.height, movie.fields);
        ASSERT_NE(record, nullptr);
        const cliphost::TreeNode tree = Describe(MadeMovie(movie.file));
        ExpectKnownPicture(tree, *record, movie.file);
        EXPECT_EQ(RateAndLength(tree), movie.rateAndLength);
    }
}

struct Raster {
    const char* name;
    ncfUInt32 width;
    ncfUInt32 height;
    ncfUInt32 fields;
    const char* rateAndLength;
};

constexpr Raster kRasters[] = {
    {"480i", 720, 480, 2, "30000/1001 x 2"}, {"480p", 720, 480, 1, "30000/1001 x 2"},
    {"486i", 720, 486, 2, "30000/1001 x 2"}, {"486p", 720, 486, 1, "30000/1001 x 2"},
    {"576i", 720, 576, 2, "25/1 x 2"},       {"576p", 720, 576, 1, "25/1 x 2"},
    {"720p", 1280, 720, 1, "50/1 x 2"},      {"1080i", 1920, 1080, 2, "25/1 x 2"},
    {"1080p", 1920, 1080, 1, "24/1 x 2"},
};

struct Profile {
    const char* name;
    const char* code;
};

void PrintTo(const Profile& profile, std::ostream* to) {
    *to << profile.code;
}

class ProRes : public SystemTest, public testing::WithParamInterface<Profile> {};

TEST_P(ProRes, IsNativeAtEveryRaster) {
    for (const Raster& raster : kRasters) {
        const std::string file = std::string("prores_") + GetParam().name + "_" + raster.name;
        SCOPED_TRACE(file);
        const KnownRecord* const record =
            FindRecord(GetParam().code, raster.width, raster.height, raster.fields);
        ASSERT_NE(record, nullptr);
        const cliphost::TreeNode tree = Describe(MadeMovie(file + ".mov"));
        ExpectKnownPicture(tree, *record, file);
        EXPECT_EQ(RateAndLength(tree), raster.rateAndLength);
    }
}

INSTANTIATE_TEST_SUITE_P(Profiles, ProRes,
                         testing::Values(Profile{"proxy", "apco"}, Profile{"lt", "apcs"},
                                         Profile{"standard", "apcn"}, Profile{"hq", "apch"},
                                         Profile{"4444", "ap4h"}, Profile{"4444xq", "ap4x"}),
                         [](const auto& test) { return std::string(test.param.name); });

// A picture that comes decoded: what the description says in a line.
struct ProviderMovie {
    const char* file;
    const char* rateAndLength;
    const char* picture;
    const char* boxes;
};

// clang-format off
constexpr ProviderMovie kProvider[] = {
    {"animation.mov", "25/1 x 3",
     "provider Animation stored 320x240 shows 320x240 FullFrame 4/3",
     "-1600/12 -100/1 1600/6 200/1"},
    {"animation_alpha.mov", "25/1 x 3",
     "provider Animation stored 320x240 shows 320x240 FullFrame 4/3",
     "-1600/12 -100/1 1600/6 200/1"},
    {"h264_23976.mov", "24000/1001 x 6",
     "provider H.264 stored 320x180 shows 320x180 FullFrame 16/9",
     "-1600/12 -75/1 1600/6 150/1"},
    {"h264_50.mov", "50/1 x 6",
     "provider H.264 stored 320x180 shows 320x180 FullFrame 16/9",
     "-1600/12 -75/1 1600/6 150/1"},
    {"h264_5994.mov", "60000/1001 x 6",
     "provider H.264 stored 320x180 shows 320x180 FullFrame 16/9",
     "-1600/12 -75/1 1600/6 150/1"},
    {"h264_aspect.mov", "25/1 x 5",
     "provider H.264 stored 720x288 shows 720x288 SeparateFields 16/9",
     "-800/1 -450/1 1600/1 900/1"},
    {"h264_bframes.mov", "25/1 x 10",
     "provider H.264 stored 640x360 shows 640x360 FullFrame 16/9",
     "-3200/12 -150/1 3200/6 300/1"},
    {"h264_header_first.mov", "25/1 x 5",
     "provider H.264 stored 640x360 shows 640x360 FullFrame 16/9",
     "-3200/12 -150/1 3200/6 300/1"},
    {"h264_mp4_header_last.mp4", "25/1 x 5",
     "provider H.264 stored 640x360 shows 640x360 FullFrame 16/9",
     "-3200/12 -150/1 3200/6 300/1"},
    {"h264_rec709.mov", "25/1 x 5",
     "provider H.264 stored 1280x720 shows 1280x720 FullFrame 16/9",
     "-800/1 -450/1 1600/1 900/1"},
    {"h264_with_aac.mov", "25/1 x 10",
     "provider H.264 stored 640x360 shows 640x360 FullFrame 16/9",
     "-3200/12 -150/1 3200/6 300/1"},
    {"mjpeg.mov", "24/1 x 4",
     "provider Photo - JPEG stored 640x480 shows 640x480 FullFrame 4/3",
     "-600/1 -450/1 1200/1 900/1"},
    {"mpeg2.mov", "25/1 x 5",
     "provider MPEG-2 Video stored 720x576 shows 720x576 FullFrame 5/4",
     "-300/1 -240/1 600/1 480/1"},
    {"mpeg4.mov", "25/1 x 5",
     "provider MPEG-4 Video stored 352x288 shows 352x288 FullFrame 11/9",
     "-1760/12 -120/1 1760/6 240/1"},
    {"one_picture.mov", "25/1 x 1",
     "provider PNG stored 400x300 shows 400x300 FullFrame 4/3",
     "-2000/12 -125/1 2000/6 250/1"},
    {"png.mov", "25/1 x 3",
     "provider PNG stored 320x240 shows 320x240 FullFrame 4/3",
     "-1600/12 -100/1 1600/6 200/1"},
    {"png_alpha.mov", "25/1 x 3",
     "provider PNG stored 320x240 shows 320x240 FullFrame 4/3",
     "-1600/12 -100/1 1600/6 200/1"},
    {"prores_odd_raster.mov", "25/1 x 2",
     "provider ProRes 422 stored 320x240 shows 320x240 FullFrame 4/3",
     "-1600/12 -100/1 1600/6 200/1"},
    {"raw_rgb.mov", "25/1 x 3",
     "provider RAW Codec stored 64x48 shows 64x48 FullFrame 4/3",
     "-320/12 -20/1 320/6 40/1"},
    {"rotated_180.mov", "25/1 x 4",
     "provider Photo - JPEG stored 320x240 shows 320x240 FullFrame 4/3",
     "-1600/12 -100/1 1600/6 200/1"},
    {"rotated_270.mov", "25/1 x 4",
     "provider Photo - JPEG stored 320x240 shows 320x240 FullFrame 4/3",
     "-100/1 -75/1 200/1 150/1"},
    {"rotated_90.mov", "25/1 x 4",
     "provider Photo - JPEG stored 320x240 shows 320x240 FullFrame 4/3",
     "-1600/12 -100/1 1600/6 200/1"},
    {"three_sounds.mov", "25/1 x 10",
     "provider Photo - JPEG stored 320x240 shows 320x240 FullFrame 4/3",
     "-1600/12 -100/1 1600/6 200/1"},
    {"timecode_24.mov", "24/1 x 4",
     "provider Photo - JPEG stored 320x240 shows 320x240 FullFrame 4/3",
     "-1600/12 -100/1 1600/6 200/1"},
    {"timecode_25.mov", "25/1 x 4",
     "provider Photo - JPEG stored 320x240 shows 320x240 FullFrame 4/3",
     "-1600/12 -100/1 1600/6 200/1"},
    {"timecode_2997_drop.mov", "30000/1001 x 4",
     "provider Photo - JPEG stored 320x240 shows 320x240 FullFrame 4/3",
     "-1600/12 -100/1 1600/6 200/1"},
    {"timecode_2997_nondrop.mov", "30000/1001 x 4",
     "provider Photo - JPEG stored 320x240 shows 320x240 FullFrame 4/3",
     "-1600/12 -100/1 1600/6 200/1"},
};
// clang-format on

TEST_F(MadeMovies, OfOtherCodesTakeTheProvider) {
    for (const ProviderMovie& movie : kProvider) {
        SCOPED_TRACE(movie.file);
        const cliphost::TreeNode tree = Describe(MadeMovie(movie.file));
        EXPECT_EQ(RateAndLength(tree), movie.rateAndLength);
        EXPECT_EQ(PictureLine(tree), movie.picture);
        EXPECT_EQ(BoxesLine(tree), movie.boxes);
        EXPECT_EQ(Column(tree, "Video File Format"), std::vector<std::string>{"MOV"});
    }
}

struct SoundMovie {
    const char* file;
    const char* rateAndLength;
    const char* sound;
    const char* column;
};

// clang-format off
constexpr SoundMovie kSounds[] = {
    {"aac.m4a", "25/1 x 10",
     "provider 1 x 44100/1 Hz 24 bit, 17640 samples, 0 a second, block 0", "AAC"},
    {"aac.mov", "25/1 x 10",
     "provider 2 x 48000/1 Hz 24 bit, 19200 samples, 0 a second, block 0", "AAC"},
    {"alac.mov", "25/1 x 10",
     "provider 2 x 48000/1 Hz 24 bit, 19200 samples, 0 a second, block 0", "QT-NMA Audio"},
    {"ima4.mov", "25/1 x 10",
     "provider 1 x 48000/1 Hz 24 bit, 19200 samples, 13056000 a second, block 34", "QT-NMA Audio"},
    {"pcm_44100.mov", "25/1 x 10",
     "little-endian 2 x 44100/1 Hz 16 bit, 17640 samples, 1411200 a second, block 4", "LPCM"},
    {"pcm_96000_mono.mov", "25/1 x 10",
     "little-endian 1 x 96000/1 Hz 24 bit, 38400 samples, 2304000 a second, block 3", "LPCM"},
    {"pcm_alaw.mov", "25/1 x 10",
     "provider 2 x 48000/1 Hz 24 bit, 19200 samples, 768000 a second, block 2", "QT-NMA Audio"},
    {"pcm_f32be.mov", "25/1 x 10",
     "provider 2 x 48000/1 Hz 24 bit, 19200 samples, 3072000 a second, block 8", "LPCM"},
    {"pcm_f32le.mov", "25/1 x 10",
     "provider 2 x 48000/1 Hz 24 bit, 19200 samples, 3072000 a second, block 8", "LPCM"},
    {"pcm_f64be.mov", "25/1 x 10",
     "provider 2 x 48000/1 Hz 24 bit, 19200 samples, 6144000 a second, block 16", "LPCM"},
    {"pcm_f64le.mov", "25/1 x 10",
     "provider 2 x 48000/1 Hz 24 bit, 19200 samples, 6144000 a second, block 16", "LPCM"},
    {"pcm_mulaw.mov", "25/1 x 10",
     "provider 2 x 48000/1 Hz 24 bit, 19200 samples, 768000 a second, block 2", "QT-NMA Audio"},
    {"pcm_s16be.mov", "25/1 x 10",
     "big-endian 2 x 48000/1 Hz 16 bit, 19200 samples, 1536000 a second, block 4", "LPCM"},
    {"pcm_s16le.mov", "25/1 x 10",
     "little-endian 2 x 48000/1 Hz 16 bit, 19200 samples, 1536000 a second, block 4", "LPCM"},
    {"pcm_s24be.mov", "25/1 x 10",
     "big-endian 2 x 48000/1 Hz 24 bit, 19200 samples, 2304000 a second, block 6", "LPCM"},
    {"pcm_s24le.mov", "25/1 x 10",
     "little-endian 2 x 48000/1 Hz 24 bit, 19200 samples, 2304000 a second, block 6", "LPCM"},
    {"pcm_s32be.mov", "25/1 x 10",
     "provider 2 x 48000/1 Hz 24 bit, 19200 samples, 3072000 a second, block 8", "LPCM"},
    {"pcm_s32le.mov", "25/1 x 10",
     "provider 2 x 48000/1 Hz 24 bit, 19200 samples, 3072000 a second, block 8", "LPCM"},
    {"pcm_s8.mov", "25/1 x 10",
     "provider 2 x 48000/1 Hz 24 bit, 19200 samples, 768000 a second, block 2", "LPCM"},
    {"pcm_u8.mov", "25/1 x 10",
     "provider 2 x 48000/1 Hz 24 bit, 19200 samples, 768000 a second, block 2", "LPCM"},
};
// clang-format on

TEST_F(MadeMovies, OfSoundAloneTakeTheEditorsRate) {
    for (const SoundMovie& movie : kSounds) {
        SCOPED_TRACE(movie.file);
        const cliphost::TreeNode tree = Describe(MadeMovie(movie.file));
        EXPECT_TRUE(Pictures(tree).empty());
        EXPECT_EQ(RateAndLength(tree), movie.rateAndLength);
        EXPECT_EQ(SoundLine(tree), movie.sound);
        EXPECT_EQ(Column(tree, "Audio Format"), std::vector<std::string>{movie.column});
    }
}

TEST_F(MadeMovies, WithSeveralSoundsHaveASlotForEachChannel) {
    const cliphost::TreeNode tree = Describe(MadeMovie("three_sounds.mov"));
    ASSERT_EQ(Sounds(tree).size(), 3u);
    EXPECT_EQ(SoundLine(tree, 0),
              "little-endian 1 x 48000/1 Hz 16 bit, 19200 samples, 768000 a second, block 2");
    EXPECT_EQ(SoundLine(tree, 1),
              "little-endian 2 x 48000/1 Hz 16 bit, 19200 samples, 1536000 a second, block 4");
    EXPECT_EQ(SoundLine(tree, 2),
              "little-endian 6 x 48000/1 Hz 16 bit, 19200 samples, 4608000 a second, block 12");
    const std::string sounds =
        "3 picture, 4 sound, 5 sound, 6 sound, 7 sound, 8 sound, 9 sound, 10 sound, 11 sound, "
        "12 sound";
    EXPECT_EQ(SlotList(tree, kMasterMob), sounds);
    EXPECT_EQ(SlotList(tree, kFileMob), sounds);
    EXPECT_EQ(SlotList(tree, kSourceMob), "1 TC1, 2 AuxTC1, " + sounds);
    EXPECT_EQ(Column(tree, "Audio Format"), (std::vector<std::string>{"LPCM", "LPCM", "LPCM"}));
}

TEST_F(MadeMovies, WithNativePictureAndSound) {
    const cliphost::TreeNode tree = Describe(MadeMovie("prores_with_pcm.mov"));
    EXPECT_EQ(SoundLine(tree),
              "little-endian 2 x 48000/1 Hz 24 bit, 9600 samples, 2304000 a second, block 6");
    EXPECT_EQ(SlotList(tree, kSourceMob), "1 TC1, 2 picture, 3 sound, 4 sound");
    EXPECT_EQ(TimecodeLine(tree), "25 fps, clip enters at 900000");
}

struct TimecodeMovie {
    const char* file;
    const char* timecode;
    const char* rateAndLength;
};

// Starts: 01:02:03:04 is 3723 seconds of 24 and 4; 10 hours of 25; an hour of
// 30 without 2 frames in all minutes but each tenth: 108000 - 108; an hour of 30.
constexpr TimecodeMovie kTimecodes[] = {
    {"timecode_24.mov", "24 fps, clip enters at 89356", "24/1 x 4"},
    {"timecode_25.mov", "25 fps, clip enters at 900000", "25/1 x 4"},
    {"timecode_2997_drop.mov", "30 fps drop, clip enters at 107892", "30000/1001 x 4"},
    {"timecode_2997_nondrop.mov", "30 fps, clip enters at 108000", "30000/1001 x 4"},
};

TEST_F(MadeMovies, WithATimecodeTrackEnterAtItsStart) {
    for (const TimecodeMovie& movie : kTimecodes) {
        SCOPED_TRACE(movie.file);
        const cliphost::TreeNode tree = Describe(MadeMovie(movie.file));
        EXPECT_EQ(TimecodeLine(tree), movie.timecode);
        EXPECT_EQ(RateAndLength(tree), movie.rateAndLength);
        EXPECT_EQ(SlotList(tree, kSourceMob), "1 TC1, 2 picture");
    }
}

TEST_F(MadeMovies, WithoutATimecodeTrackShowTheTimeOfTheirFile) {
    const cliphost::TreeNode tree = Describe(MadeMovie("png.mov"));
    EXPECT_EQ(SlotList(tree, kSourceMob), "1 TC1, 2 AuxTC1, 3 picture");
    EXPECT_EQ(TimecodeLine(tree), "25 fps, clip enters at 0");
    // The files are dated 12:00:00 UTC: 43200 seconds of 25 frames.
    const auto& auxiliary = Parts(Mob(tree, kSourceMob), "Slots").at(1);
    const auto& parts = Parts(Parts(auxiliary, "Segment").at(0), "Components");
    ASSERT_EQ(parts.size(), 3u);
    EXPECT_EQ(Fact(parts[1], "Start"), "1080000");
    EXPECT_EQ(Fact(parts[1], "Length"), "3");
    EXPECT_EQ(Fact(auxiliary, "PhysicalTrackNumber"), "3");
}

struct AlphaMovie {
    const char* file;
    bool hasAlpha;
};

constexpr AlphaMovie kAlpha[] = {{"png_alpha.mov", true},         {"png.mov", false},
                                 {"animation_alpha.mov", true},   {"animation.mov", false},
                                 {"prores_4444_alpha.mov", true}, {"mjpeg.mov", false}};

TEST_F(MadeMovies, WithAlphaHaveASecondPictureWhenTheHostWantsIt) {
    options.host.ignoreAlpha = false;
    Start();
    for (const AlphaMovie& movie : kAlpha) {
        SCOPED_TRACE(movie.file);
        const cliphost::TreeNode tree = Describe(MadeMovie(movie.file));
        EXPECT_EQ(Pictures(tree).size(), movie.hasAlpha ? 2u : 1u);
        EXPECT_EQ(SlotList(tree, kMasterMob),
                  movie.hasAlpha ? "3 picture, 4 picture" : "3 picture");
        EXPECT_EQ(Fact(Mob(tree, kMasterMob), "AppCode"), movie.hasAlpha ? "1" : "-");
        EXPECT_EQ(PictureLine(tree, 0), PictureLine(tree, Pictures(tree).size() - 1));
        EXPECT_EQ(Column(tree, "Video File Format").size(), Pictures(tree).size());
    }
}

TEST_F(MadeMovies, WithAlphaHaveOnePictureWhenTheHostIgnoresIt) {
    options.host.ignoreAlpha = true;
    Start();
    for (const AlphaMovie& movie : kAlpha) {
        const cliphost::TreeNode tree = Describe(MadeMovie(movie.file));
        EXPECT_EQ(Pictures(tree).size(), 1u) << movie.file;
        EXPECT_EQ(Fact(Mob(tree, kMasterMob), "AppCode"), "-") << movie.file;
    }
}

TEST_F(MadeMovies, NameTheirFileInTheLocators) {
    const auto movie = MadeMovie("png.mov");
    const cliphost::TreeNode tree = Describe(movie);
    const std::string url = host::text::FileUrl(movie.string());
    EXPECT_EQ(Url(tree, kFileMob), url);
    EXPECT_EQ(Url(tree, kSourceMob), url);
    EXPECT_EQ(Fact(Mob(tree, kMasterMob), "Name"), "\"png\"");
}

// The host's length of one-frame clips is for files that come by the wrapper.
TEST_F(MadeMovies, OfOnePictureAreOneFrameLong) {
    options.host.singleFrameDuration = 100;
    Start();
    EXPECT_EQ(RateAndLength(Describe(MadeMovie("one_picture.mov"))), "25/1 x 1");
}

TEST_F(MadeMovies, TakeTheEditorsRateForSoundAlone) {
    options.host.editorFrameRate = 30000.0 / 1001.0;
    Start();
    // 0.4 seconds are 11.99 frames, and no part of one counts.
    EXPECT_EQ(RateAndLength(Describe(MadeMovie("pcm_s16le.mov"))), "30000/1001 x 11");
}

}  // namespace
