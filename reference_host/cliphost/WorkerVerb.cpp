// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/WorkerVerb.h"

#include "host_interfaces/quicktime/QuickTimeProperty.h"
#include "reference_host/cliphost/PrivateFile.h"
#include "reference_host/cliphost/Workers.h"
#include "reference_host/quicktime/MovieComponents.h"
#include "reference_host/system/Paths.h"

namespace cliphost {
namespace {

MovieAnswer Failed(int status, Problem problem) {
    MovieAnswer answer;
    answer.status = status;
    answer.problem = std::move(problem);
    return answer;
}

}  // namespace

MovieAnswer AnswerOfMovie(const std::filesystem::path& movie,
                          const std::function<MovieAnswer()>& answer) {
    try {
        return answer();
    } catch (const ReaderGone&) {
        throw;
    } catch (const host::MovieLibraryMissing&) {
        throw;
    } catch (const Failure& failure) {
        return Failed(failure.status(), failure.problem());
    } catch (const std::filesystem::filesystem_error& error) {
        // Most often a file that is not the movie, such as the folder of an output.
        Problem problem{error.path1().empty() ? movie : error.path1(),
                        error.code().default_error_condition().message()};
        const int status = StatusOf(problem);
        return Failed(status, std::move(problem));
    } catch (const std::exception& error) {
        return Failed(kExitFile, {movie, error.what()});
    }
}

MovieAnswer AnswerSafely(const std::filesystem::path& movie,
                         const std::function<MovieAnswer()>& answer) {
    try {
        return AnswerOfMovie(movie, answer);
    } catch (const host::MovieLibraryMissing& missing) {
        return Failed(kExitCaller,
                      {movie, missing.what(), "install cliphost anew, with all its files"});
    }
}

CLI::App* AddWorkerVerb(CLI::App& app, const std::shared_ptr<WorkerVerb>& worker) {
    CLI::App* const verb = app.add_subcommand(worker->name, "Work for another cliphost");
    verb->group("");  // not for users
    // Lives as long as the verb.
    verb->add_option_function<std::string>("--folder", [worker](const std::string& folder) {
        worker->folder = host::system::PathOfText(folder);
    });
    return verb;
}

void Serve(Session& session, const WorkerVerb& worker,
           const std::function<std::string(std::uint64_t, const std::string&)>& answer) {
    // Loads the multimedia library, which can't be done later.
    host::Ref<QuickTime::IQuickTimeProperty> property;
    session.host().Create(QuickTime::CompID_QuickTimeProperty, property);
    if (!ServeAsWorker(worker.folder, answer)) {
        throw Failure(kExitCaller, worker.name, "only cliphost itself starts this",
                      "use `cliphost " + worker.users + "`");
    }
}

void ServeMovies(Session& session, const WorkerVerb& worker, const AnswerToMovie& answer) {
    Serve(session, worker, [&](std::uint64_t number, const std::string& text) {
        const std::filesystem::path movie = host::system::PathOfText(text);
        const PlaceOfFile place = [&] {
            return worker.folder.empty() ? std::filesystem::path()
                                         : PrivateFile(worker.folder, number);
        };
        return ToBytes(AnswerSafely(movie, [&] { return answer(movie, place); }));
    });
}

}  // namespace cliphost
