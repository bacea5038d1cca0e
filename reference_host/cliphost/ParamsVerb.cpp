// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include <fmt/format.h>

#include <map>

#include "reference_host/cliphost/Describe.h"
#include "reference_host/cliphost/JsonAnswer.h"
#include "reference_host/cliphost/MachinePath.h"
#include "reference_host/cliphost/ParameterOptions.h"
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

// All choices of a parameter, a star at the one in use. A number that is none of
// them is the file's own way.
void PrintParameter(const ClipParameter& parameter) {
    const auto line = [&](const std::string& text, std::optional<ncfUInt32> value) {
        fmt::print("    {} {}{}\n", parameter.value == value ? '*' : ' ', text,
                   parameter.defaultValue == value ? " (default)" : "");
    };
    const auto isChoice = [&](std::optional<ncfUInt32> value) {
        for (const host::ParameterChoice& choice : parameter.info.choices) {
            if (value == choice.value) {
                return true;
            }
        }
        return false;
    };
    fmt::print("  {} (\"{}\")\n", parameter.info.label, parameter.info.name);
    for (const host::ParameterChoice& choice : parameter.info.choices) {
        line(choice.text, choice.value);
    }
    const auto other = [&](std::optional<ncfUInt32> value) {
        if (!isChoice(value)) {
            line(value ? fmt::format("none of these: {}", *value) : "no value", value);
        }
    };
    other(parameter.value);
    if (parameter.defaultValue != parameter.value) {
        other(parameter.defaultValue);
    }
}

nlohmann::ordered_json ToJson(const ClipParameter& parameter) {
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
            {"choices", std::move(choices)}};
}

void Print(ClipParameters& parameters, const ParamsOptions& options) {
    if (!options.xml.empty()) {
        fmt::print("{}\n", parameters.Xml(kXml.at(options.xml)));
        return;
    }
    const std::vector<ClipParameter> list = parameters.List();
    const std::string set = parameters.SetName();
    if (!options.json) {
        fmt::print("{}: {}\n", DisplayPath(options.movie), host::ShownText(set, kLongestName));
        for (const ClipParameter& parameter : list) {
            PrintParameter(parameter);
        }
        return;
    }
    nlohmann::ordered_json json = {{"movie", MachinePath(options.movie)},
                                   {"set", set},
                                   {"parameters", nlohmann::ordered_json::array()}};
    for (const ClipParameter& parameter : list) {
        json["parameters"].push_back(ToJson(parameter));
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
                throw Failure(kExitFile, ProblemWith(running, options->movie, opened));
            }
            ClipParameters parameters(running, options->movie, *container);
            options->parameters.ApplyTo(parameters);
            Print(parameters, *options);
        });
    });
}

}  // namespace cliphost
