// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/model/TypeDefinition.h"
#include "not_implemented/AAFTypeDefinitions.h"

namespace aaf {

// A value that carries the type of what it holds.
class TypeIndirect : public Implements<TypeDefinition, IAAFTypeDefIndirect> {
public:
    explicit TypeIndirect(TypeKind kind = TypeKind::Indirect) : Implements(kind) {}

    // The stored form of an indirect value. A size that does not fit: AAFRESULT_ILLEGAL_VALUE.
    static HRESULT Wrap(const TypeDefinition& actual, const void* native, std::size_t bytes,
                        Bytes& out);

    // -- IAAFTypeDefIndirect
    HRESULT CreateValueFromActualValue(IAAFPropertyValue* actualValue,
                                       IAAFPropertyValue** indirectPropertyValue) override;
    HRESULT CreateValueFromActualData(IAAFTypeDef* actualType, aafMemPtr_t initData,
                                      aafUInt32 initDataSize,
                                      IAAFPropertyValue** indirectPropertyValue) override;
    HRESULT GetActualValue(IAAFPropertyValue* indirectPropertyValue,
                           IAAFPropertyValue** actualPropertyValue) override;
    HRESULT GetActualSize(IAAFPropertyValue* indirectPropertyValue, aafUInt32* actualSize) override;
    HRESULT GetActualType(IAAFPropertyValue* indirectPropertyValue,
                          IAAFTypeDef** actualType) override;
    HRESULT GetActualData(IAAFPropertyValue* propVal, aafMemPtr_t data,
                          aafUInt32 dataSize) override;

protected:
    bool NeedsNameOnly() const override { return true; }

private:
    // The value and its type; AAFRESULT_ILLEGAL_VALUE while it holds nothing.
    HRESULT Open(IAAFPropertyValue* argument, PropertyValue** value, TypeDefinition** actual) const;
};

// An indirect value that may be kept without knowing its type.
class TypeOpaque : public Implements<TypeIndirect, IAAFTypeDefOpaque> {
public:
    TypeOpaque() : Implements(TypeKind::Opaque) {}

    // -- IAAFTypeDefOpaque
    HRESULT GetActualTypeID(IAAFPropertyValue* opaquePropertyValue,
                            aafUID_t* actualTypeID) override;
    HRESULT GetHandle(IAAFPropertyValue* propVal, aafUInt32 handleSize, aafDataBuffer_t handle,
                      aafUInt32* bytesRead) override;
    HRESULT GetHandleBufLen(IAAFPropertyValue* propVal, aafUInt32* len) override;
    HRESULT SetHandle(IAAFPropertyValue* propVal, aafUInt32 handleSize,
                      aafDataBuffer_t handle) override;
    HRESULT CreateValueFromHandle(aafMemPtr_t initData, aafUInt32 initDataSize,
                                  IAAFPropertyValue** opaquePropertyValue) override;
};

// The parts of the stored form of an indirect value; false when it is too short.
bool ReadIndirectHead(const Bytes& bytes, GUID* typeId);

}  // namespace aaf
