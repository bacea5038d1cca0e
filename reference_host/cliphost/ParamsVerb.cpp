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
#include "reference_host/cliphost/PathOption.h"
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

// What the verb tells of a movie.
struct ShownParameters {
    std::string set;
    std::vector<ClipParameter> list;
    FileFields file;  // before the user's values count
};

void PrintText(const std::filesystem::path& movie, const ShownParameters& shown) {
    fmt::print("{}: {}\n", DisplayPath(movie), host::ShownText(shown.set, kLongestName));
    for (const ClipParameter& parameter : shown.list) {
        PrintParameter(parameter, shown.file);
    }
}

void PrintAsJson(const std::filesystem::path& movie, const ShownParameters& shown) {
    nlohmann::ordered_json json = {{"movie", MachinePath(movie)}};
    AddRoute(movie, json);
    json["set"] = shown.set;
    json["parameters"] = nlohmann::ordered_json::array();
    for (const ClipParameter& parameter : shown.list) {
        json["parameters"].push_back(ToJson(parameter, shown.file));
    }
    PrintJson(schema::kParams, std::move(json));
}

}  // namespace

void AddParams(CLI::App& app, const SessionOptions& session, int&) {
    auto* const verb = app.add_subcommand("params", "Show and change the parameters of a movie");
    verb->footer(
        "Examples:\n"
        "  cliphost params clip.mov\n"
        "  cliphost params clip.mov --set \"Level Remapping=Expand\" --xml values > my.xml\n"
        "  cliphost params clip.mov --set-xml my.xml --json\n"
        "  cliphost params clip.mov --xml description");
    auto options = std::make_shared<ParamsOptions>();
    AddPath(*verb, "movie", options->movie, "A movie")->required();
    options->parameters.AddTo(*verb);
    auto* const xml = verb->add_option("--xml", options->xml,
                                       "Print a document: values, description or defaults");
    xml->check(CLI::IsMember(kXml));
    verb->add_flag("--json", options->json, kJsonHelp)->excludes(xml);
    verb->callback([&session, options] {
        AnswerFailureToo(
            options->json, schema::kParams, {{"movie", MachinePath(options->movie)}}, [&] {
                Session running(session);
                host::Ref<NMA::IMediaContainer3> container;
                const NCFRESULT opened = OpenContainer(running, options->movie, container);
                if (opened < 0) {
                    throw Failure(ProblemWith(running, options->movie, opened));
                }
                // A container takes parameters also for what is no movie.
                const Description description =
                    DescribeContainer(running, container.get(), options->movie);
                ShownParameters shown;
                shown.file = ReadFileFields(*container);
                if (description.problem && shown.file.order.empty()) {
                    throw Failure(description.problem);
                }
                TellRoute(options->movie, running.verbosity());
                ClipParameters parameters(running, options->movie, *container);
                options->parameters.ApplyTo(parameters);
                if (!options->xml.empty()) {
                    fmt::print("{}\n", parameters.Xml(kXml.at(options->xml)));
                    return;
                }
                shown.list = parameters.List();
                shown.set = parameters.SetName();
                (options->json ? PrintAsJson : PrintText)(options->movie, shown);
            });
    });
}

}  // namespace cliphost
