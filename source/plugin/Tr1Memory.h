// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

// std::tr1::shared_ptr, in which the module holds its own classes. Microsoft's library
// has lost it; the pointer of the standard takes its place there.
#ifdef _MSC_VER
#include <memory>
namespace std::tr1 {
using std::shared_ptr;
}
#else
#include <tr1/memory>
#endif
