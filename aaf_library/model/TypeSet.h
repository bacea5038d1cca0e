// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/model/TypeOfElements.h"
#include "not_implemented/AAFTypeDefinitionsOfMany.h"

namespace aaf {

// Elements that each occur once: plain data, or objects told apart by their key.
class TypeSet : public Implements<TypeOfElements, IAAFTypeDefSet> {
public:
    TypeSet() : Implements(TypeKind::Set) {}

    HRESULT Setup(const GUID& id, const std::wstring& name, TypeDefinition& element) {
        return SetupElement(id, name, element);
    }
    ValueForm form() const override;

    // -- IAAFTypeDefSet
    HRESULT Initialize(aafUID_constref id, IAAFTypeDef* typeDef,
                       aafCharacter_constptr typeName) override;
    HRESULT GetElementType(IAAFTypeDef** typeDef) override { return GiveElementType(typeDef); }
    HRESULT AddElement(IAAFPropertyValue* setPropertyValue,
                       IAAFPropertyValue* elementPropertyValue) override;
    HRESULT RemoveElement(IAAFPropertyValue* setPropertyValue,
                          IAAFPropertyValue* elementPropertyValue) override;
    HRESULT ContainsElement(IAAFPropertyValue* setPropertyValue,
                            IAAFPropertyValue* elementPropertyValue,
                            aafBoolean_t* containsElement) override;
    HRESULT GetCount(IAAFPropertyValue* setPropertyValue, aafUInt32* count) override;
    HRESULT CreateKey(aafDataBuffer_t keyPtr, aafUInt32 length, IAAFPropertyValue** key) override;
    HRESULT LookupElement(IAAFPropertyValue* setPropertyValue, IAAFPropertyValue* key,
                          IAAFPropertyValue** elementPropertyValue) override;
    HRESULT ContainsKey(IAAFPropertyValue* setPropertyValue, IAAFPropertyValue* key,
                        aafBoolean_t* containsKey) override;
    HRESULT GetElements(IAAFPropertyValue* setPropertyValue,
                        IEnumAAFPropertyValues** enumerator) override {
        return ElementsOf(setPropertyValue, enumerator);
    }

private:
    // What an element is told apart by.
    Bytes KeyAt(const PropertyValue& value, std::size_t index) const;
    Bytes KeyOf(const PropertyValue& element) const;
    std::size_t Find(const PropertyValue& value, const Bytes& key) const;
    HRESULT TakeKey(IAAFPropertyValue* set, IAAFPropertyValue* key, PropertyValue** value,
                    Bytes* keyBytes) const;
};

}  // namespace aaf
