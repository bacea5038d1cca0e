// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// The digest itself and not the library's way of choosing one: to look it up by its name
// first sets up all that the library has, which takes longer than a short movie's digest. The
// functions are marked as old for the sake of that choice, which nobody has here.
#define OPENSSL_SUPPRESS_DEPRECATED
#include <openssl/sha.h>

#include "reference_host/system/DigestEngine.h"

namespace host::system {

static_assert(kDigestBytes == SHA256_DIGEST_LENGTH);

struct DigestEngine::Handle {
    SHA256_CTX context;
    bool ready;
};

DigestEngine::DigestEngine() : handle_(std::make_unique<Handle>()) {
    handle_->ready = SHA256_Init(&handle_->context) == 1;
}

DigestEngine::~DigestEngine() = default;

bool DigestEngine::IsReady() const {
    return handle_->ready;
}

bool DigestEngine::Add(const unsigned char* data, std::size_t size) {
    return SHA256_Update(&handle_->context, data, size) == 1;
}

bool DigestEngine::Finish(std::array<unsigned char, kDigestBytes>& digest) {
    return SHA256_Final(digest.data(), &handle_->context) == 1;
}

}  // namespace host::system
