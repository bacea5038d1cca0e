// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/model/PropertyValue.h"
#include "aaf_library/stored/StoredTree.h"
#include "host_interfaces/framework/Guid.h"

#include <functional>
#include <unordered_map>

namespace aaf::stored {

// A property of a file that is no value of its type, with all that it holds,
// as it is written back.
struct KeptProperty : AsStored {
    StoredProperty property;
    // What the file's own numbers in it mean. Another file has others.
    std::unordered_map<std::uint16_t, GUID> numbers;
};

// The definition's id of a property in an object of that class; an id of
// zeros when it has none.
using IdOfProperty = std::function<GUID(const StoredObject&, std::uint16_t)>;
std::shared_ptr<const KeptProperty> Keep(const StoredProperty& property,
                                         const IdOfProperty& idOfProperty);

// The bytes of it that can be shown: the value, the ids that it refers to, or
// the name under which its objects stand.
Bytes BytesToShow(const StoredProperty& property);

// Calls for each object that a property holds, at any depth.
void ForEachObject(StoredProperty& property, const std::function<void(StoredObject&)>& call);

}  // namespace aaf::stored
