// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <fmt/format.h>

#include <cstdio>
#include <string>
#include <utility>

#include "reference_host/util/text/Printable.h"

namespace cliphost {

// Prints lines on standard error; control characters from a movie's texts are
// escaped. When standard error can't be written, as on a full disk, the program
// goes on: there is nobody left to tell.
template <class... Arguments>
void Notice(fmt::format_string<Arguments...> form, Arguments&&... arguments) {
    const std::string text =
        host::text::PrintableLines(fmt::format(form, std::forward<Arguments>(arguments)...));
    std::fwrite(text.data(), 1, text.size(), stderr);
}

}  // namespace cliphost
