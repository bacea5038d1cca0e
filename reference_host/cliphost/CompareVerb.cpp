// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include <fmt/format.h>

#include "reference_host/cliphost/ComparisonReport.h"
#include "reference_host/cliphost/JsonAnswer.h"
#include "reference_host/cliphost/MachinePath.h"
#include "reference_host/cliphost/PathOption.h"
#include "reference_host/cliphost/Verbs.h"

namespace cliphost {
namespace {

using nlohmann::ordered_json;

struct CompareOptions {
    std::filesystem::path before;
    std::filesystem::path after;
    bool json = false;
};

// A file to be compared. The status of a failure can be that of a difference, so its words tell
// that there was no comparison.
host::Ref<IAAFFile> Open(const AafLibrary& library, const std::filesystem::path& file) {
    try {
        return library.Open(file);
    } catch (const Failure& failure) {
        Problem problem = failure.problem();
        problem.reason = "not compared: " + problem.reason;
        throw Failure(failure.status(), problem);
    }
}

// A reader of the output may go away before all is told; what it saw counts for the status.
template <class Printer>
void PrintComparison(Printer& printer, IAAFFile* before, IAAFFile* after, int& status) {
    const ComparisonCounts counts = CompareFiles(
        before, after, [&](const ComparedObject& object, const TreeDifference& difference) {
            status = kExitFile;
            printer.Take(object, difference);
        });
    status = StatusOf(counts);
    printer.Finish(counts);
}

}  // namespace

void AddCompare(CLI::App& app, const SessionOptions& session, int& status) {
    auto* const verb = app.add_subcommand(
        "compare", "Tell in words in what two AAF files differ, whoever made them");
    verb->footer(
        std::string("Examples:\n"
                    "  cliphost compare before.aaf after.aaf\n"
                    "  cliphost compare before.aaf after.aaf --json\n"
                    "  cliphost compare before.aaf after.aaf >/dev/null && echo alike\n\n"
                    "Mobs are those with the same id, or the only ones of their class and name; "
                    "slots go by their ids,\ncolumns and other named things by their names, the "
                    "rest by content and order.\n") +
        kLeftOutOfComparison +
        "\n\nExit status: 0, the files are alike; 1, they differ, or one can't be read as AAF; 2, "
        "the call is at fault.\nWhere they were compared, and only there, the last line counts "
        "what "
        "differs and what is alike\n(with --json: the member counts).");
    auto options = std::make_shared<CompareOptions>();
    AddPath(*verb, "before", options->before, "An AAF file")->required();
    AddPath(*verb, "after", options->after, "The one that is told against it")->required();
    verb->add_flag("--json", options->json, kJsonHelp);
    verb->callback([&session, &status, options] {
        const ordered_json files = {{"beforeFile", MachinePath(options->before)},
                                    {"afterFile", MachinePath(options->after)}};
        std::unique_ptr<AafLibrary> library;
        host::Ref<IAAFFile> before;
        host::Ref<IAAFFile> after;
        // Behind the start of an answer, a failure would be none.
        AnswerFailureToo(options->json, schema::kCompare, files, [&] {
            library = LoadAafLibrary(session);
            before = Open(*library, options->before);
            after = Open(*library, options->after);
        });
        if (options->json) {
            ComparisonJson json(WithSchema(schema::kCompare, files), ComparisonJson::Form::Lines);
            PrintComparison(json, before.get(), after.get(), status);
        } else {
            ComparisonLines lines;
            PrintComparison(lines, before.get(), after.get(), status);
        }
    });
}

}  // namespace cliphost
