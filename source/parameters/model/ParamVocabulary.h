// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

// The words that this model and the host share.
#include "host_interfaces/parameters/DocumentWords.h"
