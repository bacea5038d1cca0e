// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <string>

#include "aaf_library/model/PropertyValue.h"
#include "host_interfaces/aaf/AAFPlainTypes.h"

// Texts: wide characters in the calls, UTF-16 without regard to the machine in
// stored values. A lone surrogate is carried as it stands.

namespace aaf {

void AppendUtf16(const aafCharacter* text, std::size_t count, Bytes& out);
std::wstring FromUtf16(const std::uint8_t* bytes, std::size_t size);
// The same without a text between: how many characters there are, and the characters for a
// buffer. More than it has room for: AAFRESULT_SMALLBUF.
std::size_t CountOfUtf16(const std::uint8_t* bytes, std::size_t size);
HRESULT CopyUtf16(const std::uint8_t* bytes, std::size_t size, void* buffer,
                  std::size_t bufferBytes);

// Stored form of a text with its terminating zero.
Bytes StoredText(const std::wstring& text);
// Text up to the first zero, if there is one.
std::wstring TextOfStored(const Bytes& bytes);

// Whether two names of an enumeration's elements mean the same: files have them without the prefix
// "kAAF" that they have in programs.
bool IsSameElementName(const std::wstring& left, const std::wstring& right);

// Text of one of the constant tables, which are plain ASCII.
std::wstring Widen(const char* ascii);

// Answers of the operations that hand out a text: bytes include the zero.
HRESULT CopyText(const std::wstring& text, aafCharacter* buffer, aafUInt32 bufferBytes);
HRESULT TextSize(const std::wstring& text, aafUInt32* bytes);
// The same for texts of the constant tables.
HRESULT CopyAscii(const char* text, aafCharacter* buffer, aafUInt32 bufferBytes);
HRESULT AsciiSize(const char* text, aafUInt32* bytes);

}  // namespace aaf
