// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/model/BuiltIn.h"
#include "aaf_library/stored/StoredTree.h"
#include "host_interfaces/framework/Guid.h"

#include <string>
#include <vector>

// The meta-dictionary of a file as plain records: which classes there are,
// which properties these have and of which types. Every file carries its own;
// a reader goes by it and never by numbers that it knows already.

namespace aaf::stored {

struct MetaProperty {
    GUID id{};
    std::u16string name;
    std::uint16_t pid = 0;
    GUID type{};
    bool optional = false;
    bool unique = false;
};

struct MetaClass {
    GUID id{};
    std::u16string name;
    GUID parent{};  // its own id for a root class
    bool concrete = false;
    std::vector<MetaProperty> properties;
};

struct MetaMember {
    std::u16string name;
    GUID id{};  // record: type of the member; extendible enumeration: value; weak reference:
                // property on the path from the root to the set of targets
    std::int64_t value = 0;  // enumeration: value
};

struct MetaType {
    GUID id{};
    std::u16string name;
    TypeKind kind = TypeKind::Integer;
    GUID target{};           // element, renamed or character type; class referred to
    std::uint32_t size = 0;  // integer: bytes; fixed array: elements
    bool isSigned = false;   // integer
    std::vector<MetaMember> members;
};

struct MetaRecords {
    std::vector<MetaClass> classes;
    std::vector<MetaType> types;
};

// The object that the root holds as its MetaDictionary.
StoredObject storedMetaDictionary(const MetaRecords& records);

// Definitions of a kind that nobody knows are passed over. Throws StoredError.
MetaRecords readMetaDictionary(const StoredObject& metaDictionary);

StoredAuid storedAuid(const GUID& id);
GUID guidOf(const StoredAuid& id);
GUID guidOf(const Bytes& bytes);  // throws StoredError unless there are 16

// Class of the definitions of one kind of type.
GUID typeDefinitionClass(TypeKind kind);

}  // namespace aaf::stored
