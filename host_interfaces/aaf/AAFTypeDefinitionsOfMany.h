// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/aaf/AAFUnknown.h"

// Types of several values and of references: arrays, sets, streams, objects owned or
// referred to. Counts and indexes are of elements, from 0; sizes are in bytes. Owned
// and used as the types of single values.

struct IAAFClassDef;
struct IAAFPlainStreamData;
struct IAAFPropertyValue;
struct IAAFStreamAccess;
struct IAAFTypeDef;
struct IEnumAAFPropertyValues;

// Answered by AAFTypeDefVariableArray.
struct IAAFTypeDefVariableArray : IUnknown {
    virtual HRESULT Initialize(aafUID_constref id, IAAFTypeDef* typeDef,
                               aafCharacter_constptr typeName) = 0;              // 3
    virtual HRESULT GetType(IAAFTypeDef** typeDef) = 0;                          // 4
    virtual HRESULT GetCount(IAAFPropertyValue* propVal, aafUInt32* count) = 0;  // 5
    virtual HRESULT AppendElement(IAAFPropertyValue* inPropVal,
                                  IAAFPropertyValue* memberPropVal) = 0;  // 6
    virtual HRESULT CreateEmptyValue(IAAFPropertyValue** propVal) = 0;    // 7
    virtual HRESULT CreateValueFromValues(IAAFPropertyValue** elementValues, aafUInt32 numElements,
                                          IAAFPropertyValue** propVal) = 0;  // 8
    virtual HRESULT CreateValueFromCArray(aafMemPtr_t initData, aafUInt32 initDataSize,
                                          IAAFPropertyValue** propVal) = 0;  // 9
    virtual HRESULT GetElementValue(IAAFPropertyValue* inPropVal, aafUInt32 index,
                                    IAAFPropertyValue** outPropVal) = 0;  // 10
    virtual HRESULT GetCArray(IAAFPropertyValue* propVal, aafMemPtr_t data,
                              aafUInt32 dataSize) = 0;  // 11
    virtual HRESULT SetElementValue(IAAFPropertyValue* propVal, aafUInt32 index,
                                    IAAFPropertyValue* memberPropVal) = 0;  // 12
    virtual HRESULT SetCArray(IAAFPropertyValue* propVal, aafMemPtr_t data,
                              aafUInt32 dataSize) = 0;  // 13
    virtual HRESULT GetElements(IAAFPropertyValue* setPropVal,
                                IEnumAAFPropertyValues** enumerator) = 0;  // 14

protected:
    ~IAAFTypeDefVariableArray() = default;
};

inline constexpr GUID IID_IAAFTypeDefVariableArray =
    ncfGuid("307E9E66-DCB2-11D2-8429-00600832ACB8");
constexpr const GUID& aafIdOf(const IAAFTypeDefVariableArray*) {
    return IID_IAAFTypeDefVariableArray;
}

// Answered by AAFTypeDefVariableArray.
struct IAAFTypeDefVariableArrayEx : IUnknown {
    virtual HRESULT PrependElement(IAAFPropertyValue* inPropVal,
                                   IAAFPropertyValue* memberPropVal) = 0;              // 3
    virtual HRESULT RemoveElement(IAAFPropertyValue* inPropVal, aafUInt32 index) = 0;  // 4
    virtual HRESULT InsertElement(IAAFPropertyValue* inPropVal, aafUInt32 index,
                                  IAAFPropertyValue* memberPropVal) = 0;  // 5

protected:
    ~IAAFTypeDefVariableArrayEx() = default;
};

inline constexpr GUID IID_IAAFTypeDefVariableArrayEx =
    ncfGuid("7F73D4B3-6F9A-11D4-8E59-009027DFCC26");
constexpr const GUID& aafIdOf(const IAAFTypeDefVariableArrayEx*) {
    return IID_IAAFTypeDefVariableArrayEx;
}

// Answered by AAFTypeDefObjectRef.
struct IAAFTypeDefObjectRef : IUnknown {
    virtual HRESULT GetObjectType(IAAFClassDef** objType) = 0;                                 // 3
    virtual HRESULT CreateValue(IUnknown* obj, IAAFPropertyValue** propVal) = 0;               // 4
    virtual HRESULT GetObject(IAAFPropertyValue* propVal, REFIID iid, IUnknown** object) = 0;  // 5
    virtual HRESULT SetObject(IAAFPropertyValue* propVal, IUnknown* object) = 0;               // 6

protected:
    ~IAAFTypeDefObjectRef() = default;
};

inline constexpr GUID IID_IAAFTypeDefObjectRef = ncfGuid("C3274644-9467-11D2-841F-00600832ACB8");
constexpr const GUID& aafIdOf(const IAAFTypeDefObjectRef*) {
    return IID_IAAFTypeDefObjectRef;
}

// Answered by AAFTypeDefFixedArray.
struct IAAFTypeDefFixedArray : IUnknown {
    virtual HRESULT Initialize(aafUID_constref id, IAAFTypeDef* typeDef, aafUInt32 nElements,
                               aafCharacter_constptr typeName) = 0;  // 3
    virtual HRESULT GetType(IAAFTypeDef** typeDef) = 0;              // 4
    virtual HRESULT GetCount(aafUInt32* count) = 0;                  // 5
    virtual HRESULT CreateValueFromValues(IAAFPropertyValue** elementValues, aafUInt32 numElements,
                                          IAAFPropertyValue** propVal) = 0;  // 6
    virtual HRESULT CreateValueFromCArray(aafMemPtr_t initData, aafUInt32 initDataSize,
                                          IAAFPropertyValue** propVal) = 0;  // 7
    virtual HRESULT GetElementValue(IAAFPropertyValue* inPropVal, aafUInt32 index,
                                    IAAFPropertyValue** outPropVal) = 0;  // 8
    virtual HRESULT GetCArray(IAAFPropertyValue* propVal, aafMemPtr_t data,
                              aafUInt32 dataSize) = 0;  // 9
    virtual HRESULT SetElementValue(IAAFPropertyValue* propVal, aafUInt32 index,
                                    IAAFPropertyValue* memberPropVal) = 0;  // 10
    virtual HRESULT SetCArray(IAAFPropertyValue* propVal, aafMemPtr_t data,
                              aafUInt32 dataSize) = 0;  // 11
    virtual HRESULT GetElements(IAAFPropertyValue* setPropVal,
                                IEnumAAFPropertyValues** enumerator) = 0;  // 12

protected:
    ~IAAFTypeDefFixedArray() = default;
};

inline constexpr GUID IID_IAAFTypeDefFixedArray = ncfGuid("C3274646-9467-11D2-841F-00600832ACB8");
constexpr const GUID& aafIdOf(const IAAFTypeDefFixedArray*) {
    return IID_IAAFTypeDefFixedArray;
}

// Answered by AAFTypeDefSet.
struct IAAFTypeDefSet : IUnknown {
    virtual HRESULT Initialize(aafUID_constref id, IAAFTypeDef* typeDef,
                               aafCharacter_constptr typeName) = 0;  // 3
    virtual HRESULT GetElementType(IAAFTypeDef** typeDef) = 0;       // 4
    virtual HRESULT AddElement(IAAFPropertyValue* setPropertyValue,
                               IAAFPropertyValue* elementPropertyValue) = 0;  // 5
    virtual HRESULT RemoveElement(IAAFPropertyValue* setPropertyValue,
                                  IAAFPropertyValue* elementPropertyValue) = 0;  // 6
    virtual HRESULT ContainsElement(IAAFPropertyValue* setPropertyValue,
                                    IAAFPropertyValue* elementPropertyValue,
                                    aafBoolean_t* containsElement) = 0;                   // 7
    virtual HRESULT GetCount(IAAFPropertyValue* setPropertyValue, aafUInt32* count) = 0;  // 8
    virtual HRESULT CreateKey(aafDataBuffer_t keyPtr, aafUInt32 length,
                              IAAFPropertyValue** key) = 0;  // 9
    virtual HRESULT LookupElement(IAAFPropertyValue* setPropertyValue, IAAFPropertyValue* key,
                                  IAAFPropertyValue** elementPropertyValue) = 0;  // 10
    virtual HRESULT ContainsKey(IAAFPropertyValue* setPropertyValue, IAAFPropertyValue* key,
                                aafBoolean_t* containsKey) = 0;  // 11
    virtual HRESULT GetElements(IAAFPropertyValue* setPropertyValue,
                                IEnumAAFPropertyValues** enumerator) = 0;  // 12

protected:
    ~IAAFTypeDefSet() = default;
};

inline constexpr GUID IID_IAAFTypeDefSet = ncfGuid("381E1F22-E7BB-11D2-842A-00600832ACB8");
constexpr const GUID& aafIdOf(const IAAFTypeDefSet*) {
    return IID_IAAFTypeDefSet;
}

// Answered by AAFTypeDefStrongObjRef.
struct IAAFTypeDefStrongObjRef : IUnknown {
    virtual HRESULT Initialize(aafUID_constref id, IAAFClassDef* objType,
                               aafCharacter_constptr typeName) = 0;  // 3

protected:
    ~IAAFTypeDefStrongObjRef() = default;
};

inline constexpr GUID IID_IAAFTypeDefStrongObjRef = ncfGuid("381E1F26-E7BB-11D2-842A-00600832ACB8");
constexpr const GUID& aafIdOf(const IAAFTypeDefStrongObjRef*) {
    return IID_IAAFTypeDefStrongObjRef;
}

// Answered by AAFTypeDefWeakObjRef.
struct IAAFTypeDefWeakObjRef : IUnknown {
    virtual HRESULT Initialize(aafUID_constref id, IAAFClassDef* objType,
                               aafCharacter_constptr typeName, aafUInt32 ids,
                               aafUID_constptr targetSet) = 0;  // 3

protected:
    ~IAAFTypeDefWeakObjRef() = default;
};

inline constexpr GUID IID_IAAFTypeDefWeakObjRef = ncfGuid("381E1F24-E7BB-11D2-842A-00600832ACB8");
constexpr const GUID& aafIdOf(const IAAFTypeDefWeakObjRef*) {
    return IID_IAAFTypeDefWeakObjRef;
}

// Answered by AAFTypeDefStream.
struct IAAFTypeDefStream : IUnknown {
    virtual HRESULT GetSize(IAAFPropertyValue* streamPropertyValue, aafInt64* size) = 0;    // 3
    virtual HRESULT SetSize(IAAFPropertyValue* streamPropertyValue, aafInt64 newSize) = 0;  // 4
    virtual HRESULT GetPosition(IAAFPropertyValue* streamPropertyValue,
                                aafInt64* position) = 0;  // 5
    virtual HRESULT SetPosition(IAAFPropertyValue* streamPropertyValue,
                                aafInt64 newPosition) = 0;  // 6
    virtual HRESULT Read(IAAFPropertyValue* streamPropertyValue, aafUInt32 dataSize,
                         aafMemPtr_t data, aafUInt32* bytesRead) = 0;  // 7
    virtual HRESULT Write(IAAFPropertyValue* streamPropertyValue, aafUInt32 dataSize,
                          aafMemPtr_t data) = 0;  // 8
    virtual HRESULT Append(IAAFPropertyValue* streamPropertyValue, aafUInt32 dataSize,
                           aafMemPtr_t data) = 0;  // 9
    virtual HRESULT HasStoredByteOrder(IAAFPropertyValue* streamPropertyValue,
                                       aafBoolean_t* hasByteOrder) = 0;  // 10
    virtual HRESULT GetStoredByteOrder(IAAFPropertyValue* streamPropertyValue,
                                       eAAFByteOrder_t* byteOrder) = 0;  // 11
    virtual HRESULT SetStoredByteOrder(IAAFPropertyValue* streamPropertyValue,
                                       eAAFByteOrder_t byteOrder) = 0;                 // 12
    virtual HRESULT ClearStoredByteOrder(IAAFPropertyValue* streamPropertyValue) = 0;  // 13
    virtual HRESULT ReadElements(IAAFPropertyValue* streamPropertyValue, IAAFTypeDef* elementType,
                                 aafUInt32 dataSize, aafMemPtr_t data,
                                 aafUInt32* bytesRead) = 0;  // 14
    virtual HRESULT WriteElements(IAAFPropertyValue* streamPropertyValue, IAAFTypeDef* elementType,
                                  aafUInt32 dataSize,
                                  aafMemPtr_t data) = 0;  // 15
    virtual HRESULT AppendElements(IAAFPropertyValue* streamPropertyValue, IAAFTypeDef* elementType,
                                   aafUInt32 dataSize,
                                   aafMemPtr_t data) = 0;  // 16

protected:
    ~IAAFTypeDefStream() = default;
};

inline constexpr GUID IID_IAAFTypeDefStream = ncfGuid("307E9E6E-DCB2-11D2-8429-00600832ACB8");
constexpr const GUID& aafIdOf(const IAAFTypeDefStream*) {
    return IID_IAAFTypeDefStream;
}

// Answered by AAFTypeDefStream.
struct IAAFTypeDefStreamEx : IUnknown {
    virtual HRESULT SetCallback(IAAFPropertyValue* propertyValue, IAAFStreamAccess* callbackIF,
                                aafMemPtr_t userData) = 0;  // 3

protected:
    ~IAAFTypeDefStreamEx() = default;
};

inline constexpr GUID IID_IAAFTypeDefStreamEx = ncfGuid("A7A76BEF-E074-4DA8-B18D-07E355C60DF4");
constexpr const GUID& aafIdOf(const IAAFTypeDefStreamEx*) {
    return IID_IAAFTypeDefStreamEx;
}

// Answered by AAFTypeDefStream.
struct IAAFTypeDefStream3 : IUnknown {
    virtual HRESULT GetSize(IAAFPropertyValue* streamPropertyValue, aafInt64* size) = 0;    // 3
    virtual HRESULT SetSize(IAAFPropertyValue* streamPropertyValue, aafInt64 newSize) = 0;  // 4
    virtual HRESULT GetPosition(IAAFPropertyValue* streamPropertyValue,
                                aafInt64* position) = 0;  // 5
    virtual HRESULT SetPosition(IAAFPropertyValue* streamPropertyValue,
                                aafInt64 newPosition) = 0;  // 6
    virtual HRESULT Read(IAAFPropertyValue* streamPropertyValue, aafUInt32 dataSize,
                         aafMemPtr_t data, aafUInt32* bytesRead) = 0;  // 7
    virtual HRESULT Write(IAAFPropertyValue* streamPropertyValue, aafUInt32 dataSize,
                          aafMemPtr_t data) = 0;  // 8
    virtual HRESULT Append(IAAFPropertyValue* streamPropertyValue, aafUInt32 dataSize,
                           aafMemPtr_t data) = 0;  // 9
    virtual HRESULT HasStoredByteOrder(IAAFPropertyValue* streamPropertyValue,
                                       aafBoolean_t* hasByteOrder) = 0;  // 10
    virtual HRESULT GetStoredByteOrder(IAAFPropertyValue* streamPropertyValue,
                                       eAAFByteOrder_t* byteOrder) = 0;  // 11
    virtual HRESULT SetStoredByteOrder(IAAFPropertyValue* streamPropertyValue,
                                       eAAFByteOrder_t byteOrder) = 0;                 // 12
    virtual HRESULT ClearStoredByteOrder(IAAFPropertyValue* streamPropertyValue) = 0;  // 13
    virtual HRESULT ReadElements(IAAFPropertyValue* streamPropertyValue, IAAFTypeDef* elementType,
                                 aafUInt32 dataSize, aafMemPtr_t data,
                                 aafUInt32* bytesRead) = 0;  // 14
    virtual HRESULT WriteElements(IAAFPropertyValue* streamPropertyValue, IAAFTypeDef* elementType,
                                  aafUInt32 dataSize,
                                  aafMemPtr_t data) = 0;  // 15
    virtual HRESULT AppendElements(IAAFPropertyValue* streamPropertyValue, IAAFTypeDef* elementType,
                                   aafUInt32 dataSize,
                                   aafMemPtr_t data) = 0;  // 16
    virtual HRESULT SetCallback(IAAFPropertyValue* propertyValue, IAAFStreamAccess* callbackIF,
                                aafMemPtr_t userData) = 0;  // 17
    virtual HRESULT GetPlainStreamData(aafUInt32 reserved,
                                       IAAFPlainStreamData** plainStreamData) = 0;  // 18

protected:
    ~IAAFTypeDefStream3() = default;
};

inline constexpr GUID IID_IAAFTypeDefStream3 = ncfGuid("D1E43120-D90A-463F-BC4D-BB1174A8DBD3");
constexpr const GUID& aafIdOf(const IAAFTypeDefStream3*) {
    return IID_IAAFTypeDefStream3;
}
