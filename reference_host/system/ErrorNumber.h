// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

namespace host::system {

// The C library's number, by which the host tells errors apart, for an error in the system's own
// numbers.
int ErrorNumber(unsigned long error);

}  // namespace host::system
