// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/TurnOption.h"

namespace cliphost {

void TurnOption::AddTo(CLI::App& verb) {
    verb.add_flag("--as-stored", asStored_,
                  "Leave the pictures as they are stored; else they are turned by quarters and "
                  "mirrored as the movie's display matrix says. Raw frames always are as stored");
}

PictureTurn TurnOption::TurnFor(const std::filesystem::path& movie) const {
    return asStored_ ? PictureTurn() : TurnOf(host::DisplayMatrixOf(movie));
}

}  // namespace cliphost
