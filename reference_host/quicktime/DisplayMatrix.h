// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <filesystem>

namespace host {

// How a picture is to be turned before it is shown, without moving it:
//
//     shown x = a x + c y
//     shown y = b x + d y, with y pointing down
struct DisplayMatrix {
    double a = 1;
    double b = 0;
    double c = 0;
    double d = 1;
};

// What a movie tells for its first picture track, those of track and movie taken
// together. As it is stored where nothing is told or the file can't be opened.
DisplayMatrix DisplayMatrixOf(const std::filesystem::path& movie);

}  // namespace host
