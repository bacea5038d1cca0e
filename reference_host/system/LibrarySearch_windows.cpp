// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/system/LibrarySearch.h"
#include "reference_host/system/SharedLibrary.h"

namespace host::system {

// The system finds what is loaded by the name of its file. One with another name can't be had
// under this one: a copy or link of it could not be removed while it is loaded.
void MakeFoundAs(const std::filesystem::path& file, const char* name) {
    SharedLibrary library;
    std::string ignored;
    if (library.Open(file, ignored) && library.IsFoundAs(name)) {
        library.Abandon();
    }
}

}  // namespace host::system
