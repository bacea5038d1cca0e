// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/TurnOption.h"

namespace cliphost {

void TurnOption::AddTo(CLI::App& verb) {
    verb.add_flag("--as-stored", asStored_,
                  "Leave pictures as they are stored instead of rotating and mirroring them as "
                  "the movie's display matrix says. Raw frames are always as stored");
}

PictureTurn TurnOption::TurnFor(const std::filesystem::path& movie) const {
    return asStored_ ? PictureTurn() : TurnOf(host::DisplayMatrixOf(movie));
}

}  // namespace cliphost
