// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/header_parser/ByteSource.h"

#include <algorithm>
#include <cstring>

#include "reference_host/header_parser/ByteReader.h"

namespace header_parser {

bool ByteSource::Read(ncfUInt64 position, ncfUInt8* to, ncfUInt64 size) {
    return position <= Length() && size <= Length() - position && ReadInside(position, to, size);
}

ncfUInt32 ByteSource::U32(ncfUInt64 position) {
    ncfUInt8 bytes[4] = {};
    return Read(position, bytes, sizeof bytes) ? LoadU32(bytes) : 0;
}

FileBytes::FileBytes(const std::filesystem::path& path) {
    stream_.rdbuf()->pubsetbuf(nullptr, 0);  // each seek would fill the stream's buffer anew
    stream_.open(path, std::ios::binary);
    stream_.seekg(0, std::ios::end);
    const std::streamoff end = stream_.tellg();
    length_ = end > 0 ? static_cast<ncfUInt64>(end) : 0;
}

bool FileBytes::ReadFile(ncfUInt64 position, ncfUInt8* to, ncfUInt64 size) {
    stream_.clear();
    stream_.seekg(static_cast<std::streamoff>(position));
    return static_cast<bool>(
        stream_.read(reinterpret_cast<char*>(to), static_cast<std::streamsize>(size)));
}

bool FileBytes::ReadInside(ncfUInt64 position, ncfUInt8* to, ncfUInt64 size) {
    const bool isKept = position >= keptBegin_ && position + size <= keptBegin_ + keptSize_;
    if (!isKept) {
        keptBegin_ = position;
        keptSize_ = std::min<ncfUInt64>(kept_.size(), length_ - position);
        // A file may have become shorter since it was opened.
        if (size > keptSize_ || !ReadFile(position, kept_.data(), keptSize_)) {
            keptSize_ = 0;
            return ReadFile(position, to, size);
        }
    }
    std::memcpy(to, kept_.data() + (position - keptBegin_), static_cast<std::size_t>(size));
    return true;
}

bool UnpackedBytes::ReadInside(ncfUInt64 position, ncfUInt8* to, ncfUInt64 size) {
    std::memcpy(to, bytes_.begin() + position, static_cast<std::size_t>(size));
    return true;
}

}  // namespace header_parser
