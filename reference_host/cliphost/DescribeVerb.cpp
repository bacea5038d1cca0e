// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/cliphost/ColumnsOption.h"
#include "reference_host/cliphost/ComparisonReport.h"
#include "reference_host/cliphost/DescribeRun.h"
#include "reference_host/cliphost/InputOptions.h"
#include "reference_host/cliphost/JsonAnswer.h"
#include "reference_host/cliphost/MachinePath.h"
#include "reference_host/cliphost/MapOption.h"
#include "reference_host/cliphost/OptionChecks.h"
#include "reference_host/cliphost/PathOption.h"
#include "reference_host/cliphost/Verbs.h"
#include "reference_host/cliphost/WatchRun.h"
#include "reference_host/cliphost/WorkerOptions.h"
#include "reference_host/cliphost/WorkerVerb.h"
#include "reference_host/system/OutputStream.h"
#include "reference_host/system/Paths.h"

namespace cliphost {
namespace {

// What both processes are told of a description.
void AddForm(CLI::App& verb, DescriptionForm& form, std::string& pinned) {
    auto* const json = verb.add_flag("--json", form.json, kJsonHelp);
    verb.add_flag("--jsonl", form.lines,
                  "As JSON, a line for each movie as soon as it is done, with the members of an "
                  "entry of --json")
        ->excludes(json);
    verb.add_flag("-q,--quiet", form.quiet, "Only a line for each movie");
    verb.add_option("--pin-time", pinned,
                    "Time stamp of the saved files, such as 2026-01-31T12:00:00Z, so that the "
                    "same movie gives the same bytes");
    AddColumnsOption(verb, form.columns);
    AddPath(verb, "--columns-out", form.columnsOut,
            "Write such a table of all movies here, with what their descriptions tell");
    AddMapOption(verb, form.maps,
                 "FROM=TO, for another machine that reads what is saved: locators of movies in the "
                 "folder FROM name TO instead, which is a folder, a drive (M:) or a share "
                 "(//server/share); may be given several times, and the longest FROM counts");
}

SessionOptions WithTime(const SessionOptions& session, const std::string& pinned) {
    SessionOptions withTime = session;
    withTime.pinTime = pinned;
    return withTime;
}

void AddDescribeForParent(CLI::App& app, const SessionOptions& session, int& status) {
    const auto worker = std::make_shared<WorkerVerb>(WorkerVerb{"describe-for-parent", "describe"});
    const auto form = std::make_shared<DescriptionForm>();
    const auto pinned = std::make_shared<std::string>();
    CLI::App* const verb = AddWorkerVerb(app, worker);
    AddForm(*verb, *form, *pinned);
    verb->callback([&session, &status, worker, form, pinned] {
        form->json = form->json || form->lines;
        form->columns.Read();
        Session running(WithTime(session, *pinned));
        ServeMovies(running, *worker,
                    [&](const std::filesystem::path& movie, const PlaceOfFile& place) {
                        return AnswerOf(running, DescribeMovie(running, movie), *form, place);
                    });
        status = kExitFine;
    });
}

void AddWatchOptions(CLI::App& verb, WatchOptions& watch) {
    constexpr std::uint64_t kMostSeconds = 86'400;
    const char* const group = "Folders in which movies arrive";
    auto* const on =
        verb.add_flag("--watch", watch.isOn,
                      "Go on until a signal comes: describe each movie that arrives in the "
                      "folders, after those that are there. Those count whose names end in .mov, "
                      "or as --extensions says")
            ->group(group)
            ->needs("--out-dir");
    for (const char* const other :
         {"--aaf", "--bin", "--columns-out", "--files-from", "--json", "--shard"}) {
        on->excludes(verb.get_option(other));
    }
    verb.add_option("--rest", watch.rest,
                    "A movie has arrived when its size and date did not change for so many seconds")
        ->check(WholeNumber(1, kMostSeconds))
        ->default_str("5")
        ->group(group)
        ->needs(on);
    verb.add_option("--poll", watch.poll,
                    "Look at the folders every so many seconds, instead of being told by the "
                    "system, which does not know what other machines do in a network's folders")
        ->check(WholeNumber(1, kMostSeconds))
        ->group(group)
        ->needs(on);
}

}  // namespace

void AddDescribe(CLI::App& app, const SessionOptions& session, int& status) {
    auto* const verb =
        app.add_subcommand("describe", "Describe movies as AAF: show the mob tree and save it");
    verb->footer(
        "Examples:\n"
        "  cliphost describe clip.mov --aaf clip.aaf\n"
        "  cliphost describe FOLDER --out-dir DIR --map /mnt/media=//server/media\n"
        "  cliphost describe FOLDER --bin BIN.aaf --stringout\n"
        "  cliphost describe FOLDER --columns-out LIST.csv -q   # fill it in, and then:\n"
        "  cliphost describe FOLDER --bin BIN.aaf --columns LIST.csv\n"
        "  cliphost describe FOLDER --out-dir DIR --recursive --extensions mov,mxf\n"
        "  cliphost describe --files-from LIST --out-dir DIR --skip-done --jsonl\n"
        "  cliphost describe --files-from LIST --out-dir DIR --shard 2/16\n"
        "  cliphost describe --watch FOLDER --recursive --out-dir DIR --skip-done\n"
        "  cliphost describe --watch /mnt/nas/in --poll 30 --out-dir DIR\n"
        "  cliphost describe FOLDER --against OLD.aaf   # what a new version changes\n\n"
        "--against compares as `cliphost compare` does; differences give status 1. Clips of movies "
        "that can't be\ndescribed are told as that, not as gone.\n" +
        std::string(kLeftOutOfComparison));
    auto options = std::make_shared<DescribeOptions>();
    auto pinned = std::make_shared<std::string>();
    auto* const aaf = AddPath(*verb, "--aaf", options->movies.file,
                              "Save the file of the only movie here; - for standard output");
    AddPath(*verb, "--out-dir", options->movies.outFolder, "Save every movie's file in this folder")
        ->excludes(aaf);
    auto* const bin =
        AddPath(*verb, "--bin", options->movies.together,
                "Save one file here with the clips of all movies; copies of a movie are "
                "one clip with several places")
            ->excludes(aaf)
            ->excludes("--out-dir");
    verb->add_flag("--stringout", options->stringout,
                   "Add a sequence to the bin, all clips end to end at the editor rate, for "
                   "programs that show sequences alone")
        ->needs(bin);
    AddForm(*verb, options->form, *pinned);
    auto* const against =
        AddPath(*verb, "--against", options->against,
                "Compare what is described with this AAF file, which an earlier call "
                "saved with --aaf or --bin, and tell in words what is other now")
            ->excludes(aaf)
            ->excludes("--out-dir");
    AddInputOptions(*verb, options->movies, *aaf);
    // The file is of all movies.
    verb->get_option("--shard")->excludes(against);
    // What was done before is not looked at, so that nothing is known of it.
    verb->get_option("--columns-out")->excludes("--skip-done");
    AddWorkerOptions(*verb, options->movies.workers);
    auto watch = std::make_shared<WatchOptions>();
    AddWatchOptions(*verb, *watch);
    AddDescribeForParent(app, session, status);
    verb->callback([&app, verb, &session, &status, options, pinned, watch] {
        NeedInputs(options->movies);
        options->form.json = options->form.json || options->form.lines;
        const auto work = [&] {
            if (!options->movies.file.empty() &&
                (options->movies.paths.size() != 1 ||
                 std::filesystem::is_directory(options->movies.paths[0]))) {
                throw Failure(kExitCaller, "--aaf", "it takes one movie",
                              "use --out-dir for several");
            }
            if (options->form.json && host::system::IsStandardOutput(options->movies.file)) {
                throw Failure(kExitCaller, "--aaf", "standard output takes the JSON",
                              "name a file");
            }
            if (options->form.json && host::system::IsStandardOutput(options->movies.together)) {
                throw Failure(kExitCaller, "--bin", "standard output takes the JSON",
                              "name a file");
            }
            if (host::system::IsStandardOutput(options->form.columnsOut)) {
                throw Failure(kExitCaller, "--columns-out",
                              options->form.json ? "standard output takes the JSON"
                                                 : "standard output takes what is told of movies",
                              "name a file");
            }
            options->form.columns.Read();
            options->editorRate = session.host.editorFrameRate.value_or(options->editorRate);
            if (app.get_config_ptr()->count() > 0) {
                options->settingsFile =
                    host::system::PathOfText(app.get_config_ptr()->as<std::string>());
            }
            TakeWorkerVerb(app, *verb, "describe-for-parent", session, options->movies.workers);
            if (!options->against.empty()) {
                options->form.quiet = true;
                options->movies.workers.arguments.emplace_back("--quiet");
            }
            Session running(WithTime(session, *pinned));
            if (watch->isOn) {
                status = kExitCaller;  // until a signal ends it
                WatchFolders(running, *options, *watch);
                status = kExitFine;
            } else {
                status = DescribeRun(running, *options).Run();
            }
        };
        if (options->form.lines) {
            AnswerFailureInLine(true, schema::kDescribe, work);
        } else {
            AnswerFailureToo(options->form.json, schema::kDescribe, nlohmann::ordered_json::array(),
                             work);
        }
    });
}

}  // namespace cliphost
