// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include <cmath>
#include <cstring>

#include "host_interfaces/parameters/DocumentWords.h"
#include "reference_host/framework/Guard.h"
#include "reference_host/parameters/GuidText.h"
#include "reference_host/parameters/ParameterDocument.h"
#include "reference_host/parameters/ShownText.h"
#include "reference_host/util/text/Number.h"
#include "reference_host/xml/EventReader.h"
#include "reference_host/xml/XmlTree.h"

namespace host {

namespace {

using namespace NMA;

// What ends the reading.
struct Refusal {
    NCFRESULT result;
    std::string problem;
};

// "component/track/parameterSet": where a node stands.
std::string PlaceOf(const pugi::xml_node& node) {
    std::string place = node.path('/');
    return place.size() > 200 ? place.substr(0, 200) + "..." : place.substr(place.empty() ? 0 : 1);
}

[[noreturn]] void Refuse(const pugi::xml_node& node, const std::string& what,
                         NCFRESULT result = NCF_E_INVALIDARG) {
    throw Refusal{result, PlaceOf(node) + ": " + what};
}

std::string Quoted(std::string_view text) {
    return "\"" + ShownText(text, 60) + "\"";
}

std::string_view Trimmed(std::string_view text) {
    constexpr char kSpace[] = " \t\r\n";
    const std::size_t first = text.find_first_not_of(kSpace);
    return first == std::string_view::npos
               ? std::string_view()
               : text.substr(first, text.find_last_not_of(kSpace) - first + 1);
}

// The whole text of an element; marks and comments in it are passed over.
std::string TextOf(const pugi::xml_node& node) {
    std::string text;
    for (const pugi::xml_node& child : node.children()) {
        if (child.type() == pugi::node_pcdata || child.type() == pugi::node_cdata) {
            text += child.value();
        }
        if (text.size() > ParameterLimits::kLongestText) {
            Refuse(node, "a text that is too long", NCF_E_NOTSUPPORTED);
        }
    }
    return text;
}

std::string ChildText(const pugi::xml_node& node, const char* name) {
    const pugi::xml_node child = node.child(name);
    return child ? TextOf(child) : std::string();
}

GUID Id(const pugi::xml_node& node, std::string_view text, const char* what) {
    GUID id{};
    if (!ReadGuid(Trimmed(text), id)) {
        Refuse(node, std::string(what) + " is " + Quoted(text) + ", which is no identifier");
    }
    return id;
}

GUID IdAttribute(const pugi::xml_node& node) {
    const pugi::xml_attribute attribute = node.attribute(kParamId);
    if (!attribute) {
        Refuse(node, "has no id");
    }
    return Id(node, attribute.value(), "the id");
}

ncfUInt32 Number(const pugi::xml_node& node, std::string_view text) {
    ncfUInt32 number = 0;
    if (!text::ReadNumber(Trimmed(text), number)) {
        Refuse(node, "holds " + Quoted(text) + ", which is no number of 32 bits without sign");
    }
    return number;
}

float Version(const pugi::xml_node& node) {
    const pugi::xml_node child = node.child(kParamVersion);
    if (!child) {
        return 1.0f;
    }
    const std::string text = TextOf(child);
    float number = 0.0f;
    if (!text::ReadNumber(Trimmed(text), number) || !std::isfinite(number)) {
        Refuse(child, "holds " + Quoted(text) + ", which is no version");
    }
    return number;
}

// Adds what `read` makes of each child of that name.
template <class Item>
void ReadEach(const pugi::xml_node& parent, const char* name, Item (*read)(const pugi::xml_node&),
              std::vector<Item>& items) {
    for (const pugi::xml_node& child : parent.children(name)) {
        items.push_back(read(child));
    }
}

bool Flag(const pugi::xml_node& node, const char* name) {
    return std::strcmp(node.attribute(name).value(), kParamTrue) == 0;
}

// --- the description -------------------------------------------------------------------

ParameterInfo ReadInfo(const pugi::xml_node& node) {
    ParameterInfo info;
    info.id = IdAttribute(node);
    info.name = ChildText(node, kParamShortName);
    info.label = ChildText(node, kParamDescription);
    const pugi::xml_node discrete =
        node.child(kParamValueInfo).child(kParamKindNames[kParamKindDiscrete].info);
    for (const pugi::xml_node& choice : discrete.children(kParamDiscrete)) {
        const char* const name = choice.attribute(kParamName).value();
        if (std::strlen(name) > ParameterLimits::kLongestText) {
            Refuse(choice, "a name that is too long", NCF_E_NOTSUPPORTED);
        }
        info.choices.push_back({Number(choice, choice.attribute(kParamValue).value()), name});
    }
    if (const pugi::xml_attribute value = discrete.attribute(kParamDefault)) {
        const ncfUInt32 number = Number(discrete, value.value());
        if (number != kNoDefault) {
            info.defaultValue = number;
        }
    }
    return info;
}

// Groups of groups come out one after the other. Their depth is that of the
// document, which is bounded.
void ReadGroups(const pugi::xml_node& parent, std::vector<ParameterGroup>& out) {
    for (const pugi::xml_node& node : parent.children(kParamGroupItem)) {
        ParameterGroup group;
        group.id = IdAttribute(node);
        group.name = ChildText(node, kParamShortName);
        group.isShown = std::strcmp(node.attribute(kParamDisplayState).value(), kParamHide) != 0;
        ReadEach(node, kParamItem, ReadInfo, group.parameters);
        out.push_back(std::move(group));
        ReadGroups(node, out);
    }
}

// --- sets -----------------------------------------------------------------------------------

ParameterSetting ReadSetting(const pugi::xml_node& node) {
    ParameterSetting setting;
    setting.parameter = IdAttribute(node);
    for (const char* const name :
         {kParamKindNames[kParamKindUInt32].value, kParamKindNames[kParamKindDiscrete].value}) {
        if (const pugi::xml_node value = node.child(name)) {
            setting.value = Number(value, TextOf(value));
            return setting;
        }
    }
    return setting;
}

ParameterSet ReadSet(const pugi::xml_node& node) {
    ParameterSet set;
    set.id = IdAttribute(node);
    set.name = ChildText(node, kParamName);
    set.version = Version(node);
    set.isDefault = Flag(node, kParamDefault);
    set.isReadOnly = Flag(node, kParamReadOnly);
    ReadEach(node, kParamItem, ReadSetting, set.settings);
    return set;
}

ParameterTrack ReadTrack(const pugi::xml_node& node) {
    ParameterTrack track;
    track.number = Number(node, node.attribute(kParamNumber).value());
    if (const pugi::xml_node infos = node.child(kParamInfos)) {
        track.descriptionVersion = Version(infos);
        ReadEach(infos, kParamItem, ReadInfo, track.parameters);
        ReadGroups(infos, track.groups);
    }
    if (const pugi::xml_node active = node.child(kParamActiveSet)) {
        track.activeSet = Id(active, TextOf(active), "the set");
    }
    ReadEach(node, kParamSetItem, ReadSet, track.sets);
    return track;
}

ParameterComponent ReadComponent(const pugi::xml_node& node) {
    ParameterComponent component;
    component.id = IdAttribute(node);
    ReadEach(node, kParamTrack, ReadTrack, component.tracks);
    return component;
}

ParameterDocument ReadRoot(const pugi::xml_node& root) {
    if (std::strcmp(root.name(), kParamRoot) != 0) {
        Refuse(root, std::string("the outermost element of a parameter document is ") + kParamRoot);
    }
    ParameterDocument document;
    ReadEach(root, kParamComponent, ReadComponent, document.components);
    return document;
}

}  // namespace

bool ParameterTrack::IsInUse(const ParameterSet& set) const {
    return activeSet ? set.id == *activeSet : sets.size() == 1;
}

const ParameterSet* ParameterTrack::SetInUse() const {
    for (const ParameterSet& set : sets) {
        if (IsInUse(set)) {
            return &set;
        }
    }
    return nullptr;
}

NCFRESULT ReadParameterDocument(std::string_view xml, ParameterDocument& out,
                                std::string& problem) {
    return Guarded([&]() -> NCFRESULT {
        if (xml.size() > ParameterLimits::kLargestDocument) {
            problem = "more than " + std::to_string(ParameterLimits::kLargestDocument >> 20) +
                      " MiB, which no parameter document needs";
            return NCF_E_NOTSUPPORTED;
        }
        // First for its words: the tree's own check has none.
        XmlEvents events;
        EventReader check(events, "UTF-8");
        NCFRESULT result = check.Feed(xml.data(), xml.size(), true);
        if (result < 0) {
            problem = check.problem();
            return result;
        }
        const auto tree = XmlTree::Load(std::string(xml), "UTF-8", result);
        if (tree == nullptr) {
            problem = "it can't be read";
            return result;
        }
        try {
            out = ReadRoot(tree->root());
        } catch (const Refusal& refusal) {
            problem = refusal.problem;
            return refusal.result;
        }
        return NCF_OK;
    });
}

}  // namespace host
