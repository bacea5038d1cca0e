// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/model/ClassDefinition.h"
#include "aaf_library/model/Dictionary.h"
#include "aaf_library/model/Model.h"
#include "aaf_library/model/StoredNumbers.h"
#include "aaf_library/model/TypeEnumeration.h"
#include "aaf_library/model/TypeExtendibleEnumeration.h"
#include "aaf_library/model/TypeFixedArray.h"
#include "aaf_library/model/TypeIndirect.h"
#include "aaf_library/model/TypeInteger.h"
#include "aaf_library/model/TypeRecord.h"
#include "aaf_library/model/TypeReference.h"
#include "aaf_library/model/TypeRename.h"
#include "aaf_library/model/TypeSet.h"
#include "aaf_library/model/TypeString.h"
#include "aaf_library/model/TypeVariableArray.h"
#include "host_interfaces/aaf/AAFClassIds.h"

// Copies objects from model to model. Everything is found again by id: numbers
// of properties and addresses of definitions are each model's own.
namespace aaf {

ClassDefinition* Model::ClassLike(const ClassDefinition& source) {
    if (ClassDefinition* known = FindClass(source.id())) {
        return known;
    }
    RefPtr<ClassDefinition> made(new ClassDefinition);
    made->JoinModel(*this);
    made->SetIdentity(source.id(), source.name());
    made->SetConcrete(source.concrete());
    made->SetParent(source.parent() == nullptr ? nullptr : ClassLike(*source.parent()));
    return &Enter(std::move(made));
}

TypeDefinition* Model::TypeLike(const TypeDefinition& source) {
    if (TypeDefinition* known = FindType(source.id())) {
        return known;
    }
    RefPtr<TypeDefinition> made = MakeType(source.kind());
    made->JoinModel(*this);
    const GUID& id = source.id();
    const std::wstring& name = source.name();
    TypeDefinition* element = source.element() == nullptr ? nullptr : TypeLike(*source.element());
    switch (source.kind()) {
        case TypeKind::Integer: {
            const auto& from = static_cast<const TypeInteger&>(source);
            static_cast<TypeInteger&>(*made).Setup(
                id, name, static_cast<unsigned>(from.StoredSize()), from.IsSignedType());
            break;
        }
        case TypeKind::StrongReference:
            static_cast<TypeStrongReference&>(*made).Setup(
                id, name, static_cast<const TypeReference&>(source).targetClass());
            break;
        case TypeKind::WeakReference: {
            const auto& from = static_cast<const TypeWeakReference&>(source);
            static_cast<TypeWeakReference&>(*made).Setup(id, name, from.targetClass(),
                                                         from.targetSet());
            break;
        }
        case TypeKind::Enumeration: {
            const auto& from = static_cast<const TypeEnumeration&>(source);
            auto& to = static_cast<TypeEnumeration&>(*made);
            to.Setup(id, name, *element, from.members());
            to.RegisterSize(static_cast<aafUInt32>(from.NativeSize()));
            break;
        }
        case TypeKind::ExtendibleEnumeration:
            static_cast<TypeExtendibleEnumeration&>(*made).Setup(
                id, name, static_cast<const TypeExtendibleEnumeration&>(source).members());
            break;
        case TypeKind::Record: {
            const auto& from = static_cast<const TypeRecord&>(source);
            std::vector<TypeRecord::Member> members;
            for (const TypeRecord::Member& member : from.members()) {
                members.push_back({member.name, TypeLike(*member.type)});
            }
            static_cast<TypeRecord&>(*made).Setup(id, name, std::move(members));
            static_cast<TypeRecord&>(*made).UseLayoutOf(from);
            break;
        }
        case TypeKind::FixedArray:
            static_cast<TypeFixedArray&>(*made).Setup(
                id, name, *element, static_cast<const TypeFixedArray&>(source).count());
            break;
        case TypeKind::VariableArray:
            static_cast<TypeVariableArray&>(*made).Setup(id, name, *element);
            break;
        case TypeKind::Set:
            static_cast<TypeSet&>(*made).Setup(id, name, *element);
            break;
        case TypeKind::Rename:
            static_cast<TypeRename&>(*made).Setup(id, name, *element);
            break;
        case TypeKind::String:
            static_cast<TypeString&>(*made).Setup(id, name, *element);
            break;
        case TypeKind::Character:
        case TypeKind::Stream:
        case TypeKind::Indirect:
        case TypeKind::Opaque:
            made->SetIdentity(id, name);
            break;
    }
    return &Enter(std::move(made));
}

PropertyDefinition* Model::PropertyLike(ClassDefinition& owner, const PropertyDefinition& source) {
    if (PropertyDefinition* known = owner.FindProperty(source.id())) {
        return known;
    }
    ClassDefinition* holder = ClassLike(source.owner());
    const TypeDefinition* sourceType = source.type();
    // An id that another class has here already can't be had twice.
    if (!owner.IsKindOf(holder->id()) || HasProperty(source.id()) || sourceType == nullptr ||
        !HasFreePropertyId()) {
        return nullptr;
    }
    return &holder->AddProperty(source.id(), source.name(), TypeLike(*sourceType)->id(),
                                source.IsOptional(), source.IsUnique());
}

void Model::CopyReferredTo(const PropertyValue& value) {
    GUID actual{};
    const TypeDefinition& type = value.type();
    const TypeKind kind = type.Resolved().kind();
    if ((kind == TypeKind::Indirect || kind == TypeKind::Opaque) &&
        ReadIndirectHead(value.bytes(), &actual)) {
        if (const TypeDefinition* found = type.model()->FindType(actual)) {
            TypeLike(*found);
        }
        return;
    }
    const TypeDefinition* reference = &type;
    while (reference->form() != ValueForm::WeakReference && reference->element() != nullptr) {
        reference = reference->element();
    }
    const auto* weak = dynamic_cast<const TypeWeakReference*>(reference);
    if (weak == nullptr) {
        return;
    }
    for (std::size_t at = 0; at + kGuidSize <= value.bytes().size(); at += kGuidSize) {
        const GUID id = GuidAt(value.bytes().data() + at);
        auto* definition =
            dynamic_cast<DefinitionObject*>(type.model()->FindTarget(weak->targetClass(), id));
        if (definition != nullptr && FindTarget(weak->targetClass(), id) == nullptr) {
            const RefPtr<Object> copy = CopyObject(*definition);
            dictionary_->AddDefinition(weak->targetClass(), copy.get());
        }
    }
}

HRESULT Model::CopyValue(const PropertyValue& source, Object& target,
                         PropertyDefinition& property) {
    RefPtr<PropertyValue> value = NewValue(*TypeLike(source.type()));
    CopyReferredTo(source);
    value->BytesToChange() = source.bytes();
    value->SetStreamByteOrder(source.streamByteOrder());
    for (const RefPtr<Object>& object : source.objects()) {
        const RefPtr<Object> copy = CopyObject(*object);
        if (!copy) {
            return AAFRESULT_INVALID_OBJ;
        }
        if (const HRESULT result = value->InsertObject(value->objects().size(), copy.get());
            result < 0) {
            return result;
        }
    }
    return target.PutValue(property.pid(), value.get());
}

RefPtr<Object> Model::CopyObject(const Object& source) {
    ClassDefinition* definition = ClassLike(source.classDefinition());
    RefPtr<Object> copy = CreateObject(*definition, false);
    if (!copy) {
        return nullptr;
    }
    for (const auto& entry : source.values()) {
        const PropertyDefinition* from = source.classDefinition().FindProperty(entry.first);
        PropertyDefinition* to = PropertyLike(*definition, *from);
        if (to == nullptr || CopyValue(*entry.second, *copy, *to) < 0) {
            return nullptr;
        }
    }
    return copy;
}

}  // namespace aaf
