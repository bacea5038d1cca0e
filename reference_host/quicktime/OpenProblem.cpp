// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/quicktime/OpenProblem.h"

#include <cerrno>

#include "reference_host/header_parser/Atom.h"
#include "reference_host/quicktime/CodecNames.h"
#include "reference_host/quicktime/HeaderLook.h"
#include "reference_host/quicktime/MovieFile.h"
#include "reference_host/quicktime/OpenInput.h"
#include "reference_host/quicktime/RasterClaim.h"

extern "C" {
#include <libavcodec/avcodec.h>
#include <libavformat/avformat.h>
#include <libavutil/avutil.h>
#include <libavutil/error.h>
}

namespace host {
namespace {

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
    const CodecOwner context(avcodec_alloc_context3(&decoder));
    int result = context ? avcodec_parameters_to_context(context.get(), &form) : AVERROR(ENOMEM);
    if (result >= 0) {
        result = avcodec_open2(context.get(), &decoder, nullptr);
    }
    return result < 0 ? ErrorText(result) : std::string();
}

// One of the streams of a kind, counted from 0; null for none. A picture attached
// to sound is none.
const AVStream* FindOfKind(const AVFormatContext& input, AVMediaType kind, std::size_t place) {
    for (unsigned i = 0; i < input.nb_streams; ++i) {
        const AVStream& stream = *input.streams[i];
        if (stream.codecpar->codec_type == kind &&
            (stream.disposition & AV_DISPOSITION_ATTACHED_PIC) == 0 && place-- == 0) {
            return &stream;
        }
    }
    return nullptr;
}

CodecProblem ProblemOf(const AVStream& stream) {
    const AVCodecParameters& form = *stream.codecpar;
    const bool isSound = form.codec_type == AVMEDIA_TYPE_AUDIO;
    const ncfUInt32 code = CodeOfTag(form.codec_tag);
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
    const auto stream = static_cast<int>(track);
    const InputOwner input = OpenForStream(path, InputView::AsPresented, stream);
    return input ? ProblemOf(*input->streams[stream]) : CodecProblem();
}

CodecProblem DecoderProblem(const std::filesystem::path& path, bool ofSound, std::size_t place) {
    std::string reason;
    const InputOwner input = OpenInput(path, InputView::AsPresented, reason);
    const AVStream* const stream =
        input ? FindOfKind(*input, ofSound ? AVMEDIA_TYPE_AUDIO : AVMEDIA_TYPE_VIDEO, place)
              : nullptr;
    return stream ? ProblemOf(*stream) : CodecProblem();
}

std::string RasterProblem(const std::filesystem::path& path) {
    std::string reason;
    const InputOwner input = OpenInput(path, InputView::AsPresented, reason);
    const AVStream* const stream = input ? FindOfKind(*input, AVMEDIA_TYPE_VIDEO, 0) : nullptr;
    const std::string claim = stream ? FindImpossibleRaster(path, stream->index) : std::string();
    return claim.empty() ? claim
                         : "track " + std::to_string(stream->index + 1) + " of the file: " + claim;
}

}  // namespace host
