// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/descriptor_data/XMLDataPropertyValue.h"

#include <cstring>

#include "source/plugin/ResultChecks.h"

XMLDataPropertyValue::XMLDataPropertyValue(const XMLDataPropertyDescription* description)
    : description_(description) {
    if (!description) {
        throw NCF_E_HANDLE;
    }
}

bool XMLDataPropertyValue::IsNamed(const char* property) const {
    return std::strcmp(description_->NameText(), property) == 0;
}

NCFRESULT XMLDataPropertyValue::GetDesc(const XMLDataPropertyDescription** outDesc) const {
    NCF_FUNCTION("XMLDataPropertyValue::GetDesc");
    CHK_INARG(outDesc);
    *outDesc = description_;
    return NCF_OK;
}

NCFRESULT XMLDataPropertyValue::SetValue(const NMAString& value) {
    value_ = value;
    return NCF_OK;
}

NCFRESULT XMLDataPropertyValue::GetValue(NMAString* outValue) const {
    NCF_FUNCTION("XMLDataPropertyValue::GetValue");
    CHK_INARG(outValue);
    *outValue = value_;
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
    for (XMLDataPropertyValue* node = this; node; node = node->parent_) {
        if (node->IsNamed(property)) {
            *dataPropertyValue = node;
            return NCF_OK;
        }
        if (node->FindPropertyInChildren(property, dataPropertyValue) != kPropertyNotFound) {
            return NCF_OK;
        }
    }
    return kPropertyNotFound;
}

NCFRESULT XMLDataPropertyValue::FindPropertyInChildren(
    const char* property, std::vector<XMLDataPropertyValue*>* dataPropertyValueVect) const {
    NCF_FUNCTION("XMLDataPropertyValue::FindPropertyInChildren");
    CHK_INARG(dataPropertyValueVect);
    NCFRESULT result = kPropertyNotFound;
    for (XMLDataPropertyValue* child : children_) {
        if (child->IsNamed(property)) {
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
    *dataPropertyValue = nullptr;
    for (XMLDataPropertyValue* child : children_) {
        if (child->IsNamed(property)) {
            *dataPropertyValue = child;
            return NCF_OK;
        }
    }
    return kPropertyNotFound;
}
