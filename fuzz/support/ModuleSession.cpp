// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "fuzz/support/ModuleSession.h"

#include <cstdio>
#include <cstdlib>

namespace fuzz {

cliphost::Session& TheSession() {
    static cliphost::Session* const session = [] {
        cliphost::SessionOptions options;
        options.programFolder =
            std::filesystem::read_symlink("/proc/self/exe").parent_path().parent_path();
        options.pinTime = "2026-01-31T12:00:00Z";
        return new cliphost::Session(options);
    }();
    return *session;
}

void RequireNothingLeft(cliphost::Session& session) {
    if (session.plugin().CanUnload() != NCF_OK) {
        std::fputs("an object of the module is left\n", stderr);
        std::abort();
    }
}

}  // namespace fuzz
