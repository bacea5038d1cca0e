// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include <openssl/evp.h>

#include "reference_host/system/DigestEngine.h"

namespace host::system {

struct DigestEngine::Handle {
    EVP_MD_CTX* context = nullptr;
};

// Found once for the process: the library searches its providers for each name. Like
// the library itself it stays until the end.
static const EVP_MD* Sha256() {
    static const EVP_MD* const digest = EVP_MD_fetch(nullptr, "SHA256", nullptr);
    return digest;
}

DigestEngine::DigestEngine() : handle_(std::make_unique<Handle>()) {
    EVP_MD_CTX* context = EVP_MD_CTX_new();
    if (context != nullptr && EVP_DigestInit_ex(context, Sha256(), nullptr) != 1) {
        EVP_MD_CTX_free(context);
        context = nullptr;
    }
    handle_->context = context;
}

DigestEngine::~DigestEngine() {
    EVP_MD_CTX_free(handle_->context);
}

bool DigestEngine::IsReady() const {
    return handle_->context != nullptr;
}

bool DigestEngine::Add(const unsigned char* data, std::size_t size) {
    return EVP_DigestUpdate(handle_->context, data, size) == 1;
}

bool DigestEngine::Finish(std::array<unsigned char, kDigestBytes>& digest) {
    return EVP_DigestFinal_ex(handle_->context, digest.data(), nullptr) == 1;
}

}  // namespace host::system
