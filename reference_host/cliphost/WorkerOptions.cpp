// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/WorkerOptions.h"

#include "reference_host/cliphost/OptionChecks.h"
#include "reference_host/system/ChildProcess.h"

namespace cliphost {
namespace {

constexpr std::uint64_t kMostJobs = 1024;
constexpr std::uint64_t kMostSeconds = 1'000'000;
// The program itself needs most of that.
constexpr std::uint64_t kLeastMebibytes = 64;
constexpr std::uint64_t kMostMebibytes = 1u << 24;

// What was given of those options that another has, too.
void AppendGiven(const CLI::App& app, const CLI::App& other, std::vector<std::string>& given) {
    for (const CLI::Option* const option : app.get_options()) {
        const std::string name = option->get_name();
        if (!other.get_option_no_throw(name)) {
            continue;
        }
        const bool takesValue = option->get_items_expected_max() > 0;
        for (const std::string& value : option->results()) {
            const bool isPlainFlag = !takesValue && value == "true";
            given.push_back(isPlainFlag ? name : name + "=" + value);
        }
    }
}

}  // namespace

void AddWorkerOptions(CLI::App& verb, WorkerCall& call) {
    const char* const group = "Many movies at once";
    call.jobs = host::system::UsableProcessors();
    verb.add_option("--jobs", call.jobs,
                    "How many movies are read at the same time, each by a process that can do "
                    "little else; what one does to its process costs that movie alone. With 1, "
                    "and for a single movie, this process reads")
        ->check(WholeNumber(1, kMostJobs))
        ->default_str("one for each processor")
        ->group(group);
    verb.add_option("--limit-seconds", call.limits.seconds,
                    "Give a movie up that takes longer; movies are then read by such processes, "
                    "whatever --jobs is")
        ->check(WholeNumber(1, kMostSeconds))
        ->group(group);
    verb.add_option("--limit-memory", call.limits.mebibytes,
                    "Give a movie up whose process needs more MiB of memory, the program's own "
                    "included; movies are then read by such processes, whatever --jobs is")
        ->check(WholeNumber(kLeastMebibytes, kMostMebibytes))
        ->group(group);
}

void TakeWorkerVerb(CLI::App& app, const CLI::App& verb, const std::string& worker,
                    const SessionOptions& session, WorkerCall& call) {
    call.program = session.program;
    call.verbosity = session.verbosity;
    AppendGiven(app, app, call.arguments);
    call.arguments.push_back(worker);
    AppendGiven(verb, *app.get_subcommand(worker), call.arguments);
}

}  // namespace cliphost
