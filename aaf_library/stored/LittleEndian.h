// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/stored/StoredError.h"
#include "aaf_library/stored/StoredTree.h"

#include <cstddef>
#include <cstring>
#include <string>
#include <utility>

namespace aaf::stored {

template <typename Number>
void PutNumber(std::uint8_t* at, Number value) {
    if constexpr (__BYTE_ORDER__ == __ORDER_LITTLE_ENDIAN__) {
        std::memcpy(at, &value, sizeof(Number));
    } else {
        for (std::size_t i = 0; i < sizeof(Number); ++i) {
            at[i] = static_cast<std::uint8_t>(static_cast<std::uint64_t>(value) >> 8 * i);
        }
    }
}

// Four bytes as a number.
inline std::uint32_t NumberIn(const std::uint8_t* at) {
    return at[0] | at[1] << 8 | at[2] << 16 | std::uint32_t{at[3]} << 24;
}

// Appends numbers to bytes, little-endian and without padding.
class ByteWriter {
public:
    ByteWriter() { bytes_.reserve(64); }  // most values are shorter

    template <typename Number>
    ByteWriter& AppendNumber(Number value) {
        std::uint8_t bytes[sizeof(Number)];
        PutNumber(bytes, value);
        bytes_.insert(bytes_.end(), bytes, bytes + sizeof(Number));
        return *this;
    }
    template <typename Range>
    ByteWriter& Append(const Range& range) {
        bytes_.insert(bytes_.end(), range.begin(), range.end());
        return *this;
    }
    // A text with its terminator.
    ByteWriter& AppendText(const std::u16string& text) {
        std::uint8_t* at = AppendRoom(2 * text.size() + 2);
        for (char16_t unit : text) {
            PutNumber(at, static_cast<std::uint16_t>(unit));
            at += 2;
        }
        return *this;
    }

    const Bytes& bytes() const { return bytes_; }
    Bytes Take() { return std::move(bytes_); }
    // Keeps its room.
    void Clear() { bytes_.clear(); }

private:
    // Zeroed, and good until something else is appended.
    std::uint8_t* AppendRoom(std::size_t size) {
        bytes_.resize(bytes_.size() + size);
        return bytes_.data() + bytes_.size() - size;
    }

    Bytes bytes_;
};

// Takes numbers from a range of bytes that somebody else owns. Anything that
// would reach beyond the end is refused.
class ByteReader {
public:
    ByteReader(const std::uint8_t* begin, std::size_t size) : at_(begin), left_(size) {}
    explicit ByteReader(const Bytes& bytes) : ByteReader(bytes.data(), bytes.size()) {}

    template <typename Number>
    Number TakeNumber() {
        const std::uint8_t* from = Take(sizeof(Number));
        std::uint64_t value = 0;
        for (std::size_t i = 0; i < sizeof(Number); ++i) {
            value |= std::uint64_t{from[i]} << 8 * i;
        }
        return static_cast<Number>(value);
    }
    Bytes TakeBytes(std::size_t size) {
        const std::uint8_t* from = Take(size);
        return Bytes(from, from + size);
    }
    // The rest as a text, which must end with its only terminator.
    std::u16string TakeText() {
        if (left_ < 2 || left_ % 2 != 0) {
            throw StoredError("a name of " + std::to_string(left_) + " bytes");
        }
        std::u16string text;
        while (left_ > 2) {
            text += static_cast<char16_t>(TakeNumber<std::uint16_t>());
        }
        if (TakeNumber<std::uint16_t>() != 0 || text.find(u'\0') != std::u16string::npos) {
            throw StoredError("a name that does not end with its terminator");
        }
        return text;
    }
    std::size_t left() const { return left_; }

private:
    const std::uint8_t* Take(std::size_t size) {
        if (size > left_) {
            throw StoredError(std::to_string(size) + " bytes wanted, " + std::to_string(left_) +
                              " left");
        }
        const std::uint8_t* from = at_;
        at_ += size;
        left_ -= size;
        return from;
    }

    const std::uint8_t* at_;
    std::size_t left_;
};

}  // namespace aaf::stored
