// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/movie_writer/Box.h"

#include <cmath>
#include <cstring>

namespace movies {

namespace {

void Append(Bytes& to, std::uint64_t value, int bytes) {
    for (int shift = 8 * (bytes - 1); shift >= 0; shift -= 8) {
        to.push_back(static_cast<std::uint8_t>(value >> shift));
    }
}

}  // namespace

Box::Box(std::string_view type) : type_(type) {
    type_.resize(4, ' ');
}

Box& Box::Version(unsigned version, std::uint32_t flags) {
    return U32(version << 24 | (flags & 0xFFFFFFu));
}

Box& Box::U8(unsigned value) {
    Append(payload_, value, 1);
    return *this;
}

Box& Box::U16(unsigned value) {
    Append(payload_, value, 2);
    return *this;
}

Box& Box::U32(std::uint64_t value) {
    Append(payload_, value, 4);
    return *this;
}

Box& Box::U64(std::uint64_t value) {
    Append(payload_, value, 8);
    return *this;
}

Box& Box::Fixed16(double value) {
    return U32(static_cast<std::uint64_t>(std::llround(value * 65536.0)));
}

Box& Box::Fixed30(double value) {
    return U32(static_cast<std::uint64_t>(std::llround(value * 1073741824.0)));
}

Box& Box::Double(double value) {
    std::uint64_t bits = 0;
    std::memcpy(&bits, &value, sizeof bits);
    return U64(bits);
}

Box& Box::Code(std::string_view fourCharacters) {
    return U32(movies::Code(fourCharacters));
}

Box& Box::Text(std::string_view text) {
    payload_.insert(payload_.end(), text.begin(), text.end());
    return *this;
}

Box& Box::Pascal(std::string_view text, std::size_t fieldSize) {
    const std::string_view kept = text.substr(0, fieldSize - 1);
    U8(static_cast<unsigned>(kept.size()));
    return Text(kept).Zeros(fieldSize - 1 - kept.size());
}

Box& Box::Zeros(std::size_t count) {
    payload_.insert(payload_.end(), count, 0);
    return *this;
}

Box& Box::Raw(const Bytes& bytes) {
    payload_.insert(payload_.end(), bytes.begin(), bytes.end());
    return *this;
}

Box& Box::Add(const Box& child) {
    return Raw(child.ToBytes());
}

Box& Box::Add(const std::vector<Box>& children) {
    for (const Box& child : children) {
        Add(child);
    }
    return *this;
}

Box& Box::LargeSize() {
    large_ = true;
    return *this;
}

Box& Box::SizeToEnd() {
    toEnd_ = true;
    return *this;
}

Box& Box::ClaimSize(std::uint64_t untruth) {
    lies_ = true;
    claimedSize_ = untruth;
    return *this;
}

Bytes Box::ToBytes() const {
    Bytes bytes = HeaderBytes(payload_.size());
    bytes.insert(bytes.end(), payload_.begin(), payload_.end());
    return bytes;
}

Bytes Box::HeaderBytes(std::uint64_t payloadSize) const {
    const std::uint64_t size = lies_ ? claimedSize_ : payloadSize + HeaderSize();
    Bytes bytes;
    bytes.reserve(16);
    Append(bytes, toEnd_ ? 0 : large_ ? 1 : size, 4);
    Append(bytes, movies::Code(type_), 4);
    if (large_) {
        Append(bytes, size, 8);
    }
    return bytes;
}

std::uint32_t Code(std::string_view fourCharacters) {
    if (fourCharacters.empty()) {
        return 0;
    }
    std::uint32_t value = 0;
    for (std::size_t i = 0; i < 4; ++i) {
        const char c = i < fourCharacters.size() ? fourCharacters[i] : ' ';
        value = value << 8 | static_cast<std::uint8_t>(c);
    }
    return value;
}

}  // namespace movies
