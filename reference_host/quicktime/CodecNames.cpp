// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/quicktime/CodecNames.h"

extern "C" {
#include <libavcodec/codec_desc.h>
#include <libavformat/avformat.h>
#include <libavutil/bswap.h>
}

#include "reference_host/header_parser/Atom.h"

namespace host {
namespace {

using header_parser::Code;
using header_parser::IsText;

struct Row {
    ncfUInt32 code;
    const char* name;
};

// Names that people know codecs by; the multimedia library's own are often
// those of a family, where the code tells one of its members.
constexpr Row kNames[] = {
    {Code("apco"), "Apple ProRes 422 Proxy"},
    {Code("apcs"), "Apple ProRes 422 LT"},
    {Code("apcn"), "Apple ProRes 422"},
    {Code("apch"), "Apple ProRes 422 HQ"},
    {Code("ap4h"), "Apple ProRes 4444"},
    {Code("ap4x"), "Apple ProRes 4444 XQ"},
    {Code("avc1"), "H.264"},
    {Code("avc2"), "H.264"},
    {Code("avc3"), "H.264"},
    {Code("avc4"), "H.264"},
    {Code("hvc1"), "HEVC"},
    {Code("hev1"), "HEVC"},
    {Code("dvh1"), "HEVC with Dolby Vision"},
    {Code("dvhe"), "HEVC with Dolby Vision"},
    {Code("av01"), "AV1"},
    {Code("vp08"), "VP8"},
    {Code("vp09"), "VP9"},
    {Code("mp4v"), "MPEG-4 Video"},
    {Code("mp1v"), "MPEG-1 Video"},
    {Code("mp2v"), "MPEG-2 Video"},
    {Code("m2v1"), "MPEG-2 Video"},
    {Code("mpeg"), "MPEG-1 Video"},
    {Code("jpeg"), "Photo - JPEG"},
    {Code("mjpa"), "Motion JPEG A"},
    {Code("mjpb"), "Motion JPEG B"},
    {Code("mjp2"), "Motion JPEG 2000"},
    {Code("png "), "PNG"},
    {Code("tiff"), "TIFF"},
    {Code("gif "), "GIF"},
    {Code("rle "), "Animation"},
    {Code("cvid"), "Cinepak"},
    {Code("rpza"), "Video"},
    {Code("smc "), "Graphics"},
    {Code("8BPS"), "Planar RGB"},
    {Code("SVQ1"), "Sorenson Video"},
    {Code("SVQ3"), "Sorenson Video 3"},
    {Code("h261"), "H.261"},
    {Code("h263"), "H.263"},
    {Code("s263"), "H.263"},
    {Code("dvc "), "DV25 NTSC"},
    {Code("dvcp"), "DV25 PAL"},
    {Code("dvpp"), "DVCPRO PAL"},
    {Code("dvpn"), "DVCPRO NTSC"},
    {Code("dv5p"), "DVCPRO50 PAL"},
    {Code("dv5n"), "DVCPRO50 NTSC"},
    {Code("dvhp"), "DVCPRO HD 720p60"},
    {Code("dvhq"), "DVCPRO HD 720p50"},
    {Code("dvh5"), "DVCPRO HD 1080i50"},
    {Code("dvh6"), "DVCPRO HD 1080i60"},
    {Code("dvh3"), "DVCPRO HD 1080p30"},
    {Code("dvh2"), "DVCPRO HD 1080p25"},
    {Code("hdv1"), "HDV 720p30"},
    {Code("hdv2"), "HDV 1080i60"},
    {Code("hdv3"), "HDV 1080i50"},
    {Code("hdv4"), "HDV 720p24"},
    {Code("hdv5"), "HDV 720p25"},
    {Code("hdv6"), "HDV 1080p24"},
    {Code("hdv7"), "HDV 1080p25"},
    {Code("hdv8"), "HDV 1080p30"},
    {Code("hdv9"), "HDV 720p60"},
    {Code("hdva"), "HDV 720p50"},
    {Code("mx3n"), "IMX 30 NTSC"},
    {Code("mx3p"), "IMX 30 PAL"},
    {Code("mx4n"), "IMX 40 NTSC"},
    {Code("mx4p"), "IMX 40 PAL"},
    {Code("mx5n"), "IMX 50 NTSC"},
    {Code("mx5p"), "IMX 50 PAL"},
    {Code("v210"), "Uncompressed 10-bit 4:2:2"},
    {Code("2vuy"), "Uncompressed 8-bit 4:2:2"},
    {Code("yuv2"), "Component Video"},
    {Code("yuvs"), "Component Video"},
    {Code("v308"), "Uncompressed 8-bit 4:4:4"},
    {Code("v408"), "Uncompressed 8-bit 4:4:4:4"},
    {Code("v410"), "Uncompressed 10-bit 4:4:4"},
    {Code("r210"), "Uncompressed 10-bit RGB"},
    {Code("b48r"), "Uncompressed 16-bit RGB"},
    {Code("b64a"), "Uncompressed 16-bit RGB with Alpha"},
    {Code("r4fl"), "Uncompressed 32-bit Float"},
    {Code("raw "), "Uncompressed RGB"},
    {Code("AVdn"), "VC-3"},
    {Code("AVdh"), "VC-3 HR"},
    {Code("CFHD"), "CineForm"},
    {Code("Hap1"), "Hap"},
    {Code("Hap5"), "Hap Alpha"},
    {Code("HapY"), "Hap Q"},
    {Code("icod"), "Apple Intermediate Codec"},
    {Code("mp4a"), "AAC"},
    {Code("alac"), "Apple Lossless"},
    {Code("ac-3"), "AC-3"},
    {Code("sowt"), "Linear PCM"},
    {Code("twos"), "Linear PCM"},
    {Code("lpcm"), "Linear PCM"},
};

// Families whose codes count upward with raster and rate.
constexpr Row kFamilies[] = {
    {Code("xdv."), "XDCAM EX"},      {Code("xd5."), "XDCAM HD422"},
    {Code("xdh."), "XDCAM HD 540p"}, {Code("ai1."), "AVC-Intra 100"},
    {Code("ai5."), "AVC-Intra 50"},
};

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
        const std::string name = LibraryName(av_codec_get_id(tables, CodeOfTag(code)));
        if (!name.empty()) {
            return name;
        }
    }
    return {};
}

// By the rows above alone; empty for other codes.
std::string OwnName(ncfUInt32 code) {
    for (const Row& row : kNames) {
        if (row.code == code) {
            return row.name;
        }
    }
    for (const Row& row : kFamilies) {
        if (row.code >> 8 == code >> 8) {
            return row.name;
        }
    }
    return {};
}

// Codes of still pictures that movies hold by another codec's name.
struct StillRow {
    AVCodecID codec;
    ncfUInt32 code;
};
constexpr StillRow kStills[] = {
    {AV_CODEC_ID_BMP, Code("WRLE")}, {AV_CODEC_ID_PSD, Code("8BPS")},
    {AV_CODEC_ID_SGI, Code(".SGI")}, {AV_CODEC_ID_TARGA, Code("tga ")},
    {AV_CODEC_ID_PCX, Code("PCX ")},
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
    const ncfUInt32 code = CodeOfTag(av_codec_get_tag(tables, form.codec_id));
    return IsText(code) ? code : 0;
}

}  // namespace

ncfUInt32 CodeOfTag(unsigned tag) {
    return av_bswap32(tag);
}

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
    if (IsText(CodeOfTag(form.codec_tag))) {
        return CodeOfTag(form.codec_tag);
    }
    if (const ncfUInt32 code = CodeInMovies(form)) {
        return code;
    }
    for (const StillRow& row : kStills) {
        if (row.codec == form.codec_id) {
            return row.code;
        }
    }
    const AVCodecTag* const tables[] = {avformat_get_riff_video_tags(), nullptr};
    const ncfUInt32 code = CodeOfTag(av_codec_get_tag(tables, form.codec_id));
    const AVCodecDescriptor* const codec = avcodec_descriptor_get(form.codec_id);
    return IsText(code) ? code : codec ? CodeOf(codec->name) : 0;
}

std::string CodecNameOf(const AVCodecParameters& form) {
    std::string name = OwnName(CodeOfTag(form.codec_tag));
    if (name.empty() && !HasManyCodes(form.codec_id)) {
        name = OwnName(CodeInMovies(form));
    }
    if (name.empty()) {
        name = LibraryName(form.codec_id);
    }
    if (name.empty() && IsText(CodeOfTag(form.codec_tag))) {
        name = LibraryName(CodeOfTag(form.codec_tag));
    }
    return name;
}

}  // namespace host
