// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// The kind of a value, and the choices of the kinds that have a list or words.

#include "source/parameters/model/NMAParamValueInfo.h"

#include <memory>
#include <vector>

#include "source/parameters/model/ParamItems.h"
#include "source/plugin/ResultChecks.h"

namespace NMA::XMLUtils {
namespace {

// The first child that describes a value, in the order of the kinds; null
// without one. `kind` is left alone then.
NMAXmlElement* FindInfo(NMAXmlElement& valueInfo, ncfUInt32& kind) {
    for (ncfUInt32 i = 0; i < kParamKindCount; ++i) {
        NMAXmlElement* const found = valueInfo.FindChild(NMAString(kParamKindNames[i].info), 0);
        if (found) {
            kind = i;
            return found;
        }
    }
    return nullptr;
}

ncfUInt32 ReadNumber(NMAXmlElement& element, const char* attribute) {
    ncfUInt32 value = 0;
    ParamText::Read(GetParamAttribute(element, attribute), value);
    return value;
}

}  // namespace

NMAXmlElement& NMAParamValueInfo::infoElement(NMAParamKind kind) const {
    NMAXmlElement* const found = Element().FindChild(NMAString(kParamKindNames[kind].info), 0);
    if (!found) {
        ThrowIfFailed(NCF_E_UNEXPECTED);
    }
    return *found;
}

ncfUInt32 NMAParamValueInfo::GetKind() const {
    ncfUInt32 kind = kParamKindOpaque;
    FindInfo(Element(), kind);
    return kind;
}

NCFRESULT NMAParamValueInfo::SetKind(ncfUInt32 kind) {
    ncfUInt32 oldKind = kParamKindOpaque;
    NMAXmlElement* const old = FindInfo(Element(), oldKind);
    if (old && old->Origin() == NMAXmlNode::kOriginMemory) {
        RemoveParamElement(Element(), old);
    } else if (old) {
        old->MarkDeleted();
    }
    AddParamElement(Element(), kind < kParamKindCount ? kParamKindNames[kind].info : "");
    return NCF_OK;
}

NCFRESULT NMAParamValueInfo::GetBooleanInfo(bool& outDefault, NMAString& outTrueString,
                                            NMAString& outFalseString) const {
    NMAXmlElement& info = infoElement(kParamKindBoolean);
    const NMAString trueString = GetParamAttribute(info, kParamTrueString);
    const NMAString falseString = GetParamAttribute(info, kParamFalseString);
    outDefault = GetParamFlag(info, kParamDefault);
    outTrueString = trueString;
    outFalseString = falseString;
    return NCF_OK;
}

NCFRESULT NMAParamValueInfo::SetBooleanInfo(bool defaultValue, const NMAString& trueString,
                                            const NMAString& falseString) {
    NMAXmlElement& info = infoElement(kParamKindBoolean);
    SetParamFlag(info, kParamDefault, defaultValue);
    info.SetAttribute(NMAString(kParamTrueString), trueString);
    info.SetAttribute(NMAString(kParamFalseString), falseString);
    return NCF_OK;
}

NCFRESULT NMAParamValueInfo::GetDiscreteInfo(ncfUInt32** outValues, ncfUInt32* outCount,
                                             ncfUInt32* outDefault) const {
    NMAXmlElement& info = infoElement(kParamKindDiscrete);
    const ncfUInt32 defaultValue = ReadNumber(info, kParamDefault);
    std::vector<NMAXmlElement*> choices;
    info.CollectChildren(NMAString(kParamDiscrete), choices);
    if (choices.empty()) {
        ThrowIfFailed(NCF_E_UNEXPECTED);
    }
    std::unique_ptr<ncfUInt32[]> values(new ncfUInt32[choices.size()]);
    for (std::size_t i = 0; i < choices.size(); ++i) {
        values[i] = ReadNumber(*choices[i], kParamValue);
    }
    *outValues = values.release();
    *outCount = static_cast<ncfUInt32>(choices.size());
    *outDefault = defaultValue;
    return NCF_OK;
}

NCFRESULT NMAParamValueInfo::SetDiscreteInfo(const ncfUInt32* values, ncfUInt32 count,
                                             ncfUInt32 defaultValue) {
    NMAXmlElement& info = infoElement(kParamKindDiscrete);
    if (!values && count > 0) {
        ThrowIfFailed(NCF_E_INVALIDARG);
    }
    info.SetAttribute(NMAString(kParamDefault), ParamText::Write(defaultValue));
    info.RemoveChildren(NMAString(kParamDiscrete));
    for (ncfUInt32 i = 0; i < count; ++i) {
        const NMAString number = ParamText::Write(values[i]);
        NMAXmlElement* const choice = AddParamElement(info, kParamDiscrete);
        choice->SetAttribute(NMAString(kParamValue), number);
        choice->SetText(number);
    }
    return NCF_OK;
}

}  // namespace NMA::XMLUtils
