// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>
#include <filesystem>
#include <string>
#include <string_view>
#include <vector>

namespace cliphost {

// Many paths, most of them in the folder of the first: that folder is kept once, and of each path
// in it the bare name. A folder may hold 100,000 movies.
class PathList {
public:
    using Text = std::filesystem::path::string_type;
    using View = std::basic_string_view<Text::value_type>;

    void Add(const Text& path);
    // No more come: what was kept ready for them is given back.
    void Close();

    std::size_t size() const { return ends_.size(); }
    Text operator[](std::size_t index) const;
    // Whether one path comes before another, as their texts do.
    bool IsBefore(std::size_t one, std::size_t other) const;

private:
    View Kept(std::size_t index) const;
    static bool IsWhole(View kept);

    Text folder_;  // with the separator after it
    Text kept_;    // one after the other
    std::vector<std::size_t> ends_;
};

}  // namespace cliphost
