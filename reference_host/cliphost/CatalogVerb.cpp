// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/cliphost/CatalogRun.h"
#include "reference_host/cliphost/ColumnsOption.h"
#include "reference_host/cliphost/InputOptions.h"
#include "reference_host/cliphost/JsonAnswer.h"
#include "reference_host/cliphost/PathOption.h"
#include "reference_host/cliphost/Verbs.h"
#include "reference_host/cliphost/WorkerOptions.h"
#include "reference_host/cliphost/WorkerVerb.h"

namespace cliphost {
namespace {

// What both processes are told.
void AddForm(CLI::App& verb, CatalogForm& form) {
    verb.add_flag("--thumbnails", form.thumbnails,
                  "Keep a small picture of each movie, as PNG, from its middle");
    AddColumnsOption(verb, form.columns);
}

void AddCatalogForParent(CLI::App& app, const SessionOptions& session, int& status) {
    const auto worker = std::make_shared<WorkerVerb>(WorkerVerb{"catalog-for-parent", "catalog"});
    const auto form = std::make_shared<CatalogForm>();
    CLI::App* const verb = AddWorkerVerb(app, worker);
    AddForm(*verb, *form);
    verb->callback([&session, &status, worker, form] {
        form->columns.Read();
        Session running(session);
        CodecReader codecs(running);
        ServeMovies(running, *worker, [&](const std::filesystem::path& movie, const PlaceOfFile&) {
            return CatalogAnswer(running, codecs, *form, DescribeMovie(running, movie));
        });
        status = kExitFine;
    });
}

}  // namespace

void AddCatalog(CLI::App& app, const SessionOptions& session, int& status) {
    auto* const verb = app.add_subcommand(
        "catalog", "Write an SQLite file of what movies are, for `cliphost find` and for SQL");
    verb->footer(
        "Examples:\n"
        "  cliphost catalog FOLDER -o clips.sqlite\n"
        "  cliphost catalog FOLDER -o clips.sqlite --recursive --extensions mov,mxf --update\n"
        "  cliphost catalog FOLDER -o clips.sqlite --thumbnails\n"
        "  cliphost catalog FOLDER -o clips.sqlite --columns LIST.csv   # with reels from a table\n"
        "  cliphost catalog --files-from LIST -o part2.sqlite --shard 2/16 --update\n"
        "  cliphost catalog --files-from LIST -o clips.sqlite --jsonl\n"
        "  cliphost catalog --merge part1.sqlite part2.sqlite -o clips.sqlite\n\n"
        "Without --update, a catalog that is there is replaced. A movie that can't be described is "
        "in the\ncatalog too, with the reason.");
    auto options = std::make_shared<CatalogOptions>();
    auto isMerge = std::make_shared<bool>(false);
    AddPath(*verb, "-o,--output", options->movies.together, "The catalog")->required();
    auto* const update =
        verb->add_flag("--update", options->update,
                       "Read only movies that are new or have changed, or that failed before; "
                       "remove those that are gone from where this call looks");
    auto* const merge = verb->add_flag("--merge", *isMerge,
                                       "The paths are catalogs: make one of them all. Of a movie "
                                       "that several have, the one that was read last counts");
    merge->excludes(update);
    AddForm(*verb, options->form);
    verb->add_flag("--jsonl", options->lines, kMovieLinesHelp);
    AddInputOptions(*verb, options->movies);
    AddWorkerOptions(*verb, options->movies.workers);
    // It reads no movie.
    for (const char* const other :
         {"--thumbnails", "--columns", "--jsonl", "--files-from", "--recursive", "--extensions",
          "--shard", "--jobs", "--limit-seconds", "--limit-memory"}) {
        merge->excludes(other);
    }
    AddCatalogForParent(app, session, status);
    verb->callback([&app, verb, &session, &status, options, isMerge] {
        NeedInputs(options->movies);
        if (*isMerge) {
            status =
                MergeCatalogs(options->movies.paths, options->movies.together, session.verbosity);
            return;
        }
        AnswerFailureInLine(options->lines, schema::kCatalogLine, [&] {
            options->form.columns.Read();
            TakeWorkerVerb(app, *verb, "catalog-for-parent", session, options->movies.workers);
            Session running(session);
            status = WithCatalog(options->movies.together,
                                 [&] { return CatalogRun(running, *options).Run(); });
        });
    });
}

}  // namespace cliphost
