// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include <cstring>
#include <memory>

#include "host_interfaces/util/NMAUtil.h"
#include "reference_host/system/DigestEngine.h"
#include "reference_host/util/NMAStringState.h"

using host::system::DigestEngine;
using host::util::Quietly;

// The digest is the first half of the SHA-256 of all bytes added.

NCFRESULT GenerateUMIDFromData_Begin(void** state) {
    if (state == nullptr) {
        return NCF_E_POINTER;
    }
    *state = nullptr;
    return Quietly(NCF_E_OUTOFMEMORY, [&] {
        auto engine = std::make_unique<DigestEngine>();
        if (!engine->IsReady()) {
            return NCF_E_FAIL;
        }
        *state = engine.release();
        return NCF_OK;
    });
}

NCFRESULT GenerateUMIDFromData_AddData(void** state, ncfUInt32 size, const unsigned char* data) {
    if (state == nullptr || (data == nullptr && size > 0)) {
        return NCF_E_POINTER;
    }
    if (*state == nullptr) {
        return NMA_E_NOTINITIALIZED;
    }
    if (size == 0) {
        return NCF_OK;
    }
    return static_cast<DigestEngine*>(*state)->Add(data, size) ? NCF_OK : NCF_E_FAIL;
}

NCFRESULT GenerateUMIDFromData_Finish(void** state, GUID* uid) {
    if (state == nullptr) {
        return NCF_E_POINTER;
    }
    const std::unique_ptr<DigestEngine> engine(static_cast<DigestEngine*>(*state));
    *state = nullptr;
    if (uid == nullptr) {
        return NCF_E_POINTER;
    }
    if (engine == nullptr) {
        return NMA_E_NOTINITIALIZED;
    }
    std::array<unsigned char, host::system::kDigestBytes> digest{};
    if (!engine->Finish(digest)) {
        return NCF_E_FAIL;
    }
    std::memcpy(uid, digest.data(), sizeof(GUID));
    return NCF_OK;
}
