// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/stored/MetaClosure.h"

#include "aaf_library/model/ClassDefinition.h"
#include "aaf_library/model/Model.h"
#include "aaf_library/model/TypeDefinition.h"
#include "aaf_library/stored/MetaKinds.h"
#include "aaf_library/stored/ModelNames.h"
#include "aaf_library/stored/ModelTypes.h"
#include "aaf_library/stored/StoredError.h"
#include "host_interfaces/aaf/AAFClassIds.h"

namespace aaf::stored {

namespace {

MetaClass RecordOf(ClassDefinition& definition) {
    MetaClass record;
    record.id = definition.id();
    record.name = definition.name();
    record.parent = definition.parent() == nullptr ? record.id : definition.parent()->id();
    record.concrete = definition.concrete();
    record.properties.reserve(definition.properties().size());
    for (const RefPtr<PropertyDefinition>& property : definition.properties()) {
        MetaProperty entry;
        entry.id = property->id();
        entry.name = property->name();
        entry.pid = property->pid();
        entry.type = property->typeId();
        entry.optional = property->IsOptional();
        entry.unique = property->IsUnique();
        record.properties.push_back(std::move(entry));
    }
    return record;
}

// Whether an id was not met before; it is met now.
template <class Entry>
bool IsNew(const Entry* entry, Span<Entry> table, std::vector<bool>& metEntries, const GUID& id,
           std::unordered_set<GUID, GuidHash>& metIds) {
    if (entry == nullptr) {
        return metIds.insert(id).second;
    }
    metEntries.resize(table.size());
    std::vector<bool>::reference met = metEntries[static_cast<std::size_t>(entry - table.begin())];
    const bool isNew = !met;
    met = true;
    return isNew;
}

// Whether a built-in enumeration lists more than the built-in model.
bool HasOwnMembers(const TypeDefinition& type) {
    const bool isEnumeration =
        type.kind() == TypeKind::Enumeration || type.kind() == TypeKind::ExtendibleEnumeration;
    const BuiltInType* const entry = isEnumeration ? FindBuiltInType(type.id()) : nullptr;
    return entry != nullptr && !(MembersOf(type) == FactsOf(*entry).members);
}

}  // namespace

void MetaClosure::AddClass(const GUID& id) {
    pendingClasses_.push_back(id);
    AddPending();
}

void MetaClosure::AddType(const GUID& id) {
    pendingTypes_.push_back(id);
    AddPending();
}

void MetaClosure::AddMetaClasses() {
    for (const GUID& id : {AUID_AAFClassDef, AUID_AAFPropertyDef, AUID_AAFMetaDictionary}) {
        AddClass(id);
    }
    for (int kind = 0; kind < kTypeKinds; ++kind) {
        AddClass(ClassOfTypes(static_cast<TypeKind>(kind)));
    }
}

void MetaClosure::AddExtensions() {
    // Entering a definition may look up others, which makes the lists longer.
    for (std::size_t i = 0; i < model_.madeClasses().size(); ++i) {
        const RefPtr<ClassDefinition> definition = model_.madeClasses()[i];
        if (definition->IsExtended()) {
            AddClass(definition->id());
        }
    }
    for (std::size_t i = 0; i < model_.madeTypes().size(); ++i) {
        const RefPtr<TypeDefinition> type = model_.madeTypes()[i];
        if (!type->IsBuiltIn() || HasOwnMembers(*type)) {
            AddType(type->id());
        }
    }
}

void MetaClosure::AddPending() {
    while (!pendingClasses_.empty() || !pendingTypes_.empty()) {
        if (!pendingClasses_.empty()) {
            const GUID id = pendingClasses_.back();
            pendingClasses_.pop_back();
            EnterClass(id);
        } else {
            const GUID id = pendingTypes_.back();
            pendingTypes_.pop_back();
            EnterType(id);
        }
    }
}

void MetaClosure::EnterClass(const GUID& id) {
    const BuiltInClass* const entry = FindBuiltInClass(id);
    if (!IsNew(entry, BuiltInClasses(), builtInClasses_, id, classes_)) {
        return;
    }
    if (entry != nullptr && model_.HasAsBuiltIn(*entry)) {
        if (builtIn_ == BuiltIn::LeftOut) {
            return;
        }
        records_.builtInClasses.push_back(entry);
        pendingClasses_.push_back(entry->parent);
        for (const BuiltInProperty& property : entry->properties) {
            pendingTypes_.push_back(property.type);
        }
        return;
    }
    ClassDefinition* definition = model_.FindClass(id);
    if (definition == nullptr) {
        throw StoredError("a class that is needed has no definition");
    }
    records_.classes.push_back(RecordOf(*definition));
    const MetaClass& record = records_.classes.back();
    pendingClasses_.push_back(record.parent);
    for (const MetaProperty& property : record.properties) {
        pendingTypes_.push_back(property.type);
    }
}

void MetaClosure::EnterType(const GUID& id) {
    const BuiltInType* const entry = FindBuiltInType(id);
    if (!IsNew(entry, BuiltInTypes(), builtInTypes_, id, types_)) {
        return;
    }
    if (entry != nullptr && model_.HasAsBuiltIn(*entry)) {
        if (builtIn_ == BuiltIn::LeftOut) {
            return;
        }
        records_.builtInTypes.push_back(entry);
        AddTypesIn(FactsOf(*entry));
        return;
    }
    const TypeDefinition* type = model_.FindType(id);
    if (type == nullptr) {
        throw StoredError("a type that is needed has no definition");
    }
    records_.types.push_back(FactsOf(*type));
    AddTypesIn(records_.types.back());
}

void MetaClosure::AddTypesIn(const TypeFacts& record) {
    if (RefersToClass(record.kind)) {
        pendingClasses_.push_back(record.target);
    } else if (TargetPidOf(record.kind) != 0) {
        pendingTypes_.push_back(record.target);
    }
    if (record.kind == TypeKind::Record) {
        for (const TypeMember& member : record.members) {
            pendingTypes_.push_back(member.id);
        }
    }
}

}  // namespace aaf::stored
