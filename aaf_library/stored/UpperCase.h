// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

namespace aaf::stored {

// The capital of a letter, by Unicode's simple mapping; any other unit as it
// is. A compound file orders its directory by it.
char16_t UpperCase(char16_t unit);

}  // namespace aaf::stored
