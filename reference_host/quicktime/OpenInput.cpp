// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/quicktime/OpenInput.h"

extern "C" {
#include <libavutil/dict.h>
#include <libavutil/mem.h>
}

#include <algorithm>
#include <cerrno>
#include <cstdio>
#include <fstream>
#include <optional>
#include <string_view>

#include "reference_host/quicktime/MovieAtoms.h"
#include "reference_host/quicktime/TableClaims.h"

namespace host {
namespace {

// The largest block that the library may ask for. A picture of 16384 x 16384
// with an alpha takes all of it.
constexpr std::size_t kLargestBlock = std::size_t{1} << 30;

constexpr int kBufferBytes = 32768;

char detailsMark;

// The one file that an input reads. The library has a buffer of its own, and
// lets no exception through.
int ReadBytes(void* file, std::uint8_t* to, int size) {
    try {
        const auto got = static_cast<std::filebuf*>(file)->sgetn(reinterpret_cast<char*>(to), size);
        return got > 0 ? static_cast<int>(got) : AVERROR_EOF;
    } catch (...) {
        return AVERROR(EIO);  // the file can't be read there
    }
}

int64_t SeekBytes(void* file, int64_t offset, int whence) {
    try {
        auto& bytes = *static_cast<std::filebuf*>(file);
        if ((whence & AVSEEK_SIZE) != 0) {
            const auto here = bytes.pubseekoff(0, std::ios::cur, std::ios::in);
            const auto end = bytes.pubseekoff(0, std::ios::end, std::ios::in);
            bytes.pubseekpos(here, std::ios::in);
            return end;
        }
        const auto from = whence & ~AVSEEK_FORCE;
        return bytes.pubseekoff(offset,
                                from == SEEK_SET   ? std::ios::beg
                                : from == SEEK_CUR ? std::ios::cur
                                                   : std::ios::end,
                                std::ios::in);
    } catch (...) {
        return AVERROR(EIO);
    }
}

void CloseBytes(AVIOContext* bytes) {
    if (bytes) {
        delete static_cast<std::filebuf*>(bytes->opaque);
        av_freep(&bytes->buffer);
        avio_context_free(&bytes);
    }
}

AVIOContext* OpenBytes(const std::filesystem::path& path) {
    std::error_code error;
    if (!std::filesystem::is_regular_file(path, error)) {
        return nullptr;  // a pipe would be waited for
    }
    auto file = std::make_unique<std::filebuf>();
    file->pubsetbuf(nullptr, 0);
    auto* const buffer = static_cast<unsigned char*>(av_malloc(kBufferBytes));
    if (!buffer || !file->open(path, std::ios::in | std::ios::binary)) {
        av_free(buffer);
        return nullptr;
    }
    AVIOContext* const bytes =
        avio_alloc_context(buffer, kBufferBytes, 0, file.get(), ReadBytes, nullptr, SeekBytes);
    if (!bytes) {
        av_free(buffer);
        return nullptr;
    }
    file.release();
    return bytes;
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

// The library knows whole numbers of this form of linear sound, `ipcm`, but no
// floating-point ones.
void NameFloatSound(AVFormatContext& input, const std::filesystem::path& path) {
    constexpr unsigned kFloatTag = MKTAG('f', 'p', 'c', 'm');
    std::optional<MovieAtoms> atoms;
    for (unsigned i = 0; i < input.nb_streams; ++i) {
        AVCodecParameters& form = *input.streams[i]->codecpar;
        if (form.codec_tag != kFloatTag || form.codec_id != AV_CODEC_ID_NONE) {
            continue;
        }
        if (!atoms) {
            atoms = ReadMovieAtoms(path);
        }
        const auto* const track = atoms->Find(static_cast<ncfUInt32>(input.streams[i]->id));
        const ncfUInt32 bits = track && track->linearBits != 0
                                   ? track->linearBits
                                   : static_cast<ncfUInt32>(form.bits_per_coded_sample);
        const bool isLittle = track && track->isLittleEndian;
        form.codec_id = bits == 32   ? isLittle ? AV_CODEC_ID_PCM_F32LE : AV_CODEC_ID_PCM_F32BE
                        : bits == 64 ? isLittle ? AV_CODEC_ID_PCM_F64LE : AV_CODEC_ID_PCM_F64BE
                                     : AV_CODEC_ID_NONE;
        form.bits_per_coded_sample = static_cast<int>(bits);
    }
}

// Of MPEG-4 the library keeps the size that the first samples tell. That of the
// description counts, as for all others: it is what a host makes its buffers for.
void TakeSizesOfDescriptions(AVFormatContext& input, const std::filesystem::path& path) {
    const MovieAtoms atoms = ReadMovieAtoms(path);
    for (unsigned i = 0; i < input.nb_streams; ++i) {
        AVCodecParameters& form = *input.streams[i]->codecpar;
        const auto id = static_cast<ncfUInt32>(input.streams[i]->id);
        const bool isOne = std::count_if(atoms.tracks.begin(), atoms.tracks.end(),
                                         [id](const auto& each) { return each.id == id; }) == 1;
        const auto* const track = isOne ? atoms.Find(id) : nullptr;
        if (form.codec_type == AVMEDIA_TYPE_VIDEO && track && track->width > 0 &&
            track->height > 0) {
            form.width = static_cast<int>(track->width);
            form.height = static_cast<int>(track->height);
        }
    }
}

int CountChannels(const AVFormatContext& input) {
    int channels = 0;
    for (unsigned i = 0; i < input.nb_streams && channels <= kMostChannelsOfMovie; ++i) {
        const int more = input.streams[i]->codecpar->ch_layout.nb_channels;
        channels += std::clamp(more, 0, kMostChannelsOfMovie + 1);
    }
    return channels;
}

// What is wrong with an input that the library opened, empty for nothing.
std::string FindFault(const AVFormatContext& input) {
    if (input.nb_streams == 0) {
        return "the file holds no tracks";
    }
    if (CountChannels(input) > kMostChannelsOfMovie) {
        return TooManyChannels();
    }
    return {};
}

}  // namespace

InputOwner OpenForStream(const std::filesystem::path& path, InputView view, int stream) {
    std::string ignored;
    InputOwner input = OpenInput(path, view, ignored);
    return input && stream >= 0 && stream < static_cast<int>(input->nb_streams) ? std::move(input)
                                                                                : nullptr;
}

std::string ErrorText(int error) {
    char text[AV_ERROR_MAX_STRING_SIZE] = {};
    av_strerror(error, text, sizeof text);
    return text;
}

std::string TooManyChannels() {
    return "the sound tracks of the movie have more than " + std::to_string(kMostChannelsOfMovie) +
           " channels in total";
}

void CloseInput::operator()(AVFormatContext* context) const {
    AVIOContext* const bytes = context->pb;  // the library closes none that it was given
    avformat_close_input(&context);
    CloseBytes(bytes);
}

InputOwner OpenInput(const std::filesystem::path& path, InputView view, std::string& reason) {
    AVFormatContext* opened = avformat_alloc_context();
    AVIOContext* const bytes = opened ? OpenBytes(path) : nullptr;
    if (!bytes) {
        avformat_free_context(opened);
        reason = "the file can't be read";
        return nullptr;
    }
    if (std::string claim = FindImpossibleTable(path); !claim.empty()) {
        avformat_free_context(opened);
        CloseBytes(bytes);
        reason = std::move(claim);
        return nullptr;
    }
    av_max_alloc(kLargestBlock);
    opened->pb = bytes;
    AVDictionary* options = nullptr;
    // The bytes are at hand, so no way of reaching a file is needed.
    av_dict_set(&options, "protocol_whitelist", "none", 0);
    // A track that names another as its chapters changes nothing of that other,
    // which the library would take for no picture track.
    av_dict_set(&options, "ignore_chapters", "1", 0);
    if (view == InputView::WholeMedia) {
        av_dict_set(&options, "ignore_editlist", "1", 0);
    }
    const int error = avformat_open_input(&opened, path.u8string().c_str(), nullptr, &options);
    av_dict_free(&options);
    if (error < 0) {
        CloseBytes(bytes);
        reason = ErrorText(error);
        return nullptr;
    }
    InputOwner input(opened);
    if (IsMovieFamily(*input)) {
        NameFloatSound(*input, path);
    }
    if (CountChannels(*input) <= kMostChannelsOfMovie && !AreStreamsKnown(*input)) {
        FindStreamDetails(*input);
        if (IsMovieFamily(*input)) {
            TakeSizesOfDescriptions(*input, path);
        }
    }
    reason = FindFault(*input);
    return reason.empty() ? std::move(input) : nullptr;
}

bool IsMovieFamily(const AVFormatContext& input) {
    return std::string_view(input.iformat->name).find("mov") != std::string_view::npos;
}

bool TellsTimesOfAll(const AVFormatContext& input) {
    return (input.iformat->flags & AVFMT_NOTIMESTAMPS) == 0 &&
           std::string_view(input.iformat->name) != "mpeg";
}

bool HasStreamDetails(const AVFormatContext& input) {
    return input.opaque == &detailsMark;
}

void FindStreamDetails(AVFormatContext& input) {
    // The library does not survive being asked twice.
    if (!HasStreamDetails(input)) {
        input.opaque = &detailsMark;
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
