// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/PathOption.h"

#include <algorithm>
#include <iterator>

#include "reference_host/system/Paths.h"

namespace cliphost {

CLI::Option* AddPath(CLI::App& app, const std::string& name, std::filesystem::path& path,
                     const std::string& about) {
    return app.add_option_function<std::string>(
        name, [&path](const std::string& text) { path = host::system::PathOfText(text); }, about);
}

CLI::Option* AddPaths(CLI::App& app, const std::string& name,
                      std::vector<std::filesystem::path>& paths, const std::string& about) {
    return app.add_option_function<std::vector<std::string>>(
        name,
        [&paths](const std::vector<std::string>& texts) {
            paths.clear();
            std::transform(texts.begin(), texts.end(), std::back_inserter(paths),
                           host::system::PathOfText);
        },
        about);
}

}  // namespace cliphost
