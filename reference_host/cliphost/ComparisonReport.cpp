// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/ComparisonReport.h"

#include <fmt/format.h>

#include <nlohmann/json.hpp>

#include "reference_host/cliphost/Failure.h"
#include "reference_host/cliphost/JsonAnswer.h"
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
    return InWords(object) + InWords(difference);
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
    add(counts.unknown, "not described");
    fmt::print("{}\n", text);
}

ComparisonJson::ComparisonJson(const ordered_json& head, Form form, std::size_t spaces)
    : form_(form), spaces_(spaces) {
    std::string text = Text(head, 0);
    text.pop_back();
    text.resize(text.find_last_not_of(" \n") + 1);
    fmt::print("{}{},{}\"differences\": [", std::string(spaces_, ' '), text, LineEnd(1));
}

void ComparisonJson::Take(const ComparedObject& object, const TreeDifference& difference) {
    fmt::print("{}{}{}", isFirst_ ? "" : ",", LineEnd(2), Text(ToJson(object, difference), 2));
    isFirst_ = false;
}

void ComparisonJson::Finish(const ComparisonCounts& counts) {
    fmt::print("{}],{}\"counts\": {}{}}}{}", isFirst_ ? "" : LineEnd(1), LineEnd(1),
               Text(ToJson(counts), 1), LineEnd(0), spaces_ == 0 ? "\n" : "");
}

// Without what indents its first line.
std::string ComparisonJson::Text(const ordered_json& json, std::size_t level) const {
    if (form_ == Form::OneLine) {
        return json.dump(-1, ' ', false, ordered_json::error_handler_t::replace);
    }
    const std::size_t indentation = spaces_ + 2 * level;
    return InLines(json, indentation).substr(indentation);
}

std::string ComparisonJson::LineEnd(std::size_t level) const {
    return form_ == Form::OneLine ? "" : '\n' + std::string(spaces_ + 2 * level, ' ');
}

ordered_json ToJson(const ComparedObject& object, const TreeDifference& difference) {
    return {
        {"object",
         {{"class", Shown(object.kind)},
          {"id", OrNull(object.id)},
          {"name", OrNull(Shown(object.name))}}},
        {"kind", NameOf(difference.kind)},
        {"place", difference.place},
        {"property", OrNull(Shown(difference.property))},
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
            {"notDescribed", counts.unknown},
            {"unread", counts.unread}};
}

int StatusOf(const ComparisonCounts& counts) {
    return counts.AreEqual() ? kExitFine : kExitFile;
}

}  // namespace cliphost
