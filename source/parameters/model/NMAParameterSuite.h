// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "source/parameters/model/NMAParamComponent.h"
#include "source/parameters/xml/NMAXmlDoc.h"

namespace NMA::XMLUtils {

// A whole parameter document. The name of its root is not looked at. Failures
// are thrown as the views throw them; NMA_E_NOTINITIALIZED before a document is
// loaded or a root made.
class NMAParameterSuite : public NMAXmlDoc {
public:
    using NMAXmlDoc::NMAXmlDoc;
    ~NMAParameterSuite() override;

    ncfUInt32 GetComponentCount() const;
    NCFRESULT GetComponentAt(ncfUInt32 index, NMAParamComponent& out) const;
    NCFRESULT GetComponent(const GUID& id, NMAParamComponent& out) const;
    NCFRESULT AddComponent(const GUID& id, NMAParamComponent& out);
    NCFRESULT RemoveComponent(const GUID& id);

private:
    NMAXmlElement& root() const;
};

}  // namespace NMA::XMLUtils
