// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <string>
#include <string_view>
#include <vector>

#include "host_interfaces/framework/ResultCodes.h"
#include "source/descriptor_data/XMLDataPropertyDescription.h"

// The answer of a search that found nothing; not a failure.
inline constexpr NCFRESULT kPropertyNotFound = 1;

// One node of a tree: of the declared tree, or of an entry that was read. It
// owns nothing; the container owns descriptions and nodes alike.
class XMLDataPropertyValue {
public:
    // Throws NCF_E_HANDLE without a description.
    explicit XMLDataPropertyValue(const XMLDataPropertyDescription* description);

    NCFRESULT GetDesc(const XMLDataPropertyDescription** outDesc) const;
    NCFRESULT SetValue(const NMAString& value);
    NCFRESULT GetValue(NMAString* outValue) const;
    NCFRESULT SetParent(XMLDataPropertyValue* parent);
    NCFRESULT GetParent(XMLDataPropertyValue** outPropertyValue) const;  // null at a root
    // Links the child to this node first and keeps it only if that succeeded.
    NCFRESULT AddChild(XMLDataPropertyValue* child);

    // Searches outward: this node, its children, then the same from its parent
    // on. 0 found, kPropertyNotFound otherwise.
    NCFRESULT FindNextProperty(const char* property, XMLDataPropertyValue** dataPropertyValue);
    // The same; null when there is none.
    XMLDataPropertyValue* NearestNamed(std::string_view property);
    // Searches the direct children; the first form appends every match, the
    // second gives the first, null when there is none.
    NCFRESULT FindPropertyInChildren(
        const char* property, std::vector<XMLDataPropertyValue*>* dataPropertyValueVect) const;
    NCFRESULT FindPropertyInChildren(const char* property,
                                     XMLDataPropertyValue** dataPropertyValue) const;

    // The value in UTF-8, valid until it is set anew.
    const char* ValueText() const { return value_.c_str(); }
    const std::vector<XMLDataPropertyValue*>& Children() const { return children_; }

private:
    bool IsNamed(std::string_view property) const { return description_->NameText() == property; }
    XMLDataPropertyValue* FirstChildNamed(std::string_view property) const;

    const XMLDataPropertyDescription* description_;
    std::string value_;  // in UTF-8, as it is read; there are thousands
    XMLDataPropertyValue* parent_ = nullptr;
    std::vector<XMLDataPropertyValue*> children_;
};
