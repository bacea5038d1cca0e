// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include <algorithm>
#include <iterator>

#include "reference_host/system/ProcessFacts.h"
#include "reference_host/validate/Module.h"

namespace validate {
namespace {

void Open(Trial& trial, host::system::SharedLibrary& library) {
    trial.Doing("loading the file");
    std::string reason;
    if (!library.Open(trial.options().module, reason)) {
        trial.Fail("the system loads the file as a shared library", reason);
    }
}

void Loads(Trial& trial) {
    host::system::SharedLibrary library;
    Open(trial, library);
}

void ExportsSixFunctions(Trial& trial) {
    host::system::SharedLibrary library;
    std::string reason;
    if (!library.Open(trial.options().module, reason)) {
        trial.Skip("the system does not load the file");
    }
    for (const char* const name : kExports) {
        trial.Doing(std::string("looking for the function ") + name);
        trial.Expect(library.Find(name) != nullptr, "the file exports it, with C linkage",
                     "there is no such name");
    }
}

void ExportsNothingElse(Trial& trial) {
    host::system::SharedLibrary library;
    std::string reason;
    if (!library.Open(trial.options().module, reason)) {
        trial.Skip("the system does not load the file");
    }
    trial.Doing("reading the names that the file exports");
    std::string others;
    std::size_t count = 0;
    constexpr std::size_t kMostTold = 5;
    for (const std::string& name : library.Exports()) {
        if (std::find(std::begin(kExports), std::end(kExports), name) != std::end(kExports)) {
            continue;
        }
        if (++count <= kMostTold) {
            others += (others.empty() ? "" : ", ") + name;
        }
    }
    if (count > 0) {
        trial.Warn("the six functions and no other name",
                   std::to_string(count) + (count == 1 ? " further name: " : " further names: ") +
                       others + (count > kMostTold ? ", ..." : ""));
    }
}

void LoadingStartsNothing(Trial& trial) {
    const host::system::ProcessFacts before = host::system::OwnFacts();
    const Module module(trial);
    const host::system::ProcessFacts after = host::system::OwnFacts();
    trial.Expect(after.threads <= before.threads, "no thread is started",
                 std::to_string(after.threads - before.threads) + " more than before");
    trial.Expect(after.handles <= before.handles, "no file stays open",
                 std::to_string(after.handles - before.handles) + " more than before");
}

void LoadsAgain(Trial& trial) {
    for (int round = 1; round <= 3; ++round) {
        Module module(trial);
        trial.Doing("registering after loading it " + std::to_string(round) + " times");
        const auto components = module.Components();
        trial.Doing("giving the library back after it was loaded " + std::to_string(round) +
                    " times and never started");
        module.Unmap();
    }
}

}  // namespace

std::vector<Check> FileChecks() {
    return {
        {"file-loads", "The system loads the file as a shared library, with all that it needs.",
         "it is no shared library, is built for another processor, or lacks a library or symbol "
         "that it was linked with",
         Loads},
        {"file-exports-six-functions",
         "The file exports the six functions of the framework under their names.",
         "the function is missing, is not extern \"C\", or is hidden", ExportsSixFunctions},
        {"file-exports-nothing-else",
         "The six functions are all that the file exports, so nothing of it gets mixed up with "
         "other libraries.",
         "the module is linked without a list of exports (a version script); libraries in it stay "
         "visible",
         ExportsNothingElse},
        {"file-starts-nothing",
         "Loading the file only maps it: no thread runs and no file stays open before the host "
         "calls it.",
         "a global object's constructor does the work of NCFStartup", LoadingStartsNothing},
        {"file-loads-again",
         "A module that registered and was never started can be given back and loaded anew.",
         "a global object's destructor uses something that is gone", LoadsAgain},
    };
}

}  // namespace validate
