// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/MovieAnswer.h"

#include <algorithm>
#include <nlohmann/json.hpp>

#include "reference_host/cliphost/AafLocators.h"
#include "reference_host/cliphost/AafTree.h"
#include "reference_host/cliphost/Fields.h"
#include "reference_host/cliphost/JsonText.h"
#include "reference_host/cliphost/MovieCodecs.h"
#include "reference_host/cliphost/Notice.h"
#include "reference_host/cliphost/OutputFile.h"
#include "reference_host/cliphost/RouteTaken.h"
#include "reference_host/framework/HostPath.h"
#include "reference_host/system/Paths.h"
#include "reference_host/util/text/Printable.h"

namespace cliphost {
namespace {

constexpr std::uint64_t kMostInAnswer = 10'000;
constexpr int kLevelOfDescription = 2;  // in the list of all entries

bool IsRoute(const std::string& text) {
    for (const char* const known : {"", route::kHeader, route::kLibrary, route::kNone}) {
        if (text == known) {
            return true;
        }
    }
    return false;
}

}  // namespace

MovieAnswer StartAnswer(const Session& session, const Description& description) {
    MovieAnswer answer;
    answer.problem = description.file ? description.doubt : description.problem;
    if (!description.file) {
        answer.status = StatusOf(description.problem);
    } else if (description.doubt) {
        TellProblem(description.doubt, session.verbosity());
    }
    return answer;
}

void WriteColumns(const Session& session, const Description& description,
                  const GivenColumns& columns) {
    if (!columns.table) {
        return;
    }
    if (const MovieColumns::Row* const row = columns.table->Find(description.movie)) {
        SetColumns(description.file.get(), *columns.table, *row);
    } else if (session.verbosity() > 0) {
        Notice("cliphost: {}: {} has no row for it\n", host::DisplayPath(description.movie),
               host::DisplayPath(columns.file));
    }
}

MovieAnswer AnswerOf(Session& session, const Description& description, const DescriptionForm& form,
                     const PlaceOfFile& place) {
    MovieAnswer answer = StartAnswer(session, description);
    if (!description.file) {
        return answer;
    }
    WriteColumns(session, description, form.columns);
    if (!form.columnsOut.empty()) {
        answer.columns =
            ColumnsOf(description.file.get(), CodecReader(session).ReadFirst(description.movie));
    }
    PathMaps maps = form.maps;
    MapLocators(description.file.get(), maps);
    answer.mapsUsed = maps.used();
    const std::filesystem::path saved = place();
    const bool isOnDisk = !saved.empty() && !OutputFile::IsDevice(saved);
    if (!saved.empty()) {
        session.aaf().Save(description.file.get(), saved);
    }
    TellRoute(description.movie, session.verbosity());
    if (host::system::IsStandardOutput(saved)) {
        return answer;  // what is shown would be in the midst of the file
    }
    // What is shown is what any reader of the saved file finds.
    const auto shown = [&] {
        return ReadTree((isOnDisk ? session.aaf().Open(saved) : description.file).get());
    };
    if (form.json) {
        const RouteTaken taken = RouteOf(description.movie);
        answer.route = taken.route;
        answer.routeReason = taken.reason;
        answer.description = ToJson(shown(), kLevelOfDescription);
    } else if (!form.quiet) {
        answer.description = ToReadableText(shown(), 1);
    }
    return answer;
}

std::string ToBytes(const MovieAnswer& answer) {
    const Problem& problem = answer.problem;
    FieldWriter writer;
    writer.Add(static_cast<std::uint64_t>(answer.status))
        .Add(host::system::PathText(problem.subject))
        .Add(problem.reason)
        .Add(problem.hint)
        .Add(static_cast<ncfUInt32>(problem.code))
        .Add(problem.route)
        .Add(answer.route)
        .Add(answer.routeReason)
        .Add(answer.description)
        .Add(answer.mapsUsed)
        .Add(std::uint64_t{answer.isPartial})
        .Add(std::uint64_t{answer.columns.size()});
    for (const auto& [name, value] : answer.columns) {
        writer.Add(name).Add(value);
    }
    return writer.bytes();
}

bool FromBytes(std::string_view bytes, const DescriptionForm& form, MovieAnswer& answer) {
    FieldReader fields(bytes);
    const std::uint64_t status = fields.Number();
    Problem& problem = answer.problem;
    problem.subject = host::system::PathOfText(fields.Text());
    problem.reason = fields.Text();
    problem.hint = fields.Text();
    problem.code = static_cast<NCFRESULT>(fields.Number());
    problem.route = fields.Text();
    answer.route = fields.Text();
    answer.routeReason = fields.Text();
    answer.description = fields.Text();
    answer.mapsUsed = fields.Number();
    const std::uint64_t isPartial = fields.Number();
    answer.isPartial = isPartial != 0;
    const std::uint64_t columns = fields.Number();
    for (std::uint64_t i = 0; i < std::min(columns, kMostInAnswer); ++i) {
        std::string name = fields.Text();
        std::string value = fields.Text();
        answer.columns.emplace_back(std::move(name), std::move(value));
    }
    if (columns > kMostInAnswer || !fields.IsWhole() || isPartial > 1 || status > kExitCaller ||
        !IsRoute(answer.route) || !IsRoute(problem.route) || (status != kExitFine && !problem)) {
        return false;
    }
    answer.status = static_cast<int>(status);
    if (form.json) {
        return status != kExitFine || (form.hasNumbers ? nlohmann::json::accept(answer.description)
                                                       : IsJsonOfTexts(answer.description));
    }
    answer.description = host::text::PrintableLines(answer.description);
    return true;
}

}  // namespace cliphost
