// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/model/TypeDefinition.h"
#include "not_implemented/AAFTypeDefinitionsOfMany.h"

namespace aaf {

// Bulk data, read and written piece by piece.
class TypeStream : public Implements<TypeDefinition, IAAFTypeDefStream, IAAFTypeDefStreamEx,
                                     IAAFTypeDefStream3> {
public:
    TypeStream() : Implements(TypeKind::Stream) {}

    ValueForm form() const override { return ValueForm::Stream; }

    // -- IAAFTypeDefStream, IAAFTypeDefStream3
    HRESULT GetSize(IAAFPropertyValue* streamPropertyValue, aafInt64* size) override;
    HRESULT SetSize(IAAFPropertyValue* streamPropertyValue, aafInt64 newSize) override;
    HRESULT GetPosition(IAAFPropertyValue* streamPropertyValue, aafInt64* position) override;
    HRESULT SetPosition(IAAFPropertyValue* streamPropertyValue, aafInt64 newPosition) override;
    HRESULT Read(IAAFPropertyValue* streamPropertyValue, aafUInt32 dataSize, aafMemPtr_t data,
                 aafUInt32* bytesRead) override;
    HRESULT Write(IAAFPropertyValue* streamPropertyValue, aafUInt32 dataSize,
                  aafMemPtr_t data) override;
    HRESULT Append(IAAFPropertyValue* streamPropertyValue, aafUInt32 dataSize,
                   aafMemPtr_t data) override;
    HRESULT HasStoredByteOrder(IAAFPropertyValue* streamPropertyValue,
                               aafBoolean_t* hasByteOrder) override;
    HRESULT GetStoredByteOrder(IAAFPropertyValue* streamPropertyValue,
                               eAAFByteOrder_t* byteOrder) override;
    HRESULT SetStoredByteOrder(IAAFPropertyValue* streamPropertyValue,
                               eAAFByteOrder_t byteOrder) override;
    HRESULT ClearStoredByteOrder(IAAFPropertyValue* streamPropertyValue) override;
    // Whole elements of a fixed size, in their native layout. A stream in big-endian order is left
    // to Read and Write (AAFRESULT_INVALID_BYTEORDER).
    HRESULT ReadElements(IAAFPropertyValue* streamPropertyValue, IAAFTypeDef* elementType,
                         aafUInt32 dataSize, aafMemPtr_t data, aafUInt32* bytesRead) override;
    HRESULT WriteElements(IAAFPropertyValue* streamPropertyValue, IAAFTypeDef* elementType,
                          aafUInt32 dataSize, aafMemPtr_t data) override;
    HRESULT AppendElements(IAAFPropertyValue* streamPropertyValue, IAAFTypeDef* elementType,
                           aafUInt32 dataSize, aafMemPtr_t data) override;

protected:
    bool NeedsNameOnly() const override { return true; }

private:
    // The element's type, when that many bytes of a caller are whole elements of it.
    HRESULT TakeElements(IAAFPropertyValue* argument, IAAFTypeDef* elementType, aafUInt32 dataSize,
                         PropertyValue** value, const TypeDefinition** element) const;
    // The same bytes as a stream has them.
    HRESULT StoreElements(IAAFPropertyValue* argument, IAAFTypeDef* elementType, aafUInt32 dataSize,
                          const aafUInt8* data, Bytes* stored) const;
};

}  // namespace aaf
