// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/aaf/AAFUnknown.h"

// The dictionary and the definitions that objects refer to.

struct IAAFClassDef;
struct IAAFCodecDef;
struct IAAFContainerDef;
struct IAAFDataDef;
struct IAAFDefObject;
struct IAAFDictionary;
struct IAAFInterpolationDef;
struct IAAFKLVDataDefinition;
struct IAAFLocator;
struct IAAFNetworkLocator;
struct IAAFOperationDef;
struct IAAFParameterDef;
struct IAAFPluginDef;
struct IAAFPropertyDef;
struct IAAFTaggedValueDefinition;
struct IAAFTypeDef;
struct IEnumAAFClassDefs;
struct IEnumAAFCodecDefs;
struct IEnumAAFCodecFlavours;
struct IEnumAAFContainerDefs;
struct IEnumAAFDataDefs;
struct IEnumAAFInterpolationDefs;
struct IEnumAAFKLVDataDefs;
struct IEnumAAFLoadedPlugins;
struct IEnumAAFOperationDefs;
struct IEnumAAFParameterDefs;
struct IEnumAAFPluginDefs;
struct IEnumAAFPluginLocators;
struct IEnumAAFPropertyDefs;
struct IEnumAAFTaggedValueDefs;
struct IEnumAAFTypeDefs;

// Answered by AAFDictionary.
struct IAAFDictionary : IUnknown {
    virtual HRESULT CreateInstance(aafUID_constref id, REFIID riid, IUnknown** object) = 0;  // 3
    virtual HRESULT CreateMetaInstance(aafUID_constref id, REFIID riid,
                                       IUnknown** metaDefinition) = 0;                     // 4
    virtual HRESULT RegisterClassDef(IAAFClassDef* classDef) = 0;                          // 5
    virtual HRESULT LookupClassDef(aafUID_constref classId, IAAFClassDef** classDef) = 0;  // 6
    virtual HRESULT GetClassDefs(IEnumAAFClassDefs** enumerator) = 0;                      // 7
    virtual HRESULT CountClassDefs(aafUInt32* result) = 0;                                 // 8
    virtual HRESULT CreateForwardClassReference(aafUID_constref classId) = 0;              // 9
    virtual HRESULT HasForwardClassReference(aafUID_constref classId,
                                             aafBoolean_t* result) = 0;                      // 10
    virtual HRESULT RegisterTypeDef(IAAFTypeDef* typeDef) = 0;                               // 11
    virtual HRESULT LookupTypeDef(aafUID_constref typeId, IAAFTypeDef** typeDef) = 0;        // 12
    virtual HRESULT GetTypeDefs(IEnumAAFTypeDefs** enumerator) = 0;                          // 13
    virtual HRESULT CountTypeDefs(aafUInt32* result) = 0;                                    // 14
    virtual HRESULT RegisterOpaqueTypeDef(IAAFTypeDef* typeDef) = 0;                         // 15
    virtual HRESULT LookupOpaqueTypeDef(aafUID_constref typeId, IAAFTypeDef** typeDef) = 0;  // 16
    virtual HRESULT GetOpaqueTypeDefs(IEnumAAFTypeDefs** enumerator) = 0;                    // 17
    virtual HRESULT CountOpaqueTypeDefs(aafUInt32* result) = 0;                              // 18
    virtual HRESULT RegisterKLVDataKey(aafUID_t uid, IAAFTypeDef* typeDef) = 0;              // 19
    virtual HRESULT RegisterDataDef(IAAFDataDef* dataDef) = 0;                               // 20
    virtual HRESULT LookupDataDef(aafUID_constref dataDefinitionId,
                                  IAAFDataDef** dataDef) = 0;                  // 21
    virtual HRESULT GetDataDefs(IEnumAAFDataDefs** enumerator) = 0;            // 22
    virtual HRESULT CountDataDefs(aafUInt32* result) = 0;                      // 23
    virtual HRESULT RegisterOperationDef(IAAFOperationDef* operationDef) = 0;  // 24
    virtual HRESULT LookupOperationDef(aafUID_constref operationId,
                                       IAAFOperationDef** operationDef) = 0;   // 25
    virtual HRESULT GetOperationDefs(IEnumAAFOperationDefs** enumerator) = 0;  // 26
    virtual HRESULT CountOperationDefs(aafUInt32* result) = 0;                 // 27
    virtual HRESULT RegisterParameterDef(IAAFParameterDef* parmDef) = 0;       // 28
    virtual HRESULT LookupParameterDef(aafUID_constref parameterId,
                                       IAAFParameterDef** parmDef) = 0;                       // 29
    virtual HRESULT GetParameterDefs(IEnumAAFParameterDefs** enumerator) = 0;                 // 30
    virtual HRESULT CountParameterDefs(aafUInt32* result) = 0;                                // 31
    virtual HRESULT RegisterCodecDef(IAAFCodecDef* parmDef) = 0;                              // 32
    virtual HRESULT LookupCodecDef(aafUID_constref parameterId, IAAFCodecDef** parmDef) = 0;  // 33
    virtual HRESULT GetCodecDefs(IEnumAAFCodecDefs** enumerator) = 0;                         // 34
    virtual HRESULT CountCodecDefs(aafUInt32* result) = 0;                                    // 35
    virtual HRESULT RegisterContainerDef(IAAFContainerDef* parmDef) = 0;                      // 36
    virtual HRESULT LookupContainerDef(aafUID_constref parameterId,
                                       IAAFContainerDef** parmDef) = 0;                    // 37
    virtual HRESULT GetContainerDefs(IEnumAAFContainerDefs** enumerator) = 0;              // 38
    virtual HRESULT CountContainerDefs(aafUInt32* result) = 0;                             // 39
    virtual HRESULT RegisterInterpolationDef(IAAFInterpolationDef* interpolationDef) = 0;  // 40
    virtual HRESULT LookupInterpolationDef(aafUID_constref parameterId,
                                           IAAFInterpolationDef** interpolationDef) = 0;  // 41
    virtual HRESULT GetInterpolationDefs(IEnumAAFInterpolationDefs** enumerator) = 0;     // 42
    virtual HRESULT CountInterpolationDefs(aafUInt32* result) = 0;                        // 43
    virtual HRESULT RegisterPluginDef(IAAFPluginDef* plugDef) = 0;                        // 44
    virtual HRESULT LookupPluginDef(aafUID_constref parameterId,
                                    IAAFPluginDef** plugDef) = 0;        // 45
    virtual HRESULT GetPluginDefs(IEnumAAFPluginDefs** enumerator) = 0;  // 46
    virtual HRESULT CountPluginDefs(aafUInt32* result) = 0;              // 47

protected:
    ~IAAFDictionary() = default;
};

inline constexpr GUID IID_IAAFDictionary = ncfGuid("B1A21398-1A7D-11D2-BF78-00104BC9156D");
constexpr const GUID& aafIdOf(const IAAFDictionary*) {
    return IID_IAAFDictionary;
}

// Answered by AAFDictionary.
struct IAAFDictionary2 : IUnknown {
    virtual HRESULT CreateInstance(aafUID_constref id, REFIID riid, IUnknown** object) = 0;  // 3
    virtual HRESULT CreateMetaInstance(aafUID_constref id, REFIID riid,
                                       IUnknown** metaDefinition) = 0;                     // 4
    virtual HRESULT RegisterClassDef(IAAFClassDef* classDef) = 0;                          // 5
    virtual HRESULT LookupClassDef(aafUID_constref classId, IAAFClassDef** classDef) = 0;  // 6
    virtual HRESULT GetClassDefs(IEnumAAFClassDefs** enumerator) = 0;                      // 7
    virtual HRESULT CountClassDefs(aafUInt32* result) = 0;                                 // 8
    virtual HRESULT CreateForwardClassReference(aafUID_constref classId) = 0;              // 9
    virtual HRESULT HasForwardClassReference(aafUID_constref classId,
                                             aafBoolean_t* result) = 0;                      // 10
    virtual HRESULT RegisterTypeDef(IAAFTypeDef* typeDef) = 0;                               // 11
    virtual HRESULT LookupTypeDef(aafUID_constref typeId, IAAFTypeDef** typeDef) = 0;        // 12
    virtual HRESULT GetTypeDefs(IEnumAAFTypeDefs** enumerator) = 0;                          // 13
    virtual HRESULT CountTypeDefs(aafUInt32* result) = 0;                                    // 14
    virtual HRESULT RegisterOpaqueTypeDef(IAAFTypeDef* typeDef) = 0;                         // 15
    virtual HRESULT LookupOpaqueTypeDef(aafUID_constref typeId, IAAFTypeDef** typeDef) = 0;  // 16
    virtual HRESULT GetOpaqueTypeDefs(IEnumAAFTypeDefs** enumerator) = 0;                    // 17
    virtual HRESULT CountOpaqueTypeDefs(aafUInt32* result) = 0;                              // 18
    virtual HRESULT RegisterKLVDataKey(aafUID_t uid, IAAFTypeDef* typeDef) = 0;              // 19
    virtual HRESULT RegisterDataDef(IAAFDataDef* dataDef) = 0;                               // 20
    virtual HRESULT LookupDataDef(aafUID_constref dataDefinitionId,
                                  IAAFDataDef** dataDef) = 0;                  // 21
    virtual HRESULT GetDataDefs(IEnumAAFDataDefs** enumerator) = 0;            // 22
    virtual HRESULT CountDataDefs(aafUInt32* result) = 0;                      // 23
    virtual HRESULT RegisterOperationDef(IAAFOperationDef* operationDef) = 0;  // 24
    virtual HRESULT LookupOperationDef(aafUID_constref operationId,
                                       IAAFOperationDef** operationDef) = 0;   // 25
    virtual HRESULT GetOperationDefs(IEnumAAFOperationDefs** enumerator) = 0;  // 26
    virtual HRESULT CountOperationDefs(aafUInt32* result) = 0;                 // 27
    virtual HRESULT RegisterParameterDef(IAAFParameterDef* parmDef) = 0;       // 28
    virtual HRESULT LookupParameterDef(aafUID_constref parameterId,
                                       IAAFParameterDef** parmDef) = 0;                       // 29
    virtual HRESULT GetParameterDefs(IEnumAAFParameterDefs** enumerator) = 0;                 // 30
    virtual HRESULT CountParameterDefs(aafUInt32* result) = 0;                                // 31
    virtual HRESULT RegisterCodecDef(IAAFCodecDef* parmDef) = 0;                              // 32
    virtual HRESULT LookupCodecDef(aafUID_constref parameterId, IAAFCodecDef** parmDef) = 0;  // 33
    virtual HRESULT GetCodecDefs(IEnumAAFCodecDefs** enumerator) = 0;                         // 34
    virtual HRESULT CountCodecDefs(aafUInt32* result) = 0;                                    // 35
    virtual HRESULT RegisterContainerDef(IAAFContainerDef* parmDef) = 0;                      // 36
    virtual HRESULT LookupContainerDef(aafUID_constref parameterId,
                                       IAAFContainerDef** parmDef) = 0;                    // 37
    virtual HRESULT GetContainerDefs(IEnumAAFContainerDefs** enumerator) = 0;              // 38
    virtual HRESULT CountContainerDefs(aafUInt32* result) = 0;                             // 39
    virtual HRESULT RegisterInterpolationDef(IAAFInterpolationDef* interpolationDef) = 0;  // 40
    virtual HRESULT LookupInterpolationDef(aafUID_constref parameterId,
                                           IAAFInterpolationDef** interpolationDef) = 0;  // 41
    virtual HRESULT GetInterpolationDefs(IEnumAAFInterpolationDefs** enumerator) = 0;     // 42
    virtual HRESULT CountInterpolationDefs(aafUInt32* result) = 0;                        // 43
    virtual HRESULT RegisterPluginDef(IAAFPluginDef* plugDef) = 0;                        // 44
    virtual HRESULT LookupPluginDef(aafUID_constref parameterId,
                                    IAAFPluginDef** plugDef) = 0;                              // 45
    virtual HRESULT GetPluginDefs(IEnumAAFPluginDefs** enumerator) = 0;                        // 46
    virtual HRESULT CountPluginDefs(aafUInt32* result) = 0;                                    // 47
    virtual HRESULT RegisterKLVDataDef(IAAFKLVDataDefinition* def) = 0;                        // 48
    virtual HRESULT LookupKLVDataDef(aafUID_constref defId, IAAFKLVDataDefinition** def) = 0;  // 49
    virtual HRESULT GetKLVDataDefs(IEnumAAFKLVDataDefs** enumerator) = 0;                      // 50
    virtual HRESULT CountKLVDataDefs(aafUInt32* result) = 0;                                   // 51
    virtual HRESULT RegisterTaggedValueDef(IAAFTaggedValueDefinition* def) = 0;                // 52
    virtual HRESULT LookupTaggedValueDef(aafUID_constref defId,
                                         IAAFTaggedValueDefinition** def) = 0;     // 53
    virtual HRESULT GetTaggedValueDefs(IEnumAAFTaggedValueDefs** enumerator) = 0;  // 54
    virtual HRESULT CountTaggedValueDefs(aafUInt32* result) = 0;                   // 55
    virtual HRESULT LookupAuxiliaryDataDef(IAAFDataDef** dataDef) = 0;             // 56
    virtual HRESULT LookupDescriptiveMetadataDataDef(IAAFDataDef** dataDef) = 0;   // 57
    virtual HRESULT LookupEdgecodeDataDef(IAAFDataDef** dataDef) = 0;              // 58
    virtual HRESULT LookupLegacyPictureDataDef(IAAFDataDef** dataDef) = 0;         // 59
    virtual HRESULT LookupLegacySoundDataDef(IAAFDataDef** dataDef) = 0;           // 60
    virtual HRESULT LookupLegacyTimecodeDataDef(IAAFDataDef** dataDef) = 0;        // 61
    virtual HRESULT LookupMatteDataDef(IAAFDataDef** dataDef) = 0;                 // 62
    virtual HRESULT LookupPictureDataDef(IAAFDataDef** dataDef) = 0;               // 63
    virtual HRESULT LookupPictureWithMatteDataDef(IAAFDataDef** dataDef) = 0;      // 64
    virtual HRESULT LookupSoundDataDef(IAAFDataDef** dataDef) = 0;                 // 65
    virtual HRESULT LookupTimecodeDataDef(IAAFDataDef** dataDef) = 0;              // 66

protected:
    ~IAAFDictionary2() = default;
};

inline constexpr GUID IID_IAAFDictionary2 = ncfGuid("952A5C85-DCEC-4C99-8E40-978D88A0CDC1");
constexpr const GUID& aafIdOf(const IAAFDictionary2*) {
    return IID_IAAFDictionary2;
}

// Answered by AAFDefObject.
struct IAAFDefObject : IUnknown {
    virtual HRESULT SetName(aafCharacter_constptr name) = 0;                           // 3
    virtual HRESULT GetName(aafCharacter* name, aafUInt32 bufSize) = 0;                // 4
    virtual HRESULT GetNameBufLen(aafUInt32* bufSize) = 0;                             // 5
    virtual HRESULT SetDescription(aafCharacter_constptr description) = 0;             // 6
    virtual HRESULT GetDescription(aafCharacter* description, aafUInt32 bufSize) = 0;  // 7
    virtual HRESULT GetDescriptionBufLen(aafUInt32* bufSize) = 0;                      // 8
    virtual HRESULT Initialize(aafUID_constref id, aafCharacter_constptr name) = 0;    // 9
    virtual HRESULT GetAUID(aafUID_t* auid) = 0;                                       // 10

protected:
    ~IAAFDefObject() = default;
};

inline constexpr GUID IID_IAAFDefObject = ncfGuid("DFBD6527-1D81-11D2-BF96-006097116212");
constexpr const GUID& aafIdOf(const IAAFDefObject*) {
    return IID_IAAFDefObject;
}

// Answered by AAFDataDef.
struct IAAFDataDef : IUnknown {
    virtual HRESULT Initialize(aafUID_constref id, aafCharacter_constptr name,
                               aafCharacter_constptr description) = 0;                        // 3
    virtual HRESULT IsPictureKind(aafBoolean_t* bIsPictureKind) = 0;                          // 4
    virtual HRESULT IsMatteKind(aafBoolean_t* bIsMatteKind) = 0;                              // 5
    virtual HRESULT IsPictureWithMatteKind(aafBoolean_t* bIsPictureWithMatteKind) = 0;        // 6
    virtual HRESULT IsSoundKind(aafBoolean_t* bIsSoundKind) = 0;                              // 7
    virtual HRESULT DoesDataDefConvertTo(IAAFDataDef* id, aafBoolean_t* bDoesConvertTo) = 0;  // 8
    virtual HRESULT IsDataDefOf(IAAFDataDef* dataDef, aafBoolean_t* bIsDataDefOf) = 0;        // 9
    virtual HRESULT DoesDataDefConvertFrom(IAAFDataDef* dataDef,
                                           aafBoolean_t* bDoesConvertFrom) = 0;  // 10

protected:
    ~IAAFDataDef() = default;
};

inline constexpr GUID IID_IAAFDataDef = ncfGuid("DFBD6529-1D81-11D2-BF96-006097116212");
constexpr const GUID& aafIdOf(const IAAFDataDef*) {
    return IID_IAAFDataDef;
}

// Answered by AAFDataDef.
struct IAAFDataDef2 : IUnknown {
    virtual HRESULT Initialize(aafUID_constref id, aafCharacter_constptr name,
                               aafCharacter_constptr description) = 0;                        // 3
    virtual HRESULT IsPictureKind(aafBoolean_t* bIsPictureKind) = 0;                          // 4
    virtual HRESULT IsMatteKind(aafBoolean_t* bIsMatteKind) = 0;                              // 5
    virtual HRESULT IsPictureWithMatteKind(aafBoolean_t* bIsPictureWithMatteKind) = 0;        // 6
    virtual HRESULT IsSoundKind(aafBoolean_t* bIsSoundKind) = 0;                              // 7
    virtual HRESULT DoesDataDefConvertTo(IAAFDataDef* id, aafBoolean_t* bDoesConvertTo) = 0;  // 8
    virtual HRESULT IsDataDefOf(IAAFDataDef* dataDef, aafBoolean_t* bIsDataDefOf) = 0;        // 9
    virtual HRESULT DoesDataDefConvertFrom(IAAFDataDef* dataDef,
                                           aafBoolean_t* bDoesConvertFrom) = 0;  // 10
    virtual HRESULT IsEdgecodeKind(aafBoolean_t* bIsEdgecodeKind) = 0;           // 11
    virtual HRESULT IsTimecodeKind(aafBoolean_t* bIsTimecodeKind) = 0;           // 12

protected:
    ~IAAFDataDef2() = default;
};

inline constexpr GUID IID_IAAFDataDef2 = ncfGuid("588951C1-2F10-46DA-A20D-6E8E7AC6963C");
constexpr const GUID& aafIdOf(const IAAFDataDef2*) {
    return IID_IAAFDataDef2;
}

// Answered by AAFDataDef.
struct IAAFDataDef3 : IUnknown {
    virtual HRESULT Initialize(aafUID_constref id, aafCharacter_constptr name,
                               aafCharacter_constptr description) = 0;                        // 3
    virtual HRESULT IsPictureKind(aafBoolean_t* bIsPictureKind) = 0;                          // 4
    virtual HRESULT IsMatteKind(aafBoolean_t* bIsMatteKind) = 0;                              // 5
    virtual HRESULT IsPictureWithMatteKind(aafBoolean_t* bIsPictureWithMatteKind) = 0;        // 6
    virtual HRESULT IsSoundKind(aafBoolean_t* bIsSoundKind) = 0;                              // 7
    virtual HRESULT DoesDataDefConvertTo(IAAFDataDef* id, aafBoolean_t* bDoesConvertTo) = 0;  // 8
    virtual HRESULT IsDataDefOf(IAAFDataDef* dataDef, aafBoolean_t* bIsDataDefOf) = 0;        // 9
    virtual HRESULT DoesDataDefConvertFrom(IAAFDataDef* dataDef,
                                           aafBoolean_t* bDoesConvertFrom) = 0;               // 10
    virtual HRESULT IsEdgecodeKind(aafBoolean_t* bIsEdgecodeKind) = 0;                        // 11
    virtual HRESULT IsTimecodeKind(aafBoolean_t* bIsTimecodeKind) = 0;                        // 12
    virtual HRESULT IsAuxiliaryKind(aafBoolean_t* bIsAuxiliaryKind) = 0;                      // 13
    virtual HRESULT IsDescriptiveMetadataKind(aafBoolean_t* bIsDescriptiveMetadataKind) = 0;  // 14

protected:
    ~IAAFDataDef3() = default;
};

inline constexpr GUID IID_IAAFDataDef3 = ncfGuid("858109C4-CB51-48AD-9086-A3FCFE9739FA");
constexpr const GUID& aafIdOf(const IAAFDataDef3*) {
    return IID_IAAFDataDef3;
}

// Answered by AAFContainerDef.
struct IAAFContainerDef : IUnknown {
    virtual HRESULT Initialize(aafUID_constref id, aafCharacter_constptr name,
                               aafCharacter_constptr description) = 0;             // 3
    virtual HRESULT EssenceIsIdentified(aafBoolean_t* essenceIsIdentified) = 0;    // 4
    virtual HRESULT SetEssenceIsIdentified(aafBoolean_t essenceIsIdentified) = 0;  // 5

protected:
    ~IAAFContainerDef() = default;
};

inline constexpr GUID IID_IAAFContainerDef = ncfGuid("AD1BB858-DBB2-11D2-809C-006008143E6F");
constexpr const GUID& aafIdOf(const IAAFContainerDef*) {
    return IID_IAAFContainerDef;
}

// Answered by EnumAAFDataDefs.
struct IEnumAAFDataDefs : IUnknown {
    virtual HRESULT NextOne(IAAFDataDef** dataDefs) = 0;                                       // 3
    virtual HRESULT Next(aafUInt32 count, IAAFDataDef** dataDefs, aafUInt32* numFetched) = 0;  // 4
    virtual HRESULT Skip(aafUInt32 count) = 0;                                                 // 5
    virtual HRESULT Reset() = 0;                                                               // 6
    virtual HRESULT Clone(IEnumAAFDataDefs** enumerator) = 0;                                  // 7

protected:
    ~IEnumAAFDataDefs() = default;
};

inline constexpr GUID IID_IEnumAAFDataDefs = ncfGuid("D8000382-498E-11D2-841B-00600832ACB8");
constexpr const GUID& aafIdOf(const IEnumAAFDataDefs*) {
    return IID_IEnumAAFDataDefs;
}

// Answered by EnumAAFContainerDefs.
struct IEnumAAFContainerDefs : IUnknown {
    virtual HRESULT NextOne(IAAFContainerDef** containerDefs) = 0;  // 3
    virtual HRESULT Next(aafUInt32 count, IAAFContainerDef** containerDefs,
                         aafUInt32* numFetched) = 0;                // 4
    virtual HRESULT Skip(aafUInt32 count) = 0;                      // 5
    virtual HRESULT Reset() = 0;                                    // 6
    virtual HRESULT Clone(IEnumAAFContainerDefs** enumerator) = 0;  // 7

protected:
    ~IEnumAAFContainerDefs() = default;
};

inline constexpr GUID IID_IEnumAAFContainerDefs = ncfGuid("3B2C9AD2-022A-11D3-80A6-006008143E6F");
constexpr const GUID& aafIdOf(const IEnumAAFContainerDefs*) {
    return IID_IEnumAAFContainerDefs;
}

// Answered by AAFCodecDef.
struct IAAFCodecDef : IUnknown {
    virtual HRESULT Initialize(aafUID_constref id, aafCharacter_constptr name,
                               aafCharacter_constptr description) = 0;  // 3
    virtual HRESULT IsEssenceKindSupported(IAAFDataDef* essenceKind,
                                           aafBoolean_t* isSupported) = 0;      // 4
    virtual HRESULT AddEssenceKind(IAAFDataDef* essenceKind) = 0;               // 5
    virtual HRESULT RemoveEssenceKind(IAAFDataDef* essenceKind) = 0;            // 6
    virtual HRESULT CountEssenceKinds(aafUInt32* result) = 0;                   // 7
    virtual HRESULT GetEssenceKinds(IEnumAAFDataDefs** enumerator) = 0;         // 8
    virtual HRESULT AreThereFlavours(aafBoolean_t* result) = 0;                 // 9
    virtual HRESULT GetFileDescriptorClass(IAAFClassDef** cls) = 0;             // 10
    virtual HRESULT SetFileDescriptorClass(IAAFClassDef* cls) = 0;              // 11
    virtual HRESULT EnumCodecFlavours(IEnumAAFCodecFlavours** enumerator) = 0;  // 12

protected:
    ~IAAFCodecDef() = default;
};

inline constexpr GUID IID_IAAFCodecDef = ncfGuid("AD1BB856-DBB2-11D2-809C-006008143E6F");
constexpr const GUID& aafIdOf(const IAAFCodecDef*) {
    return IID_IAAFCodecDef;
}

// Answered by EnumAAFCodecDefs.
struct IEnumAAFCodecDefs : IUnknown {
    virtual HRESULT NextOne(IAAFCodecDef** codecDefs) = 0;  // 3
    virtual HRESULT Next(aafUInt32 count, IAAFCodecDef** codecDefs,
                         aafUInt32* numFetched) = 0;            // 4
    virtual HRESULT Skip(aafUInt32 count) = 0;                  // 5
    virtual HRESULT Reset() = 0;                                // 6
    virtual HRESULT Clone(IEnumAAFCodecDefs** enumerator) = 0;  // 7

protected:
    ~IEnumAAFCodecDefs() = default;
};

inline constexpr GUID IID_IEnumAAFCodecDefs = ncfGuid("3B2C9AD4-022A-11D3-80A6-006008143E6F");
constexpr const GUID& aafIdOf(const IEnumAAFCodecDefs*) {
    return IID_IEnumAAFCodecDefs;
}

// Answered by AAFInterpolationDef.
struct IAAFInterpolationDef : IUnknown {
    virtual HRESULT Initialize(aafUID_constref id, aafCharacter_constptr name,
                               aafCharacter_constptr description) = 0;  // 3

protected:
    ~IAAFInterpolationDef() = default;
};

inline constexpr GUID IID_IAAFInterpolationDef = ncfGuid("293600A3-0D37-11D3-80A9-006008143E6F");
constexpr const GUID& aafIdOf(const IAAFInterpolationDef*) {
    return IID_IAAFInterpolationDef;
}

// Answered by AAFKLVDataDefinition.
struct IAAFKLVDataDefinition : IUnknown {
    virtual HRESULT Initialize(aafUID_constref id, aafCharacter_constptr name,
                               aafCharacter_constptr description) = 0;           // 3
    virtual HRESULT AddParentProperty(IAAFPropertyDef* parentProperty) = 0;      // 4
    virtual HRESULT GetParentProperties(IEnumAAFPropertyDefs** enumerator) = 0;  // 5
    virtual HRESULT CountParentProperties(aafUInt32* numProperties) = 0;         // 6
    virtual HRESULT RemoveParentProperty(IAAFPropertyDef* parentProperty) = 0;   // 7
    virtual HRESULT GetKLVDataType(IAAFTypeDef** typeDef) = 0;                   // 8
    virtual HRESULT SetKLVDataType(IAAFTypeDef* typeDef) = 0;                    // 9

protected:
    ~IAAFKLVDataDefinition() = default;
};

inline constexpr GUID IID_IAAFKLVDataDefinition = ncfGuid("F6AF8700-949C-4304-9706-C0576B53F4AA");
constexpr const GUID& aafIdOf(const IAAFKLVDataDefinition*) {
    return IID_IAAFKLVDataDefinition;
}

// Answered by AAFOperationDef.
struct IAAFOperationDef : IUnknown {
    virtual HRESULT Initialize(aafUID_constref id, aafCharacter_constptr name,
                               aafCharacter_constptr description) = 0;              // 3
    virtual HRESULT GetDataDef(IAAFDataDef** dataDef) = 0;                          // 4
    virtual HRESULT SetDataDef(IAAFDataDef* dataDef) = 0;                           // 5
    virtual HRESULT IsTimeWarp(aafBoolean_t* bIsTimeWarp) = 0;                      // 6
    virtual HRESULT SetIsTimeWarp(aafBoolean_t isTimeWarp) = 0;                     // 7
    virtual HRESULT PrependDegradeToOperation(IAAFOperationDef* operationDef) = 0;  // 8
    virtual HRESULT AppendDegradeToOperation(IAAFOperationDef* operationDef) = 0;   // 9
    virtual HRESULT InsertDegradeToOperationAt(aafUInt32 index,
                                               IAAFOperationDef* operationDef) = 0;  // 10
    virtual HRESULT RemoveDegradeToOperationAt(aafUInt32 index) = 0;                 // 11
    virtual HRESULT GetDegradeToOperations(IEnumAAFOperationDefs** enumerator) = 0;  // 12
    virtual HRESULT CountDegradeToOperations(aafUInt32* result) = 0;                 // 13
    virtual HRESULT GetCategory(aafUID_t* value) = 0;                                // 14
    virtual HRESULT SetCategory(aafUID_constref value) = 0;                          // 15
    virtual HRESULT GetNumberInputs(aafInt32* numberInputs) = 0;                     // 16
    virtual HRESULT SetNumberInputs(aafInt32 numberInputs) = 0;                      // 17
    virtual HRESULT GetBypass(aafUInt32* bypass) = 0;                                // 18
    virtual HRESULT SetBypass(aafUInt32 bypass) = 0;                                 // 19
    virtual HRESULT AddParameterDef(IAAFParameterDef* parameterDef) = 0;             // 20
    virtual HRESULT GetParameterDefs(IEnumAAFParameterDefs** enumerator) = 0;        // 21
    virtual HRESULT CountParameterDefs(aafUInt32* result) = 0;                       // 22
    virtual HRESULT LookupParameterDef(aafUID_constref parameterDefId,
                                       IAAFParameterDef** parameterDef) = 0;  // 23

protected:
    ~IAAFOperationDef() = default;
};

inline constexpr GUID IID_IAAFOperationDef = ncfGuid("14035D91-1FF5-11D2-BF97-006097116212");
constexpr const GUID& aafIdOf(const IAAFOperationDef*) {
    return IID_IAAFOperationDef;
}

// Answered by AAFParameterDef.
struct IAAFParameterDef : IUnknown {
    virtual HRESULT Initialize(aafUID_constref id, aafCharacter_constptr name,
                               aafCharacter_constptr description, IAAFTypeDef* type) = 0;  // 3
    virtual HRESULT GetTypeDefinition(IAAFTypeDef** typeDef) = 0;                          // 4
    virtual HRESULT SetDisplayUnits(aafCharacter_constptr displayUnits) = 0;               // 5
    virtual HRESULT GetDisplayUnits(aafCharacter* displayUnits, aafUInt32 bufSize) = 0;    // 6
    virtual HRESULT GetDisplayUnitsBufLen(aafUInt32* bufSize) = 0;                         // 7

protected:
    ~IAAFParameterDef() = default;
};

inline constexpr GUID IID_IAAFParameterDef = ncfGuid("20045FA1-1D87-11D2-BF96-006097116212");
constexpr const GUID& aafIdOf(const IAAFParameterDef*) {
    return IID_IAAFParameterDef;
}

// Answered by AAFPluginDef.
struct IAAFPluginDef : IUnknown {
    virtual HRESULT Initialize(aafUID_constref id, aafCharacter_constptr name,
                               aafCharacter_constptr description) = 0;                      // 3
    virtual HRESULT GetCategoryClass(aafUID_t* categoryClass) = 0;                          // 4
    virtual HRESULT SetCategoryClass(aafUID_constref categoryClass) = 0;                    // 5
    virtual HRESULT GetPluginVersion(aafVersionType_t* version) = 0;                        // 6
    virtual HRESULT SetPluginVersion(aafVersionType_t* version) = 0;                        // 7
    virtual HRESULT SetPluginVersionString(aafCharacter_constptr pluginVersionString) = 0;  // 8
    virtual HRESULT GetPluginVersionString(aafCharacter* pluginVersionString,
                                           aafUInt32 bufSize) = 0;         // 9
    virtual HRESULT GetPluginVersionStringBufLen(aafUInt32* bufSize) = 0;  // 10
    virtual HRESULT SetPluginManufacturerName(
        aafCharacter_constptr pluginManufacturerName) = 0;  // 11
    virtual HRESULT GetPluginManufacturerName(aafCharacter* pluginManufacturerName,
                                              aafUInt32 bufSize) = 0;                        // 12
    virtual HRESULT GetPluginManufacturerNameBufLen(aafUInt32* bufSize) = 0;                 // 13
    virtual HRESULT GetManufacturerInfo(IAAFNetworkLocator** result) = 0;                    // 14
    virtual HRESULT SetManufacturerInfo(IAAFNetworkLocator* manufacturerInfo) = 0;           // 15
    virtual HRESULT GetManufacturerID(aafUID_t* manufacturerID) = 0;                         // 16
    virtual HRESULT SetManufacturerID(aafUID_constref manufacturerID) = 0;                   // 17
    virtual HRESULT GetHardwarePlatform(aafHardwarePlatform_t* hardwarePlatform) = 0;        // 18
    virtual HRESULT SetHardwarePlatform(aafHardwarePlatform_constref hardwarePlatform) = 0;  // 19
    virtual HRESULT GetPlatformVersionRange(aafVersionType_t* minVersion,
                                            aafVersionType_t* maxVersion) = 0;          // 20
    virtual HRESULT SetPlatformMinimumVersion(aafVersionType_constref minVersion) = 0;  // 21
    virtual HRESULT SetPlatformMaximumVersion(aafVersionType_constref maxVersion) = 0;  // 22
    virtual HRESULT GetEngine(aafEngine_t* engine) = 0;                                 // 23
    virtual HRESULT SetEngine(aafEngine_constref engine) = 0;                           // 24
    virtual HRESULT GetEngineVersionRange(aafVersionType_t* minVersion,
                                          aafVersionType_t* maxVersion) = 0;          // 25
    virtual HRESULT SetEngineMinimumVersion(aafVersionType_constref minVersion) = 0;  // 26
    virtual HRESULT SetEngineMaximumVersion(aafVersionType_constref maxVersion) = 0;  // 27
    virtual HRESULT GetPluginAPI(aafPluginAPI_t* pluginAPI) = 0;                      // 28
    virtual HRESULT SetPluginAPI(aafPluginAPI_constref pluginAPI) = 0;                // 29
    virtual HRESULT GetPluginAPIVersionRange(aafVersionType_t* minVersion,
                                             aafVersionType_t* maxVersion) = 0;          // 30
    virtual HRESULT SetPluginAPIMinimumVersion(aafVersionType_constref minVersion) = 0;  // 31
    virtual HRESULT SetPluginAPIMaximumVersion(aafVersionType_constref maxVersion) = 0;  // 32
    virtual HRESULT IsSoftwareOnly(aafBoolean_t* isSoftwareOnly) = 0;                    // 33
    virtual HRESULT SetIsSoftwareOnly(aafBoolean_t isSoftwareOnly) = 0;                  // 34
    virtual HRESULT IsAccelerated(aafBoolean_t* isAccelerated) = 0;                      // 35
    virtual HRESULT SetIsAccelerated(aafBoolean_t isAccelerated) = 0;                    // 36
    virtual HRESULT SupportsAuthentication(aafBoolean_t* supportsAuthentication) = 0;    // 37
    virtual HRESULT SetSupportsAuthentication(aafBoolean_t supportsAuthentication) = 0;  // 38
    virtual HRESULT CountLocators(aafUInt32* result) = 0;                                // 39
    virtual HRESULT AppendLocator(IAAFLocator* locator) = 0;                             // 40
    virtual HRESULT PrependLocator(IAAFLocator* locator) = 0;                            // 41
    virtual HRESULT InsertLocatorAt(aafUInt32 index, IAAFLocator* locator) = 0;          // 42
    virtual HRESULT GetLocatorAt(aafUInt32 index, IAAFLocator** locator) = 0;            // 43
    virtual HRESULT RemoveLocatorAt(aafUInt32 index) = 0;                                // 44
    virtual HRESULT GetLocators(IEnumAAFPluginLocators** enumerator) = 0;                // 45
    virtual HRESULT SetDefinitionObjectID(aafUID_t def) = 0;                             // 46
    virtual HRESULT GetDefinitionObjectID(aafUID_t* def) = 0;                            // 47

protected:
    ~IAAFPluginDef() = default;
};

inline constexpr GUID IID_IAAFPluginDef = ncfGuid("AD1BB854-DBB2-11D2-809C-006008143E6F");
constexpr const GUID& aafIdOf(const IAAFPluginDef*) {
    return IID_IAAFPluginDef;
}

// Answered by AAFPluginManager.
struct IAAFPluginManager : IUnknown {
    virtual HRESULT RegisterSharedPlugins() = 0;                                       // 3
    virtual HRESULT RegisterPluginDirectory(aafCharacter_constptr directoryName) = 0;  // 4
    virtual HRESULT RegisterPluginFile(aafCharacter_constptr fileName) = 0;            // 5
    virtual HRESULT EnumLoadedPlugins(aafUID_constref categoryID,
                                      IEnumAAFLoadedPlugins** enumerator) = 0;  // 6
    virtual HRESULT CreatePluginDefinition(aafUID_constref pluginDefID, IAAFDictionary* dictionary,
                                           IAAFDefObject** pluginDef) = 0;  // 7
    virtual HRESULT CreateInstance(REFCLSID rclsid, IUnknown* unkOuter, REFIID riid,
                                   void** plugin) = 0;  // 8

protected:
    ~IAAFPluginManager() = default;
};

inline constexpr GUID IID_IAAFPluginManager = ncfGuid("AD1BB85C-DBB2-11D2-809C-006008143E6F");
constexpr const GUID& aafIdOf(const IAAFPluginManager*) {
    return IID_IAAFPluginManager;
}

// Answered by AAFTaggedValueDefinition.
struct IAAFTaggedValueDefinition : IUnknown {
    virtual HRESULT Initialize(aafUID_constref id, aafCharacter_constptr name,
                               aafCharacter_constptr description) = 0;           // 3
    virtual HRESULT AddParentProperty(IAAFPropertyDef* parentProperty) = 0;      // 4
    virtual HRESULT GetParentProperties(IEnumAAFPropertyDefs** enumerator) = 0;  // 5
    virtual HRESULT CountParentProperties(aafUInt32* numProperties) = 0;         // 6
    virtual HRESULT RemoveParentProperty(IAAFPropertyDef* parentProperty) = 0;   // 7

protected:
    ~IAAFTaggedValueDefinition() = default;
};

inline constexpr GUID IID_IAAFTaggedValueDefinition =
    ncfGuid("C358428A-BF73-4558-BFDF-482160719823");
constexpr const GUID& aafIdOf(const IAAFTaggedValueDefinition*) {
    return IID_IAAFTaggedValueDefinition;
}

// Answered by EnumAAFCodecFlavours.
struct IEnumAAFCodecFlavours : IUnknown {
    virtual HRESULT NextOne(aafUID_t* AAFCodecFlavour) = 0;                                     // 3
    virtual HRESULT Next(aafUInt32 count, aafUID_t* AAFCodecFlavours, aafUInt32* fetched) = 0;  // 4
    virtual HRESULT Skip(aafUInt32 count) = 0;                                                  // 5
    virtual HRESULT Reset() = 0;                                                                // 6
    virtual HRESULT Clone(IEnumAAFCodecFlavours** enumerator) = 0;                              // 7

protected:
    ~IEnumAAFCodecFlavours() = default;
};

inline constexpr GUID IID_IEnumAAFCodecFlavours = ncfGuid("AB4D9F12-DD69-11D2-809C-006008143E6F");
constexpr const GUID& aafIdOf(const IEnumAAFCodecFlavours*) {
    return IID_IEnumAAFCodecFlavours;
}

// Answered by EnumAAFInterpolationDefs.
struct IEnumAAFInterpolationDefs : IUnknown {
    virtual HRESULT NextOne(IAAFInterpolationDef** interpolationDefs) = 0;  // 3
    virtual HRESULT Next(aafUInt32 count, IAAFInterpolationDef** interpolationDefs,
                         aafUInt32* numFetched) = 0;                    // 4
    virtual HRESULT Skip(aafUInt32 count) = 0;                          // 5
    virtual HRESULT Reset() = 0;                                        // 6
    virtual HRESULT Clone(IEnumAAFInterpolationDefs** enumerator) = 0;  // 7

protected:
    ~IEnumAAFInterpolationDefs() = default;
};

inline constexpr GUID IID_IEnumAAFInterpolationDefs =
    ncfGuid("293600A5-0D37-11D3-80A9-006008143E6F");
constexpr const GUID& aafIdOf(const IEnumAAFInterpolationDefs*) {
    return IID_IEnumAAFInterpolationDefs;
}

// Answered by EnumAAFKLVDataDefs.
struct IEnumAAFKLVDataDefs : IUnknown {
    virtual HRESULT NextOne(IAAFKLVDataDefinition** KLVDataDefs) = 0;  // 3
    virtual HRESULT Next(aafUInt32 count, IAAFKLVDataDefinition** KLVDataDefs,
                         aafUInt32* numFetched) = 0;              // 4
    virtual HRESULT Skip(aafUInt32 count) = 0;                    // 5
    virtual HRESULT Reset() = 0;                                  // 6
    virtual HRESULT Clone(IEnumAAFKLVDataDefs** enumerator) = 0;  // 7

protected:
    ~IEnumAAFKLVDataDefs() = default;
};

inline constexpr GUID IID_IEnumAAFKLVDataDefs = ncfGuid("2A368C5C-E5AF-43C8-8E5A-E78BA02F5F3B");
constexpr const GUID& aafIdOf(const IEnumAAFKLVDataDefs*) {
    return IID_IEnumAAFKLVDataDefs;
}

// Answered by EnumAAFLoadedPlugins.
struct IEnumAAFLoadedPlugins : IUnknown {
    virtual HRESULT NextOne(aafUID_t* AAFPluginID) = 0;                                     // 3
    virtual HRESULT Next(aafUInt32 count, aafUID_t* AAFPluginIDs, aafUInt32* fetched) = 0;  // 4
    virtual HRESULT Skip(aafUInt32 count) = 0;                                              // 5
    virtual HRESULT Reset() = 0;                                                            // 6
    virtual HRESULT Clone(IEnumAAFLoadedPlugins** enumerator) = 0;                          // 7

protected:
    ~IEnumAAFLoadedPlugins() = default;
};

inline constexpr GUID IID_IEnumAAFLoadedPlugins = ncfGuid("AB4D9F14-DD69-11D2-809C-006008143E6F");
constexpr const GUID& aafIdOf(const IEnumAAFLoadedPlugins*) {
    return IID_IEnumAAFLoadedPlugins;
}

// Answered by EnumAAFOperationDefs.
struct IEnumAAFOperationDefs : IUnknown {
    virtual HRESULT NextOne(IAAFOperationDef** operationDefs) = 0;  // 3
    virtual HRESULT Next(aafUInt32 count, IAAFOperationDef** operationDefs,
                         aafUInt32* numFetched) = 0;                // 4
    virtual HRESULT Skip(aafUInt32 count) = 0;                      // 5
    virtual HRESULT Reset() = 0;                                    // 6
    virtual HRESULT Clone(IEnumAAFOperationDefs** enumerator) = 0;  // 7

protected:
    ~IEnumAAFOperationDefs() = default;
};

inline constexpr GUID IID_IEnumAAFOperationDefs = ncfGuid("92B88021-2B2B-11D2-BF7E-00104BC9156D");
constexpr const GUID& aafIdOf(const IEnumAAFOperationDefs*) {
    return IID_IEnumAAFOperationDefs;
}

// Answered by EnumAAFParameterDefs.
struct IEnumAAFParameterDefs : IUnknown {
    virtual HRESULT NextOne(IAAFParameterDef** parameterDef) = 0;  // 3
    virtual HRESULT Next(aafUInt32 count, IAAFParameterDef** parameterDefs,
                         aafUInt32* fetched) = 0;                   // 4
    virtual HRESULT Skip(aafUInt32 count) = 0;                      // 5
    virtual HRESULT Reset() = 0;                                    // 6
    virtual HRESULT Clone(IEnumAAFParameterDefs** enumerator) = 0;  // 7

protected:
    ~IEnumAAFParameterDefs() = default;
};

inline constexpr GUID IID_IEnumAAFParameterDefs = ncfGuid("B1A213A4-1A7D-11D2-BF78-00104BC9156D");
constexpr const GUID& aafIdOf(const IEnumAAFParameterDefs*) {
    return IID_IEnumAAFParameterDefs;
}

// Answered by EnumAAFPluginDefs.
struct IEnumAAFPluginDefs : IUnknown {
    virtual HRESULT NextOne(IAAFPluginDef** pluginDefs) = 0;  // 3
    virtual HRESULT Next(aafUInt32 count, IAAFPluginDef** pluginDefs,
                         aafUInt32* numFetched) = 0;             // 4
    virtual HRESULT Skip(aafUInt32 count) = 0;                   // 5
    virtual HRESULT Reset() = 0;                                 // 6
    virtual HRESULT Clone(IEnumAAFPluginDefs** enumerator) = 0;  // 7

protected:
    ~IEnumAAFPluginDefs() = default;
};

inline constexpr GUID IID_IEnumAAFPluginDefs = ncfGuid("AD1BB85F-DBB2-11D2-809C-006008143E6F");
constexpr const GUID& aafIdOf(const IEnumAAFPluginDefs*) {
    return IID_IEnumAAFPluginDefs;
}

// Answered by EnumAAFPluginLocators.
struct IEnumAAFPluginLocators : IUnknown {
    virtual HRESULT NextOne(IAAFLocator** AAFLocator) = 0;                                     // 3
    virtual HRESULT Next(aafUInt32 count, IAAFLocator** AAFLocators, aafUInt32* fetched) = 0;  // 4
    virtual HRESULT Skip(aafUInt32 count) = 0;                                                 // 5
    virtual HRESULT Reset() = 0;                                                               // 6
    virtual HRESULT Clone(IEnumAAFPluginLocators** enumerator) = 0;                            // 7

protected:
    ~IEnumAAFPluginLocators() = default;
};

inline constexpr GUID IID_IEnumAAFPluginLocators = ncfGuid("AD1BB861-DBB2-11D2-809C-006008143E6F");
constexpr const GUID& aafIdOf(const IEnumAAFPluginLocators*) {
    return IID_IEnumAAFPluginLocators;
}

// Answered by EnumAAFTaggedValueDefs.
struct IEnumAAFTaggedValueDefs : IUnknown {
    virtual HRESULT NextOne(IAAFTaggedValueDefinition** taggedValueDefs) = 0;  // 3
    virtual HRESULT Next(aafUInt32 count, IAAFTaggedValueDefinition** taggedValueDefs,
                         aafUInt32* numFetched) = 0;                  // 4
    virtual HRESULT Skip(aafUInt32 count) = 0;                        // 5
    virtual HRESULT Reset() = 0;                                      // 6
    virtual HRESULT Clone(IEnumAAFTaggedValueDefs** enumerator) = 0;  // 7

protected:
    ~IEnumAAFTaggedValueDefs() = default;
};

inline constexpr GUID IID_IEnumAAFTaggedValueDefs = ncfGuid("9D1BD790-16A8-488C-8743-F9A60A1CBA95");
constexpr const GUID& aafIdOf(const IEnumAAFTaggedValueDefs*) {
    return IID_IEnumAAFTaggedValueDefs;
}
