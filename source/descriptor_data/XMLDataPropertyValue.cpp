// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/descriptor_data/XMLDataPropertyValue.h"

#include "source/plugin/ResultChecks.h"

XMLDataPropertyValue::XMLDataPropertyValue(const XMLDataPropertyDescription* description)
    : description_(description) {
    if (!description) {
        throw NCF_E_HANDLE;
    }
}

XMLDataPropertyValue* XMLDataPropertyValue::NearestNamed(std::string_view property) {
    for (XMLDataPropertyValue* node = this; node; node = node->parent_) {
        XMLDataPropertyValue* const found =
            node->IsNamed(property) ? node : node->FirstChildNamed(property);
        if (found) {
            return found;
        }
    }
    return nullptr;
}

XMLDataPropertyValue* XMLDataPropertyValue::FirstChildNamed(std::string_view property) const {
    for (XMLDataPropertyValue* child : children_) {
        if (child->IsNamed(property)) {
            return child;
        }
    }
    return nullptr;
}

NCFRESULT XMLDataPropertyValue::GetDesc(const XMLDataPropertyDescription** outDesc) const {
    NCF_FUNCTION("XMLDataPropertyValue::GetDesc");
    CHK_INARG(outDesc);
    *outDesc = description_;
    return NCF_OK;
}

NCFRESULT XMLDataPropertyValue::SetValue(const NMAString& value) {
    value_ = value.GetUTF8String();
    return NCF_OK;
}

NCFRESULT XMLDataPropertyValue::GetValue(NMAString* outValue) const {
    NCF_FUNCTION("XMLDataPropertyValue::GetValue");
    CHK_INARG(outValue);
    *outValue = NMAString(value_.c_str());
    return NCF_OK;
}

NCFRESULT XMLDataPropertyValue::SetParent(XMLDataPropertyValue* parent) {
    NCF_FUNCTION("XMLDataPropertyValue::SetParent");
    CHK_INARG(parent);
    parent_ = parent;
    return NCF_OK;
}

NCFRESULT XMLDataPropertyValue::GetParent(XMLDataPropertyValue** outPropertyValue) const {
    NCF_FUNCTION("XMLDataPropertyValue::GetParent");
    CHK_INARG(outPropertyValue);
    *outPropertyValue = parent_;
    return NCF_OK;
}

NCFRESULT XMLDataPropertyValue::AddChild(XMLDataPropertyValue* child) {
    NCF_FUNCTION("XMLDataPropertyValue::AddChild");
    CHK_INARG(child);
    NCF_RETURN(child->SetParent(this));
    children_.push_back(child);
    return NCF_OK;
}

NCFRESULT XMLDataPropertyValue::FindNextProperty(const char* property,
                                                 XMLDataPropertyValue** dataPropertyValue) {
    NCF_FUNCTION("XMLDataPropertyValue::FindNextProperty");
    CHK_INARG(dataPropertyValue);
    *dataPropertyValue = NearestNamed(property);
    return *dataPropertyValue ? NCF_OK : kPropertyNotFound;
}

NCFRESULT XMLDataPropertyValue::FindPropertyInChildren(
    const char* property, std::vector<XMLDataPropertyValue*>* dataPropertyValueVect) const {
    NCF_FUNCTION("XMLDataPropertyValue::FindPropertyInChildren");
    CHK_INARG(dataPropertyValueVect);
    const std::string_view name = property;
    NCFRESULT result = kPropertyNotFound;
    for (XMLDataPropertyValue* child : children_) {
        if (child->IsNamed(name)) {
            dataPropertyValueVect->push_back(child);
            result = NCF_OK;
        }
    }
    return result;
}

NCFRESULT XMLDataPropertyValue::FindPropertyInChildren(
    const char* property, XMLDataPropertyValue** dataPropertyValue) const {
    NCF_FUNCTION("XMLDataPropertyValue::FindPropertyInChildren");
    CHK_INARG(dataPropertyValue);
    *dataPropertyValue = FirstChildNamed(property);
    return *dataPropertyValue ? NCF_OK : kPropertyNotFound;
}
