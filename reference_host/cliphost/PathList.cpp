// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/cliphost/PathList.h"

namespace cliphost {
namespace {

constexpr auto kSeparator = std::filesystem::path::preferred_separator;
// Stands before a path that is kept whole; no path has it.
constexpr PathList::Text::value_type kWhole = 0;

}  // namespace

void PathList::Add(const Text& path) {
    const std::size_t name = path.rfind(kSeparator) + 1;  // 0 where there is none
    if (ends_.empty()) {
        folder_.assign(path, 0, name);
    }
    if (View(path).substr(0, name) == folder_) {
        kept_.append(path, name);
    } else {
        kept_ += kWhole;
        kept_ += path;
    }
    ends_.push_back(kept_.size());
}

void PathList::Close() {
    kept_.shrink_to_fit();
    ends_.shrink_to_fit();
}

PathList::View PathList::Kept(std::size_t index) const {
    const std::size_t start = index == 0 ? 0 : ends_[index - 1];
    return View(kept_).substr(start, ends_[index] - start);
}

bool PathList::IsWhole(View kept) {
    return !kept.empty() && kept.front() == kWhole;
}

PathList::Text PathList::operator[](std::size_t index) const {
    const View kept = Kept(index);
    return IsWhole(kept) ? Text(kept.substr(1)) : folder_ + Text(kept);
}

bool PathList::IsBefore(std::size_t one, std::size_t other) const {
    const View first = Kept(one);
    const View second = Kept(other);
    return IsWhole(first) || IsWhole(second) ? (*this)[one] < (*this)[other] : first < second;
}

}  // namespace cliphost
