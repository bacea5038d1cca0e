// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>
#include <filesystem>
#include <functional>
#include <memory>
#include <optional>
#include <string>
#include <system_error>

#include "reference_host/framework/Host.h"
#include "reference_host/validate/Check.h"
#include "reference_host/validate/Outcome.h"

namespace validate {

// The checker's own files could not be written, which is no fault of the module.
struct CannotWrite {
    std::filesystem::path path;
    std::error_code error;
};

// What all checks of one call share.
struct TrialOptions {
    std::filesystem::path module;
    std::filesystem::path folder;  // where a check may write; empty when it begins
    std::uint64_t seed = 0;
    // Registers what a host of clips has besides the framework: parser, wrapper, XML, parameters.
    std::function<void(host::Host&)> addServices;
    // A result code in words.
    std::function<std::string(NCFRESULT)> resultText;
};

// One check at its work. What it is about to do, it says first, so that somebody knows it when the
// module does not come back.
class Trial {
public:
    using Tell = std::function<void(const std::string& step)>;

    Trial(const TrialOptions& options, Tell tell) : options_(options), tell_(std::move(tell)) {}

    const TrialOptions& options() const { return options_; }
    const std::filesystem::path& folder() const { return options_.folder; }
    const std::string& step() const { return step_; }
    const std::optional<Outcome>& warning() const { return warning_; }
    std::string Text(NCFRESULT result) const { return options_.resultText(result); }

    // A new host, with all its services.
    std::unique_ptr<host::Host> NewHost() const;

    // From now on the module is given this to do: "calling NCFStartup".
    void Doing(std::string step);

    // From now on each step is told with this before it, such as the component it is done with.
    void With(std::string what) { with_ = std::move(what); }

    // Does a part of the check that may be skipped without the rest. Why it was, if it was.
    std::optional<std::string> Part(const std::function<void()>& part) const;

    // Each ends the check. Without a cause, that of the check's row is told.
    [[noreturn]] void Fail(std::string expected, std::string found, std::string cause = {}) const;
    [[noreturn]] void Skip(std::string why) const;
    // The check goes on; the first warning is told when nothing fails.
    void Warn(std::string expected, std::string found);

    // The same where something is not so.
    void Expect(bool isSo, const char* expected, const std::string& found) const;
    void ExpectResult(NCFRESULT expected, NCFRESULT found, const char* words) const;
    void ExpectSuccess(NCFRESULT result, const char* expected = "success") const;
    void ExpectRefusal(NCFRESULT result, const char* expected = "a failure") const;

private:
    const TrialOptions& options_;
    Tell tell_;
    std::string with_;
    std::string step_;
    std::optional<Outcome> warning_;
};

// Does a check in this process. What the module throws is a failure of the check; where the
// checker can't write its own files, the check is skipped.
Outcome Run(const Check& check, const TrialOptions& options, const Trial::Tell& tell);

}  // namespace validate
