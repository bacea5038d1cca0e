// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>
#include <string>
#include <string_view>
#include <vector>

namespace movies {

using Bytes = std::vector<std::uint8_t>;

// One atom of a QuickTime or ISO base media file, written field by field:
//
//     Box("mdhd").Version(0).U32(0).U32(0).U32(600).U32(1200).U16(0).U16(0)
//
// All numbers are big-endian. Boxes nest by Add. What a box says of its own
// size can be bent, to make broken files.
class Box {
public:
    // `type` has four characters; fewer are filled with blanks.
    explicit Box(std::string_view type);

    Box& Version(unsigned version, std::uint32_t flags = 0);
    Box& U8(unsigned value);
    Box& U16(unsigned value);
    Box& U32(std::uint64_t value);  // the low 32 bits
    Box& U64(std::uint64_t value);
    Box& Fixed16(double value);  // 16.16
    Box& Fixed30(double value);  // 2.30
    Box& Double(double value);
    Box& Code(std::string_view fourCharacters);  // empty: four zero bytes
    Box& Text(std::string_view text);            // without terminator
    Box& Pascal(std::string_view text, std::size_t fieldSize);
    Box& Zeros(std::size_t count);
    Box& Raw(const Bytes& bytes);
    Box& Add(const Box& child);
    Box& Add(const std::vector<Box>& children);

    Box& LargeSize();                       // size 1 and a 64-bit size behind the type
    Box& SizeToEnd();                       // size 0: up to the end of the file
    Box& ClaimSize(std::uint64_t untruth);  // says this size whatever it holds

    const std::string& Type() const { return type_; }
    std::size_t HeaderSize() const { return large_ ? 16 : 8; }
    Bytes ToBytes() const;
    // The header alone, for a box whose payload of `payloadSize` bytes is
    // written elsewhere.
    Bytes HeaderBytes(std::uint64_t payloadSize) const;

private:
    std::string type_;
    Bytes payload_;
    bool large_ = false;
    bool toEnd_ = false;
    bool lies_ = false;
    std::uint64_t claimedSize_ = 0;
};

// The number of a four-character code.
std::uint32_t Code(std::string_view fourCharacters);

}  // namespace movies
