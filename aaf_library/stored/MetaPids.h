// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>

// Properties of the root, of the meta-dictionary and of definitions. They
// describe all others and are the same in every file.

namespace aaf::stored::meta {

inline constexpr std::uint16_t rootMetaDictionary = 0x0001;
inline constexpr std::uint16_t rootHeader = 0x0002;
inline constexpr std::uint16_t classDefinitions = 0x0003;
inline constexpr std::uint16_t typeDefinitions = 0x0004;

inline constexpr std::uint16_t identification = 0x0005;
inline constexpr std::uint16_t name = 0x0006;
inline constexpr std::uint16_t parentClass = 0x0008;
inline constexpr std::uint16_t properties = 0x0009;
inline constexpr std::uint16_t isConcrete = 0x000A;

inline constexpr std::uint16_t propertyType = 0x000B;
inline constexpr std::uint16_t isOptional = 0x000C;
inline constexpr std::uint16_t localIdentification = 0x000D;
inline constexpr std::uint16_t isUniqueIdentifier = 0x000E;

inline constexpr std::uint16_t integerSize = 0x000F;
inline constexpr std::uint16_t integerIsSigned = 0x0010;
inline constexpr std::uint16_t strongReferencedType = 0x0011;
inline constexpr std::uint16_t weakReferencedType = 0x0012;
inline constexpr std::uint16_t weakTargetSet = 0x0013;
inline constexpr std::uint16_t enumerationElementType = 0x0014;
inline constexpr std::uint16_t enumerationNames = 0x0015;
inline constexpr std::uint16_t enumerationValues = 0x0016;
inline constexpr std::uint16_t fixedArrayElementType = 0x0017;
inline constexpr std::uint16_t fixedArrayCount = 0x0018;
inline constexpr std::uint16_t variableArrayElementType = 0x0019;
inline constexpr std::uint16_t setElementType = 0x001A;
inline constexpr std::uint16_t stringElementType = 0x001B;
inline constexpr std::uint16_t recordMemberTypes = 0x001C;
inline constexpr std::uint16_t recordMemberNames = 0x001D;
inline constexpr std::uint16_t renamedType = 0x001E;
inline constexpr std::uint16_t extendibleNames = 0x001F;
inline constexpr std::uint16_t extendibleValues = 0x0020;

}  // namespace aaf::stored::meta
