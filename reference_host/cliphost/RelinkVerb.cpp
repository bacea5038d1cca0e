// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/cliphost/CheckOptions.h"
#include "reference_host/cliphost/JsonAnswer.h"
#include "reference_host/cliphost/MachinePath.h"
#include "reference_host/cliphost/PathOption.h"
#include "reference_host/cliphost/Relink.h"
#include "reference_host/cliphost/Verbs.h"
#include "reference_host/system/OutputStream.h"

namespace cliphost {

void AddRelink(CLI::App& app, const SessionOptions& session, int& status) {
    auto* const verb = app.add_subcommand(
        "relink",
        "Find moved movies by their content and write an AAF file anew with their places");
    verb->footer(
        "Examples:\n"
        "  cliphost relink bin.aaf --search /mnt/new -o relinked.aaf\n"
        "  cliphost relink bin.aaf --search /mnt/new --map /mnt/new=M: -o bin.aaf\n\n"
        "What else is in the file stays as it is, other makers' clips too. A clip whose movie is "
        "not found gives\nstatus 1.");
    auto options = std::make_shared<RelinkOptions>();
    auto pinned = std::make_shared<std::string>();
    AddPath(*verb, "file", options->file, "The AAF file")->required();
    AddPath(*verb, "-o,--output", options->output,
            "Write the file here, which may be the same file; - for standard output")
        ->required();
    verb->add_flag("--json", options->json, kJsonHelp);
    verb->add_option("--pin-time", *pinned,
                     "Time stamp of what is written, such as 2026-01-31T12:00:00Z");
    AddCheckOptions(*verb, options->check)->required();
    verb->callback([&app, &session, &status, options, pinned] {
        AnswerFailureToo(options->json, schema::kRelink, {{"aaf", MachinePath(options->file)}},
                         [&] {
                             if (options->json && host::system::IsStandardOutput(options->output)) {
                                 throw Failure(kExitCaller, "-o", "standard output takes the JSON",
                                               "name a file");
                             }
                             TakeDescribingWorkers(app, session, options->check.workers);
                             SessionOptions withTime = session;
                             withTime.pinTime = *pinned;
                             Session running(withTime);
                             status = Relink(running, *options);
                         });
    });
}

}  // namespace cliphost
