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

void ShowTypes(Session& session, bool json) {
    host::Ref<NMA::IMediaContainer3> container;
    const NCFRESULT made = session.host().Create(NMA::CompID_QuickTimeContainer, container);
    if (made < 0) {
        throw Failure(kExitCaller,
                      Problem{{},
                              "the module makes no container, so its file types can't be asked for",
                              {},
                              made});
    }
    nlohmann::ordered_json list = nlohmann::ordered_json::array();
    const ncfUInt32 count = container->GetFileTypeCount();
    for (ncfUInt32 i = 0; i < count; ++i) {
        host::Ref<INCFString> extension, description, group;
        const NCFRESULT result =
            container->GetFileType(i, extension.Out(), description.Out(), group.Out());
        if (result < 0) {
            throw Failure(kExitCaller,
                          Problem{{}, "the module does not tell its file types", {}, result});
        }
        if (json) {
            list.push_back({{"index", i},
                            {"extension", host::text::ReadUtf8(extension.get())},
                            {"description", host::text::ReadUtf8(description.get())},
                            {"group", host::text::ReadUtf8(group.get())}});
        } else {
            fmt::print("{:2}  {:<6} {:<12} {}\n", i, host::text::ReadUtf8(extension.get()),
                       host::text::ReadUtf8(description.get()), host::text::ReadUtf8(group.get()));
        }
    }
    if (json) {
        PrintJson(list);
    }
}

}  // namespace

void AddTypes(CLI::App& app, const SessionOptions& options, int&) {
    auto* const verb = app.add_subcommand("types", "List the file types that the module claims");
    verb->footer("Example: cliphost types --json");
    auto json = std::make_shared<bool>(false);
    verb->add_flag("--json", *json, "As JSON");
    verb->callback([&options, json] {
        AnswerFailureToo(*json, nlohmann::ordered_json::object(), [&] {
            Session session(options);
            ShowTypes(session, *json);
        });
    });
}

}  // namespace cliphost
