// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/model/TypeFactory.h"
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

namespace aaf {

namespace {

template <class T>
T* As(TypeDefinition& type) {
    return static_cast<T*>(&type);
}

TypeDefinition& Need(Model& model, const GUID& id) {
    return *model.FindType(id);
}

void SetupRecord(Model& model, const BuiltInType& entry, const std::wstring& name,
                 TypeRecord& record) {
    std::vector<TypeRecord::Member> members;
    for (const BuiltInMember& member : entry.members) {
        members.push_back({Widen(member.name), &Need(model, member.id)});
    }
    record.Setup(entry.id, name, std::move(members));
    record.UseNaturalLayout();
}

void SetupEnumeration(Model& model, const BuiltInType& entry, const std::wstring& name,
                      TypeEnumeration& type) {
    std::vector<TypeEnumeration::Member> members;
    for (const BuiltInMember& member : entry.members) {
        members.push_back({Widen(member.name), member.value});
    }
    type.Setup(entry.id, name, Need(model, entry.target), std::move(members));
}

void SetupExtendible(const BuiltInType& entry, const std::wstring& name,
                     TypeExtendibleEnumeration& type) {
    std::vector<TypeExtendibleEnumeration::Member> members;
    for (const BuiltInMember& member : entry.members) {
        members.push_back({Widen(member.name), member.id});
    }
    type.Setup(entry.id, name, std::move(members));
}

void SetupWeakReference(const BuiltInType& entry, const std::wstring& name,
                        TypeWeakReference& type) {
    std::vector<GUID> path;
    for (const BuiltInMember& member : entry.members) {
        path.push_back(member.id);
    }
    type.Setup(entry.id, name, entry.target, std::move(path));
}

}  // namespace

RefPtr<TypeDefinition> MakeType(TypeKind kind) {
    switch (kind) {
        case TypeKind::Integer:
            return RefPtr<TypeDefinition>(new TypeInteger);
        case TypeKind::Character:
            return RefPtr<TypeDefinition>(new TypeCharacter);
        case TypeKind::StrongReference:
            return RefPtr<TypeDefinition>(new TypeStrongReference);
        case TypeKind::WeakReference:
            return RefPtr<TypeDefinition>(new TypeWeakReference);
        case TypeKind::Rename:
            return RefPtr<TypeDefinition>(new TypeRename);
        case TypeKind::Enumeration:
            return RefPtr<TypeDefinition>(new TypeEnumeration);
        case TypeKind::FixedArray:
            return RefPtr<TypeDefinition>(new TypeFixedArray);
        case TypeKind::VariableArray:
            return RefPtr<TypeDefinition>(new TypeVariableArray);
        case TypeKind::Set:
            return RefPtr<TypeDefinition>(new TypeSet);
        case TypeKind::Record:
            return RefPtr<TypeDefinition>(new TypeRecord);
        case TypeKind::Stream:
            return RefPtr<TypeDefinition>(new TypeStream);
        case TypeKind::String:
            return RefPtr<TypeDefinition>(new TypeString);
        case TypeKind::ExtendibleEnumeration:
            return RefPtr<TypeDefinition>(new TypeExtendibleEnumeration);
        case TypeKind::Indirect:
            return RefPtr<TypeDefinition>(new TypeIndirect);
        case TypeKind::Opaque:
            return RefPtr<TypeDefinition>(new TypeOpaque);
    }
    return nullptr;
}

RefPtr<TypeDefinition> MakeBuiltInType(Model& model, const BuiltInType& entry) {
    RefPtr<TypeDefinition> type = MakeType(entry.kind);
    const std::wstring name = Widen(entry.name);
    type->JoinModel(model);
    type->MarkBuiltIn();
    switch (entry.kind) {
        case TypeKind::Integer:
            As<TypeInteger>(*type)->Setup(entry.id, name, entry.size, entry.isSigned);
            break;
        case TypeKind::StrongReference:
            As<TypeStrongReference>(*type)->Setup(entry.id, name, entry.target);
            break;
        case TypeKind::WeakReference:
            SetupWeakReference(entry, name, *As<TypeWeakReference>(*type));
            break;
        case TypeKind::Rename:
            As<TypeRename>(*type)->Setup(entry.id, name, Need(model, entry.target));
            break;
        case TypeKind::Enumeration:
            SetupEnumeration(model, entry, name, *As<TypeEnumeration>(*type));
            break;
        case TypeKind::FixedArray:
            As<TypeFixedArray>(*type)->Setup(entry.id, name, Need(model, entry.target), entry.size);
            break;
        case TypeKind::VariableArray:
            As<TypeVariableArray>(*type)->Setup(entry.id, name, Need(model, entry.target));
            break;
        case TypeKind::Set:
            As<TypeSet>(*type)->Setup(entry.id, name, Need(model, entry.target));
            break;
        case TypeKind::Record:
            SetupRecord(model, entry, name, *As<TypeRecord>(*type));
            break;
        case TypeKind::String:
            As<TypeString>(*type)->Setup(entry.id, name, Need(model, entry.target));
            break;
        case TypeKind::ExtendibleEnumeration:
            SetupExtendible(entry, name, *As<TypeExtendibleEnumeration>(*type));
            break;
        case TypeKind::Character:
        case TypeKind::Stream:
        case TypeKind::Indirect:
        case TypeKind::Opaque:
            type->SetIdentity(entry.id, name);
            break;
    }
    return type;
}

}  // namespace aaf
