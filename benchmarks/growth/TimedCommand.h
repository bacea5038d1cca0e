// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <string>
#include <vector>

// Runs a program, its output thrown away, and gives the seconds of processor time that it and
// its children took; less than zero where it can't be started or ends with another status.
double SecondsOf(const std::vector<std::string>& command, int expectedStatus = 0);
