// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "tests/system/OtherKinds.h"

#include <string_view>

namespace {

using movies::Bytes;

void Add(Bytes& bytes, std::string_view text) {
    bytes.insert(bytes.end(), text.begin(), text.end());
}

void AddNumber(Bytes& bytes, int width, std::uint32_t value) {
    for (int shift = 8 * (width - 1); shift >= 0; shift -= 8) {
        bytes.push_back(static_cast<std::uint8_t>(value >> shift));
    }
}

}  // namespace

movies::Bytes PhotoshopPicture() {
    constexpr std::uint32_t kWidth = 16, kHeight = 8, kChannels = 3, kDepth = 8, kRgb = 3;
    Bytes bytes;
    Add(bytes, "8BPS");
    AddNumber(bytes, 2, 1);
    bytes.resize(bytes.size() + 6);
    AddNumber(bytes, 2, kChannels);
    AddNumber(bytes, 4, kHeight);
    AddNumber(bytes, 4, kWidth);
    AddNumber(bytes, 2, kDepth);
    AddNumber(bytes, 2, kRgb);
    for (int section = 0; section < 3; ++section) {  // palette, resources, layers
        AddNumber(bytes, 4, 0);
    }
    AddNumber(bytes, 2, 0);  // not compressed, channel after channel
    for (std::uint32_t i = 0; i < kChannels * kHeight * kWidth; ++i) {
        bytes.push_back(static_cast<std::uint8_t>(i % kWidth * 16));
    }
    return bytes;
}

movies::Bytes MidiSong() {
    Bytes bytes;
    Add(bytes, "MThd");
    AddNumber(bytes, 4, 6);
    AddNumber(bytes, 2, 0);  // one track
    AddNumber(bytes, 2, 1);
    AddNumber(bytes, 2, 96);  // ticks of a quarter
    Add(bytes, "MTrk");
    const std::string_view events("\x00\x90\x3C\x40\x60\x80\x3C\x00\x00\xFF\x2F\x00", 12);
    AddNumber(bytes, 4, static_cast<std::uint32_t>(events.size()));
    Add(bytes, events);
    return bytes;
}

movies::Bytes Letter() {
    Bytes bytes;
    Add(bytes, "This is no movie but a letter, long enough to be read.\n");
    return bytes;
}
