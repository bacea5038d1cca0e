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

std::string Indented(const ordered_json& json) {
    return json.dump(2, ' ', false, ordered_json::error_handler_t::replace);
}

// Written as it is found: there may be more differences than memory.
int PrintComparisonAsJson(const ordered_json& files, IAAFFile* before, IAAFFile* after) {
    std::string head = Indented(WithSchema(schema::kCompare, files));
    head.resize(head.rfind('\n'));
    fmt::print("{},\n  \"differences\": [", head);
    const char* separator = "\n";
    const ComparisonCounts counts = CompareFiles(
        before, after, [&](const ComparedObject& object, const TreeDifference& difference) {
            fmt::print("{}{}", separator, Indented(ToJson(object, difference)));
            separator = ",\n";
        });
    fmt::print("{}],\n  \"counts\": {}\n}}\n", counts.AreEqual() ? "" : "\n",
               Indented(ToJson(counts)));
    return StatusOf(counts);
}

int PrintComparison(IAAFFile* before, IAAFFile* after) {
    ComparisonLines lines;
    const ComparisonCounts counts = CompareFiles(
        before, after, [&](const ComparedObject& object, const TreeDifference& difference) {
            lines.Take(object, difference);
        });
    lines.Finish(counts);
    return StatusOf(counts);
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
        "the call is at fault.");
    auto options = std::make_shared<CompareOptions>();
    AddPath(*verb, "before", options->before, "An AAF file")->required();
    AddPath(*verb, "after", options->after, "The one that is told against it")->required();
    verb->add_flag("--json", options->json, kJsonHelp);
    verb->callback([&session, &status, options] {
        const ordered_json files = {{"beforeFile", MachinePath(options->before)},
                                    {"afterFile", MachinePath(options->after)}};
        AnswerFailureToo(options->json, schema::kCompare, files, [&] {
            const std::unique_ptr<AafLibrary> library = LoadAafLibrary(session);
            const host::Ref<IAAFFile> before = library->Open(options->before);
            const host::Ref<IAAFFile> after = library->Open(options->after);
            status = options->json ? PrintComparisonAsJson(files, before.get(), after.get())
                                   : PrintComparison(before.get(), after.get());
        });
    });
}

}  // namespace cliphost
