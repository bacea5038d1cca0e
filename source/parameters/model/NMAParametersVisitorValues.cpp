// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Values by address: each read leaves the document for update in place, each
// write hands it over.

#include "source/parameters/model/NMAParametersVisitor.h"

namespace NMA::XMLUtils {

NMAParameter NMAParametersVisitor::open(const GUID& component, ncfUInt32 track, const GUID& set,
                                        const GUID& parameter) {
    BeginUpdate();
    NMAParameter found;
    FindParameter(component, track, set, parameter, found);
    return found;
}

NCFRESULT NMAParametersVisitor::GetUInt32(const GUID& component, ncfUInt32 track, const GUID& set,
                                          const GUID& parameter, ncfUInt32& out) {
    return open(component, track, set, parameter).GetUInt32(out);
}

NCFRESULT NMAParametersVisitor::GetSInt32(const GUID& component, ncfUInt32 track, const GUID& set,
                                          const GUID& parameter, ncfSInt32& out) {
    return open(component, track, set, parameter).GetSInt32(out);
}

NCFRESULT NMAParametersVisitor::GetUInt64(const GUID& component, ncfUInt32 track, const GUID& set,
                                          const GUID& parameter, ncfUInt64& out) {
    return open(component, track, set, parameter).GetUInt64(out);
}

NCFRESULT NMAParametersVisitor::GetSInt64(const GUID& component, ncfUInt32 track, const GUID& set,
                                          const GUID& parameter, ncfSInt64& out) {
    return open(component, track, set, parameter).GetSInt64(out);
}

NCFRESULT NMAParametersVisitor::GetDouble(const GUID& component, ncfUInt32 track, const GUID& set,
                                          const GUID& parameter, double& out) {
    return open(component, track, set, parameter).GetDouble(out);
}

NCFRESULT NMAParametersVisitor::GetRational(const GUID& component, ncfUInt32 track, const GUID& set,
                                            const GUID& parameter, NMAParamRational& out) {
    return open(component, track, set, parameter).GetRational(out);
}

NCFRESULT NMAParametersVisitor::GetString(const GUID& component, ncfUInt32 track, const GUID& set,
                                          const GUID& parameter, NMAString& out) {
    return open(component, track, set, parameter).GetString(out);
}

NCFRESULT NMAParametersVisitor::GetBoolean(const GUID& component, ncfUInt32 track, const GUID& set,
                                           const GUID& parameter, bool& out) {
    return open(component, track, set, parameter).GetBoolean(out);
}

NCFRESULT NMAParametersVisitor::SetUInt32(const GUID& component, ncfUInt32 track, const GUID& set,
                                          const GUID& parameter, ncfUInt32 value) {
    open(component, track, set, parameter).SetUInt32(value);
    return EndUpdate();
}

NCFRESULT NMAParametersVisitor::SetSInt32(const GUID& component, ncfUInt32 track, const GUID& set,
                                          const GUID& parameter, ncfSInt32 value) {
    open(component, track, set, parameter).SetSInt32(value);
    return EndUpdate();
}

NCFRESULT NMAParametersVisitor::SetUInt64(const GUID& component, ncfUInt32 track, const GUID& set,
                                          const GUID& parameter, ncfUInt64 value) {
    open(component, track, set, parameter).SetUInt64(value);
    return EndUpdate();
}

NCFRESULT NMAParametersVisitor::SetSInt64(const GUID& component, ncfUInt32 track, const GUID& set,
                                          const GUID& parameter, ncfSInt64 value) {
    open(component, track, set, parameter).SetSInt64(value);
    return EndUpdate();
}

NCFRESULT NMAParametersVisitor::SetDouble(const GUID& component, ncfUInt32 track, const GUID& set,
                                          const GUID& parameter, double value) {
    open(component, track, set, parameter).SetDouble(value);
    return EndUpdate();
}

NCFRESULT NMAParametersVisitor::SetRational(const GUID& component, ncfUInt32 track, const GUID& set,
                                            const GUID& parameter, const NMAParamRational& value) {
    open(component, track, set, parameter).SetRational(value);
    return EndUpdate();
}

NCFRESULT NMAParametersVisitor::SetString(const GUID& component, ncfUInt32 track, const GUID& set,
                                          const GUID& parameter, const NMAString& value) {
    open(component, track, set, parameter).SetString(value);
    return EndUpdate();
}

NCFRESULT NMAParametersVisitor::SetBoolean(const GUID& component, ncfUInt32 track, const GUID& set,
                                           const GUID& parameter, bool value) {
    open(component, track, set, parameter).SetBoolean(value);
    return EndUpdate();
}

}  // namespace NMA::XMLUtils
