// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/model/TypeReference.h"

#include "aaf_library/model/ClassDefinition.h"
#include "aaf_library/model/DefinitionObjects.h"
#include "aaf_library/model/Model.h"
#include "aaf_library/model/StoredNumbers.h"

namespace aaf {

bool WeakKeyOf(Unknown& target, GUID* id) {
    if (auto* object = dynamic_cast<DefinitionObject*>(&target)) {
        const PropertyValue* value = object->FindValue(prop::DefinitionObject_Identification);
        if (value == nullptr || value->bytes().size() != kGuidSize) {
            return false;
        }
        *id = GuidAt(value->bytes().data());
        return true;
    }
    auto* definition = dynamic_cast<MetaDefinition*>(&target);
    if (definition != nullptr) {
        *id = definition->id();
    }
    return definition != nullptr;
}

HRESULT TypeReference::SetupTarget(const GUID& id, const std::wstring& name,
                                   const GUID& targetClass) {
    const HRESULT result = SetIdentity(id, name);
    if (result >= 0) {
        targetClass_ = targetClass;
    }
    return result;
}

HRESULT TypeReference::CheckTarget(IAAFClassDef* objType, aafCharacter_constptr typeName,
                                   ClassDefinition** target) const {
    if (objType == nullptr || typeName == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    *target = ImplementationAs<ClassDefinition>(objType);
    const bool known = *target != nullptr && (*target)->model() == model();
    return known ? AAFRESULT_SUCCESS : AAFRESULT_INVALID_OBJ;
}

HRESULT TypeReference::GetObjectType(IAAFClassDef** objType) {
    if (objType == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    if (!IsInitialized()) {
        return AAFRESULT_NOT_INITIALIZED;
    }
    ClassDefinition* target = model()->FindClass(targetClass_);
    return target == nullptr ? AAFRESULT_NO_MORE_OBJECTS : GiveOut(target, objType);
}

HRESULT TypeReference::CreateValue(IUnknown* obj, IAAFPropertyValue** propVal) {
    if (obj == nullptr || propVal == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    if (!IsInitialized()) {
        return AAFRESULT_NOT_INITIALIZED;
    }
    Unknown* object = ImplementationOf(obj);
    if (object == nullptr) {
        return AAFRESULT_INVALID_OBJ;
    }
    RefPtr<PropertyValue> value = NewValue();
    const HRESULT result = Fill(*value, *object);
    return result < 0 ? result : GiveOut(value.get(), propVal);
}

HRESULT TypeReference::GetObject(IAAFPropertyValue* propVal, REFIID iid, IUnknown** object) {
    PropertyValue* value = nullptr;
    if (object == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    if (const HRESULT result = Take(propVal, &value); result < 0) {
        return result;
    }
    Unknown* target = TargetOf(*value);
    return target == nullptr ? AAFRESULT_OBJECT_NOT_FOUND
                             : target->QueryInterface(iid, reinterpret_cast<void**>(object));
}

HRESULT TypeReference::SetObject(IAAFPropertyValue* propVal, IUnknown* object) {
    PropertyValue* value = nullptr;
    if (object == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    if (const HRESULT result = Take(propVal, &value); result < 0) {
        return result;
    }
    Unknown* target = ImplementationOf(object);
    return target == nullptr ? AAFRESULT_INVALID_OBJ : Fill(*value, *target);
}

HRESULT TypeStrongReference::Initialize(aafUID_constref id, IAAFClassDef* objType,
                                        aafCharacter_constptr typeName) {
    ClassDefinition* target = nullptr;
    const HRESULT result = CheckTarget(objType, typeName, &target);
    return result < 0 ? result : SetupTarget(id, typeName, target->id());
}

HRESULT TypeStrongReference::Fill(PropertyValue& value, Unknown& target) {
    auto* object = dynamic_cast<Object*>(&target);
    if (object == nullptr || object->model() != model()) {
        return AAFRESULT_INVALID_OBJ;
    }
    if (!object->IsKindOf(targetClass())) {
        return AAFRESULT_BAD_TYPE;
    }
    // A value that stands in an object takes only what has no owner yet.
    if (value.holder() != nullptr && object->owner() != nullptr) {
        return AAFRESULT_OBJECT_ALREADY_ATTACHED;
    }
    value.ClearObjects();
    return value.InsertObject(0, object);
}

Unknown* TypeStrongReference::TargetOf(const PropertyValue& value) const {
    return value.objects().empty() ? nullptr : value.objects().front().get();
}

HRESULT TypeWeakReference::Setup(const GUID& id, const std::wstring& name, const GUID& targetClass,
                                 std::vector<GUID> targetSet) {
    const HRESULT result = SetupTarget(id, name, targetClass);
    if (result >= 0) {
        targetSet_ = std::move(targetSet);
    }
    return result;
}

HRESULT TypeWeakReference::Initialize(aafUID_constref id, IAAFClassDef* objType,
                                      aafCharacter_constptr typeName, aafUInt32 ids,
                                      aafUID_constptr targetSet) {
    ClassDefinition* target = nullptr;
    if (targetSet == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    const HRESULT result = CheckTarget(objType, typeName, &target);
    return result < 0 ? result : Setup(id, typeName, target->id(), {targetSet, targetSet + ids});
}

HRESULT TypeWeakReference::Fill(PropertyValue& value, Unknown& object) {
    GUID id{};
    if (!WeakKeyOf(object, &id)) {
        return AAFRESULT_BAD_TYPE;
    }
    if (model()->FindTarget(targetClass(), id) == nullptr) {
        return AAFRESULT_OBJECT_NOT_ATTACHED;
    }
    value.BytesToChange().clear();
    AppendGuid(id, value.BytesToChange());
    return AAFRESULT_SUCCESS;
}

Unknown* TypeWeakReference::TargetOf(const PropertyValue& value) const {
    return value.bytes().size() == kGuidSize
               ? model()->FindTarget(targetClass(), GuidAt(value.bytes().data()))
               : nullptr;
}

}  // namespace aaf
