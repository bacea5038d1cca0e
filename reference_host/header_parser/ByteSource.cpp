// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/header_parser/ByteSource.h"

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

FileBytes::FileBytes(const std::filesystem::path& path) : stream_(path, std::ios::binary) {
    stream_.seekg(0, std::ios::end);
    const std::streamoff end = stream_.tellg();
    length_ = end > 0 ? static_cast<ncfUInt64>(end) : 0;
}

bool FileBytes::ReadInside(ncfUInt64 position, ncfUInt8* to, ncfUInt64 size) {
    stream_.clear();
    stream_.seekg(static_cast<std::streamoff>(position));
    return static_cast<bool>(
        stream_.read(reinterpret_cast<char*>(to), static_cast<std::streamsize>(size)));
}

bool UnpackedBytes::ReadInside(ncfUInt64 position, ncfUInt8* to, ncfUInt64 size) {
    std::memcpy(to, bytes_.begin() + position, static_cast<std::size_t>(size));
    return true;
}

}  // namespace header_parser
