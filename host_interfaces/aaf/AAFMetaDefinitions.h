// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/aaf/AAFUnknown.h"

// Classes, properties and types: the model that every file carries.

struct IAAFClassDef;
struct IAAFPlainStreamData;
struct IAAFPropertyDef;
struct IAAFPropertyValue;
struct IAAFStreamAccess;
struct IAAFTypeDef;
struct IEnumAAFClassDefs;
struct IEnumAAFPropertyDefs;
struct IEnumAAFPropertyValues;
struct IEnumAAFTypeDefs;

// Answered by AAFClassDef.
struct IAAFClassDef : IUnknown {
    virtual HRESULT Initialize(aafUID_constref classID, IAAFClassDef* parentClass,
                               aafCharacter_constptr className,
                               aafBoolean_t isConcrete) = 0;                 // 3
    virtual HRESULT GetPropertyDefs(IEnumAAFPropertyDefs** enumerator) = 0;  // 4
    virtual HRESULT CountPropertyDefs(aafUInt32* count) = 0;                 // 5
    virtual HRESULT RegisterNewPropertyDef(aafUID_constref id, aafCharacter_constptr name,
                                           IAAFTypeDef* typeDef, aafBoolean_t isOptional,
                                           aafBoolean_t isUniqueIdentifier,
                                           IAAFPropertyDef** propDef) = 0;  // 6
    virtual HRESULT RegisterOptionalPropertyDef(aafUID_constref id, aafCharacter_constptr name,
                                                IAAFTypeDef* typeDef,
                                                IAAFPropertyDef** propDef) = 0;                // 7
    virtual HRESULT LookupPropertyDef(aafUID_constref propID, IAAFPropertyDef** propDef) = 0;  // 8
    virtual HRESULT GetName(aafCharacter* name, aafUInt32 bufSize) = 0;                        // 9
    virtual HRESULT GetNameBufLen(aafUInt32* bufSize) = 0;                                     // 10
    virtual HRESULT GetParent(IAAFClassDef** classDef) = 0;                                    // 11
    virtual HRESULT IsConcrete(aafBoolean_t* result) = 0;                                      // 12
    virtual HRESULT IsRoot(aafBoolean_t* isRoot) = 0;                                          // 13
    virtual HRESULT IsUniquelyIdentified(aafBoolean_t* isUniquelyIdentified) = 0;              // 14
    virtual HRESULT GetUniqueIdentifier(IAAFPropertyDef** uniqueIdentifier) = 0;               // 15
    virtual HRESULT CreateInstance(REFIID riid, IUnknown** object) = 0;                        // 16

protected:
    ~IAAFClassDef() = default;
};

inline constexpr GUID IID_IAAFClassDef = ncfGuid("DFBD6525-1D81-11D2-BF96-006097116212");
constexpr const GUID& aafIdOf(const IAAFClassDef*) {
    return IID_IAAFClassDef;
}

// Answered by AAFMetaDefinition.
struct IAAFMetaDefinition : IUnknown {
    virtual HRESULT Initialize(aafUID_constref id, aafCharacter_constptr name,
                               aafCharacter_constptr description) = 0;                 // 3
    virtual HRESULT GetAUID(aafUID_t* auid) = 0;                                       // 4
    virtual HRESULT SetName(aafCharacter_constptr name) = 0;                           // 5
    virtual HRESULT GetName(aafCharacter* name, aafUInt32 bufSize) = 0;                // 6
    virtual HRESULT GetNameBufLen(aafUInt32* bufSize) = 0;                             // 7
    virtual HRESULT SetDescription(aafCharacter_constptr description) = 0;             // 8
    virtual HRESULT GetDescription(aafCharacter* description, aafUInt32 bufSize) = 0;  // 9
    virtual HRESULT GetDescriptionBufLen(aafUInt32* bufSize) = 0;                      // 10

protected:
    ~IAAFMetaDefinition() = default;
};

inline constexpr GUID IID_IAAFMetaDefinition = ncfGuid("CEE32174-0C10-11D4-8014-00104BC9156D");
constexpr const GUID& aafIdOf(const IAAFMetaDefinition*) {
    return IID_IAAFMetaDefinition;
}

// Answered by AAFPropertyDef.
struct IAAFPropertyDef : IUnknown {
    virtual HRESULT GetTypeDef(IAAFTypeDef** typeDef) = 0;                             // 3
    virtual HRESULT GetName(aafCharacter* name, aafUInt32 bufSize) = 0;                // 4
    virtual HRESULT GetNameBufLen(aafUInt32* bufSize) = 0;                             // 5
    virtual HRESULT GetIsOptional(aafBoolean_t* isOptional) = 0;                       // 6
    virtual HRESULT GetIsUniqueIdentifier(aafBoolean_t* isUniqueIdentifier) = 0;       // 7
    virtual HRESULT SetDescription(aafCharacter_constptr description) = 0;             // 8
    virtual HRESULT GetDescription(aafCharacter* description, aafUInt32 bufSize) = 0;  // 9
    virtual HRESULT GetDescriptionBufLen(aafUInt32* bufSize) = 0;                      // 10

protected:
    ~IAAFPropertyDef() = default;
};

inline constexpr GUID IID_IAAFPropertyDef = ncfGuid("DFBD6521-1D81-11D2-BF96-006097116212");
constexpr const GUID& aafIdOf(const IAAFPropertyDef*) {
    return IID_IAAFPropertyDef;
}

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

// Answered by EnumAAFPropertyDefs.
struct IEnumAAFPropertyDefs : IUnknown {
    virtual HRESULT NextOne(IAAFPropertyDef** propertyDefs) = 0;  // 3
    virtual HRESULT Next(aafUInt32 count, IAAFPropertyDef** propertyDefs,
                         aafUInt32* numFetched) = 0;               // 4
    virtual HRESULT Skip(aafUInt32 count) = 0;                     // 5
    virtual HRESULT Reset() = 0;                                   // 6
    virtual HRESULT Clone(IEnumAAFPropertyDefs** enumerator) = 0;  // 7

protected:
    ~IEnumAAFPropertyDefs() = default;
};

inline constexpr GUID IID_IEnumAAFPropertyDefs = ncfGuid("245343C1-2D59-11D2-BF80-00104BC9156D");
constexpr const GUID& aafIdOf(const IEnumAAFPropertyDefs*) {
    return IID_IEnumAAFPropertyDefs;
}

// Answered by EnumAAFClassDefs.
struct IEnumAAFClassDefs : IUnknown {
    virtual HRESULT NextOne(IAAFClassDef** classDefs) = 0;  // 3
    virtual HRESULT Next(aafUInt32 count, IAAFClassDef** classDefs,
                         aafUInt32* numFetched) = 0;            // 4
    virtual HRESULT Skip(aafUInt32 count) = 0;                  // 5
    virtual HRESULT Reset() = 0;                                // 6
    virtual HRESULT Clone(IEnumAAFClassDefs** enumerator) = 0;  // 7

protected:
    ~IEnumAAFClassDefs() = default;
};

inline constexpr GUID IID_IEnumAAFClassDefs = ncfGuid("B1A2138E-1A7D-11D2-BF78-00104BC9156D");
constexpr const GUID& aafIdOf(const IEnumAAFClassDefs*) {
    return IID_IEnumAAFClassDefs;
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
