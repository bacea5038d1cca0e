// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <string>

#include "aaf_library/model/Unknown.h"
#include "not_implemented/AAFMetaDefinitions.h"

namespace aaf {

// What class, property and type definitions share: id, name, description. They
// belong to the meta-dictionary of their model, or to nobody while a caller
// builds them.
class MetaDefinition : public Implements<Unknown, IAAFMetaDefinition> {
public:
    const GUID& id() const { return id_; }
    const std::wstring& name() const;
    bool IsInitialized() const { return initialized_; }
    // Part of the built-in model, as opposed to registered by a caller or read from a file.
    bool IsBuiltIn() const { return builtIn_; }
    void MarkBuiltIn() { builtIn_ = true; }
    bool IsRenamed() const { return renamed_; }
    // Identity and mark of a built-in definition. The name is ASCII and outlives all models.
    void SetBuiltInIdentity(const GUID& id, const char* name);

    // Fails with AAFRESULT_ALREADY_INITIALIZED the second time.
    HRESULT SetIdentity(const GUID& id, const std::wstring& name);

    // -- IAAFMetaDefinition
    HRESULT Initialize(aafUID_constref id, aafCharacter_constptr name,
                       aafCharacter_constptr description) override;
    HRESULT GetAUID(aafUID_t* auid) override;
    HRESULT SetName(aafCharacter_constptr name) override;
    HRESULT GetName(aafCharacter* name, aafUInt32 bufSize) override;
    HRESULT GetNameBufLen(aafUInt32* bufSize) override;
    HRESULT SetDescription(aafCharacter_constptr description) override;
    HRESULT GetDescription(aafCharacter* description, aafUInt32 bufSize) override;
    HRESULT GetDescriptionBufLen(aafUInt32* bufSize) override;

protected:
    // Whether id and name are all that a definition of this kind needs.
    virtual bool NeedsNameOnly() const { return false; }

private:
    bool IsNameInTable() const { return name_.empty() && builtInName_ != nullptr; }

    GUID id_{};
    const char* builtInName_ = nullptr;  // until somebody asks for the name
    mutable std::wstring name_;
    std::wstring description_;
    bool described_ = false;
    bool initialized_ = false;
    bool builtIn_ = false;
    bool renamed_ = false;
};

}  // namespace aaf
