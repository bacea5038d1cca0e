// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/cliphost/CheckOptions.h"
#include "reference_host/cliphost/JsonAnswer.h"
#include "reference_host/cliphost/MachinePath.h"
#include "reference_host/cliphost/PathOption.h"
#include "reference_host/cliphost/Verbs.h"
#include "reference_host/cliphost/Verify.h"

namespace cliphost {

void AddVerify(CLI::App& app, const SessionOptions& session, int& status) {
    auto* const verb = app.add_subcommand(
        "verify", "Tell for each clip of AAF files whether its movie is still there and the same");
    verb->footer(
        "Examples:\n"
        "  cliphost verify bin.aaf\n"
        "  cliphost verify bin.aaf --map /mnt/media=//server/media --search /mnt/archive\n\n"
        "A clip is the same, moved (its movie is elsewhere), unknown (nobody can tell), missing "
        "(no "
        "file is there)\nor changed (another movie is there, or it is described otherwise now, as "
        "under other settings).\n"
        "A clip that is not the same gives status 1, as a file's fault does; the last line tells "
        "them apart. Another\nmaker's clip that is unknown gives 0: nothing in it tells which "
        "movie it is.");
    auto options = std::make_shared<VerifyOptions>();
    AddPaths(*verb, "files", options->files, "AAF files")->required();
    verb->add_flag("--json", options->json, kJsonHelp);
    AddCheckOptions(*verb, options->check);
    verb->callback([&app, &session, &status, options] {
        AnswerFailureToo(options->json, schema::kVerify, nlohmann::ordered_json::object(), [&] {
            TakeDescribingWorkers(app, session, options->check.workers);
            Session running(session);
            status = Verify(running, *options);
        });
    });
}

}  // namespace cliphost
