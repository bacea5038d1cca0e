// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <array>
#include <cstdint>
#include <filesystem>
#include <optional>
#include <string>
#include <string_view>

namespace cliphost {

// The first half of a SHA-256.
using Digest = std::array<unsigned char, 16>;

Digest DigestOf(std::string_view bytes);
// None for a file that can't be read.
std::optional<Digest> DigestOfFile(const std::filesystem::path& file);

// Its first 64 bits.
std::uint64_t FirstBitsOf(const Digest& digest);

// In hexadecimal digits.
std::string TextOf(const Digest& digest);

}  // namespace cliphost
