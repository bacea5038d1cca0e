// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include <charconv>

#include "host_interfaces/parameters/DocumentWords.h"
#include "reference_host/framework/Guard.h"
#include "reference_host/framework/String.h"
#include "reference_host/parameters/GuidText.h"
#include "reference_host/parameters/ParameterDocument.h"
#include "reference_host/util/text/HostText.h"
#include "reference_host/xml/XmlWriter.h"

namespace host {

namespace {

using namespace NMA;

// The XML writer with plain texts; throws its refusals.
class Printer {
public:
    Printer() : writer_(MakeRef<XmlWriter>()) { Check(writer_->Open(nullptr)); }

    void Root(const char* name) { Check(writer_->Element(S(name).get(), nullptr)); }
    void Element(const char* name, const char* parent) {
        Check(writer_->Element(S(name).get(), S(parent).get()));
    }
    void Attribute(const char* element, const char* name, std::string_view value) {
        Check(writer_->Attribute(S(element).get(), S(name).get(), S(value).get()));
    }
    void Text(std::string_view text, const char* parent) {
        if (!text.empty()) {
            Check(writer_->Text(S(text).get(), S(parent).get()));
        }
    }
    // A child that holds a text and nothing else.
    void TextElement(const char* name, std::string_view text, const char* parent) {
        Element(name, parent);
        Text(text, name);
    }
    std::string Finish() {
        Ref<INCFString> text;
        Check(writer_->GetText(text.Out()));
        return text::ReadUtf8(text.get());
    }

private:
    static Ref<String> S(std::string_view text) { return MakeString(text); }

    Ref<XmlWriter> writer_;
};

std::string FloatText(float number) {
    char text[64];
    const auto end = std::to_chars(text, text + sizeof text, number);
    std::string result(text, end.ptr);
    return result.find_first_not_of("-0123456789") == std::string::npos ? result + ".0" : result;
}

const char* FlagText(bool flag) {
    return flag ? kParamTrue : kParamFalse;
}

void WriteChoices(Printer& out, const ParameterInfo& info) {
    out.Element(kParamValueInfo, kParamItem);
    const char* const choices = kParamKindNames[kParamKindDiscrete].info;
    out.Element(choices, kParamValueInfo);
    out.Attribute(choices, kParamDefault, std::to_string(info.defaultValue.value_or(kNoDefault)));
    for (const ParameterChoice& choice : info.choices) {
        const std::string number = std::to_string(choice.value);
        out.Element(kParamDiscrete, choices);
        out.Attribute(kParamDiscrete, kParamValue, number);
        out.Attribute(kParamDiscrete, kParamName, choice.text);
        out.Text(number, kParamDiscrete);
    }
}

void WriteRules(Printer& out, const ParameterInfo& info) {
    if (info.rules.empty()) {
        return;
    }
    out.Element(kParamRuleSet, kParamItem);
    for (const ParameterRule& rule : info.rules) {
        out.Element(kParamRule, kParamRuleSet);
        out.Element(kParamCondition, kParamRule);
        out.Attribute(kParamCondition, kParamId, GuidText(rule.parameter));
        out.TextElement(kParamConditionValue, std::to_string(rule.value), kParamCondition);
        out.TextElement(kParamOperation, rule.enables ? kParamEnable : kParamDisable, kParamRule);
    }
}

void WriteInfo(Printer& out, const ParameterInfo& info, const char* parent) {
    out.Element(kParamItem, parent);
    out.Attribute(kParamItem, kParamId, GuidText(info.id));
    out.TextElement(kParamShortName, info.name, kParamItem);
    out.TextElement(kParamDescription, info.label, kParamItem);
    WriteChoices(out, info);
    WriteRules(out, info);
}

void WriteDescription(Printer& out, const ParameterTrack& track) {
    if (!track.descriptionVersion) {
        return;
    }
    out.Element(kParamInfos, kParamTrack);
    out.TextElement(kParamVersion, FloatText(*track.descriptionVersion), kParamInfos);
    for (const ParameterInfo& info : track.parameters) {
        WriteInfo(out, info, kParamInfos);
    }
    // The writer knows parents by name alone, so groups stay one deep.
    for (const ParameterGroup& group : track.groups) {
        out.Element(kParamGroupItem, kParamInfos);
        out.Attribute(kParamGroupItem, kParamId, GuidText(group.id));
        out.Attribute(kParamGroupItem, kParamDisplayState, group.isShown ? kParamShow : kParamHide);
        out.TextElement(kParamShortName, group.name, kParamGroupItem);
        out.TextElement(kParamDescription, "", kParamGroupItem);
        for (const ParameterInfo& info : group.parameters) {
            WriteInfo(out, info, kParamGroupItem);
        }
    }
}

void WriteSet(Printer& out, const ParameterSet& set) {
    out.Element(kParamSetItem, kParamTrack);
    out.Attribute(kParamSetItem, kParamId, GuidText(set.id));
    out.Attribute(kParamSetItem, kParamReadOnly, FlagText(set.isReadOnly));
    if (set.isDefault) {
        out.Attribute(kParamSetItem, kParamDefault, kParamTrue);
    }
    out.TextElement(kParamVersion, FloatText(set.version), kParamSetItem);
    out.TextElement(kParamName, set.name, kParamSetItem);
    for (const ParameterSetting& setting : set.settings) {
        out.Element(kParamItem, kParamSetItem);
        out.Attribute(kParamItem, kParamId, GuidText(setting.parameter));
        out.Attribute(kParamItem, kParamSilent, kParamFalse);
        if (setting.value) {
            out.TextElement(kParamKindNames[kParamKindUInt32].value, std::to_string(*setting.value),
                            kParamItem);
        }
    }
}

void WriteTrack(Printer& out, const ParameterTrack& track) {
    out.Element(kParamTrack, kParamComponent);
    out.Attribute(kParamTrack, kParamNumber, std::to_string(track.number));
    WriteDescription(out, track);
    if (track.activeSet) {
        out.TextElement(kParamActiveSet, GuidText(*track.activeSet), kParamTrack);
    }
    for (const ParameterSet& set : track.sets) {
        WriteSet(out, set);
    }
}

}  // namespace

NCFRESULT WriteParameterDocument(const ParameterDocument& document, std::string& xml) {
    return Guarded([&] {
        Printer out;
        out.Root(kParamRoot);
        for (const ParameterComponent& component : document.components) {
            out.Element(kParamComponent, kParamRoot);
            out.Attribute(kParamComponent, kParamId, GuidText(component.id));
            for (const ParameterTrack& track : component.tracks) {
                WriteTrack(out, track);
            }
        }
        xml = out.Finish();
        return NCF_OK;
    });
}

}  // namespace host
