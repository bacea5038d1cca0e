// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// No encoder at hand writes fields apart, so this does, by the plainest means of
// the format: every macroblock holds its samples as they are.

#include "tests/unit/quicktime/FieldCodedVideo.h"

namespace quicktime_tests {
namespace {

constexpr int kParameterSet = 7;
constexpr int kPictureParameterSet = 8;
constexpr int kStartingSlice = 5;
constexpr int kSlice = 1;
constexpr std::uint32_t kIntraSlice = 7;
constexpr std::uint32_t kPlainMacroblock = 25;  // within an intra slice

class Bits {
public:
    Bits& U(int count, std::uint32_t value) {
        for (int i = count - 1; i >= 0; --i) {
            Bit(value >> i & 1);
        }
        return *this;
    }
    Bits& Ue(std::uint32_t value) {
        int length = 1;
        while ((value + 1) >> length != 0) {
            ++length;
        }
        return U(length - 1, 0).U(length, value + 1);
    }
    Bits& Align() {
        while (count_ % 8 != 0) {
            Bit(0);
        }
        return *this;
    }
    Bytes Unit(int type) {
        U(1, 1).Align();
        Bytes unit = {0, 0, 0, 1, static_cast<std::uint8_t>(3 << 5 | type)};
        int zeros = 0;
        for (const std::uint8_t byte : bytes_) {
            if (zeros >= 2 && byte <= 3) {
                unit.push_back(3);
                zeros = 0;
            }
            unit.push_back(byte);
            zeros = byte == 0 ? zeros + 1 : 0;
        }
        return unit;
    }

private:
    void Bit(std::uint32_t bit) {
        if (count_++ % 8 == 0) {
            bytes_.push_back(0);
        }
        bytes_.back() = static_cast<std::uint8_t>(bytes_.back() | bit << (7 - (count_ - 1) % 8));
    }

    Bytes bytes_;
    int count_ = 0;
};

// One macroblock wide, two high, field coding allowed, 25 pictures a second.
Bytes Parameters() {
    Bits bits;
    bits.U(8, 77).U(8, 0).U(8, 30).Ue(0).Ue(0).Ue(2).Ue(1).U(1, 0).Ue(0).Ue(0);
    bits.U(1, 0).U(1, 0).U(1, 1).U(1, 0);                             // fields may be apart
    bits.U(1, 1).U(4, 0).U(1, 1).U(32, 1).U(32, 50).U(1, 1).U(4, 0);  // rate alone
    return bits.Unit(kParameterSet);
}

Bytes PictureParameters() {
    Bits bits;
    bits.Ue(0).Ue(0).U(2, 0).Ue(0).Ue(0).Ue(0).U(3, 0).Ue(0).Ue(0).Ue(0).U(3, 0);
    return bits.Unit(kPictureParameterSet);
}

Bytes Field(int frame, bool isBottom, bool isStart, std::uint32_t luminance) {
    Bits bits;
    bits.Ue(0).Ue(kIntraSlice).Ue(0).U(4, static_cast<std::uint32_t>(frame)).U(1, 1).U(1, isBottom);
    if (isStart) {
        bits.Ue(0).U(2, 0);
    } else {
        bits.U(1, 0);
    }
    bits.Ue(0).Ue(kPlainMacroblock).Align();
    for (int i = 0; i < 256; ++i) {
        bits.U(8, luminance);
    }
    for (int i = 0; i < 128; ++i) {
        bits.U(8, 128);
    }
    return bits.Unit(isStart ? kStartingSlice : kSlice);
}

}  // namespace

Bytes FieldCodedVideo(int pictures) {
    Bytes stream;
    const auto add = [&stream](const Bytes& unit) {
        stream.insert(stream.end(), unit.begin(), unit.end());
    };
    const Bytes delimiter = {0, 0, 0, 1, 9, 0xF0};
    for (int i = 0; i < pictures; ++i) {
        const int frame = i % kGroupOfFieldCodedVideo;
        const auto luminance = static_cast<std::uint32_t>(16 + 4 * i);
        add(delimiter);
        if (frame == 0) {
            add(Parameters());
            add(PictureParameters());
        }
        add(Field(frame, false, frame == 0, luminance));
        add(delimiter);
        add(Field(frame, true, false, luminance + 2));
    }
    return stream;
}

}  // namespace quicktime_tests
