// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Every picture codec that FFmpeg both writes into a movie and reads.

#include "tests/support/codecs/Words.h"
#include "tests/system/codecs/Codecs.h"

namespace {

constexpr const char* kSmall = "160x96";

// Lists are words with a space between. The broad set has the first pixel formats
// in the first ending.
struct PictureCodec {
    const char* name;
    const char* options;
    const char* pixels;
    const char* endings;
    const char* size = kSmall;
    std::size_t broad = 1;
};

// Left out is what ffmpeg writes but does not read again: raw planes, and 4:4:0
// of VP9.
constexpr PictureCodec kCodecs[] = {
    {"amv", "-c:v amv", "yuvj420p", "mov", "160x112"},
    {"asv1", "-c:v asv1", "yuv420p", "mov"},
    {"asv2", "-c:v asv2", "yuv420p", "mov"},
    {"av1", "-c:v libaom-av1 -cpu-used 8 -row-mt 0",
     "yuv420p yuv422p yuv444p gbrp yuv420p10le yuv422p10le yuv444p10le yuv420p12le "
     "yuv422p12le yuv444p12le gbrp10le gbrp12le gray gray10le gray12le",
     "mp4"},
    {"av1_rav1e", "-c:v librav1e -speed 10",
     "yuv420p yuvj420p yuv420p10le yuv420p12le yuv422p yuvj422p yuv422p10le yuv422p12le "
     "yuv444p yuvj444p yuv444p10le yuv444p12le",
     "mp4"},
    {"av1_svt", "-c:v libsvtav1 -preset 12", "yuv420p yuv420p10le", "mp4"},
    {"avrp", "-c:v avrp", "gbrp10le", "mov"},
    {"avui", "-c:v avui -strict -2", "uyvy422", "mov", "720x486"},
    {"ayuv", "-c:v ayuv", "yuva444p", "mov"},
    {"cfhd", "-c:v cfhd", "yuv422p10le gbrp12le gbrap12le", "mov"},
    {"cinepak", "-c:v cinepak", "rgb24 gray", "mov"},
    {"cljr", "-c:v cljr", "yuv411p", "mov"},
    {"dirac", "-c:v vc2",
     "yuv420p yuv422p yuv444p yuv420p10le yuv422p10le yuv444p10le yuv420p12le "
     "yuv422p12le yuv444p12le",
     "mov mp4"},
    {"dnxhd", "-c:v dnxhd -b:v 120M", "yuv422p", "mov", "1920x1080"},
    {"dnxhr", "-c:v dnxhd -profile:v dnxhr_sq", "yuv422p", "mov", "1280x720"},
    {"dnxhr_hqx", "-c:v dnxhd -profile:v dnxhr_hqx", "yuv422p10le", "mov", "1280x720"},
    {"dnxhr_444", "-c:v dnxhd -profile:v dnxhr_444", "yuv444p10le gbrp10le", "mov", "1280x720"},
    {"dpx", "-c:v dpx",
     "rgb24 gray rgba abgr gray16le gray16be rgb48le rgb48be rgba64le rgba64be gbrp10le "
     "gbrp10be gbrp12le gbrp12be",
     "mov"},
    {"dv25", "-c:v dvvideo", "yuv420p yuv411p", "mov", "720x576"},
    {"dv50", "-c:v dvvideo", "yuv422p", "mov", "720x576"},
    {"exr", "-c:v exr", "gbrpf32le grayf32le gbrapf32le", "mov", kSmall, 3},
    {"ffv1", "-c:v ffv1",
     "yuv420p yuv440p yuv410p yuv411p yuv444p yuva420p yuv420p10le yuv422p12le "
     "yuv444p16le yuva444p10le ya8 gray16le gbrp12le gbrap16le bgra yuva422p yuva444p "
     "yuv422p bgr0 yuv420p16le yuv422p16le yuv444p9le yuv422p9le yuv420p9le yuv422p10le "
     "yuv444p10le yuv420p12le yuv444p12le yuva444p16le yuva422p16le yuva420p16le "
     "yuva422p10le yuva420p10le yuva444p9le yuva422p9le yuva420p9le gray gbrp9le "
     "gbrp10le gbrp14le gbrap10le gbrap12le gray10le gray12le gbrp16le rgb48le rgba64le "
     "gray9le yuv420p14le yuv422p14le yuv444p14le yuv440p10le yuv440p12le",
     "mov", kSmall, 15},
    {"ffvhuff", "-c:v ffvhuff",
     "yuva420p yuv420p yuv422p yuv444p yuv411p yuv410p yuv440p gbrp gbrp9le gbrp10le "
     "gbrp12le gbrp14le gbrp16le gray gray16le yuva422p yuva444p gbrap yuv420p9le "
     "yuv420p10le yuv420p12le yuv420p14le yuv420p16le yuv422p9le yuv422p10le "
     "yuv422p12le yuv422p14le yuv422p16le yuv444p9le yuv444p10le yuv444p12le "
     "yuv444p14le yuv444p16le yuva420p9le yuva420p10le yuva420p16le yuva422p9le "
     "yuva422p10le yuva422p16le yuva444p9le yuva444p10le yuva444p16le rgb24 bgra",
     "mov"},
    {"flashsv", "-c:v flashsv", "bgr24", "mov"},
    {"flv1", "-c:v flv", "yuv420p", "mov"},
    {"gif", "-c:v gif", "rgb8 bgr8 rgb4_byte bgr4_byte gray pal8", "mov"},
    {"h261", "-c:v h261", "yuv420p", "mov", "176x144"},
    {"h263", "-c:v h263", "yuv420p", "mov", "176x144"},
    {"h263p", "-c:v h263p", "yuv420p", "mov"},
    {"h264", "-c:v libx264 -bf 2",
     "yuv420p yuvj420p yuv422p10le yuv422p yuvj422p yuv444p yuvj444p nv12 nv21 "
     "yuv420p10le yuv444p10le gray gray10le",
     "mov mp4", kSmall, 3},
    {"h264_rgb", "-c:v libx264rgb", "bgr0 bgr24 rgb24", "mov mp4"},
    {"h264_intra", "-c:v libx264 -g 1", "yuv420p yuv422p10le", "mov"},
    {"h264_fields", "-c:v libx264 -flags +ildct+ilme -top 1 -bf 2", "yuv420p yuv422p", "mov mp4"},
    {"hap", "-c:v hap", "rgba", "mov"},
    {"hap_alpha", "-c:v hap -format hap_alpha", "rgba", "mov"},
    {"hap_q", "-c:v hap -format hap_q", "rgba", "mov"},
    {"hevc", "-c:v libx265 -x265-params log-level=none:pools=1:frame-threads=1",
     "yuv420p yuvj420p yuv422p yuvj422p yuv444p yuvj444p gbrp yuv420p10le yuv422p10le "
     "yuv444p10le gbrp10le yuv420p12le yuv422p12le yuv444p12le gbrp12le gray gray10le "
     "gray12le",
     "mov mp4"},
    {"huffyuv", "-c:v huffyuv", "yuv422p rgb24 bgra", "mov"},
    {"jpeg2000", "-c:v jpeg2000",
     "yuv420p rgb24 yuv444p gray yuv422p yuv410p yuv411p pal8 rgb48le gray16le", "mov mp4"},
    {"jpeg2000_openjpeg", "-c:v libopenjpeg",
     "yuva422p10le rgb24 rgba rgb48le rgba64le gbrp gbrp9le gbrp10le gbrp12le gbrp14le "
     "gbrp16le gray ya8 gray16le ya16le gray10le gray12le gray14le yuv420p yuv422p "
     "yuva420p yuv440p yuv444p yuva422p yuv411p yuv410p yuva444p yuv420p9le yuv422p9le "
     "yuv444p9le yuva420p9le yuva422p9le yuva444p9le yuv420p10le yuv422p10le "
     "yuv444p10le yuva420p10le yuva444p10le yuv420p12le yuv422p12le yuv444p12le "
     "yuv420p14le yuv422p14le yuv444p14le yuv420p16le yuv422p16le yuv444p16le "
     "yuva420p16le yuva422p16le yuva444p16le xyz12le",
     "mov mp4"},
    {"jpegls", "-c:v jpegls", "rgb24 bgr24 gray gray16le", "mov"},
    {"ljpeg", "-c:v ljpeg -strict -2",
     "yuvj422p bgr24 bgra bgr0 yuvj420p yuvj444p yuv420p yuv444p yuv422p", "mov"},
    {"magicyuv", "-c:v magicyuv", "gbrp gbrap yuv422p yuv420p yuv444p yuva444p gray", "mov"},
    {"mjpeg", "-c:v mjpeg -q:v 2 -strict -2", "yuvj420p yuvj422p yuvj444p yuv420p yuv422p yuv444p",
     "mov mp4"},
    {"mpeg1", "-c:v mpeg1video -bf 2", "yuv420p", "mov mp4"},
    {"mpeg2", "-c:v mpeg2video -bf 2", "yuv420p yuv422p", "mov mp4"},
    {"mpeg2_fields", "-c:v mpeg2video -flags +ildct+ilme -top 1 -bf 2", "yuv420p yuv422p", "mov"},
    {"mpeg4", "-c:v mpeg4 -bf 2", "yuv420p", "mov mp4"},
    {"msmpeg4v2", "-c:v msmpeg4v2", "yuv420p", "mov"},
    {"msmpeg4v3", "-c:v msmpeg4", "yuv420p", "mov"},
    {"msvideo1", "-c:v msvideo1", "rgb555le", "mov"},
    {"png", "-c:v png", "rgb24 rgba rgb48be rgba64be pal8 gray ya8 gray16be ya16be monob",
     "mov mp4", kSmall, 10},
    {"prores", "-c:v prores_ks", "yuv422p10le yuv444p10le yuva444p10le", "mov"},
    {"prores_aw", "-c:v prores_aw", "yuv422p10le yuv444p10le yuva444p10le", "mov"},
    {"prores_plain", "-c:v prores", "yuv422p10le yuv444p10le yuva444p10le", "mov"},
    {"qtrle", "-c:v qtrle", "rgb24 rgb555be argb gray", "mov"},
    {"r10k", "-c:v r10k", "gbrp10le", "mov"},
    {"r210", "-c:v r210", "gbrp10le", "mov"},
    {"rawvideo", "-c:v rawvideo",
     "uyvy422 yuyv422 rgb24 argb bgra rgb555be rgb565be gray monow rgb48be", "mov", kSmall, 10},
    {"rpza", "-c:v rpza", "rgb555le", "mov", "176x144"},
    {"sgi", "-c:v sgi", "rgb24 rgba rgb48le rgb48be rgba64le rgba64be gray16le gray16be gray",
     "mov"},
    {"smc", "-c:v smc", "pal8", "mov"},
    {"snow", "-c:v snow", "yuv420p yuv410p yuv444p gray", "mov"},
    {"speedhq", "-c:v speedhq", "yuv420p yuv422p yuv444p", "mov"},
    {"svq1", "-c:v svq1", "yuv410p", "mov"},
    {"targa", "-c:v targa", "bgr24 bgra rgb555le gray pal8", "mov"},
    {"theora", "-c:v libtheora", "yuv420p yuv422p yuv444p", "mov"},
    {"tiff", "-c:v tiff",
     "rgb24 rgb48le pal8 rgba rgba64le gray ya8 gray16le ya16le monob monow yuv420p "
     "yuv422p yuv440p yuv444p yuv410p yuv411p",
     "mov"},
    {"utvideo", "-c:v utvideo", "gbrp gbrap yuv422p yuv420p yuv444p", "mov"},
    {"v210", "-c:v v210", "yuv422p10le yuv422p", "mov"},
    {"v308", "-c:v v308", "yuv444p", "mov"},
    {"v408", "-c:v v408", "yuva444p", "mov"},
    {"v410", "-c:v v410", "yuv444p10le", "mov"},
    {"vp9", "-c:v libvpx-vp9 -cpu-used 8",
     "yuv420p yuva420p yuv422p yuv444p yuv420p10le yuv422p10le yuv444p10le yuv420p12le "
     "yuv422p12le yuv444p12le gbrp gbrp10le gbrp12le",
     "mp4"},
    {"wmv1", "-c:v wmv1", "yuv420p", "mov"},
    {"wmv2", "-c:v wmv2", "yuv420p", "mov"},
    {"xvid", "-c:v libxvid", "yuv420p", "mov mp4"},
    {"y41p", "-c:v y41p", "yuv411p", "mov"},
    {"yuv4", "-c:v yuv4", "yuv420p", "mov"},
    {"zlib", "-c:v zlib", "bgr24", "mov"},
    {"zmbv", "-c:v zmbv", "bgr0 pal8 rgb555le rgb565le bgr24", "mov"},
};

// Movies whose pictures lie, follow or are shown in another way than one behind
// the other from the first on.
struct PictureFeature {
    const char* name;
    const char* options;
    const char* pixels;
    const char* ending;
    const char* copyBefore = "";
    const char* copyBehind = "";
};

constexpr PictureFeature kPictureFeatures[] = {
    {"rotated_90", "-c:v libx264 -metadata:s:v rotate=90", "yuv420p", "mp4"},
    {"rotated_180", "-c:v mpeg4 -metadata:s:v rotate=180", "yuv420p", "mov"},
    {"rotated_270", "-c:v libx264 -metadata:s:v rotate=270", "yuv420p", "mov"},
    {"many_b_frames", "-c:v libx264 -bf 4 -b_strategy 0 -g 10", "yuv420p", "mov"},
    {"b_frames_with_negative_offsets", "-c:v libx264 -bf 3 -movflags +negative_cts_offsets",
     "yuv420p", "mp4"},
    {"b_frames_in_fragments", "-c:v libx264 -bf 2 -movflags +frag_keyframe+empty_moov", "yuv420p",
     "mp4"},
    {"header_first", "-c:v libx264 -movflags +faststart", "yuv420p", "mp4"},
    {"edit_inside_a_group", "-c:v libx264 -bf 2 -g 8", "yuv420p", "mov", "-ss 0.12"},
    {"edit_at_a_key", "-c:v libx264 -bf 0 -g 4", "yuv420p", "mp4", "-ss 0.16"},
    {"edit_of_all_keys", "-c:v prores_ks", "yuv422p10le", "mov", "-ss 0.12"},
    {"edit_with_a_gap_in_front", "-c:v libx264 -bf 2", "yuv420p", "mov", "-itsoffset 0.4"},
    {"uneven_durations", "-c:v libx264 -bf 0 -vf 'setpts=(N+N*N/8)/25/TB' -vsync passthrough",
     "yuv420p", "mov"},
    {"rate_of_30000_1001", "-r 30000/1001 -c:v mpeg2video", "yuv420p", "mov"},
    {"rate_of_24000_1001", "-r 24000/1001 -c:v prores_ks", "yuv422p10le", "mov"},
    {"another_matrix", "-c:v libx264 -colorspace bt709 -color_primaries bt709 -color_trc bt709",
     "yuv422p10le", "mov"},
    {"one_picture", "-c:v png -frames:v 1", "rgb24", "mov"},
    {"of_odd_width", "-vf crop=157:93 -c:v png", "rgb24", "mov"},
    {"of_odd_size_in_luma", "-vf crop=157:93:exact=1 -c:v ffv1", "yuv444p", "mov"},
};

// Not quite as colourful and contrasty as can be, so that it stays within the
// colours of every form; with a ramp where there is alpha.
std::string Source(const std::string& size, const std::string& pixels) {
    const bool isLarge = size.size() > 7;
    const bool hasAlpha = pixels.find("yuva") == 0 || pixels.find("gbrap") == 0 ||
                          pixels.find("ya") == 0 || pixels == "bgra" || pixels == "argb" ||
                          pixels == "abgr" || pixels.find("rgba") == 0;
    return "testsrc2=s=" + size + ":r=25,trim=end_frame=" + (isLarge ? "2" : "10") +
           ",format=yuv444p,eq=saturation=0.6:contrast=0.8" +
           (hasAlpha ? ",format=yuva444p,geq=lum=p(X\\,Y):cb=p(X\\,Y):cr=p(X\\,Y):a=255*X/W" : "");
}

}  // namespace

std::vector<CodecCase> PictureCodecCases() {
    std::vector<CodecCase> cases;
    for (const PictureCodec& codec : kCodecs) {
        const auto pixelFormats = Words(codec.pixels), endings = Words(codec.endings);
        for (std::size_t p = 0; p < pixelFormats.size(); ++p) {
            for (std::size_t e = 0; e < endings.size(); ++e) {
                const std::string& pixels = pixelFormats[p];
                cases.push_back({std::string(codec.name) + "_" + pixels + "_" + endings[e],
                                 Source(codec.size, pixels),
                                 std::string(codec.options) + " -pix_fmt " + pixels, endings[e],
                                 e == 0 && p < codec.broad ? TestSet::kBroad : TestSet::kThorough,
                                 "", "", "", true});
            }
        }
    }
    for (const PictureFeature& feature : kPictureFeatures) {
        cases.push_back({feature.name, Source("160x96", feature.pixels),
                         std::string(feature.options) + " -pix_fmt " + feature.pixels,
                         feature.ending, TestSet::kAlways, feature.copyBefore, feature.copyBehind,
                         "", true});
    }
    return cases;
}
