// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/header_parser/QTParser.h"

// Asks a parser whose headers are whole for everything that it can give, as a
// client with no trust would: every track, description and table, samples at
// both ends and beyond. Aborts where an answer breaks a promise of the
// interfaces. For hostile files in tests and for the fuzzer.
void VisitEverything(IQTParser& parser);
