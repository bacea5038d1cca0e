// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/quicktime/OpenProblem.h"

#include <algorithm>
#include <cerrno>
#include <iterator>

#include "reference_host/header_parser/Atom.h"
#include "reference_host/quicktime/MovieFile.h"
#include "reference_host/quicktime/OpenInput.h"
#include "reference_host/quicktime/RasterClaim.h"

extern "C" {
#include <libavcodec/avcodec.h>
#include <libavformat/avformat.h>
#include <libavutil/avutil.h>
#include <libavutil/bswap.h>
#include <libavutil/error.h>
}

namespace host {
namespace {

using header_parser::Code;

constexpr ncfUInt32 kEncrypted[] = {Code("encv"), Code("enca"), Code("drmi"), Code("drms")};

ncfUInt32 CodeOf(const AVCodecParameters& form) {
    return av_bswap32(form.codec_tag);
}

// Whether a codec of that code is one of the other kind of track.
bool IsOfOtherKind(const AVCodecParameters& form) {
    const AVCodecTag* const tags[] = {form.codec_type == AVMEDIA_TYPE_AUDIO
                                          ? avformat_get_mov_video_tags()
                                          : avformat_get_mov_audio_tags(),
                                      nullptr};
    return form.codec_tag != 0 && av_codec_get_id(tags, form.codec_tag) != AV_CODEC_ID_NONE;
}

// What a decoder says when it rejects the description of its samples.
std::string OpeningProblem(const AVCodec& decoder, const AVCodecParameters& form) {
    AVCodecContext* context = avcodec_alloc_context3(&decoder);
    int result = context ? avcodec_parameters_to_context(context, &form) : AVERROR(ENOMEM);
    if (result >= 0) {
        result = avcodec_open2(context, &decoder, nullptr);
    }
    avcodec_free_context(&context);
    char text[AV_ERROR_MAX_STRING_SIZE] = {};
    av_strerror(result, text, sizeof text);
    return result < 0 ? text : std::string();
}

CodecProblem ProblemOf(const AVStream& stream) {
    const AVCodecParameters& form = *stream.codecpar;
    const bool isSound = form.codec_type == AVMEDIA_TYPE_AUDIO;
    const ncfUInt32 code = CodeOf(form);
    const std::string track = "track " + std::to_string(stream.index + 1) + " of the file: ";
    const std::string name = header_parser::NameOf(code);
    if (IsEncrypted(code)) {
        return {track + "its samples are encrypted (" + name + ")", code};
    }
    if (const AVCodec* const decoder = avcodec_find_decoder(form.codec_id)) {
        const std::string refused = OpeningProblem(*decoder, form);
        return refused.empty() ? CodecProblem()
                               : CodecProblem{track + "the decoder of its codec " + name +
                                                  " rejects its description: " + refused,
                                              code};
    }
    if (IsOfOtherKind(form)) {
        return {track + "its handler calls it " + (isSound ? "sound" : "pictures") +
                    ", but its codec " + name + " is for " + (isSound ? "pictures" : "sound"),
                code};
    }
    const AVCodecDescriptor* const known = avcodec_descriptor_get(form.codec_id);
    return {track + "no decoder is known for its codec " + name +
                (known ? std::string(", ") + known->long_name : std::string()),
            code};
}

}  // namespace

std::string OpenProblem(const std::filesystem::path& path) {
    std::string reason;
    return MovieFile::Open(path, reason) ? std::string() : reason;
}

CodecProblem DecoderProblem(const std::filesystem::path& path, std::size_t track) {
    std::string reason;
    const InputOwner input = OpenInput(path, InputView::AsPresented, reason);
    return input && track < input->nb_streams ? ProblemOf(*input->streams[track]) : CodecProblem();
}

bool IsEncrypted(std::uint32_t code) {
    return std::find(std::begin(kEncrypted), std::end(kEncrypted), code) != std::end(kEncrypted);
}

CodecProblem DecoderProblem(const std::filesystem::path& path, bool ofSound, std::size_t place) {
    std::string reason;
    const InputOwner input = OpenInput(path, InputView::AsPresented, reason);
    const AVMediaType wanted = ofSound ? AVMEDIA_TYPE_AUDIO : AVMEDIA_TYPE_VIDEO;
    for (unsigned i = 0; input && i < input->nb_streams; ++i) {
        const AVStream& stream = *input->streams[i];
        if (stream.codecpar->codec_type != wanted ||
            (stream.disposition & AV_DISPOSITION_ATTACHED_PIC) != 0) {
            continue;
        }
        if (place-- == 0) {
            return ProblemOf(stream);
        }
    }
    return {};
}

std::string RasterProblem(const std::filesystem::path& path) {
    std::string reason;
    const InputOwner input = OpenInput(path, InputView::AsPresented, reason);
    for (unsigned i = 0; input && i < input->nb_streams; ++i) {
        const AVStream& stream = *input->streams[i];
        if (stream.codecpar->codec_type == AVMEDIA_TYPE_VIDEO &&
            (stream.disposition & AV_DISPOSITION_ATTACHED_PIC) == 0) {
            const std::string claim = FindImpossibleRaster(path, static_cast<int>(i));
            return claim.empty() ? claim
                                 : "track " + std::to_string(i + 1) + " of the file: " + claim;
        }
    }
    return {};
}

bool NeedsRasterCheck(const std::filesystem::path& path) {
    return TellsLargePictures(path);
}

}  // namespace host
