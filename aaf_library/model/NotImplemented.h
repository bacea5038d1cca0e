// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

namespace aaf {

// An interface whose every operation answers AAFRESULT_NOT_IMPLEMENTED. Classes
// are built on these, so that each states only the operations that it has. The
// build writes one specialisation for each published interface into the headers
// of not_implemented/ (see cmake/NotImplementedInterfaces.cmake); a test compares
// them slot by slot.
template <class Interface>
class NotImplemented;

}  // namespace aaf
