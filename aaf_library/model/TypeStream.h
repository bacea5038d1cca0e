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

protected:
    bool NeedsNameOnly() const override { return true; }
};

}  // namespace aaf
