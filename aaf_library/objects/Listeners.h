// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <string>

struct IAAFDiagnosticOutput;
struct IAAFProgress;

// Two callbacks that a program may set for the whole library.

namespace aaf {

// The library holds a reference until another one or null takes the place.
void SetProgressListener(IAAFProgress* progress);
void SetDiagnosticListener(IAAFDiagnosticOutput* output);

// Called at the start and the end of long work.
void TellProgress();

// A sentence for a person that says more than a result code can.
void TellDiagnostic(const std::string& utf8);

}  // namespace aaf
