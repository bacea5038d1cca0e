// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/quicktime/CodecNames.h"

extern "C" {
#include <libavcodec/codec_desc.h>
#include <libavformat/avformat.h>
}

namespace host {
namespace {

struct Row {
    char code[5];
    const char* name;
};

// Names that people know codecs by; the multimedia library's own are often
// those of a family, where the code tells one of its members.
constexpr Row kNames[] = {
    {"apco", "Apple ProRes 422 Proxy"},
    {"apcs", "Apple ProRes 422 LT"},
    {"apcn", "Apple ProRes 422"},
    {"apch", "Apple ProRes 422 HQ"},
    {"ap4h", "Apple ProRes 4444"},
    {"ap4x", "Apple ProRes 4444 XQ"},
    {"avc1", "H.264"},
    {"avc2", "H.264"},
    {"avc3", "H.264"},
    {"avc4", "H.264"},
    {"hvc1", "HEVC"},
    {"hev1", "HEVC"},
    {"dvh1", "HEVC with Dolby Vision"},
    {"dvhe", "HEVC with Dolby Vision"},
    {"av01", "AV1"},
    {"vp08", "VP8"},
    {"vp09", "VP9"},
    {"mp4v", "MPEG-4 Video"},
    {"mp1v", "MPEG-1 Video"},
    {"mp2v", "MPEG-2 Video"},
    {"m2v1", "MPEG-2 Video"},
    {"mpeg", "MPEG-1 Video"},
    {"jpeg", "Photo - JPEG"},
    {"mjpa", "Motion JPEG A"},
    {"mjpb", "Motion JPEG B"},
    {"mjp2", "Motion JPEG 2000"},
    {"png ", "PNG"},
    {"tiff", "TIFF"},
    {"gif ", "GIF"},
    {"rle ", "Animation"},
    {"cvid", "Cinepak"},
    {"rpza", "Video"},
    {"smc ", "Graphics"},
    {"8BPS", "Planar RGB"},
    {"SVQ1", "Sorenson Video"},
    {"SVQ3", "Sorenson Video 3"},
    {"h261", "H.261"},
    {"h263", "H.263"},
    {"s263", "H.263"},
    {"dvc ", "DV25 NTSC"},
    {"dvcp", "DV25 PAL"},
    {"dvpp", "DVCPRO PAL"},
    {"dvpn", "DVCPRO NTSC"},
    {"dv5p", "DVCPRO50 PAL"},
    {"dv5n", "DVCPRO50 NTSC"},
    {"dvhp", "DVCPRO HD 720p60"},
    {"dvhq", "DVCPRO HD 720p50"},
    {"dvh5", "DVCPRO HD 1080i50"},
    {"dvh6", "DVCPRO HD 1080i60"},
    {"dvh3", "DVCPRO HD 1080p30"},
    {"dvh2", "DVCPRO HD 1080p25"},
    {"hdv1", "HDV 720p30"},
    {"hdv2", "HDV 1080i60"},
    {"hdv3", "HDV 1080i50"},
    {"hdv4", "HDV 720p24"},
    {"hdv5", "HDV 720p25"},
    {"hdv6", "HDV 1080p24"},
    {"hdv7", "HDV 1080p25"},
    {"hdv8", "HDV 1080p30"},
    {"hdv9", "HDV 720p60"},
    {"hdva", "HDV 720p50"},
    {"mx3n", "IMX 30 NTSC"},
    {"mx3p", "IMX 30 PAL"},
    {"mx4n", "IMX 40 NTSC"},
    {"mx4p", "IMX 40 PAL"},
    {"mx5n", "IMX 50 NTSC"},
    {"mx5p", "IMX 50 PAL"},
    {"v210", "Uncompressed 10-bit 4:2:2"},
    {"2vuy", "Uncompressed 8-bit 4:2:2"},
    {"yuv2", "Component Video"},
    {"yuvs", "Component Video"},
    {"v308", "Uncompressed 8-bit 4:4:4"},
    {"v408", "Uncompressed 8-bit 4:4:4:4"},
    {"v410", "Uncompressed 10-bit 4:4:4"},
    {"r210", "Uncompressed 10-bit RGB"},
    {"b48r", "Uncompressed 16-bit RGB"},
    {"b64a", "Uncompressed 16-bit RGB with Alpha"},
    {"r4fl", "Uncompressed 32-bit Float"},
    {"raw ", "Uncompressed RGB"},
    {"AVdn", "VC-3"},
    {"AVdh", "VC-3 HR"},
    {"CFHD", "CineForm"},
    {"Hap1", "Hap"},
    {"Hap5", "Hap Alpha"},
    {"HapY", "Hap Q"},
    {"icod", "Apple Intermediate Codec"},
    {"mp4a", "AAC"},
    {"alac", "Apple Lossless"},
    {"ac-3", "AC-3"},
    {"sowt", "Linear PCM"},
    {"twos", "Linear PCM"},
    {"lpcm", "Linear PCM"},
};

// Families whose codes count upward with raster and rate.
struct FamilyRow {
    const char* start;
    const char* name;
};
constexpr FamilyRow kFamilies[] = {
    {"xdv", "XDCAM EX"},      {"xd5", "XDCAM HD422"},  {"xdh", "XDCAM HD 540p"},
    {"ai1", "AVC-Intra 100"}, {"ai5", "AVC-Intra 50"},
};

std::string TextOf(ncfUInt32 code) {
    std::string text;
    for (const int shift : {24, 16, 8, 0}) {
        text += static_cast<char>(code >> shift & 0xFF);
    }
    return text;
}

ncfUInt32 Swapped(ncfUInt32 tag) {
    return tag << 24 | (tag & 0xFF00u) << 8 | (tag >> 8 & 0xFF00u) | tag >> 24;
}

bool IsText(ncfUInt32 code) {
    for (const int shift : {24, 16, 8, 0}) {
        const ncfUInt32 c = code >> shift & 0xFF;
        if (c < 0x20 || c > 0x7E) {
            return false;
        }
    }
    return true;
}

std::string LibraryName(AVCodecID codec) {
    const AVCodecDescriptor* const descriptor = avcodec_descriptor_get(codec);
    return !descriptor ? "" : descriptor->long_name ? descriptor->long_name : descriptor->name;
}

// The multimedia library's own long name, by the tags of movie files and of the
// other family of files that has tags.
std::string LibraryName(ncfUInt32 code) {
    for (const AVCodecTag* const table :
         {avformat_get_mov_video_tags(), avformat_get_mov_audio_tags(),
          avformat_get_riff_video_tags()}) {
        const AVCodecTag* const tables[] = {table, nullptr};
        const std::string name = LibraryName(av_codec_get_id(tables, Swapped(code)));
        if (!name.empty()) {
            return name;
        }
    }
    return {};
}

// By the rows above alone; empty for other codes.
std::string OwnName(ncfUInt32 code) {
    const std::string text = TextOf(code);
    for (const Row& row : kNames) {
        if (text == row.code) {
            return row.name;
        }
    }
    for (const FamilyRow& row : kFamilies) {
        if (text.compare(0, 3, row.start) == 0) {
            return row.name;
        }
    }
    return {};
}

// Codes of still pictures that movies hold by another codec's name.
struct StillRow {
    AVCodecID codec;
    const char* code;
};
constexpr StillRow kStills[] = {
    {AV_CODEC_ID_BMP, "WRLE"},   {AV_CODEC_ID_PSD, "8BPS"}, {AV_CODEC_ID_SGI, ".SGI"},
    {AV_CODEC_ID_TARGA, "tga "}, {AV_CODEC_ID_PCX, "PCX "},
};

// The first four characters, spaces behind a shorter text.
ncfUInt32 CodeOf(const char* text) {
    ncfUInt32 code = 0;
    for (int i = 0; i < 4; ++i) {
        code = code << 8 | static_cast<unsigned char>(*text != 0 ? *text++ : ' ');
    }
    return code;
}

// Codecs with several codes in movies, each of which means something of its own.
bool HasManyCodes(AVCodecID codec) {
    return codec == AV_CODEC_ID_PRORES || codec == AV_CODEC_ID_DVVIDEO ||
           codec == AV_CODEC_ID_RAWVIDEO;
}

ncfUInt32 CodeInMovies(const AVCodecParameters& form) {
    const AVCodecTag* const tables[] = {form.codec_type == AVMEDIA_TYPE_AUDIO
                                            ? avformat_get_mov_audio_tags()
                                            : avformat_get_mov_video_tags(),
                                        nullptr};
    const ncfUInt32 code = Swapped(av_codec_get_tag(tables, form.codec_id));
    return IsText(code) ? code : 0;
}

}  // namespace

NCFRESULT CodecName(ncfUInt32 code, std::string& name) {
    if (!IsText(code)) {
        return NCF_E_INVALIDARG;
    }
    name = OwnName(code);
    if (name.empty()) {
        name = LibraryName(code);
    }
    return NCF_OK;
}

ncfUInt32 CodecCode(const AVCodecParameters& form) {
    if (IsText(Swapped(form.codec_tag))) {
        return Swapped(form.codec_tag);
    }
    if (const ncfUInt32 code = CodeInMovies(form)) {
        return code;
    }
    for (const StillRow& row : kStills) {
        if (row.codec == form.codec_id) {
            return CodeOf(row.code);
        }
    }
    const AVCodecTag* const tables[] = {avformat_get_riff_video_tags(), nullptr};
    const ncfUInt32 code = Swapped(av_codec_get_tag(tables, form.codec_id));
    const AVCodecDescriptor* const codec = avcodec_descriptor_get(form.codec_id);
    return IsText(code) ? code : codec ? CodeOf(codec->name) : 0;
}

std::string CodecNameOf(const AVCodecParameters& form) {
    std::string name = OwnName(Swapped(form.codec_tag));
    if (name.empty() && !HasManyCodes(form.codec_id)) {
        name = OwnName(CodeInMovies(form));
    }
    if (name.empty()) {
        name = LibraryName(form.codec_id);
    }
    if (name.empty() && IsText(Swapped(form.codec_tag))) {
        name = LibraryName(Swapped(form.codec_tag));
    }
    return name;
}

}  // namespace host
