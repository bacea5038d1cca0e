// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/WorkerOptions.h"

#include "reference_host/cliphost/OptionChecks.h"
#include "reference_host/cliphost/SettingsFile.h"
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
        if (!other.get_option_no_throw(name) || name == "--config" || name == kNoSettingsFile) {
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

const WorkerWords kManyMovies = {
    "Many movies at once",
    "How many movies are read at the same time, each by a process that can do little else; what "
    "one does to its process costs that movie alone. With 1, and for a single movie, this process "
    "reads",
    "Give a movie up that takes longer; movies are then read by such processes, whatever --jobs is",
    "Give a movie up whose process needs more MiB of memory, the program's own included; movies "
    "are then read by such processes, whatever --jobs is"};

const WorkerWords kManyFrames = {
    "Many frames at once",
    "How many processes that can do little else read pieces of the range at the same time; what "
    "the movie does to one costs that piece alone. Where nothing tells which frames can be decoded "
    "without those before, one process reads all pieces, and all behind a lost one are lost. With "
    "1, where the range names fewer than 24 frames, where the output is a pipe or a device, and "
    "for raw frames unless this is given, this process reads. Of a damaged movie, pieces can have "
    "other frames than one process reads",
    "Give a piece of the range up that takes longer; opening the movie and counting its frames may "
    "take as long before. Frames are then read by such processes, whatever --jobs and the output "
    "are",
    "Give a piece up whose process needs more MiB of memory, the program's own included; frames "
    "are then read by such processes, whatever --jobs and the output are"};

void AddWorkerOptions(CLI::App& verb, WorkerCall& call, const WorkerWords& words) {
    call.jobs = host::system::UsableProcessors();
    verb.add_option("--jobs", call.jobs, words.jobs)
        ->check(WholeNumber(1, kMostJobs))
        ->default_str("one for each processor")
        ->group(words.group);
    verb.add_option("--limit-seconds", call.limits.seconds, words.seconds)
        ->check(WholeNumber(1, kMostSeconds))
        ->group(words.group);
    verb.add_option("--limit-memory", call.limits.mebibytes, words.memory)
        ->check(WholeNumber(kLeastMebibytes, kMostMebibytes))
        ->group(words.group);
}

void TakeWorkerVerb(CLI::App& app, const CLI::App& verb, const std::string& worker,
                    const SessionOptions& session, WorkerCall& call) {
    call.program = session.program;
    call.verbosity = session.verbosity;
    // What the settings file gave is given them, too; they need not read it.
    call.arguments.emplace_back(kNoSettingsFile);
    AppendGiven(app, app, call.arguments);
    call.arguments.push_back(worker);
    AppendGiven(verb, *app.get_subcommand(worker), call.arguments);
}

}  // namespace cliphost
