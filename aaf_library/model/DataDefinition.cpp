// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/model/DefinitionObjects.h"
#include "host_interfaces/aaf/AAFDefinitionIds.h"

namespace aaf {

namespace {

// Each legacy id with the newer one of the same kind.
const GUID* const kCounterparts[][2] = {
    {&kAAFDataDef_LegacyPicture, &kAAFDataDef_Picture},
    {&kAAFDataDef_LegacySound, &kAAFDataDef_Sound},
    {&kAAFDataDef_LegacyTimecode, &kAAFDataDef_Timecode},
};

const GUID& KindOf(const GUID& id) {
    for (const auto& pair : kCounterparts) {
        if (id == *pair[0]) {
            return *pair[1];
        }
    }
    return id;
}

HRESULT Answer(bool value, aafBoolean_t* out) {
    *out = value ? kAAFTrue : kAAFFalse;
    return AAFRESULT_SUCCESS;
}

}  // namespace

bool DataDefinition::Converts(const GUID& from, const GUID& to) {
    return KindOf(from) == KindOf(to) ||
           (from == kAAFDataDef_PictureWithMatte && KindOf(to) == kAAFDataDef_Picture);
}

HRESULT DataDefinition::Initialize(aafUID_constref id, aafCharacter_constptr name,
                                   aafCharacter_constptr description) {
    return InitializeDefinition(id, name, description);
}

HRESULT DataDefinition::IsKind(const GUID& kind, aafBoolean_t* out) const {
    return out == nullptr ? AAFRESULT_NULL_PARAM : Answer(KindOf(Identification()) == kind, out);
}

HRESULT DataDefinition::IsPictureKind(aafBoolean_t* bIsPictureKind) {
    return IsKind(kAAFDataDef_Picture, bIsPictureKind);
}

HRESULT DataDefinition::IsMatteKind(aafBoolean_t* bIsMatteKind) {
    return IsKind(kAAFDataDef_Matte, bIsMatteKind);
}

HRESULT DataDefinition::IsPictureWithMatteKind(aafBoolean_t* bIsPictureWithMatteKind) {
    return IsKind(kAAFDataDef_PictureWithMatte, bIsPictureWithMatteKind);
}

HRESULT DataDefinition::IsSoundKind(aafBoolean_t* bIsSoundKind) {
    return IsKind(kAAFDataDef_Sound, bIsSoundKind);
}

HRESULT DataDefinition::DoesDataDefConvertTo(IAAFDataDef* id, aafBoolean_t* bDoesConvertTo) {
    if (id == nullptr || bDoesConvertTo == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    auto* other = ImplementationAs<DataDefinition>(id);
    return other == nullptr
               ? AAFRESULT_INVALID_OBJ
               : Answer(Converts(Identification(), other->Identification()), bDoesConvertTo);
}

HRESULT DataDefinition::IsDataDefOf(IAAFDataDef* dataDef, aafBoolean_t* bIsDataDefOf) {
    if (dataDef == nullptr || bIsDataDefOf == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    auto* other = ImplementationAs<DataDefinition>(dataDef);
    return other == nullptr ? AAFRESULT_INVALID_OBJ
                            : Answer(Identification() == other->Identification(), bIsDataDefOf);
}

HRESULT DataDefinition::DoesDataDefConvertFrom(IAAFDataDef* dataDef,
                                               aafBoolean_t* bDoesConvertFrom) {
    if (dataDef == nullptr || bDoesConvertFrom == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    auto* other = ImplementationAs<DataDefinition>(dataDef);
    return other == nullptr
               ? AAFRESULT_INVALID_OBJ
               : Answer(Converts(other->Identification(), Identification()), bDoesConvertFrom);
}

HRESULT DataDefinition::IsEdgecodeKind(aafBoolean_t* bIsEdgecodeKind) {
    return IsKind(kAAFDataDef_Edgecode, bIsEdgecodeKind);
}

HRESULT DataDefinition::IsTimecodeKind(aafBoolean_t* bIsTimecodeKind) {
    return IsKind(kAAFDataDef_Timecode, bIsTimecodeKind);
}

HRESULT DataDefinition::IsAuxiliaryKind(aafBoolean_t* bIsAuxiliaryKind) {
    return IsKind(kAAFDataDef_Auxiliary, bIsAuxiliaryKind);
}

HRESULT DataDefinition::IsDescriptiveMetadataKind(aafBoolean_t* bIsDescriptiveMetadataKind) {
    return IsKind(kAAFDataDef_DescriptiveMetadata, bIsDescriptiveMetadataKind);
}

}  // namespace aaf
