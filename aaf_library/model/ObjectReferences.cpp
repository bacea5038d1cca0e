// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include <algorithm>

#include "aaf_library/model/ClassDefinition.h"
#include "aaf_library/model/Model.h"
#include "aaf_library/model/Object.h"
#include "aaf_library/model/StoredNumbers.h"
#include "aaf_library/model/TypeReference.h"

// Contained objects and weak references.
namespace aaf {

namespace {

// The object behind an argument that is to be contained.
HRESULT TakeObject(IUnknown* argument, Object** object) {
    if (argument == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    *object = ImplementationAs<Object>(argument);
    return *object == nullptr ? AAFRESULT_INVALID_OBJ : AAFRESULT_SUCCESS;
}

// The class of what a weak reference, or a list of them, points to.
const GUID* TargetClassOf(const TypeDefinition& type) {
    const TypeDefinition* at = &type;
    while (at->form() != ValueForm::WeakReference && at->element() != nullptr) {
        at = at->element();
    }
    const auto* reference = dynamic_cast<const TypeWeakReference*>(at);
    return reference == nullptr ? nullptr : &reference->targetClass();
}

// The bytes of an object's key; empty when it has none.
const Bytes& KeyOf(const Object& object) {
    static const Bytes none;
    const PropertyDefinition* property = object.classDefinition().FindUniqueProperty();
    const PropertyValue* value = property == nullptr ? nullptr : object.FindValue(property->key());
    return value == nullptr ? none : value->bytes();
}

}  // namespace

HRESULT Object::PutObject(const PropertyKey& key, IUnknown* argument) {
    Object* object = nullptr;
    if (const HRESULT result = TakeObject(argument, &object); result < 0) {
        return result;
    }
    if (object->owner() != nullptr || object->model() != model()) {
        return AAFRESULT_OBJECT_ALREADY_ATTACHED;
    }
    PropertyValue* value = RequireValue(key);
    if (value == nullptr) {
        return AAFRESULT_BAD_PROP;
    }
    const RefPtr<Object> old(ObjectAt(key));
    value->ClearObjects();
    const HRESULT result = value->InsertObject(0, object);
    if (result < 0 && old) {
        value->InsertObject(0, old.get());
    }
    return result;
}

Object* Object::ObjectAt(const PropertyKey& key) const {
    return ObjectAt(key, 0);
}

aafUInt32 Object::CountObjects(const PropertyKey& key) const {
    const PropertyValue* value = FindValue(key);
    return value == nullptr ? 0 : static_cast<aafUInt32>(value->objects().size());
}

Object* Object::ObjectAt(const PropertyKey& key, std::size_t index) const {
    const PropertyValue* value = FindValue(key);
    return value != nullptr && index < value->objects().size() ? value->objects()[index].get()
                                                               : nullptr;
}

HRESULT Object::ReadCount(const PropertyKey& key, aafUInt32* count) const {
    if (count == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    *count = CountObjects(key);
    return AAFRESULT_SUCCESS;
}

HRESULT Object::AppendObject(const PropertyKey& key, IUnknown* object) {
    return InsertObjectAt(key, CountObjects(key), object);
}

HRESULT Object::PrependObject(const PropertyKey& key, IUnknown* object) {
    return InsertObjectAt(key, 0, object);
}

HRESULT Object::InsertObjectAt(const PropertyKey& key, std::size_t index, IUnknown* argument) {
    Object* object = nullptr;
    if (const HRESULT result = TakeObject(argument, &object); result < 0) {
        return result;
    }
    if (index > CountObjects(key)) {
        return AAFRESULT_BADINDEX;
    }
    // Before the list comes into being: a refusal leaves the property absent.
    if (object->owner() != nullptr || object->model() != model()) {
        return AAFRESULT_OBJECT_ALREADY_ATTACHED;
    }
    PropertyValue* value = RequireValue(key);
    return value == nullptr ? AAFRESULT_BAD_PROP : value->InsertObject(index, object);
}

HRESULT Object::RemoveObjectAt(const PropertyKey& key, std::size_t index) {
    PropertyValue* value = FindValue(key);
    if (value == nullptr || index >= value->objects().size()) {
        return AAFRESULT_BADINDEX;
    }
    value->RemoveObjectAt(index);
    return AAFRESULT_SUCCESS;
}

HRESULT Object::RemoveObject(const PropertyKey& key, IUnknown* argument) {
    Object* object = nullptr;
    if (const HRESULT result = TakeObject(argument, &object); result < 0) {
        return result;
    }
    for (std::size_t index = 0; index < CountObjects(key); ++index) {
        if (ObjectAt(key, index) == object) {
            return RemoveObjectAt(key, index);
        }
    }
    return AAFRESULT_OBJECT_NOT_FOUND;
}

Bytes Object::UniqueKey() const {
    return KeyOf(*this);
}

HRESULT Object::AddToSet(const PropertyKey& key, IUnknown* argument) {
    Object* object = nullptr;
    if (const HRESULT result = TakeObject(argument, &object); result < 0) {
        return result;
    }
    if (object->owner() != nullptr || object->model() != model()) {
        return AAFRESULT_OBJECT_ALREADY_ATTACHED;
    }
    PropertyValue* value = RequireValue(key);
    if (value == nullptr) {
        return AAFRESULT_BAD_PROP;
    }
    const Bytes added = object->UniqueKey();
    const auto& elements = value->objects();
    const auto place =
        std::lower_bound(elements.begin(), elements.end(), added,
                         [](const RefPtr<Object>& at, const Bytes& id) { return KeyOf(*at) < id; });
    if (place != elements.end() && KeyOf(**place) == added) {
        return AAFRESULT_OBJECT_ALREADY_ATTACHED;
    }
    return value->InsertObject(static_cast<std::size_t>(place - elements.begin()), object);
}

Object* Object::FindInSet(const PropertyKey& key, const void* keyBytes, std::size_t size) const {
    const PropertyValue* value = FindValue(key);
    if (value == nullptr) {
        return nullptr;
    }
    const auto* const first = static_cast<const std::uint8_t*>(keyBytes);
    const auto* const last = first + size;
    const auto& elements = value->objects();
    const auto place =
        std::partition_point(elements.begin(), elements.end(), [&](const RefPtr<Object>& at) {
            const Bytes& id = KeyOf(*at);
            return std::lexicographical_compare(id.begin(), id.end(), first, last);
        });
    if (place == elements.end()) {
        return nullptr;
    }
    const Bytes& found = KeyOf(**place);
    return std::equal(found.begin(), found.end(), first, last) ? place->get() : nullptr;
}

void Object::SortSet(const PropertyKey& key) {
    if (PropertyValue* value = FindValue(key)) {
        value->SortByKey();
    }
}

HRESULT Object::PutWeak(const PropertyKey& key, IUnknown* target) {
    Bytes id;
    const HRESULT result = WeakKey(key, target, &id);
    if (result >= 0) {
        PutBytes(key, std::move(id));
    }
    return result;
}

HRESULT Object::AppendWeak(const PropertyKey& key, IUnknown* target) {
    Bytes id;
    const HRESULT result = WeakKey(key, target, &id);
    if (result >= 0) {
        Bytes& ids = RequireValue(key)->BytesToChange();
        ids.insert(ids.end(), id.begin(), id.end());
    }
    return result;
}

HRESULT Object::WeakKey(const PropertyKey& key, IUnknown* argument, Bytes* bytes) const {
    GUID id{};
    if (argument == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    Unknown* target = ImplementationOf(argument);
    const PropertyDefinition* const property = DefinitionOf(key);
    if (property == nullptr) {
        return AAFRESULT_BAD_PROP;
    }
    const GUID* targetClass = TargetClassOf(*property->type());
    if (target == nullptr || targetClass == nullptr || !WeakKeyOf(*target, &id)) {
        return AAFRESULT_INVALID_OBJ;
    }
    if (!target->IsKept()) {
        return AAFRESULT_OBJECT_NOT_ATTACHED;
    }
    if (model()->FindTarget(*targetClass, id) == nullptr) {
        return AAFRESULT_INVALID_OBJ;
    }
    AppendGuid(id, *bytes);
    return AAFRESULT_SUCCESS;
}

Unknown* Object::WeakTargetAt(const PropertyKey& key, std::size_t index) const {
    const PropertyValue* const value = FindValue(key);
    if (value == nullptr || index >= value->bytes().size() / kGuidSize) {
        return nullptr;
    }
    const GUID* const targetClass = TargetClassOf(value->type());
    return targetClass == nullptr
               ? nullptr
               : model()->FindTarget(*targetClass,
                                     GuidAt(value->bytes().data() + index * kGuidSize));
}

}  // namespace aaf
