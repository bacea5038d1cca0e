// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/quicktime/OpenProblem.h"

#include "reference_host/quicktime/OpenInput.h"

namespace host {

std::string OpenProblem(const std::filesystem::path& path) {
    std::string reason;
    return OpenInput(path, InputView::AsPresented, reason) ? std::string() : reason;
}

}  // namespace host
