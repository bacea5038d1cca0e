// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/model/TypeDefinition.h"

namespace aaf {

// What arrays and sets share: elements of one type, either plain data of a
// fixed size or references.
class TypeOfElements : public TypeDefinition {
public:
    using TypeDefinition::TypeDefinition;

    TypeDefinition* element() const override { return element_; }
    HRESULT Encode(const void* native, std::size_t bytes, Bytes& out) const override;
    std::size_t DecodedSize(const std::uint8_t* stored, std::size_t size) const override;
    HRESULT Decode(const std::uint8_t* stored, std::size_t size, void* native,
                   std::size_t bytes) const override;

protected:
    HRESULT SetupElement(const GUID& id, const std::wstring& name, TypeDefinition& element);
    // The type behind an Initialize argument, if it may be an element.
    HRESULT CheckElement(IAAFTypeDef* typeDef, aafCharacter_constptr typeName,
                         TypeDefinition** element) const;

    bool HasObjects() const;
    // Bytes of one element in the value: those of its data or of its key.
    std::size_t ElementSize() const;
    std::size_t CountOf(const PropertyValue& value) const;
    HRESULT GiveElement(const PropertyValue& value, std::size_t index,
                        IAAFPropertyValue** out) const;
    HRESULT GiveElements(PropertyValue& value, IEnumAAFPropertyValues** enumerator);
    // The value behind an element argument. Wrong kind: AAFRESULT_BAD_TYPE.
    HRESULT TakeElement(IAAFPropertyValue* argument, PropertyValue** element) const;
    HRESULT InsertElementAt(PropertyValue& value, std::size_t index, const PropertyValue& element);
    HRESULT ReplaceElement(PropertyValue& value, std::size_t index, const PropertyValue& element);
    HRESULT EraseElement(PropertyValue& value, std::size_t index);
    HRESULT FillFromValues(PropertyValue& value, IAAFPropertyValue** elements, aafUInt32 count);

    // Both arguments of an operation that puts one element into a list.
    HRESULT TakeBoth(IAAFPropertyValue* list, IAAFPropertyValue* member, PropertyValue** value,
                     PropertyValue** element) const;

    // Operations that arrays answer alike, and two of them sets too.
    HRESULT GiveElementType(IAAFTypeDef** typeDef) const;
    HRESULT ElementsOf(IAAFPropertyValue* list, IEnumAAFPropertyValues** enumerator);
    HRESULT ElementOf(IAAFPropertyValue* list, aafUInt32 index, IAAFPropertyValue** out) const;
    HRESULT SetElement(IAAFPropertyValue* list, aafUInt32 index, IAAFPropertyValue* member);
    HRESULT ValueFromValues(IAAFPropertyValue** elements, aafUInt32 count, IAAFPropertyValue** out);
    HRESULT ValueFromArray(aafMemPtr_t data, aafUInt32 bytes, IAAFPropertyValue** out);
    HRESULT ArrayOf(IAAFPropertyValue* list, aafMemPtr_t data, aafUInt32 bytes) const;
    HRESULT SetArray(IAAFPropertyValue* list, aafMemPtr_t data, aafUInt32 bytes);
    // Whether a value may have so many elements.
    virtual bool MayHold(std::size_t) const { return true; }

private:
    // The value behind a list of plain data, for a caller's buffer.
    HRESULT TakePlain(IAAFPropertyValue* list, const void* data, PropertyValue** value) const;

    TypeDefinition* element_ = nullptr;
};

}  // namespace aaf
