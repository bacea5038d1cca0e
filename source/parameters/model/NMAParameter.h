// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/parameters/DocumentWords.h"
#include "source/parameters/model/NMAParamElement.h"
#include "source/parameters/model/ParamItems.h"
#include "source/parameters/model/ParamText.h"

namespace NMA::XMLUtils {

// One value of a set. Reading or writing it as another kind than it has throws
// NCF_E_UNEXPECTED. Opaque values and labels pass through untouched.
class NMAParameter : public NMAParamElement {
public:
    NCFRESULT GetID(GUID& out) const {
        out = GetParamId(Element());
        return NCF_OK;
    }
    bool IsSilent() const { return GetParamFlag(Element(), kParamSilent); }
    NCFRESULT SetSilent(bool silent) {
        SetParamFlag(Element(), kParamSilent, silent);
        return NCF_OK;
    }

    NCFRESULT GetSInt32(ncfSInt32& out) const { return read(valueElement(kParamKindSInt32), out); }
    NCFRESULT SetSInt32(ncfSInt32 value) {
        return write(valueElement(kParamKindSInt32), ParamText::Write(value));
    }
    // Discrete values too.
    NCFRESULT GetUInt32(ncfUInt32& out) const { return read(uint32Element(), out); }
    NCFRESULT SetUInt32(ncfUInt32 value) { return write(uint32Element(), ParamText::Write(value)); }
    NCFRESULT GetSInt64(ncfSInt64& out) const { return read(valueElement(kParamKindSInt64), out); }
    NCFRESULT SetSInt64(ncfSInt64 value) {
        return write(valueElement(kParamKindSInt64), ParamText::Write(value));
    }
    NCFRESULT GetUInt64(ncfUInt64& out) const { return read(valueElement(kParamKindUInt64), out); }
    NCFRESULT SetUInt64(ncfUInt64 value) {
        return write(valueElement(kParamKindUInt64), ParamText::Write(value));
    }
    // What is read is not what was set: see ParamText.
    NCFRESULT GetDouble(double& out) const { return read(valueElement(kParamKindDouble), out); }
    NCFRESULT SetDouble(double value) {
        return write(valueElement(kParamKindDouble), ParamText::Write(value));
    }
    NCFRESULT GetRational(NMAParamRational& out) const {
        return read(valueElement(kParamKindRational), out);
    }
    NCFRESULT SetRational(const NMAParamRational& value) {
        return write(valueElement(kParamKindRational), ParamText::Write(value));
    }
    NCFRESULT GetBoolean(bool& out) const {
        out = ParamText::IsTrue(textOf(valueElement(kParamKindBoolean)));
        return NCF_OK;
    }
    NCFRESULT SetBoolean(bool value) {
        return write(valueElement(kParamKindBoolean), ParamText::WriteFlag(value));
    }
    NCFRESULT GetString(NMAString& out) const {
        valueElement(kParamKindString).GetText(out);
        return NCF_OK;
    }
    NCFRESULT SetString(const NMAString& value) {
        return write(valueElement(kParamKindString), value);
    }

private:
    NMAXmlElement& valueElement(NMAParamKind kind) const;
    NMAXmlElement& uint32Element() const;
    static NMAString textOf(NMAXmlElement& element) {
        NMAString text;
        element.GetText(text);
        return text;
    }
    template <class Value>
    static NCFRESULT read(NMAXmlElement& element, Value& out) {
        ParamText::Read(textOf(element), out);
        return NCF_OK;
    }
    static NCFRESULT write(NMAXmlElement& element, const NMAString& text) {
        element.SetText(text);
        return NCF_OK;
    }
};

}  // namespace NMA::XMLUtils
