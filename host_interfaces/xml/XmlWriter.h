// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/framework/String.h"

// Builds an XML text from events. No event tells where an element ends: each one
// closes elements down to the nearest open one that has the parent's name. So two
// elements of one name, side by side in a third of that name, nest wrongly.
//
// Implemented by the host as a component; the module's XML document model creates
// one for a document that it writes. One thread at a time. Escaping, encoding and
// the declaration are the writer's affair. Strings that go in are copied.
struct IXmlWriter : INCFUnknown {
    // 3. Begins a document: in a file, or in memory with null.
    virtual NCFRESULT Open(INCFString* path) = 0;
    // 4. Ends the document and writes the file.
    virtual NCFRESULT Close() = 0;
    // 5. The whole text, complete without Close. The caller owns the string.
    virtual NCFRESULT GetText(INCFString** text) = 0;
    // 6. Gives the last element of that name an attribute; it has no content yet.
    virtual NCFRESULT Attribute(INCFString* element, INCFString* name, INCFString* value) = 0;
    // 7. Adds an element to the nearest open one named `parent`; null makes the root.
    virtual NCFRESULT Element(INCFString* name, INCFString* parent) = 0;
    // 8. Adds text to the nearest open element named `parent`.
    virtual NCFRESULT Text(INCFString* text, INCFString* parent) = 0;

protected:
    ~IXmlWriter() = default;
};

inline constexpr GUID kCLSID_XmlWriter = ncfGuid("B2DF3638-109F-4C00-8BD5-F3117B79B583");
inline constexpr GUID kIID_XmlWriter = ncfGuid("93B7F857-263B-463E-9EF9-9C66AC80C51C");
constexpr const GUID& ncfIdOf(const IXmlWriter*) {
    return kIID_XmlWriter;
}
