// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/parameters/NMAParameterSuite.h"

#include "source/parameters/ParamItems.h"
#include "source/parameters/ParamVocabulary.h"
#include "source/plugin/ResultChecks.h"

namespace NMA::XMLUtils {

NMAParameterSuite::~NMAParameterSuite() = default;

NMAXmlElement& NMAParameterSuite::root() const {
    if (!GetRoot()) {
        ThrowIfFailed(NMA_E_NOTINITIALIZED);
    }
    return *GetRoot();
}

ncfUInt32 NMAParameterSuite::GetComponentCount() const {
    return CountParamItems(root(), kParamComponent);
}

NCFRESULT NMAParameterSuite::GetComponentAt(ncfUInt32 index, NMAParamComponent& out) const {
    return FillParam(out, GetParamItemAt(root(), kParamComponent, index));
}

NCFRESULT NMAParameterSuite::GetComponent(const GUID& id, NMAParamComponent& out) const {
    return FillParam(out, GetParamItem(root(), kParamComponent, ParamIdKey(id)));
}

NCFRESULT NMAParameterSuite::AddComponent(const GUID& id, NMAParamComponent& out) {
    return FillParam(out, AddParamItem(root(), kParamComponent, ParamIdKey(id)));
}

NCFRESULT NMAParameterSuite::RemoveComponent(const GUID& id) {
    RemoveParamItem(root(), kParamComponent, ParamIdKey(id));
    return NCF_OK;
}

}  // namespace NMA::XMLUtils
