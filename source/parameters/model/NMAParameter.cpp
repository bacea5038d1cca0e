// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/parameters/model/NMAParameter.h"

#include "source/parameters/model/ParamItems.h"
#include "source/plugin/ResultChecks.h"

namespace NMA::XMLUtils {
namespace {

NMAXmlElement* FindValue(NMAXmlElement& parameter, NMAParamKind kind) {
    return parameter.FindChild(NMAString(kParamKindNames[kind].value), 0);
}

NMAString TextOf(NMAXmlElement& element) {
    NMAString text;
    element.GetText(text);
    return text;
}

NCFRESULT Write(NMAXmlElement& element, const NMAString& text) {
    element.SetText(text);
    return NCF_OK;
}

}  // namespace

NMAParameter::~NMAParameter() = default;

NMAXmlElement& NMAParameter::valueElement(NMAParamKind kind) const {
    NMAXmlElement* const found = FindValue(Element(), kind);
    if (!found) {
        ThrowIfFailed(NCF_E_UNEXPECTED);
    }
    return *found;
}

NMAXmlElement& NMAParameter::uint32Element() const {
    NMAXmlElement* const found = FindValue(Element(), kParamKindUInt32);
    return found ? *found : valueElement(kParamKindDiscrete);
}

template <class Value>
NCFRESULT NMAParameter::read(NMAXmlElement& element, Value& out) {
    ParamText::Read(TextOf(element), out);
    return NCF_OK;
}

NCFRESULT NMAParameter::GetID(GUID& out) const {
    out = GetParamId(Element());
    return NCF_OK;
}

bool NMAParameter::IsSilent() const {
    return GetParamFlag(Element(), kParamSilent);
}

NCFRESULT NMAParameter::SetSilent(bool silent) {
    SetParamFlag(Element(), kParamSilent, silent);
    return NCF_OK;
}

NCFRESULT NMAParameter::GetSInt32(ncfSInt32& out) const {
    return read(valueElement(kParamKindSInt32), out);
}

NCFRESULT NMAParameter::SetSInt32(ncfSInt32 value) {
    return Write(valueElement(kParamKindSInt32), ParamText::Write(value));
}

NCFRESULT NMAParameter::GetUInt32(ncfUInt32& out) const {
    return read(uint32Element(), out);
}

NCFRESULT NMAParameter::SetUInt32(ncfUInt32 value) {
    return Write(uint32Element(), ParamText::Write(value));
}

NCFRESULT NMAParameter::GetSInt64(ncfSInt64& out) const {
    return read(valueElement(kParamKindSInt64), out);
}

NCFRESULT NMAParameter::SetSInt64(ncfSInt64 value) {
    return Write(valueElement(kParamKindSInt64), ParamText::Write(value));
}

NCFRESULT NMAParameter::GetUInt64(ncfUInt64& out) const {
    return read(valueElement(kParamKindUInt64), out);
}

NCFRESULT NMAParameter::SetUInt64(ncfUInt64 value) {
    return Write(valueElement(kParamKindUInt64), ParamText::Write(value));
}

NCFRESULT NMAParameter::GetDouble(double& out) const {
    return read(valueElement(kParamKindDouble), out);
}

NCFRESULT NMAParameter::SetDouble(double value) {
    return Write(valueElement(kParamKindDouble), ParamText::Write(value));
}

NCFRESULT NMAParameter::GetRational(NMAParamRational& out) const {
    return read(valueElement(kParamKindRational), out);
}

NCFRESULT NMAParameter::SetRational(const NMAParamRational& value) {
    return Write(valueElement(kParamKindRational), ParamText::Write(value));
}

NCFRESULT NMAParameter::GetBoolean(bool& out) const {
    out = ParamText::IsTrue(TextOf(valueElement(kParamKindBoolean)));
    return NCF_OK;
}

NCFRESULT NMAParameter::SetBoolean(bool value) {
    return Write(valueElement(kParamKindBoolean), ParamText::WriteFlag(value));
}

NCFRESULT NMAParameter::GetString(NMAString& out) const {
    valueElement(kParamKindString).GetText(out);
    return NCF_OK;
}

NCFRESULT NMAParameter::SetString(const NMAString& value) {
    return Write(valueElement(kParamKindString), value);
}

}  // namespace NMA::XMLUtils
