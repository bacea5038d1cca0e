// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/model/Enumerator.h"
#include "aaf_library/model/Object.h"
#include "host_interfaces/aaf/AAFMetaDefinitions.h"
#include "host_interfaces/aaf/AAFTypeDefinitions.h"
#include "not_implemented/AAFDefinitions.h"
#include "not_implemented/AAFEffectDefinitions.h"
#include "not_implemented/AAFPluginDefinitions.h"

namespace aaf {

// A definition of the dictionary: id, name and description.
class DefinitionObject : public Implements<Object, IAAFDefObject> {
public:
    // Its id; all zero before it is initialised.
    GUID Identification() const;

    // -- IAAFDefObject
    HRESULT SetName(aafCharacter_constptr name) override {
        return PutString(prop::DefinitionObject_Name, name);
    }
    HRESULT GetName(aafCharacter* name, aafUInt32 bufSize) override {
        return ReadString(prop::DefinitionObject_Name, name, bufSize);
    }
    HRESULT GetNameBufLen(aafUInt32* bufSize) override {
        return ReadStringLength(prop::DefinitionObject_Name, bufSize);
    }
    HRESULT SetDescription(aafCharacter_constptr description) override {
        return PutString(prop::DefinitionObject_Description, description);
    }
    HRESULT GetDescription(aafCharacter* description, aafUInt32 bufSize) override {
        return ReadString(prop::DefinitionObject_Description, description, bufSize);
    }
    // Without a description there is nothing to read: 0.
    HRESULT GetDescriptionBufLen(aafUInt32* bufSize) override {
        if (bufSize != nullptr && !IsPresent(prop::DefinitionObject_Description)) {
            *bufSize = 0;
            return AAFRESULT_SUCCESS;
        }
        return ReadStringLength(prop::DefinitionObject_Description, bufSize);
    }
    HRESULT Initialize(aafUID_constref id, aafCharacter_constptr name) override;
    HRESULT GetAUID(aafUID_t* auid) override {
        return ReadStruct(prop::DefinitionObject_Identification, auid);
    }

protected:
    HRESULT InitializeDefinition(const GUID& id, aafCharacter_constptr name,
                                 aafCharacter_constptr description);
};

// The kinds of data that components hold. A legacy id and its newer counterpart
// count as one kind.
class DataDefinition
    : public Implements<DefinitionObject, IAAFDataDef, IAAFDataDef2, IAAFDataDef3> {
public:
    // Equal ids, two ids of one kind, or picture with matte into picture.
    static bool Converts(const GUID& from, const GUID& to);

    // -- IAAFDataDef and its successors
    HRESULT Initialize(aafUID_constref id, aafCharacter_constptr name,
                       aafCharacter_constptr description) override;
    HRESULT IsPictureKind(aafBoolean_t* bIsPictureKind) override;
    HRESULT IsMatteKind(aafBoolean_t* bIsMatteKind) override;
    HRESULT IsPictureWithMatteKind(aafBoolean_t* bIsPictureWithMatteKind) override;
    HRESULT IsSoundKind(aafBoolean_t* bIsSoundKind) override;
    HRESULT DoesDataDefConvertTo(IAAFDataDef* id, aafBoolean_t* bDoesConvertTo) override;
    HRESULT IsDataDefOf(IAAFDataDef* dataDef, aafBoolean_t* bIsDataDefOf) override;
    HRESULT DoesDataDefConvertFrom(IAAFDataDef* dataDef, aafBoolean_t* bDoesConvertFrom) override;
    HRESULT IsEdgecodeKind(aafBoolean_t* bIsEdgecodeKind) override;
    HRESULT IsTimecodeKind(aafBoolean_t* bIsTimecodeKind) override;
    HRESULT IsAuxiliaryKind(aafBoolean_t* bIsAuxiliaryKind) override;
    HRESULT IsDescriptiveMetadataKind(aafBoolean_t* bIsDescriptiveMetadataKind) override;

private:
    HRESULT IsKind(const GUID& kind, aafBoolean_t* out) const;
};

// The wrapping of essence in files.
class ContainerDefinition : public Implements<DefinitionObject, IAAFContainerDef> {
public:
    // -- IAAFContainerDef
    HRESULT Initialize(aafUID_constref id, aafCharacter_constptr name,
                       aafCharacter_constptr description) override {
        return InitializeDefinition(id, name, description);
    }
    HRESULT EssenceIsIdentified(aafBoolean_t* essenceIsIdentified) override {
        return ReadInteger(prop::ContainerDefinition_EssenceIsIdentified, essenceIsIdentified);
    }
    HRESULT SetEssenceIsIdentified(aafBoolean_t essenceIsIdentified) override;
};

// A definition of which only id, name and description are looked at.
template <class Interface>
class PlainDefinition : public Implements<DefinitionObject, Interface> {
public:
    HRESULT Initialize(aafUID_constref id, aafCharacter_constptr name,
                       aafCharacter_constptr description) override {
        return this->InitializeDefinition(id, name, description);
    }
};

// What KLV data with a key holds.
class KLVDataDefinition : public PlainDefinition<IAAFKLVDataDefinition> {
public:
    HRESULT GetKLVDataType(IAAFTypeDef** typeDef) override {
        return ReadWeak(prop::KLVDataDefinition_KLVDataType, typeDef);
    }
    HRESULT SetKLVDataType(IAAFTypeDef* typeDef) override;
};

using InterpolationDefinition = PlainDefinition<IAAFInterpolationDef>;
using TaggedValueDefinition = PlainDefinition<IAAFTaggedValueDefinition>;

// A codec: the descriptor class and the kinds of data that it serves.
class CodecDefinition : public PlainDefinition<IAAFCodecDef> {
public:
    // -- IAAFCodecDef
    HRESULT IsEssenceKindSupported(IAAFDataDef* essenceKind, aafBoolean_t* isSupported) override;
    HRESULT AddEssenceKind(IAAFDataDef* essenceKind) override {
        return AppendWeak(prop::CodecDefinition_DataDefinitions, essenceKind);
    }
    HRESULT RemoveEssenceKind(IAAFDataDef* essenceKind) override;
    HRESULT CountEssenceKinds(aafUInt32* result) override;
    HRESULT GetEssenceKinds(IEnumAAFDataDefs** enumerator) override;
    HRESULT GetFileDescriptorClass(IAAFClassDef** cls) override {
        return ReadWeak(prop::CodecDefinition_FileDescriptorClass, cls);
    }
    HRESULT SetFileDescriptorClass(IAAFClassDef* cls) override;
};

// A parameter of effects, with its type.
class ParameterDefinition : public Implements<DefinitionObject, IAAFParameterDef> {
public:
    // -- IAAFParameterDef
    HRESULT Initialize(aafUID_constref id, aafCharacter_constptr name,
                       aafCharacter_constptr description, IAAFTypeDef* type) override;
    HRESULT GetTypeDefinition(IAAFTypeDef** typeDef) override {
        return ReadWeak(prop::ParameterDefinition_Type, typeDef);
    }
    HRESULT SetDisplayUnits(aafCharacter_constptr displayUnits) override {
        return PutString(prop::ParameterDefinition_DisplayUnits, displayUnits);
    }
    HRESULT GetDisplayUnits(aafCharacter* displayUnits, aafUInt32 bufSize) override {
        return ReadString(prop::ParameterDefinition_DisplayUnits, displayUnits, bufSize);
    }
    HRESULT GetDisplayUnitsBufLen(aafUInt32* bufSize) override;
};

}  // namespace aaf
