// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/MachinePath.h"

#include "reference_host/system/Paths.h"
#include "reference_host/util/text/FileUrl.h"
#include "text/Encodings.h"

namespace cliphost {

std::string MachinePath(const std::filesystem::path& path) {
    const std::string bytes = host::system::PathText(path);
    // A byte that is no UTF-8 travels as a surrogate, and nothing else does.
    if (!encodings::HoldsSurrogate(encodings::FromUtf8(bytes)) && !host::text::IsFileUrl(bytes)) {
        return bytes;
    }
    return host::system::UrlOfPath(AbsolutePath(path));
}

std::filesystem::path AbsolutePath(const std::filesystem::path& path) {
    return host::system::AbsolutePath(path);
}

std::string AbsoluteMachinePath(const std::filesystem::path& path) {
    return MachinePath(AbsolutePath(path));
}

std::filesystem::path PathOfMachinePath(const std::string& text) {
    std::string path;
    const bool isUrl = host::text::IsFileUrl(text) && host::system::PathTextOfUrl(text, path);
    return host::system::PathOfText(isUrl ? path : text);
}

}  // namespace cliphost
