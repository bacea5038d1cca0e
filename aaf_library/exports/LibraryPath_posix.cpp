// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include <dlfcn.h>

#include "aaf_library/exports/LibraryPath.h"
#include "aaf_library/objects/Paths.h"

namespace aaf {

std::wstring LibraryPath() {
    static const char anchor = 0;
    Dl_info info{};
    if (dladdr(&anchor, &info) == 0 || info.dli_fname == nullptr) {
        return {};
    }
    return WideOf(info.dli_fname);
}

}  // namespace aaf
