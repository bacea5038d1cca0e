// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/validate/Trial.h"

#include <exception>
#include <utility>

#include "reference_host/framework/HostPath.h"

namespace validate {
namespace {

struct Ended {
    Verdict verdict;
    std::string expected;
    std::string found;
    std::string cause;
};

}  // namespace

std::unique_ptr<host::Host> Trial::NewHost() const {
    auto made = std::make_unique<host::Host>();
    made->console().SetSink([](ncfUInt32, const std::string&) {});
    if (options_.addServices) {
        options_.addServices(*made);
    }
    return made;
}

void Trial::Doing(std::string step) {
    step_ = with_.empty() ? std::move(step) : with_ + ": " + step;
    tell_(step_);
}

std::optional<std::string> Trial::Part(const std::function<void()>& part) const {
    try {
        part();
    } catch (const Ended& ended) {
        if (ended.verdict != Verdict::kSkipped) {
            throw;
        }
        return ended.found;
    }
    return {};
}

void Trial::Fail(std::string expected, std::string found, std::string cause) const {
    throw Ended{Verdict::kFailed, std::move(expected), std::move(found), std::move(cause)};
}

void Trial::Skip(std::string why) const {
    throw Ended{Verdict::kSkipped, {}, std::move(why), {}};
}

void Trial::Warn(std::string expected, std::string found) {
    if (!warning_) {
        warning_ = Outcome{Verdict::kWarning, step_, std::move(expected), std::move(found), {}};
    }
}

void Trial::Expect(bool isSo, const char* expected, const std::string& found) const {
    if (!isSo) {
        Fail(expected, found);
    }
}

void Trial::ExpectResult(NCFRESULT expected, NCFRESULT found, const char* words) const {
    if (expected != found) {
        Fail(words, Text(found));
    }
}

void Trial::ExpectSuccess(NCFRESULT result, const char* expected) const {
    Expect(result >= 0, expected, Text(result));
}

void Trial::ExpectRefusal(NCFRESULT result, const char* expected) const {
    Expect(result < 0, expected, Text(result));
}

Outcome Run(const Check& check, const TrialOptions& options, const Trial::Tell& tell) {
    Trial trial(options, tell);
    Outcome outcome;
    const auto end = [&](Ended ended) {
        outcome.verdict = ended.verdict;
        outcome.expected = std::move(ended.expected);
        outcome.found = std::move(ended.found);
        if (ended.verdict != Verdict::kSkipped) {
            outcome.cause = ended.cause.empty() ? check.cause : std::move(ended.cause);
        }
    };
    const auto thrown = [&](const std::string& what) {
        end({Verdict::kFailed, "no exception leaves the module", "it threw " + what,
             "an operation that does not catch what it calls throws"});
    };
    try {
        check.run(trial);
    } catch (Ended& ended) {
        end(std::move(ended));
    } catch (const CannotWrite& failure) {
        end({Verdict::kSkipped,
             {},
             "the checker can't write " + host::DisplayPath(failure.path) + ": " +
                 failure.error.default_error_condition().message() +
                 "; name another folder in TMPDIR",
             {}});
    } catch (NCFRESULT result) {
        thrown(options.resultText(result));
    } catch (const std::exception& error) {
        thrown(error.what());
    } catch (...) {
        thrown("something that is no std::exception");
    }
    outcome.done = trial.step();
    if (outcome.verdict == Verdict::kPassed && trial.warning()) {
        outcome = *trial.warning();
        outcome.cause = check.cause;
    }
    return outcome;
}

}  // namespace validate
