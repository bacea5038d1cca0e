// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <array>
#include <filesystem>
#include <fstream>

#include "reference_host/header_parser/HeaderBytes.h"

namespace header_parser {

// Bytes that are read piece by piece, wherever they lie.
class ByteSource {
public:
    virtual ~ByteSource() = default;
    virtual ncfUInt64 Length() const = 0;
    // False unless all of them are there.
    bool Read(ncfUInt64 position, ncfUInt8* to, ncfUInt64 size);
    // A big-endian number; 0 where none is.
    ncfUInt32 U32(ncfUInt64 position);

private:
    virtual bool ReadInside(ncfUInt64 position, ncfUInt8* to, ncfUInt64 size) = 0;
};

// Those of a file; none of one that can't be read. Small reads near each other cost one
// call of the system: most headers are no longer than what is kept.
class FileBytes final : public ByteSource {
public:
    explicit FileBytes(const std::filesystem::path& path);
    ncfUInt64 Length() const override { return length_; }

private:
    bool ReadInside(ncfUInt64 position, ncfUInt8* to, ncfUInt64 size) override;
    bool ReadFile(ncfUInt64 position, ncfUInt8* to, ncfUInt64 size);

    std::ifstream stream_;
    ncfUInt64 length_ = 0;
    std::array<ncfUInt8, 4096> kept_;  // `keptSize_` bytes from `keptBegin_`
    ncfUInt64 keptBegin_ = 0;
    ncfUInt64 keptSize_ = 0;
};

// Those of a header that was unpacked.
class UnpackedBytes final : public ByteSource {
public:
    explicit UnpackedBytes(HeaderBytes bytes) : bytes_(std::move(bytes)) {}
    ncfUInt64 Length() const override { return bytes_.Size(); }

private:
    bool ReadInside(ncfUInt64 position, ncfUInt8* to, ncfUInt64 size) override;

    HeaderBytes bytes_;
};

}  // namespace header_parser
