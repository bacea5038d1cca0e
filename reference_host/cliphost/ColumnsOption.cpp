// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/ColumnsOption.h"

#include "reference_host/cliphost/PathOption.h"

namespace cliphost {

void AddColumnsOption(CLI::App& verb, GivenColumns& columns) {
    AddPath(verb, "--columns", columns.file,
            "A table (CSV) with a row for each movie, told by its columns path or name: "
            "name, reel, start timecode, and any column of a bin, to be written into the "
            "descriptions");
}

}  // namespace cliphost
