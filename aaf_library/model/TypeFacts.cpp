// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/model/TypeFacts.h"

#include <algorithm>

#include "aaf_library/model/Model.h"
#include "aaf_library/model/Text.h"
#include "aaf_library/model/TypeCharacter.h"
#include "aaf_library/model/TypeEnumeration.h"
#include "aaf_library/model/TypeExtendibleEnumeration.h"
#include "aaf_library/model/TypeFixedArray.h"
#include "aaf_library/model/TypeIndirect.h"
#include "aaf_library/model/TypeInteger.h"
#include "aaf_library/model/TypeRecord.h"
#include "aaf_library/model/TypeReference.h"
#include "aaf_library/model/TypeRename.h"
#include "aaf_library/model/TypeSet.h"
#include "aaf_library/model/TypeStream.h"
#include "aaf_library/model/TypeString.h"
#include "aaf_library/model/TypeVariableArray.h"
#include "host_interfaces/aaf/AAFClassIds.h"

namespace aaf {
namespace {

template <class T>
RefPtr<TypeDefinition> Make() {
    return RefPtr<TypeDefinition>(new T);
}

struct Kind {
    const GUID& classId;
    eAAFTypeCategory_t category;
    RefPtr<TypeDefinition> (*make)();
};

// In the order of TypeKind.
const Kind kKinds[] = {
    {AUID_AAFTypeDefInt, kAAFTypeCatInt, Make<TypeInteger>},
    {AUID_AAFTypeDefStrongObjRef, kAAFTypeCatStrongObjRef, Make<TypeStrongReference>},
    {AUID_AAFTypeDefWeakObjRef, kAAFTypeCatWeakObjRef, Make<TypeWeakReference>},
    {AUID_AAFTypeDefEnum, kAAFTypeCatEnum, Make<TypeEnumeration>},
    {AUID_AAFTypeDefFixedArray, kAAFTypeCatFixedArray, Make<TypeFixedArray>},
    {AUID_AAFTypeDefVariableArray, kAAFTypeCatVariableArray, Make<TypeVariableArray>},
    {AUID_AAFTypeDefSet, kAAFTypeCatSet, Make<TypeSet>},
    {AUID_AAFTypeDefString, kAAFTypeCatString, Make<TypeString>},
    {AUID_AAFTypeDefStream, kAAFTypeCatStream, Make<TypeStream>},
    {AUID_AAFTypeDefRecord, kAAFTypeCatRecord, Make<TypeRecord>},
    {AUID_AAFTypeDefRename, kAAFTypeCatRename, Make<TypeRename>},
    {AUID_AAFTypeDefExtEnum, kAAFTypeCatExtEnum, Make<TypeExtendibleEnumeration>},
    {AUID_AAFTypeDefIndirect, kAAFTypeCatIndirect, Make<TypeIndirect>},
    {AUID_AAFTypeDefOpaque, kAAFTypeCatOpaque, Make<TypeOpaque>},
    {AUID_AAFTypeDefCharacter, kAAFTypeCatCharacter, Make<TypeCharacter>},
};

const Kind& EntryOf(TypeKind kind) {
    return kKinds[static_cast<std::size_t>(kind)];
}

HRESULT SetupRecord(TypeRecord& type, Model& model, const TypeFacts& facts) {
    std::vector<TypeDefinition*> types;
    types.reserve(facts.members.size());
    for (const TypeMember& member : facts.members) {
        TypeDefinition* const found = model.FindType(member.id);
        if (found == nullptr) {
            return AAFRESULT_BAD_TYPE;
        }
        types.push_back(found);
    }
    return type.Setup(facts.id, facts.name, facts.members, std::move(types));
}

HRESULT SetupWeak(TypeWeakReference& type, const TypeFacts& facts) {
    std::vector<GUID> path;
    for (const TypeMember& member : facts.members) {
        path.push_back(member.id);
    }
    return type.Setup(facts.id, facts.name, facts.target, std::move(path));
}

template <class T>
HRESULT SetupOn(TypeDefinition* target, TypeDefinition& type, const TypeFacts& facts) {
    return target == nullptr ? AAFRESULT_BAD_TYPE
                             : static_cast<T&>(type).Setup(facts.id, facts.name, *target);
}

HRESULT Setup(TypeDefinition& type, Model& model, const TypeFacts& facts) {
    const auto& [id, name, kind, targetId, size, isSigned, members] = facts;
    TypeDefinition* const target = RefersToClass(kind) ? nullptr : model.FindType(targetId);
    switch (kind) {
        case TypeKind::Integer:
            return static_cast<TypeInteger&>(type).Setup(id, name, size, isSigned);
        case TypeKind::StrongReference:
            return static_cast<TypeStrongReference&>(type).Setup(id, name, targetId);
        case TypeKind::WeakReference:
            return SetupWeak(static_cast<TypeWeakReference&>(type), facts);
        case TypeKind::Enumeration:
            return target == nullptr
                       ? AAFRESULT_BAD_TYPE
                       : static_cast<TypeEnumeration&>(type).Setup(id, name, *target, members);
        case TypeKind::ExtendibleEnumeration:
            return static_cast<TypeExtendibleEnumeration&>(type).Setup(id, name, members);
        case TypeKind::FixedArray:
            return target == nullptr
                       ? AAFRESULT_BAD_TYPE
                       : static_cast<TypeFixedArray&>(type).Setup(id, name, *target, size);
        case TypeKind::Record:
            return SetupRecord(static_cast<TypeRecord&>(type), model, facts);
        case TypeKind::Rename:
            return SetupOn<TypeRename>(target, type, facts);
        case TypeKind::VariableArray:
            return SetupOn<TypeVariableArray>(target, type, facts);
        case TypeKind::Set:
            return SetupOn<TypeSet>(target, type, facts);
        case TypeKind::String:
            return SetupOn<TypeString>(target, type, facts);
        default:
            return type.SetIdentity(id, name);
    }
}

std::vector<TypeFacts> AllBuiltInFacts() {
    std::vector<TypeFacts> all;
    all.reserve(BuiltInTypes().size());
    for (const BuiltInType& entry : BuiltInTypes()) {
        std::vector<TypeMember> members;
        for (const BuiltInMember& member : entry.members) {
            members.push_back({Widen(member.name), member.id, member.value});
        }
        all.push_back({entry.id, Widen(entry.name), entry.kind, entry.target, entry.size,
                       entry.isSigned, std::move(members)});
    }
    return all;
}

}  // namespace

TypeMembers MembersOf(const TypeDefinition& type) {
    switch (type.kind()) {
        case TypeKind::Enumeration:
            return static_cast<const TypeEnumeration&>(type).members();
        case TypeKind::ExtendibleEnumeration:
            return static_cast<const TypeExtendibleEnumeration&>(type).members();
        case TypeKind::Record:
            return static_cast<const TypeRecord&>(type).members();
        case TypeKind::WeakReference: {
            std::vector<TypeMember> steps;
            for (const GUID& step : static_cast<const TypeWeakReference&>(type).targetSet()) {
                steps.push_back({{}, step});
            }
            return steps;
        }
        default:
            return {};
    }
}

bool operator==(const TypeFacts& left, const TypeFacts& right) {
    return left.id == right.id && left.name == right.name && left.kind == right.kind &&
           left.target == right.target && left.size == right.size &&
           left.isSigned == right.isSigned && left.members == right.members;
}

const TypeFacts& FactsOf(const BuiltInType& entry) {
    static const std::vector<TypeFacts> all = AllBuiltInFacts();
    return all[static_cast<std::size_t>(&entry - BuiltInTypes().begin())];
}

TypeFacts FactsOf(const TypeDefinition& type) {
    TypeFacts facts{type.id(), type.name(), type.kind(), {}, 0, false, MembersOf(type)};
    if (type.element() != nullptr) {
        facts.target = type.element()->id();
    }
    if (RefersToClass(facts.kind)) {
        facts.target = static_cast<const TypeReference&>(type).targetClass();
    }
    if (facts.kind == TypeKind::Integer) {
        facts.size = static_cast<std::uint32_t>(type.StoredSize());
        facts.isSigned = static_cast<const TypeInteger&>(type).IsSignedType();
    }
    if (facts.kind == TypeKind::FixedArray) {
        facts.size = static_cast<std::uint32_t>(static_cast<const TypeFixedArray&>(type).count());
    }
    return facts;
}

const GUID& ClassOfTypes(TypeKind kind) {
    return EntryOf(kind).classId;
}

eAAFTypeCategory_t CategoryOf(TypeKind kind) {
    return EntryOf(kind).category;
}

bool IsClassOfTypes(const GUID& classId, TypeKind* kind) {
    const auto* const found =
        std::find_if(std::begin(kKinds), std::end(kKinds),
                     [&](const Kind& entry) { return entry.classId == classId; });
    *kind = static_cast<TypeKind>(found - kKinds);
    return found != std::end(kKinds);
}

RefPtr<TypeDefinition> MakeType(Model& model, TypeKind kind) {
    RefPtr<TypeDefinition> type = EntryOf(kind).make();
    type->JoinModel(model);
    return type;
}

RefPtr<TypeDefinition> MakeType(Model& model, const TypeFacts& facts) {
    RefPtr<TypeDefinition> type = MakeType(model, facts.kind);
    return Setup(*type, model, facts) < 0 ? nullptr : type;
}

namespace {

// Whether a type is the other, or made of it at any depth.
bool IsMadeOf(const TypeDefinition& type, const TypeDefinition& other) {
    if (&type == &other || (type.element() != nullptr && IsMadeOf(*type.element(), other))) {
        return true;
    }
    if (type.kind() != TypeKind::Record) {
        return false;
    }
    const std::vector<TypeDefinition*>& members = static_cast<const TypeRecord&>(type).types();
    return std::any_of(members.begin(), members.end(),
                       [&](const TypeDefinition* member) { return IsMadeOf(*member, other); });
}

// What a file lists, and behind it what we know besides.
TypeMembers Joined(const TypeMembers& listed, const TypeMembers& known) {
    std::vector<TypeMember> joined(listed.begin(), listed.end());
    for (const TypeMember& member : known) {
        const bool mentioned =
            std::any_of(listed.begin(), listed.end(), [&](const TypeMember& other) {
                return other.name == member.name ||
                       (other.id == member.id && other.value == member.value);
            });
        if (!mentioned) {
            joined.push_back(member);
        }
    }
    // The same in another order says nothing new.
    return joined.size() == known.size() &&
                   std::is_permutation(joined.begin(), joined.end(), known.begin())
               ? known
               : TypeMembers(std::move(joined));
}

}  // namespace

bool AddMembers(TypeDefinition& type, const TypeFacts& facts) {
    if (type.kind() != facts.kind) {
        return false;
    }
    const BuiltInType* const entry = FindBuiltInType(type.id());
    const TypeMembers known = MembersOf(type);
    const bool isAsBuiltIn = entry != nullptr && known == FactsOf(*entry).members;
    TypeMembers joined = isAsBuiltIn ? Joined(facts.members, known) : Joined(known, facts.members);
    if (facts.kind == TypeKind::Enumeration) {
        static_cast<TypeEnumeration&>(type).Redefine(*type.element(), std::move(joined));
    } else if (facts.kind == TypeKind::ExtendibleEnumeration) {
        static_cast<TypeExtendibleEnumeration&>(type).Redefine(std::move(joined));
    }
    return true;
}

bool Redefine(TypeDefinition& type, Model& model, const TypeFacts& facts) {
    if (type.kind() != facts.kind) {
        return false;
    }
    if (!facts.name.empty() && facts.name != type.name()) {
        type.SetName(facts.name.c_str());
    }
    TypeDefinition* const target =
        RefersToClass(facts.kind) ? nullptr : model.FindType(facts.target);
    const bool sameKind = target != nullptr && type.element() != nullptr &&
                          target->Resolved().kind() == type.element()->Resolved().kind();
    switch (facts.kind) {
        case TypeKind::Enumeration:
            static_cast<TypeEnumeration&>(type).Redefine(sameKind ? *target : *type.element(),
                                                         Joined(facts.members, MembersOf(type)));
            return true;
        case TypeKind::ExtendibleEnumeration:
            static_cast<TypeExtendibleEnumeration&>(type).Redefine(
                Joined(facts.members, MembersOf(type)));
            return true;
        case TypeKind::Rename:
            if (sameKind && !IsMadeOf(*target, type)) {
                static_cast<TypeRename&>(type).Redefine(*target);
            }
            return true;
        default:
            return true;
    }
}

RefPtr<TypeDefinition> MakeBuiltInType(Model& model, const BuiltInType& entry) {
    RefPtr<TypeDefinition> type = MakeType(model, FactsOf(entry));
    type->MarkBuiltIn();
    if (entry.kind == TypeKind::Record) {
        static_cast<TypeRecord&>(*type).UseNaturalLayout();
    }
    return type;
}

}  // namespace aaf
