// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include <charconv>

#include "reference_host/framework/Guard.h"
#include "reference_host/framework/String.h"
#include "reference_host/parameters/GuidText.h"
#include "reference_host/parameters/ParameterDocument.h"
#include "reference_host/parameters/ParameterNames.h"
#include "reference_host/util/text/HostText.h"
#include "reference_host/xml/XmlWriter.h"

namespace host {

namespace {

using namespace parameter_names;

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
    static void Check(NCFRESULT result) {
        if (result < 0) {
            throw result;
        }
    }

    Ref<XmlWriter> writer_;
};

std::string FloatText(float number) {
    char text[64];
    const auto end = std::to_chars(text, text + sizeof text, number);
    std::string result(text, end.ptr);
    return result.find_first_not_of("-0123456789") == std::string::npos ? result + ".0" : result;
}

const char* FlagText(bool flag) {
    return flag ? kTrue : kFalse;
}

void WriteChoices(Printer& out, const ParameterInfo& info) {
    out.Element(kValueInfo, kParameter);
    out.Element(kDiscreteInfo, kValueInfo);
    out.Attribute(kDiscreteInfo, kDefault, std::to_string(info.defaultValue.value_or(kNoDefault)));
    for (const ParameterChoice& choice : info.choices) {
        const std::string number = std::to_string(choice.value);
        out.Element(kDiscrete, kDiscreteInfo);
        out.Attribute(kDiscrete, kValue, number);
        out.Attribute(kDiscrete, kName, choice.text);
        out.Text(number, kDiscrete);
    }
}

void WriteRules(Printer& out, const ParameterInfo& info) {
    if (info.rules.empty()) {
        return;
    }
    out.Element(kRuleSet, kParameter);
    for (const ParameterRule& rule : info.rules) {
        out.Element(kRule, kRuleSet);
        out.Element(kCondition, kRule);
        out.Attribute(kCondition, kId, GuidText(rule.parameter));
        out.TextElement(kConditionValue, std::to_string(rule.value), kCondition);
        out.TextElement(kOperation, rule.enables ? kEnable : kDisable, kRule);
    }
}

void WriteInfo(Printer& out, const ParameterInfo& info, const char* parent) {
    out.Element(kParameter, parent);
    out.Attribute(kParameter, kId, GuidText(info.id));
    out.TextElement(kShortName, info.name, kParameter);
    out.TextElement(kDescription, info.label, kParameter);
    WriteChoices(out, info);
    WriteRules(out, info);
}

void WriteDescription(Printer& out, const ParameterTrack& track) {
    if (!track.descriptionVersion) {
        return;
    }
    out.Element(kInfos, kTrack);
    out.TextElement(kVersion, FloatText(*track.descriptionVersion), kInfos);
    for (const ParameterInfo& info : track.parameters) {
        WriteInfo(out, info, kInfos);
    }
    // The writer knows parents by name alone, so groups stay one deep.
    for (const ParameterGroup& group : track.groups) {
        out.Element(kGroup, kInfos);
        out.Attribute(kGroup, kId, GuidText(group.id));
        out.Attribute(kGroup, kDisplayState, group.isShown ? kShow : kHide);
        out.TextElement(kShortName, group.name, kGroup);
        out.TextElement(kDescription, "", kGroup);
        for (const ParameterInfo& info : group.parameters) {
            WriteInfo(out, info, kGroup);
        }
    }
}

void WriteSet(Printer& out, const ParameterSet& set) {
    out.Element(kSet, kTrack);
    out.Attribute(kSet, kId, GuidText(set.id));
    out.Attribute(kSet, kReadOnly, FlagText(set.isReadOnly));
    if (set.isDefault) {
        out.Attribute(kSet, kDefault, kTrue);
    }
    out.TextElement(kVersion, FloatText(set.version), kSet);
    out.TextElement(kName, set.name, kSet);
    for (const ParameterSetting& setting : set.settings) {
        out.Element(kParameter, kSet);
        out.Attribute(kParameter, kId, GuidText(setting.parameter));
        out.Attribute(kParameter, kSilent, kFalse);
        if (setting.value) {
            out.TextElement(kValueUInt32, std::to_string(*setting.value), kParameter);
        }
    }
}

void WriteTrack(Printer& out, const ParameterTrack& track) {
    out.Element(kTrack, kComponent);
    out.Attribute(kTrack, kNumber, std::to_string(track.number));
    WriteDescription(out, track);
    if (track.activeSet) {
        out.TextElement(kActiveSet, GuidText(*track.activeSet), kTrack);
    }
    for (const ParameterSet& set : track.sets) {
        WriteSet(out, set);
    }
}

}  // namespace

NCFRESULT WriteParameterDocument(const ParameterDocument& document, std::string& xml) {
    return Guarded([&] {
        Printer out;
        out.Root(kRoot);
        for (const ParameterComponent& component : document.components) {
            out.Element(kComponent, kRoot);
            out.Attribute(kComponent, kId, GuidText(component.id));
            for (const ParameterTrack& track : component.tracks) {
                WriteTrack(out, track);
            }
        }
        xml = out.Finish();
        return NCF_OK;
    });
}

}  // namespace host
