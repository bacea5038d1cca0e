// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/model/TypeDefinition.h"
#include "not_implemented/AAFTypeDefinitions.h"

namespace aaf {

// One character: wchar_t for the caller, one UTF-16 unit when stored.
class TypeCharacter : public Implements<TypeDefinition, IAAFTypeDefCharacter> {
public:
    TypeCharacter() : Implements(TypeKind::Character) {}

    std::size_t StoredSize() const override { return 2; }
    std::size_t NativeSize() const override { return sizeof(aafCharacter); }
    void AppendStored(const std::uint8_t* native, Bytes& out) const override;
    void CopyNative(const std::uint8_t* stored, std::uint8_t* native) const override;

    // -- IAAFTypeDefCharacter
    HRESULT CreateValueFromCharacter(aafCharacter character,
                                     IAAFPropertyValue** characterValue) override;
    HRESULT GetCharacter(IAAFPropertyValue* characterValue, aafCharacter* character) override;
    HRESULT SetCharacter(IAAFPropertyValue* characterValue, aafCharacter character) override;

protected:
    bool NeedsNameOnly() const override { return true; }
};

}  // namespace aaf
