// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Nothing: this file is there for the headers that are compiled with it.
