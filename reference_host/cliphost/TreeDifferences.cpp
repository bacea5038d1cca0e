// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/TreeDifferences.h"

#include <fmt/format.h>

#include <algorithm>
#include <functional>
#include <map>

#include "reference_host/cliphost/AafClips.h"
#include "reference_host/cliphost/AafValue.h"
#include "reference_host/cliphost/ListMatching.h"
#include "reference_host/cliphost/Words.h"
#include "reference_host/util/text/Cut.h"

namespace cliphost {
namespace {

using host::text::IsInsideCharacter;
using host::text::StartOf;
using Kind = TreeDifference::Kind;

// What says when, or by whom, an object was written.
constexpr const char* kLeftOut[] = {"CreationTime", "Generation", "LastModified"};

constexpr char kSlotId[] = "SlotID";

// What names slots elsewhere, which may have other numbers now.
constexpr const char* kSlotReferences[] = {"LinkedSlotID", "SourceMobSlotID"};

// The properties by which an object of a list is found again; the first that it has counts.
constexpr const char* kKeys[] = {kSlotId, "Identification", "Definition", "Name"};

constexpr std::string_view kStartOfMobIds = "urn:smpte:umid:";

// Of values in words.
constexpr std::size_t kLongestValue = 160;
constexpr std::size_t kShownBefore = 30;  // of what two long values have in common
// Objects with no more facts are told whole.
constexpr std::size_t kFewFacts = 2;

template <std::size_t count>
bool IsOneOf(const char* const (&names)[count], const std::string& name) {
    return std::find(std::begin(names), std::end(names), name) != std::end(names);
}

bool IsLeftOut(const std::string& name) {
    return IsOneOf(kLeftOut, name);
}

const TreeNode::Fact* FindFact(const TreeNode& node, std::string_view name) {
    const auto found = std::find_if(node.facts.begin(), node.facts.end(),
                                    [&](const TreeNode::Fact& fact) { return fact.name == name; });
    return found == node.facts.end() ? nullptr : &*found;
}

const TreeNode::Fact* KeyOf(const TreeNode& node) {
    for (const char* const name : kKeys) {
        if (const TreeNode::Fact* const fact = FindFact(node, name)) {
            return fact;
        }
    }
    return nullptr;
}

// "picture" and the like; else the name that the file gives it.
std::string KindOfData(const TreeNode& node) {
    const std::string& data = FactOf(node, "DataDefinition");
    const std::size_t id = data.find('{');
    const std::string kind =
        id == std::string::npos ? std::string() : KindOfDataNamed(data.substr(id));
    return kind.empty() ? Shown(data.substr(0, data.find(" {"))) : kind;
}

std::string KindOfSlot(const TreeNode& slot) {
    for (const TreeNode::Branch& branch : slot.branches) {
        if (branch.name == "Segment" && !branch.nodes.empty()) {
            return KindOfData(branch.nodes.front());
        }
    }
    return {};
}

// "first", "second", "11th"
std::string Ordinal(std::size_t number) {
    constexpr const char* kFirst[] = {"first", "second",  "third",  "fourth", "fifth",
                                      "sixth", "seventh", "eighth", "ninth",  "tenth"};
    if (number <= std::size(kFirst)) {
        return kFirst[number - 1];
    }
    const bool isTeen = number / 10 % 10 == 1;
    const char* const ends[] = {"th", "st", "nd", "rd"};
    const std::size_t last = isTeen || number % 10 > 3 ? 0 : number % 10;
    return std::to_string(number) + ends[last];
}

// The word for one of what a property holds several of.
std::string OneOf(const std::string& property) {
    std::string words = PropertyWords(property);
    if (words.size() > 1 && words.back() == 's') {
        words.pop_back();
    }
    return words;
}

// Names the elements of a list.
class Labels {
public:
    explicit Labels(const TreeNode::Branch& list) : list_(list) {
        for (const TreeNode& node : list.nodes) {
            const std::string kind = FindFact(node, kSlotId) ? KindOfSlot(node) : std::string();
            ordinals_.push_back(kind.empty() ? 0 : ++counts_[kind]);
            kinds_.push_back(kind);
        }
    }

    std::string Of(std::size_t at) const {
        const TreeNode& node = list_.nodes[at];
        const TreeNode::Fact* const key = KeyOf(node);
        if (key == nullptr) {
            return fmt::format("{} {} ({})", Ordinal(at + 1), OneOf(list_.name), Shown(node.title));
        }
        if (key->name != kSlotId) {
            return fmt::format("{} {}", OneOf(list_.name), Shown(key->value));
        }
        if (ordinals_[at] == 0) {
            return fmt::format("slot {}", key->value);
        }
        return counts_.at(kinds_[at]) == 1
                   ? fmt::format("{} slot {}", kinds_[at], key->value)
                   : fmt::format("{} {} slot ({})", Ordinal(ordinals_[at]), kinds_[at], key->value);
    }

private:
    const TreeNode::Branch& list_;
    std::map<std::string, std::size_t> counts_;  // of slots, by what they hold
    std::vector<std::string> kinds_;
    std::vector<std::size_t> ordinals_;
};

std::size_t Mixed(std::size_t hash, std::string_view text) {
    constexpr std::size_t kFactor = 0x9E3779B97F4A7C15u;
    return (hash ^ std::hash<std::string_view>()(text)) * kFactor;
}

// Equal for equal objects, but perhaps for their keys and the numbers of slots.
std::size_t HashOf(const TreeNode& node, const TreeNode::Fact* key) {
    std::size_t hash = Mixed(node.facts.size(), node.title);
    for (const TreeNode::Fact& fact : node.facts) {
        if (&fact != key && !IsLeftOut(fact.name) && !IsOneOf(kSlotReferences, fact.name)) {
            hash = Mixed(Mixed(hash, fact.name), fact.value);
        }
    }
    for (const TreeNode::Branch& branch : node.branches) {
        hash = Mixed(hash + branch.nodes.size(), branch.name);
        for (const TreeNode& child : branch.nodes) {
            hash = Mixed(hash, std::to_string(HashOf(child, nullptr)));
        }
    }
    return hash;
}

std::vector<ListElement> ElementsOf(const TreeNode::Branch& list) {
    std::vector<ListElement> elements;
    for (const TreeNode& node : list.nodes) {
        const TreeNode::Fact* const key = KeyOf(node);
        const bool isSlot = key != nullptr && key->name == kSlotId;
        elements.push_back({key ? key->name + ' ' + key->value : std::string(), HashOf(node, key),
                            isSlot ? node.title + ' ' + KindOfSlot(node) : node.title, isSlot});
    }
    return elements;
}

// What an object of few facts says, else its class.
std::string Brief(const TreeNode& node) {
    const TreeNode::Fact* const key = KeyOf(node);
    std::string text;
    std::size_t count = 0;
    for (const TreeNode::Fact& fact : node.facts) {
        if (&fact != key && !IsLeftOut(fact.name)) {
            text += fmt::format("{}{} {}", count++ == 0 ? "" : ", ", PropertyWords(fact.name),
                                fact.value);
        }
    }
    return count > 0 && count <= kFewFacts && node.branches.empty() ? text : node.title;
}

// A piece of a value from `start` on.
std::string Piece(const std::string& value, std::size_t start) {
    const std::string_view rest = std::string_view(value).substr(start);
    const std::string_view piece = StartOf(rest, kLongestValue);
    return fmt::format("{}{}{}", start > 0 ? "..." : "", piece,
                       piece.size() < rest.size() ? "..." : "");
}

// Two values so that it is seen in what they differ.
std::string Shown(const std::string& before, const std::string& after) {
    std::size_t start = 0;
    if (std::max(before.size(), after.size()) > kLongestValue) {
        const auto differ =
            std::mismatch(before.begin(), before.end(), after.begin(), after.end()).first;
        const auto common = static_cast<std::size_t>(differ - before.begin());
        start = common > kShownBefore ? common - kShownBefore : 0;
        while (start > 0 && IsInsideCharacter(before, start)) {
            --start;
        }
    }
    return Piece(before, start) + " -> " + Piece(after, start);
}

bool IsUnread(const std::string& value) {
    return value == kUnreadable || value.rfind(std::string("[") + kUnreadable, 0) == 0;
}

}  // namespace

std::string Shown(const std::string& value) {
    return Piece(value, 0);
}

const char* NameOf(Kind kind) {
    constexpr const char* kNames[] = {"changed", "gone", "new", "reordered", "notDescribed"};
    return kNames[static_cast<std::size_t>(kind)];
}

std::string PropertyWords(const std::string& property) {
    const std::string name = Shown(property);
    const auto isUpper = [&](std::size_t i) {
        return i < name.size() && name[i] >= 'A' && name[i] <= 'Z';
    };
    const auto isLower = [&](std::size_t i) {
        return i < name.size() && name[i] >= 'a' && name[i] <= 'z';
    };
    std::string words;
    for (std::size_t i = 0; i < name.size(); ++i) {
        if (i > 0 && isUpper(i) && (isLower(i - 1) || (isUpper(i - 1) && isLower(i + 1)))) {
            words += ' ';
        }
        words += name[i];
    }
    return InSmallLetters(words);
}

std::string InWords(const TreeDifference& difference) {
    std::string text;
    for (const std::string& place : difference.place) {
        text += (text.empty() ? "" : ": ") + place;
    }
    const auto in = [](const std::optional<std::string>& object) {
        const bool saysMore = object && object->find(' ') != std::string::npos;
        return saysMore ? fmt::format(" ({})", Shown(*object)) : std::string();
    };
    switch (difference.kind) {
        case Kind::Gone:
            return text + " gone" + in(difference.before);
        case Kind::New:
            return text + " new" + in(difference.after);
        case Kind::Reordered:
            return fmt::format("{}{}{} in another order", text, text.empty() ? "" : ": ",
                               PropertyWords(difference.property));
        case Kind::Unknown:
            return fmt::format("{} not described: {}", text, difference.reason);
        case Kind::Changed:
            break;
    }
    return fmt::format(
        "{}{}{} {}", text, text.empty() ? "" : ": ", PropertyWords(difference.property),
        Shown(difference.before.value_or("none"), difference.after.value_or("none")));
}

void TreeComparison::Tell(TreeDifference difference) {
    difference.place.insert(difference.place.begin(), place_.begin(), place_.end());
    take_(difference);
}

void TreeComparison::TellObject(Kind kind, std::string place, const TreeNode& node) {
    TreeDifference difference;
    difference.kind = kind;
    difference.place.push_back(std::move(place));
    (kind == Kind::Gone ? difference.before : difference.after) = Brief(node);
    Tell(std::move(difference));
}

const std::string& TreeComparison::InTermsOfBefore(const std::string& value) const {
    if (value.compare(0, kStartOfMobIds.size(), kStartOfMobIds) != 0) {
        return value;
    }
    const auto found = same_.find(value);
    return found == same_.end() ? value : found->second;
}

void TreeComparison::Compare(const TreeNode& before, const TreeNode& after) {
    unread_ += before.isCut || after.isCut ? 1 : 0;
    CompareFacts(before, after);
    CompareBranches(before, after);
}

void TreeComparison::CompareAt(std::string place, const TreeNode& before, const TreeNode& after) {
    const std::size_t depth = place_.size();
    if (!place.empty()) {
        place_.push_back(std::move(place));
    }
    Compare(before, after);
    place_.resize(depth);
}

// Both lists are in the order of their names.
void TreeComparison::CompareFacts(const TreeNode& before, const TreeNode& after) {
    auto a = before.facts.begin();
    auto b = after.facts.begin();
    while (a != before.facts.end() || b != after.facts.end()) {
        const bool hasBefore =
            a != before.facts.end() && (b == after.facts.end() || a->name <= b->name);
        const bool hasAfter =
            b != after.facts.end() && (a == before.facts.end() || b->name <= a->name);
        CompareFact(hasBefore ? a->name : b->name, hasBefore ? &a->value : nullptr,
                    hasAfter ? &b->value : nullptr);
        a += hasBefore ? 1 : 0;
        b += hasAfter ? 1 : 0;
    }
}

void TreeComparison::CompareFact(const std::string& name, const std::string* before,
                                 const std::string* after) {
    if (IsLeftOut(name)) {
        return;
    }
    if (before != nullptr && after != nullptr) {
        if (*before == *after || *before == InTermsOfBefore(*after)) {
            unread_ += IsUnread(*before) ? 1 : 0;
            return;
        }
    }
    TreeDifference difference;
    difference.property = name;
    difference.before = before ? std::optional<std::string>(*before) : std::nullopt;
    difference.after = after ? std::optional<std::string>(*after) : std::nullopt;
    Tell(std::move(difference));
}

void TreeComparison::CompareBranches(const TreeNode& before, const TreeNode& after) {
    auto a = before.branches.begin();
    auto b = after.branches.begin();
    while (a != before.branches.end() || b != after.branches.end()) {
        const bool hasBefore =
            a != before.branches.end() && (b == after.branches.end() || a->name <= b->name);
        const bool hasAfter =
            b != after.branches.end() && (a == before.branches.end() || b->name <= a->name);
        const TreeNode::Branch none{hasBefore ? a->name : b->name, {}};
        CompareLists(hasBefore ? *a : none, hasAfter ? *b : none);
        a += hasBefore ? 1 : 0;
        b += hasAfter ? 1 : 0;
    }
}

void TreeComparison::CompareLists(const TreeNode::Branch& before, const TreeNode::Branch& after) {
    const bool areSingle = before.nodes.size() == 1 && after.nodes.size() == 1;
    if (areSingle && KeyOf(before.nodes[0]) == nullptr && KeyOf(after.nodes[0]) == nullptr) {
        if (before.nodes[0].title != after.nodes[0].title) {
            CompareFact(before.name, &before.nodes[0].title, &after.nodes[0].title);
        } else {
            // What a slot holds is the slot, to people.
            CompareAt(before.name == "Segment" ? "" : PropertyWords(before.name), before.nodes[0],
                      after.nodes[0]);
        }
        return;
    }
    const Labels labels(before);
    const Labels newLabels(after);
    const bool isSet = before.isSet || after.isSet;
    const std::vector<std::optional<std::size_t>> found =
        MatchLists(ElementsOf(before), ElementsOf(after), isSet);
    std::vector<bool> isFound(after.nodes.size());
    std::size_t next = 0;
    bool isReordered = false;
    for (std::size_t i = 0; i < found.size(); ++i) {
        if (!found[i]) {
            TellObject(Kind::Gone, labels.Of(i), before.nodes[i]);
            continue;
        }
        isFound[*found[i]] = true;
        isReordered = isReordered || *found[i] < next;
        next = *found[i];
        CompareAt(labels.Of(i), before.nodes[i], after.nodes[*found[i]]);
    }
    for (std::size_t i = 0; i < isFound.size(); ++i) {
        if (!isFound[i]) {
            TellObject(Kind::New, newLabels.Of(i), after.nodes[i]);
        }
    }
    if (isReordered && !isSet) {
        TreeDifference difference;
        difference.kind = Kind::Reordered;
        difference.property = before.name;
        Tell(std::move(difference));
    }
}

}  // namespace cliphost
