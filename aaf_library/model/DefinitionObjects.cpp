// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/model/DefinitionObjects.h"

#include "aaf_library/model/WeakLists.h"

namespace aaf {

GUID DefinitionObject::Identification() const {
    GUID id{};
    ReadStruct(prop::DefinitionObject_Identification, &id);
    return id;
}

HRESULT DefinitionObject::InitializeDefinition(const GUID& id, aafCharacter_constptr name,
                                               aafCharacter_constptr description) {
    if (description == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    const HRESULT result = DefinitionObject::Initialize(id, name);
    return result < 0 ? result : DefinitionObject::SetDescription(description);
}

HRESULT DefinitionObject::Initialize(aafUID_constref id, aafCharacter_constptr name) {
    if (name == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    // A dictionary finds its definitions by id.
    if (owner() != nullptr && Identification() != id) {
        return AAFRESULT_OBJECT_ALREADY_ATTACHED;
    }
    PutStruct(prop::DefinitionObject_Identification, id);
    return PutString(prop::DefinitionObject_Name, name);
}

HRESULT ContainerDefinition::SetEssenceIsIdentified(aafBoolean_t essenceIsIdentified) {
    return PutBoolean(prop::ContainerDefinition_EssenceIsIdentified, essenceIsIdentified);
}

HRESULT CodecDefinition::IsEssenceKindSupported(IAAFDataDef* essenceKind,
                                                aafBoolean_t* isSupported) {
    if (essenceKind == nullptr || isSupported == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    const PropertyKey& kinds = prop::CodecDefinition_DataDefinitions;
    const bool found = FindWeak(*this, kinds, essenceKind) < CountWeak(*this, kinds);
    *isSupported = found ? kAAFTrue : kAAFFalse;
    return AAFRESULT_SUCCESS;
}

HRESULT CodecDefinition::RemoveEssenceKind(IAAFDataDef* essenceKind) {
    return RemoveWeak(*this, prop::CodecDefinition_DataDefinitions, essenceKind);
}

HRESULT CodecDefinition::CountEssenceKinds(aafUInt32* result) {
    return ReadWeakCount(*this, prop::CodecDefinition_DataDefinitions, result);
}

HRESULT CodecDefinition::GetEssenceKinds(IEnumAAFDataDefs** enumerator) {
    return EnumerateWeak<IAAFDataDef>(this, prop::CodecDefinition_DataDefinitions, enumerator);
}

HRESULT CodecDefinition::SetFileDescriptorClass(IAAFClassDef* cls) {
    return PutWeak(prop::CodecDefinition_FileDescriptorClass, cls);
}

HRESULT KLVDataDefinition::SetKLVDataType(IAAFTypeDef* typeDef) {
    return PutWeak(prop::KLVDataDefinition_KLVDataType, typeDef);
}

HRESULT ParameterDefinition::Initialize(aafUID_constref id, aafCharacter_constptr name,
                                        aafCharacter_constptr description, IAAFTypeDef* type) {
    if (type == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    const HRESULT result = InitializeDefinition(id, name, description);
    return result < 0 ? result : PutWeak(prop::ParameterDefinition_Type, type);
}

HRESULT ParameterDefinition::GetDisplayUnitsBufLen(aafUInt32* bufSize) {
    return ReadStringLength(prop::ParameterDefinition_DisplayUnits, bufSize);
}

}  // namespace aaf
