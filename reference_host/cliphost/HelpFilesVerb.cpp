// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/cliphost/HelpWords.h"
#include "reference_host/cliphost/OutputFile.h"
#include "reference_host/cliphost/OutputFolder.h"
#include "reference_host/cliphost/PathOption.h"
#include "reference_host/cliphost/Verbs.h"

namespace cliphost {
namespace {

void WriteText(const std::filesystem::path& file, const std::string& text) {
    WriteWholeFile(file, {text.begin(), text.end()});
}

void WriteHelpFiles(const CLI::App& program, const std::filesystem::path& folder) {
    const std::vector<HelpVerb> verbs = HelpOf(program);
    const OutputFolder made(folder);
    for (std::size_t i = 0; i < verbs.size(); ++i) {
        const std::string name = verbs[i].name.empty() ? "cliphost" : "cliphost-" + verbs[i].name;
        WriteText(folder / (name + ".1"), ManPage(verbs, i));
    }
    WriteText(folder / "cliphost.bash", BashCompletion(verbs));
    WriteText(folder / "_cliphost", ZshCompletion(verbs));
    WriteText(folder / "cliphost.fish", FishCompletion(verbs));
}

}  // namespace

void AddHelpFiles(CLI::App& app) {
    auto* const verb = app.add_subcommand(
        "help-files", "Write the manual pages and the completions of shells into a folder");
    verb->group("");  // for packages
    auto folder = std::make_shared<std::filesystem::path>();
    AddPath(*verb, "folder", *folder, "The folder")->required();
    verb->callback([&app, folder] { WriteHelpFiles(app, *folder); });
}

}  // namespace cliphost
