// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <string>
#include <vector>

#include <CLI/CLI.hpp>

namespace cliphost {

// What the command line says of itself, from which its manual pages and the completions of shells
// are written.
struct HelpOption {
    std::vector<std::string> names;  // -q, --quiet; the argument's name where it has no dash
    std::string text;
    std::string group;
    bool takesValue = false;
    bool mayRepeat = false;
    bool isArgument = false;  // told by its place
    bool isRequired = false;
};

struct HelpVerb {
    std::string name;  // empty: the program itself
    std::string text;
    std::string footer;  // examples, exit statuses
    std::vector<HelpOption> options;
};

// The program first, then its verbs in their order; without those that are not for users.
std::vector<HelpVerb> HelpOf(const CLI::App& program);

// A manual page for man(1), in section 1: of the program, or of the verb at an index.
std::string ManPage(const std::vector<HelpVerb>& verbs, std::size_t which);

// Scripts that complete verbs, options and file names.
std::string BashCompletion(const std::vector<HelpVerb>& verbs);
std::string ZshCompletion(const std::vector<HelpVerb>& verbs);
std::string FishCompletion(const std::vector<HelpVerb>& verbs);

}  // namespace cliphost
