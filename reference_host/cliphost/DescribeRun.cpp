// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/DescribeRun.h"

#include <fmt/format.h>

#include <nlohmann/json.hpp>

#include "reference_host/cliphost/MachinePath.h"
#include "reference_host/cliphost/OutputFile.h"
#include "reference_host/framework/HostPath.h"

namespace cliphost {
namespace {

using host::DisplayPath;
using nlohmann::ordered_json;

// An entry of a list in JSON. `description` is JSON already.
std::string EntryText(const ordered_json& head, const std::string& description) {
    std::string lines = head.dump(2, ' ', false, ordered_json::error_handler_t::replace);
    std::string text = "  ";
    for (const char c : lines) {
        text += c;
        if (c == '\n') {
            text += "  ";
        }
    }
    if (!description.empty()) {
        constexpr std::string_view kEnd = "\n  }";
        text.resize(text.size() - kEnd.size());
        text += ",\n    \"description\": " + description;
        text += kEnd;
    }
    return text;
}

}  // namespace

MovieAnswer DescribeRun::Answer(const MovieStep& step, const PlaceOfFile& place) {
    const Description description =
        step.folder ? DescribeFromList(session(), step.folder->list(), step.index, step.movie)
                    : DescribeMovie(session(), step.movie);
    return AnswerOf(session(), description, options_.form, place);
}

bool DescribeRun::ReadAnswer(const std::string& bytes, MovieAnswer& answer) {
    return FromBytes(bytes, options_.form, answer);
}

void DescribeRun::ShowFailure(const std::filesystem::path& movie, const Problem& problem) {
    if (options_.form.json) {
        ordered_json head = {{"movie", MachinePath(movie)}};
        AddProblem(problem, head);
        entries_.push_back(EntryText(head, ""));
    }
}

void DescribeRun::Show(const std::filesystem::path& movie, const MovieAnswer& answer,
                       const std::filesystem::path& saved) {
    maps_.AddUsed(answer.mapsUsed);
    if (host::system::IsStandardOutput(saved)) {
        return;
    }
    if (!options_.form.json) {
        fmt::print("{}{}\n{}", DisplayPath(movie), saved.empty() ? "" : " -> " + DisplayPath(saved),
                   answer.description);
        return;
    }
    ordered_json head = {{"movie", MachinePath(movie)}};
    if (!saved.empty()) {
        head["aaf"] = MachinePath(saved);
    }
    if (answer.problem) {
        AddProblem(answer.problem, head);
    }
    head["route"] = answer.route;
    if (!answer.routeReason.empty()) {
        head["routeReason"] = answer.routeReason;
    }
    entries_.push_back(EntryText(head, answer.description));
}

void DescribeRun::Finish(int described, int failed) {
    for (const std::string& rule : maps_.Unused()) {
        if (described > 0) {
            TellAlso(Failure(kExitCaller, "--map " + rule, "nothing was mapped by it",
                             "give FROM as the locators of `cliphost describe` begin"));
        }
    }
    if (!options_.form.json) {
        if (described + failed != 1 && !host::system::IsStandardOutput(options_.movies.file)) {
            fmt::print("{} described, {} not\n", described, failed);
        }
        return;
    }
    fmt::print("[");
    for (std::size_t i = 0; i < entries_.size(); ++i) {
        fmt::print("{}\n{}", i == 0 ? "" : ",", entries_[i]);
    }
    fmt::print("{}]\n", entries_.empty() ? "" : "\n");
}

}  // namespace cliphost
