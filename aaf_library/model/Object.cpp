// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/model/Object.h"

#include "aaf_library/model/ClassDefinition.h"
#include "aaf_library/model/Dictionary.h"
#include "aaf_library/model/Enumerator.h"
#include "aaf_library/model/Model.h"
#include "aaf_library/model/Property.h"
#include "aaf_library/model/TypeDefinition.h"

// What an object is, its list of values, and IAAFObject.
namespace aaf {

Object::~Object() {
    for (const auto& entry : values_) {
        entry.second->LeaveObject();
    }
}

const GUID& Object::classId() const {
    return class_->id();
}

bool Object::IsKindOf(const GUID& classId) const {
    return class_->IsKindOf(classId);
}

PropertyId Object::NumberOf(const PropertyKey& key) const {
    if (key.pid != kNoPropertyId) {
        return key.pid;
    }
    PropertyDefinition* property = class_->FindProperty(key.id);
    return property == nullptr ? kNoPropertyId : property->pid();
}

PropertyValue* Object::FindValue(const PropertyKey& key) const {
    PropertyValue* const value = values().Find(NumberOf(key));
    return value == nullptr || value->asStored() ? nullptr : value;
}

HRESULT Object::RemoveValue(const PropertyKey& key) {
    if (values().Find(NumberOf(key)) == nullptr) {
        return AAFRESULT_PROP_NOT_PRESENT;
    }
    model()->TellChange();
    values_.Take(NumberOf(key))->LeaveObject();
    return AAFRESULT_SUCCESS;
}

PropertyDefinition* Object::DefinitionOf(const PropertyKey& key) const {
    PropertyDefinition* const property =
        key.pid == kNoPropertyId ? class_->FindProperty(key.id) : class_->FindProperty(key.pid);
    return property == nullptr || property->type() == nullptr ? nullptr : property;
}

PropertyValue* Object::EnterNew(const PropertyDefinition& property, RefPtr<PropertyValue> value) {
    value->EnterObject(*this);
    PropertyValue* added = value.get();
    if (const RefPtr<PropertyValue> old = values_.Put(property.pid(), std::move(value))) {
        old->LeaveObject();  // one that is kept as stored
    }
    return added;
}

PropertyValue* Object::RequireValue(const PropertyKey& key) {
    if (PropertyValue* present = FindValue(key)) {
        return present;
    }
    const PropertyDefinition* const property = DefinitionOf(key);
    return property == nullptr ? nullptr : EnterNew(*property, property->type()->NewValue());
}

PropertyValue* Object::PutBytes(const PropertyKey& key, Bytes bytes) {
    if (PropertyValue* present = FindValue(key)) {
        present->BytesToChange() = std::move(bytes);
        return present;
    }
    const PropertyDefinition* const property = DefinitionOf(key);
    return property == nullptr
               ? nullptr
               : EnterNew(*property, model()->NewValue(*property->type(), std::move(bytes)));
}

HRESULT Object::PutValue(PropertyId pid, PropertyValue* value) {
    if (values_.Find(pid) == value) {
        return AAFRESULT_SUCCESS;
    }
    if (value->model() != model()) {
        return AAFRESULT_INVALID_OBJ;
    }
    RefPtr<PropertyValue> entering(value);
    if (value->holder() != nullptr) {
        // A value has one holder. What it contains can't be shared; plain data is copied.
        if (value->HoldsObjects() && !value->objects().empty()) {
            return AAFRESULT_OBJECT_ALREADY_ATTACHED;
        }
        entering = value->type().NewValue();
        entering->BytesToChange() = value->bytes();
        entering->SetStreamByteOrder(value->streamByteOrder());
        entering->KeepAsStored(value->asStored());
    }
    const HRESULT result = entering->EnterObject(*this);
    if (result < 0) {
        return result;
    }
    if (const RefPtr<PropertyValue> old = values_.Put(pid, std::move(entering))) {
        old->LeaveObject();
    }
    return AAFRESULT_SUCCESS;
}

PropertyDefinition* Object::OwnProperty(IAAFPropertyDef* propDef) const {
    auto* property = ImplementationAs<PropertyDefinition>(propDef);
    return property != nullptr && property->model() == model() &&
                   class_->IsKindOf(property->owner().id())
               ? property
               : nullptr;
}

HRESULT Object::GetGeneration(IAAFIdentification** generation) {
    if (generation == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    return generationTracked_ ? AAFRESULT_PROP_NOT_PRESENT : AAFRESULT_INVALID_PARAM;
}

HRESULT Object::GetGenerationAUID(aafUID_t* result) {
    if (result == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    if (!generationTracked_) {
        return AAFRESULT_INVALID_PARAM;
    }
    return ReadStruct(prop::InterchangeObject_Generation, result);
}

HRESULT Object::GetDefinition(IAAFClassDef** classDef) {
    return classDef == nullptr ? AAFRESULT_NULL_PARAM : GiveOut(class_, classDef);
}

HRESULT Object::GetProperties(IEnumAAFProperties** enumerator) {
    return MakeEnumerator<IAAFProperty>(
        [self = RefPtr<Object>(this),
         given = RefPtr<Property>()](std::size_t index) mutable -> RefPtr<Property> {
            if (index >= self->values().size()) {
                return nullptr;
            }
            const auto& [pid, value] = self->values_.At(index);
            // Who walks through them gives each back before the next.
            if (!given || !given->IsHeldOnce()) {
                given = new Property(*self);
            }
            given->Set(*self->class_->FindProperty(pid), *value);
            return given;
        },
        enumerator);
}

HRESULT Object::CountProperties(aafUInt32* count) {
    if (count == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    *count = static_cast<aafUInt32>(values().size());
    return AAFRESULT_SUCCESS;
}

HRESULT Object::GetPropertyValue(IAAFPropertyDef* propDef, IAAFPropertyValue** propVal) {
    if (propDef == nullptr || propVal == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    PropertyDefinition* property = OwnProperty(propDef);
    if (property == nullptr) {
        return AAFRESULT_BAD_PROP;
    }
    PropertyValue* const found = values().Find(property->pid());
    return found == nullptr ? AAFRESULT_PROP_NOT_PRESENT : GiveOut(found, propVal);
}

HRESULT Object::SetPropertyValue(IAAFPropertyDef* propDef, IAAFPropertyValue* propVal) {
    if (propDef == nullptr || propVal == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    PropertyDefinition* property = OwnProperty(propDef);
    if (property == nullptr) {
        return AAFRESULT_BAD_PROP;
    }
    auto* value = ImplementationAs<PropertyValue>(propVal);
    return value == nullptr ? AAFRESULT_INVALID_OBJ : PutValue(property->pid(), value);
}

HRESULT Object::IsPropertyPresent(IAAFPropertyDef* propDef, aafBoolean_t* result) {
    if (propDef == nullptr || result == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    PropertyDefinition* property = OwnProperty(propDef);
    if (property == nullptr) {
        return AAFRESULT_BAD_PROP;
    }
    *result = values().Find(property->pid()) != nullptr ? kAAFTrue : kAAFFalse;
    return AAFRESULT_SUCCESS;
}

HRESULT Object::RemoveOptionalProperty(IAAFPropertyDef* propDef) {
    if (propDef == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    PropertyDefinition* property = OwnProperty(propDef);
    return property == nullptr ? AAFRESULT_BAD_PROP : RemoveValue(property->key());
}

HRESULT Object::CreateOptionalPropertyValue(IAAFPropertyDef* propDef, IAAFPropertyValue** propVal) {
    if (propDef == nullptr || propVal == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    PropertyDefinition* property = OwnProperty(propDef);
    if (property == nullptr || !property->IsOptional()) {
        return AAFRESULT_BAD_PROP;
    }
    if (values().Find(property->pid()) != nullptr) {
        return AAFRESULT_PROP_ALREADY_PRESENT;
    }
    PropertyValue* value = RequireValue(property->key());
    return value == nullptr ? AAFRESULT_TYPE_NOT_FOUND : GiveOut(value, propVal);
}

HRESULT Object::GetDictionary(IAAFDictionary** dictionary) {
    return dictionary == nullptr ? AAFRESULT_NULL_PARAM
                                 : GiveOut<IAAFDictionary>(&model()->dictionary(), dictionary);
}

HRESULT Object::EnableGenerationTracking() {
    generationTracked_ = true;
    return AAFRESULT_SUCCESS;
}

HRESULT Object::DisableGenerationTracking() {
    generationTracked_ = false;
    return AAFRESULT_SUCCESS;
}

HRESULT Object::IsGenerationTracked(aafBoolean_t* result) {
    if (result == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    *result = generationTracked_ ? kAAFTrue : kAAFFalse;
    return AAFRESULT_SUCCESS;
}

}  // namespace aaf
