// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/quicktime/SoundForm.h"

extern "C" {
#include <libavcodec/codec_desc.h>
#include <libavutil/avutil.h>
}

#include <string_view>
#include <vector>

#include "reference_host/header_parser/SoundConfig.h"
#include "reference_host/quicktime/DecodedSound.h"

namespace host {
namespace {

using header_parser::Code;

constexpr ncfUInt32 kFloat = 1;
constexpr ncfUInt32 kBigEndian = 2;
constexpr ncfUInt32 kSigned = 4;
constexpr ncfUInt32 kPacked = 8;
constexpr ncfUInt32 kPlanar = 32;

constexpr double kHighestRate = 1e9;
// No instrument has more; memory for a moment of sound grows with them.
constexpr int kMostChannels = 1024;

// Codes of compressed sound. Sound that is not listed goes by its own tag.
struct CompressedRow {
    AVCodecID codec;
    ncfUInt32 formatId;
};
constexpr CompressedRow kCompressed[] = {
    {AV_CODEC_ID_AAC, Code("aac ")},       {AV_CODEC_ID_AC3, Code("ac-3")},
    {AV_CODEC_ID_EAC3, Code("ec-3")},      {AV_CODEC_ID_MP3, Code(".mp3")},
    {AV_CODEC_ID_MP2, Code(".mp2")},       {AV_CODEC_ID_MP1, Code(".mp1")},
    {AV_CODEC_ID_ALAC, Code("alac")},      {AV_CODEC_ID_PCM_ALAW, Code("alaw")},
    {AV_CODEC_ID_PCM_MULAW, Code("ulaw")}, {AV_CODEC_ID_ADPCM_IMA_QT, Code("ima4")},
    {AV_CODEC_ID_OPUS, Code("opus")},      {AV_CODEC_ID_FLAC, Code("flac")},
};

// Discs hold linear sound behind a header in each packet, which tells its depth.
bool ReadLinearKindOfDiscs(const AVCodecParameters& parameters, SoundForm& form) {
    if (parameters.codec_id != AV_CODEC_ID_PCM_BLURAY &&
        parameters.codec_id != AV_CODEC_ID_PCM_DVD) {
        return false;
    }
    form.bitsPerChannel = static_cast<ncfUInt32>(
        parameters.bits_per_coded_sample > 0 ? parameters.bits_per_coded_sample : 16);
    form.isBigEndian = true;
    form.formatFlags = kPacked | kSigned | kBigEndian;
    return true;
}

// Other linear sound is told by the name of its kind: sign, bits and byte order.
bool ReadLinearKind(const AVCodecParameters& parameters, SoundForm& form) {
    const AVCodecID codec = parameters.codec_id;
    const std::string_view name = avcodec_get_name(codec);
    if (name.substr(0, 4) != "pcm_" || name.size() < 6) {
        return false;
    }
    if (ReadLinearKindOfDiscs(parameters, form)) {
        return true;
    }
    const char kind = name[4];
    if ((kind != 's' && kind != 'u' && kind != 'f') || name[5] < '0' || name[5] > '9') {
        return false;  // a-law and the like are compressed
    }
    const bool isPlanar = name.find("planar") != std::string_view::npos;
    form.bitsPerChannel = static_cast<ncfUInt32>(av_get_bits_per_sample(codec));
    form.isBigEndian = name.find("be") != std::string_view::npos;
    form.isStoredPlain = !isPlanar && codec != AV_CODEC_ID_PCM_S24DAUD;
    form.formatFlags = kPacked |
                       (kind == 'f'   ? kFloat
                        : kind == 's' ? kSigned
                                      : 0u) |
                       (form.isBigEndian ? kBigEndian : 0u) | (isPlanar ? kPlanar : 0u);
    return form.bitsPerChannel > 0;
}

// Bytes of a packet of all channels, where all packets have one size; 0 for the
// rest. The movie reader leaves it out for the kinds that QuickTime itself has.
ncfUInt32 ConstantPacketSize(const AVCodecParameters& parameters) {
    constexpr ncfUInt32 kIma4Packet = 34;  // 64 samples of a channel
    const auto channels = static_cast<ncfUInt32>(parameters.ch_layout.nb_channels);
    switch (parameters.codec_id) {
        case AV_CODEC_ID_PCM_ALAW:
        case AV_CODEC_ID_PCM_MULAW:
            return channels;
        case AV_CODEC_ID_ADPCM_IMA_QT:
            return kIma4Packet * channels;
        default:
            break;
    }
    const bool constant = av_get_bits_per_sample(parameters.codec_id) > 0;
    return constant && parameters.block_align > 0 ? static_cast<ncfUInt32>(parameters.block_align)
                                                  : 0;
}

ncfUInt32 FormatIdOf(const AVCodecParameters& parameters) {
    for (const CompressedRow& row : kCompressed) {
        if (row.codec == parameters.codec_id) {
            return row.formatId;
        }
    }
    const ncfUInt32 tag = parameters.codec_tag;  // first character in the low byte
    return tag << 24 | (tag & 0xFF00u) << 8 | (tag >> 8 & 0xFF00u) | tag >> 24;
}

// Its packets tell their form themselves, headers of movies have no place for it
// but the fields.
bool IsMpegAudio(AVCodecID codec) {
    return codec == AV_CODEC_ID_MP1 || codec == AV_CODEC_ID_MP2 || codec == AV_CODEC_ID_MP3;
}

// Puts channels and rate right. What the library says of them is no help: it
// changes as it reads on.
void Deliver(const DecodedSound& decoded, const AVCodecParameters& parameters, bool hasWholeIndex,
             SoundForm& form) {
    const bool isTold = hasWholeIndex && parameters.codec_id == AV_CODEC_ID_AAC &&
                        parameters.extradata && parameters.extradata_size > 0;
    const header_parser::AacSound told =
        isTold ? header_parser::ReadAacSound(parameters.extradata,
                                             parameters.extradata + parameters.extradata_size)
               : header_parser::AacSound();
    if (told.rate != 0 && told.rate <= kHighestRate &&
        told.rate != static_cast<ncfUInt32>(decoded.rate)) {
        form.sampleRate = told.rate;
        form.channels = told.channels != 0 ? told.channels : form.channels;
    } else if (hasWholeIndex && IsMpegAudio(parameters.codec_id) && decoded.channels > 0 &&
               decoded.channels <= kMostChannels && decoded.rate != decoded.containerRate &&
               decoded.containerRate > 0) {
        form.channels = static_cast<ncfUInt32>(decoded.channels);
        form.sampleRate = decoded.containerRate;
    } else if (decoded.channels > 0 && decoded.channels <= kMostChannels && decoded.rate > 0) {
        form.channels = static_cast<ncfUInt32>(decoded.channels);
        form.sampleRate = decoded.rate;
        form.decodedPerPacket = decoded.framesPerPacket;
    }
}

}  // namespace

bool ReadSoundForm(const AVStream& stream, SoundForm& out) {
    const AVCodecParameters& parameters = *stream.codecpar;
    const int channels = parameters.ch_layout.nb_channels;
    if (parameters.codec_type != AVMEDIA_TYPE_AUDIO || channels < 1 || channels > kMostChannels ||
        parameters.sample_rate < 1 || parameters.sample_rate > kHighestRate) {
        return false;
    }
    SoundForm form;
    form.channels = static_cast<ncfUInt32>(channels);
    form.sampleRate = parameters.sample_rate;
    if (ReadLinearKind(parameters, form)) {
        form.formatId = Code("lpcm");
        form.bytesPerPacket = form.channels * ((form.bitsPerChannel + 7) / 8);
        form.framesPerPacket = 1;
        form.isConstantBitRate = true;
    } else {
        form.formatId = FormatIdOf(parameters);
        form.bytesPerPacket = ConstantPacketSize(parameters);
        form.framesPerPacket =
            parameters.frame_size > 0 ? static_cast<ncfUInt32>(parameters.frame_size) : 0;
    }
    out = form;
    return true;
}

std::map<int, SoundForm> ReadSoundForms(const std::filesystem::path& path,
                                        const AVFormatContext& input, bool hasWholeIndex) {
    std::map<int, SoundForm> forms;
    std::vector<int> compressed;
    for (unsigned i = 0; i < input.nb_streams; ++i) {
        SoundForm form;
        if (ReadSoundForm(*input.streams[i], form)) {
            const int stream = static_cast<int>(i);
            forms[stream] = form;
            if (form.bitsPerChannel == 0) {
                compressed.push_back(stream);
            }
        }
    }
    for (const auto& [stream, decoded] : DecodeFirstSounds(path, compressed)) {
        Deliver(decoded, *input.streams[stream]->codecpar, hasWholeIndex, forms[stream]);
    }
    return forms;
}

}  // namespace host
