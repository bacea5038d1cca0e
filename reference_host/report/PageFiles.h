// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

namespace report {

// What lies in page/, all scripts as one.
extern const char* const kPageHtml;
extern const char* const kPageStyle;
extern const char* const kPageScript;

// Their SHA-256, in hexadecimal digits.
extern const char* const kPageStyleDigest;
extern const char* const kPageScriptDigest;

}  // namespace report
