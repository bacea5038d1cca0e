// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/data_check/Findings.h"

#include <algorithm>
#include <tuple>

namespace data_check {

void Findings::Tell(DataFile file, host::XmlPlace place, std::string what, std::string hint) {
    if (count_++ < kMost) {
        kept_.push_back({file, place, std::move(what), std::move(hint)});
    }
}

std::vector<Finding> Findings::TakeInOrder() {
    std::stable_sort(kept_.begin(), kept_.end(), [](const Finding& a, const Finding& b) {
        return std::tie(a.file, a.place.line, a.place.column) <
               std::tie(b.file, b.place.line, b.place.column);
    });
    return std::move(kept_);
}

}  // namespace data_check
