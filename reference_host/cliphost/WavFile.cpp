// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/WavFile.h"

#include <cstring>
#include <limits>

// The file:
//
//   RIFF size WAVE                   or RF64 -1 WAVE
//                                       ds64 28 riff-size data-size frames 0
//   fmt  40 form
//   data size samples ... [pad]      or data -1 samples ... [pad]

namespace cliphost {
namespace {

constexpr std::uint64_t kMost32 = std::numeric_limits<std::uint32_t>::max();
constexpr std::uint64_t kRiffHead = 12;
constexpr std::uint64_t kChunkHead = 8;
constexpr std::uint64_t kFormBody = 40;
constexpr std::uint64_t kSizesBody = 28;
constexpr unsigned kExtensible = 0xFFFE;

// Speakers of the commonest forms; others leave them open.
constexpr std::uint32_t kSpeakers[] = {0, 0x4, 0x3};

class Bytes {
public:
    void Text(const char* four) { bytes_.insert(bytes_.end(), four, four + 4); }
    void Number(std::uint64_t value, int size) {
        for (int i = 0; i < size; ++i) {
            bytes_.push_back(static_cast<unsigned char>(value >> (8 * i)));
        }
    }
    std::vector<unsigned char> Take() { return std::move(bytes_); }

private:
    std::vector<unsigned char> bytes_;
};

void PutForm(Bytes& bytes, const WavForm& form) {
    // The end of the id that says PCM; its first number is the classic code, 1.
    static constexpr unsigned char kPcmIdEnd[] = {0x00, 0x00, 0x10, 0x00, 0x80, 0x00,
                                                  0x00, 0xAA, 0x00, 0x38, 0x9B, 0x71};
    bytes.Text("fmt ");
    bytes.Number(kFormBody, 4);
    bytes.Number(kExtensible, 2);
    bytes.Number(form.channels, 2);
    bytes.Number(form.rate, 4);
    bytes.Number(std::uint64_t{form.rate} * form.FrameBytes(), 4);
    bytes.Number(form.FrameBytes(), 2);
    bytes.Number(form.bits, 2);
    bytes.Number(22, 2);  // bytes of what follows
    bytes.Number(form.bits, 2);
    bytes.Number(form.channels < std::size(kSpeakers) ? kSpeakers[form.channels] : 0, 4);
    bytes.Number(1, 4);
    for (const unsigned char byte : kPcmIdEnd) {
        bytes.Number(byte, 1);
    }
}

bool IsPossible(const WavForm& form, std::uint64_t frames) {
    return form.channels > 0 && form.rate > 0 && form.bits > 0 && form.bits % 8 == 0 &&
           form.channels <= 0xFFFF && form.FrameBytes() <= 0xFFFF &&
           std::uint64_t{form.rate} * form.FrameBytes() <= kMost32 &&
           frames <= (std::numeric_limits<std::uint64_t>::max() >> 1) / form.FrameBytes();
}

}  // namespace

bool WavNeedsPadding(const WavForm& form, std::uint64_t frames) {
    return (form.FrameBytes() & 1) != 0 && (frames & 1) != 0;
}

std::vector<unsigned char> WavHeader(const WavForm& form, std::uint64_t frames) {
    if (!IsPossible(form, frames)) {
        return {};
    }
    const std::uint64_t data = frames * form.FrameBytes();
    const std::uint64_t padded = data + (WavNeedsPadding(form, frames) ? 1 : 0);
    // Sizes count from behind the first two words.
    std::uint64_t riff = kRiffHead - kChunkHead + kChunkHead + kFormBody + kChunkHead + padded;
    const bool isLarge = riff > kMost32;
    Bytes bytes;
    if (isLarge) {
        riff += kChunkHead + kSizesBody;
        bytes.Text("RF64");
        bytes.Number(kMost32, 4);
        bytes.Text("WAVE");
        bytes.Text("ds64");
        bytes.Number(kSizesBody, 4);
        bytes.Number(riff, 8);
        bytes.Number(data, 8);
        bytes.Number(frames, 8);
        bytes.Number(0, 4);  // no further sizes
    } else {
        bytes.Text("RIFF");
        bytes.Number(riff, 4);
        bytes.Text("WAVE");
    }
    PutForm(bytes, form);
    bytes.Text("data");
    bytes.Number(isLarge ? kMost32 : data, 4);
    return bytes.Take();
}

}  // namespace cliphost
