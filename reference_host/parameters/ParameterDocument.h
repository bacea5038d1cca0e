// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "host_interfaces/framework/ResultCodes.h"
#include "host_interfaces/parameters/ParameterIds.h"

namespace host {

// What stands in a parameter document, as plain records. All texts are UTF-8.
//
//   ncfComponents
//     component id
//       track number
//         parameterInfos            the description
//           parameterGroup, parameter, valueInfo, its choices
//         activeSet                 the set in use
//         parameterSet id readOnly  version, name
//           parameter id            one value element

// The default of a list of choices that has none: no list holds it.
inline constexpr ncfUInt32 kNoDefault = 0xFFFFFFFFu;

struct ParameterChoice {
    ncfUInt32 value = 0;
    std::string text;
};

// Whether the user may change a parameter while another has a value.
struct ParameterRule {
    GUID parameter{};
    ncfUInt32 value = 0;
    bool enables = false;
};

struct ParameterInfo {
    GUID id{};
    std::string name;   // in documents and on command lines
    std::string label;  // for people
    std::vector<ParameterChoice> choices;
    std::optional<ncfUInt32> defaultValue;  // none: no choice is the default
    std::vector<ParameterRule> rules;       // written, and passed over in reading
};

struct ParameterGroup {
    GUID id{};
    std::string name;
    bool isShown = true;
    std::vector<ParameterInfo> parameters;
};

struct ParameterSetting {
    GUID parameter{};
    std::optional<ncfUInt32> value;  // none: of a kind that this host doesn't carry
};

struct ParameterSet {
    GUID id{};
    std::string name;
    float version = 1.0f;
    bool isDefault = false;   // for readers of the text; it means nothing here
    bool isReadOnly = false;  // its values are not for taking
    std::vector<ParameterSetting> settings;
};

struct ParameterTrack {
    ncfUInt32 number = 0;
    std::optional<float> descriptionVersion;  // none: nothing is described
    std::vector<ParameterInfo> parameters;    // those outside groups
    std::vector<ParameterGroup> groups;
    std::optional<GUID> activeSet;
    std::vector<ParameterSet> sets;

    // The set that `activeSet` names; without it, the only one there is.
    bool IsInUse(const ParameterSet& set) const;
    const ParameterSet* SetInUse() const;  // or null
};

struct ParameterComponent {
    GUID id{};
    std::vector<ParameterTrack> tracks;
};

struct ParameterDocument {
    std::vector<ParameterComponent> components;
};

// What documents may ask for: real ones have a few kilobytes.
struct ParameterLimits {
    static constexpr std::size_t kLargestDocument = std::size_t{1} << 20;
    static constexpr std::size_t kLongestText = 4096;
};

// Reads a whole document or nothing. `problem` says what is wrong with it, and
// where: NCF_E_FAIL for what is no XML, NCF_E_NOTSUPPORTED beyond the limits,
// NCF_E_INVALIDARG for an id, a number or a text that can't be. Elements that
// are not known are passed over.
NCFRESULT ReadParameterDocument(std::string_view xml, ParameterDocument& out, std::string& problem);

// NCF_E_INVALIDARG for a text that XML has no place for.
NCFRESULT WriteParameterDocument(const ParameterDocument& document, std::string& xml);

}  // namespace host
