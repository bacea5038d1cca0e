// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

namespace aaf {

// An interface whose every operation answers AAFRESULT_NOT_IMPLEMENTED. Classes
// are built on these, so that each states only the operations that it has. The
// NotImplemented...h headers hold one specialisation for each published
// interface; a test compares them slot by slot.
template <class Interface>
class NotImplemented;

}  // namespace aaf
