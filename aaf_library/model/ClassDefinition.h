// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <vector>

#include "aaf_library/model/BuiltIn.h"
#include "aaf_library/model/PropertyDefinition.h"
#include "not_implemented/AAFMetaDefinitions.h"

namespace aaf {

// A class of the object model with its own properties. Kept by the model once
// it is registered.
//
// A built-in class looks its properties up in the table that all models share; their definitions
// come into being when they are first looked up. Registered ones stand behind them.
class ClassDefinition : public Implements<MetaDefinition, IAAFClassDef> {
public:
    // Null for a root class.
    ClassDefinition* parent() const { return parent_; }
    void SetParent(ClassDefinition* parent) { parent_ = parent; }
    bool concrete() const { return concrete_; }
    void SetConcrete(bool concrete) { concrete_ = concrete; }
    bool IsKindOf(const GUID& classId) const;
    // In the dictionary, as opposed to being built by a caller.
    bool IsRegistered() const { return registered_; }
    void MarkRegistered() { registered_ = true; }
    // Once, before anything is added.
    void TakeBuiltIn(const BuiltInClass& entry);

    const std::vector<RefPtr<PropertyDefinition>>& properties();
    // Whether it has more than the built-in model knows.
    bool IsExtended() const { return !IsBuiltIn() || properties_.size() > builtIn_.size(); }
    // Itself, or a property that was looked up.
    bool IsRenamedAnywhere() const;
    // For each of its own properties to which the model allotted a number.
    template <class Do>
    void ForEachAllotted(const Do& use) const {
        if (highest_ < kLastAllottedPid) {
            return;
        }
        for (const RefPtr<PropertyDefinition>& property : properties_) {
            if (property && property->pid() >= kLastAllottedPid) {
                use(*property);
            }
        }
    }
    // Whether all that it says stands in the built-in model.
    bool IsAsBuiltIn() const;
    // This class and its parents; null when unknown.
    PropertyDefinition* FindProperty(const GUID& id);
    PropertyDefinition* FindProperty(PropertyId pid);
    PropertyDefinition* FindUniqueProperty();
    // Those that its objects must have, and the one with that id if it is among the others.
    std::vector<PropertyDefinition*> RequiredProperties(const GUID& andThis);
    // Adds without the checks that a caller's registration has. pid kNoPropertyId: the next free.
    PropertyDefinition& AddProperty(const GUID& id, const std::wstring& name, const GUID& typeId,
                                    bool optional, bool unique, PropertyId pid = kNoPropertyId);

    // -- IAAFClassDef
    HRESULT Initialize(aafUID_constref classID, IAAFClassDef* parentClass,
                       aafCharacter_constptr className, aafBoolean_t isConcrete) override;
    HRESULT GetPropertyDefs(IEnumAAFPropertyDefs** enumerator) override;
    HRESULT CountPropertyDefs(aafUInt32* count) override;
    HRESULT RegisterNewPropertyDef(aafUID_constref id, aafCharacter_constptr name,
                                   IAAFTypeDef* typeDef, aafBoolean_t isOptional,
                                   aafBoolean_t isUniqueIdentifier,
                                   IAAFPropertyDef** propDef) override;
    HRESULT RegisterOptionalPropertyDef(aafUID_constref id, aafCharacter_constptr name,
                                        IAAFTypeDef* typeDef, IAAFPropertyDef** propDef) override;
    HRESULT LookupPropertyDef(aafUID_constref propID, IAAFPropertyDef** propDef) override;
    HRESULT GetName(aafCharacter* name, aafUInt32 bufSize) override;
    HRESULT GetNameBufLen(aafUInt32* bufSize) override;
    HRESULT GetParent(IAAFClassDef** classDef) override;
    HRESULT IsConcrete(aafBoolean_t* result) override;
    HRESULT IsRoot(aafBoolean_t* isRoot) override;
    HRESULT IsUniquelyIdentified(aafBoolean_t* isUniquelyIdentified) override;
    HRESULT GetUniqueIdentifier(IAAFPropertyDef** uniqueIdentifier) override;
    HRESULT CreateInstance(REFIID riid, IUnknown** object) override;

protected:
    ~ClassDefinition() override;

private:
    bool IsClosedToExtension() const;
    struct Searched;
    Searched SearchedAt(std::size_t index) const;
    PropertyDefinition* PropertyAt(std::size_t index);
    // The first one of this class and its parents.
    template <class Fits>
    PropertyDefinition* FindWhere(const Fits& fits);
    HRESULT RegisterProperty(const GUID& id, aafCharacter_constptr name, IAAFTypeDef* typeDef,
                             bool optional, bool unique, IAAFPropertyDef** propDef);

    void Cover(PropertyId pid);

    ClassDefinition* parent_ = nullptr;
    bool concrete_ = false;
    bool registered_ = false;
    Span<BuiltInProperty> builtIn_;
    std::vector<RefPtr<PropertyDefinition>> properties_;  // null: not looked up yet
    // No property of its own has a number beyond these.
    PropertyId lowest_ = 0xFFFF;
    PropertyId highest_ = 0;
};

}  // namespace aaf
