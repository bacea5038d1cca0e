// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/aaf/AAFUnknown.h"

// Types of single values: numbers, records, texts, enumerations, and names for other
// types. A type makes, reads and writes values (IAAFPropertyValue) of its kind; sizes
// are in bytes. The dictionary owns types. The module writes properties of its own
// with them; the host prints values.

struct IAAFPropertyValue;
struct IAAFTypeDef;
struct IEnumAAFTypeDefs;

// Answered by AAFTypeDef.
struct IAAFTypeDef : IUnknown {
    virtual HRESULT GetTypeCategory(eAAFTypeCategory_t* tid) = 0;  // 3
    virtual HRESULT RawAccessType(IAAFTypeDef** rawTypeDef) = 0;   // 4

protected:
    ~IAAFTypeDef() = default;
};

inline constexpr GUID IID_IAAFTypeDef = ncfGuid("DFBD6523-1D81-11D2-BF96-006097116212");
constexpr const GUID& aafIdOf(const IAAFTypeDef*) {
    return IID_IAAFTypeDef;
}

// Answered by AAFTypeDefInt.
struct IAAFTypeDefInt : IUnknown {
    virtual HRESULT Initialize(aafUID_constref id, aafUInt8 intSize, aafBoolean_t isSigned,
                               aafCharacter_constptr typeName) = 0;  // 3
    virtual HRESULT CreateValue(aafMemPtr_t val, aafUInt32 valSize,
                                IAAFPropertyValue** propVal) = 0;  // 4
    virtual HRESULT GetInteger(IAAFPropertyValue* propVal, aafMemPtr_t val,
                               aafUInt32 valSize) = 0;  // 5
    virtual HRESULT SetInteger(IAAFPropertyValue* propVal, aafMemPtr_t val,
                               aafUInt32 valSize) = 0;     // 6
    virtual HRESULT GetSize(aafUInt32* size) = 0;          // 7
    virtual HRESULT IsSigned(aafBoolean_t* isSigned) = 0;  // 8

protected:
    ~IAAFTypeDefInt() = default;
};

inline constexpr GUID IID_IAAFTypeDefInt = ncfGuid("809C8CA2-9884-11D2-841F-00600832ACB8");
constexpr const GUID& aafIdOf(const IAAFTypeDefInt*) {
    return IID_IAAFTypeDefInt;
}

// Answered by AAFTypeDefRecord.
struct IAAFTypeDefRecord : IUnknown {
    virtual HRESULT Initialize(aafUID_constref id, IAAFTypeDef** memberTypes,
                               aafString_t* memberNames, aafUInt32 numMembers,
                               aafCharacter_constptr typeName) = 0;                             // 3
    virtual HRESULT GetMemberType(aafUInt32 index, IAAFTypeDef** typeDef) = 0;                  // 4
    virtual HRESULT GetMemberName(aafUInt32 index, aafCharacter* name, aafUInt32 bufSize) = 0;  // 5
    virtual HRESULT GetMemberNameBufLen(aafUInt32 index, aafUInt32* len) = 0;                   // 6
    virtual HRESULT CreateValueFromValues(IAAFPropertyValue** memberValues, aafUInt32 numMembers,
                                          IAAFPropertyValue** propVal) = 0;  // 7
    virtual HRESULT CreateValueFromStruct(aafMemPtr_t initData, aafUInt32 initDataSize,
                                          IAAFPropertyValue** propVal) = 0;  // 8
    virtual HRESULT GetValue(IAAFPropertyValue* inPropVal, aafUInt32 index,
                             IAAFPropertyValue** outPropVal) = 0;  // 9
    virtual HRESULT GetStruct(IAAFPropertyValue* propVal, aafMemPtr_t data,
                              aafUInt32 dataSize) = 0;  // 10
    virtual HRESULT SetValue(IAAFPropertyValue* propVal, aafUInt32 index,
                             IAAFPropertyValue* memberPropVal) = 0;  // 11
    virtual HRESULT SetStruct(IAAFPropertyValue* propVal, aafMemPtr_t data,
                              aafUInt32 dataSize) = 0;  // 12
    virtual HRESULT GetCount(aafUInt32* count) = 0;     // 13
    virtual HRESULT RegisterMembers(aafUInt32* offsets, aafUInt32 numMembers,
                                    aafUInt32 structSize) = 0;  // 14

protected:
    ~IAAFTypeDefRecord() = default;
};

inline constexpr GUID IID_IAAFTypeDefRecord = ncfGuid("809C8CA6-9884-11D2-841F-00600832ACB8");
constexpr const GUID& aafIdOf(const IAAFTypeDefRecord*) {
    return IID_IAAFTypeDefRecord;
}

// Answered by AAFTypeDefString.
struct IAAFTypeDefString : IUnknown {
    virtual HRESULT Initialize(aafUID_constref id, IAAFTypeDef* typeDef,
                               aafCharacter_constptr typeName) = 0;              // 3
    virtual HRESULT GetType(IAAFTypeDef** typeDef) = 0;                          // 4
    virtual HRESULT GetCount(IAAFPropertyValue* propVal, aafUInt32* count) = 0;  // 5
    virtual HRESULT CreateValueFromCString(aafMemPtr_t initData, aafUInt32 initDataSize,
                                           IAAFPropertyValue** propVal) = 0;  // 6
    virtual HRESULT SetCString(IAAFPropertyValue* propVal, aafMemPtr_t data,
                               aafUInt32 dataSize) = 0;                                      // 7
    virtual HRESULT AppendElements(IAAFPropertyValue* inPropVal, aafMemPtr_t elements) = 0;  // 8
    virtual HRESULT GetElements(IAAFPropertyValue* inPropVal, aafMemPtr_t buffer,
                                aafUInt32 bufferSize) = 0;  // 9

protected:
    ~IAAFTypeDefString() = default;
};

inline constexpr GUID IID_IAAFTypeDefString = ncfGuid("307E9E68-DCB2-11D2-8429-00600832ACB8");
constexpr const GUID& aafIdOf(const IAAFTypeDefString*) {
    return IID_IAAFTypeDefString;
}

// Answered by AAFTypeDefEnum.
struct IAAFTypeDefEnum : IUnknown {
    virtual HRESULT Initialize(aafUID_constref id, IAAFTypeDef* type, aafInt64* elementValues,
                               aafString_t* elementNames, aafUInt32 numElems,
                               aafCharacter_constptr typeName) = 0;  // 3
    virtual HRESULT CreateValueFromName(aafCharacter_constptr name,
                                        IAAFPropertyValue** propVal) = 0;      // 4
    virtual HRESULT GetElementType(IAAFTypeDef** typeDef) = 0;                 // 5
    virtual HRESULT GetElementValue(aafUInt32 index, aafInt64* outValue) = 0;  // 6
    virtual HRESULT GetElementName(aafUInt32 index, aafCharacter* outValue,
                                   aafUInt32 bufSize) = 0;                      // 7
    virtual HRESULT GetElementNameBufLen(aafUInt32 index, aafUInt32* len) = 0;  // 8
    virtual HRESULT CountElements(aafUInt32* count) = 0;                        // 9
    virtual HRESULT GetNameFromValue(IAAFPropertyValue* value, aafCharacter* name,
                                     aafUInt32 bufSize) = 0;                               // 10
    virtual HRESULT GetNameBufLenFromValue(IAAFPropertyValue* value, aafUInt32* len) = 0;  // 11
    virtual HRESULT GetNameFromInteger(aafInt64 value, aafCharacter* name,
                                       aafUInt32 bufSize) = 0;                               // 12
    virtual HRESULT GetNameBufLenFromInteger(aafInt64 value, aafUInt32* len) = 0;            // 13
    virtual HRESULT GetIntegerValue(IAAFPropertyValue* propValIn, aafInt64* valueOut) = 0;   // 14
    virtual HRESULT SetIntegerValue(IAAFPropertyValue* propValToSet, aafInt64 valueIn) = 0;  // 15
    virtual HRESULT RegisterSize(aafUInt32 enumSize) = 0;                                    // 16

protected:
    ~IAAFTypeDefEnum() = default;
};

inline constexpr GUID IID_IAAFTypeDefEnum = ncfGuid("307E9E64-DCB2-11D2-8429-00600832ACB8");
constexpr const GUID& aafIdOf(const IAAFTypeDefEnum*) {
    return IID_IAAFTypeDefEnum;
}

// Answered by AAFTypeDefRename.
struct IAAFTypeDefRename : IUnknown {
    virtual HRESULT Initialize(aafUID_constref id, IAAFTypeDef* baseType,
                               aafCharacter_constptr typeName) = 0;  // 3
    virtual HRESULT GetBaseType(IAAFTypeDef** baseType) = 0;         // 4
    virtual HRESULT GetBaseValue(IAAFPropertyValue* inPropVal,
                                 IAAFPropertyValue** outPropVal) = 0;  // 5
    virtual HRESULT CreateValue(IAAFPropertyValue* inPropVal,
                                IAAFPropertyValue** outPropVal) = 0;  // 6

protected:
    ~IAAFTypeDefRename() = default;
};

inline constexpr GUID IID_IAAFTypeDefRename = ncfGuid("307E9E6A-DCB2-11D2-8429-00600832ACB8");
constexpr const GUID& aafIdOf(const IAAFTypeDefRename*) {
    return IID_IAAFTypeDefRename;
}

// Answered by AAFTypeDefExtEnum.
struct IAAFTypeDefExtEnum : IUnknown {
    virtual HRESULT Initialize(aafUID_constref id, aafCharacter_constptr typeName) = 0;  // 3
    virtual HRESULT CreateValueFromName(aafCharacter_constptr name,
                                        IAAFPropertyValue** propVal) = 0;      // 4
    virtual HRESULT CountElements(aafUInt32* count) = 0;                       // 5
    virtual HRESULT GetElementValue(aafUInt32 index, aafUID_t* outValue) = 0;  // 6
    virtual HRESULT GetElementName(aafUInt32 index, aafCharacter* outValue,
                                   aafUInt32 bufSize) = 0;                      // 7
    virtual HRESULT GetElementNameBufLen(aafUInt32 index, aafUInt32* len) = 0;  // 8
    virtual HRESULT GetNameFromValue(IAAFPropertyValue* value, aafCharacter* name,
                                     aafUInt32 bufSize) = 0;                               // 9
    virtual HRESULT GetNameBufLenFromValue(IAAFPropertyValue* value, aafUInt32* len) = 0;  // 10
    virtual HRESULT GetNameFromAUID(aafUID_constref value, aafCharacter* name,
                                    aafUInt32 bufSize) = 0;                              // 11
    virtual HRESULT GetNameBufLenFromAUID(aafUID_constref value, aafUInt32* len) = 0;    // 12
    virtual HRESULT GetAUIDValue(IAAFPropertyValue* propValIn, aafUID_t* valueOut) = 0;  // 13
    virtual HRESULT SetAUIDValue(IAAFPropertyValue* propValToSet,
                                 aafUID_constref valueIn) = 0;                             // 14
    virtual HRESULT AppendElement(aafUID_constref value, aafCharacter_constptr name) = 0;  // 15

protected:
    ~IAAFTypeDefExtEnum() = default;
};

inline constexpr GUID IID_IAAFTypeDefExtEnum = ncfGuid("A5456F01-0EF2-11D3-842E-00600832ACB8");
constexpr const GUID& aafIdOf(const IAAFTypeDefExtEnum*) {
    return IID_IAAFTypeDefExtEnum;
}

// Answered by AAFTypeDefIndirect.
struct IAAFTypeDefIndirect : IUnknown {
    virtual HRESULT CreateValueFromActualValue(IAAFPropertyValue* actualValue,
                                               IAAFPropertyValue** indirectPropertyValue) = 0;  // 3
    virtual HRESULT CreateValueFromActualData(IAAFTypeDef* actualType, aafMemPtr_t initData,
                                              aafUInt32 initDataSize,
                                              IAAFPropertyValue** indirectPropertyValue) = 0;  // 4
    virtual HRESULT GetActualValue(IAAFPropertyValue* indirectPropertyValue,
                                   IAAFPropertyValue** actualPropertyValue) = 0;  // 5
    virtual HRESULT GetActualSize(IAAFPropertyValue* indirectPropertyValue,
                                  aafUInt32* actualSize) = 0;  // 6
    virtual HRESULT GetActualType(IAAFPropertyValue* indirectPropertyValue,
                                  IAAFTypeDef** actualType) = 0;  // 7
    virtual HRESULT GetActualData(IAAFPropertyValue* propVal, aafMemPtr_t data,
                                  aafUInt32 dataSize) = 0;  // 8

protected:
    ~IAAFTypeDefIndirect() = default;
};

inline constexpr GUID IID_IAAFTypeDefIndirect = ncfGuid("FE717CA8-F04C-11D3-800B-00104BC9156D");
constexpr const GUID& aafIdOf(const IAAFTypeDefIndirect*) {
    return IID_IAAFTypeDefIndirect;
}

// Answered by AAFTypeDefOpaque.
struct IAAFTypeDefOpaque : IUnknown {
    virtual HRESULT GetActualTypeID(IAAFPropertyValue* opaquePropertyValue,
                                    aafUID_t* actualTypeID) = 0;  // 3
    virtual HRESULT GetHandle(IAAFPropertyValue* propVal, aafUInt32 handleSize,
                              aafDataBuffer_t handle, aafUInt32* bytesRead) = 0;      // 4
    virtual HRESULT GetHandleBufLen(IAAFPropertyValue* propVal, aafUInt32* len) = 0;  // 5
    virtual HRESULT SetHandle(IAAFPropertyValue* propVal, aafUInt32 handleSize,
                              aafDataBuffer_t handle) = 0;  // 6
    virtual HRESULT CreateValueFromHandle(aafMemPtr_t initData, aafUInt32 initDataSize,
                                          IAAFPropertyValue** opaquePropertyValue) = 0;  // 7

protected:
    ~IAAFTypeDefOpaque() = default;
};

inline constexpr GUID IID_IAAFTypeDefOpaque = ncfGuid("FE717CAC-F04C-11D3-800B-00104BC9156D");
constexpr const GUID& aafIdOf(const IAAFTypeDefOpaque*) {
    return IID_IAAFTypeDefOpaque;
}

// Answered by AAFTypeDefCharacter.
struct IAAFTypeDefCharacter : IUnknown {
    virtual HRESULT CreateValueFromCharacter(aafCharacter character,
                                             IAAFPropertyValue** characterValue) = 0;  // 3
    virtual HRESULT GetCharacter(IAAFPropertyValue* characterValue,
                                 aafCharacter* character) = 0;  // 4
    virtual HRESULT SetCharacter(IAAFPropertyValue* characterValue,
                                 aafCharacter character) = 0;  // 5

protected:
    ~IAAFTypeDefCharacter() = default;
};

inline constexpr GUID IID_IAAFTypeDefCharacter = ncfGuid("FE717CAA-F04C-11D3-800B-00104BC9156D");
constexpr const GUID& aafIdOf(const IAAFTypeDefCharacter*) {
    return IID_IAAFTypeDefCharacter;
}

// Answered by EnumAAFTypeDefs.
struct IEnumAAFTypeDefs : IUnknown {
    virtual HRESULT NextOne(IAAFTypeDef** typeDefs) = 0;                                       // 3
    virtual HRESULT Next(aafUInt32 count, IAAFTypeDef** typeDefs, aafUInt32* numFetched) = 0;  // 4
    virtual HRESULT Skip(aafUInt32 count) = 0;                                                 // 5
    virtual HRESULT Reset() = 0;                                                               // 6
    virtual HRESULT Clone(IEnumAAFTypeDefs** enumerator) = 0;                                  // 7

protected:
    ~IEnumAAFTypeDefs() = default;
};

inline constexpr GUID IID_IEnumAAFTypeDefs = ncfGuid("B1A2138C-1A7D-11D2-BF78-00104BC9156D");
constexpr const GUID& aafIdOf(const IEnumAAFTypeDefs*) {
    return IID_IEnumAAFTypeDefs;
}
