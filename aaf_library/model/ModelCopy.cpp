// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include <algorithm>

#include "aaf_library/model/ClassDefinition.h"
#include "aaf_library/model/Dictionary.h"
#include "aaf_library/model/Model.h"
#include "aaf_library/model/StoredNumbers.h"
#include "aaf_library/model/TypeEnumeration.h"
#include "aaf_library/model/TypeFacts.h"
#include "aaf_library/model/TypeIndirect.h"
#include "aaf_library/model/TypeRecord.h"
#include "aaf_library/model/TypeReference.h"
#include "aaf_library/model/ValueWidth.h"
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
    const TypeFacts facts = FactsOf(source);
    if (source.element() != nullptr) {
        TypeLike(*source.element());
    }
    if (source.kind() == TypeKind::Record) {
        for (const TypeDefinition* type : static_cast<const TypeRecord&>(source).types()) {
            TypeLike(*type);
        }
    }
    RefPtr<TypeDefinition> made = MakeType(*this, facts);
    // The layout that callers registered is no part of the definition.
    if (source.kind() == TypeKind::Record) {
        static_cast<TypeRecord&>(*made).UseLayoutOf(static_cast<const TypeRecord&>(source));
    } else if (source.kind() == TypeKind::Enumeration) {
        static_cast<TypeEnumeration&>(*made).RegisterSize(
            static_cast<aafUInt32>(source.NativeSize()));
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

template <class Set>
void Model::CopyDefinition(const Object* definition, const Set& set, const GUID& id) {
    // Definitions may refer to one another in a circle.
    if (definition == nullptr || dictionary_->FindDefinition(set, id) != nullptr ||
        std::find(copying_.begin(), copying_.end(), definition) != copying_.end()) {
        return;
    }
    copying_.push_back(definition);
    dictionary_->AddDefinition(set, CopyObject(*definition).get());
    copying_.pop_back();
}

void Model::CopyReferredTo(const PropertyValue& value) {
    if (value.asStored()) {
        for (const auto& [set, id] : value.asStored()->targets) {
            CopyDefinition(value.model()->dictionary().FindDefinition(set, id), set, id);
        }
        return;
    }
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
        const Unknown* const target = type.model()->FindTarget(weak->targetClass(), id);
        if (const auto* const known = dynamic_cast<const DefinitionObject*>(target)) {
            CopyDefinition(known, weak->targetClass(), id);
        } else if (const auto* const cls = dynamic_cast<const ClassDefinition*>(target)) {
            ClassLike(*cls);
        } else if (const auto* const named = dynamic_cast<const TypeDefinition*>(target)) {
            TypeLike(*named);
        }
    }
}

void Model::CopyParameterNamedBy(const PropertyValue& value) {
    if (value.bytes().size() == kGuidSize) {
        const GUID id = GuidAt(value.bytes().data());
        CopyDefinition(value.model()->dictionary().FindDefinition(AUID_AAFParameterDef, id),
                       AUID_AAFParameterDef, id);
    }
}

HRESULT Model::CopyValue(const PropertyValue& source, Object& target,
                         PropertyDefinition& property) {
    TypeDefinition& type = *TypeLike(source.type());
    RefPtr<PropertyValue> value = NewValue(type);
    CopyReferredTo(source);
    if (source.asStored() || HasWidthOf(source.type(), type)) {
        value->BytesToChange() = source.bytes();
    } else if (!Widen(source, type, value->BytesToChange())) {
        return AAFRESULT_BAD_SIZE;
    }
    value->SetStreamByteOrder(source.streamByteOrder());
    value->KeepAsStored(source.asStored());
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
        if (to != nullptr && to->id() == prop::Parameter_Definition.id) {
            CopyParameterNamedBy(*entry.second);
        }
        if (to == nullptr || CopyValue(*entry.second, *copy, *to) < 0) {
            return nullptr;
        }
    }
    return copy;
}

}  // namespace aaf
