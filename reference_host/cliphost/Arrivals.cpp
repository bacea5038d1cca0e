// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/Arrivals.h"

#include <algorithm>
#include <iterator>
#include <system_error>

namespace cliphost {

void Arrivals::See(const std::filesystem::path& file, Clock::time_point now) {
    const auto state = stateOf_(file);
    const auto arrived = arrived_.find(file.native());
    if (!state) {
        onTheirWay_.erase(file);
        arrived_.erase(file.native());
    } else if (arrived == arrived_.end() || !(arrived->second == *state)) {
        const auto [known, isNew] = onTheirWay_.try_emplace(file, OnItsWay{*state, now});
        if (!isNew && !(known->second.state == *state)) {
            known->second = {*state, now};
        }
    }
}

void Arrivals::LookForRemoved() {
    for (auto file = arrived_.begin(); file != arrived_.end();) {
        const std::filesystem::path path(file->first);
        std::error_code ignored;
        const bool isRemoved =
            !stateOf_(path) && std::filesystem::is_directory(path.parent_path(), ignored);
        file = isRemoved ? arrived_.erase(file) : std::next(file);
    }
}

std::vector<std::filesystem::path> Arrivals::Take(Clock::time_point now) {
    std::vector<std::filesystem::path> taken;
    for (auto file = onTheirWay_.begin(); file != onTheirWay_.end();) {
        OnItsWay& known = file->second;
        if (now - known.looked < rest_) {
            ++file;
            continue;
        }
        const auto state = stateOf_(file->first);
        if (state && !(*state == known.state)) {
            known = {*state, now};
            ++file;
            continue;
        }
        if (state) {
            arrived_[file->first.native()] = *state;
            taken.push_back(file->first);
        }
        file = onTheirWay_.erase(file);
    }
    return taken;
}

std::optional<Arrivals::Clock::time_point> Arrivals::Next() const {
    std::optional<Clock::time_point> next;
    for (const auto& [file, known] : onTheirWay_) {
        next = std::min(next.value_or(known.looked + rest_), known.looked + rest_);
    }
    return next;
}

}  // namespace cliphost
