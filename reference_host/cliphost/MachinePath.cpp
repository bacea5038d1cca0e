// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/MachinePath.h"

#include "reference_host/util/text/FileUrl.h"
#include "text/Encodings.h"

namespace cliphost {

std::string MachinePath(const std::filesystem::path& path) {
    const std::string& bytes = path.native();
    // A byte that is no UTF-8 travels as a surrogate, and nothing else does.
    if (!encodings::HoldsSurrogate(encodings::FromUtf8(bytes)) && !host::text::IsFileUrl(bytes)) {
        return bytes;
    }
    std::error_code error;
    const std::filesystem::path absolute = std::filesystem::absolute(path, error);
    return host::text::FileUrl(error ? bytes : absolute.native());
}

std::string AbsoluteMachinePath(const std::filesystem::path& path) {
    std::error_code error;
    const std::filesystem::path absolute = std::filesystem::absolute(path, error);
    return MachinePath((error ? path : absolute).lexically_normal());
}

std::filesystem::path PathOfMachinePath(const std::string& text) {
    std::string path;
    return host::text::IsFileUrl(text) && host::text::PathOfFileUrl(text, path) ? path : text;
}

}  // namespace cliphost
