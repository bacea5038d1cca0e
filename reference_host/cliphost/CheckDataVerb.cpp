// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include <fmt/format.h>

#include "reference_host/cliphost/FileAccess.h"
#include "reference_host/cliphost/JsonAnswer.h"
#include "reference_host/cliphost/MachinePath.h"
#include "reference_host/cliphost/PathOption.h"
#include "reference_host/cliphost/Verbs.h"
#include "reference_host/cliphost/Words.h"
#include "reference_host/data_check/DataCheck.h"
#include "reference_host/framework/HostPath.h"
#include "reference_host/system/Paths.h"
#include "reference_host/util/text/Printable.h"

namespace cliphost {
namespace {

using data_check::CheckedData;
using data_check::Finding;
using nlohmann::ordered_json;

struct CheckDataOptions {
    std::filesystem::path folder;
    bool json = false;
};

std::filesystem::path FileOf(const std::filesystem::path& folder, std::size_t number) {
    return folder / data_check::kDataFileNames[number];
}

ordered_json ToJson(const Finding& finding, const std::filesystem::path& folder) {
    return {{"file", MachinePath(FileOf(folder, static_cast<std::size_t>(finding.file)))},
            {"line", finding.place.line},
            {"column", finding.place.column},
            {"reason", finding.what},
            {"hint", finding.hint}};
}

ordered_json ToJson(const data_check::DataCounts& counts) {
    return {{"rows", counts.rows},
            {"codes", counts.codes},
            {"records", counts.records},
            {"ids", counts.ids},
            {"findings", counts.findings}};
}

// What could not be read is the caller's: nothing is said of it.
int TellUnreadable(const CheckedData& checked, const std::filesystem::path& folder,
                   ordered_json& unreadable, int verbosity) {
    int status = kExitFine;
    for (std::size_t number = 0; number < std::size(checked.unreadable); ++number) {
        const std::filesystem::path file = FileOf(folder, number);
        if (checked.unreadable[number].empty()) {
            continue;
        }
        Problem problem = WhyUnreadable(file);
        if (!problem) {
            problem = {file, checked.unreadable[number]};
        }
        problem.hint = "give a folder that has the module's two data files";
        TellProblem(problem, verbosity);
        ordered_json entry = {{"file", MachinePath(file)}};
        AddProblem(problem, entry);
        unreadable.push_back(std::move(entry));
        status = kExitCaller;
    }
    return status;
}

void PrintFindings(const CheckedData& checked, const std::filesystem::path& folder) {
    for (const Finding& finding : checked.findings) {
        const std::filesystem::path file = FileOf(folder, static_cast<std::size_t>(finding.file));
        fmt::print("{}:{}:{}: {}\n", host::DisplayPath(file), finding.place.line,
                   finding.place.column, host::text::Printable(finding.what + "; " + finding.hint));
    }
    const data_check::DataCounts& counts = checked.counts;
    if (counts.findings > checked.findings.size()) {
        fmt::print("... and {} more\n", counts.findings - checked.findings.size());
    }
    fmt::print("{}: {} of {}, {} of {}\n", Counted(counts.findings, "finding"),
               Counted(counts.rows, "row"), Counted(counts.codes, "code"),
               Counted(counts.records, "record"), Counted(counts.ids, "id"));
}

int CheckDataFiles(const std::filesystem::path& folder, bool json, int verbosity) {
    if (Problem problem = WhyUnlistable(folder)) {
        throw Failure(kExitCaller, std::move(problem));
    }
    const CheckedData checked = data_check::CheckData(folder);
    ordered_json unreadable = ordered_json::array();
    const int status = std::max(TellUnreadable(checked, folder, unreadable, verbosity),
                                checked.counts.findings > 0 ? kExitFile : kExitFine);
    if (!json) {
        if (unreadable.size() < std::size(checked.unreadable)) {
            PrintFindings(checked, folder);
        }
        return status;
    }
    ordered_json findings = ordered_json::array();
    for (const Finding& finding : checked.findings) {
        findings.push_back(ToJson(finding, folder));
    }
    PrintJson(schema::kCheckData, {{"folder", MachinePath(folder)},
                                   {"findings", std::move(findings)},
                                   {"unreadable", std::move(unreadable)},
                                   {"counts", ToJson(checked.counts)}});
    return status;
}

}  // namespace

void AddCheckData(CLI::App& app, const SessionOptions& session, int& status) {
    auto* const verb = app.add_subcommand(
        "check-data",
        "Look for mistakes in the module's two data files, such as in rows that you "
        "added");
    verb->footer(
        "Examples:\n"
        "  cliphost check-data                       # the files that are in use\n"
        "  cliphost check-data ~/plugins             # those beside a copy of the module\n"
        "  cliphost --plugin ~/plugins/QuickTimePlugin.nvx check-data\n"
        "  cliphost check-data ~/plugins --json\n\n"
        "Each line names file, line and column, the mistake and what helps. The page "
        "adding_a_codec.md tells what the files mean.\n\n"
        "Exit status: 0, nothing was found; 1, the files have mistakes; 2, the folder or a file "
        "can't be read.");
    auto options = std::make_shared<CheckDataOptions>();
    AddPath(*verb, "folder", options->folder,
            "The folder of FourCharMapper.xml and AAFInfo.xml; the module's own without "
            "it");
    verb->add_flag("--json", options->json, kJsonHelp);
    verb->callback([&session, &status, options] {
        const std::filesystem::path folder =
            options->folder.empty() ? host::system::WholePath(ModuleFile(session)).parent_path()
                                    : options->folder;
        AnswerFailureToo(options->json, schema::kCheckData, {{"folder", MachinePath(folder)}}, [&] {
            status = CheckDataFiles(folder, options->json, session.verbosity);
        });
    });
}

}  // namespace cliphost
