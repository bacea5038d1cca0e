// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/ComparisonReport.h"

#include <fmt/format.h>

#include <nlohmann/json.hpp>

#include "reference_host/cliphost/Failure.h"
#include "reference_host/cliphost/Notice.h"
#include "reference_host/cliphost/Words.h"
#include "reference_host/util/text/Printable.h"

namespace cliphost {
namespace {

using nlohmann::ordered_json;

ordered_json OrNull(const std::string& text) {
    return text.empty() ? ordered_json() : ordered_json(text);
}

ordered_json OrNull(const std::optional<std::string>& text) {
    return text ? ordered_json(*text) : ordered_json();
}

// Of an object that is there in one file alone, the difference is the whole.
bool IsOfWhole(const TreeDifference& difference) {
    return difference.place.empty() && difference.property.empty();
}

std::string WholeInWords(const ComparedObject& object, const TreeDifference& difference) {
    return fmt::format("{} {}", InWords(object), NameOf(difference.kind));
}

std::string LineOf(const std::string& margin, const std::string& text) {
    return fmt::format("{}{}\n", margin, host::text::Printable(text));
}

}  // namespace

void ComparisonLines::Take(const ComparedObject& object, const TreeDifference& difference) {
    if (IsOfWhole(difference)) {
        fmt::print("{}", LineOf("", WholeInWords(object, difference)));
        told_.clear();
        return;
    }
    const std::string name = InWords(object);
    const std::string whole = name + object.id;
    if (told_ != whole) {
        fmt::print("{}", LineOf("", name));
        told_ = whole;
    }
    fmt::print("{}", LineOf("  ", InWords(difference)));
}

void ComparisonLines::Finish(const ComparisonCounts& counts) {
    if (counts.unread > 0) {
        Notice("cliphost: nothing is told of {} that can't be read\n",
               Counted(counts.unread, "value"));
    }
    std::string text = Counted(counts.differences, "difference");
    const char* before = ": ";
    const auto add = [&](std::size_t count, const char* word) {
        if (count > 0) {
            text += fmt::format("{}{} {}", before, Counted(count, "object"), word);
            before = ", ";
        }
    };
    add(counts.alike, "alike");
    add(counts.changed, "changed");
    add(counts.gone, "gone");
    add(counts.added, "new");
    fmt::print("{}\n", text);
}

ordered_json ToJson(const ComparedObject& object, const TreeDifference& difference) {
    return {
        {"object",
         {{"class", object.kind}, {"id", OrNull(object.id)}, {"name", OrNull(object.name)}}},
        {"kind", NameOf(difference.kind)},
        {"place", difference.place},
        {"property", OrNull(difference.property)},
        {"before", OrNull(difference.before)},
        {"after", OrNull(difference.after)},
        {"words", IsOfWhole(difference) ? WholeInWords(object, difference) : InWords(difference)}};
}

ordered_json ToJson(const ComparisonCounts& counts) {
    return {{"differences", counts.differences},
            {"alike", counts.alike},
            {"changed", counts.changed},
            {"gone", counts.gone},
            {"new", counts.added},
            {"unread", counts.unread}};
}

int StatusOf(const ComparisonCounts& counts) {
    return counts.AreEqual() ? kExitFine : kExitFile;
}

}  // namespace cliphost
