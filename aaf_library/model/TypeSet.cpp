// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/model/TypeSet.h"

#include "aaf_library/model/Model.h"
#include "host_interfaces/aaf/AAFTypeIds.h"

namespace aaf {

ValueForm TypeSet::form() const {
    const ValueForm form = element() == nullptr ? ValueForm::Data : element()->form();
    return form == ValueForm::StrongReference ? ValueForm::StrongSet
           : form == ValueForm::WeakReference ? ValueForm::WeakSet
                                              : ValueForm::Data;
}

Bytes TypeSet::KeyAt(const PropertyValue& value, std::size_t index) const {
    if (HasObjects()) {
        return value.objects()[index]->UniqueKey();
    }
    const auto first = value.bytes().begin() + static_cast<std::ptrdiff_t>(index * ElementSize());
    return Bytes(first, first + static_cast<std::ptrdiff_t>(ElementSize()));
}

Bytes TypeSet::KeyOf(const PropertyValue& element) const {
    return HasObjects() ? element.objects().front()->UniqueKey() : element.bytes();
}

std::size_t TypeSet::Find(const PropertyValue& value, const Bytes& key) const {
    std::size_t index = 0;
    while (index < CountOf(value) && KeyAt(value, index) != key) {
        ++index;
    }
    return index;
}

HRESULT TypeSet::TakeKey(IAAFPropertyValue* set, IAAFPropertyValue* key, PropertyValue** value,
                         Bytes* keyBytes) const {
    if (set == nullptr || key == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    if (const HRESULT result = Take(set, value); result < 0) {
        return result;
    }
    auto* given = ImplementationAs<PropertyValue>(key);
    if (given == nullptr || given->HoldsObjects()) {
        return AAFRESULT_BAD_TYPE;
    }
    *keyBytes = given->bytes();
    return AAFRESULT_SUCCESS;
}

HRESULT TypeSet::Initialize(aafUID_constref id, IAAFTypeDef* typeDef,
                            aafCharacter_constptr typeName) {
    TypeDefinition* elementType = nullptr;
    const HRESULT result = CheckElement(typeDef, typeName, &elementType);
    return result < 0 ? result : SetupElement(id, typeName, *elementType);
}

HRESULT TypeSet::AddElement(IAAFPropertyValue* setPropertyValue,
                            IAAFPropertyValue* elementPropertyValue) {
    PropertyValue* value = nullptr;
    PropertyValue* element = nullptr;
    HRESULT result = TakeBoth(setPropertyValue, elementPropertyValue, &value, &element);
    if (result < 0) {
        return result;
    }
    const std::size_t count = CountOf(*value);
    const Bytes key = KeyOf(*element);
    // Objects without a key are told apart by themselves, which InsertObject sees to.
    if (!key.empty() && Find(*value, key) < count) {
        return HasObjects() ? AAFRESULT_OBJECT_ALREADY_ATTACHED : AAFRESULT_INVALID_PARAM;
    }
    result = InsertElementAt(*value, count, *element);
    if (result >= 0 && HasObjects()) {
        value->SortByKey();
    }
    return result;
}

HRESULT TypeSet::RemoveElement(IAAFPropertyValue* setPropertyValue,
                               IAAFPropertyValue* elementPropertyValue) {
    PropertyValue* value = nullptr;
    PropertyValue* element = nullptr;
    const HRESULT result = TakeBoth(setPropertyValue, elementPropertyValue, &value, &element);
    if (result < 0) {
        return result;
    }
    const std::size_t index = Find(*value, KeyOf(*element));
    return index < CountOf(*value) ? EraseElement(*value, index) : AAFRESULT_OBJECT_NOT_FOUND;
}

HRESULT TypeSet::ContainsElement(IAAFPropertyValue* setPropertyValue,
                                 IAAFPropertyValue* elementPropertyValue,
                                 aafBoolean_t* containsElement) {
    PropertyValue* value = nullptr;
    PropertyValue* element = nullptr;
    if (containsElement == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    const HRESULT result = TakeBoth(setPropertyValue, elementPropertyValue, &value, &element);
    if (result >= 0) {
        const bool found = Find(*value, KeyOf(*element)) < CountOf(*value);
        *containsElement = found ? kAAFTrue : kAAFFalse;
    }
    return result;
}

HRESULT TypeSet::GetCount(IAAFPropertyValue* setPropertyValue, aafUInt32* count) {
    PropertyValue* value = nullptr;
    if (count == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    const HRESULT result = Take(setPropertyValue, &value);
    if (result >= 0) {
        *count = static_cast<aafUInt32>(CountOf(*value));
    }
    return result;
}

HRESULT TypeSet::CreateKey(aafDataBuffer_t keyPtr, aafUInt32 length, IAAFPropertyValue** key) {
    if (keyPtr == nullptr || key == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    // Keys are ids, whose type tells how they are stored.
    const bool isMobId = length == sizeof(aafMobID_t);
    TypeDefinition* type = model()->FindType(isMobId ? kAAFTypeID_MobIDType : kAAFTypeID_AUID);
    Bytes stored;
    const HRESULT result = type->Encode(keyPtr, length, stored);
    return result < 0 ? result : GiveValue(*type, std::move(stored), key);
}

HRESULT TypeSet::LookupElement(IAAFPropertyValue* setPropertyValue, IAAFPropertyValue* key,
                               IAAFPropertyValue** elementPropertyValue) {
    PropertyValue* value = nullptr;
    Bytes keyBytes;
    if (elementPropertyValue == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    if (const HRESULT result = TakeKey(setPropertyValue, key, &value, &keyBytes); result < 0) {
        return result;
    }
    const std::size_t index = Find(*value, keyBytes);
    return index < CountOf(*value) ? GiveElement(*value, index, elementPropertyValue)
                                   : AAFRESULT_OBJECT_NOT_FOUND;
}

HRESULT TypeSet::ContainsKey(IAAFPropertyValue* setPropertyValue, IAAFPropertyValue* key,
                             aafBoolean_t* containsKey) {
    PropertyValue* value = nullptr;
    Bytes keyBytes;
    if (containsKey == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    const HRESULT result = TakeKey(setPropertyValue, key, &value, &keyBytes);
    if (result >= 0) {
        *containsKey = Find(*value, keyBytes) < CountOf(*value) ? kAAFTrue : kAAFFalse;
    }
    return result;
}

}  // namespace aaf
