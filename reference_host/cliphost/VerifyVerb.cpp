// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/cliphost/CheckOptions.h"
#include "reference_host/cliphost/JsonAnswer.h"
#include "reference_host/cliphost/MachinePath.h"
#include "reference_host/cliphost/Verbs.h"
#include "reference_host/cliphost/Verify.h"

namespace cliphost {

void AddVerify(CLI::App& app, const SessionOptions& session, int& status) {
    auto* const verb = app.add_subcommand(
        "verify", "Tell for each clip of AAF files whether its movie is still there and the same");
    verb->footer(
        "Example: cliphost verify bin.aaf --map /mnt/media=//server/media\n"
        "States: same; moved, found by its content elsewhere; changed, another movie is there or "
        "it "
        "is described otherwise now;\nmissing; unknown, where nobody can tell, as of other makers' "
        "clips.\n"
        "Exit status: 0, every clip is the same, or another maker's whose file is there; 1, a clip "
        "is not, or an AAF file can't be read;\n2, the call is at fault.");
    auto options = std::make_shared<VerifyOptions>();
    verb->add_option("files", options->files, "AAF files")->required();
    verb->add_flag("--json", options->json, kJsonHelp);
    AddCheckOptions(*verb, options->check);
    verb->callback([&app, &session, &status, options] {
        AnswerFailureToo(options->json, nlohmann::ordered_json::object(), [&] {
            TakeDescribingWorkers(app, session, options->check.workers);
            Session running(session);
            status = Verify(running, *options);
        });
    });
}

}  // namespace cliphost
