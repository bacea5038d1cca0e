// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/stored/StoredTree.h"

// The layout of a compound file's header, shared by writer and reader:
//
//   offset  0  8 bytes   magic number
//           8  16        class id, in an AAF file the signature of its kind
//          24  u16       minor version, u16 major version
//          28  u16       byte order mark
//          30  u16       sector size, u16 small sector size, as powers of two
//          40  u32       number of directory sectors (version 4 only)
//          44  u32       number of allocation table sectors
//          48  u32       first directory sector
//          56  u32       size from which on a stream has sectors of its own
//          60  u32       first sector and u32 number of the small table
//          68  u32       first sector and u32 number of the list of tables
//          76  109 u32   the first allocation table sectors
//
// Sector n begins at (n + 1) sectors from the start of the file.

namespace aaf::stored {

inline constexpr std::uint8_t kCompoundMagic[8] = {0xD0, 0xCF, 0x11, 0xE0, 0xA1, 0xB1, 0x1A, 0xE1};

inline constexpr std::size_t kHeaderSize = 512;
inline constexpr std::size_t kSignatureOffset = 8;
inline constexpr std::size_t kMinorVersionOffset = 24;
inline constexpr std::size_t kMajorVersionOffset = 26;
inline constexpr std::size_t kByteOrderOffset = 28;
inline constexpr std::size_t kSectorShiftOffset = 30;
inline constexpr std::size_t kSmallSectorShiftOffset = 32;
inline constexpr std::size_t kDirectoryCountOffset = 40;
inline constexpr std::size_t kTableCountOffset = 44;
inline constexpr std::size_t kFirstDirectoryOffset = 48;
inline constexpr std::size_t kSmallLimitOffset = 56;
inline constexpr std::size_t kFirstSmallTableOffset = 60;
inline constexpr std::size_t kSmallTableCountOffset = 64;
inline constexpr std::size_t kFirstTableListOffset = 68;
inline constexpr std::size_t kTableListCountOffset = 72;
inline constexpr std::size_t kTableListOffset = 76;
inline constexpr std::uint32_t kHeaderTableCount = 109;

inline constexpr std::uint16_t kMinorVersion = 0x3E;
inline constexpr std::uint16_t kByteOrderMark = 0xFFFE;
inline constexpr std::uint16_t kSmallSectorShift = 6;
inline constexpr std::uint32_t kSmallSectorSize = 1u << kSmallSectorShift;
inline constexpr std::uint32_t kSmallStreamLimit = 4096;

// A directory entry: its name with a terminator, then
//
//   offset 64  u16       size of the name in bytes, terminator included
//          66  u8        kind, u8 colour in the search tree of its storage
//          68  u32       left neighbour, u32 right one, u32 first contained entry
//          80  16        class id
//          96  20        flags and times, which AAF leaves empty
//         116  u32       first sector
//         120  u64       size of the content
inline constexpr std::size_t kDirectoryEntrySize = 128;
inline constexpr std::size_t kEntryNameSizeOffset = 64;
inline constexpr std::size_t kEntryKindOffset = 66;
inline constexpr std::size_t kEntryColourOffset = 67;
inline constexpr std::size_t kEntryLeftOffset = 68;
inline constexpr std::size_t kEntryRightOffset = 72;
inline constexpr std::size_t kEntryChildOffset = 76;
inline constexpr std::size_t kEntryClassOffset = 80;
inline constexpr std::size_t kEntryStartOffset = 116;
inline constexpr std::size_t kEntrySizeOffset = 120;
inline constexpr std::size_t kLongestName = 31;

enum class EntryKind : std::uint8_t { Unused = 0, Storage = 1, Stream = 2, Root = 5 };
inline constexpr std::uint8_t kRed = 0;
inline constexpr std::uint8_t kBlack = 1;
inline constexpr std::uint32_t kNoEntry = 0xFFFFFFFF;

inline constexpr std::uint32_t kFreeSector = 0xFFFFFFFF;
inline constexpr std::uint32_t kEndOfChain = 0xFFFFFFFE;
inline constexpr std::uint32_t kTableSector = 0xFFFFFFFD;
inline constexpr std::uint32_t kTableListSector = 0xFFFFFFFC;
inline constexpr std::uint32_t kLastPlainSector = 0xFFFFFFFA;

// The two kinds of AAF file differ in the size of their sectors.
inline constexpr StoredAuid kSignature512 = {0x41, 0x41, 0x46, 0x42, 0x0D, 0x00, 0x4F, 0x4D,
                                             0x06, 0x0E, 0x2B, 0x34, 0x01, 0x01, 0x01, 0xFF};
inline constexpr StoredAuid kSignature4096 = {0x01, 0x02, 0x01, 0x0D, 0x00, 0x02, 0x00, 0x00,
                                              0x06, 0x0E, 0x2B, 0x34, 0x03, 0x02, 0x01, 0x01};

}  // namespace aaf::stored
