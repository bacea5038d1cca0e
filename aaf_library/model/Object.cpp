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
    Complete();
    const auto found = values_.find(NumberOf(key));
    return found == values_.end() || found->second->asStored() ? nullptr : found->second.get();
}

HRESULT Object::RemoveValue(const PropertyKey& key) {
    const auto found = values_.find(NumberOf(key));
    if (found == values_.end()) {
        return AAFRESULT_PROP_NOT_PRESENT;
    }
    model()->TellChange();
    const RefPtr<PropertyValue> value = std::move(found->second);
    values_.erase(found);
    value->LeaveObject();
    return AAFRESULT_SUCCESS;
}

PropertyValue* Object::RequireValue(const PropertyKey& key) {
    if (PropertyValue* present = FindValue(key)) {
        return present;
    }
    PropertyDefinition* property =
        key.pid == kNoPropertyId ? class_->FindProperty(key.id) : class_->FindProperty(key.pid);
    if (property == nullptr || property->type() == nullptr) {
        return nullptr;
    }
    RefPtr<PropertyValue> value = property->type()->NewValue();
    value->EnterObject(*this);
    PropertyValue* added = value.get();
    RefPtr<PropertyValue>& place = values_[property->pid()];
    if (place) {
        place->LeaveObject();  // one that is kept as stored
    }
    place = std::move(value);
    return added;
}

HRESULT Object::PutValue(PropertyId pid, PropertyValue* value) {
    const auto present = values_.find(pid);
    if (present != values_.end() && present->second.get() == value) {
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
    RefPtr<PropertyValue>& slot = values_[pid];
    const RefPtr<PropertyValue> old = std::move(slot);
    slot = std::move(entering);
    if (old) {
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
        [self = RefPtr<Object>(this)](std::size_t index) -> RefPtr<Unknown> {
            if (index >= self->values().size()) {
                return nullptr;
            }
            const auto entry =
                std::next(self->values().begin(), static_cast<std::ptrdiff_t>(index));
            PropertyDefinition* property = self->class_->FindProperty(entry->first);
            return RefPtr<Unknown>(new Property(*self, *property, *entry->second));
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
    const auto found = values().find(property->pid());
    return found == values_.end() ? AAFRESULT_PROP_NOT_PRESENT
                                  : GiveOut(found->second.get(), propVal);
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
    *result = values().count(property->pid()) > 0 ? kAAFTrue : kAAFFalse;
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
    if (values().count(property->pid()) > 0) {
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
