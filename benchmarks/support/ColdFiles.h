// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <benchmark/benchmark.h>

#include <filesystem>

// With --cold a program measures files that the system's cache doesn't hold, as a
// user meets them who opens them for the first time that day.

// Takes --cold from the arguments of the program.
void TakeColdOption(int* argc, char** argv);

// Before each timed run, with --cold: drops what the cache holds of these files,
// outside of the time that is measured.
void MakeCold(benchmark::State& state, const std::filesystem::path& file);
void MakeFolderCold(benchmark::State& state, const std::filesystem::path& folder);
