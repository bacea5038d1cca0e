// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/model/TypeFacts.h"
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
    std::wstring name;
    std::uint16_t pid = 0;
    GUID type{};
    bool optional = false;
    bool unique = false;
};

struct MetaClass {
    GUID id{};
    std::wstring name;
    GUID parent{};  // its own id for a root class
    bool concrete = false;
    std::vector<MetaProperty> properties;
};

struct MetaRecords {
    std::vector<MetaClass> classes;
    std::vector<TypeFacts> types;
    // Those that say what the built-in model says. MetaClosure alone tells them apart; of a file
    // that was read all are above.
    std::vector<const BuiltInClass*> builtInClasses;
    std::vector<const BuiltInType*> builtInTypes;
    // Of a file that was read: a sentence for each definition that makes no sense and is left out.
    std::vector<std::string> notes;
};

bool operator==(const MetaRecords& left, const MetaRecords& right);

// The object that the root holds as its MetaDictionary.
StoredObject StoredMetaDictionary(const MetaRecords& records);
// The same for writing alone: what files have in common is laid out once.
StoredObject LaidOutMetaDictionary(const MetaRecords& records);

// Definitions of data and of containers as the built-in model has them.
StoredObject StoredDataDefinition(const BuiltInDefinition& entry);
StoredObject StoredContainerDefinition(const BuiltInDefinition& entry);
// The same for writing alone.
StoredObject LaidOutDataDefinition(const BuiltInDefinition& entry);
StoredObject LaidOutContainerDefinition(const BuiltInDefinition& entry);

// Definitions of a kind that nobody knows are passed over, those that make no sense are left out
// and noted. Throws StoredError when there is no set of classes or of types.
MetaRecords ReadMetaDictionary(const StoredObject& metaDictionary);

StoredAuid AuidOf(const GUID& id);
GUID GuidOf(const StoredAuid& id);
GUID GuidOf(const Bytes& bytes);  // throws StoredError unless there are 16

}  // namespace aaf::stored
