// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include <fmt/format.h>

#include <map>
#include <set>

#include "reference_host/cliphost/Describe.h"
#include "reference_host/cliphost/FileFields.h"
#include "reference_host/cliphost/JsonAnswer.h"
#include "reference_host/cliphost/MachinePath.h"
#include "reference_host/cliphost/ParameterOptions.h"
#include "reference_host/cliphost/RouteTaken.h"
#include "reference_host/cliphost/Verbs.h"
#include "reference_host/framework/HostPath.h"
#include "reference_host/parameters/ShownText.h"

namespace cliphost {
namespace {

using host::DisplayPath;

struct ParamsOptions {
    std::filesystem::path movie;
    ParameterOptions parameters;
    std::string xml;
    bool json = false;
};

const std::map<std::string, ParameterXml> kXml = {{"values", ParameterXml::kValues},
                                                  {"description", ParameterXml::kDescription},
                                                  {"defaults", ParameterXml::kDefaults}};

// The name of a set may come from any document.
constexpr std::size_t kLongestName = 200;

// All choices of a parameter, with a star at the one in use. A value that is not one
// of the choices is printed after them.
void PrintParameter(const ClipParameter& parameter, const FileFields& file) {
    const auto line = [&](const std::string& text, bool isUsed, bool isDefault) {
        fmt::print("    {} {}{}\n", isUsed ? '*' : ' ', text, isDefault ? " (default)" : "");
    };
    const std::string used = WordsForValue(parameter.info, parameter.value, file);
    const std::string usual = WordsForValue(parameter.info, parameter.defaultValue, file);
    std::set<std::string> shown;
    fmt::print("  {} (\"{}\")\n", parameter.info.label, parameter.info.name);
    for (const host::ParameterChoice& choice : parameter.info.choices) {
        line(choice.text, choice.text == used, choice.text == usual);
        shown.insert(choice.text);
    }
    for (const std::string& other : {used, usual}) {
        if (shown.insert(other).second) {
            line(other, other == used, other == usual);
        }
    }
}

nlohmann::ordered_json ToJson(const ClipParameter& parameter, const FileFields& file) {
    const auto number = [](std::optional<ncfUInt32> value) {
        return value ? nlohmann::ordered_json(*value) : nlohmann::ordered_json();
    };
    nlohmann::ordered_json choices = nlohmann::ordered_json::array();
    for (const host::ParameterChoice& choice : parameter.info.choices) {
        choices.push_back({{"value", choice.value}, {"text", choice.text}});
    }
    return {{"name", parameter.info.name},
            {"label", parameter.info.label},
            {"value", number(parameter.value)},
            {"default", number(parameter.defaultValue)},
            {"words", WordsForValue(parameter.info, parameter.value, file)},
            {"defaultWords", WordsForValue(parameter.info, parameter.defaultValue, file)},
            {"choices", std::move(choices)}};
}

void Print(ClipParameters& parameters, const ParamsOptions& options, const FileFields& file) {
    if (!options.xml.empty()) {
        fmt::print("{}\n", parameters.Xml(kXml.at(options.xml)));
        return;
    }
    const std::vector<ClipParameter> list = parameters.List();
    const std::string set = parameters.SetName();
    if (!options.json) {
        fmt::print("{}: {}\n", DisplayPath(options.movie), host::ShownText(set, kLongestName));
        for (const ClipParameter& parameter : list) {
            PrintParameter(parameter, file);
        }
        return;
    }
    nlohmann::ordered_json json = {{"movie", MachinePath(options.movie)}};
    AddRoute(options.movie, json);
    json["set"] = set;
    json["parameters"] = nlohmann::ordered_json::array();
    for (const ClipParameter& parameter : list) {
        json["parameters"].push_back(ToJson(parameter, file));
    }
    PrintJson(json);
}

}  // namespace

void AddParams(CLI::App& app, const SessionOptions& session, int&) {
    auto* const verb = app.add_subcommand("params", "Show and change the parameters of a movie");
    verb->footer(
        "Example: cliphost params clip.mov --set \"Level Remapping=Expand\" --xml values > my.xml");
    auto options = std::make_shared<ParamsOptions>();
    verb->add_option("movie", options->movie, "A movie")->required();
    options->parameters.AddTo(*verb);
    auto* const xml = verb->add_option("--xml", options->xml,
                                       "Print a document: values, description or defaults");
    xml->check(CLI::IsMember(kXml));
    verb->add_flag("--json", options->json, kJsonHelp)->excludes(xml);
    verb->callback([&session, options] {
        AnswerFailureToo(options->json, {{"movie", MachinePath(options->movie)}}, [&] {
            Session running(session);
            host::Ref<NMA::IMediaContainer3> container;
            const NCFRESULT opened = OpenContainer(running, options->movie, container);
            if (opened < 0) {
                throw Failure(ProblemWith(running, options->movie, opened));
            }
            // A container takes parameters also for what is no movie.
            const Description description =
                DescribeContainer(running, container.get(), options->movie);
            // Before the user's values count.
            const FileFields file = ReadFileFields(*container);
            if (description.problem && file.order.empty()) {
                throw Failure(description.problem);
            }
            TellRoute(options->movie, running.verbosity());
            ClipParameters parameters(running, options->movie, *container);
            options->parameters.ApplyTo(parameters);
            Print(parameters, *options, file);
        });
    });
}

}  // namespace cliphost
