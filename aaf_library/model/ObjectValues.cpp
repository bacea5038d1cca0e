// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/model/ClassDefinition.h"
#include "aaf_library/model/Model.h"
#include "aaf_library/model/Object.h"
#include "aaf_library/model/StoredNumbers.h"
#include "aaf_library/model/Text.h"
#include "aaf_library/model/TypeIndirect.h"
#include "aaf_library/model/TypeInteger.h"

// Typed access to plain values.
namespace aaf {

namespace {

// Integers are signed or not by their own type; enumerations by that of their elements.
bool IsSignedValue(const TypeDefinition& type) {
    const TypeDefinition& plain = type.Resolved();
    const TypeDefinition& number =
        plain.kind() == TypeKind::Enumeration ? plain.element()->Resolved() : plain;
    return number.kind() == TypeKind::Integer &&
           static_cast<const TypeInteger&>(number).IsSignedType();
}

}  // namespace

HRESULT Object::PutInteger(const PropertyKey& key, aafInt64 value) {
    PropertyValue* stored = RequireValue(key);
    if (stored == nullptr) {
        return AAFRESULT_BAD_PROP;
    }
    const std::size_t size = stored->type().StoredSize();
    stored->BytesToChange().clear();
    AppendNumber(static_cast<std::uint64_t>(value), size, stored->BytesToChange());
    return AAFRESULT_SUCCESS;
}

HRESULT Object::ReadInteger64(const PropertyKey& key, aafInt64* out) const {
    const PropertyValue* value = FindValue(key);
    if (value == nullptr) {
        return AAFRESULT_PROP_NOT_PRESENT;
    }
    const Bytes& bytes = value->bytes();
    if (bytes.empty() || bytes.size() > sizeof *out) {
        return AAFRESULT_BAD_SIZE;
    }
    *out = IsSignedValue(value->type())
               ? SignedAt(bytes.data(), bytes.size())
               : static_cast<aafInt64>(UnsignedAt(bytes.data(), bytes.size()));
    return AAFRESULT_SUCCESS;
}

aafInt64 Object::IntegerOr(const PropertyKey& key, aafInt64 absent) const {
    aafInt64 value = absent;
    return ReadInteger64(key, &value) >= 0 ? value : absent;
}

HRESULT Object::PutString(const PropertyKey& key, aafCharacter_constptr text) {
    if (text == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    Bytes bytes = StoredText(text);
    // The stored form counts a value's bytes with sixteen bits.
    if (bytes.size() > 0xFFFF) {
        return AAFRESULT_BAD_SIZE;
    }
    return PutBytes(key, std::move(bytes)) == nullptr ? AAFRESULT_BAD_PROP : AAFRESULT_SUCCESS;
}

HRESULT Object::ReadString(const PropertyKey& key, aafCharacter* buffer,
                           aafUInt32 bufferBytes) const {
    if (buffer == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    const PropertyValue* value = FindValue(key);
    return value == nullptr ? AAFRESULT_PROP_NOT_PRESENT
                            : CopyText(TextOfStored(value->bytes()), buffer, bufferBytes);
}

HRESULT Object::ReadStringLength(const PropertyKey& key, aafUInt32* bytes) const {
    if (bytes == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    const PropertyValue* value = FindValue(key);
    return value == nullptr ? AAFRESULT_PROP_NOT_PRESENT
                            : TextSize(TextOfStored(value->bytes()), bytes);
}

std::wstring Object::StringOr(const PropertyKey& key, const wchar_t* absent) const {
    const PropertyValue* value = FindValue(key);
    return value == nullptr ? std::wstring(absent) : TextOfStored(value->bytes());
}

HRESULT Object::PutNative(const PropertyKey& key, const void* data, std::size_t bytes) {
    if (data == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    const PropertyDefinition* const property = DefinitionOf(key);
    if (property == nullptr) {
        return AAFRESULT_BAD_PROP;
    }
    Bytes stored;
    const HRESULT result = property->type()->Encode(data, bytes, stored);
    if (result >= 0) {
        PutBytes(key, std::move(stored));
    }
    return result;
}

HRESULT Object::ReadNative(const PropertyKey& key, void* data, std::size_t bytes) const {
    if (data == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    const PropertyValue* value = FindValue(key);
    return value == nullptr
               ? AAFRESULT_PROP_NOT_PRESENT
               : value->type().Decode(value->bytes().data(), value->bytes().size(), data, bytes);
}

HRESULT Object::ReadNativeSize(const PropertyKey& key, aafUInt32* bytes) const {
    if (bytes == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    const PropertyValue* value = FindValue(key);
    if (value == nullptr) {
        return AAFRESULT_PROP_NOT_PRESENT;
    }
    *bytes = static_cast<aafUInt32>(
        value->type().DecodedSize(value->bytes().data(), value->bytes().size()));
    return AAFRESULT_SUCCESS;
}

HRESULT Object::PutIndirect(const PropertyKey& key, IAAFTypeDef* type, const void* data,
                            std::size_t bytes) {
    if (type == nullptr || data == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    TypeDefinition* actual = TypeOf(type, model());
    if (actual == nullptr) {
        return AAFRESULT_BAD_TYPE;
    }
    Bytes stored;
    const HRESULT result = TypeIndirect::Wrap(*actual, data, bytes, stored);
    if (result < 0) {
        return result;
    }
    PropertyValue* value = RequireValue(key);
    if (value == nullptr) {
        return AAFRESULT_BAD_PROP;
    }
    value->BytesToChange() = std::move(stored);
    return AAFRESULT_SUCCESS;
}

TypeDefinition* Object::IndirectType(const PropertyValue* value) const {
    GUID id{};
    return value != nullptr && ReadIndirectHead(value->bytes(), &id) ? model()->FindType(id)
                                                                     : nullptr;
}

HRESULT Object::ReplaceIndirect(const PropertyKey& key, const void* data, std::size_t bytes) {
    if (data == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    PropertyValue* const value = FindValue(key);
    const TypeDefinition* const actual = IndirectType(value);
    if (actual == nullptr) {
        return value == nullptr ? AAFRESULT_PROP_NOT_PRESENT : AAFRESULT_TYPE_NOT_FOUND;
    }
    Bytes stored;
    const HRESULT result = TypeIndirect::Wrap(*actual, data, bytes, stored);
    if (result >= 0) {
        value->BytesToChange() = std::move(stored);
    }
    return result;
}

HRESULT Object::ReadIndirect(const PropertyKey& key, void* data, std::size_t bytes) const {
    if (data == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    const PropertyValue* value = FindValue(key);
    const TypeDefinition* actual = IndirectType(value);
    if (actual == nullptr) {
        return value == nullptr ? AAFRESULT_PROP_NOT_PRESENT : AAFRESULT_TYPE_NOT_FOUND;
    }
    const std::uint8_t* stored = value->bytes().data() + kIndirectHead;
    const std::size_t size = value->bytes().size() - kIndirectHead;
    if (bytes < actual->DecodedSize(stored, size)) {
        return AAFRESULT_SMALLBUF;
    }
    return actual->Decode(stored, size, data, bytes);
}

HRESULT Object::ReadIndirectSize(const PropertyKey& key, aafUInt32* bytes) const {
    if (bytes == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    const PropertyValue* value = FindValue(key);
    const TypeDefinition* actual = IndirectType(value);
    if (actual == nullptr) {
        return value == nullptr ? AAFRESULT_PROP_NOT_PRESENT : AAFRESULT_TYPE_NOT_FOUND;
    }
    *bytes = static_cast<aafUInt32>(actual->DecodedSize(value->bytes().data() + kIndirectHead,
                                                        value->bytes().size() - kIndirectHead));
    return AAFRESULT_SUCCESS;
}

HRESULT Object::ReadIndirectType(const PropertyKey& key, IAAFTypeDef** type) const {
    if (type == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    const PropertyValue* value = FindValue(key);
    TypeDefinition* actual = IndirectType(value);
    if (actual == nullptr) {
        return value == nullptr ? AAFRESULT_PROP_NOT_PRESENT : AAFRESULT_TYPE_NOT_FOUND;
    }
    return GiveOut(actual, type);
}

}  // namespace aaf
