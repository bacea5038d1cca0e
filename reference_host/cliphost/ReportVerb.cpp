// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/InputOptions.h"
#include "reference_host/cliphost/JsonAnswer.h"
#include "reference_host/cliphost/MachinePath.h"
#include "reference_host/cliphost/MapOption.h"
#include "reference_host/cliphost/PathOption.h"
#include "reference_host/cliphost/ReportClip.h"
#include "reference_host/cliphost/ReportRun.h"
#include "reference_host/cliphost/Verbs.h"
#include "reference_host/cliphost/WorkerOptions.h"
#include "reference_host/cliphost/WorkerVerb.h"
#include "reference_host/system/OutputStream.h"

namespace cliphost {
namespace {

// What both processes are told.
void AddForm(CLI::App& verb, PathMaps& maps) {
    AddMapOption(
        verb, maps,
        "FROM=TO, for another machine that reads the report: movies in the folder FROM are "
        "told to lie in TO instead, which is a folder, a drive (M:) or a share "
        "(//server/share); may be given several times, and the longest FROM counts");
}

void AddReportForParent(CLI::App& app, const SessionOptions& session, int& status) {
    const auto worker = std::make_shared<WorkerVerb>(WorkerVerb{"report-for-parent", "report"});
    const auto maps = std::make_shared<PathMaps>();
    CLI::App* const verb = AddWorkerVerb(app, worker);
    AddForm(*verb, *maps);
    verb->callback([&session, &status, worker, maps] {
        Session running(session);
        CodecReader codecs(running);
        ServeMovies(running, *worker, [&](const std::filesystem::path& movie, const PlaceOfFile&) {
            return ReportAnswer(running, codecs, *maps, movie);
        });
        status = kExitFine;
    });
}

}  // namespace

void AddReport(CLI::App& app, const SessionOptions& session, int& status) {
    auto* const verb = app.add_subcommand(
        "report", "Write a page for browsers that shows movies and what is odd about them");
    verb->footer(
        "Examples:\n"
        "  cliphost report FOLDER -o report.html\n"
        "  cliphost report FOLDER -o report.html --recursive --extensions mov,mp4,mxf\n"
        "  cliphost report clips.sqlite -o report.html\n"
        "  cliphost report --files-from LIST -o report.html --split\n"
        "  cliphost report FOLDER --json > report.json\n\n"
        "The page holds all that it shows, so it can be sent or archived as it is, and asks no "
        "network for\nanything. A path on the command line may be a catalog, which stands for the "
        "movies in it; what it\nknows of a movie that can't be read is shown. A list names movies "
        "and folders, and no catalogs. A\nmovie that can't be described is in the page too, with "
        "the reason.");
    auto options = std::make_shared<ReportOptions>();
    auto* const output = AddPath(*verb, "-o,--output", options->movies.together,
                                 "The page, such as report.html, or - for standard output");
    auto* const json = verb->add_flag("--json", options->json,
                                      "Print what the page is made of instead, as JSON; pictures "
                                      "are WebP in base64. A path that is not UTF-8 is given as a "
                                      "file URL")
                           ->excludes(output);
    verb->add_flag("--split", options->isSplit,
                   "Put the pictures into a folder beside the page, called as the page with _files "
                   "behind its name: for more than some 1,000 movies")
        ->excludes(json);
    verb->add_option("--title", options->title,
                     "The title of the page; without it, the folder's name");
    AddForm(*verb, options->maps);
    AddInputOptions(*verb, options->movies);
    AddWorkerOptions(*verb, options->movies.workers);
    AddReportForParent(app, session, status);
    verb->callback([&app, verb, &session, &status, options] {
        NeedInputs(options->movies);
        AnswerFailureToo(options->json, schema::kReport, nlohmann::ordered_json::object(), [&] {
            const std::filesystem::path& page = options->movies.together;
            if (!options->json && page.empty()) {
                throw Failure(kExitCaller, "--output", "there is no place for the page",
                              "give -o FILE.html, or --json");
            }
            if (options->isSplit && OutputFile::IsDevice(page)) {
                throw Failure(kExitCaller, "--split", "a folder needs a page in a file beside it",
                              "give -o FILE.html");
            }
            TakeCatalogs(*options);
            TakeWorkerVerb(app, *verb, "report-for-parent", session, options->movies.workers);
            Session running(session);
            status = ReportRun(running, *options).Run();
        });
    });
}

}  // namespace cliphost
