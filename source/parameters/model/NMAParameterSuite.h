// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/parameters/DocumentWords.h"
#include "source/parameters/model/NMAParamComponent.h"
#include "source/parameters/model/ParamItems.h"
#include "source/parameters/xml/NMAXmlDoc.h"

namespace NMA::XMLUtils {

// A whole parameter document. The name of its root is ignored. Failures
// are thrown as the views throw them; NMA_E_NOTINITIALIZED before a document is
// loaded or a root made.
class NMAParameterSuite : public NMAXmlDoc {
public:
    using NMAXmlDoc::NMAXmlDoc;
    ~NMAParameterSuite() override;

    ncfUInt32 GetComponentCount() const { return CountParamItems(root(), kParamComponent); }
    NCFRESULT GetComponentAt(ncfUInt32 index, NMAParamComponent& out) const {
        return FillParam(out, GetParamItemAt(root(), kParamComponent, index));
    }
    NCFRESULT GetComponent(const GUID& id, NMAParamComponent& out) const {
        return FillParam(out, GetParamItem(root(), kParamComponent, ParamIdKey(id)));
    }
    NCFRESULT AddComponent(const GUID& id, NMAParamComponent& out) {
        return FillParam(out, AddParamItem(root(), kParamComponent, ParamIdKey(id)));
    }
    NCFRESULT RemoveComponent(const GUID& id) {
        RemoveParamItem(root(), kParamComponent, ParamIdKey(id));
        return NCF_OK;
    }

private:
    NMAXmlElement& root() const;
};

}  // namespace NMA::XMLUtils
