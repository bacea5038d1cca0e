// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include <fmt/format.h>

#include <nlohmann/json.hpp>

#include "host_interfaces/media/MediaContainer.h"
#include "host_interfaces/media/PluginComponents.h"
#include "reference_host/cliphost/JsonAnswer.h"
#include "reference_host/cliphost/ResultText.h"
#include "reference_host/cliphost/Verbs.h"
#include "reference_host/util/text/HostText.h"

namespace cliphost {

namespace {

struct FileType {
    std::string extension;
    std::string description;
    std::string group;
};

std::vector<FileType> ReadTypes(Session& session) {
    host::Ref<NMA::IMediaContainer3> container;
    const NCFRESULT made = session.host().Create(NMA::CompID_QuickTimeContainer, container);
    if (made < 0) {
        throw Failure(kExitCaller,
                      Problem{{},
                              "the module makes no container, so its file types can't be asked for",
                              {},
                              made});
    }
    std::vector<FileType> types(container->GetFileTypeCount());
    for (std::size_t i = 0; i < types.size(); ++i) {
        host::Ref<INCFString> extension, description, group;
        const NCFRESULT result = container->GetFileType(static_cast<ncfUInt32>(i), extension.Out(),
                                                        description.Out(), group.Out());
        if (result < 0) {
            throw Failure(kExitCaller,
                          Problem{{}, "the module does not tell its file types", {}, result});
        }
        types[i] = {host::text::ReadUtf8(extension.get()), host::text::ReadUtf8(description.get()),
                    host::text::ReadUtf8(group.get())};
    }
    return types;
}

void Print(const std::vector<FileType>& types) {
    for (std::size_t i = 0; i < types.size(); ++i) {
        fmt::print("{:2}  {:<6} {:<12} {}\n", i, types[i].extension, types[i].description,
                   types[i].group);
    }
}

nlohmann::ordered_json ToJson(const std::vector<FileType>& types) {
    nlohmann::ordered_json list = nlohmann::ordered_json::array();
    for (const FileType& type : types) {
        list.push_back({{"index", list.size()},
                        {"extension", type.extension},
                        {"description", type.description},
                        {"group", type.group}});
    }
    return list;
}

}  // namespace

void AddTypes(CLI::App& app, const SessionOptions& options, int&) {
    auto* const verb = app.add_subcommand("types", "List the file types that the module claims");
    verb->footer(
        "Examples:\n"
        "  cliphost types\n"
        "  cliphost types --json");
    auto json = std::make_shared<bool>(false);
    verb->add_flag("--json", *json, "As JSON");
    verb->callback([&options, json] {
        AnswerFailureToo(*json, nlohmann::ordered_json::object(), [&] {
            Session session(options);
            const std::vector<FileType> types = ReadTypes(session);
            if (*json) {
                PrintJson(ToJson(types));
            } else {
                Print(types);
            }
        });
    });
}

}  // namespace cliphost
