// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/parameters/DocumentWords.h"
#include "source/parameters/model/NMAParamElement.h"
#include "source/parameters/model/ParamItems.h"
#include "source/parameters/model/ParamText.h"

namespace NMA::XMLUtils {

// What a parameter's value may be. The kind is that of the one child element;
// Get...Info and Set...Info of another kind throw NCF_E_UNEXPECTED.
class NMAParamValueInfo : public NMAParamElement {
public:
    // kParamKindOpaque when there is no child.
    ncfUInt32 GetKind() const;
    // Makes way for the new kind, whose attributes are then to be set. A child
    // that was read from a text is only marked, and met by all operations until
    // the document is saved: GetKind may still answer its kind, and setting the
    // attributes of that kind goes to it and takes the mark away. A number that
    // is no kind leaves an element that can't be saved.
    NCFRESULT SetKind(ncfUInt32 kind);

    NCFRESULT GetSInt32Info(ncfSInt32& outMax, ncfSInt32& outMin, ncfSInt32& outDefault) const {
        return getRange(kParamKindSInt32, outMax, outMin, outDefault);
    }
    NCFRESULT SetSInt32Info(ncfSInt32 max, ncfSInt32 min, ncfSInt32 defaultValue) {
        return setRange(kParamKindSInt32, max, min, defaultValue);
    }
    NCFRESULT GetUInt32Info(ncfUInt32& outMax, ncfUInt32& outMin, ncfUInt32& outDefault) const {
        return getRange(kParamKindUInt32, outMax, outMin, outDefault);
    }
    NCFRESULT SetUInt32Info(ncfUInt32 max, ncfUInt32 min, ncfUInt32 defaultValue) {
        return setRange(kParamKindUInt32, max, min, defaultValue);
    }
    NCFRESULT GetSInt64Info(ncfSInt64& outMax, ncfSInt64& outMin, ncfSInt64& outDefault) const {
        return getRange(kParamKindSInt64, outMax, outMin, outDefault);
    }
    NCFRESULT SetSInt64Info(ncfSInt64 max, ncfSInt64 min, ncfSInt64 defaultValue) {
        return setRange(kParamKindSInt64, max, min, defaultValue);
    }
    NCFRESULT GetUInt64Info(ncfUInt64& outMax, ncfUInt64& outMin, ncfUInt64& outDefault) const {
        return getRange(kParamKindUInt64, outMax, outMin, outDefault);
    }
    NCFRESULT SetUInt64Info(ncfUInt64 max, ncfUInt64 min, ncfUInt64 defaultValue) {
        return setRange(kParamKindUInt64, max, min, defaultValue);
    }
    // What is read is not what was set: see ParamText.
    NCFRESULT GetDoubleInfo(double& outMax, double& outMin, double& outDefault) const {
        return getRange(kParamKindDouble, outMax, outMin, outDefault);
    }
    NCFRESULT SetDoubleInfo(double max, double min, double defaultValue) {
        return setRange(kParamKindDouble, max, min, defaultValue);
    }
    NCFRESULT GetRationalInfo(NMAParamRational& outMax, NMAParamRational& outMin,
                              NMAParamRational& outDefault) const {
        return getRange(kParamKindRational, outMax, outMin, outDefault);
    }
    NCFRESULT SetRationalInfo(const NMAParamRational& max, const NMAParamRational& min,
                              const NMAParamRational& defaultValue) {
        return setRange(kParamKindRational, max, min, defaultValue);
    }

    NCFRESULT GetBooleanInfo(bool& outDefault, NMAString& outTrueString,
                             NMAString& outFalseString) const;
    NCFRESULT SetBooleanInfo(bool defaultValue, const NMAString& trueString,
                             const NMAString& falseString);

    // The values go to the caller, who frees them with delete[]. A list of none
    // throws NCF_E_UNEXPECTED.
    NCFRESULT GetDiscreteInfo(ncfUInt32** outValues, ncfUInt32* outCount,
                              ncfUInt32* outDefault) const;
    // NCF_E_INVALIDARG for values that are null, unless the count is 0. Values
    // that came from a text are only marked, and stand before the new ones until
    // the document is saved. Till then reading gives both, or throws
    // NMA_E_NODATA where the old ones had not been read before.
    NCFRESULT SetDiscreteInfo(const ncfUInt32* values, ncfUInt32 count, ncfUInt32 defaultValue);

private:
    NMAXmlElement& infoElement(NMAParamKind kind) const;
    template <class Value>
    NCFRESULT getRange(NMAParamKind kind, Value& outMax, Value& outMin, Value& outDefault) const {
        NMAXmlElement& info = infoElement(kind);
        Value max{};
        Value min{};
        ParamText::Read(GetParamAttribute(info, kParamMax), max);
        ParamText::Read(GetParamAttribute(info, kParamMin), min);
        ParamText::Read(GetParamAttribute(info, kParamDefault), outDefault);
        outMax = max;
        outMin = min;
        return NCF_OK;
    }

    template <class Value>
    NCFRESULT setRange(NMAParamKind kind, const Value& max, const Value& min,
                       const Value& defaultValue) {
        NMAXmlElement& info = infoElement(kind);
        info.SetAttribute(NMAString(kParamMax), ParamText::Write(max));
        info.SetAttribute(NMAString(kParamMin), ParamText::Write(min));
        info.SetAttribute(NMAString(kParamDefault), ParamText::Write(defaultValue));
        return NCF_OK;
    }
};

}  // namespace NMA::XMLUtils
