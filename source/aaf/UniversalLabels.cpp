// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/aaf/UniversalLabels.h"

#include <algorithm>

#include "host_interfaces/framework/Types.h"

namespace NMA::Impl {
namespace {

// `count` bytes from `first` on, most significant first.
ncfUInt32 CombineBytes(const MXFUL& ul, std::size_t first, std::size_t count) {
    ncfUInt32 value = 0;
    for (std::size_t i = 0; i < count; ++i) {
        const auto byte = static_cast<ncfSInt32>(static_cast<ncfSInt8>(ul[first + i]));
        value |= static_cast<ncfUInt32>(byte) << (8 * (count - 1 - i));
    }
    return value;
}

}  // namespace

aafUID_t MakeAAFUIDfromMXFUL(const MXFUL& ul) {
    aafUID_t id{};
    id.Data1 = CombineBytes(ul, 8, 4);
    id.Data2 = static_cast<ncfUInt16>(CombineBytes(ul, 12, 2));
    id.Data3 = static_cast<ncfUInt16>(CombineBytes(ul, 14, 2));
    std::copy_n(ul.begin(), 8, id.Data4);
    return id;
}

}  // namespace NMA::Impl
