// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/objects/Paths.h"

#include "text/Encodings.h"

namespace aaf {

std::filesystem::path PathOf(const wchar_t* text) {
    if (sizeof(wchar_t) == sizeof(std::filesystem::path::value_type)) {
        return std::filesystem::path(text);
    }
    return std::filesystem::path(encodings::ToUtf8Lossy(encodings::FromWide(text)));
}

std::wstring WideOf(const std::string& utf8) {
    return encodings::ToWideLossy(encodings::FromUtf8(utf8));
}

}  // namespace aaf
