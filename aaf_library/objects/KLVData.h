// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/model/Object.h"
#include "host_interfaces/aaf/AAFObjects.h"
#include "not_implemented/AAFObjects.h"

namespace aaf {

// Bytes under a key that only their writer understands. Owned by the mob or
// component whose list they stand in.
class KLVData : public Implements<Object, IAAFKLVData> {
public:
    HRESULT Initialize(aafUID_t key, aafUInt32 length, aafDataBuffer_t value) override;
    HRESULT GetKey(aafUID_t* key) override;
    HRESULT GetValue(aafUInt32 valueSize, aafDataBuffer_t value, aafUInt32* bytesRead) override;
    HRESULT GetValueBufLen(aafUInt32* len) override;
    HRESULT SetValue(aafUInt32 valueSize, aafDataBuffer_t value) override;

private:
    // The stored value, or null while there is none that has a key.
    PropertyValue* Stored() const;
};

}  // namespace aaf
