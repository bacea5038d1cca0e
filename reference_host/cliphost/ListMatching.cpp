// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/ListMatching.h"

#include <algorithm>
#include <deque>
#include <map>
#include <set>
#include <string_view>
#include <unordered_map>

namespace cliphost {
namespace {

class Matching {
public:
    Matching(const std::vector<ListElement>& before, const std::vector<ListElement>& after)
        : before_(before), after_(after), found_(before.size()), isTaken_(after.size()) {}

    // Pairs elements of one name, the first with the first, and so on. `nameOf` gives an empty name
    // to an element that is not for this.
    template <class NameOf>
    void PairByName(const NameOf& nameOf) {
        std::unordered_map<std::string, std::deque<std::size_t>> places;
        for (std::size_t i = 0; i < after_.size(); ++i) {
            if (std::string name = isTaken_[i] ? "" : nameOf(after_[i]); !name.empty()) {
                places[std::move(name)].push_back(i);
            }
        }
        for (std::size_t i = 0; i < before_.size(); ++i) {
            const auto there = found_[i] ? places.end() : places.find(nameOf(before_[i]));
            if (there != places.end() && !there->second.empty()) {
                Pair(i, there->second.front());
                there->second.pop_front();
            }
        }
    }

    // Pairs elements whose key may change in their order, where both lists have as many of a kind
    // and not the same keys: then they have others now, and a key that is there may be another's.
    void PairRenamed() {
        const auto there = ThoseThatMayChange(after_);
        for (const auto& [kind, those] : ThoseThatMayChange(before_)) {
            const auto found = there.find(kind);
            if (found == there.end() || found->second.size() != those.size() ||
                KeysOf(before_, those) == KeysOf(after_, found->second)) {
                continue;
            }
            for (std::size_t i = 0; i < those.size(); ++i) {
                Pair(those[i], found->second[i]);
            }
        }
    }

    // Takes back pairs of elements without a key until all that are left run in one order: as few
    // as can be.
    void KeepOrder() {
        // Of each length the place in `before` where the best run of that length ends.
        std::vector<std::size_t> ends;
        std::vector<std::size_t> previous(before_.size(), kNone);
        for (std::size_t i = 0; i < before_.size(); ++i) {
            if (!IsLoose(i)) {
                continue;
            }
            const auto end = std::lower_bound(
                ends.begin(), ends.end(), *found_[i],
                [&](std::size_t at, std::size_t place) { return *found_[at] < place; });
            previous[i] = end == ends.begin() ? kNone : *(end - 1);
            if (end == ends.end()) {
                ends.push_back(i);
            } else {
                *end = i;
            }
        }
        std::vector<bool> stays(before_.size());
        for (std::size_t at = ends.empty() ? kNone : ends.back(); at != kNone; at = previous[at]) {
            stays[at] = true;
        }
        for (std::size_t i = 0; i < before_.size(); ++i) {
            if (IsLoose(i) && !stays[i]) {
                isTaken_[*found_[i]] = false;
                found_[i].reset();
            }
        }
    }

    // Pairs what is left without a key by its kind.
    void PairRest() { PairGap(0, before_.size(), 0, after_.size()); }

    // The same between the pairs on both sides of it.
    void PairBetween() {
        std::size_t firstAfter = 0;
        std::size_t firstBefore = 0;
        for (std::size_t i = 0; i <= before_.size(); ++i) {
            const bool isEnd = i == before_.size();
            if (isEnd || (IsLoose(i) && *found_[i] >= firstAfter)) {
                const std::size_t end = isEnd ? after_.size() : *found_[i];
                PairGap(firstBefore, i, firstAfter, end);
                firstBefore = i + 1;
                firstAfter = end + 1;
            }
        }
    }

    std::vector<std::optional<std::size_t>> Take() { return std::move(found_); }

private:
    static constexpr std::size_t kNone = static_cast<std::size_t>(-1);

    using Places = std::vector<std::size_t>;

    static std::map<std::string, Places> ThoseThatMayChange(const std::vector<ListElement>& list) {
        std::map<std::string, Places> kinds;
        for (std::size_t i = 0; i < list.size(); ++i) {
            if (list[i].mayChangeKey) {
                kinds[list[i].kind].push_back(i);
            }
        }
        return kinds;
    }

    static std::multiset<std::string_view> KeysOf(const std::vector<ListElement>& list,
                                                  const Places& places) {
        std::multiset<std::string_view> keys;
        for (const std::size_t place : places) {
            keys.insert(list[place].key);
        }
        return keys;
    }

    bool IsLoose(std::size_t i) const { return found_[i] && before_[i].key.empty(); }

    void Pair(std::size_t before, std::size_t after) {
        found_[before] = after;
        isTaken_[after] = true;
    }

    void PairGap(std::size_t firstBefore, std::size_t endBefore, std::size_t firstAfter,
                 std::size_t endAfter) {
        std::map<std::string, std::deque<std::size_t>> places;
        for (std::size_t i = firstAfter; i < endAfter; ++i) {
            if (!isTaken_[i] && after_[i].key.empty()) {
                places[after_[i].kind].push_back(i);
            }
        }
        for (std::size_t i = firstBefore; i < endBefore && !places.empty(); ++i) {
            if (found_[i] || !before_[i].key.empty()) {
                continue;
            }
            const auto there = places.find(before_[i].kind);
            if (there != places.end() && !there->second.empty()) {
                Pair(i, there->second.front());
                there->second.pop_front();
            }
        }
    }

    const std::vector<ListElement>& before_;
    const std::vector<ListElement>& after_;
    std::vector<std::optional<std::size_t>> found_;
    std::vector<bool> isTaken_;
};

// Kind and another text, as one name.
std::string Under(const std::string& kind, const std::string& text) {
    return kind + '\0' + text;
}

}  // namespace

std::vector<std::optional<std::size_t>> MatchLists(const std::vector<ListElement>& before,
                                                   const std::vector<ListElement>& after,
                                                   bool isSet) {
    Matching matching(before, after);
    matching.PairRenamed();
    matching.PairByName([](const ListElement& element) {
        return element.key.empty() ? "" : Under(element.kind, element.key);
    });
    matching.PairByName([](const ListElement& element) {
        return element.key.empty() || element.mayChangeKey
                   ? Under(element.kind, (element.key.empty() ? "" : "of a key ") +
                                             std::to_string(element.content))
                   : "";
    });
    if (isSet) {
        matching.PairRest();
    } else {
        matching.KeepOrder();
        matching.PairBetween();
    }
    return matching.Take();
}

}  // namespace cliphost
