// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "source/parameters/xml/NMAXmlElement.h"

// What the typed classes of the parameter document share: element children that
// are addressed by index or by an attribute, and children that hold a text.
// Names are of DocumentWords.h. Failures are thrown.
namespace NMA::XMLUtils {

// The attribute by which an item is found among its kind; case does not count.
struct ParamKey {
    NMAString attribute;
    NMAString value;
};
ParamKey ParamIdKey(const GUID& id);
ParamKey ParamNumberKey(ncfUInt32 number);

ncfUInt32 CountParamItems(NMAXmlElement& parent, const char* name);
ncfUInt32 CountParamItems(NMAXmlElement& parent, const char* name, const ParamKey& key);
// Null when there is none; the others throw NMA_E_NODATA.
NMAXmlElement* FindParamItem(NMAXmlElement& parent, const char* name, const ParamKey& key);
NMAXmlElement* GetParamItem(NMAXmlElement& parent, const char* name, const ParamKey& key);
NMAXmlElement* GetParamItemAt(NMAXmlElement& parent, const char* name, ncfUInt32 index);
// The key must be free, else NCF_E_ABORT.
void RequireFreeParamKey(NMAXmlElement& parent, const char* name, const ParamKey& key);
// Appends an item that has the key as its attribute.
NMAXmlElement* AddParamItem(NMAXmlElement& parent, const char* name, const ParamKey& key);
// Appends an element without attributes.
NMAXmlElement* AddParamElement(NMAXmlElement& parent, const char* name);
// Takes a child out and deletes it, wherever it came from.
void RemoveParamElement(NMAXmlElement& parent, NMAXmlElement* child);
void RemoveParamItem(NMAXmlElement& parent, const char* name, const ParamKey& key);

// The text of the first child of that name; NMA_E_NODATA without such a child.
void GetParamText(NMAXmlElement& parent, const char* name, NMAString& out);
// Replaces that text; makes the child when there is none.
void SetParamText(NMAXmlElement& parent, const char* name, const NMAString& text);

// Attributes. An absent one throws NMA_E_NODATA, in whatever form it is read.
NMAString GetParamAttribute(NMAXmlElement& element, const char* name);
GUID GetParamId(NMAXmlElement& element);
bool GetParamFlag(NMAXmlElement& element, const char* name);
void SetParamFlag(NMAXmlElement& element, const char* name, bool value);

}  // namespace NMA::XMLUtils
