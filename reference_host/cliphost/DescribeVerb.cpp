// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "host_interfaces/quicktime/QuickTimeProperty.h"
#include "reference_host/cliphost/DescribeRun.h"
#include "reference_host/cliphost/JsonAnswer.h"
#include "reference_host/cliphost/MachinePath.h"
#include "reference_host/cliphost/PrivateFile.h"
#include "reference_host/cliphost/Verbs.h"
#include "reference_host/cliphost/WorkerOptions.h"
#include "reference_host/quicktime/MovieComponents.h"
#include "reference_host/system/OutputStream.h"

namespace cliphost {
namespace {

// What the child processes of this verb are started as.
constexpr char kWorkerVerb[] = "describe-for-parent";

std::vector<std::string> WorkerArguments(const CLI::App& app, const DescribeOptions& options,
                                         const std::string& pinned) {
    std::vector<std::string> arguments = GivenOptions(app);
    arguments.push_back(kWorkerVerb);
    if (options.form.json) {
        arguments.push_back("--json");
    }
    if (options.form.quiet) {
        arguments.push_back("--quiet");
    }
    if (!pinned.empty()) {
        arguments.push_back("--pin-time=" + pinned);
    }
    return arguments;
}

// One movie's answer, whatever happens to it.
MovieAnswer AnswerTo(Session& session, const std::filesystem::path& movie,
                     const DescriptionForm& form, const std::filesystem::path& file) {
    MovieAnswer answer;
    try {
        return AnswerOf(session, DescribeMovie(session, movie), form, [&] { return file; });
    } catch (const Failure& failure) {
        answer.status = failure.status();
        answer.problem = failure.problem();
    } catch (const host::MovieLibraryMissing& missing) {
        answer.status = kExitCaller;
        answer.problem = {movie, missing.what(), "install cliphost anew, with all its files"};
    } catch (const std::exception& error) {
        answer.status = kExitFile;
        answer.problem = {movie, error.what()};
    }
    return answer;
}

void AddDescribeForParent(CLI::App& app, const SessionOptions& session, int& status) {
    struct WorkerOptions {
        DescriptionForm form;
        std::string pinned;
        std::filesystem::path folder;
    };
    auto* const verb = app.add_subcommand(kWorkerVerb, "Describe movies for another cliphost");
    verb->group("");  // not for users
    auto options = std::make_shared<WorkerOptions>();
    verb->add_flag("--json", options->form.json);
    verb->add_flag("--quiet", options->form.quiet);
    verb->add_option("--pin-time", options->pinned);
    verb->add_option("--folder", options->folder);
    verb->callback([&session, &status, options] {
        SessionOptions withTime = session;
        withTime.pinTime = options->pinned;
        Session running(withTime);
        // Loads the multimedia library, which can't be done later.
        host::Ref<QuickTime::IQuickTimeProperty> property;
        running.host().Create(QuickTime::CompID_QuickTimeProperty, property);
        const auto answer = [&](std::uint64_t number, const std::string& movie) {
            return ToBytes(AnswerTo(running, movie, options->form,
                                    options->folder.empty()
                                        ? std::filesystem::path()
                                        : PrivateFile(options->folder, number)));
        };
        if (!ServeAsWorker(options->folder, answer)) {
            throw Failure(kExitCaller, kWorkerVerb, "only cliphost itself starts this",
                          "use `cliphost describe`");
        }
        status = kExitFine;
    });
}

}  // namespace

void AddDescribe(CLI::App& app, const SessionOptions& session, int& status) {
    auto* const verb =
        app.add_subcommand("describe", "Describe movies as AAF: show the mob tree and save it");
    verb->footer("Example: cliphost describe clip.mov --aaf clip.aaf");
    auto options = std::make_shared<DescribeOptions>();
    auto pinned = std::make_shared<std::string>();
    verb->add_option("paths", options->paths, "Movies and folders")->required();
    auto* const aaf = verb->add_option(
        "--aaf", options->aafFile, "Save the file of the only movie here; - for standard output");
    verb->add_option("--out-dir", options->outFolder, "Save every movie's file in this folder")
        ->excludes(aaf);
    verb->add_flag("--json", options->form.json, kJsonHelp);
    verb->add_flag("-q,--quiet", options->form.quiet, "Only a line for each movie");
    verb->add_option("--pin-time", *pinned,
                     "Time stamp of the saved files, such as 2026-01-31T12:00:00Z, so that the "
                     "same movie gives the same bytes");
    AddWorkerOptions(*verb, options->workers);
    verb->callback([&app, &session, &status, options, pinned] {
        AnswerFailureToo(options->form.json, nlohmann::ordered_json::array(), [&] {
            if (!options->aafFile.empty() &&
                (options->paths.size() != 1 || std::filesystem::is_directory(options->paths[0]))) {
                throw Failure(kExitCaller, "--aaf", "it takes one movie",
                              "use --out-dir for several");
            }
            if (options->form.json && host::system::IsStandardOutput(options->aafFile)) {
                throw Failure(kExitCaller, "--aaf", "standard output takes the JSON",
                              "name a file");
            }
            SessionOptions withTime = session;
            withTime.pinTime = *pinned;
            options->workers.program = session.program;
            options->workers.arguments = WorkerArguments(app, *options, *pinned);
            options->workers.verbosity = session.verbosity;
            Session running(withTime);
            status = DescribeRun(running, *options).Run();
        });
    });
    AddDescribeForParent(app, session, status);
}

}  // namespace cliphost
