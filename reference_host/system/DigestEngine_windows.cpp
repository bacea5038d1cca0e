// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/system/DigestEngine.h"

// The second needs the first.
#include <windows.h>

#include <bcrypt.h>

namespace host::system {

struct DigestEngine::Handle {
    BCRYPT_ALG_HANDLE algorithm = nullptr;
    BCRYPT_HASH_HANDLE hash = nullptr;
};

DigestEngine::DigestEngine() : handle_(std::make_unique<Handle>()) {
    if (BCryptOpenAlgorithmProvider(&handle_->algorithm, BCRYPT_SHA256_ALGORITHM, nullptr, 0) < 0) {
        handle_->algorithm = nullptr;
        return;
    }
    if (BCryptCreateHash(handle_->algorithm, &handle_->hash, nullptr, 0, nullptr, 0, 0) < 0) {
        handle_->hash = nullptr;
    }
}

DigestEngine::~DigestEngine() {
    if (handle_->hash != nullptr) {
        BCryptDestroyHash(handle_->hash);
    }
    if (handle_->algorithm != nullptr) {
        BCryptCloseAlgorithmProvider(handle_->algorithm, 0);
    }
}

bool DigestEngine::IsReady() const {
    return handle_->hash != nullptr;
}

bool DigestEngine::Add(const unsigned char* data, std::size_t size) {
    return BCryptHashData(handle_->hash, const_cast<unsigned char*>(data), static_cast<ULONG>(size),
                          0) >= 0;
}

bool DigestEngine::Finish(std::array<unsigned char, kDigestBytes>& digest) {
    return BCryptFinishHash(handle_->hash, digest.data(), static_cast<ULONG>(digest.size()), 0) >=
           0;
}

}  // namespace host::system
