// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/model/TypeArray.h"

namespace aaf {

// A fixed number of plain elements.
class TypeFixedArray : public TypeArray<IAAFTypeDefFixedArray> {
public:
    TypeFixedArray() : TypeArray(TypeKind::FixedArray) {}

    HRESULT Setup(const GUID& id, const std::wstring& name, TypeDefinition& element,
                  std::size_t count);
    std::size_t count() const { return count_; }

    std::size_t StoredSize() const override;
    std::size_t NativeSize() const override;
    void AppendStored(const std::uint8_t* native, Bytes& out) const override;
    void CopyNative(const std::uint8_t* stored, std::uint8_t* native) const override;
    HRESULT Encode(const void* native, std::size_t bytes, Bytes& out) const override;

    // -- IAAFTypeDefFixedArray
    HRESULT Initialize(aafUID_constref id, IAAFTypeDef* typeDef, aafUInt32 nElements,
                       aafCharacter_constptr typeName) override;
    HRESULT GetCount(aafUInt32* count) override;

protected:
    bool MayHold(std::size_t elements) const override { return elements == count_; }

private:
    std::size_t count_ = 0;
};

}  // namespace aaf
