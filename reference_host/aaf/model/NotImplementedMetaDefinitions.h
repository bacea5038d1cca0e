// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/aaf/AAFMetaDefinitions.h"
#include "host_interfaces/aaf/AAFResultCodes.h"
#include "reference_host/aaf/model/NotImplemented.h"

// Bodies for operations that a class leaves out; see NotImplemented.h.
namespace aaf {

template <>
class NotImplemented<IAAFClassDef> : public IAAFClassDef {
public:
    HRESULT Initialize(aafUID_constref, IAAFClassDef*, aafCharacter_constptr,
                       aafBoolean_t) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetPropertyDefs(IEnumAAFPropertyDefs**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT CountPropertyDefs(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT RegisterNewPropertyDef(aafUID_constref, aafCharacter_constptr, IAAFTypeDef*,
                                   aafBoolean_t, aafBoolean_t, IAAFPropertyDef**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT RegisterOptionalPropertyDef(aafUID_constref, aafCharacter_constptr, IAAFTypeDef*,
                                        IAAFPropertyDef**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT LookupPropertyDef(aafUID_constref, IAAFPropertyDef**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetName(aafCharacter*, aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetNameBufLen(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetParent(IAAFClassDef**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT IsConcrete(aafBoolean_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT IsRoot(aafBoolean_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT IsUniquelyIdentified(aafBoolean_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetUniqueIdentifier(IAAFPropertyDef**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT CreateInstance(REFIID, IUnknown**) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFMetaDefinition> : public IAAFMetaDefinition {
public:
    HRESULT Initialize(aafUID_constref, aafCharacter_constptr, aafCharacter_constptr) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetAUID(aafUID_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetName(aafCharacter_constptr) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetName(aafCharacter*, aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetNameBufLen(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetDescription(aafCharacter_constptr) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetDescription(aafCharacter*, aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetDescriptionBufLen(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFPropertyDef> : public IAAFPropertyDef {
public:
    HRESULT GetTypeDef(IAAFTypeDef**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetName(aafCharacter*, aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetNameBufLen(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetIsOptional(aafBoolean_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetIsUniqueIdentifier(aafBoolean_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetDescription(aafCharacter_constptr) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetDescription(aafCharacter*, aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetDescriptionBufLen(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFTypeDef> : public IAAFTypeDef {
public:
    HRESULT GetTypeCategory(eAAFTypeCategory_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT RawAccessType(IAAFTypeDef**) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFTypeDefInt> : public IAAFTypeDefInt {
public:
    HRESULT Initialize(aafUID_constref, aafUInt8, aafBoolean_t, aafCharacter_constptr) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT CreateValue(aafMemPtr_t, aafUInt32, IAAFPropertyValue**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetInteger(IAAFPropertyValue*, aafMemPtr_t, aafUInt32) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT SetInteger(IAAFPropertyValue*, aafMemPtr_t, aafUInt32) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetSize(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT IsSigned(aafBoolean_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFTypeDefRecord> : public IAAFTypeDefRecord {
public:
    HRESULT Initialize(aafUID_constref, IAAFTypeDef**, aafString_t*, aafUInt32,
                       aafCharacter_constptr) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetMemberType(aafUInt32, IAAFTypeDef**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetMemberName(aafUInt32, aafCharacter*, aafUInt32) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetMemberNameBufLen(aafUInt32, aafUInt32*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT CreateValueFromValues(IAAFPropertyValue**, aafUInt32, IAAFPropertyValue**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT CreateValueFromStruct(aafMemPtr_t, aafUInt32, IAAFPropertyValue**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetValue(IAAFPropertyValue*, aafUInt32, IAAFPropertyValue**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetStruct(IAAFPropertyValue*, aafMemPtr_t, aafUInt32) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT SetValue(IAAFPropertyValue*, aafUInt32, IAAFPropertyValue*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT SetStruct(IAAFPropertyValue*, aafMemPtr_t, aafUInt32) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetCount(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT RegisterMembers(aafUInt32*, aafUInt32, aafUInt32) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFTypeDefVariableArray> : public IAAFTypeDefVariableArray {
public:
    HRESULT Initialize(aafUID_constref, IAAFTypeDef*, aafCharacter_constptr) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetType(IAAFTypeDef**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetCount(IAAFPropertyValue*, aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT AppendElement(IAAFPropertyValue*, IAAFPropertyValue*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT CreateEmptyValue(IAAFPropertyValue**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT CreateValueFromValues(IAAFPropertyValue**, aafUInt32, IAAFPropertyValue**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT CreateValueFromCArray(aafMemPtr_t, aafUInt32, IAAFPropertyValue**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetElementValue(IAAFPropertyValue*, aafUInt32, IAAFPropertyValue**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetCArray(IAAFPropertyValue*, aafMemPtr_t, aafUInt32) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT SetElementValue(IAAFPropertyValue*, aafUInt32, IAAFPropertyValue*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT SetCArray(IAAFPropertyValue*, aafMemPtr_t, aafUInt32) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetElements(IAAFPropertyValue*, IEnumAAFPropertyValues**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFTypeDefVariableArrayEx> : public IAAFTypeDefVariableArrayEx {
public:
    HRESULT PrependElement(IAAFPropertyValue*, IAAFPropertyValue*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT RemoveElement(IAAFPropertyValue*, aafUInt32) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT InsertElement(IAAFPropertyValue*, aafUInt32, IAAFPropertyValue*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFTypeDefObjectRef> : public IAAFTypeDefObjectRef {
public:
    HRESULT GetObjectType(IAAFClassDef**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT CreateValue(IUnknown*, IAAFPropertyValue**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetObject(IAAFPropertyValue*, REFIID, IUnknown**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT SetObject(IAAFPropertyValue*, IUnknown*) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFTypeDefString> : public IAAFTypeDefString {
public:
    HRESULT Initialize(aafUID_constref, IAAFTypeDef*, aafCharacter_constptr) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetType(IAAFTypeDef**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetCount(IAAFPropertyValue*, aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT CreateValueFromCString(aafMemPtr_t, aafUInt32, IAAFPropertyValue**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT SetCString(IAAFPropertyValue*, aafMemPtr_t, aafUInt32) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT AppendElements(IAAFPropertyValue*, aafMemPtr_t) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetElements(IAAFPropertyValue*, aafMemPtr_t, aafUInt32) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFTypeDefEnum> : public IAAFTypeDefEnum {
public:
    HRESULT Initialize(aafUID_constref, IAAFTypeDef*, aafInt64*, aafString_t*, aafUInt32,
                       aafCharacter_constptr) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT CreateValueFromName(aafCharacter_constptr, IAAFPropertyValue**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetElementType(IAAFTypeDef**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetElementValue(aafUInt32, aafInt64*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetElementName(aafUInt32, aafCharacter*, aafUInt32) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetElementNameBufLen(aafUInt32, aafUInt32*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT CountElements(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetNameFromValue(IAAFPropertyValue*, aafCharacter*, aafUInt32) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetNameBufLenFromValue(IAAFPropertyValue*, aafUInt32*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetNameFromInteger(aafInt64, aafCharacter*, aafUInt32) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetNameBufLenFromInteger(aafInt64, aafUInt32*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetIntegerValue(IAAFPropertyValue*, aafInt64*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT SetIntegerValue(IAAFPropertyValue*, aafInt64) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT RegisterSize(aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFTypeDefFixedArray> : public IAAFTypeDefFixedArray {
public:
    HRESULT Initialize(aafUID_constref, IAAFTypeDef*, aafUInt32, aafCharacter_constptr) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetType(IAAFTypeDef**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetCount(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT CreateValueFromValues(IAAFPropertyValue**, aafUInt32, IAAFPropertyValue**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT CreateValueFromCArray(aafMemPtr_t, aafUInt32, IAAFPropertyValue**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetElementValue(IAAFPropertyValue*, aafUInt32, IAAFPropertyValue**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetCArray(IAAFPropertyValue*, aafMemPtr_t, aafUInt32) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT SetElementValue(IAAFPropertyValue*, aafUInt32, IAAFPropertyValue*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT SetCArray(IAAFPropertyValue*, aafMemPtr_t, aafUInt32) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetElements(IAAFPropertyValue*, IEnumAAFPropertyValues**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFTypeDefSet> : public IAAFTypeDefSet {
public:
    HRESULT Initialize(aafUID_constref, IAAFTypeDef*, aafCharacter_constptr) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetElementType(IAAFTypeDef**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT AddElement(IAAFPropertyValue*, IAAFPropertyValue*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT RemoveElement(IAAFPropertyValue*, IAAFPropertyValue*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT ContainsElement(IAAFPropertyValue*, IAAFPropertyValue*, aafBoolean_t*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetCount(IAAFPropertyValue*, aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT CreateKey(aafDataBuffer_t, aafUInt32, IAAFPropertyValue**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT LookupElement(IAAFPropertyValue*, IAAFPropertyValue*, IAAFPropertyValue**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT ContainsKey(IAAFPropertyValue*, IAAFPropertyValue*, aafBoolean_t*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetElements(IAAFPropertyValue*, IEnumAAFPropertyValues**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFTypeDefStrongObjRef> : public IAAFTypeDefStrongObjRef {
public:
    HRESULT Initialize(aafUID_constref, IAAFClassDef*, aafCharacter_constptr) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFTypeDefWeakObjRef> : public IAAFTypeDefWeakObjRef {
public:
    HRESULT Initialize(aafUID_constref, IAAFClassDef*, aafCharacter_constptr, aafUInt32,
                       aafUID_constptr) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFTypeDefRename> : public IAAFTypeDefRename {
public:
    HRESULT Initialize(aafUID_constref, IAAFTypeDef*, aafCharacter_constptr) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetBaseType(IAAFTypeDef**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetBaseValue(IAAFPropertyValue*, IAAFPropertyValue**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT CreateValue(IAAFPropertyValue*, IAAFPropertyValue**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFTypeDefExtEnum> : public IAAFTypeDefExtEnum {
public:
    HRESULT Initialize(aafUID_constref, aafCharacter_constptr) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT CreateValueFromName(aafCharacter_constptr, IAAFPropertyValue**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT CountElements(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetElementValue(aafUInt32, aafUID_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetElementName(aafUInt32, aafCharacter*, aafUInt32) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetElementNameBufLen(aafUInt32, aafUInt32*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetNameFromValue(IAAFPropertyValue*, aafCharacter*, aafUInt32) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetNameBufLenFromValue(IAAFPropertyValue*, aafUInt32*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetNameFromAUID(aafUID_constref, aafCharacter*, aafUInt32) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetNameBufLenFromAUID(aafUID_constref, aafUInt32*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetAUIDValue(IAAFPropertyValue*, aafUID_t*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT SetAUIDValue(IAAFPropertyValue*, aafUID_constref) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT AppendElement(aafUID_constref, aafCharacter_constptr) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFTypeDefIndirect> : public IAAFTypeDefIndirect {
public:
    HRESULT CreateValueFromActualValue(IAAFPropertyValue*, IAAFPropertyValue**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT CreateValueFromActualData(IAAFTypeDef*, aafMemPtr_t, aafUInt32,
                                      IAAFPropertyValue**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetActualValue(IAAFPropertyValue*, IAAFPropertyValue**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetActualSize(IAAFPropertyValue*, aafUInt32*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetActualType(IAAFPropertyValue*, IAAFTypeDef**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetActualData(IAAFPropertyValue*, aafMemPtr_t, aafUInt32) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFTypeDefOpaque> : public IAAFTypeDefOpaque {
public:
    HRESULT GetActualTypeID(IAAFPropertyValue*, aafUID_t*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetHandle(IAAFPropertyValue*, aafUInt32, aafDataBuffer_t, aafUInt32*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetHandleBufLen(IAAFPropertyValue*, aafUInt32*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT SetHandle(IAAFPropertyValue*, aafUInt32, aafDataBuffer_t) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT CreateValueFromHandle(aafMemPtr_t, aafUInt32, IAAFPropertyValue**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFTypeDefCharacter> : public IAAFTypeDefCharacter {
public:
    HRESULT CreateValueFromCharacter(aafCharacter, IAAFPropertyValue**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetCharacter(IAAFPropertyValue*, aafCharacter*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT SetCharacter(IAAFPropertyValue*, aafCharacter) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFTypeDefStream> : public IAAFTypeDefStream {
public:
    HRESULT GetSize(IAAFPropertyValue*, aafInt64*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetSize(IAAFPropertyValue*, aafInt64) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetPosition(IAAFPropertyValue*, aafInt64*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT SetPosition(IAAFPropertyValue*, aafInt64) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Read(IAAFPropertyValue*, aafUInt32, aafMemPtr_t, aafUInt32*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT Write(IAAFPropertyValue*, aafUInt32, aafMemPtr_t) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT Append(IAAFPropertyValue*, aafUInt32, aafMemPtr_t) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT HasStoredByteOrder(IAAFPropertyValue*, aafBoolean_t*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetStoredByteOrder(IAAFPropertyValue*, eAAFByteOrder_t*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT SetStoredByteOrder(IAAFPropertyValue*, eAAFByteOrder_t) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT ClearStoredByteOrder(IAAFPropertyValue*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT ReadElements(IAAFPropertyValue*, IAAFTypeDef*, aafUInt32, aafMemPtr_t,
                         aafUInt32*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT WriteElements(IAAFPropertyValue*, IAAFTypeDef*, aafUInt32, aafMemPtr_t) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT AppendElements(IAAFPropertyValue*, IAAFTypeDef*, aafUInt32, aafMemPtr_t) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFTypeDefStreamEx> : public IAAFTypeDefStreamEx {
public:
    HRESULT SetCallback(IAAFPropertyValue*, IAAFStreamAccess*, aafMemPtr_t) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFTypeDefStream3> : public IAAFTypeDefStream3 {
public:
    HRESULT GetSize(IAAFPropertyValue*, aafInt64*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetSize(IAAFPropertyValue*, aafInt64) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetPosition(IAAFPropertyValue*, aafInt64*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT SetPosition(IAAFPropertyValue*, aafInt64) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Read(IAAFPropertyValue*, aafUInt32, aafMemPtr_t, aafUInt32*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT Write(IAAFPropertyValue*, aafUInt32, aafMemPtr_t) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT Append(IAAFPropertyValue*, aafUInt32, aafMemPtr_t) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT HasStoredByteOrder(IAAFPropertyValue*, aafBoolean_t*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetStoredByteOrder(IAAFPropertyValue*, eAAFByteOrder_t*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT SetStoredByteOrder(IAAFPropertyValue*, eAAFByteOrder_t) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT ClearStoredByteOrder(IAAFPropertyValue*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT ReadElements(IAAFPropertyValue*, IAAFTypeDef*, aafUInt32, aafMemPtr_t,
                         aafUInt32*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT WriteElements(IAAFPropertyValue*, IAAFTypeDef*, aafUInt32, aafMemPtr_t) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT AppendElements(IAAFPropertyValue*, IAAFTypeDef*, aafUInt32, aafMemPtr_t) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT SetCallback(IAAFPropertyValue*, IAAFStreamAccess*, aafMemPtr_t) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetPlainStreamData(aafUInt32, IAAFPlainStreamData**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IEnumAAFPropertyDefs> : public IEnumAAFPropertyDefs {
public:
    HRESULT NextOne(IAAFPropertyDef**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Next(aafUInt32, IAAFPropertyDef**, aafUInt32*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT Skip(aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Reset() override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Clone(IEnumAAFPropertyDefs**) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IEnumAAFClassDefs> : public IEnumAAFClassDefs {
public:
    HRESULT NextOne(IAAFClassDef**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Next(aafUInt32, IAAFClassDef**, aafUInt32*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT Skip(aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Reset() override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Clone(IEnumAAFClassDefs**) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IEnumAAFTypeDefs> : public IEnumAAFTypeDefs {
public:
    HRESULT NextOne(IAAFTypeDef**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Next(aafUInt32, IAAFTypeDef**, aafUInt32*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT Skip(aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Reset() override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Clone(IEnumAAFTypeDefs**) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

}  // namespace aaf
