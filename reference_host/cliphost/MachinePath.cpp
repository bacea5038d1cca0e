// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/MachinePath.h"

#include <algorithm>

#include "reference_host/util/text/Encodings.h"
#include "reference_host/util/text/FileUrl.h"

namespace cliphost {
namespace {

bool IsUtf8(const std::string& bytes) {
    // A byte that is no UTF-8 travels as a surrogate, and nothing else does.
    const std::u32string characters = host::text::FromUtf8(bytes);
    return std::none_of(characters.begin(), characters.end(),
                        [](char32_t c) { return c >= 0xD800 && c <= 0xDFFF; });
}

}  // namespace

std::string MachinePath(const std::filesystem::path& path) {
    const std::string& bytes = path.native();
    if (IsUtf8(bytes) && !host::text::IsFileUrl(bytes)) {
        return bytes;
    }
    std::error_code error;
    const std::filesystem::path absolute = std::filesystem::absolute(path, error);
    return host::text::FileUrl(error ? bytes : absolute.native());
}

}  // namespace cliphost
