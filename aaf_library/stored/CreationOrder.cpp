// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/stored/CreationOrder.h"

#include "aaf_library/model/BuiltIn.h"
#include "aaf_library/model/GuidHash.h"
#include "host_interfaces/aaf/AAFClassIds.h"
#include "host_interfaces/aaf/AAFTypeIds.h"

#include <algorithm>
#include <unordered_map>

namespace aaf::stored {

namespace {

const GUID* const kClasses[] = {
    &AUID_AAFMetaDefinition,
    &AUID_AAFClassDef,
    &AUID_AAFPropertyDef,
    &AUID_AAFObject,
    &AUID_AAFHeader,
    &AUID_AAFIdentification,
    &AUID_AAFContentStorage,
    &AUID_AAFTypeDef,
    &AUID_AAFTypeDefInt,
    &AUID_AAFTypeDefStrongObjRef,
    &AUID_AAFTypeDefWeakObjRef,
    &AUID_AAFTypeDefEnum,
    &AUID_AAFTypeDefFixedArray,
    &AUID_AAFTypeDefVariableArray,
    &AUID_AAFTypeDefSet,
    &AUID_AAFTypeDefString,
    &AUID_AAFTypeDefStream,
    &AUID_AAFTypeDefRecord,
    &AUID_AAFTypeDefIndirect,
    &AUID_AAFTypeDefOpaque,
    &AUID_AAFTypeDefCharacter,
    &AUID_AAFMetaDictionary,
    &AUID_AAFDictionary,
    &AUID_AAFDefObject,
    &AUID_AAFDataDef,
    &AUID_AAFContainerDef,
    &AUID_AAFMob,
    &AUID_AAFTaggedValue,
    &AUID_AAFMobSlot,
    &AUID_AAFComponent,
    &AUID_AAFTypeDefRename,
    &AUID_AAFKLVData,
    &AUID_AAFSegment,
    &AUID_AAFTypeDefExtEnum,
    &AUID_AAFEssenceData,
    &AUID_AAFOperationDef,
    &AUID_AAFParameterDef,
    &AUID_AAFPluginDef,
    &AUID_AAFLocator,
    &AUID_AAFNetworkLocator,
    &AUID_AAFCodecDef,
    &AUID_AAFInterpolationDef,
    &AUID_AAFKLVDataDefinition,
    &AUID_AAFTaggedValueDefinition,
};

const GUID* const kTypes[] = {
    &kAAFTypeID_UInt8,
    &kAAFTypeID_UInt32,
    &kAAFTypeID_UInt16,
    &kAAFTypeID_UInt8Array8,
    &kAAFTypeID_ClassDefinitionWeakReference,
    &kAAFTypeID_AUID,
    &kAAFTypeID_Boolean,
    &kAAFTypeID_ClassDefinitionStrongReferenceSet,
    &kAAFTypeID_Character,
    &kAAFTypeID_TypeDefinitionWeakReferenceVector,
    &kAAFTypeID_String,
    &kAAFTypeID_Stream,
    &kAAFTypeID_Indirect,
    &kAAFTypeID_Int64Array,
    &kAAFTypeID_Opaque,
    &kAAFTypeID_Int8,
    &kAAFTypeID_Int16,
    &kAAFTypeID_AUIDArray,
    &kAAFTypeID_Int32,
    &kAAFTypeID_Int64,
    &kAAFTypeID_TypeDefinitionWeakReference,
    &kAAFTypeID_ClassDefinitionStrongReference,
    &kAAFTypeID_PropertyDefinitionStrongReferenceSet,
    &kAAFTypeID_TypeDefinitionStrongReferenceSet,
    &kAAFTypeID_PropertyDefinitionStrongReference,
    &kAAFTypeID_TypeDefinitionStrongReference,
    &kAAFTypeID_TaggedValueStrongReference,
    &kAAFTypeID_TaggedValueStrongReferenceVector,
    &kAAFTypeID_DataDefinitionWeakReference,
    &kAAFTypeID_LengthType,
    &kAAFTypeID_KLVDataStrongReference,
    &kAAFTypeID_KLVDataStrongReferenceVector,
    &kAAFTypeID_SegmentStrongReference,
    &kAAFTypeID_MobSlotStrongReference,
    &kAAFTypeID_MobSlotStrongReferenceVector,
    &kAAFTypeID_UsageType,
    &kAAFTypeID_DateStruct,
    &kAAFTypeID_TimeStruct,
    &kAAFTypeID_TimeStamp,
    &kAAFTypeID_UInt8Array12,
    &kAAFTypeID_MobIDType,
    &kAAFTypeID_MobStrongReference,
    &kAAFTypeID_MobStrongReferenceSet,
    &kAAFTypeID_EssenceDataStrongReference,
    &kAAFTypeID_EssenceDataStrongReferenceSet,
    &kAAFTypeID_OperationDefinitionWeakReference,
    &kAAFTypeID_OperationDefinitionWeakReferenceVector,
    &kAAFTypeID_ParameterDefinitionWeakReference,
    &kAAFTypeID_ParameterDefinitionWeakReferenceSet,
    &kAAFTypeID_OperationCategoryType,
    &kAAFTypeID_OperationDefinitionStrongReference,
    &kAAFTypeID_OperationDefinitionStrongReferenceSet,
    &kAAFTypeID_ParameterDefinitionStrongReference,
    &kAAFTypeID_ParameterDefinitionStrongReferenceSet,
    &kAAFTypeID_DataDefinitionStrongReference,
    &kAAFTypeID_DataDefinitionStrongReferenceSet,
    &kAAFTypeID_VersionType,
    &kAAFTypeID_PluginCategoryType,
    &kAAFTypeID_NetworkLocatorStrongReference,
    &kAAFTypeID_LocatorStrongReference,
    &kAAFTypeID_LocatorStrongReferenceVector,
    &kAAFTypeID_PluginDefinitionStrongReference,
    &kAAFTypeID_PluginDefinitionStrongReferenceSet,
    &kAAFTypeID_DataDefinitionWeakReferenceVector,
    &kAAFTypeID_CodecDefinitionStrongReference,
    &kAAFTypeID_CodecDefinitionStrongReferenceSet,
    &kAAFTypeID_ContainerDefinitionStrongReference,
    &kAAFTypeID_ContainerDefinitionStrongReferenceSet,
    &kAAFTypeID_InterpolationDefinitionStrongReference,
    &kAAFTypeID_InterpolationDefinitionStrongReferenceSet,
    &kAAFTypeID_KLVDataDefinitionStrongReference,
    &kAAFTypeID_KLVDataDefinitionStrongReferenceSet,
    &kAAFTypeID_TaggedValueDefinitionStrongReference,
    &kAAFTypeID_TaggedValueDefinitionStrongReferenceSet,
    &kAAFTypeID_ContentStorageStrongReference,
    &kAAFTypeID_DictionaryStrongReference,
    &kAAFTypeID_ProductReleaseType,
    &kAAFTypeID_ProductVersion,
    &kAAFTypeID_IdentificationStrongReference,
    &kAAFTypeID_IdentificationStrongReferenceVector,
};

// One more property of mobs, MobAttributeList, is built into that library, behind those that we
// know.
constexpr GUID kLastOfMob = ncfGuid("60958183-47B1-11D4-A01C-0004AC969F50");

constexpr std::uint32_t kNoKey = 0xFFFFFFFF;

using Places = std::unordered_map<GUID, std::uint32_t, GuidHash>;

template <std::size_t N>
Places PlacesIn(const GUID* const (&order)[N]) {
    Places places;
    for (const GUID* id : order) {
        places.emplace(*id, static_cast<std::uint32_t>(places.size()));
    }
    return places;
}

// Those without a key get the next ones.
void NumberOthers(StoredProperty& set, std::uint32_t next) {
    std::vector<std::size_t> others;
    for (std::size_t i = 0; i < set.localKeys.size(); ++i) {
        if (set.localKeys[i] == kNoKey) {
            others.push_back(i);
        }
    }
    std::sort(others.begin(), others.end(),
              [&](std::size_t a, std::size_t b) { return set.keys[a] < set.keys[b]; });
    for (const std::size_t i : others) {
        set.localKeys[i] = next++;
    }
}

void NumberBy(const Places& places, StoredProperty& set) {
    set.localKeys.clear();
    for (const Bytes& key : set.keys) {
        const auto place = places.find(GuidOf(key));
        set.localKeys.push_back(place == places.end() ? kNoKey : place->second);
    }
    NumberOthers(set, static_cast<std::uint32_t>(places.size()));
}

}  // namespace

void NumberClasses(StoredProperty& classes) {
    static const Places places = PlacesIn(kClasses);
    NumberBy(places, classes);
}

void NumberTypes(StoredProperty& types) {
    static const Places places = PlacesIn(kTypes);
    NumberBy(places, types);
}

void NumberProperties(StoredProperty& properties, const MetaClass& record) {
    Span<BuiltInProperty> builtIn;
    if (const BuiltInClass* const entry = FindBuiltInClass(record.id)) {
        builtIn = entry->properties;
    }
    const auto ours = static_cast<std::uint32_t>(builtIn.size());
    const bool isMob = record.id == AUID_AAFMob;
    properties.localKeys.clear();
    for (const MetaProperty& property : record.properties) {
        const auto* const place =
            std::find_if(builtIn.begin(), builtIn.end(),
                         [&](const BuiltInProperty& entry) { return entry.key.id == property.id; });
        const bool isLast = isMob && property.id == kLastOfMob;
        properties.localKeys.push_back(place != builtIn.end()
                                           ? static_cast<std::uint32_t>(place - builtIn.begin())
                                       : isLast ? ours
                                                : kNoKey);
    }
    NumberOthers(properties, ours + (isMob ? 1 : 0));
}

}  // namespace aaf::stored
