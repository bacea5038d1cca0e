// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <filesystem>

// Stands between the whole process and the system's reading of one file: counts
// the reads and moves within it and lets one of them go wrong. Other files are
// read as ever.
namespace read_faults {

enum class Fault {
    kNone,
    kReadFails,  // EIO
    kReadEnds,   // no bytes, as at the end of the file
    kReadShort,  // half of the bytes
    kSeekFails,  // EIO
    kOpenFails,  // EMFILE
};

// From now on the `number`-th call of the fault's kind on `file`, from 1, goes
// wrong; counting starts anew.
void Arm(const std::filesystem::path& file, Fault fault, int number);
void Disarm();
// Calls of the armed kind so far.
int Calls();

}  // namespace read_faults
