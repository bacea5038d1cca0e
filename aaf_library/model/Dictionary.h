// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/model/BuiltIn.h"
#include "aaf_library/model/DefinitionObjects.h"
#include "not_implemented/AAFDictionary.h"

namespace aaf {

// The definitions of one file. The model owns it; the header's property that
// refers to it only shows where it stands in a stored file.
class Dictionary : public Implements<Object, IAAFDictionary, IAAFDictionary2> {
public:
    // The registered definition of that class, or null.
    Object* FindDefinition(const GUID& classId, const GUID& id) const;
    // The same by the property that holds the set.
    Object* FindDefinition(PropertyId set, const GUID& id) const;
    // Whether a property holds a set that definitions are found in. A file may add other sets.
    static bool IsSetOfDefinitions(PropertyId set);
    // Adds one of that class; its id must be new.
    HRESULT AddDefinition(const GUID& classId, Object* definition);
    HRESULT AddDefinition(PropertyId set, Object* definition);

    // From now on the built-in data and container definitions are there; each comes into being
    // when it is looked up, all of them when the whole set is looked at.
    void OfferBuiltIn() { hasOffers_ = true; }

    bool BelongsToModel() const override { return true; }

    // -- IAAFDictionary, IAAFDictionary2: making objects
    HRESULT CreateInstance(aafUID_constref id, REFIID riid, IUnknown** object) override;
    HRESULT CreateMetaInstance(aafUID_constref id, REFIID riid, IUnknown** metaDefinition) override;

    // Classes and types
    HRESULT RegisterClassDef(IAAFClassDef* classDef) override;
    HRESULT LookupClassDef(aafUID_constref classId, IAAFClassDef** classDef) override;
    HRESULT GetClassDefs(IEnumAAFClassDefs** enumerator) override;
    HRESULT CountClassDefs(aafUInt32* result) override;
    HRESULT RegisterTypeDef(IAAFTypeDef* typeDef) override;
    HRESULT LookupTypeDef(aafUID_constref typeId, IAAFTypeDef** typeDef) override;
    HRESULT GetTypeDefs(IEnumAAFTypeDefs** enumerator) override;
    HRESULT CountTypeDefs(aafUInt32* result) override;

    // Definition objects
    HRESULT RegisterDataDef(IAAFDataDef* dataDef) override;
    HRESULT LookupDataDef(aafUID_constref dataDefinitionId, IAAFDataDef** dataDef) override;
    HRESULT GetDataDefs(IEnumAAFDataDefs** enumerator) override;
    HRESULT CountDataDefs(aafUInt32* result) override;
    HRESULT RegisterOperationDef(IAAFOperationDef* operationDef) override;
    HRESULT LookupOperationDef(aafUID_constref operationId,
                               IAAFOperationDef** operationDef) override;
    HRESULT GetOperationDefs(IEnumAAFOperationDefs** enumerator) override;
    HRESULT CountOperationDefs(aafUInt32* result) override;
    HRESULT RegisterParameterDef(IAAFParameterDef* parmDef) override;
    HRESULT LookupParameterDef(aafUID_constref parameterId, IAAFParameterDef** parmDef) override;
    HRESULT GetParameterDefs(IEnumAAFParameterDefs** enumerator) override;
    HRESULT CountParameterDefs(aafUInt32* result) override;
    HRESULT RegisterCodecDef(IAAFCodecDef* parmDef) override;
    HRESULT LookupCodecDef(aafUID_constref parameterId, IAAFCodecDef** parmDef) override;
    HRESULT GetCodecDefs(IEnumAAFCodecDefs** enumerator) override;
    HRESULT CountCodecDefs(aafUInt32* result) override;
    HRESULT RegisterContainerDef(IAAFContainerDef* parmDef) override;
    HRESULT LookupContainerDef(aafUID_constref parameterId, IAAFContainerDef** parmDef) override;
    HRESULT GetContainerDefs(IEnumAAFContainerDefs** enumerator) override;
    HRESULT CountContainerDefs(aafUInt32* result) override;
    HRESULT RegisterInterpolationDef(IAAFInterpolationDef* interpolationDef) override;
    HRESULT LookupInterpolationDef(aafUID_constref parameterId,
                                   IAAFInterpolationDef** interpolationDef) override;
    HRESULT GetInterpolationDefs(IEnumAAFInterpolationDefs** enumerator) override;
    HRESULT CountInterpolationDefs(aafUInt32* result) override;
    HRESULT RegisterPluginDef(IAAFPluginDef* plugDef) override;
    HRESULT LookupPluginDef(aafUID_constref parameterId, IAAFPluginDef** plugDef) override;
    HRESULT GetPluginDefs(IEnumAAFPluginDefs** enumerator) override;
    HRESULT CountPluginDefs(aafUInt32* result) override;
    HRESULT RegisterKLVDataDef(IAAFKLVDataDefinition* def) override;
    HRESULT LookupKLVDataDef(aafUID_constref defId, IAAFKLVDataDefinition** def) override;
    HRESULT GetKLVDataDefs(IEnumAAFKLVDataDefs** enumerator) override;
    HRESULT CountKLVDataDefs(aafUInt32* result) override;
    HRESULT RegisterTaggedValueDef(IAAFTaggedValueDefinition* def) override;
    HRESULT LookupTaggedValueDef(aafUID_constref defId, IAAFTaggedValueDefinition** def) override;
    HRESULT GetTaggedValueDefs(IEnumAAFTaggedValueDefs** enumerator) override;
    HRESULT CountTaggedValueDefs(aafUInt32* result) override;

    // Well-known data definitions
    HRESULT LookupAuxiliaryDataDef(IAAFDataDef** dataDef) override;
    HRESULT LookupDescriptiveMetadataDataDef(IAAFDataDef** dataDef) override;
    HRESULT LookupEdgecodeDataDef(IAAFDataDef** dataDef) override;
    HRESULT LookupLegacyPictureDataDef(IAAFDataDef** dataDef) override;
    HRESULT LookupLegacySoundDataDef(IAAFDataDef** dataDef) override;
    HRESULT LookupLegacyTimecodeDataDef(IAAFDataDef** dataDef) override;
    HRESULT LookupMatteDataDef(IAAFDataDef** dataDef) override;
    HRESULT LookupPictureDataDef(IAAFDataDef** dataDef) override;
    HRESULT LookupPictureWithMatteDataDef(IAAFDataDef** dataDef) override;
    HRESULT LookupSoundDataDef(IAAFDataDef** dataDef) override;
    HRESULT LookupTimecodeDataDef(IAAFDataDef** dataDef) override;

protected:
    void Complete() const override;

private:
    // The element of a set with that id; a built-in one is made if it is not there yet.
    Object* Find(const PropertyKey& set, const GUID& id) const;
    Object* FindMade(const PropertyKey& set, const GUID& id) const;
    HRESULT AddTo(const PropertyKey* set, Object* definition);
    void Make(const PropertyKey& set, const BuiltInDefinition& entry) const;

    template <class Interface>
    HRESULT Register(Interface* definition, const PropertyKey& set);
    template <class Interface>
    HRESULT Lookup(const GUID& id, const PropertyKey& set, Interface** out) const;

    mutable bool hasOffers_ = false;  // built-in definitions may be missing
    mutable bool isMaking_ = false;   // one element is wanted, not the whole set
};

}  // namespace aaf
