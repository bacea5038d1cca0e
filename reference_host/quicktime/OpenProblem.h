// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <filesystem>
#include <string>

namespace host {

// Why the movie wrapper can't open a file, in a few words; empty when it can.
std::string OpenProblem(const std::filesystem::path& path);

// Why a picture or sound track of a file finds no decoder, with the name of its
// codec; empty when it finds one or there is no such track. `place` counts from 0
// among the tracks of its kind.
std::string DecoderProblem(const std::filesystem::path& path, bool ofSound, std::size_t place);

// Why the first picture track can't have pictures as large as the file tells; empty
// when it can.
std::string RasterProblem(const std::filesystem::path& path);
// Whether a movie's header tells pictures large enough to ask for that: a quick look.
bool NeedsRasterCheck(const std::filesystem::path& path);

}  // namespace host
