// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <filesystem>
#include <memory>
#include <optional>
#include <string>
#include <vector>

#include "reference_host/cliphost/AafLibrary.h"
#include "reference_host/cliphost/Problem.h"
#include "reference_host/framework/Host.h"
#include "reference_host/framework/String.h"

namespace cliphost {

// What the command line says for all verbs.
struct SessionOptions {
    std::filesystem::path program;        // the file that runs
    std::filesystem::path programFolder;  // where module and library lie
    std::filesystem::path plugin;         // empty: beside the program
    std::filesystem::path aafLibrary;     // empty: beside the program
    host::HostOptions host;
    std::string pinTime;  // ISO 8601, empty: the clock
    int verbosity = 0;
};

// The module that the command line means.
std::filesystem::path ModuleFile(const SessionOptions& options);

// The AAF library that the command line means, for verbs that need no module. Throws a Failure.
std::unique_ptr<AafLibrary> LoadAafLibrary(const SessionOptions& options);

// Registers what a host of clips has besides the framework: parser, wrapper, XML, parameters.
void RegisterServices(host::Host& host);

// A host with all its services and the module loaded into it.
class Session {
public:
    explicit Session(const SessionOptions& options);  // throws a Failure
    ~Session();

    host::Host& host() { return *host_; }
    const host::PluginModule& plugin() const { return *plugin_; }
    const AafLibrary& aaf() const { return *aaf_; }
    int verbosity() const { return verbosity_; }

    // Lines that the module wrote for the user since the last call.
    std::vector<std::string> TakeNotices();
    // The files that the module needs beside it.
    std::vector<std::filesystem::path> DataFiles() const;

private:
    int verbosity_;
    std::vector<std::string> notices_;
    std::unique_ptr<AafLibrary> aaf_;
    std::unique_ptr<host::Host> host_;
    host::PluginModule* plugin_ = nullptr;
};

// The problem of a path whose names contain a backslash, as only Windows forbids.
Problem BackslashProblem(const std::filesystem::path& path);

// A path as the module wants it: absolute, with backslashes. Throws a Failure
// for one that does not exist or that holds a backslash of its own.
host::Ref<host::String> PathForModule(const std::filesystem::path& path);

}  // namespace cliphost
