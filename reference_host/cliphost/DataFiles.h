// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "reference_host/cliphost/Session.h"

namespace cliphost {

// What is wrong with a data file beside the module: it is missing, can't be read
// or is no well-formed document, with the place. Nothing where each can be read.
Problem DataFileProblem(const Session& session);

}  // namespace cliphost
