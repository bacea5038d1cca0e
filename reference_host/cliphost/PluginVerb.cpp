// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include <fmt/format.h>

#include "reference_host/cliphost/AafValue.h"
#include "reference_host/cliphost/JsonAnswer.h"
#include "reference_host/cliphost/MachinePath.h"
#include "reference_host/cliphost/Verbs.h"
#include "reference_host/framework/HostPath.h"

namespace cliphost {
namespace {

void PrintText(const Session& session) {
    const host::PluginModule& module = session.plugin();
    const host::PluginFacts& plugin = module.plugin();
    fmt::print("{} {}.{}  by {}\n", plugin.name, plugin.major, plugin.minor, plugin.vendor);
    fmt::print("  file        {}\n", host::DisplayPath(module.file()));
    fmt::print("  id          {}\n", ToText(plugin.id));
    fmt::print("  second id   {}\n", ToText(plugin.secondId));
    for (const host::DefinitionAttribute& attribute : plugin.attributes) {
        const bool isText = attribute.valueType == kNCFValueTypeText;
        fmt::print("  attribute   {} {}\n", ToText(attribute.id),
                   isText ? attribute.Text() : fmt::format("{}", attribute.Number()));
    }
    fmt::print("  components  {}\n", plugin.componentCount);
    for (std::size_t i = 0; i < module.components().size(); ++i) {
        const host::ComponentFacts& component = module.components()[i];
        fmt::print("  {} {:<24} {}.{}  component {}  class {}  {}\n", i, component.name,
                   component.major, component.minor, ToText(component.id),
                   ToText(component.classId),
                   component.hasFactory ? "class factory" : "no class factory");
    }
    fmt::print("AAF library {} {}\n", host::DisplayPath(session.aaf().file()),
               session.aaf().Version());
}

nlohmann::ordered_json ToJson(const Session& session) {
    const host::PluginModule& module = session.plugin();
    const host::PluginFacts& plugin = module.plugin();
    nlohmann::ordered_json json = {
        {"name", plugin.name},
        {"version", fmt::format("{}.{}", plugin.major, plugin.minor)},
        {"vendor", plugin.vendor},
        {"file", MachinePath(module.file())},
        {"id", ToText(plugin.id)},
        {"secondId", ToText(plugin.secondId)},
        {"componentCount", plugin.componentCount},
    };
    for (const host::ComponentFacts& component : module.components()) {
        json["components"].push_back(
            {{"name", component.name},
             {"version", fmt::format("{}.{}", component.major, component.minor)},
             {"componentId", ToText(component.id)},
             {"classId", ToText(component.classId)},
             {"classFactory", component.hasFactory}});
    }
    return json;
}

}  // namespace

void AddPlugin(CLI::App& app, const SessionOptions& options, int&) {
    auto* const verb = app.add_subcommand("plugin", "Show what the module registered");
    verb->footer(
        "Examples:\n"
        "  cliphost plugin\n"
        "  cliphost plugin --json\n"
        "  cliphost plugin --plugin another.nvx");
    auto json = std::make_shared<bool>(false);
    verb->add_flag("--json", *json, kJsonHelp);
    verb->callback([&options, json] {
        AnswerFailureToo(*json, nlohmann::ordered_json::object(), [&] {
            const Session session(options);
            if (*json) {
                PrintJson(ToJson(session));
            } else {
                PrintText(session);
            }
        });
    });
}

}  // namespace cliphost
