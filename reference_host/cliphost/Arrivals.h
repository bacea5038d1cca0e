// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <chrono>
#include <filesystem>
#include <functional>
#include <map>
#include <optional>
#include <unordered_map>
#include <vector>

#include "reference_host/system/FileState.h"

namespace cliphost {

// Files that arrive. One has arrived when its size and date have not changed for a while; it
// arrives again when they change later, or when it was away.
class Arrivals {
public:
    using Clock = std::chrono::steady_clock;
    using StateOf =
        std::function<std::optional<host::system::FileState>(const std::filesystem::path&)>;

    Arrivals(std::chrono::milliseconds rest, StateOf stateOf)
        : rest_(rest), stateOf_(std::move(stateOf)) {}

    // Something may have happened to a file.
    void See(const std::filesystem::path& file, Clock::time_point now);
    // The same of all that have arrived and are no longer in their folders; those of a folder that
    // is away itself wait for it.
    void LookForRemoved();
    // Those that have arrived since the last call, by the order of their paths.
    std::vector<std::filesystem::path> Take(Clock::time_point now);
    // When the next one may have; none is on its way: nothing.
    std::optional<Clock::time_point> Next() const;

private:
    struct OnItsWay {
        host::system::FileState state;
        Clock::time_point looked;
    };

    std::chrono::milliseconds rest_;
    StateOf stateOf_;
    std::map<std::filesystem::path, OnItsWay> onTheirWay_;
    std::unordered_map<std::filesystem::path::string_type, host::system::FileState> arrived_;
};

}  // namespace cliphost
