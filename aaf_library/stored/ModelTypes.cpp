// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/stored/ModelTypes.h"

#include "aaf_library/model/Model.h"
#include "aaf_library/model/TypeEnumeration.h"
#include "aaf_library/model/TypeExtendibleEnumeration.h"
#include "aaf_library/model/TypeFixedArray.h"
#include "aaf_library/model/TypeInteger.h"
#include "aaf_library/model/TypeRecord.h"
#include "aaf_library/model/TypeReference.h"
#include "aaf_library/model/TypeRename.h"
#include "aaf_library/model/TypeSet.h"
#include "aaf_library/model/TypeString.h"
#include "aaf_library/model/TypeVariableArray.h"
#include "aaf_library/stored/ModelNames.h"

namespace aaf::stored {

namespace {

// A property value has a size field of 16 bits.
constexpr std::uint64_t largestValue = 0xFFFF;

void addMembers(const TypeDefinition& type, MetaType& record) {
    switch (record.kind) {
        case TypeKind::Enumeration:
            for (const auto& member : static_cast<const TypeEnumeration&>(type).members()) {
                record.members.push_back({utf16Of(member.name), {}, member.value});
            }
            break;
        case TypeKind::ExtendibleEnumeration:
            for (const auto& member :
                 static_cast<const TypeExtendibleEnumeration&>(type).members()) {
                record.members.push_back({utf16Of(member.name), member.value, 0});
            }
            break;
        case TypeKind::Record:
            for (const auto& member : static_cast<const TypeRecord&>(type).members()) {
                record.members.push_back({utf16Of(member.name), member.type->id(), 0});
            }
            break;
        case TypeKind::WeakReference:
            for (const GUID& step : static_cast<const TypeWeakReference&>(type).targetSet()) {
                record.members.push_back({{}, step, 0});
            }
            break;
        default:
            break;
    }
}

HRESULT setUpRecord(TypeRecord& type, const MetaType& record, Model& model) {
    std::vector<TypeRecord::Member> members;
    std::uint64_t size = 0;
    for (const MetaMember& entry : record.members) {
        TypeDefinition* member = model.FindType(entry.id);
        if (member == nullptr || member->StoredSize() == 0) {
            return AAFRESULT_BAD_TYPE;
        }
        size += member->StoredSize();
        members.push_back({wideOf(entry.name), member});
    }
    if (size == 0 || size > largestValue) {
        return AAFRESULT_BAD_SIZE;
    }
    return type.Setup(record.id, wideOf(record.name), std::move(members));
}

HRESULT setUpEnumeration(TypeEnumeration& type, const MetaType& record, TypeDefinition& element) {
    std::vector<TypeEnumeration::Member> members;
    for (const MetaMember& entry : record.members) {
        members.push_back({wideOf(entry.name), entry.value});
    }
    return type.Setup(record.id, wideOf(record.name), element, std::move(members));
}

HRESULT setUpExtendible(TypeExtendibleEnumeration& type, const MetaType& record) {
    std::vector<TypeExtendibleEnumeration::Member> members;
    for (const MetaMember& entry : record.members) {
        members.push_back({wideOf(entry.name), entry.id});
    }
    return type.Setup(record.id, wideOf(record.name), std::move(members));
}

HRESULT setUpWeak(TypeWeakReference& type, const MetaType& record) {
    std::vector<GUID> path;
    for (const MetaMember& entry : record.members) {
        path.push_back(entry.id);
    }
    return type.Setup(record.id, wideOf(record.name), record.target, std::move(path));
}

HRESULT setUp(TypeDefinition& type, const MetaType& record, Model& model) {
    const std::wstring name = wideOf(record.name);
    TypeDefinition* element = model.FindType(record.target);
    const bool needsElement =
        record.kind == TypeKind::Rename || record.kind == TypeKind::Enumeration ||
        record.kind == TypeKind::FixedArray || record.kind == TypeKind::VariableArray ||
        record.kind == TypeKind::Set || record.kind == TypeKind::String;
    if (needsElement && element == nullptr) {
        return AAFRESULT_BAD_TYPE;
    }
    switch (record.kind) {
        case TypeKind::Integer:
            if (record.size != 1 && record.size != 2 && record.size != 4 && record.size != 8) {
                return AAFRESULT_BAD_SIZE;
            }
            return static_cast<TypeInteger&>(type).Setup(record.id, name, record.size,
                                                         record.isSigned);
        case TypeKind::StrongReference:
            return static_cast<TypeStrongReference&>(type).Setup(record.id, name, record.target);
        case TypeKind::WeakReference:
            return setUpWeak(static_cast<TypeWeakReference&>(type), record);
        case TypeKind::Rename:
            return static_cast<TypeRename&>(type).Setup(record.id, name, *element);
        case TypeKind::Enumeration:
            if (element->Resolved().kind() != TypeKind::Integer) {
                return AAFRESULT_BAD_TYPE;
            }
            return setUpEnumeration(static_cast<TypeEnumeration&>(type), record, *element);
        case TypeKind::ExtendibleEnumeration:
            return setUpExtendible(static_cast<TypeExtendibleEnumeration&>(type), record);
        case TypeKind::FixedArray:
            if (record.size == 0 || element->StoredSize() == 0 ||
                std::uint64_t{record.size} * element->StoredSize() > largestValue) {
                return AAFRESULT_BAD_SIZE;
            }
            return static_cast<TypeFixedArray&>(type).Setup(record.id, name, *element, record.size);
        case TypeKind::VariableArray:
            return static_cast<TypeVariableArray&>(type).Setup(record.id, name, *element);
        case TypeKind::Set:
            return static_cast<TypeSet&>(type).Setup(record.id, name, *element);
        case TypeKind::String:
            return static_cast<TypeString&>(type).Setup(record.id, name, *element);
        case TypeKind::Record:
            return setUpRecord(static_cast<TypeRecord&>(type), record, model);
        default:
            return type.SetIdentity(record.id, name);
    }
}

}  // namespace

MetaType recordOf(const TypeDefinition& type) {
    MetaType record;
    record.id = type.id();
    record.name = utf16Of(type.name());
    record.kind = type.kind();
    if (type.element() != nullptr) {
        record.target = type.element()->id();
    }
    if (record.kind == TypeKind::StrongReference || record.kind == TypeKind::WeakReference) {
        record.target = static_cast<const TypeReference&>(type).targetClass();
    }
    if (record.kind == TypeKind::Integer) {
        record.size = static_cast<std::uint32_t>(type.StoredSize());
        record.isSigned = static_cast<const TypeInteger&>(type).IsSignedType();
    }
    if (record.kind == TypeKind::FixedArray) {
        record.size = static_cast<std::uint32_t>(static_cast<const TypeFixedArray&>(type).count());
    }
    addMembers(type, record);
    return record;
}

RefPtr<TypeDefinition> typeOf(const MetaType& record, Model& model) {
    const RefPtr<TypeDefinition> type = MakeType(record.kind);
    if (!type) {
        return nullptr;
    }
    type->JoinModel(model);
    return setUp(*type, record, model) < 0 ? nullptr : type;
}

}  // namespace aaf::stored
