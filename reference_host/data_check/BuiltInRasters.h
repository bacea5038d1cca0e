// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>
#include <string_view>
#include <vector>

namespace data_check {

// A picture format of a code that has several, and the id that it leads to. Every module of this
// kind has these built in; which of two formats of one raster a movie has is told by its rate.
struct BuiltInRaster {
    std::uint32_t width;
    std::uint32_t height;  // of one field where the picture is stored in fields
    std::uint32_t layout;  // 0: frames, 1: fields
    std::uint32_t id;
};

// Those of a code; none for most.
std::vector<BuiltInRaster> BuiltInRastersOf(std::string_view code);
// The codes that have some.
std::vector<std::string_view> CodesWithBuiltInRasters();

}  // namespace data_check
