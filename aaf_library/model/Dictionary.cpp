// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/model/Dictionary.h"

#include "aaf_library/model/ClassDefinition.h"
#include "aaf_library/model/Enumerator.h"
#include "aaf_library/model/Model.h"
#include "aaf_library/model/StoredNumbers.h"
#include "aaf_library/model/Text.h"
#include "aaf_library/model/TypeDefinition.h"
#include "host_interfaces/aaf/AAFClassIds.h"
#include "host_interfaces/aaf/AAFDefinitionIds.h"

namespace aaf {

namespace {

// The set that holds the definitions of each class.
struct DefinitionSet {
    const GUID& classId;
    const PropertyKey& set;
};

const DefinitionSet kSets[] = {
    {AUID_AAFDataDefinition, prop::Dictionary_DataDefinitions},
    {AUID_AAFOperationDefinition, prop::Dictionary_OperationDefinitions},
    {AUID_AAFParameterDefinition, prop::Dictionary_ParameterDefinitions},
    {AUID_AAFCodecDefinition, prop::Dictionary_CodecDefinitions},
    {AUID_AAFContainerDefinition, prop::Dictionary_ContainerDefinitions},
    {AUID_AAFInterpolationDefinition, prop::Dictionary_InterpolationDefinitions},
    {AUID_AAFPluginDefinition, prop::Dictionary_PluginDefinitions},
    {AUID_AAFKLVDataDefinition, prop::Dictionary_KLVDataDefinitions},
    {AUID_AAFTaggedValueDefinition, prop::Dictionary_TaggedValueDefinitions},
};

const PropertyKey* SetFor(const GUID& classId) {
    for (const DefinitionSet& entry : kSets) {
        if (entry.classId == classId) {
            return &entry.set;
        }
    }
    return nullptr;
}

const PropertyKey* SetWithNumber(PropertyId pid) {
    for (const DefinitionSet& entry : kSets) {
        if (entry.set.pid == pid) {
            return &entry.set;
        }
    }
    return nullptr;
}

// The sets that a new dictionary offers something in.
struct Offer {
    const GUID& classId;
    const PropertyKey& set;
    Span<BuiltInDefinition> (*entries)();
};

const Offer kOffers[] = {
    {AUID_AAFDataDefinition, prop::Dictionary_DataDefinitions, BuiltInDataDefinitions},
    {AUID_AAFContainerDefinition, prop::Dictionary_ContainerDefinitions,
     BuiltInContainerDefinitions},
};

// Sets a flag for the length of a scope.
class Raised {
public:
    explicit Raised(bool& flag) : flag_(flag), before_(flag) { flag_ = true; }
    ~Raised() { flag_ = before_; }
    Raised(const Raised&) = delete;
    Raised& operator=(const Raised&) = delete;

private:
    bool& flag_;
    bool before_;
};

}  // namespace

Object* Dictionary::FindDefinition(const GUID& classId, const GUID& id) const {
    const PropertyKey* set = SetFor(classId);
    return set == nullptr ? nullptr : Find(*set, id);
}

Object* Dictionary::FindDefinition(PropertyId set, const GUID& id) const {
    const PropertyKey* key = SetWithNumber(set);
    return key == nullptr ? nullptr : Find(*key, id);
}

bool Dictionary::IsSetOfDefinitions(PropertyId set) {
    return SetWithNumber(set) != nullptr;
}

Object* Dictionary::FindMade(const PropertyKey& set, const GUID& id) const {
    std::uint8_t key[kGuidSize];
    PutGuid(id, key);
    return FindInSet(set, key, sizeof key);
}

Object* Dictionary::Find(const PropertyKey& set, const GUID& id) const {
    const Raised making(isMaking_);
    Object* const made = FindMade(set, id);
    if (made != nullptr || !hasOffers_) {
        return made;
    }
    for (const Offer& offer : kOffers) {
        if (!(offer.set.id == set.id)) {
            continue;
        }
        for (const BuiltInDefinition& entry : offer.entries()) {
            if (entry.id == id) {
                Make(set, entry);
                return FindMade(set, id);
            }
        }
    }
    return nullptr;
}

void Dictionary::Make(const PropertyKey& set, const BuiltInDefinition& entry) const {
    const auto enter = [&](auto definition) {
        definition->Initialize(entry.id, Widen(entry.name).c_str(),
                               Widen(entry.description).c_str());
        const_cast<Dictionary*>(this)->AddToSet(set, definition->Identity());
    };
    if (set.id == prop::Dictionary_DataDefinitions.id) {
        enter(model()->NewObject<DataDefinition>(AUID_AAFDataDefinition));
    } else {
        enter(model()->NewObject<ContainerDefinition>(AUID_AAFContainerDefinition));
    }
}

void Dictionary::Complete() const {
    if (!hasOffers_ || isMaking_) {
        return;
    }
    const Raised making(isMaking_);
    hasOffers_ = false;
    for (const Offer& offer : kOffers) {
        for (const BuiltInDefinition& entry : offer.entries()) {
            if (FindMade(offer.set, entry.id) == nullptr) {
                Make(offer.set, entry);
            }
        }
    }
}

HRESULT Dictionary::AddDefinition(const GUID& classId, Object* definition) {
    return AddTo(SetFor(classId), definition);
}

HRESULT Dictionary::AddDefinition(PropertyId set, Object* definition) {
    return AddTo(SetWithNumber(set), definition);
}

HRESULT Dictionary::AddTo(const PropertyKey* set, Object* definition) {
    if (set == nullptr || definition == nullptr) {
        return AAFRESULT_INVALID_OBJ;
    }
    const Raised making(isMaking_);
    return AddToSet(*set, definition->Identity());
}

template <class Interface>
HRESULT Dictionary::Register(Interface* argument, const PropertyKey& set) {
    if (argument == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    auto* definition = ImplementationAs<DefinitionObject>(argument);
    if (definition == nullptr || definition->model() != model()) {
        return AAFRESULT_INVALID_OBJ;
    }
    if (definition->owner() != nullptr) {
        return AAFRESULT_OBJECT_ALREADY_ATTACHED;
    }
    const Bytes key = definition->UniqueKey();
    if (key.empty()) {
        return AAFRESULT_NOT_INITIALIZED;
    }
    // The first definition with an id stays the one that is found.
    const Raised making(isMaking_);
    if (Find(set, GuidAt(key.data())) != nullptr) {
        return AAFRESULT_SUCCESS;
    }
    return AddToSet(set, definition->Identity());
}

template <class Interface>
HRESULT Dictionary::Lookup(const GUID& id, const PropertyKey& set, Interface** out) const {
    if (out == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    Object* found = Find(set, id);
    return found == nullptr ? AAFRESULT_NO_MORE_OBJECTS : GiveOut(found, out);
}

HRESULT Dictionary::CreateInstance(aafUID_constref id, REFIID riid, IUnknown** object) {
    return object == nullptr ? AAFRESULT_NULL_PARAM : model()->CreateInstance(id, riid, object);
}

HRESULT Dictionary::CreateMetaInstance(aafUID_constref id, REFIID riid, IUnknown** metaDefinition) {
    return metaDefinition == nullptr ? AAFRESULT_NULL_PARAM
                                     : model()->CreateMetaInstance(id, riid, metaDefinition);
}

HRESULT Dictionary::RegisterClassDef(IAAFClassDef* classDef) {
    if (classDef == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    auto* definition = ImplementationAs<ClassDefinition>(classDef);
    return definition == nullptr || definition->model() != model()
               ? AAFRESULT_INVALID_OBJ
               : model()->RegisterClass(*definition);
}

HRESULT Dictionary::LookupClassDef(aafUID_constref classId, IAAFClassDef** classDef) {
    if (classDef == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    ClassDefinition* found = model()->FindClass(classId);
    return found == nullptr ? AAFRESULT_NO_MORE_OBJECTS : GiveOut(found, classDef);
}

HRESULT Dictionary::GetClassDefs(IEnumAAFClassDefs** enumerator) {
    return MakeEnumerator<IAAFClassDef>(
        [self = RefPtr<Dictionary>(this)](std::size_t index) {
            const auto& classes = self->model()->classes();
            return index < classes.size() ? RefPtr<Unknown>(classes[index]) : nullptr;
        },
        enumerator);
}

HRESULT Dictionary::CountClassDefs(aafUInt32* result) {
    if (result == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    *result = static_cast<aafUInt32>(model()->classes().size());
    return AAFRESULT_SUCCESS;
}

HRESULT Dictionary::RegisterTypeDef(IAAFTypeDef* typeDef) {
    if (typeDef == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    TypeDefinition* type = TypeOf(typeDef, model());
    return type == nullptr ? AAFRESULT_INVALID_OBJ : model()->RegisterType(*type);
}

HRESULT Dictionary::LookupTypeDef(aafUID_constref typeId, IAAFTypeDef** typeDef) {
    if (typeDef == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    TypeDefinition* found = model()->FindType(typeId);
    return found == nullptr ? AAFRESULT_NO_MORE_OBJECTS : GiveOut(found, typeDef);
}

HRESULT Dictionary::GetTypeDefs(IEnumAAFTypeDefs** enumerator) {
    return MakeEnumerator<IAAFTypeDef>(
        [self = RefPtr<Dictionary>(this)](std::size_t index) {
            const auto& types = self->model()->types();
            return index < types.size() ? RefPtr<Unknown>(types[index]) : nullptr;
        },
        enumerator);
}

HRESULT Dictionary::CountTypeDefs(aafUInt32* result) {
    if (result == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    *result = static_cast<aafUInt32>(model()->types().size());
    return AAFRESULT_SUCCESS;
}

HRESULT Dictionary::RegisterDataDef(IAAFDataDef* dataDef) {
    // Unlike the other definitions a repeated one is never an error.
    const HRESULT result = Register(dataDef, prop::Dictionary_DataDefinitions);
    return result == AAFRESULT_OBJECT_ALREADY_ATTACHED ? AAFRESULT_SUCCESS : result;
}

HRESULT Dictionary::LookupDataDef(aafUID_constref dataDefinitionId, IAAFDataDef** dataDef) {
    return Lookup(dataDefinitionId, prop::Dictionary_DataDefinitions, dataDef);
}

HRESULT Dictionary::GetDataDefs(IEnumAAFDataDefs** enumerator) {
    return MakeEnumerator<IAAFDataDef>(this, prop::Dictionary_DataDefinitions, enumerator);
}

HRESULT Dictionary::CountDataDefs(aafUInt32* result) {
    return ReadCount(prop::Dictionary_DataDefinitions, result);
}

HRESULT Dictionary::RegisterOperationDef(IAAFOperationDef* operationDef) {
    return Register(operationDef, prop::Dictionary_OperationDefinitions);
}

HRESULT Dictionary::LookupOperationDef(aafUID_constref operationId,
                                       IAAFOperationDef** operationDef) {
    return Lookup(operationId, prop::Dictionary_OperationDefinitions, operationDef);
}

HRESULT Dictionary::GetOperationDefs(IEnumAAFOperationDefs** enumerator) {
    return MakeEnumerator<IAAFOperationDef>(this, prop::Dictionary_OperationDefinitions,
                                            enumerator);
}

HRESULT Dictionary::CountOperationDefs(aafUInt32* result) {
    return ReadCount(prop::Dictionary_OperationDefinitions, result);
}

HRESULT Dictionary::RegisterParameterDef(IAAFParameterDef* parmDef) {
    return Register(parmDef, prop::Dictionary_ParameterDefinitions);
}

HRESULT Dictionary::LookupParameterDef(aafUID_constref parameterId, IAAFParameterDef** parmDef) {
    return Lookup(parameterId, prop::Dictionary_ParameterDefinitions, parmDef);
}

HRESULT Dictionary::GetParameterDefs(IEnumAAFParameterDefs** enumerator) {
    return MakeEnumerator<IAAFParameterDef>(this, prop::Dictionary_ParameterDefinitions,
                                            enumerator);
}

HRESULT Dictionary::CountParameterDefs(aafUInt32* result) {
    return ReadCount(prop::Dictionary_ParameterDefinitions, result);
}

HRESULT Dictionary::RegisterCodecDef(IAAFCodecDef* parmDef) {
    return Register(parmDef, prop::Dictionary_CodecDefinitions);
}

HRESULT Dictionary::LookupCodecDef(aafUID_constref parameterId, IAAFCodecDef** parmDef) {
    return Lookup(parameterId, prop::Dictionary_CodecDefinitions, parmDef);
}

HRESULT Dictionary::GetCodecDefs(IEnumAAFCodecDefs** enumerator) {
    return MakeEnumerator<IAAFCodecDef>(this, prop::Dictionary_CodecDefinitions, enumerator);
}

HRESULT Dictionary::CountCodecDefs(aafUInt32* result) {
    return ReadCount(prop::Dictionary_CodecDefinitions, result);
}

HRESULT Dictionary::RegisterContainerDef(IAAFContainerDef* parmDef) {
    return Register(parmDef, prop::Dictionary_ContainerDefinitions);
}

HRESULT Dictionary::LookupContainerDef(aafUID_constref parameterId, IAAFContainerDef** parmDef) {
    return Lookup(parameterId, prop::Dictionary_ContainerDefinitions, parmDef);
}

HRESULT Dictionary::GetContainerDefs(IEnumAAFContainerDefs** enumerator) {
    return MakeEnumerator<IAAFContainerDef>(this, prop::Dictionary_ContainerDefinitions,
                                            enumerator);
}

HRESULT Dictionary::CountContainerDefs(aafUInt32* result) {
    return ReadCount(prop::Dictionary_ContainerDefinitions, result);
}

HRESULT Dictionary::RegisterInterpolationDef(IAAFInterpolationDef* interpolationDef) {
    return Register(interpolationDef, prop::Dictionary_InterpolationDefinitions);
}

HRESULT Dictionary::LookupInterpolationDef(aafUID_constref parameterId,
                                           IAAFInterpolationDef** interpolationDef) {
    return Lookup(parameterId, prop::Dictionary_InterpolationDefinitions, interpolationDef);
}

HRESULT Dictionary::GetInterpolationDefs(IEnumAAFInterpolationDefs** enumerator) {
    return MakeEnumerator<IAAFInterpolationDef>(this, prop::Dictionary_InterpolationDefinitions,
                                                enumerator);
}

HRESULT Dictionary::CountInterpolationDefs(aafUInt32* result) {
    return ReadCount(prop::Dictionary_InterpolationDefinitions, result);
}

HRESULT Dictionary::RegisterPluginDef(IAAFPluginDef* plugDef) {
    return Register(plugDef, prop::Dictionary_PluginDefinitions);
}

HRESULT Dictionary::LookupPluginDef(aafUID_constref parameterId, IAAFPluginDef** plugDef) {
    return Lookup(parameterId, prop::Dictionary_PluginDefinitions, plugDef);
}

HRESULT Dictionary::GetPluginDefs(IEnumAAFPluginDefs** enumerator) {
    return MakeEnumerator<IAAFPluginDef>(this, prop::Dictionary_PluginDefinitions, enumerator);
}

HRESULT Dictionary::CountPluginDefs(aafUInt32* result) {
    return ReadCount(prop::Dictionary_PluginDefinitions, result);
}

HRESULT Dictionary::RegisterKLVDataDef(IAAFKLVDataDefinition* def) {
    return Register(def, prop::Dictionary_KLVDataDefinitions);
}

HRESULT Dictionary::LookupKLVDataDef(aafUID_constref defId, IAAFKLVDataDefinition** def) {
    return Lookup(defId, prop::Dictionary_KLVDataDefinitions, def);
}

HRESULT Dictionary::GetKLVDataDefs(IEnumAAFKLVDataDefs** enumerator) {
    return MakeEnumerator<IAAFKLVDataDefinition>(this, prop::Dictionary_KLVDataDefinitions,
                                                 enumerator);
}

HRESULT Dictionary::CountKLVDataDefs(aafUInt32* result) {
    return ReadCount(prop::Dictionary_KLVDataDefinitions, result);
}

HRESULT Dictionary::RegisterTaggedValueDef(IAAFTaggedValueDefinition* def) {
    return Register(def, prop::Dictionary_TaggedValueDefinitions);
}

HRESULT Dictionary::LookupTaggedValueDef(aafUID_constref defId, IAAFTaggedValueDefinition** def) {
    return Lookup(defId, prop::Dictionary_TaggedValueDefinitions, def);
}

HRESULT Dictionary::GetTaggedValueDefs(IEnumAAFTaggedValueDefs** enumerator) {
    return MakeEnumerator<IAAFTaggedValueDefinition>(this, prop::Dictionary_TaggedValueDefinitions,
                                                     enumerator);
}

HRESULT Dictionary::CountTaggedValueDefs(aafUInt32* result) {
    return ReadCount(prop::Dictionary_TaggedValueDefinitions, result);
}

HRESULT Dictionary::LookupAuxiliaryDataDef(IAAFDataDef** dataDef) {
    return LookupDataDef(kAAFDataDef_Auxiliary, dataDef);
}

HRESULT Dictionary::LookupDescriptiveMetadataDataDef(IAAFDataDef** dataDef) {
    return LookupDataDef(kAAFDataDef_DescriptiveMetadata, dataDef);
}

HRESULT Dictionary::LookupEdgecodeDataDef(IAAFDataDef** dataDef) {
    return LookupDataDef(kAAFDataDef_Edgecode, dataDef);
}

HRESULT Dictionary::LookupLegacyPictureDataDef(IAAFDataDef** dataDef) {
    return LookupDataDef(kAAFDataDef_LegacyPicture, dataDef);
}

HRESULT Dictionary::LookupLegacySoundDataDef(IAAFDataDef** dataDef) {
    return LookupDataDef(kAAFDataDef_LegacySound, dataDef);
}

HRESULT Dictionary::LookupLegacyTimecodeDataDef(IAAFDataDef** dataDef) {
    return LookupDataDef(kAAFDataDef_LegacyTimecode, dataDef);
}

HRESULT Dictionary::LookupMatteDataDef(IAAFDataDef** dataDef) {
    return LookupDataDef(kAAFDataDef_Matte, dataDef);
}

HRESULT Dictionary::LookupPictureDataDef(IAAFDataDef** dataDef) {
    return LookupDataDef(kAAFDataDef_Picture, dataDef);
}

HRESULT Dictionary::LookupPictureWithMatteDataDef(IAAFDataDef** dataDef) {
    return LookupDataDef(kAAFDataDef_PictureWithMatte, dataDef);
}

HRESULT Dictionary::LookupSoundDataDef(IAAFDataDef** dataDef) {
    return LookupDataDef(kAAFDataDef_Sound, dataDef);
}

HRESULT Dictionary::LookupTimecodeDataDef(IAAFDataDef** dataDef) {
    return LookupDataDef(kAAFDataDef_Timecode, dataDef);
}

}  // namespace aaf
