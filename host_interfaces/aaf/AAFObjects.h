// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/aaf/AAFUnknown.h"

// What all objects share: their properties with values, and comments and raw data
// that may be attached. The host prints a description through them without knowing
// its classes; the module attaches attributes and properties of its own. A value
// belongs to its type, which reads and writes it.

struct IAAFClassDef;
struct IAAFDictionary;
struct IAAFIdentification;
struct IAAFKLVData;
struct IAAFProperty;
struct IAAFPropertyDef;
struct IAAFPropertyValue;
struct IAAFRIFFChunk;
struct IAAFTaggedValue;
struct IAAFTypeDef;
struct IEnumAAFKLVData;
struct IEnumAAFProperties;
struct IEnumAAFPropertyValues;
struct IEnumAAFRIFFChunks;
struct IEnumAAFTaggedValues;

// Answered by AAFPropertyValue.
struct IAAFPropertyValue : IUnknown {
    virtual HRESULT GetType(IAAFTypeDef** typeDef) = 0;          // 3
    virtual HRESULT IsDefinedType(aafBoolean_t* isDefined) = 0;  // 4

protected:
    ~IAAFPropertyValue() = default;
};

inline constexpr GUID IID_IAAFPropertyValue = ncfGuid("83057D72-9691-11D2-AA7F-80E6AA000000");
constexpr const GUID& aafIdOf(const IAAFPropertyValue*) {
    return IID_IAAFPropertyValue;
}

// Answered by AAFObject.
struct IAAFObject : IUnknown {
    virtual HRESULT GetGeneration(IAAFIdentification** generation) = 0;  // 3
    virtual HRESULT GetGenerationAUID(aafUID_t* result) = 0;             // 4
    virtual HRESULT GetDefinition(IAAFClassDef** classDef) = 0;          // 5
    virtual HRESULT GetProperties(IEnumAAFProperties** enumerator) = 0;  // 6
    virtual HRESULT CountProperties(aafUInt32* count) = 0;               // 7
    virtual HRESULT GetPropertyValue(IAAFPropertyDef* propDef,
                                     IAAFPropertyValue** propVal) = 0;  // 8
    virtual HRESULT SetPropertyValue(IAAFPropertyDef* propDef,
                                     IAAFPropertyValue* propVal) = 0;                       // 9
    virtual HRESULT IsPropertyPresent(IAAFPropertyDef* propDef, aafBoolean_t* result) = 0;  // 10
    virtual HRESULT RemoveOptionalProperty(IAAFPropertyDef* propDef) = 0;                   // 11
    virtual HRESULT CreateOptionalPropertyValue(IAAFPropertyDef* propDef,
                                                IAAFPropertyValue** propVal) = 0;  // 12
    virtual HRESULT GetDictionary(IAAFDictionary** dictionary) = 0;                // 13
    virtual HRESULT EnableGenerationTracking() = 0;                                // 14
    virtual HRESULT DisableGenerationTracking() = 0;                               // 15
    virtual HRESULT IsGenerationTracked(aafBoolean_t* result) = 0;                 // 16

protected:
    ~IAAFObject() = default;
};

inline constexpr GUID IID_IAAFObject = ncfGuid("B1A213AB-1A7D-11D2-BF78-00104BC9156D");
constexpr const GUID& aafIdOf(const IAAFObject*) {
    return IID_IAAFObject;
}

// Answered by AAFTaggedValue.
struct IAAFTaggedValue : IUnknown {
    virtual HRESULT Initialize(aafCharacter_constptr name, IAAFTypeDef* typeDef,
                               aafUInt32 valueSize, aafDataBuffer_t value) = 0;  // 3
    virtual HRESULT GetName(aafCharacter* name, aafUInt32 bufSize) = 0;          // 4
    virtual HRESULT GetNameBufLen(aafUInt32* bufSize) = 0;                       // 5
    virtual HRESULT GetTypeDefinition(IAAFTypeDef** typeDef) = 0;                // 6
    virtual HRESULT GetValue(aafUInt32 valueSize, aafDataBuffer_t value,
                             aafUInt32* bytesRead) = 0;                        // 7
    virtual HRESULT GetValueBufLen(aafUInt32* len) = 0;                        // 8
    virtual HRESULT SetValue(aafUInt32 valueSize, aafDataBuffer_t value) = 0;  // 9

protected:
    ~IAAFTaggedValue() = default;
};

inline constexpr GUID IID_IAAFTaggedValue = ncfGuid("E684D762-B935-11D2-BF9D-00104BC9156D");
constexpr const GUID& aafIdOf(const IAAFTaggedValue*) {
    return IID_IAAFTaggedValue;
}

// Answered by EnumAAFTaggedValues.
struct IEnumAAFTaggedValues : IUnknown {
    virtual HRESULT NextOne(IAAFTaggedValue** taggedValues) = 0;  // 3
    virtual HRESULT Next(aafUInt32 count, IAAFTaggedValue** taggedValues,
                         aafUInt32* numFetched) = 0;               // 4
    virtual HRESULT Skip(aafUInt32 count) = 0;                     // 5
    virtual HRESULT Reset() = 0;                                   // 6
    virtual HRESULT Clone(IEnumAAFTaggedValues** enumerator) = 0;  // 7

protected:
    ~IEnumAAFTaggedValues() = default;
};

inline constexpr GUID IID_IEnumAAFTaggedValues = ncfGuid("5F7916F1-0F87-11D3-8A3E-0050040EF7D2");
constexpr const GUID& aafIdOf(const IEnumAAFTaggedValues*) {
    return IID_IEnumAAFTaggedValues;
}

// Answered by EnumAAFProperties.
struct IEnumAAFProperties : IUnknown {
    virtual HRESULT NextOne(IAAFProperty** properties) = 0;  // 3
    virtual HRESULT Next(aafUInt32 count, IAAFProperty** properties,
                         aafUInt32* numFetched) = 0;             // 4
    virtual HRESULT Skip(aafUInt32 count) = 0;                   // 5
    virtual HRESULT Reset() = 0;                                 // 6
    virtual HRESULT Clone(IEnumAAFProperties** enumerator) = 0;  // 7

protected:
    ~IEnumAAFProperties() = default;
};

inline constexpr GUID IID_IEnumAAFProperties = ncfGuid("BE316DB2-7E73-11D2-841D-00600832ACB8");
constexpr const GUID& aafIdOf(const IEnumAAFProperties*) {
    return IID_IEnumAAFProperties;
}

// Answered by AAFProperty.
struct IAAFProperty : IUnknown {
    virtual HRESULT GetDefinition(IAAFPropertyDef** propDef) = 0;  // 3
    virtual HRESULT GetValue(IAAFPropertyValue** value) = 0;       // 4

protected:
    ~IAAFProperty() = default;
};

inline constexpr GUID IID_IAAFProperty = ncfGuid("83057D74-9691-11D2-AA7F-80E6AA000000");
constexpr const GUID& aafIdOf(const IAAFProperty*) {
    return IID_IAAFProperty;
}

// Answered by EnumAAFPropertyValues.
struct IEnumAAFPropertyValues : IUnknown {
    virtual HRESULT NextOne(IAAFPropertyValue** propertyValue) = 0;  // 3
    virtual HRESULT Next(aafUInt32 count, IAAFPropertyValue** propertyValues,
                         aafUInt32* fetched) = 0;                    // 4
    virtual HRESULT Skip(aafUInt32 count) = 0;                       // 5
    virtual HRESULT Reset() = 0;                                     // 6
    virtual HRESULT Clone(IEnumAAFPropertyValues** enumerator) = 0;  // 7

protected:
    ~IEnumAAFPropertyValues() = default;
};

inline constexpr GUID IID_IEnumAAFPropertyValues = ncfGuid("809C8CAA-9884-11D2-841F-00600832ACB8");
constexpr const GUID& aafIdOf(const IEnumAAFPropertyValues*) {
    return IID_IEnumAAFPropertyValues;
}

// Answered by EnumAAFKLVData.
struct IEnumAAFKLVData : IUnknown {
    virtual HRESULT NextOne(IAAFKLVData** KLVData) = 0;                                       // 3
    virtual HRESULT Next(aafUInt32 count, IAAFKLVData** KLVData, aafUInt32* numFetched) = 0;  // 4
    virtual HRESULT Skip(aafUInt32 count) = 0;                                                // 5
    virtual HRESULT Reset() = 0;                                                              // 6
    virtual HRESULT Clone(IEnumAAFKLVData** enumerator) = 0;                                  // 7

protected:
    ~IEnumAAFKLVData() = default;
};

inline constexpr GUID IID_IEnumAAFKLVData = ncfGuid("46114416-0676-11D4-A356-009027DFCA6A");
constexpr const GUID& aafIdOf(const IEnumAAFKLVData*) {
    return IID_IEnumAAFKLVData;
}

// Answered by AAFKLVData.
struct IAAFKLVData : IUnknown {
    virtual HRESULT Initialize(aafUID_t key, aafUInt32 length, aafDataBuffer_t value) = 0;  // 3
    virtual HRESULT GetKey(aafUID_t* key) = 0;                                              // 4
    virtual HRESULT GetValue(aafUInt32 valueSize, aafDataBuffer_t value,
                             aafUInt32* bytesRead) = 0;                        // 5
    virtual HRESULT GetValueBufLen(aafUInt32* len) = 0;                        // 6
    virtual HRESULT SetValue(aafUInt32 valueSize, aafDataBuffer_t value) = 0;  // 7

protected:
    ~IAAFKLVData() = default;
};

inline constexpr GUID IID_IAAFKLVData = ncfGuid("46114414-0676-11D4-A356-009027DFCA6A");
constexpr const GUID& aafIdOf(const IAAFKLVData*) {
    return IID_IAAFKLVData;
}

// Answered by AAFDescriptiveFramework.
struct IAAFDescriptiveFramework : IUnknown {
protected:
    ~IAAFDescriptiveFramework() = default;
};

inline constexpr GUID IID_IAAFDescriptiveFramework =
    ncfGuid("1CDED29F-B8F0-437D-ABB0-2144DD35B4AA");
constexpr const GUID& aafIdOf(const IAAFDescriptiveFramework*) {
    return IID_IAAFDescriptiveFramework;
}

// Answered by AAFDescriptiveObject.
struct IAAFDescriptiveObject : IUnknown {
protected:
    ~IAAFDescriptiveObject() = default;
};

inline constexpr GUID IID_IAAFDescriptiveObject = ncfGuid("08A98E21-8995-4BB9-98D4-166F24A5AC66");
constexpr const GUID& aafIdOf(const IAAFDescriptiveObject*) {
    return IID_IAAFDescriptiveObject;
}

// Answered by AAFRIFFChunk.
struct IAAFRIFFChunk : IUnknown {
    virtual HRESULT Initialize(aafUInt32 chunkID) = 0;                                        // 3
    virtual HRESULT SetChunkID(aafUInt32 chunkID) = 0;                                        // 4
    virtual HRESULT GetChunkID(aafUInt32* chunkID) = 0;                                       // 5
    virtual HRESULT Read(aafUInt32 bytes, aafDataBuffer_t buffer, aafUInt32* bytesRead) = 0;  // 6
    virtual HRESULT Write(aafUInt32 bytes, aafDataBuffer_t buffer,
                          aafUInt32* bytesWritten) = 0;      // 7
    virtual HRESULT SetPosition(aafPosition_t offset) = 0;   // 8
    virtual HRESULT GetPosition(aafPosition_t* offset) = 0;  // 9
    virtual HRESULT GetLength(aafLength_t* length) = 0;      // 10

protected:
    ~IAAFRIFFChunk() = default;
};

inline constexpr GUID IID_IAAFRIFFChunk = ncfGuid("49B6DE18-F562-434E-BFAB-A46D144EF22A");
constexpr const GUID& aafIdOf(const IAAFRIFFChunk*) {
    return IID_IAAFRIFFChunk;
}

// Answered by EnumAAFRIFFChunks.
struct IEnumAAFRIFFChunks : IUnknown {
    virtual HRESULT NextOne(IAAFRIFFChunk** RIFFChunks) = 0;  // 3
    virtual HRESULT Next(aafUInt32 count, IAAFRIFFChunk** RIFFChunks,
                         aafUInt32* numFetched) = 0;             // 4
    virtual HRESULT Skip(aafUInt32 count) = 0;                   // 5
    virtual HRESULT Reset() = 0;                                 // 6
    virtual HRESULT Clone(IEnumAAFRIFFChunks** enumerator) = 0;  // 7

protected:
    ~IEnumAAFRIFFChunks() = default;
};

inline constexpr GUID IID_IEnumAAFRIFFChunks = ncfGuid("54716785-AE2A-4E4B-864D-C8831A7F3C61");
constexpr const GUID& aafIdOf(const IEnumAAFRIFFChunks*) {
    return IID_IEnumAAFRIFFChunks;
}
