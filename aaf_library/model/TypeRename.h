// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/model/TypeDefinition.h"
#include "not_implemented/AAFTypeDefinitions.h"

namespace aaf {

// Another name for a type.
class TypeRename : public Implements<TypeDefinition, IAAFTypeDefRename> {
public:
    TypeRename() : Implements(TypeKind::Rename) {}

    HRESULT Setup(const GUID& id, const std::wstring& name, TypeDefinition& base);
    // Another file names another type, of the same kind.
    void Redefine(TypeDefinition& base);

    ValueForm form() const override { return base_ == nullptr ? ValueForm::Data : base_->form(); }
    TypeDefinition* element() const override { return base_; }
    std::size_t StoredSize() const override { return base_ == nullptr ? 0 : base_->StoredSize(); }
    std::size_t NativeSize() const override { return base_ == nullptr ? 0 : base_->NativeSize(); }
    void AppendStored(const std::uint8_t* native, Bytes& out) const override;
    void CopyNative(const std::uint8_t* stored, std::uint8_t* native) const override;
    HRESULT Encode(const void* native, std::size_t bytes, Bytes& out) const override;
    std::size_t DecodedSize(const std::uint8_t* stored, std::size_t size) const override;
    HRESULT Decode(const std::uint8_t* stored, std::size_t size, void* native,
                   std::size_t bytes) const override;

    // -- IAAFTypeDefRename
    HRESULT Initialize(aafUID_constref id, IAAFTypeDef* baseType,
                       aafCharacter_constptr typeName) override;
    HRESULT GetBaseType(IAAFTypeDef** baseType) override;
    HRESULT GetBaseValue(IAAFPropertyValue* inPropVal, IAAFPropertyValue** outPropVal) override;
    HRESULT CreateValue(IAAFPropertyValue* inPropVal, IAAFPropertyValue** outPropVal) override;

private:
    TypeDefinition* base_ = nullptr;
};

}  // namespace aaf
