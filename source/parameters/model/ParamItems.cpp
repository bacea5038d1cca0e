// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/parameters/model/ParamItems.h"

#include <memory>

#include "host_interfaces/parameters/DocumentWords.h"
#include "source/parameters/model/ParamText.h"
#include "source/plugin/ResultChecks.h"

namespace NMA::XMLUtils {
namespace {

// Borrows the key's texts.
NMAXmlPair PairOf(const ParamKey& key) {
    return {key.attribute.GetWCHARString(), key.value.GetWCHARString()};
}

NMAXmlElement* Required(NMAXmlElement* found) {
    if (!found) {
        ThrowIfFailed(NMA_E_NODATA);
    }
    return found;
}

}  // namespace

ParamKey ParamIdKey(const GUID& id) {
    return {NMAString(kParamId), ParamText::Write(id)};
}

ParamKey ParamNumberKey(ncfUInt32 number) {
    return {NMAString(kParamNumber), ParamText::Write(number)};
}

ncfUInt32 CountParamItems(NMAXmlElement& parent, const char* name) {
    return parent.CountChildren(NMAString(name));
}

ncfUInt32 CountParamItems(NMAXmlElement& parent, const char* name, const ParamKey& key) {
    const NMAXmlPair pair = PairOf(key);
    return parent.CountChildrenWithAttributes(NMAString(name), &pair, 1);
}

NMAXmlElement* FindParamItem(NMAXmlElement& parent, const char* name, const ParamKey& key) {
    const NMAXmlPair pair = PairOf(key);
    return parent.FindChildWithAttributes(NMAString(name), &pair, 1, 0);
}

NMAXmlElement* GetParamItem(NMAXmlElement& parent, const char* name, const ParamKey& key) {
    return Required(FindParamItem(parent, name, key));
}

NMAXmlElement* GetParamItemAt(NMAXmlElement& parent, const char* name, ncfUInt32 index) {
    return Required(parent.FindChild(NMAString(name), index));
}

void RequireFreeParamKey(NMAXmlElement& parent, const char* name, const ParamKey& key) {
    if (FindParamItem(parent, name, key)) {
        ThrowIfFailed(NCF_E_ABORT);
    }
}

NMAXmlElement* AddParamItem(NMAXmlElement& parent, const char* name, const ParamKey& key) {
    RequireFreeParamKey(parent, name, key);
    NMAXmlElement* const added = AddParamElement(parent, name);
    added->SetAttribute(key.attribute, key.value);
    return added;
}

NMAXmlElement* AddParamElement(NMAXmlElement& parent, const char* name) {
    NMAXmlElement* added = nullptr;
    parent.AddChildElement(NMAString(name), &added);
    return added;
}

void RemoveParamElement(NMAXmlElement& parent, NMAXmlElement* child) {
    const std::unique_ptr<NMAXmlElement> removed(child);
    parent.RemoveChild(child);
}

void RemoveParamItem(NMAXmlElement& parent, const char* name, const ParamKey& key) {
    RemoveParamElement(parent, GetParamItem(parent, name, key));
}

void GetParamText(NMAXmlElement& parent, const char* name, NMAString& out) {
    GetParamItemAt(parent, name, 0)->GetText(out);
}

void SetParamText(NMAXmlElement& parent, const char* name, const NMAString& text) {
    NMAXmlElement* const child = parent.FindChild(NMAString(name), 0);
    if (child) {
        child->SetText(text);
    } else {
        parent.AddChildElementWithText(NMAString(name), text);
    }
}

NMAString GetParamAttribute(NMAXmlElement& element, const char* name) {
    NMAString value;
    element.GetAttribute(NMAString(name), value);
    return value;
}

GUID GetParamId(NMAXmlElement& element) {
    GUID id{};
    ParamText::Read(GetParamAttribute(element, kParamId), id);
    return id;
}

bool GetParamFlag(NMAXmlElement& element, const char* name) {
    return ParamText::IsTrue(GetParamAttribute(element, name));
}

void SetParamFlag(NMAXmlElement& element, const char* name, bool value) {
    element.SetAttribute(NMAString(name), ParamText::WriteFlag(value));
}

}  // namespace NMA::XMLUtils
