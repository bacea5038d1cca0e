// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <filesystem>
#include <functional>
#include <string>
#include <string_view>

#include "reference_host/cliphost/ClipColumns.h"
#include "reference_host/cliphost/Describe.h"
#include "reference_host/cliphost/Failure.h"
#include "reference_host/cliphost/PathMaps.h"

namespace cliphost {

// How descriptions are shown and saved.
struct DescriptionForm {
    bool json = false;
    bool hasNumbers = false;  // in the JSON, besides texts
    bool lines = false;       // JSON of one line for each movie
    bool quiet = false;
    PathMaps maps;                     // of the locators
    GivenColumns columns;              // to be written into descriptions
    std::filesystem::path columnsOut;  // where a table of columns goes; empty: nowhere
};

// What a verb shows of one movie, whichever process read it.
struct MovieAnswer {
    int status = kExitFine;
    Problem problem;          // why it is not described; or what its header tells wrong
    std::string route;        // for JSON alone
    std::string routeReason;  // empty on the first route
    std::string description;  // text, or JSON indented as part of an entry; empty where not shown
    std::uint64_t mapsUsed = 0;  // as PathMaps counts them
    ColumnValues columns;        // where they are asked for
    bool isPartial = false;      // what was made is saved, though some of it could not be read
};

// Where what is made of a movie is to be saved, which may be nowhere. Asked once at most; throws a
// Failure where that is the movie itself.
using PlaceOfFile = std::function<std::filesystem::path()>;

// What every answer to a description begins with: its problem, and the status where there is none.
// Tells a doubt on standard error.
MovieAnswer StartAnswer(const Session& session, const Description& description);

// Writes the movie's row of the table, where there is one, into its description. Throws a Failure.
void WriteColumns(const Session& session, const Description& description,
                  const GivenColumns& columns);

// Tells on standard error what is told of a movie that is described, maps its locators, saves the
// description where `place` says, which may be nowhere, and reads it.
MovieAnswer AnswerOf(Session& session, const Description& description, const DescriptionForm& form,
                     const PlaceOfFile& place);

// From one process to another. What is read may come from a process that a movie has broken:
// texts for people are escaped again, and JSON is well-formed; false for anything else.
std::string ToBytes(const MovieAnswer& answer);
bool FromBytes(std::string_view bytes, const DescriptionForm& form, MovieAnswer& answer);

}  // namespace cliphost
