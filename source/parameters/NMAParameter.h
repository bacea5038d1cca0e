// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "source/parameters/NMAParamElement.h"
#include "source/parameters/ParamText.h"
#include "source/parameters/ParamVocabulary.h"

namespace NMA::XMLUtils {

// One value of a set. Reading or writing it as another kind than it has throws
// NCF_E_UNEXPECTED. Opaque values and labels pass through untouched.
class NMAParameter : public NMAParamElement {
public:
    ~NMAParameter() override;

    NCFRESULT GetID(GUID& out) const;
    bool IsSilent() const;
    NCFRESULT SetSilent(bool silent);

    NCFRESULT GetSInt32(ncfSInt32& out) const;
    NCFRESULT SetSInt32(ncfSInt32 value);
    // Discrete values too.
    NCFRESULT GetUInt32(ncfUInt32& out) const;
    NCFRESULT SetUInt32(ncfUInt32 value);
    NCFRESULT GetSInt64(ncfSInt64& out) const;
    NCFRESULT SetSInt64(ncfSInt64 value);
    NCFRESULT GetUInt64(ncfUInt64& out) const;
    NCFRESULT SetUInt64(ncfUInt64 value);
    // What is read is not what was set: see ParamText.
    NCFRESULT GetDouble(double& out) const;
    NCFRESULT SetDouble(double value);
    NCFRESULT GetRational(NMAParamRational& out) const;
    NCFRESULT SetRational(const NMAParamRational& value);
    NCFRESULT GetBoolean(bool& out) const;
    NCFRESULT SetBoolean(bool value);
    NCFRESULT GetString(NMAString& out) const;
    NCFRESULT SetString(const NMAString& value);

private:
    NMAXmlElement& valueElement(NMAParamKind kind) const;
    NMAXmlElement& uint32Element() const;
    template <class Value>
    static NCFRESULT read(NMAXmlElement& element, Value& out);
};

}  // namespace NMA::XMLUtils
