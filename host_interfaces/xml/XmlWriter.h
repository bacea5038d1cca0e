// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/framework/String.h"

// Builds an XML text from events. It hears of no element's end: each event
// closes down to the nearest open element that has the parent's name. Two
// groups of one name side by side in a third of that name then nest wrongly.
struct IXmlWriter : INCFUnknown {
    // 3. Null: in memory.
    virtual NCFRESULT Open(INCFString* path) = 0;
    // 4. Ends the document and writes the file.
    virtual NCFRESULT Close() = 0;
    // 5. The whole text, complete without Close; a new reference.
    virtual NCFRESULT GetText(INCFString** text) = 0;
    // 6. Of the last element of that name, before its content.
    virtual NCFRESULT Attribute(INCFString* element, INCFString* name, INCFString* value) = 0;
    // 7. A null parent makes the root.
    virtual NCFRESULT Element(INCFString* name, INCFString* parent) = 0;
    // 8. Escaped by the writer.
    virtual NCFRESULT Text(INCFString* text, INCFString* parent) = 0;

protected:
    ~IXmlWriter() = default;
};

inline constexpr GUID kCLSID_XmlWriter = ncfGuid("B2DF3638-109F-4C00-8BD5-F3117B79B583");
inline constexpr GUID kIID_XmlWriter = ncfGuid("93B7F857-263B-463E-9EF9-9C66AC80C51C");
constexpr const GUID& ncfIdOf(const IXmlWriter*) {
    return kIID_XmlWriter;
}
