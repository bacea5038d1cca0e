// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <string_view>

#include "reference_host/cliphost/Problem.h"

namespace cliphost {

// Why a file or folder can't be written: the system's own words for its error
// number, and what helps.
Problem NotWritten(const std::filesystem::path& output, int error);
// The same of a folder that is to be there.
Problem FolderNotMade(const std::filesystem::path& folder, int error);

// The error number whose system text another library's sentence ends with; 0 when
// it ends with no such text.
int SystemErrorIn(std::string_view sentence);

}  // namespace cliphost
