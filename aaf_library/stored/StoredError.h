// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <stdexcept>
#include <string>

namespace aaf::stored {

// Thrown inside this folder when a file or a tree cannot be read or written;
// the functions of AafFile.h turn it into a result. The text tells the place
// and what is wrong, not the file, which only the outermost caller knows.
class StoredError : public std::runtime_error {
public:
    using std::runtime_error::runtime_error;
};

// What is to be written takes more bytes than a file of that kind may have.
class TooLargeError : public StoredError {
public:
    using StoredError::StoredError;
};

// Objects nested deeper than this are neither written nor read. Real files
// stay below twenty; the limit keeps recursion harmless.
constexpr int kMaximumDepth = 100;

}  // namespace aaf::stored
