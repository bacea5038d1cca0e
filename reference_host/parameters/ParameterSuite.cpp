// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/parameters/ParameterSuite.h"

#include <algorithm>
#include <cmath>

#include "reference_host/framework/Guard.h"
#include "reference_host/util/text/HostText.h"
#include "reference_host/xml/XmlNames.h"
#include "text/Encodings.h"

namespace host {

namespace {

enum DependencyKind : ncfUInt32 { kEnables = 1, kDisables = 2 };

// A caller's text, copied; false when it may not stand in a document.
bool Take(const char* text, std::string& out) {
    out = text == nullptr ? "" : text;
    return out.size() <= ParameterLimits::kLongestText && IsXmlContent(encodings::FromUtf8(out));
}

template <class Items>
bool Holds(const Items& items, const GUID& id) {
    return std::any_of(items.begin(), items.end(), [&](const auto& item) { return item.id == id; });
}

}  // namespace

NCFRESULT ParameterSuite::SetComponentId(const GUID& component) {
    component_.id = component;
    isNamed_ = true;
    return NCF_OK;
}

NCFRESULT ParameterSuite::Prepare(ncfUInt32 track) {
    return Guarded([&] {
        Need(isNamed_, NCF_E_FAIL);
        component_.tracks.assign(1, {});
        component_.tracks[0].number = track;
        dependencies_.clear();
        stage_ = Stage::kPrepared;
        return NCF_OK;
    });
}

NCFRESULT ParameterSuite::WriteXML(INCFString* out) {
    return Guarded([&] {
        Need(out);
        Need(stage_ != Stage::kEmpty && stage_ != Stage::kDescribing, NCF_E_FAIL);
        std::string xml;
        const NCFRESULT written = WriteParameterDocument({{component_}}, xml);
        return written < 0 ? written : text::Assign(out, encodings::FromUtf8(xml), kNCFUTF8);
    });
}

// --- the description -------------------------------------------------------------------

NCFRESULT ParameterSuite::BeginDescription(float version) {
    if (stage_ != Stage::kPrepared) {
        return NCF_E_FAIL;
    }
    if (!std::isfinite(version)) {
        return NCF_E_INVALIDARG;
    }
    component_.tracks[0].descriptionVersion = version;
    stage_ = Stage::kDescribing;
    return NCF_OK;
}

NCFRESULT ParameterSuite::AddGroup(const GUID& group, const char* name, ncfUInt32,
                                   ncfUInt32 isShown) {
    return Guarded([&] {
        ParameterGroup added;
        Need(stage_ == Stage::kDescribing, NCF_E_FAIL);
        Need(Take(name, added.name), NCF_E_INVALIDARG);
        ParameterTrack& track = component_.tracks[0];
        Need(!Holds(track.groups, group), NMA_E_ALREADYSET);
        added.id = group;
        added.isShown = isShown != 0;
        track.groups.push_back(std::move(added));
        return NCF_OK;
    });
}

NCFRESULT ParameterSuite::AddParameter(const GUID& parameter, const char* internalName,
                                       const char* label, ncfUInt32, const GUID& type) {
    return Guarded([&] {
        ParameterInfo added;
        Need(stage_ == Stage::kDescribing, NCF_E_FAIL);
        Need(type == kParamTypeChoice, NCF_E_NOTSUPPORTED);
        Need(Take(internalName, added.name) && Take(label, added.label), NCF_E_INVALIDARG);
        Need(FindParameter(parameter) == nullptr, NMA_E_ALREADYSET);
        added.id = parameter;
        ParameterTrack& track = component_.tracks[0];
        auto& list = track.groups.empty() ? track.parameters : track.groups.back().parameters;
        list.push_back(std::move(added));
        return NCF_OK;
    });
}

NCFRESULT ParameterSuite::EndDescription() {
    return Guarded([&] {
        Need(stage_ == Stage::kDescribing, NCF_E_FAIL);
        for (const Dependency& dependency : dependencies_) {
            if (FindParameter(dependency.parameter) == nullptr) {
                return NCF_E_NOTFOUND;
            }
        }
        for (const Dependency& dependency : dependencies_) {
            FindParameter(dependency.parameter)->rules.push_back(dependency.rule);
        }
        dependencies_.clear();
        stage_ = Stage::kDescribed;
        return NCF_OK;
    });
}

NCFRESULT ParameterSuite::AddValueChoice(const char* text, ncfUInt32 value, ncfBool isDefault) {
    return Guarded([&] {
        ParameterInfo* const info = LastParameter();
        ParameterChoice added;
        Need(info, NCF_E_FAIL);
        Need(Take(text, added.text), NCF_E_INVALIDARG);
        const bool isThere =
            std::any_of(info->choices.begin(), info->choices.end(),
                        [&](const ParameterChoice& choice) { return choice.value == value; });
        if (isThere || (isDefault != 0 && info->defaultValue)) {
            return NMA_E_ALREADYSET;
        }
        added.value = value;
        info->choices.push_back(std::move(added));
        if (isDefault != 0) {
            info->defaultValue = value;
        }
        return NCF_OK;
    });
}

NCFRESULT ParameterSuite::AddDependency(ncfUInt32 kind, const GUID& parameter,
                                        IParameterValue* value, ncfUInt32) {
    return Guarded([&] {
        const ParameterInfo* const info = LastParameter();
        Need(info, NCF_E_FAIL);
        Need(value);
        if (kind != kEnables && kind != kDisables) {
            return NCF_E_INVALIDARG;
        }
        Dependency added{parameter, {info->id, 0, kind == kEnables}};
        const NCFRESULT read = value->GetData(&added.rule.value, sizeof added.rule.value);
        if (read >= 0) {
            dependencies_.push_back(added);
        }
        return read;
    });
}

ParameterInfo* ParameterSuite::FindParameter(const GUID& id) {
    ParameterTrack& track = component_.tracks[0];
    const auto findIn = [&](std::vector<ParameterInfo>& list) -> ParameterInfo* {
        for (ParameterInfo& info : list) {
            if (info.id == id) {
                return &info;
            }
        }
        return nullptr;
    };
    ParameterInfo* found = findIn(track.parameters);
    for (ParameterGroup& group : track.groups) {
        found = found != nullptr ? found : findIn(group.parameters);
    }
    return found;
}

ParameterInfo* ParameterSuite::LastParameter() {
    if (stage_ != Stage::kDescribing) {
        return nullptr;
    }
    ParameterTrack& track = component_.tracks[0];
    auto& list = track.groups.empty() ? track.parameters : track.groups.back().parameters;
    return list.empty() ? nullptr : &list.back();
}

// --- sets ----------------------------------------------------------------------------------

NCFRESULT ParameterSuite::AddParamSet(const GUID& set, const char* name, ncfUInt32, float version,
                                      ncfBool isDefault) {
    return Guarded([&] {
        ParameterSet added;
        Need(stage_ != Stage::kEmpty && stage_ != Stage::kDescribing, NCF_E_FAIL);
        Need(Take(name, added.name) && std::isfinite(version), NCF_E_INVALIDARG);
        ParameterTrack& track = component_.tracks[0];
        Need(!Holds(track.sets, set), NMA_E_ALREADYSET);
        added.id = set;
        added.version = version;
        added.isDefault = isDefault != 0;
        track.sets.push_back(std::move(added));
        track.activeSet = set;
        return NCF_OK;
    });
}

NCFRESULT ParameterSuite::AddParamValue(const GUID& parameter, IParameterValue* value) {
    return Guarded([&] {
        Need(stage_ != Stage::kEmpty && !component_.tracks[0].sets.empty(), NCF_E_FAIL);
        Need(value);
        auto& settings = component_.tracks[0].sets.back().settings;
        const bool isThere = std::any_of(
            settings.begin(), settings.end(),
            [&](const ParameterSetting& setting) { return setting.parameter == parameter; });
        Need(!isThere, NMA_E_ALREADYSET);
        ncfUInt32 number = 0;
        const NCFRESULT read = value->GetData(&number, sizeof number);
        if (read >= 0) {
            settings.push_back({parameter, number});
        }
        return read;
    });
}

}  // namespace host
