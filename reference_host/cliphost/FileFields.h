// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <string>

#include "host_interfaces/media/MediaContainer.h"
#include "reference_host/cliphost/ClipParameters.h"

namespace cliphost {

// A clip's fields before a user chooses others, for people; empty when it has no
// picture or they are not known.
struct FileFields {
    std::string order;   // "progressive", "top field first", "bottom field first"
    std::string layout;  // "merged", "split"
};

// Of a container to which no parameters were given yet: the fields of the formats
// that a new mapping offers.
FileFields ReadFileFields(NMA::IMediaContainer3& container);

// A value of a parameter for people: the text of a choice, or "as the file says:
// ..." for a number that leaves the file's own fields in force.
std::string WordsForValue(const host::ParameterInfo& parameter, std::optional<ncfUInt32> value,
                          const FileFields& file);

}  // namespace cliphost
