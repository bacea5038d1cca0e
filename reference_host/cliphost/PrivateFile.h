// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>
#include <filesystem>
#include <optional>

#include "reference_host/cliphost/OutputFile.h"

namespace cliphost {

// The file that a child process writes for a request, in the folder that is its own.
std::filesystem::path PrivateFile(const std::filesystem::path& folder, std::uint64_t number);

// Whether it is there as a file of its own, of so many bytes where that is known: a link would
// lead to somebody else's.
bool IsOwnFile(const std::filesystem::path& file, std::optional<std::uint64_t> bytes = {});

// Removes what a child process has made for a request, finished or not.
void RemovePrivateFiles(const std::filesystem::path& folder, std::uint64_t number);

// Puts such a file into the place that the user wants it at, which may be a device. Throws a
// Failure or ReaderGone.
void PutIntoPlace(const std::filesystem::path& file, const std::filesystem::path& place);

// The same for one of so many bytes that is a part of a greater file, which `place` names.
void AppendTo(OutputFile& output, const std::filesystem::path& file, std::uint64_t bytes,
              const std::filesystem::path& place);

}  // namespace cliphost
