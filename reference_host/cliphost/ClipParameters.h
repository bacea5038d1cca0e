// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <filesystem>
#include <optional>
#include <string>
#include <utility>
#include <vector>

#include "host_interfaces/media/MediaContainer.h"
#include "host_interfaces/parameters/ParametersXML.h"
#include "reference_host/cliphost/Session.h"
#include "reference_host/parameters/ParameterDocument.h"

namespace cliphost {

// The documents that a clip's parameters give.
enum class ParameterXml { kValues, kDescription, kDefaults };

// One parameter with the value in force and the value of the file.
struct ClipParameter {
    host::ParameterInfo info;
    std::optional<ncfUInt32> value;
    std::optional<ncfUInt32> defaultValue;
};

// The parameters of one open movie, which the session must outlive. They belong
// to the clip that all mappings of its container share. A change does not reach the
// formats that a mapping already has: take a new mapping. Everything here throws a
// Failure.
class ClipParameters {
public:
    // Over a sample mapping of its own.
    ClipParameters(Session& session, std::filesystem::path movie, NMA::IMediaContainer3& container);

    std::string Xml(ParameterXml which);
    std::vector<ClipParameter> List();
    std::string SetName();

    // "name=value" each: a parameter by its name or label, a value by its words,
    // their beginning, or its number; letters of either case. All of them are
    // handed over together.
    void Assign(const std::vector<std::string>& assignments);
    // Takes over a document; the file is named in messages.
    void Apply(const std::string& xml, const std::filesystem::path& file);
    void Reset();

private:
    // The one track of the module's component in a document of its own.
    std::pair<GUID, host::ParameterTrack> Read(ParameterXml which);
    void HandOver(const std::string& xml, int status, const std::filesystem::path& file,
                  const std::string& what);

    Session& session_;
    std::filesystem::path movie_;
    host::Ref<INCFParametersXML> parameters_;
};

}  // namespace cliphost
