// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/cliphost/ClipParameters.h"

#include <fmt/format.h>

#include <algorithm>

#include "host_interfaces/media/PluginComponents.h"
#include "host_interfaces/media/SampleMapping.h"
#include "reference_host/cliphost/Describe.h"
#include "reference_host/cliphost/Failure.h"
#include "reference_host/cliphost/Notice.h"
#include "reference_host/cliphost/ResultText.h"
#include "reference_host/cliphost/Words.h"
#include "reference_host/framework/HostPath.h"
#include "reference_host/system/Paths.h"
#include "reference_host/util/text/HostText.h"
#include "reference_host/util/text/Number.h"

namespace cliphost {
namespace {

using host::DisplayPath;

// The set that takes the values of the command line. It has no name of its own.
constexpr GUID kCommandLineSet = ncfGuid("4D7B2A90-51C8-4E3F-9C06-B1A87E25F31D");

std::vector<host::ParameterInfo> InfosOf(const host::ParameterTrack& track) {
    std::vector<host::ParameterInfo> infos = track.parameters;
    for (const host::ParameterGroup& group : track.groups) {
        infos.insert(infos.end(), group.parameters.begin(), group.parameters.end());
    }
    return infos;
}

std::optional<ncfUInt32> SettingOf(const host::ParameterTrack& track, const GUID& parameter) {
    if (const host::ParameterSet* const set = track.SetInUse()) {
        for (const host::ParameterSetting& setting : set->settings) {
            if (setting.parameter == parameter) {
                return setting.value;
            }
        }
    }
    return std::nullopt;
}

template <class Items, class TextOf>
std::string Listed(const Items& items, TextOf textOf) {
    std::string list;
    for (const auto& item : items) {
        list += fmt::format("\n    {}", textOf(item));
    }
    return list;
}

const host::ParameterInfo& FindParameter(const std::vector<host::ParameterInfo>& infos,
                                         const std::string& name) {
    const std::string wanted = InSmallLetters(name);
    for (const host::ParameterInfo& info : infos) {
        if (InSmallLetters(info.name) == wanted || InSmallLetters(info.label) == wanted) {
            return info;
        }
    }
    throw Failure(kExitCaller, host::system::PathOfText("--set " + name),
                  "the clip has no such parameter; it has these:" +
                      Listed(infos, [](const auto& info) { return info.name; }));
}

ncfUInt32 FindValue(const host::ParameterInfo& info, const std::string& text) {
    const std::string wanted = InSmallLetters(text);
    std::vector<ncfUInt32> found;
    for (const host::ParameterChoice& choice : info.choices) {
        const std::string words = InSmallLetters(choice.text);
        if (words == wanted) {
            return choice.value;
        }
        if (!wanted.empty() && words.compare(0, wanted.size(), wanted) == 0) {
            found.push_back(choice.value);
        }
    }
    if (found.size() == 1) {
        return found[0];
    }
    ncfUInt32 number = 0;
    if (host::text::ReadNumber(text, number)) {
        return number;
    }
    throw Failure(kExitCaller,
                  host::system::PathOfText(fmt::format("--set {}={}", info.name, text)),
                  found.empty() ? "there is no such choice" : "several choices begin with this",
                  "write one of these, or a number:" +
                      Listed(info.choices, [](const auto& choice) { return choice.text; }));
}

bool HoldsValues(const host::ParameterDocument& document) {
    for (const host::ParameterComponent& component : document.components) {
        for (const host::ParameterTrack& track : component.tracks) {
            const host::ParameterSet* const set = track.SetInUse();
            if (component.id == NMA::CompID_QuickTimeSampleMapping && set != nullptr &&
                !set->isReadOnly && !set->settings.empty()) {
                return true;
            }
        }
    }
    return false;
}

}  // namespace

ClipParameters::ClipParameters(Session& session, std::filesystem::path movie,
                               NMA::IMediaContainer3& container)
    : session_(session), movie_(std::move(movie)) {
    host::Ref<NMA::ISampleMapping> mapping;
    NCFRESULT result = container.GetSampleMapping(mapping.Out());
    if (result >= 0) {
        result = host::Query(mapping.get(), parameters_);
    }
    if (result < 0) {
        throw Failure(ProblemWith(session_, movie_, result));
    }
}

// --- reading -------------------------------------------------------------------------------

std::string ClipParameters::Xml(ParameterXml which) {
    const auto text = host::MakeString("");
    NCFRESULT result = NCF_OK;
    switch (which) {
        case ParameterXml::kValues:
            result = parameters_->GetParameterValuesXML(text.get());
            break;
        case ParameterXml::kDescription:
            result = parameters_->GetParameterDescriptionXML(text.get());
            break;
        case ParameterXml::kDefaults:
            result = parameters_->GetDefaultValuesXML(text.get());
            break;
    }
    if (result < 0) {
        throw Failure(kExitFile,
                      Problem{movie_, "the module gives no parameter document", {}, result});
    }
    return host::text::ReadUtf8(text.get());
}

std::pair<GUID, host::ParameterTrack> ClipParameters::Read(ParameterXml which) {
    host::ParameterDocument document;
    std::string problem;
    const NCFRESULT result = host::ReadParameterDocument(Xml(which), document, problem);
    if (result < 0 || document.components.empty() || document.components[0].tracks.empty()) {
        throw Failure(
            kExitFile,
            Problem{
                movie_, "the module's parameter document can't be read: " + problem, {}, result});
    }
    return {document.components[0].id, document.components[0].tracks[0]};
}

std::vector<ClipParameter> ClipParameters::List() {
    const host::ParameterTrack present = Read(ParameterXml::kDescription).second;
    const host::ParameterTrack defaults = Read(ParameterXml::kDefaults).second;
    std::vector<ClipParameter> list;
    for (host::ParameterInfo& info : InfosOf(present)) {
        const GUID id = info.id;
        list.push_back({std::move(info), SettingOf(present, id), SettingOf(defaults, id)});
    }
    return list;
}

// Of the description, which is used too for a set whose identifier is zero.
std::string ClipParameters::SetName() {
    const host::ParameterTrack track = Read(ParameterXml::kDescription).second;
    const host::ParameterSet* const set = track.SetInUse();
    return set == nullptr ? std::string() : set->name;
}

// --- changes ---------------------------------------------------------------------------------

void ClipParameters::Assign(const std::vector<std::string>& assignments) {
    auto [component, track] = Read(ParameterXml::kDescription);
    const std::vector<host::ParameterInfo> infos = InfosOf(track);
    host::ParameterSet set;
    if (const host::ParameterSet* const present = track.SetInUse()) {
        set = *present;
    }
    // What a user chose is no longer what the file says.
    if (set.id == kParamSetDefault) {
        set.id = kCommandLineSet;
        set.name.clear();
        set.isDefault = false;
    }
    for (const std::string& assignment : assignments) {
        const std::size_t equals = assignment.find('=');
        if (equals == std::string::npos) {
            throw Failure(kExitCaller, host::system::PathOfText("--set " + assignment),
                          "the value is missing", "write it as \"name=value\"");
        }
        const host::ParameterInfo& info = FindParameter(infos, assignment.substr(0, equals));
        const ncfUInt32 value = FindValue(info, assignment.substr(equals + 1));
        const auto old = std::find_if(
            set.settings.begin(), set.settings.end(),
            [&](const host::ParameterSetting& one) { return one.parameter == info.id; });
        if (old == set.settings.end()) {
            set.settings.push_back({info.id, value});
        } else {
            old->value = value;
        }
    }
    host::ParameterTrack changed;
    changed.number = track.number;
    changed.activeSet = set.id;
    changed.sets = {set};
    std::string xml;
    const NCFRESULT written = host::WriteParameterDocument({{{component, {changed}}}}, xml);
    if (written < 0) {
        throw Failure(kExitFile, Problem{movie_, "its parameters can't be written", {}, written});
    }
    HandOver(xml, kExitFile, movie_, "the module refuses the values");
}

void ClipParameters::Apply(const std::string& xml, const std::filesystem::path& file) {
    HandOver(xml, kExitCaller, file, "the module refuses it");
    host::ParameterDocument document;
    std::string problem;
    if (host::ReadParameterDocument(xml, document, problem) >= 0 && !HoldsValues(document)) {
        Notice(
            "cliphost: {}: no set in use there has values for this clip, so no value was "
            "changed\n",
            DisplayPath(file));
    }
}

// The module puts defaults into force with the next values that it is handed.
void ClipParameters::Reset() {
    const NCFRESULT result = parameters_->ResetParameters();
    if (result < 0) {
        throw Failure(kExitFile, Problem{movie_, "the parameters can't be reset", {}, result});
    }
    HandOver(Xml(ParameterXml::kDescription), kExitFile, movie_,
             "the module refuses its own values");
}

void ClipParameters::HandOver(const std::string& xml, int status, const std::filesystem::path& file,
                              const std::string& what) {
    session_.TakeNotices();
    const auto text = host::MakeString(xml, kNCFUTF8);
    const NCFRESULT result = parameters_->SetParameterValuesXML(text.get());
    const std::vector<std::string> notices = session_.TakeNotices();
    if (result < 0) {
        // What the parameters component says of the document names its place there.
        throw Failure(
            status,
            Problem{file, notices.empty() ? what : what + ": " + notices.front(), {}, result});
    }
}

}  // namespace cliphost
