// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "source/parameters/xml/NMAXmlElement.h"

namespace NMA::XMLUtils {

// Base of the typed views on a parameter document. A view holds no data: each
// operation reads or writes the one element that it points to. The document
// owns the element, so a view is good while the document lives and the element
// is not removed.
//
// A view is made empty by the caller and filled by an operation of the parent.
// Unless an operation says otherwise it returns NCF_OK and throws its failures:
// NMA_E_NOTINITIALIZED for a view that was never filled, NMA_E_NODATA for a
// child or attribute that is not there, NCF_E_UNEXPECTED for a text that can't
// be read, NCF_E_ABORT for the adding of a key that is taken. What was changed
// before a failure stays changed; outputs stay as they were.
class NMAParamElement {
public:
    NMAParamElement() = default;
    virtual ~NMAParamElement();
    NMAParamElement(const NMAParamElement&) = default;
    NMAParamElement& operator=(const NMAParamElement&) = default;

    // How a parent hands a child out.
    void SetElement(NMAXmlElement* element) { element_ = element; }

protected:
    NMAXmlElement& Element() const;

private:
    NMAXmlElement* element_ = nullptr;  // the document's
};

// Points `out` at an element; NCF_OK.
NCFRESULT FillParam(NMAParamElement& out, NMAXmlElement* element);

}  // namespace NMA::XMLUtils
