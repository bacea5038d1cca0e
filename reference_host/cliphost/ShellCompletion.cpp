// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include <algorithm>

#include "reference_host/cliphost/HelpWords.h"

namespace cliphost {
namespace {

// In single quotes of a shell; `quoteInside` is how it writes one there.
std::string Quoted(const std::string& text, const std::string& quoteInside) {
    std::string out = "'";
    for (const char c : text) {
        out += c == '\'' ? quoteInside : std::string(1, c);
    }
    return out + "'";
}

// The first sentence, which is all that fits beside a word.
std::string Short(const std::string& text) {
    return text.substr(0, std::min(text.find(';'), text.find(". ")));
}

std::string OptionNames(const HelpVerb& verb) {
    std::string names;
    for (const HelpOption& option : verb.options) {
        for (const std::string& name : option.names) {
            names += option.isArgument ? "" : (names.empty() ? "" : " ") + name;
        }
    }
    return names;
}

// Of those that take a value, which is no verb.
std::string ValueOptionNames(const HelpVerb& verb) {
    HelpVerb some = verb;
    some.options.erase(std::remove_if(some.options.begin(), some.options.end(),
                                      [](const HelpOption& one) { return !one.takesValue; }),
                       some.options.end());
    return OptionNames(some);
}

std::string VerbNames(const std::vector<HelpVerb>& verbs) {
    std::string names;
    for (const HelpVerb& verb : verbs) {
        names += (names.empty() ? "" : " ") + verb.name;
    }
    return names;
}

// For zsh, which parts the word from its explanation by a colon.
std::string Described(const std::string& word, const std::string& text) {
    std::string escaped;
    for (const char c : word) {
        escaped += c == ':' ? std::string("\\:") : std::string(1, c);
    }
    return Quoted(escaped + ":" + Short(text), "'\\''");
}

std::string ZshOptions(const HelpVerb& verb) {
    std::string lines;
    for (const HelpOption& option : verb.options) {
        for (const std::string& name : option.names) {
            lines += option.isArgument ? "" : "        " + Described(name, option.text) + "\n";
        }
    }
    return lines;
}

}  // namespace

std::string BashCompletion(const std::vector<HelpVerb>& verbs) {
    std::string text = R"(# bash completion for cliphost
_cliphost() {
    local current=${COMP_WORDS[COMP_CWORD]} verb= word
    local verbs=')" + VerbNames(verbs) +
                       R"('
    local before=: valued=')" +
                       ValueOptionNames(verbs.front()) +
                       R"('
    for word in "${COMP_WORDS[@]:1:COMP_CWORD-1}"; do
        case " $valued " in *" $before "*) before=:; continue ;; esac
        case " $verbs " in *" $word "*) verb=$word; break ;; esac
        before=$word
    done
    local options=')" + OptionNames(verbs.front()) +
                       R"('
    case $verb in
)";
    for (const HelpVerb& verb : verbs) {
        if (!verb.name.empty()) {
            text +=
                "        " + verb.name + ") options=\"$options " + OptionNames(verb) + "\" ;;\n";
        }
    }
    return text + R"(    esac
    COMPREPLY=()
    if [[ $current == -* ]]; then
        mapfile -t COMPREPLY < <(compgen -W "$options" -- "$current")
    elif [[ -z $verb ]]; then
        mapfile -t COMPREPLY < <(compgen -W "$verbs" -- "$current")
    fi
}
complete -o default -F _cliphost cliphost
)";
}

std::string ZshCompletion(const std::vector<HelpVerb>& verbs) {
    std::string text =
        "#compdef cliphost\n# zsh completion for cliphost\n_cliphost() {\n"
        "    local verb= word before=:\n    local -a verbs options valued\n    verbs=(\n";
    for (const HelpVerb& verb : verbs) {
        text += verb.name.empty() ? "" : "        " + Described(verb.name, verb.text) + "\n";
    }
    text += "    )\n    valued=(" + ValueOptionNames(verbs.front()) +
            ")\n    for word in \"${(@)words[2,CURRENT-1]}\"; do\n"
            "        if (( ${valued[(Ie)$before]} )); then before=:; continue; fi\n"
            "        if (( ${verbs[(I)${word}:*]} )); then verb=$word; break; fi\n"
            "        before=$word\n    done\n"
            "    options=(\n" +
            ZshOptions(verbs.front()) + "    )\n    case $verb in\n";
    for (const HelpVerb& verb : verbs) {
        if (!verb.name.empty()) {
            text += "    " + verb.name + ") options+=(\n" + ZshOptions(verb) + "        ) ;;\n";
        }
    }
    return text + R"(    esac
    if [[ $PREFIX == -* ]]; then
        _describe option options
    elif [[ -z $verb ]]; then
        _describe verb verbs
    else
        _files
    fi
}
_cliphost "$@"
)";
}

std::string FishCompletion(const std::vector<HelpVerb>& verbs) {
    std::string text = "# fish completion for cliphost\n";
    for (const HelpVerb& verb : verbs) {
        const bool isProgram = verb.name.empty();
        const std::string when =
            isProgram ? std::string() : " -n '__fish_seen_subcommand_from " + verb.name + "'";
        if (!isProgram) {
            text += "complete -c cliphost -n __fish_use_subcommand -f -a " + verb.name + " -d " +
                    Quoted(Short(verb.text), "\\'") + "\n";
        }
        for (const HelpOption& option : verb.options) {
            if (option.isArgument) {
                continue;
            }
            text += "complete -c cliphost" + when;
            for (const std::string& name : option.names) {
                text += name.compare(0, 2, "--") == 0 ? " -l " + name.substr(2)
                        : name.size() == 2            ? " -s " + name.substr(1)
                                                      : " -o " + name.substr(1);
            }
            text += (option.takesValue ? " -r" : "") + std::string(" -d ") +
                    Quoted(Short(option.text), "\\'") + "\n";
        }
    }
    return text;
}

}  // namespace cliphost
