// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/model/MetaDefinition.h"
#include "aaf_library/model/PropertyKey.h"
#include "not_implemented/AAFMetaDefinitions.h"

namespace aaf {

class ClassDefinition;
class TypeDefinition;

// A property of one class; owned by its class definition.
class PropertyDefinition : public Implements<MetaDefinition, IAAFPropertyDef> {
public:
    PropertyDefinition(ClassDefinition& owner, PropertyId pid, const GUID& typeId, bool optional,
                       bool unique);

    ClassDefinition& owner() const { return owner_; }
    PropertyId pid() const { return pid_; }
    void SetPid(PropertyId pid) { pid_ = pid; }
    const GUID& typeId() const { return typeId_; }
    // Null when the model has no such type.
    TypeDefinition* type() const;
    bool IsOptional() const { return optional_; }
    bool IsUnique() const { return unique_; }
    PropertyKey key() const { return {pid_, id()}; }

    // -- IAAFPropertyDef
    HRESULT GetTypeDef(IAAFTypeDef** typeDef) override;
    HRESULT GetName(aafCharacter* name, aafUInt32 bufSize) override;
    HRESULT GetNameBufLen(aafUInt32* bufSize) override;
    HRESULT GetIsOptional(aafBoolean_t* isOptional) override;
    HRESULT GetIsUniqueIdentifier(aafBoolean_t* isUniqueIdentifier) override;
    HRESULT SetDescription(aafCharacter_constptr description) override;
    HRESULT GetDescription(aafCharacter* description, aafUInt32 bufSize) override;
    HRESULT GetDescriptionBufLen(aafUInt32* bufSize) override;

private:
    ClassDefinition& owner_;
    PropertyId pid_;
    GUID typeId_;
    bool optional_;
    bool unique_;
    mutable TypeDefinition* type_ = nullptr;  // looked up once
};

}  // namespace aaf
