// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/stored/MetaRegistration.h"

#include "aaf_library/model/ClassDefinition.h"
#include "aaf_library/model/Model.h"
#include "aaf_library/model/TypeDefinition.h"
#include "aaf_library/stored/MetaKinds.h"
#include "aaf_library/stored/ModelNames.h"
#include "aaf_library/stored/ModelTypes.h"
#include "aaf_library/stored/StoredError.h"
#include "host_interfaces/aaf/AAFTypeIds.h"

#include <algorithm>
#include <utility>

namespace aaf::stored {

namespace {

// Longest line of parents, and of types made of one another. Definitions are
// followed by recursion all over the model.
constexpr int kLongestLine = 64;

// Numbers that one model can give to properties of its own are limited; this
// leaves plenty for callers.
constexpr std::size_t kMostNewProperties = 16384;

void CheckLine(int depth) {
    if (depth > kLongestLine) {
        throw StoredError("definitions that are made of one another without end");
    }
}

}  // namespace

MetaRegistration::MetaRegistration(const MetaRecords& records, Model& model, Words words)
    : model_(model), words_(words) {
    for (const MetaClass& record : records.classes) {
        classes_.emplace(record.id, &record);
        for (const MetaProperty& property : record.properties) {
            pids_[record.id].emplace(property.pid, property.id);
        }
    }
    for (const TypeFacts& record : records.types) {
        types_.emplace(record.id, &record);
    }
    for (const MetaClass& record : records.classes) {
        if (EnterClass(record.id, 0) == nullptr) {
            notes_.push_back("the class " + ToUtf8(record.name) + " has no parent and is left out");
        }
    }
    for (const TypeFacts& record : records.types) {
        if (EnterType(record.id, 0) == nullptr) {
            notes_.push_back("the type " + ToUtf8(record.name) + " makes no sense and is left out");
        }
    }
    EnterProperties();
}

PropertyDefinition* MetaRegistration::property(ClassDefinition& definition,
                                               std::uint16_t pid) const {
    for (const ClassDefinition* at = &definition; at != nullptr; at = at->parent()) {
        const auto own = pids_.find(at->id());
        if (own == pids_.end()) {
            continue;
        }
        const auto found = own->second.find(pid);
        if (found != own->second.end()) {
            return definition.FindProperty(found->second);
        }
    }
    // Files may leave out what every reader knows.
    return pid < kFirstLocalPid ? definition.FindProperty(PropertyId{pid}) : nullptr;
}

// Parents first. A class whose line of parents is broken is left out, and with
// it the objects that would need it are refused.
ClassDefinition* MetaRegistration::EnterClass(const GUID& id, int depth) {
    CheckLine(depth);
    if (ClassDefinition* known = model_.FindClass(id)) {
        return known;
    }
    const auto found = classes_.find(id);
    if (found == classes_.end() || !begun_.insert(id).second) {
        return nullptr;
    }
    const MetaClass& record = *found->second;
    ClassDefinition* parent = nullptr;
    if (record.parent != id) {
        parent = EnterClass(record.parent, depth + 1);
        if (parent == nullptr) {
            return nullptr;
        }
    }
    RefPtr<ClassDefinition> definition(new ClassDefinition);
    definition->JoinModel(model_);
    definition->SetIdentity(id, record.name);
    definition->SetParent(parent);
    definition->SetConcrete(record.concrete);
    return model_.RegisterClass(*definition) < 0 ? nullptr : model_.FindClass(id);
}

TypeDefinition* MetaRegistration::EnterType(const GUID& id, int depth) {
    CheckLine(depth);
    TypeDefinition* const known = model_.FindType(id);
    const auto found = types_.find(id);
    if (found == types_.end() || !begun_.insert(id).second) {
        return known;
    }
    const TypeFacts& record = *found->second;
    if (known == nullptr) {
        return MakeType(record, depth);
    }
    if (!RefersToClass(record.kind) && TargetPidOf(record.kind) != 0) {
        EnterType(record.target, depth + 1);
    }
    const bool taken =
        words_ == Words::OfTheFile ? Redefine(*known, model_, record) : AddMembers(*known, record);
    if (!taken) {
        notes_.push_back("the type " + ToUtf8(record.name) +
                         " is of another kind than elsewhere, which counts");
    }
    return known;
}

TypeDefinition* MetaRegistration::MakeType(const TypeFacts& record, int depth) {
    if (RefersToClass(record.kind)) {
        if (model_.FindClass(record.target) == nullptr) {
            return nullptr;
        }
    } else if (TargetPidOf(record.kind) != 0 && EnterType(record.target, depth + 1) == nullptr) {
        return nullptr;
    }
    if (record.kind == TypeKind::Record) {
        for (const TypeMember& member : record.members) {
            if (EnterType(member.id, depth + 1) == nullptr) {
                return nullptr;
            }
        }
    }
    const RefPtr<TypeDefinition> type = StorableType(record, model_);
    if (!type || model_.RegisterType(*type) < 0) {
        return nullptr;
    }
    return model_.FindType(record.id);
}

// In the order of the file's numbers, which go downwards: so a file that is
// read and written again keeps them.
void MetaRegistration::EnterProperties() {
    std::vector<std::pair<const MetaClass*, const MetaProperty*>> added;
    for (const auto& entry : classes_) {
        for (const MetaProperty& property : entry.second->properties) {
            if (model_.FindClass(entry.first) != nullptr &&
                model_.FindProperty(property.id) == nullptr &&
                FindBuiltInProperty(property.id) == nullptr) {
                added.emplace_back(entry.second, &property);
            }
        }
    }
    if (added.size() > kMostNewProperties) {
        throw StoredError("more properties than can be numbered");
    }
    std::sort(added.begin(), added.end(), [](const auto& a, const auto& b) {
        return std::make_pair(b.second->pid, AuidOf(a.second->id)) <
               std::make_pair(a.second->pid, AuidOf(b.second->id));
    });
    for (const auto& [owner, property] : added) {
        if (model_.FindProperty(property->id) != nullptr) {
            continue;
        }
        GUID type = property->type;
        if (model_.FindType(type) == nullptr) {
            notes_.push_back("the property " + ToUtf8(property->name) + " of " +
                             ToUtf8(owner->name) + " has no type and is taken as bytes");
            type = kAAFTypeID_UInt8Array;
        }
        model_.FindClass(owner->id)->AddProperty(property->id, property->name, type,
                                                 property->optional, property->unique);
    }
}

}  // namespace aaf::stored
