// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <string_view>

#include "host_interfaces/framework/Types.h"
#include "host_interfaces/util/NMAString.h"

// What an element of a data file is for.
enum DataContainerElementKind : ncfUInt32 {
    DCF_KEY_ELEMENT = 0,      // leaf whose text is the key of its entry
    DCF_ENTRY_ELEMENT = 1,    // opens an entry
    DCF_COMPLEX_ELEMENT = 2,  // holds children only
    DCF_ELEMENT = 3,          // leaf with a value
};

// Name and kind of one declared element; fixed once made.
class XMLDataPropertyDescription {
public:
    XMLDataPropertyDescription(const NMAString& name, ncfUInt32 kind)
        : name_(name), kind_(kind), nameText_(name_.GetUTF8String()) {}
    XMLDataPropertyDescription(const XMLDataPropertyDescription&) = delete;
    XMLDataPropertyDescription& operator=(const XMLDataPropertyDescription&) = delete;

    const NMAString& GetName() const { return name_; }
    ncfUInt32 GetKind() const { return kind_; }
    // The name as searches compare it.
    std::string_view NameText() const { return nameText_; }

private:
    const NMAString name_;
    const ncfUInt32 kind_;
    const std::string_view nameText_;  // lies in name_
};
