// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/model/TypeDefinition.h"
#include "not_implemented/AAFTypeDefinitionsOfMany.h"

namespace aaf {

// References to objects: what strong and weak ones share.
class TypeReference : public Implements<TypeDefinition, IAAFTypeDefObjectRef> {
public:
    using Implements::Implements;

    const GUID& targetClass() const { return targetClass_; }

    // -- IAAFTypeDefObjectRef
    HRESULT GetObjectType(IAAFClassDef** objType) override;
    HRESULT CreateValue(IUnknown* obj, IAAFPropertyValue** propVal) override;
    HRESULT GetObject(IAAFPropertyValue* propVal, REFIID iid, IUnknown** object) override;
    HRESULT SetObject(IAAFPropertyValue* propVal, IUnknown* object) override;

protected:
    HRESULT SetupTarget(const GUID& id, const std::wstring& name, const GUID& targetClass);
    HRESULT CheckTarget(IAAFClassDef* objType, aafCharacter_constptr typeName,
                        ClassDefinition** target) const;
    virtual HRESULT Fill(PropertyValue& value, Unknown& object) = 0;
    virtual Unknown* TargetOf(const PropertyValue& value) const = 0;

private:
    GUID targetClass_{};
};

// The value contains the object.
class TypeStrongReference : public Implements<TypeReference, IAAFTypeDefStrongObjRef> {
public:
    TypeStrongReference() : Implements(TypeKind::StrongReference) {}

    HRESULT Setup(const GUID& id, const std::wstring& name, const GUID& targetClass) {
        return SetupTarget(id, name, targetClass);
    }
    ValueForm form() const override { return ValueForm::StrongReference; }

    // -- IAAFTypeDefStrongObjRef
    HRESULT Initialize(aafUID_constref id, IAAFClassDef* objType,
                       aafCharacter_constptr typeName) override;

protected:
    HRESULT Fill(PropertyValue& value, Unknown& object) override;
    Unknown* TargetOf(const PropertyValue& value) const override;
};

// The value names an object in one of the file's sets by its id.
class TypeWeakReference : public Implements<TypeReference, IAAFTypeDefWeakObjRef> {
public:
    TypeWeakReference() : Implements(TypeKind::WeakReference) {}

    HRESULT Setup(const GUID& id, const std::wstring& name, const GUID& targetClass,
                  std::vector<GUID> targetSet);
    // Ids of the properties from the root object down to the set.
    const std::vector<GUID>& targetSet() const { return targetSet_; }
    ValueForm form() const override { return ValueForm::WeakReference; }

    // -- IAAFTypeDefWeakObjRef
    HRESULT Initialize(aafUID_constref id, IAAFClassDef* objType, aafCharacter_constptr typeName,
                       aafUInt32 ids, aafUID_constptr targetSet) override;

protected:
    HRESULT Fill(PropertyValue& value, Unknown& object) override;
    Unknown* TargetOf(const PropertyValue& value) const override;

private:
    std::vector<GUID> targetSet_;
};

// The id by which a weak reference names this object: that of a definition, or nothing.
bool WeakKeyOf(Unknown& target, GUID* id);

}  // namespace aaf
