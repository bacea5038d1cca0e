// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <string>
#include <string_view>

// Conversions between the encodings of host strings. Everything passes through
// UTF-32, one element for each character.
//
// A byte that is no part of well-formed UTF-8, as file names may hold, travels
// as the lone surrogate U+DC00 plus the byte and becomes that byte again on the
// way back to UTF-8. Other lone surrogates, as Windows file names may hold, pass
// between the wide encodings unchanged but have no place in UTF-8.
namespace encodings {

bool IsSurrogate(char32_t c);
bool HoldsSurrogate(std::u32string_view text);

std::u32string FromUtf8(std::string_view text);
std::u32string FromUtf16(std::u16string_view text);
std::u32string FromWide(std::wstring_view text);

// False, with `out` unchanged, when a character has no place in the encoding.
bool ToAscii(std::u32string_view text, std::string& out);
bool ToUtf8(std::u32string_view text, std::string& out);
bool ToUtf16(std::u32string_view text, std::u16string& out);
bool ToUtf32(std::u32string_view text, std::u32string& out);
bool ToWide(std::u32string_view text, std::wstring& out);

// For output that must not fail: what has no place becomes U+FFFD.
std::string ToUtf8Lossy(std::u32string_view text);
std::u16string ToUtf16Lossy(std::u32string_view text);
std::wstring ToWideLossy(std::u32string_view text);

}  // namespace encodings
