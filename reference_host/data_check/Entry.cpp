// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/data_check/Entry.h"

#include <fmt/format.h>

#include <algorithm>
#include <charconv>
#include <numeric>
#include <system_error>

#include "reference_host/util/text/Cut.h"

namespace data_check {
namespace {

using host::PlacedAttribute;
using host::PlacedElement;

// Its blanks count.
constexpr std::string_view kCode = "FourChar";

constexpr std::size_t kLongestShown = 60;     // of a value or name
constexpr std::size_t kLongestCompared = 64;  // of names
constexpr std::size_t kLikeness = 2;          // letters in which a mistyped name may differ

bool HasOuterBlank(const std::string& text) {
    constexpr const char* kBlanks = " \t\r\n";
    return text.empty() || text.find_first_of(kBlanks) == 0 ||
           text.find_last_of(kBlanks) == text.size() - 1;
}

// How many letters have to be put in, taken out or changed.
std::size_t Distance(std::string_view a, std::string_view b) {
    std::vector<std::size_t> row(b.size() + 1);
    std::iota(row.begin(), row.end(), std::size_t{0});
    for (std::size_t i = 1; i <= a.size(); ++i) {
        std::size_t diagonal = row[0]++;
        for (std::size_t j = 1; j <= b.size(); ++j) {
            const std::size_t changed = diagonal + (a[i - 1] == b[j - 1] ? 0 : 1);
            diagonal = row[j];
            row[j] = std::min({row[j] + 1, row[j - 1] + 1, changed});
        }
    }
    return row.back();
}

// The known name that one is mistyped of; null where it is like none.
const char* Meant(const std::string& name, const std::vector<const char*>& known) {
    const char* meant = nullptr;
    std::size_t least = kLikeness + 1;
    for (const char* const one : known) {
        const std::size_t distance =
            name.size() <= kLongestCompared ? Distance(name, one) : kLikeness + 1;
        meant = distance < least ? one : meant;
        least = std::min(least, distance);
    }
    return meant;
}

std::string HintFor(const std::string& name, const std::vector<const char*>& known) {
    if (const char* const meant = Meant(name, known)) {
        return fmt::format("write {}, as the module spells it", meant);
    }
    std::string all;
    for (const char* const one : known) {
        all += (all.empty() ? "" : ", ") + std::string(one);
    }
    return fmt::format("take it out; the module reads: {}", all);
}

std::string HintFor(const NumberRule& rule) {
    return fmt::format("give {}", rule.accepted);
}

bool IsKnown(const std::string& name, const std::vector<const char*>& known) {
    return name.rfind("xmlns", 0) == 0 ||
           std::any_of(known.begin(), known.end(), [&](const char* one) { return name == one; });
}

void TellUnknown(const EntryReader& reader, const std::string& name, host::XmlPlace place,
                 const std::vector<const char*>& known) {
    reader.Tell(place, fmt::format("{} means nothing here", Shown(name)), HintFor(name, known));
}

// Whether a value or element of a name stands within one of the children.
bool StandsDeeper(const PlacedElement& parent, std::string_view name) {
    return std::any_of(parent.elements.begin(), parent.elements.end(),
                       [&](const PlacedElement& child) {
                           return !ItemsOf(child, name).empty() || StandsDeeper(child, name);
                       });
}

// All but the zeros before a number; of nothing but zeros, the last.
std::string WithoutZeros(const std::string& text) {
    return text.empty() ? text
                        : text.substr(std::min(text.find_first_not_of('0'), text.size() - 1));
}

// Finds entries as the module does: wherever they stand, whatever is around them.
struct EntrySearch {
    std::string_view name;
    std::vector<const PlacedElement*> entries = {};
    std::vector<const PlacedElement*> strangers = {};  // the outermost elements without an entry

    void Enter(const PlacedElement& element) {
        const std::size_t entriesBefore = entries.size();
        const std::size_t strangersBefore = strangers.size();
        if (element.name == name) {
            entries.push_back(&element);
        }
        for (const PlacedElement& child : element.elements) {
            Enter(child);
        }
        if (element.name == name) {
            strangers.resize(strangersBefore);  // they are looked at with the entry
        } else if (entries.size() == entriesBefore) {
            strangers.resize(strangersBefore);
            strangers.push_back(&element);
        }
    }
};

}  // namespace

std::string Shown(const std::string& text) {
    const std::string start(host::text::StartOf(text, kLongestShown));
    return start.size() == text.size() ? start : start + "...";
}

std::vector<Item> ItemsOf(const PlacedElement& parent, std::string_view name) {
    std::vector<Item> items;
    for (const PlacedAttribute& attribute : parent.attributes) {
        if (attribute.name == name) {
            items.push_back({attribute.value, attribute.place});
        }
    }
    for (const PlacedElement& child : parent.elements) {
        if (child.name == name) {
            items.push_back({child.text, child.place, &child});
        }
    }
    return items;
}

std::optional<std::uint32_t> NumberIn(const std::string& text) {
    std::uint32_t number = 0;
    const char* const end = text.data() + text.size();
    const auto [last, error] = std::from_chars(text.data(), end, number);
    const bool isPlain =
        error == std::errc() && last == end && (text.size() == 1 || text[0] != '0');
    return isPlain ? std::optional<std::uint32_t>(number) : std::nullopt;
}

bool IsId(std::uint32_t number) {
    return number != 0 && number <= 0x7FFFFFFF;
}

std::optional<Item> EntryReader::One(const PlacedElement& parent, const char* name,
                                     const std::string& hint) const {
    std::vector<Item> items = ItemsOf(parent, name);
    if (items.empty()) {
        TellLack(parent, name, hint);
        return std::nullopt;
    }
    if (items.size() > 1) {
        Tell(items[1].place, fmt::format("{} stands here a second time", name),
             "take out all but one; the first counts");
        return std::nullopt;
    }
    return IsSound(items[0], name) ? std::optional<Item>(std::move(items[0])) : std::nullopt;
}

// The module takes what follows the name of a value for the value: an attribute, then the text.
bool EntryReader::IsSound(const Item& item, const char* name) const {
    if (item.element != nullptr && !item.element->attributes.empty()) {
        const PlacedAttribute& first = item.element->attributes[0];
        Tell(first.place, fmt::format("{} would get the value of {}", name, Shown(first.name)),
             "take the attribute out: the value itself stands in the element");
        return false;
    }
    if (name != kCode && HasOuterBlank(item.value)) {
        Tell(item.place, fmt::format("{} is empty or has blanks around it", name),
             "write the value with nothing around it; the module takes blanks for a part of it");
        return false;
    }
    return true;
}

std::optional<std::uint32_t> EntryReader::Number(const PlacedElement& parent,
                                                 const NumberRule& rule) const {
    if (!rule.isMandatory && ItemsOf(parent, rule.name).empty()) {
        return std::nullopt;
    }
    const std::optional<Item> item = One(parent, rule.name, HintFor(rule));
    return item ? CheckedNumber(*item, rule) : std::nullopt;
}

std::optional<std::uint32_t> EntryReader::NumberOf(const Item& item, const NumberRule& rule) const {
    return IsSound(item, rule.name) ? CheckedNumber(item, rule) : std::nullopt;
}

std::optional<std::uint32_t> EntryReader::CheckedNumber(const Item& item,
                                                        const NumberRule& rule) const {
    const std::optional<std::uint32_t> number = NumberIn(item.value);
    const std::optional<std::uint32_t> meant = NumberIn(WithoutZeros(item.value));
    if (!number && meant && rule.accepts(*meant)) {
        Tell(item.place,
             fmt::format("{} has zeros before its number: \"{}\"", rule.name, Shown(item.value)),
             fmt::format("write {}", *meant));
        return std::nullopt;
    }
    if (!number || !rule.accepts(*number)) {
        Tell(item.place, fmt::format("{} can't be \"{}\"", rule.name, Shown(item.value)),
             HintFor(rule));
        return std::nullopt;
    }
    return number;
}

const PlacedElement* EntryReader::OneChild(const PlacedElement& parent, const char* name,
                                           const std::string& hint) const {
    const PlacedElement* found = nullptr;
    for (const PlacedElement& child : parent.elements) {
        if (child.name == name && found != nullptr) {
            Tell(child.place, fmt::format("{} stands here a second time", name),
                 "take out all but one; the first counts");
            return found;
        }
        found = child.name == name ? &child : found;
    }
    if (found == nullptr) {
        TellLack(parent, name, hint);
    }
    return found;
}

// What is mistyped, or stands within something that means nothing, was told as that.
void EntryReader::TellLack(const PlacedElement& parent, const char* name,
                           const std::string& hint) const {
    if (meant_.count({&parent, name}) == 0 && !StandsDeeper(parent, name)) {
        Tell(parent.place, fmt::format("{} lacks {}", parent.name, name), hint);
    }
}

void EntryReader::CheckNames(const PlacedElement& parent, const std::vector<const char*>& known) {
    const auto check = [&](const std::string& name, host::XmlPlace place) {
        if (IsKnown(name, known)) {
            return;
        }
        TellUnknown(*this, name, place, known);
        if (const char* const meant = Meant(name, known)) {
            meant_.insert({&parent, meant});
        }
    };
    for (const PlacedAttribute& attribute : parent.attributes) {
        check(attribute.name, attribute.place);
    }
    for (const PlacedElement& child : parent.elements) {
        check(child.name, child.place);
    }
}

std::vector<const PlacedElement*> EntriesOf(const PlacedElement& root, const char* name,
                                            const EntryReader& reader) {
    if (root.name == name) {
        return {&root};
    }
    EntrySearch search{name};
    for (const PlacedElement& child : root.elements) {
        search.Enter(child);
    }
    for (const PlacedElement* const stranger : search.strangers) {
        if (!IsKnown(stranger->name, {name})) {
            TellUnknown(reader, stranger->name, stranger->place, {name});
        }
    }
    if (search.entries.empty()) {
        reader.Tell(root.place, fmt::format("there is no {} in it", name), "add one");
    }
    return std::move(search.entries);
}

}  // namespace data_check
