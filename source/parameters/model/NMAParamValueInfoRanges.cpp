// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// The kinds of values that have a range: largest, smallest, default.

#include "source/parameters/model/NMAParamValueInfo.h"
#include "source/parameters/model/ParamItems.h"

namespace NMA::XMLUtils {

template <class Value>
NCFRESULT NMAParamValueInfo::getRange(NMAParamKind kind, Value& outMax, Value& outMin,
                                      Value& outDefault) const {
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
NCFRESULT NMAParamValueInfo::setRange(NMAParamKind kind, const Value& max, const Value& min,
                                      const Value& defaultValue) {
    NMAXmlElement& info = infoElement(kind);
    info.SetAttribute(NMAString(kParamMax), ParamText::Write(max));
    info.SetAttribute(NMAString(kParamMin), ParamText::Write(min));
    info.SetAttribute(NMAString(kParamDefault), ParamText::Write(defaultValue));
    return NCF_OK;
}

NCFRESULT NMAParamValueInfo::GetSInt32Info(ncfSInt32& outMax, ncfSInt32& outMin,
                                           ncfSInt32& outDefault) const {
    return getRange(kParamKindSInt32, outMax, outMin, outDefault);
}

NCFRESULT NMAParamValueInfo::SetSInt32Info(ncfSInt32 max, ncfSInt32 min, ncfSInt32 defaultValue) {
    return setRange(kParamKindSInt32, max, min, defaultValue);
}

NCFRESULT NMAParamValueInfo::GetUInt32Info(ncfUInt32& outMax, ncfUInt32& outMin,
                                           ncfUInt32& outDefault) const {
    return getRange(kParamKindUInt32, outMax, outMin, outDefault);
}

NCFRESULT NMAParamValueInfo::SetUInt32Info(ncfUInt32 max, ncfUInt32 min, ncfUInt32 defaultValue) {
    return setRange(kParamKindUInt32, max, min, defaultValue);
}

NCFRESULT NMAParamValueInfo::GetSInt64Info(ncfSInt64& outMax, ncfSInt64& outMin,
                                           ncfSInt64& outDefault) const {
    return getRange(kParamKindSInt64, outMax, outMin, outDefault);
}

NCFRESULT NMAParamValueInfo::SetSInt64Info(ncfSInt64 max, ncfSInt64 min, ncfSInt64 defaultValue) {
    return setRange(kParamKindSInt64, max, min, defaultValue);
}

NCFRESULT NMAParamValueInfo::GetUInt64Info(ncfUInt64& outMax, ncfUInt64& outMin,
                                           ncfUInt64& outDefault) const {
    return getRange(kParamKindUInt64, outMax, outMin, outDefault);
}

NCFRESULT NMAParamValueInfo::SetUInt64Info(ncfUInt64 max, ncfUInt64 min, ncfUInt64 defaultValue) {
    return setRange(kParamKindUInt64, max, min, defaultValue);
}

NCFRESULT NMAParamValueInfo::GetDoubleInfo(double& outMax, double& outMin,
                                           double& outDefault) const {
    return getRange(kParamKindDouble, outMax, outMin, outDefault);
}

NCFRESULT NMAParamValueInfo::SetDoubleInfo(double max, double min, double defaultValue) {
    return setRange(kParamKindDouble, max, min, defaultValue);
}

NCFRESULT NMAParamValueInfo::GetRationalInfo(NMAParamRational& outMax, NMAParamRational& outMin,
                                             NMAParamRational& outDefault) const {
    return getRange(kParamKindRational, outMax, outMin, outDefault);
}

NCFRESULT NMAParamValueInfo::SetRationalInfo(const NMAParamRational& max,
                                             const NMAParamRational& min,
                                             const NMAParamRational& defaultValue) {
    return setRange(kParamKindRational, max, min, defaultValue);
}

}  // namespace NMA::XMLUtils
