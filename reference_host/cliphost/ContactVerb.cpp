// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include <fmt/format.h>

#include "reference_host/cliphost/InputOptions.h"
#include "reference_host/cliphost/JsonAnswer.h"
#include "reference_host/cliphost/OptionChecks.h"
#include "reference_host/cliphost/PathOption.h"
#include "reference_host/cliphost/SheetRun.h"
#include "reference_host/cliphost/Verbs.h"
#include "reference_host/cliphost/WorkerOptions.h"
#include "reference_host/cliphost/WorkerVerb.h"
#include "reference_host/system/OutputStream.h"
#include "reference_host/system/Paths.h"

namespace cliphost {
namespace {

// What both processes are told of a sheet.
void AddSheetForm(CLI::App& verb, SheetForm& form) {
    verb.add_option("--frames", form.frames, "How many frames")
        ->check(CLI::Range(1, 1000))
        ->capture_default_str();
    verb.add_option("--columns", form.columns, "Pictures in a row")
        ->check(CLI::Range(1, 100))
        ->capture_default_str();
    verb.add_option("--width", form.width, "Width of a picture, in pixels")
        ->check(CLI::Range(16, 2048))
        ->capture_default_str();
    verb.add_flag(
        "--exact", form.isExact,
        "Show the frames themselves. Without it each thumbnail is the nearest picture that "
        "is stored whole, so neighbours can be the same; only a movie of at most 250 "
        "frames that has few such pictures is decoded whole");
    form.turn.AddTo(verb);
    form.parameters.AddTo(verb);
}

void AddContactForParent(CLI::App& app, const SessionOptions& session, int& status) {
    const auto worker = std::make_shared<WorkerVerb>(WorkerVerb{"contact-for-parent", "contact"});
    const auto form = std::make_shared<SheetForm>();
    CLI::App* const verb = AddWorkerVerb(app, worker);
    AddSheetForm(*verb, *form);
    verb->callback([&session, &status, worker, form] {
        Session running(session);
        ServeMovies(running, *worker,
                    [&](const std::filesystem::path& movie, const PlaceOfFile& place) {
                        return MakeSheet(running, movie, *form, place);
                    });
        status = kExitFine;
    });
}

// What the command line says of the places for sheets.
void CheckPlaces(const MoviesOptions& movies, bool printsJson) {
    if (!movies.Saves()) {
        throw Failure(kExitCaller, "--output", "there is no place for the sheet",
                      "give -o FILE.png for one movie, or --out-dir FOLDER");
    }
    if (movies.file.empty()) {
        return;
    }
    if (movies.paths.size() != 1 || std::filesystem::is_directory(movies.paths[0])) {
        throw Failure(kExitCaller, "--output", "it takes one movie", "use --out-dir for several");
    }
    if (printsJson && host::system::IsStandardOutput(movies.file)) {
        throw Failure(kExitCaller, "--output", "standard output takes the JSON", "name a file");
    }
    RefuseOutputOntoMovie(movies.file, movies.paths[0]);
    const std::string ending = host::system::PathText(movies.file.extension());
    if (!ending.empty() && ending != ".png") {
        throw Failure(kExitCaller, movies.file,
                      fmt::format("a name that ends in '{}' can't be written", ending),
                      "give FILE.png, or - for standard output");
    }
}

}  // namespace

void AddContact(CLI::App& app, const SessionOptions& session, int& status) {
    auto* const verb =
        app.add_subcommand("contact", "Write contact sheets: thumbnails from the whole movie");
    verb->footer(
        "Examples:\n"
        "  cliphost contact clip.mov -o sheet.png\n"
        "  cliphost contact clip.mov --frames 30 --columns 6 --width 200 --exact -o sheet.png\n"
        "  cliphost contact FOLDER --out-dir sheets\n"
        "  cliphost contact FOLDER --out-dir sheets --recursive --extensions mov,mp4 "
        "--skip-done\n"
        "  cliphost contact --files-from LIST --out-dir sheets --jsonl\n\n"
        "With --use-alpha transparent parts show a checkerboard.");
    auto options = std::make_shared<SheetsOptions>();
    MoviesOptions& movies = options->movies;
    auto* const output = AddPath(*verb, "-o,--output", movies.file,
                                 "The PNG file of the only movie, or - for standard "
                                 "output");
    AddPath(*verb, "--out-dir", movies.outFolder, "Write every movie's sheet into this folder")
        ->excludes(output);
    AddSheetForm(*verb, options->form);
    verb->add_flag("--jsonl", options->lines, kMovieLinesHelp);
    AddInputOptions(*verb, movies, *output);
    AddWorkerOptions(*verb, movies.workers);
    AddContactForParent(app, session, status);
    verb->callback([&app, verb, &session, &status, options] {
        MoviesOptions& asked = options->movies;
        NeedInputs(asked);
        const auto work = [&] {
            CheckPlaces(asked, options->lines);
            options->form.showsProgress = asked.paths.size() == 1 && !asked.file.empty();
            TakeWorkerVerb(app, *verb, "contact-for-parent", session, asked.workers);
            Session running(session);
            status = SheetRun(running, *options).Run();
        };
        AnswerFailureInLine(options->lines, schema::kContactLine, work);
    });
}

}  // namespace cliphost
