// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/aaf/AAFDefinitions.h"
#include "host_interfaces/aaf/AAFResultCodes.h"
#include "reference_host/aaf/model/NotImplemented.h"

// Bodies for operations that a class leaves out; see NotImplemented.h.
namespace aaf {

template <>
class NotImplemented<IAAFDictionary> : public IAAFDictionary {
public:
    HRESULT CreateInstance(aafUID_constref, REFIID, IUnknown**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT CreateMetaInstance(aafUID_constref, REFIID, IUnknown**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT RegisterClassDef(IAAFClassDef*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT LookupClassDef(aafUID_constref, IAAFClassDef**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetClassDefs(IEnumAAFClassDefs**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT CountClassDefs(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT CreateForwardClassReference(aafUID_constref) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT HasForwardClassReference(aafUID_constref, aafBoolean_t*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT RegisterTypeDef(IAAFTypeDef*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT LookupTypeDef(aafUID_constref, IAAFTypeDef**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetTypeDefs(IEnumAAFTypeDefs**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT CountTypeDefs(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT RegisterOpaqueTypeDef(IAAFTypeDef*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT LookupOpaqueTypeDef(aafUID_constref, IAAFTypeDef**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetOpaqueTypeDefs(IEnumAAFTypeDefs**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT CountOpaqueTypeDefs(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT RegisterKLVDataKey(aafUID_t, IAAFTypeDef*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT RegisterDataDef(IAAFDataDef*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT LookupDataDef(aafUID_constref, IAAFDataDef**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetDataDefs(IEnumAAFDataDefs**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT CountDataDefs(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT RegisterOperationDef(IAAFOperationDef*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT LookupOperationDef(aafUID_constref, IAAFOperationDef**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetOperationDefs(IEnumAAFOperationDefs**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT CountOperationDefs(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT RegisterParameterDef(IAAFParameterDef*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT LookupParameterDef(aafUID_constref, IAAFParameterDef**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetParameterDefs(IEnumAAFParameterDefs**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT CountParameterDefs(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT RegisterCodecDef(IAAFCodecDef*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT LookupCodecDef(aafUID_constref, IAAFCodecDef**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetCodecDefs(IEnumAAFCodecDefs**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT CountCodecDefs(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT RegisterContainerDef(IAAFContainerDef*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT LookupContainerDef(aafUID_constref, IAAFContainerDef**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetContainerDefs(IEnumAAFContainerDefs**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT CountContainerDefs(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT RegisterInterpolationDef(IAAFInterpolationDef*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT LookupInterpolationDef(aafUID_constref, IAAFInterpolationDef**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetInterpolationDefs(IEnumAAFInterpolationDefs**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT CountInterpolationDefs(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT RegisterPluginDef(IAAFPluginDef*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT LookupPluginDef(aafUID_constref, IAAFPluginDef**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetPluginDefs(IEnumAAFPluginDefs**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT CountPluginDefs(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFDictionary2> : public IAAFDictionary2 {
public:
    HRESULT CreateInstance(aafUID_constref, REFIID, IUnknown**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT CreateMetaInstance(aafUID_constref, REFIID, IUnknown**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT RegisterClassDef(IAAFClassDef*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT LookupClassDef(aafUID_constref, IAAFClassDef**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetClassDefs(IEnumAAFClassDefs**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT CountClassDefs(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT CreateForwardClassReference(aafUID_constref) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT HasForwardClassReference(aafUID_constref, aafBoolean_t*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT RegisterTypeDef(IAAFTypeDef*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT LookupTypeDef(aafUID_constref, IAAFTypeDef**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetTypeDefs(IEnumAAFTypeDefs**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT CountTypeDefs(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT RegisterOpaqueTypeDef(IAAFTypeDef*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT LookupOpaqueTypeDef(aafUID_constref, IAAFTypeDef**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetOpaqueTypeDefs(IEnumAAFTypeDefs**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT CountOpaqueTypeDefs(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT RegisterKLVDataKey(aafUID_t, IAAFTypeDef*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT RegisterDataDef(IAAFDataDef*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT LookupDataDef(aafUID_constref, IAAFDataDef**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetDataDefs(IEnumAAFDataDefs**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT CountDataDefs(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT RegisterOperationDef(IAAFOperationDef*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT LookupOperationDef(aafUID_constref, IAAFOperationDef**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetOperationDefs(IEnumAAFOperationDefs**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT CountOperationDefs(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT RegisterParameterDef(IAAFParameterDef*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT LookupParameterDef(aafUID_constref, IAAFParameterDef**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetParameterDefs(IEnumAAFParameterDefs**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT CountParameterDefs(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT RegisterCodecDef(IAAFCodecDef*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT LookupCodecDef(aafUID_constref, IAAFCodecDef**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetCodecDefs(IEnumAAFCodecDefs**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT CountCodecDefs(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT RegisterContainerDef(IAAFContainerDef*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT LookupContainerDef(aafUID_constref, IAAFContainerDef**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetContainerDefs(IEnumAAFContainerDefs**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT CountContainerDefs(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT RegisterInterpolationDef(IAAFInterpolationDef*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT LookupInterpolationDef(aafUID_constref, IAAFInterpolationDef**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetInterpolationDefs(IEnumAAFInterpolationDefs**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT CountInterpolationDefs(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT RegisterPluginDef(IAAFPluginDef*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT LookupPluginDef(aafUID_constref, IAAFPluginDef**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetPluginDefs(IEnumAAFPluginDefs**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT CountPluginDefs(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT RegisterKLVDataDef(IAAFKLVDataDefinition*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT LookupKLVDataDef(aafUID_constref, IAAFKLVDataDefinition**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetKLVDataDefs(IEnumAAFKLVDataDefs**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT CountKLVDataDefs(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT RegisterTaggedValueDef(IAAFTaggedValueDefinition*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT LookupTaggedValueDef(aafUID_constref, IAAFTaggedValueDefinition**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetTaggedValueDefs(IEnumAAFTaggedValueDefs**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT CountTaggedValueDefs(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT LookupAuxiliaryDataDef(IAAFDataDef**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT LookupDescriptiveMetadataDataDef(IAAFDataDef**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT LookupEdgecodeDataDef(IAAFDataDef**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT LookupLegacyPictureDataDef(IAAFDataDef**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT LookupLegacySoundDataDef(IAAFDataDef**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT LookupLegacyTimecodeDataDef(IAAFDataDef**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT LookupMatteDataDef(IAAFDataDef**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT LookupPictureDataDef(IAAFDataDef**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT LookupPictureWithMatteDataDef(IAAFDataDef**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT LookupSoundDataDef(IAAFDataDef**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT LookupTimecodeDataDef(IAAFDataDef**) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFDefObject> : public IAAFDefObject {
public:
    HRESULT SetName(aafCharacter_constptr) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetName(aafCharacter*, aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetNameBufLen(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetDescription(aafCharacter_constptr) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetDescription(aafCharacter*, aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetDescriptionBufLen(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Initialize(aafUID_constref, aafCharacter_constptr) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetAUID(aafUID_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFDataDef> : public IAAFDataDef {
public:
    HRESULT Initialize(aafUID_constref, aafCharacter_constptr, aafCharacter_constptr) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT IsPictureKind(aafBoolean_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT IsMatteKind(aafBoolean_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT IsPictureWithMatteKind(aafBoolean_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT IsSoundKind(aafBoolean_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT DoesDataDefConvertTo(IAAFDataDef*, aafBoolean_t*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT IsDataDefOf(IAAFDataDef*, aafBoolean_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT DoesDataDefConvertFrom(IAAFDataDef*, aafBoolean_t*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFDataDef2> : public IAAFDataDef2 {
public:
    HRESULT Initialize(aafUID_constref, aafCharacter_constptr, aafCharacter_constptr) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT IsPictureKind(aafBoolean_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT IsMatteKind(aafBoolean_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT IsPictureWithMatteKind(aafBoolean_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT IsSoundKind(aafBoolean_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT DoesDataDefConvertTo(IAAFDataDef*, aafBoolean_t*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT IsDataDefOf(IAAFDataDef*, aafBoolean_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT DoesDataDefConvertFrom(IAAFDataDef*, aafBoolean_t*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT IsEdgecodeKind(aafBoolean_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT IsTimecodeKind(aafBoolean_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFDataDef3> : public IAAFDataDef3 {
public:
    HRESULT Initialize(aafUID_constref, aafCharacter_constptr, aafCharacter_constptr) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT IsPictureKind(aafBoolean_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT IsMatteKind(aafBoolean_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT IsPictureWithMatteKind(aafBoolean_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT IsSoundKind(aafBoolean_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT DoesDataDefConvertTo(IAAFDataDef*, aafBoolean_t*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT IsDataDefOf(IAAFDataDef*, aafBoolean_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT DoesDataDefConvertFrom(IAAFDataDef*, aafBoolean_t*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT IsEdgecodeKind(aafBoolean_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT IsTimecodeKind(aafBoolean_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT IsAuxiliaryKind(aafBoolean_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT IsDescriptiveMetadataKind(aafBoolean_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFContainerDef> : public IAAFContainerDef {
public:
    HRESULT Initialize(aafUID_constref, aafCharacter_constptr, aafCharacter_constptr) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT EssenceIsIdentified(aafBoolean_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetEssenceIsIdentified(aafBoolean_t) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IEnumAAFDataDefs> : public IEnumAAFDataDefs {
public:
    HRESULT NextOne(IAAFDataDef**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Next(aafUInt32, IAAFDataDef**, aafUInt32*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT Skip(aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Reset() override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Clone(IEnumAAFDataDefs**) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IEnumAAFContainerDefs> : public IEnumAAFContainerDefs {
public:
    HRESULT NextOne(IAAFContainerDef**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Next(aafUInt32, IAAFContainerDef**, aafUInt32*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT Skip(aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Reset() override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Clone(IEnumAAFContainerDefs**) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFCodecDef> : public IAAFCodecDef {
public:
    HRESULT Initialize(aafUID_constref, aafCharacter_constptr, aafCharacter_constptr) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT IsEssenceKindSupported(IAAFDataDef*, aafBoolean_t*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT AddEssenceKind(IAAFDataDef*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT RemoveEssenceKind(IAAFDataDef*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT CountEssenceKinds(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetEssenceKinds(IEnumAAFDataDefs**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT AreThereFlavours(aafBoolean_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetFileDescriptorClass(IAAFClassDef**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetFileDescriptorClass(IAAFClassDef*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT EnumCodecFlavours(IEnumAAFCodecFlavours**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IEnumAAFCodecDefs> : public IEnumAAFCodecDefs {
public:
    HRESULT NextOne(IAAFCodecDef**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Next(aafUInt32, IAAFCodecDef**, aafUInt32*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT Skip(aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Reset() override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Clone(IEnumAAFCodecDefs**) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFInterpolationDef> : public IAAFInterpolationDef {
public:
    HRESULT Initialize(aafUID_constref, aafCharacter_constptr, aafCharacter_constptr) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFKLVDataDefinition> : public IAAFKLVDataDefinition {
public:
    HRESULT Initialize(aafUID_constref, aafCharacter_constptr, aafCharacter_constptr) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT AddParentProperty(IAAFPropertyDef*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetParentProperties(IEnumAAFPropertyDefs**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT CountParentProperties(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT RemoveParentProperty(IAAFPropertyDef*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetKLVDataType(IAAFTypeDef**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetKLVDataType(IAAFTypeDef*) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFOperationDef> : public IAAFOperationDef {
public:
    HRESULT Initialize(aafUID_constref, aafCharacter_constptr, aafCharacter_constptr) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetDataDef(IAAFDataDef**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetDataDef(IAAFDataDef*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT IsTimeWarp(aafBoolean_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetIsTimeWarp(aafBoolean_t) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT PrependDegradeToOperation(IAAFOperationDef*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT AppendDegradeToOperation(IAAFOperationDef*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT InsertDegradeToOperationAt(aafUInt32, IAAFOperationDef*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT RemoveDegradeToOperationAt(aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetDegradeToOperations(IEnumAAFOperationDefs**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT CountDegradeToOperations(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetCategory(aafUID_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetCategory(aafUID_constref) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetNumberInputs(aafInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetNumberInputs(aafInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetBypass(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetBypass(aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT AddParameterDef(IAAFParameterDef*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetParameterDefs(IEnumAAFParameterDefs**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT CountParameterDefs(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT LookupParameterDef(aafUID_constref, IAAFParameterDef**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFParameterDef> : public IAAFParameterDef {
public:
    HRESULT Initialize(aafUID_constref, aafCharacter_constptr, aafCharacter_constptr,
                       IAAFTypeDef*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetTypeDefinition(IAAFTypeDef**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetDisplayUnits(aafCharacter_constptr) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetDisplayUnits(aafCharacter*, aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetDisplayUnitsBufLen(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFPluginDef> : public IAAFPluginDef {
public:
    HRESULT Initialize(aafUID_constref, aafCharacter_constptr, aafCharacter_constptr) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetCategoryClass(aafUID_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetCategoryClass(aafUID_constref) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetPluginVersion(aafVersionType_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetPluginVersion(aafVersionType_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetPluginVersionString(aafCharacter_constptr) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetPluginVersionString(aafCharacter*, aafUInt32) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetPluginVersionStringBufLen(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetPluginManufacturerName(aafCharacter_constptr) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetPluginManufacturerName(aafCharacter*, aafUInt32) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetPluginManufacturerNameBufLen(aafUInt32*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetManufacturerInfo(IAAFNetworkLocator**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetManufacturerInfo(IAAFNetworkLocator*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetManufacturerID(aafUID_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetManufacturerID(aafUID_constref) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetHardwarePlatform(aafHardwarePlatform_t*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT SetHardwarePlatform(aafHardwarePlatform_constref) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetPlatformVersionRange(aafVersionType_t*, aafVersionType_t*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT SetPlatformMinimumVersion(aafVersionType_constref) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT SetPlatformMaximumVersion(aafVersionType_constref) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetEngine(aafEngine_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetEngine(aafEngine_constref) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetEngineVersionRange(aafVersionType_t*, aafVersionType_t*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT SetEngineMinimumVersion(aafVersionType_constref) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT SetEngineMaximumVersion(aafVersionType_constref) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetPluginAPI(aafPluginAPI_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetPluginAPI(aafPluginAPI_constref) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetPluginAPIVersionRange(aafVersionType_t*, aafVersionType_t*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT SetPluginAPIMinimumVersion(aafVersionType_constref) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT SetPluginAPIMaximumVersion(aafVersionType_constref) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT IsSoftwareOnly(aafBoolean_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetIsSoftwareOnly(aafBoolean_t) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT IsAccelerated(aafBoolean_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetIsAccelerated(aafBoolean_t) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SupportsAuthentication(aafBoolean_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetSupportsAuthentication(aafBoolean_t) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT CountLocators(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT AppendLocator(IAAFLocator*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT PrependLocator(IAAFLocator*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT InsertLocatorAt(aafUInt32, IAAFLocator*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetLocatorAt(aafUInt32, IAAFLocator**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT RemoveLocatorAt(aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetLocators(IEnumAAFPluginLocators**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetDefinitionObjectID(aafUID_t) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetDefinitionObjectID(aafUID_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFPluginManager> : public IAAFPluginManager {
public:
    HRESULT RegisterSharedPlugins() override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT RegisterPluginDirectory(aafCharacter_constptr) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT RegisterPluginFile(aafCharacter_constptr) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT EnumLoadedPlugins(aafUID_constref, IEnumAAFLoadedPlugins**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT CreatePluginDefinition(aafUID_constref, IAAFDictionary*, IAAFDefObject**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT CreateInstance(REFCLSID, IUnknown*, REFIID, void**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFTaggedValueDefinition> : public IAAFTaggedValueDefinition {
public:
    HRESULT Initialize(aafUID_constref, aafCharacter_constptr, aafCharacter_constptr) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT AddParentProperty(IAAFPropertyDef*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetParentProperties(IEnumAAFPropertyDefs**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT CountParentProperties(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT RemoveParentProperty(IAAFPropertyDef*) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IEnumAAFCodecFlavours> : public IEnumAAFCodecFlavours {
public:
    HRESULT NextOne(aafUID_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Next(aafUInt32, aafUID_t*, aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Skip(aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Reset() override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Clone(IEnumAAFCodecFlavours**) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IEnumAAFInterpolationDefs> : public IEnumAAFInterpolationDefs {
public:
    HRESULT NextOne(IAAFInterpolationDef**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Next(aafUInt32, IAAFInterpolationDef**, aafUInt32*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT Skip(aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Reset() override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Clone(IEnumAAFInterpolationDefs**) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IEnumAAFKLVDataDefs> : public IEnumAAFKLVDataDefs {
public:
    HRESULT NextOne(IAAFKLVDataDefinition**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Next(aafUInt32, IAAFKLVDataDefinition**, aafUInt32*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT Skip(aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Reset() override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Clone(IEnumAAFKLVDataDefs**) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IEnumAAFLoadedPlugins> : public IEnumAAFLoadedPlugins {
public:
    HRESULT NextOne(aafUID_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Next(aafUInt32, aafUID_t*, aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Skip(aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Reset() override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Clone(IEnumAAFLoadedPlugins**) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IEnumAAFOperationDefs> : public IEnumAAFOperationDefs {
public:
    HRESULT NextOne(IAAFOperationDef**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Next(aafUInt32, IAAFOperationDef**, aafUInt32*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT Skip(aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Reset() override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Clone(IEnumAAFOperationDefs**) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IEnumAAFParameterDefs> : public IEnumAAFParameterDefs {
public:
    HRESULT NextOne(IAAFParameterDef**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Next(aafUInt32, IAAFParameterDef**, aafUInt32*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT Skip(aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Reset() override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Clone(IEnumAAFParameterDefs**) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IEnumAAFPluginDefs> : public IEnumAAFPluginDefs {
public:
    HRESULT NextOne(IAAFPluginDef**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Next(aafUInt32, IAAFPluginDef**, aafUInt32*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT Skip(aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Reset() override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Clone(IEnumAAFPluginDefs**) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IEnumAAFPluginLocators> : public IEnumAAFPluginLocators {
public:
    HRESULT NextOne(IAAFLocator**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Next(aafUInt32, IAAFLocator**, aafUInt32*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT Skip(aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Reset() override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Clone(IEnumAAFPluginLocators**) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IEnumAAFTaggedValueDefs> : public IEnumAAFTaggedValueDefs {
public:
    HRESULT NextOne(IAAFTaggedValueDefinition**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Next(aafUInt32, IAAFTaggedValueDefinition**, aafUInt32*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT Skip(aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Reset() override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Clone(IEnumAAFTaggedValueDefs**) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

}  // namespace aaf
