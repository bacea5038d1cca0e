// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/quicktime/SoundWords.h"

#include <cmath>
#include <limits>

namespace host {
namespace {

ncfSInt32 FromReal(double value) {
    if (!(value == value)) {
        return 0;
    }
    constexpr double kOne = 2147483648.0;
    const double scaled = value * kOne;
    if (scaled >= kOne) {
        return std::numeric_limits<ncfSInt32>::max();
    }
    if (scaled <= -kOne) {
        return std::numeric_limits<ncfSInt32>::min();
    }
    const long long rounded = std::llrint(scaled);
    return rounded >= 2147483648LL ? std::numeric_limits<ncfSInt32>::max()
                                   : static_cast<ncfSInt32>(rounded);
}

ncfSInt32 FromBits(ncfUInt32 bits) {
    return static_cast<ncfSInt32>(bits);
}

ncfSInt32 Word(ncfUInt8 value) {
    return FromBits((static_cast<ncfUInt32>(value) ^ 0x80u) << 24);
}
ncfSInt32 Word(ncfSInt16 value) {
    return FromBits(static_cast<ncfUInt32>(static_cast<ncfUInt16>(value)) << 16);
}
ncfSInt32 Word(ncfSInt32 value) {
    return value;
}
ncfSInt32 Word(ncfSInt64 value) {
    return FromBits(static_cast<ncfUInt32>(static_cast<ncfUInt64>(value) >> 32));
}
// The product is exact in double for either width.
ncfSInt32 Word(float value) {
    return FromReal(static_cast<double>(value));
}
ncfSInt32 Word(double value) {
    return FromReal(value);
}

template <class Value>
void Append(const AVFrame& frame, int channels, bool isPlanar, std::vector<ncfSInt32>& words) {
    const std::size_t start = words.size();
    const auto count = static_cast<std::size_t>(frame.nb_samples);
    const auto wide = static_cast<std::size_t>(channels);
    words.resize(start + count * wide);
    ncfSInt32* const to = words.data() + start;
    if (!isPlanar) {
        const auto* const from = reinterpret_cast<const Value*>(frame.extended_data[0]);
        for (std::size_t i = 0; i < count * wide; ++i) {
            to[i] = Word(from[i]);
        }
        return;
    }
    for (std::size_t channel = 0; channel < wide; ++channel) {
        const auto* const from = reinterpret_cast<const Value*>(frame.extended_data[channel]);
        for (std::size_t i = 0; i < count; ++i) {
            to[i * wide + channel] = Word(from[i]);
        }
    }
}

}  // namespace

bool AppendSoundWords(const AVFrame& frame, int channels, std::vector<ncfSInt32>& words) {
    if (frame.ch_layout.nb_channels != channels || frame.nb_samples < 0) {
        return false;
    }
    const auto format = static_cast<AVSampleFormat>(frame.format);
    const bool isPlanar = av_sample_fmt_is_planar(format) != 0;
    switch (av_get_packed_sample_fmt(format)) {
        case AV_SAMPLE_FMT_U8:
            Append<ncfUInt8>(frame, channels, isPlanar, words);
            return true;
        case AV_SAMPLE_FMT_S16:
            Append<ncfSInt16>(frame, channels, isPlanar, words);
            return true;
        case AV_SAMPLE_FMT_S32:
            Append<ncfSInt32>(frame, channels, isPlanar, words);
            return true;
        case AV_SAMPLE_FMT_S64:
            Append<ncfSInt64>(frame, channels, isPlanar, words);
            return true;
        case AV_SAMPLE_FMT_FLT:
            Append<float>(frame, channels, isPlanar, words);
            return true;
        case AV_SAMPLE_FMT_DBL:
            Append<double>(frame, channels, isPlanar, words);
            return true;
        default:
            return false;
    }
}

void StoreSoundWords(const ncfSInt32* words, std::size_t count, int bytes, bool littleEndian,
                     ncfUInt8* to) {
    for (std::size_t i = 0; i < count; ++i) {
        const auto word = static_cast<ncfUInt32>(words[i]);
        for (int byte = 0; byte < bytes; ++byte) {
            const int fromTop = littleEndian ? bytes - 1 - byte : byte;
            *to++ = static_cast<ncfUInt8>(word >> (24 - 8 * fromTop));
        }
    }
}

}  // namespace host
