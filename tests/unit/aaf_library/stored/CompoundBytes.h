// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <cstdint>

#include "aaf_library/stored/CompoundFileWriter.h"

inline constexpr aaf::stored::CompoundFileWriter::Storage kRoot =
    aaf::stored::CompoundFileWriter::kRoot;

inline std::uint32_t NumberAt(const aaf::stored::Bytes& file, std::size_t at) {
    return file[at] | file[at + 1] << 8 | file[at + 2] << 16 |
           static_cast<std::uint32_t>(file[at + 3]) << 24;
}
