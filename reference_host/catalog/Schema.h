// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <stdexcept>
#include <string>

#include "reference_host/catalog/Database.h"

namespace catalog {

// The tables of a catalog, and how a file of an older version gets those of this one.
// docs/catalog.md tells what they hold.

// What makes a file a catalog: stands in its header.
inline constexpr std::int64_t kApplicationId = 0x636C6970;  // 'clip'

// What takes a file from the version before to the next.
struct Step {
    const char* sql;
};
struct Steps {
    const Step* first;
    std::size_t count;  // the newest version
};
extern const Steps kSteps;

// The file is a database, but none of this program's.
class NoCatalog : public std::runtime_error {
public:
    using std::runtime_error::runtime_error;
};

// What a file's header says that it is. Throws as VersionOf does.
struct Stamp {
    std::int64_t application;
    std::int64_t version;
};
void CheckStamp(const Stamp& stamp, const Steps& steps = kSteps);

// The version of a catalog. Throws NoCatalog where it is none, or of a newer program.
std::int64_t VersionOf(Database& database, const Steps& steps = kSteps);
// Does the steps that are missing, all or none; makes a catalog of an empty database.
void BringUp(Database& database, const Steps& steps = kSteps);

// Tables with rows for each movie, in the order in which they are filled. The first column of each,
// behind which the others stand, is the movie's number.
struct Table {
    const char* name;
    const char* key;      // the column with the movie's number
    const char* columns;  // all others that are filled, with commas between
    const char* order;    // of the rows of one movie
};
extern const Table kTables[];
extern const std::size_t kTableCount;

// The texts that are searched are no ordinary table: a movie's row there is removed before the
// movie (?1: its path, ?2: the number of what takes its place, or null), and filled from all other
// tables (?1: its number).
extern const char* const kRemoveTexts;
extern const char* const kFillTexts;

}  // namespace catalog
