// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/model/TypeCharacter.h"

#include "aaf_library/model/StoredNumbers.h"

namespace aaf {

void TypeCharacter::AppendStored(const std::uint8_t* native, Bytes& out) const {
    aafCharacter character = 0;
    std::memcpy(&character, native, sizeof character);
    AppendNumber(static_cast<std::uint64_t>(character), 2, out);
}

void TypeCharacter::CopyNative(const std::uint8_t* stored, std::uint8_t* native) const {
    const auto character = static_cast<aafCharacter>(UnsignedAt(stored, 2));
    std::memcpy(native, &character, sizeof character);
}

HRESULT TypeCharacter::CreateValueFromCharacter(aafCharacter character,
                                                IAAFPropertyValue** characterValue) {
    if (characterValue == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    Bytes stored;
    AppendNumber(static_cast<std::uint64_t>(character), 2, stored);
    return GiveValue(*this, std::move(stored), characterValue);
}

HRESULT TypeCharacter::GetCharacter(IAAFPropertyValue* characterValue, aafCharacter* character) {
    PropertyValue* value = nullptr;
    if (character == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    if (const HRESULT result = Take(characterValue, &value); result < 0) {
        return result;
    }
    return Decode(value->bytes().data(), value->bytes().size(), character, sizeof *character);
}

HRESULT TypeCharacter::SetCharacter(IAAFPropertyValue* characterValue, aafCharacter character) {
    PropertyValue* value = nullptr;
    if (const HRESULT result = Take(characterValue, &value); result < 0) {
        return result;
    }
    value->BytesToChange().clear();
    return Encode(&character, sizeof character, value->BytesToChange());
}

}  // namespace aaf
