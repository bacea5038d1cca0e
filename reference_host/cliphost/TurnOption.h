// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <CLI/CLI.hpp>
#include <filesystem>

#include "reference_host/cliphost/PictureTurn.h"

namespace cliphost {

// The option of verbs that make pictures for people: those are shown the way up
// that the movie asks for, unless the user wants them as they are stored.
class TurnOption {
public:
    void AddTo(CLI::App& verb);
    PictureTurn TurnFor(const std::filesystem::path& movie) const;

private:
    bool asStored_ = false;
};

}  // namespace cliphost
