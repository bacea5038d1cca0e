// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include <fmt/format.h>

#include "reference_host/cliphost/AafTree.h"
#include "reference_host/cliphost/JsonAnswer.h"
#include "reference_host/cliphost/JsonText.h"
#include "reference_host/cliphost/MachinePath.h"
#include "reference_host/cliphost/PathOption.h"
#include "reference_host/cliphost/Verbs.h"

namespace cliphost {
namespace {

constexpr int kLevelOfTree = 1;  // in the answer

// A tree may be large, so it isn't made into another value first.
void PrintTreeAsJson(const std::filesystem::path& file, const TreeNode& tree) {
    std::string text =
        fmt::format("{{\n  \"{}\": \"{}\",\n  \"aaf\": ", schema::kMember, schema::kDump);
    AppendJsonText(MachinePath(file), text);
    text += ",\n  \"description\": " + ToJson(tree, kLevelOfTree) + "\n}\n";
    fmt::print("{}", text);
}

}  // namespace

void AddDump(CLI::App& app, const SessionOptions& options) {
    auto* const verb =
        app.add_subcommand("dump", "Show the mob tree of an AAF file, whoever made it");
    verb->footer(
        "Examples:\n"
        "  cliphost dump clip.aaf\n"
        "  cliphost dump clip.aaf --json");
    auto file = std::make_shared<std::filesystem::path>();
    auto json = std::make_shared<bool>(false);
    AddPath(*verb, "file", *file, "The AAF file")->required();
    verb->add_flag("--json", *json, kJsonHelp);
    verb->callback([&options, file, json] {
        AnswerFailureToo(*json, schema::kDump, {{"aaf", MachinePath(*file)}}, [&] {
            const std::unique_ptr<AafLibrary> library = LoadAafLibrary(options);
            const TreeNode tree = ReadTree(library->Open(*file).get());
            if (*json) {
                PrintTreeAsJson(*file, tree);
            } else {
                fmt::print("{}", ToReadableText(tree));
            }
        });
    });
}

}  // namespace cliphost
