// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>

// Properties of the root, of the meta-dictionary and of definitions. They
// describe all others and are the same in every file.

namespace aaf::stored::meta {

inline constexpr std::uint16_t kRootMetaDictionary = 0x0001;
inline constexpr std::uint16_t kRootHeader = 0x0002;
inline constexpr std::uint16_t kClassDefinitions = 0x0003;
inline constexpr std::uint16_t kTypeDefinitions = 0x0004;

inline constexpr std::uint16_t kIdentification = 0x0005;
inline constexpr std::uint16_t kName = 0x0006;
inline constexpr std::uint16_t kParentClass = 0x0008;
inline constexpr std::uint16_t kProperties = 0x0009;
inline constexpr std::uint16_t kIsConcrete = 0x000A;

inline constexpr std::uint16_t kPropertyType = 0x000B;
inline constexpr std::uint16_t kIsOptional = 0x000C;
inline constexpr std::uint16_t kLocalIdentification = 0x000D;
inline constexpr std::uint16_t kIsUniqueIdentifier = 0x000E;

inline constexpr std::uint16_t kIntegerSize = 0x000F;
inline constexpr std::uint16_t kIntegerIsSigned = 0x0010;
inline constexpr std::uint16_t kStrongReferencedType = 0x0011;
inline constexpr std::uint16_t kWeakReferencedType = 0x0012;
inline constexpr std::uint16_t kWeakTargetSet = 0x0013;
inline constexpr std::uint16_t kEnumerationElementType = 0x0014;
inline constexpr std::uint16_t kEnumerationNames = 0x0015;
inline constexpr std::uint16_t kEnumerationValues = 0x0016;
inline constexpr std::uint16_t kFixedArrayElementType = 0x0017;
inline constexpr std::uint16_t kFixedArrayCount = 0x0018;
inline constexpr std::uint16_t kVariableArrayElementType = 0x0019;
inline constexpr std::uint16_t kSetElementType = 0x001A;
inline constexpr std::uint16_t kStringElementType = 0x001B;
inline constexpr std::uint16_t kRecordMemberTypes = 0x001C;
inline constexpr std::uint16_t kRecordMemberNames = 0x001D;
inline constexpr std::uint16_t kRenamedType = 0x001E;
inline constexpr std::uint16_t kExtendibleNames = 0x001F;
inline constexpr std::uint16_t kExtendibleValues = 0x0020;

}  // namespace aaf::stored::meta
