// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/CheckOptions.h"

#include "reference_host/cliphost/MapOption.h"
#include "reference_host/cliphost/PathOption.h"
#include "reference_host/cliphost/WorkerOptions.h"

namespace cliphost {

CLI::Option* AddCheckOptions(CLI::App& verb, CheckOptions& options) {
    AddMapOption(verb, options.maps,
                 "FROM=TO, as `cliphost describe` takes it: what the file names in TO is in the "
                 "folder FROM of this machine; may be given several times");
    auto* const search =
        AddPaths(verb, "--search", options.search,
                 "A folder in which, and in the folders in it, movies are looked for that "
                 "are not in their places: by their content, among files with the endings "
                 "of those; may be given several times")
            ->allow_extra_args(false);
    AddWorkerOptions(verb, options.workers);
    return search;
}

void TakeDescribingWorkers(CLI::App& app, const SessionOptions& session, WorkerCall& call) {
    // None of the verb's own options: they mean something else to the other one.
    const CLI::App none;
    TakeWorkerVerb(app, none, "describe-for-parent", session, call);
    call.arguments.push_back("--quiet");
}

}  // namespace cliphost
