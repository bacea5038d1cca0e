// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/quicktime/OpenProblem.h"

#include "reference_host/quicktime/MovieFile.h"
#include "reference_host/quicktime/OpenInput.h"
#include "reference_host/quicktime/RasterClaim.h"

extern "C" {
#include <libavcodec/avcodec.h>
#include <libavutil/avutil.h>
}

namespace host {

std::string OpenProblem(const std::filesystem::path& path) {
    std::string reason;
    return MovieFile::Open(path, reason) ? std::string() : reason;
}

std::string DecoderProblem(const std::filesystem::path& path, bool ofSound, std::size_t place) {
    std::string reason;
    const InputOwner input = OpenInput(path, InputView::AsPresented, reason);
    const AVMediaType wanted = ofSound ? AVMEDIA_TYPE_AUDIO : AVMEDIA_TYPE_VIDEO;
    for (unsigned i = 0; input && i < input->nb_streams; ++i) {
        const AVStream& stream = *input->streams[i];
        if (stream.codecpar->codec_type != wanted ||
            (stream.disposition & AV_DISPOSITION_ATTACHED_PIC) != 0) {
            continue;
        }
        if (place-- > 0) {
            continue;
        }
        if (avcodec_find_decoder(stream.codecpar->codec_id)) {
            return {};
        }
        char code[AV_FOURCC_MAX_STRING_SIZE] = {};
        av_fourcc_make_string(code, stream.codecpar->codec_tag);
        const AVCodecDescriptor* const known = avcodec_descriptor_get(stream.codecpar->codec_id);
        return "track " + std::to_string(i + 1) +
               " of the file: no decoder is known for its codec '" + code + "'" +
               (known ? std::string(", ") + known->long_name : std::string());
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
