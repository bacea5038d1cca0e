// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>
#include <filesystem>

#include "reference_host/cliphost/OutputFile.h"

namespace cliphost {

// The file that a child process writes for a request, in the folder that is its own.
std::filesystem::path PrivateFile(const std::filesystem::path& folder, std::uint64_t number);

// Puts such a file into the place that the user wants it at, which may be a device. Throws a
// Failure or ReaderGone.
void PutIntoPlace(const std::filesystem::path& file, const std::filesystem::path& place);

// The same for one that is a part of a greater file, which `place` names.
void AppendTo(OutputFile& output, const std::filesystem::path& file,
              const std::filesystem::path& place);

}  // namespace cliphost
