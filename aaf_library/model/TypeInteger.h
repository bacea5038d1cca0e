// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/model/TypeDefinition.h"
#include "not_implemented/AAFTypeDefinitions.h"

namespace aaf {

// Signed and unsigned integers of 1, 2, 4 and 8 bytes.
class TypeInteger : public Implements<TypeDefinition, IAAFTypeDefInt> {
public:
    TypeInteger() : Implements(TypeKind::Integer) {}

    HRESULT Setup(const GUID& id, const std::wstring& name, unsigned size, bool isSigned);
    bool IsSignedType() const { return signed_; }

    std::size_t StoredSize() const override { return size_; }
    std::size_t NativeSize() const override { return size_; }
    bool IsStoredAsNative() const override { return size_ == 1 || kIsStoredOrder; }
    void AppendStored(const std::uint8_t* native, Bytes& out) const override;
    void CopyNative(const std::uint8_t* stored, std::uint8_t* native) const override;

    // -- IAAFTypeDefInt
    HRESULT Initialize(aafUID_constref id, aafUInt8 intSize, aafBoolean_t isSigned,
                       aafCharacter_constptr typeName) override;
    HRESULT CreateValue(aafMemPtr_t val, aafUInt32 valSize, IAAFPropertyValue** propVal) override;
    HRESULT GetInteger(IAAFPropertyValue* propVal, aafMemPtr_t val, aafUInt32 valSize) override;
    HRESULT SetInteger(IAAFPropertyValue* propVal, aafMemPtr_t val, aafUInt32 valSize) override;
    HRESULT GetSize(aafUInt32* size) override;
    HRESULT IsSigned(aafBoolean_t* isSigned) override;

private:
    // The caller's integer in this type's size, its sign extended.
    HRESULT Widen(const std::uint8_t* native, aafUInt32 bytes, Bytes& out) const;

    // Stored numbers begin with their lowest byte.
    static constexpr bool kIsStoredOrder = __BYTE_ORDER__ == __ORDER_LITTLE_ENDIAN__;

    unsigned size_ = 0;
    bool signed_ = false;
};

// Numbers in the caller's memory, whatever the machine's byte order.
std::uint64_t NativeUnsigned(const std::uint8_t* native, std::size_t size);
aafInt64 NativeSigned(const std::uint8_t* native, std::size_t size);
void PutNativeNumber(std::uint64_t value, std::uint8_t* native, std::size_t size);

}  // namespace aaf
