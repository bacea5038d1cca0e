// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <string>
#include <utility>
#include <vector>

#include "host_interfaces/aaf/AAFFile.h"
#include "reference_host/cliphost/MovieColumns.h"

namespace cliphost {

// Writes a row into the description of its movie: the name into its mobs, comments into the master
// mob, the start into the references to its source, and the reel as a tape that this one comes
// from. Throws a Failure.
void SetColumns(IAAFFile* description, const MovieColumns& columns, const MovieColumns::Row& row);

// Names of columns with their values.
using ColumnValues = std::vector<std::pair<std::string, std::string>>;

// What people see of a clip.
struct ClipTexts {
    std::string name;
    std::string reel;          // of the tape that its source comes from
    std::string start;         // the first timecode
    bool hasOwnStart = false;  // it was not made up for a movie without timecode
    ColumnValues binColumns;   // several may have one name
};
ClipTexts TextsOf(IAAFFile* description);

// What a description tells of its movie: the fixed columns but the path, then those of the bin.
// `codec`: that column's value.
ColumnValues ColumnsOf(IAAFFile* description, const std::string& codec);

}  // namespace cliphost
