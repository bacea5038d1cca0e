// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include <fmt/format.h>

#include <algorithm>
#include <cctype>
#include <cerrno>
#include <map>
#include <memory>
#include <random>
#include <string>
#include <system_error>

#include "reference_host/cliphost/FileAccess.h"
#include "reference_host/cliphost/JsonAnswer.h"
#include "reference_host/cliphost/MachinePath.h"
#include "reference_host/cliphost/OptionChecks.h"
#include "reference_host/cliphost/PathOption.h"
#include "reference_host/cliphost/ValidateRun.h"
#include "reference_host/cliphost/Verbs.h"
#include "reference_host/cliphost/Words.h"
#include "reference_host/cliphost/WorkerOptions.h"
#include "reference_host/system/OutputStream.h"
#include "reference_host/system/Paths.h"
#include "reference_host/util/text/Printable.h"

namespace cliphost {
namespace {

using nlohmann::ordered_json;
using validate::Check;
using validate::Outcome;
using validate::Verdict;

constexpr char kWorker[] = "validate-for-parent";
constexpr unsigned kUsualSeconds = 120;
constexpr unsigned kUsualMebibytes = 4096;

struct ValidateOptions {
    ValidateCall call;
    std::vector<std::string> only;
    bool json = false;
    bool list = false;
    bool isInProcess = false;
};

const WorkerWords kManyChecks = {
    "Processes", "How many checks are done at the same time, each in a process of its own",
    "Give a check up that takes longer than so many seconds; 120 unless given",
    "Give a check up that needs more resident memory than so many MiB; 4096 unless given"};

std::vector<const Check*> ChosenChecks(const std::vector<std::string>& ids) {
    std::vector<const Check*> chosen;
    for (const std::string& id : ids) {
        const Check* const check = validate::FindCheck(id.c_str());
        if (check == nullptr) {
            throw Failure(kExitCaller, host::system::PathOfText("--only " + id),
                          "there is no such check", "cliphost validate --list names all of them");
        }
        chosen.push_back(check);
    }
    if (ids.empty()) {
        for (const Check& check : validate::AllChecks()) {
            chosen.push_back(&check);
        }
    }
    return chosen;
}

// A path as a shell takes it.
std::string ShellWord(const std::filesystem::path& path) {
    const std::string text = MachinePath(path);
    const bool isPlain = std::all_of(text.begin(), text.end(), [](unsigned char c) {
        return std::isalnum(c) != 0 ||
               std::string_view("/._-+,:@%").find(static_cast<char>(c)) != std::string_view::npos;
    });
    std::string word;
    for (const char c : text) {
        word += c == '\'' ? std::string("'\\''") : std::string(1, c);
    }
    return isPlain ? text : "'" + word + "'";
}

std::string LineToRunAgain(const ValidateCall& call, const Check& check) {
    std::string line =
        fmt::format("cliphost validate {} --only {}", ShellWord(call.module), check.id);
    const auto add = [&](bool isNeeded, const char* option, std::uint64_t value) {
        line += isNeeded ? fmt::format(" {} {}", option, value) : "";
    };
    const WorkerLimits& limits = call.worker.limits;
    add(check.takesSeed, "--seed", call.seed);
    add(limits.seconds != kUsualSeconds, "--limit-seconds", limits.seconds);
    add(limits.mebibytes != kUsualMebibytes, "--limit-memory", limits.mebibytes);
    return line;
}

// A verdict as programs read it.
const char* MachineWordOf(Verdict verdict) {
    return verdict == Verdict::kTimedOut ? "timedOut" : WordOf(verdict);
}

ordered_json TextOrNull(const std::string& text) {
    return text.empty() ? ordered_json() : ordered_json(text);
}

ordered_json ToJson(const ValidateCall& call, const Check& check, const Outcome& outcome) {
    return {{"id", check.id},
            {"text", check.text},
            {"verdict", MachineWordOf(outcome.verdict)},
            {"done", TextOrNull(outcome.done)},
            {"expected", TextOrNull(outcome.expected)},
            {"found", TextOrNull(outcome.found)},
            {"cause", TextOrNull(outcome.cause)},
            {"again", LineToRunAgain(call, check)}};
}

std::string ToText(const ValidateCall& call, const Check& check, const Outcome& outcome) {
    std::string text = fmt::format("{:<10} {}\n", WordOf(outcome.verdict), check.id);
    const auto add = [&](const char* title, const std::string& line) {
        text += line.empty() ? "" : fmt::format("           {:<9} {}\n", title, line);
    };
    if (outcome.verdict == Verdict::kSkipped) {
        add("because", outcome.found);
    } else if (outcome.verdict != Verdict::kPassed) {
        add("relied on", check.text);
        add("done", outcome.done);
        add("expected", outcome.expected);
        add("found", outcome.found);
        add("cause", outcome.cause.empty() ? "" : "most likely, " + outcome.cause);
        add("again", LineToRunAgain(call, check));
    }
    return host::text::PrintableLines(text);
}

// What was counted, by verdict.
class Tally {
public:
    void Add(Verdict verdict) {
        ++counts_[verdict];
        hasFault_ = hasFault_ || IsFault(verdict);
    }
    bool HasFault() const { return hasFault_; }
    // A run in which nothing was found, since nothing was looked at.
    bool IsOfSkippedAlone() const { return counts_.size() == 1 && Count(Verdict::kSkipped) > 0; }
    // "84 checks: 80 passed, 1 failed, ..."
    std::string Line() const {
        std::uint64_t all = 0;
        std::string parts;
        for (const Verdict verdict : validate::kAllVerdicts) {
            all += Count(verdict);
            parts +=
                fmt::format("{}{} {}", parts.empty() ? "" : ", ", Count(verdict), WordOf(verdict));
        }
        return fmt::format("{}: {}", Counted(all, "check"), parts);
    }
    ordered_json ToJson() const {
        ordered_json json;
        for (const Verdict verdict : validate::kAllVerdicts) {
            json[MachineWordOf(verdict)] = Count(verdict);
        }
        return json;
    }

private:
    std::uint64_t Count(Verdict verdict) const {
        const auto found = counts_.find(verdict);
        return found == counts_.end() ? 0 : found->second;
    }

    std::map<Verdict, std::uint64_t> counts_;
    bool hasFault_ = false;
};

void PrintList(const std::vector<const Check*>& checks, bool asJson) {
    ordered_json list = ordered_json::array();
    for (const Check* const check : checks) {
        if (asJson) {
            list.push_back({{"id", check->id}, {"text", check->text}});
        } else {
            fmt::print("{}\n    {}\n", check->id, check->text);
        }
    }
    if (asJson) {
        PrintJson(schema::kValidate, {{"checks", std::move(list)}});
    } else {
        fmt::print("{}\n", Counted(checks.size(), "check"));
    }
}

// Who reads what is printed may go away.
void FlushAnswer() {
    if (std::fflush(stdout) != 0) {
        if (const int error = host::system::StandardOutputError(errno); error != EPIPE) {
            throw std::system_error(error, std::generic_category(), "standard output");
        }
    }
}

void RefuseModulePath(const std::filesystem::path& module) {
    if (module.empty()) {
        throw Failure(kExitCaller, "validate", "no module is given",
                      "name its file: cliphost validate MODULE.nvx");
    }
    if (Problem problem = WhyUnreadable(module); problem && StatusOf(problem) == kExitCaller) {
        throw Failure(kExitCaller, std::move(problem));
    }
    if (host::system::HoldsBackslash(host::system::WholePath(module))) {
        throw Failure(kExitCaller, BackslashProblem(module));
    }
}

int Validate(ValidateOptions& options, const SessionOptions& session) {
    ValidateCall& call = options.call;
    RefuseModulePath(call.module);
    const auto library = LoadAafLibrary(session);  // fails here, not in each process
    Tally tally;
    ordered_json outcomes = ordered_json::array();
    const auto take = [&](const Check& check, const Outcome& outcome) {
        tally.Add(outcome.verdict);
        if (options.json) {
            outcomes.push_back(ToJson(call, check, outcome));
        } else {
            fmt::print("{}", ToText(call, check, outcome));
            FlushAnswer();
        }
    };
    if (!options.json) {
        fmt::print("seed {}\n", call.seed);
    }
    if (options.isInProcess) {
        ValidateHere(call, take);
    } else {
        ValidateInChildren(call, take);
    }
    if (options.json) {
        PrintJson(schema::kValidate, {{"module", MachinePath(call.module)},
                                      {"seed", call.seed},
                                      {"checks", std::move(outcomes)},
                                      {"counts", tally.ToJson()}});
    } else {
        fmt::print("{}\n", tally.Line());
    }
    FlushAnswer();
    if (tally.IsOfSkippedAlone()) {
        TellProblem({call.module, "nothing was checked: all checks were skipped, and say why",
                     "give a module that has what they are about, or leave --only out"},
                    session.verbosity);
        return kExitCaller;
    }
    return tally.HasFault() ? kExitFile : kExitFine;
}

void AddValidateForParent(CLI::App& app, const SessionOptions& session, int& status) {
    CLI::App* const verb = app.add_subcommand(kWorker, "Work for another cliphost");
    verb->group("");  // not for users
    struct ForParent {
        ValidateCall call;
        std::string check;
        std::filesystem::path folder;
    };
    const auto work = std::make_shared<ForParent>();
    AddPath(*verb, "--of-module", work->call.module)->required();
    verb->add_option("--check", work->check)->required();
    verb->add_option("--use-seed", work->call.seed)->required();
    AddPath(*verb, "--folder", work->folder)->required();
    verb->callback([&session, &status, work] {
        work->call.checks = ChosenChecks({work->check});
        const auto library = LoadAafLibrary(session);
        if (!ValidateForParent(work->call, work->folder)) {
            throw Failure(kExitCaller, kWorker, "only cliphost itself starts this",
                          "use `cliphost validate`");
        }
        status = kExitFine;
    });
}

}  // namespace

void AddValidate(CLI::App& app, const SessionOptions& session, int& status) {
    auto* const verb = app.add_subcommand(
        "validate", "Hold a module file against what a host relies on, check by check");
    verb->footer(
        "Examples:\n"
        "  cliphost validate MODULE.nvx\n"
        "  cliphost validate MODULE.nvx --only query-symmetric\n"
        "  cliphost validate MODULE.nvx --json\n"
        "  cliphost validate --list\n"
        "  gdb --args cliphost validate MODULE.nvx --only fuzz-calls --seed 7 --in-process\n\n"
        "Each check is done in a process of its own, which a crash ends and nothing else. A module "
        "may have any components:\nchecks of volumes and containers are skipped where it has "
        "none. The movies that a module is given are made for\nthe check.\n\n"
        "Exit status: 0, nothing is wrong, though there may be warnings; 1, a check failed, "
        "crashed or timed out; 2, the call\nis at fault, or all checks were skipped, so that "
        "nothing is known.");
    const auto options = std::make_shared<ValidateOptions>();
    options->call.worker.limits = {kUsualSeconds, kUsualMebibytes};
    options->call.seed = std::random_device()();
    AddPath(*verb, "module", options->call.module, "The module file");
    verb->add_option("--only", options->only, "Do this check alone; may be given several times")
        ->expected(1)
        ->multi_option_policy(CLI::MultiOptionPolicy::TakeAll);
    verb->add_flag("--list", options->list, "Tell what is checked, and check nothing");
    verb->add_option("--seed", options->call.seed,
                     "What random checks begin with; the same seed does the same again")
        ->check(WholeNumber());
    verb->add_flag("--in-process", options->isInProcess,
                   "Do the checks in this process, for a debugger; a crash ends the program");
    verb->add_flag("--json", options->json, kJsonHelp);
    AddWorkerOptions(*verb, options->call.worker, kManyChecks);
    AddValidateForParent(app, session, status);
    verb->callback([&app, verb, &session, &status, options] {
        TakeWorkerVerb(app, *verb, kWorker, session, options->call.worker);
        AnswerFailureToo(options->json, schema::kValidate,
                         options->call.module.empty()
                             ? ordered_json::object()
                             : ordered_json{{"module", MachinePath(options->call.module)}},
                         [&] {
                             options->call.checks = ChosenChecks(options->only);
                             if (options->list) {
                                 PrintList(options->call.checks, options->json);
                             } else {
                                 status = Validate(*options, session);
                             }
                         });
    });
}

}  // namespace cliphost
