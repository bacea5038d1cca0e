// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <string>

#include "reference_host/catalog/Catalog.h"
#include "reference_host/cliphost/Describe.h"
#include "reference_host/cliphost/MovieCodecs.h"
#include "reference_host/cliphost/Picture.h"

namespace cliphost {

// What a catalog keeps of a movie that is described. What it keeps of every file, such as its size,
// is not in it.
catalog::Entry EntryOf(const Description& description, CodecReader& codecs);

// Adds a small picture, as PNG.
void AddThumbnail(const Picture& picture, catalog::Entry& entry);

// From one process to another, as JSON of objects, lists and texts.
std::string ToJson(const catalog::Entry& entry);
// Takes what a table can hold out of it, whatever it is: rows are numbered anew, and what a table
// needs is there.
catalog::Entry EntryFrom(const std::string& json);

// A row of what is told against a movie.
catalog::Row WarningRow(const Problem& problem, const char* kind, std::size_t place);

}  // namespace cliphost
