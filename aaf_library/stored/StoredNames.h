// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>
#include <string>

// Names of storages and streams. Other readers compute them again from the
// property's name and pid, so every character counts.

namespace aaf::stored {

inline constexpr char16_t kPropertiesStream[] = u"properties";
inline constexpr char16_t kReferencedPropertiesStream[] = u"referenced properties";

// A contained object or a data stream, "Header-2".
std::u16string SingleName(const std::u16string& property, std::uint16_t pid);

// What the names of a collection begin with, "Mobs-1901".
std::u16string CollectionName(const std::u16string& property, std::uint16_t pid);

// The index stream, "Mobs-1901 index", and an element, "Mobs-1901{1f}".
std::u16string IndexName(const std::u16string& collection);
std::u16string ElementName(const std::u16string& collection, std::uint32_t localKey);

// The part of a stored name before its pid; the whole name when it does not
// end in that pid.
std::u16string PropertyPart(const std::u16string& storedName, std::uint16_t pid);

// For messages, "property 4803".
std::string PropertyText(std::uint16_t pid);

// UTF-16 to UTF-8, for messages. A lone half of a surrogate pair becomes a
// question mark.
std::string ToUtf8(const std::u16string& text);

}  // namespace aaf::stored
