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

#include <algorithm>
#include <deque>
#include <mutex>

namespace aaf::stored {

namespace {

MetaClass RecordOf(ClassDefinition& definition, const AllottedNumbers& numbers) {
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
        const auto number = numbers.find(property->pid());
        entry.pid = number == numbers.end() ? property->pid() : number->second;
        entry.type = property->typeId();
        entry.optional = property->IsOptional();
        entry.unique = property->IsUnique();
        record.properties.push_back(std::move(entry));
    }
    return record;
}

// Whether a built-in enumeration lists more than the built-in model.
bool HasOwnMembers(const TypeDefinition& type) {
    const bool isEnumeration =
        type.kind() == TypeKind::Enumeration || type.kind() == TypeKind::ExtendibleEnumeration;
    const BuiltInType* const entry = isEnumeration ? FindBuiltInType(type.id()) : nullptr;
    return entry != nullptr && !(MembersOf(type) == FactsOf(*entry).members);
}

// Where a definition leads to.
template <class OnClass, class OnType>
void ForEachNeed(const TypeFacts& record, const OnClass& onClass, const OnType& onType) {
    if (RefersToClass(record.kind)) {
        onClass(record.target);
    } else if (TargetPidOf(record.kind) != 0) {
        onType(record.target);
    }
    if (record.kind == TypeKind::Record) {
        for (const TypeMember& member : record.members) {
            onType(member.id);
        }
    }
}

// The rows with all that they need of the tables, but not what the changed ones need.
BuiltInRows NeedsOf(const BuiltInRows& wanted, const BuiltInRows& changed) {
    BuiltInRows needed = wanted;
    std::vector<const BuiltInClass*> classes;
    std::vector<const BuiltInType*> types;
    const auto onClass = [&](const GUID& id) {
        if (const BuiltInClass* const entry = FindBuiltInClass(id); entry && needed.Add(*entry)) {
            classes.push_back(entry);
        }
    };
    const auto onType = [&](const GUID& id) {
        if (const BuiltInType* const entry = FindBuiltInType(id); entry && needed.Add(*entry)) {
            types.push_back(entry);
        }
    };
    for (const BuiltInClass& entry : BuiltInClasses()) {
        if (wanted.Has(entry)) {
            classes.push_back(&entry);
        }
    }
    for (const BuiltInType& entry : BuiltInTypes()) {
        if (wanted.Has(entry)) {
            types.push_back(&entry);
        }
    }
    while (!classes.empty() || !types.empty()) {
        if (!classes.empty()) {
            const BuiltInClass& entry = *classes.back();
            classes.pop_back();
            if (!changed.Has(entry)) {
                onClass(entry.parent);
                for (const BuiltInProperty& property : entry.properties) {
                    onType(property.type);
                }
            }
        } else {
            const BuiltInType& entry = *types.back();
            types.pop_back();
            if (!changed.Has(entry)) {
                ForEachNeed(FactsOf(entry), onClass, onType);
            }
        }
    }
    return needed;
}

// Files of one kind need the same, so what was found last is kept.
class KeptNeeds {
public:
    BuiltInRows Of(const BuiltInRows& wanted, const BuiltInRows& changed) {
        const std::lock_guard<std::mutex> lock(mutex_);
        const auto known = std::find_if(kept_.begin(), kept_.end(), [&](const Kept& one) {
            return one.wanted == wanted && one.changed == changed;
        });
        if (known == kept_.end()) {
            kept_.push_front({wanted, changed, NeedsOf(wanted, changed)});
            kept_.resize(std::min(kept_.size(), kMost));
        } else {
            std::rotate(kept_.begin(), known, known + 1);
        }
        return kept_.front().needed;
    }

private:
    struct Kept {
        BuiltInRows wanted;
        BuiltInRows changed;
        BuiltInRows needed;
    };

    static constexpr std::size_t kMost = 16;
    std::mutex mutex_;
    std::deque<Kept> kept_;
};

const BuiltInRows& RowsWithNumbersOfTheFile() {
    static const BuiltInRows rows = [] {
        BuiltInRows found;
        for (const BuiltInClass& entry : BuiltInClasses()) {
            for (const BuiltInProperty& property : entry.properties) {
                if (property.key.pid == kNoPropertyId) {
                    found.Add(entry);
                }
            }
        }
        return found;
    }();
    return rows;
}

// Of which the model doesn't say what the built-in one says.
BuiltInRows ChangedIn(const Model& model) {
    BuiltInRows changed = RowsWithNumbersOfTheFile();
    for (const RefPtr<ClassDefinition>& definition : model.madeClasses()) {
        const BuiltInClass* const entry =
            definition->IsAsBuiltIn() ? nullptr : FindBuiltInClass(definition->id());
        if (entry != nullptr) {
            changed.Add(*entry);
        }
    }
    for (const RefPtr<TypeDefinition>& type : model.madeTypes()) {
        const BuiltInType* const entry = FindBuiltInType(type->id());
        if (entry != nullptr && !model.HasAsBuiltIn(*entry)) {
            changed.Add(*entry);
        }
    }
    return changed;
}

}  // namespace

BuiltInRows::BuiltInRows()
    : classes_(BuiltInClasses().size() / kBits + 1), types_(BuiltInTypes().size() / kBits + 1) {}

std::size_t BuiltInRows::PlaceOf(const BuiltInClass& entry) {
    return static_cast<std::size_t>(&entry - BuiltInClasses().begin());
}

std::size_t BuiltInRows::PlaceOf(const BuiltInType& entry) {
    return static_cast<std::size_t>(&entry - BuiltInTypes().begin());
}

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
    if (const BuiltInClass* const entry = FindBuiltInClass(id)) {
        wanted_.Add(*entry);
        return;
    }
    if (!classes_.insert(id).second) {
        return;
    }
    ClassDefinition* const definition = model_.FindClass(id);
    if (definition == nullptr) {
        throw StoredError("a class that is needed has no definition");
    }
    Record(*definition);
}

void MetaClosure::EnterType(const GUID& id) {
    if (const BuiltInType* const entry = FindBuiltInType(id)) {
        wanted_.Add(*entry);
        return;
    }
    if (!types_.insert(id).second) {
        return;
    }
    const TypeDefinition* const type = model_.FindType(id);
    if (type == nullptr) {
        throw StoredError("a type that is needed has no definition");
    }
    Record(*type);
}

void MetaClosure::Record(ClassDefinition& definition) {
    records_.classes.push_back(RecordOf(definition, numbers_));
    const MetaClass& record = records_.classes.back();
    pendingClasses_.push_back(record.parent);
    for (const MetaProperty& property : record.properties) {
        pendingTypes_.push_back(property.type);
    }
}

void MetaClosure::Record(const TypeDefinition& type) {
    records_.types.push_back(FactsOf(type));
    ForEachNeed(
        records_.types.back(), [this](const GUID& id) { pendingClasses_.push_back(id); },
        [this](const GUID& id) { pendingTypes_.push_back(id); });
}

// False when all of them were recorded before.
template <class Definition, class Entry>
bool MetaClosure::RecordChanged(Span<Entry> table, const BuiltInRows& changed,
                                const BuiltInRows& needed,
                                Definition* (Model::*find)(const GUID&)) {
    bool isAnyNew = false;
    for (const Entry& entry : table) {
        if (changed.Has(entry) && needed.Has(entry) && recorded_.Add(entry)) {
            Record(*(model_.*find)(entry.id));
            isAnyNew = true;
        }
    }
    AddPending();
    return isAnyNew;
}

const MetaRecords& MetaClosure::records() {
    static KeptNeeds needs;
    const BuiltInRows changed = ChangedIn(model_);
    const auto needed = [&] {
        return builtIn_ == BuiltIn::Gathered ? needs.Of(wanted_, changed) : wanted_;
    };
    BuiltInRows rows = needed();
    while (RecordChanged(BuiltInClasses(), changed, rows, &Model::FindClass) ||
           RecordChanged(BuiltInTypes(), changed, rows, &Model::FindType)) {
        rows = needed();
    }
    records_.builtInClasses.clear();
    records_.builtInTypes.clear();
    if (builtIn_ == BuiltIn::LeftOut) {
        return records_;
    }
    for (const BuiltInClass& entry : BuiltInClasses()) {
        if (rows.Has(entry) && !changed.Has(entry)) {
            records_.builtInClasses.push_back(&entry);
        }
    }
    for (const BuiltInType& entry : BuiltInTypes()) {
        if (rows.Has(entry) && !changed.Has(entry)) {
            records_.builtInTypes.push_back(&entry);
        }
    }
    return records_;
}

}  // namespace aaf::stored
