// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/model/TypeString.h"

#include <algorithm>

#include "aaf_library/model/Text.h"

namespace aaf {

HRESULT TypeString::Setup(const GUID& id, const std::wstring& name, TypeDefinition& character) {
    const HRESULT result = SetIdentity(id, name);
    if (result >= 0) {
        character_ = &character;
    }
    return result;
}

HRESULT TypeString::Encode(const void* native, std::size_t bytes, Bytes& out) const {
    if (bytes % sizeof(aafCharacter) != 0) {
        return AAFRESULT_BAD_SIZE;
    }
    // The caller's memory need not be aligned for characters.
    std::wstring text(bytes / sizeof(aafCharacter), L'\0');
    if (bytes > 0) {
        std::memcpy(&text[0], native, bytes);
    }
    AppendUtf16(text.data(), text.size(), out);
    return AAFRESULT_SUCCESS;
}

std::size_t TypeString::DecodedSize(const std::uint8_t* stored, std::size_t size) const {
    return CountOfUtf16(stored, size) * sizeof(aafCharacter);
}

HRESULT TypeString::Decode(const std::uint8_t* stored, std::size_t size, void* native,
                           std::size_t bytes) const {
    return CopyUtf16(stored, size, native, bytes);
}

HRESULT TypeString::Initialize(aafUID_constref id, IAAFTypeDef* typeDef,
                               aafCharacter_constptr typeName) {
    if (typeDef == nullptr || typeName == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    TypeDefinition* character = TypeOf(typeDef, model());
    if (character == nullptr || character->kind() != TypeKind::Character) {
        return AAFRESULT_BAD_TYPE;
    }
    return Setup(id, typeName, *character);
}

HRESULT TypeString::GetType(IAAFTypeDef** typeDef) {
    if (typeDef == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    return character_ == nullptr ? AAFRESULT_NOT_INITIALIZED : GiveOut(character_, typeDef);
}

HRESULT TypeString::GetCount(IAAFPropertyValue* propVal, aafUInt32* count) {
    PropertyValue* value = nullptr;
    if (count == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    if (const HRESULT result = Take(propVal, &value); result < 0) {
        return result;
    }
    *count = static_cast<aafUInt32>(CountOfUtf16(value->bytes().data(), value->bytes().size()));
    return AAFRESULT_SUCCESS;
}

HRESULT TypeString::CreateValueFromCString(aafMemPtr_t initData, aafUInt32 initDataSize,
                                           IAAFPropertyValue** propVal) {
    if (initData == nullptr || propVal == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    if (!IsInitialized()) {
        return AAFRESULT_NOT_INITIALIZED;
    }
    Bytes stored;
    const HRESULT result = Encode(initData, initDataSize, stored);
    return result < 0 ? result : GiveValue(*this, std::move(stored), propVal);
}

HRESULT TypeString::SetCString(IAAFPropertyValue* propVal, aafMemPtr_t data, aafUInt32 dataSize) {
    PropertyValue* value = nullptr;
    if (data == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    if (const HRESULT result = Take(propVal, &value); result < 0) {
        return result;
    }
    Bytes stored;
    const HRESULT result = Encode(data, dataSize, stored);
    if (result >= 0) {
        value->BytesToChange() = std::move(stored);
    }
    return result;
}

HRESULT TypeString::AppendElements(IAAFPropertyValue* inPropVal, aafMemPtr_t elements) {
    PropertyValue* value = nullptr;
    if (elements == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    if (const HRESULT result = Take(inPropVal, &value); result < 0) {
        return result;
    }
    std::wstring text = TextOfStored(value->bytes());
    for (aafCharacter character = 0;; elements += sizeof character) {
        std::memcpy(&character, elements, sizeof character);
        if (character == 0) {
            break;
        }
        text.push_back(character);
    }
    value->BytesToChange() = StoredText(text);
    return AAFRESULT_SUCCESS;
}

HRESULT TypeString::GetElements(IAAFPropertyValue* inPropVal, aafMemPtr_t buffer,
                                aafUInt32 bufferSize) {
    PropertyValue* value = nullptr;
    if (buffer == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    if (const HRESULT result = Take(inPropVal, &value); result < 0) {
        return result;
    }
    return Decode(value->bytes().data(), value->bytes().size(), buffer, bufferSize);
}

}  // namespace aaf
