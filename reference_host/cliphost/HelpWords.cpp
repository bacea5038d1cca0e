// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/HelpWords.h"

namespace cliphost {
namespace {

HelpOption OptionHelp(const CLI::Option& option) {
    HelpOption help;
    help.isArgument = option.get_positional();
    if (help.isArgument) {
        help.names.push_back(option.get_name(true));
    } else {
        for (const std::string& name : option.get_snames()) {
            help.names.push_back("-" + name);
        }
        for (const std::string& name : option.get_lnames()) {
            help.names.push_back("--" + name);
        }
    }
    help.text = option.get_description();
    help.group = option.get_group();
    help.takesValue = option.get_items_expected_max() > 0;
    help.mayRepeat = option.get_items_expected_max() > 1;
    help.isRequired = option.get_required();
    return help;
}

HelpVerb VerbHelp(const CLI::App& app, const std::string& name) {
    HelpVerb help{name, app.get_description(), app.get_footer(), {}};
    for (const CLI::Option* const option : app.get_options()) {
        if (!option->get_group().empty()) {
            help.options.push_back(OptionHelp(*option));
        }
    }
    return help;
}

}  // namespace

std::vector<HelpVerb> HelpOf(const CLI::App& program) {
    std::vector<HelpVerb> verbs = {VerbHelp(program, "")};
    for (const CLI::App* const verb :
         program.get_subcommands([](const CLI::App*) { return true; })) {
        if (!verb->get_group().empty()) {
            verbs.push_back(VerbHelp(*verb, verb->get_name()));
        }
    }
    return verbs;
}

}  // namespace cliphost
