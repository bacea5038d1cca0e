// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <array>
#include <cstddef>
#include <memory>

// SHA-256 by the system's own means: one body for each platform, all with the
// same digest.
namespace host::system {

inline constexpr std::size_t kDigestBytes = 32;

class DigestEngine {
public:
    DigestEngine();
    ~DigestEngine();
    DigestEngine(const DigestEngine&) = delete;
    DigestEngine& operator=(const DigestEngine&) = delete;

    bool IsReady() const;  // false: the system has no such digest
    bool Add(const unsigned char* data, std::size_t size);
    bool Finish(std::array<unsigned char, kDigestBytes>& digest);

private:
    struct Handle;
    std::unique_ptr<Handle> handle_;
};

}  // namespace host::system
