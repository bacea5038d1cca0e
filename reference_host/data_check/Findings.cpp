// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/data_check/Findings.h"

#include <algorithm>
#include <tuple>

namespace data_check {

void Findings::Tell(DataFile file, host::XmlPlace place, std::string what, std::string hint) {
    ++count_;
    kept_.push_back({file, place, std::move(what), std::move(hint)});
    if (kept_.size() == 2 * kMost) {
        KeepFirst();
    }
}

std::vector<Finding> Findings::TakeInOrder() {
    KeepFirst();
    return std::move(kept_);
}

void Findings::KeepFirst() {
    std::stable_sort(kept_.begin(), kept_.end(), [](const Finding& a, const Finding& b) {
        return std::tie(a.file, a.place.line, a.place.column) <
               std::tie(b.file, b.place.line, b.place.column);
    });
    kept_.erase(kept_.begin() + static_cast<std::ptrdiff_t>(std::min(kMost, kept_.size())),
                kept_.end());
}

}  // namespace data_check
