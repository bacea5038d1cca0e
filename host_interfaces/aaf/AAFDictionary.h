// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/aaf/AAFUnknown.h"

// The dictionary: it makes the objects of a file and holds all definitions. Each
// file has one, which the header gives out, always as the same pointer. The module
// begins every description with it.

struct IAAFClassDef;
struct IAAFCodecDef;
struct IAAFContainerDef;
struct IAAFDataDef;
struct IAAFDictionary;
struct IAAFInterpolationDef;
struct IAAFKLVDataDefinition;
struct IAAFOperationDef;
struct IAAFParameterDef;
struct IAAFPluginDef;
struct IAAFTaggedValueDefinition;
struct IAAFTypeDef;
struct IEnumAAFClassDefs;
struct IEnumAAFCodecDefs;
struct IEnumAAFContainerDefs;
struct IEnumAAFDataDefs;
struct IEnumAAFInterpolationDefs;
struct IEnumAAFKLVDataDefs;
struct IEnumAAFOperationDefs;
struct IEnumAAFParameterDefs;
struct IEnumAAFPluginDefs;
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
