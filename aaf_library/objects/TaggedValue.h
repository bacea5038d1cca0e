// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/model/Object.h"
#include "host_interfaces/aaf/AAFObjects.h"
#include "not_implemented/AAFObjects.h"

namespace aaf {

// A name with a value of any plain type: a comment or an attribute. Owned by
// the mob or component whose list it stands in.
class TaggedValue : public Implements<Object, IAAFTaggedValue> {
public:
    // Initializes it as a text, as comments and attributes are.
    HRESULT InitializeText(aafCharacter_constptr name, aafCharacter_constptr text);

    HRESULT Initialize(aafCharacter_constptr name, IAAFTypeDef* typeDef, aafUInt32 valueSize,
                       aafDataBuffer_t value) override;
    HRESULT GetName(aafCharacter* name, aafUInt32 bufSize) override;
    HRESULT GetNameBufLen(aafUInt32* bufSize) override;
    HRESULT GetTypeDefinition(IAAFTypeDef** typeDef) override;
    // Tells the size of the caller's buffer in `bytesRead`, as callers of the
    // published library have it; GetValueBufLen tells that of the value.
    HRESULT GetValue(aafUInt32 valueSize, aafDataBuffer_t value, aafUInt32* bytesRead) override;
    HRESULT GetValueBufLen(aafUInt32* len) override;
    HRESULT SetValue(aafUInt32 valueSize, aafDataBuffer_t value) override;

private:
    bool IsInitialized() const { return IsPresent(prop::TaggedValue_Value); }
};

}  // namespace aaf
