// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "source/parameters/NMAParamElement.h"
#include "source/parameters/ParamText.h"
#include "source/parameters/ParamVocabulary.h"

namespace NMA::XMLUtils {

// What a parameter's value may be. The kind is that of the one child element;
// Get...Info and Set...Info of another kind throw NCF_E_UNEXPECTED.
class NMAParamValueInfo : public NMAParamElement {
public:
    ~NMAParamValueInfo() override;

    // kParamKindOpaque when there is no child.
    ncfUInt32 GetKind() const;
    // Makes way for the new kind, whose attributes are then to be set. A child
    // that was read from a text is only marked, and met by all operations until
    // the document is saved: GetKind may still answer its kind, and setting the
    // attributes of that kind goes to it and takes the mark away. A number that
    // is no kind leaves an element that can't be saved.
    NCFRESULT SetKind(ncfUInt32 kind);

    NCFRESULT GetSInt32Info(ncfSInt32& outMax, ncfSInt32& outMin, ncfSInt32& outDefault) const;
    NCFRESULT SetSInt32Info(ncfSInt32 max, ncfSInt32 min, ncfSInt32 defaultValue);
    NCFRESULT GetUInt32Info(ncfUInt32& outMax, ncfUInt32& outMin, ncfUInt32& outDefault) const;
    NCFRESULT SetUInt32Info(ncfUInt32 max, ncfUInt32 min, ncfUInt32 defaultValue);
    NCFRESULT GetSInt64Info(ncfSInt64& outMax, ncfSInt64& outMin, ncfSInt64& outDefault) const;
    NCFRESULT SetSInt64Info(ncfSInt64 max, ncfSInt64 min, ncfSInt64 defaultValue);
    NCFRESULT GetUInt64Info(ncfUInt64& outMax, ncfUInt64& outMin, ncfUInt64& outDefault) const;
    NCFRESULT SetUInt64Info(ncfUInt64 max, ncfUInt64 min, ncfUInt64 defaultValue);
    // What is read is not what was set: see ParamText.
    NCFRESULT GetDoubleInfo(double& outMax, double& outMin, double& outDefault) const;
    NCFRESULT SetDoubleInfo(double max, double min, double defaultValue);
    NCFRESULT GetRationalInfo(NMAParamRational& outMax, NMAParamRational& outMin,
                              NMAParamRational& outDefault) const;
    NCFRESULT SetRationalInfo(const NMAParamRational& max, const NMAParamRational& min,
                              const NMAParamRational& defaultValue);

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
    NCFRESULT getRange(NMAParamKind kind, Value& outMax, Value& outMin, Value& outDefault) const;
    template <class Value>
    NCFRESULT setRange(NMAParamKind kind, const Value& max, const Value& min,
                       const Value& defaultValue);
};

}  // namespace NMA::XMLUtils
