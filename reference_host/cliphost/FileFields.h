// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <string>

#include "host_interfaces/media/MediaContainer.h"
#include "reference_host/cliphost/ClipParameters.h"

namespace cliphost {

// A clip's fields before a user chooses others, in words; empty where it has no
// picture or nothing tells them.
struct FileFields {
    std::string order;   // "progressive", "top field first", "bottom field first"
    std::string layout;  // "merged", "split"
};

// Of a container to which no parameters were given yet. They are those of the
// formats that a mapping of its own offers.
FileFields ReadFileFields(NMA::IMediaContainer3& container);

// A value of a parameter in words: a choice's, or "as the file says: ..." for a
// number by which the file's own fields count.
std::string WordsForValue(const host::ParameterInfo& parameter, std::optional<ncfUInt32> value,
                          const FileFields& file);

}  // namespace cliphost
