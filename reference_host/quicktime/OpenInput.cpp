// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/quicktime/OpenInput.h"

extern "C" {
#include <libavutil/dict.h>
}

#include <cstring>
#include <string_view>

namespace host {
namespace {

std::string ErrorText(int error) {
    char text[AV_ERROR_MAX_STRING_SIZE] = {};
    av_strerror(error, text, sizeof text);
    return text;
}

// Whether every sound and picture stream tells its form already; most files do
// in their headers, and reading on would cost what decoding costs.
bool AreStreamsKnown(const AVFormatContext& input) {
    for (unsigned i = 0; i < input.nb_streams; ++i) {
        const AVCodecParameters& form = *input.streams[i]->codecpar;
        if (form.codec_type == AVMEDIA_TYPE_AUDIO &&
            (form.sample_rate <= 0 || form.ch_layout.nb_channels <= 0)) {
            return false;
        }
        if (form.codec_type == AVMEDIA_TYPE_VIDEO && (form.width <= 0 || form.height <= 0)) {
            return false;
        }
    }
    return input.nb_streams > 0;
}

}  // namespace

InputOwner OpenInput(const std::filesystem::path& path, InputView view, std::string& reason) {
    AVFormatContext* opened = nullptr;
    AVDictionary* options = nullptr;
    // A file that names others, such as a playlist, reaches none of them.
    av_dict_set(&options, "protocol_whitelist", "file", 0);
    if (view == InputView::WholeMedia) {
        av_dict_set(&options, "ignore_editlist", "1", 0);
    }
    const int error =
        avformat_open_input(&opened, ("file:" + path.string()).c_str(), nullptr, &options);
    av_dict_free(&options);
    if (error < 0) {
        reason = ErrorText(error);
        return nullptr;
    }
    InputOwner input(opened);
    if (!AreStreamsKnown(*input)) {
        FindStreamDetails(*input);
    }
    if (input->nb_streams == 0) {
        reason = "the file holds no tracks";
        return nullptr;
    }
    return input;
}

bool IsMovieFamily(const AVFormatContext& input) {
    return std::string_view(input.iformat->name).find("mov") != std::string_view::npos;
}

bool IsStillPicture(const AVFormatContext& input) {
    const std::string_view name = input.iformat->name;
    const std::string_view pipe = "_pipe";
    return name == "image2" ||
           (name.size() > pipe.size() && name.substr(name.size() - pipe.size()) == pipe);
}

void FindStreamDetails(AVFormatContext& input) {
    static char mark;
    // The library does not survive being asked twice.
    if (input.opaque != &mark) {
        input.opaque = &mark;
        avformat_find_stream_info(&input, nullptr);
    }
}

void UseOneStream(AVFormatContext& input, int stream) {
    for (unsigned i = 0; i < input.nb_streams; ++i) {
        input.streams[i]->discard =
            static_cast<int>(i) == stream ? AVDISCARD_DEFAULT : AVDISCARD_ALL;
    }
}

}  // namespace host
