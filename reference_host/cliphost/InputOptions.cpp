// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/InputOptions.h"

#include "reference_host/cliphost/FolderTree.h"
#include "reference_host/cliphost/PathOption.h"

namespace cliphost {
namespace {

constexpr char kGroup[] = "Which movies";

}  // namespace

CLI::Option* AddInputOptions(CLI::App& verb, MoviesOptions& movies) {
    AddPaths(verb, "paths", movies.paths, "Movies and folders");
    auto* const list = AddPath(verb, "--files-from", movies.list,
                               "Also the movies and folders of a list, a path in each "
                               "line; - for standard input")
                           ->group(kGroup);
    verb.add_flag_callback(
            "-0,--null", [&movies] { movies.listForm = ListForm::Nulls; },
            "The paths of the list end with a byte of zero, as after find -print0, so that a "
            "name may have a line end in it")
        ->needs(list)
        ->group(kGroup);
    verb.add_flag("--recursive", movies.isRecursive,
                  "Also the movies of all folders within the folders, hidden ones too")
        ->group(kGroup);
    verb.add_option_function<std::string>(
            "--extensions",
            [&movies](const std::string& text) { movies.endings = EndingsIn(text); },
            "Out of folders take the movies whose names end so, such as mov,mp4,mxf in any case. "
            "Without it the module lists a folder, and it lists *.mov alone")
        ->group(kGroup);
    verb.add_option_function<std::string>(
            "--shard", [&movies](const std::string& text) { movies.shard = Shard(text); },
            "I/N: of all movies only the I-th share of N, for one of N machines. A movie's share "
            "depends on its path alone")
        ->group(kGroup);
    return list;
}

void AddInputOptions(CLI::App& verb, MoviesOptions& movies, CLI::Option& file) {
    AddInputOptions(verb, movies)->excludes(&file);
    verb.add_flag("--skip-done", movies.skipDone,
                  "Leave out movies whose output is in --out-dir already, made of the same movie "
                  "with the same options and version; so a run that was stopped goes on")
        ->needs(verb.get_option("--out-dir"))
        ->group(kGroup);
}

void NeedInputs(const MoviesOptions& movies) {
    if (movies.paths.empty() && movies.list.empty()) {
        throw CLI::RequiredError("paths or --files-from");
    }
}

}  // namespace cliphost
