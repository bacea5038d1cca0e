// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include <algorithm>
#include <string_view>

#include "host_interfaces/Version.h"
#include "reference_host/cliphost/HelpWords.h"

namespace cliphost {
namespace {

// A text that roff takes as it stands: a dash is one of ASCII, and no line is a request.
std::string Roff(const std::string& text) {
    std::string out;
    for (const char c : text) {
        const bool isAtStart = out.empty() || out.back() == '\n';
        if (isAtStart && (c == '.' || c == '\'')) {
            out += "\\&";
        }
        out += c == '\\' ? std::string("\\e") : c == '-' ? std::string("\\-") : std::string(1, c);
    }
    return out;
}

std::string Upper(std::string text) {
    std::transform(text.begin(), text.end(), text.begin(),
                   [](char c) { return c >= 'a' && c <= 'z' ? static_cast<char>(c - 32) : c; });
    return text;
}

std::string PageName(const HelpVerb& verb) {
    return verb.name.empty() ? "cliphost" : "cliphost-" + verb.name;
}

std::string Call(const HelpVerb& verb) {
    std::string call = ".B cliphost" + (verb.name.empty() ? std::string() : " " + verb.name) +
                       "\n[\\fIoptions\\fR]";
    for (const HelpOption& option : verb.options) {
        if (option.isArgument) {
            const std::string name =
                "\\fI" + Roff(option.names[0]) + "\\fR" + (option.mayRepeat ? " ..." : "");
            call += option.isRequired ? " " + name : " [" + name + "]";
        }
    }
    return call + (verb.name.empty() ? " \\fIverb\\fR ...\n" : "\n");
}

std::string Entry(const HelpOption& option) {
    std::string names;
    for (const std::string& name : option.names) {
        names += (names.empty() ? "" : ", ") + Roff(name);
    }
    const std::string value = option.takesValue && !option.isArgument ? " \\fIvalue\\fR" : "";
    return ".TP\n\\fB" + names + "\\fR" + value + "\n" + Roff(option.text) + "\n";
}

std::string Options(const HelpVerb& verb) {
    std::vector<std::string> groups;
    for (const HelpOption& option : verb.options) {
        if (std::find(groups.begin(), groups.end(), option.group) == groups.end()) {
            groups.push_back(option.group);
        }
    }
    std::string text;
    for (const std::string& group : groups) {
        text += ".SH " + Upper(Roff(group)) + "\n";
        for (const HelpOption& option : verb.options) {
            text += option.group == group ? Entry(option) : "";
        }
    }
    return text;
}

// The help's last words by paragraphs: those that begin with a title are sections of their own.
std::string LastSections(const std::string& footer) {
    struct Section {
        std::string_view title;
        std::string_view start;  // of a paragraph in it
        std::string text = {};
    };
    Section sections[] = {
        {"EXIT STATUS", "Exit status: "}, {"NOTES", ""}, {"EXAMPLES", "Examples:\n"}};
    Section& notes = sections[1];
    constexpr std::string_view kBetween = "\n\n";
    for (std::size_t at = 0, end = 0; at < footer.size(); at = end + kBetween.size()) {
        end = std::min(footer.find(kBetween, at), footer.size());
        std::string_view paragraph = std::string_view(footer).substr(at, end - at);
        Section* place = &notes;
        for (Section& section : sections) {
            if (!section.start.empty() &&
                paragraph.substr(0, section.start.size()) == section.start) {
                place = &section;
            }
        }
        paragraph.remove_prefix(place->start.size());
        place->text.append(place->text.empty() ? "" : kBetween).append(paragraph);
    }
    std::string page;
    for (const Section& section : sections) {
        if (!section.text.empty()) {
            // Lines stay lines.
            page.append(".SH ").append(section.title);
            page += "\n.nf\n" + Roff(section.text) + "\n.fi\n";
        }
    }
    return page;
}

std::string Verbs(const std::vector<HelpVerb>& verbs) {
    std::string text = ".SH VERBS\n";
    for (const HelpVerb& verb : verbs) {
        if (!verb.name.empty()) {
            text += ".TP\n.BR " + Roff(PageName(verb)) + " (1)\n" + Roff(verb.text) + "\n";
        }
    }
    return text;
}

}  // namespace

std::string ManPage(const std::vector<HelpVerb>& verbs, std::size_t which) {
    const HelpVerb& verb = verbs.at(which);
    std::string page = ".TH " + Upper(Roff(PageName(verb))) + " 1 \"\" \"cliphost " +
                       PRODUCT_VERSION_TEXT "\" \"User commands\"\n";
    page += ".SH NAME\n" + Roff(PageName(verb)) + " \\- " + Roff(verb.text) + "\n";
    page += ".SH SYNOPSIS\n" + Call(verb);
    page += verb.name.empty() ? Verbs(verbs) : std::string();
    page += Options(verb);
    page += LastSections(verb.footer);
    page += ".SH SEE ALSO\n";
    return page + (verb.name.empty() ? ".BR cliphost\\-describe (1)\n" : ".BR cliphost (1)\n");
}

}  // namespace cliphost
