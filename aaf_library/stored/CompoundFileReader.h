// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/stored/CompoundFileFormat.h"
#include "aaf_library/stored/StoredTree.h"

#include <map>
#include <string>
#include <vector>

namespace aaf::stored {

// Reads a compound file that is held in memory. Nothing in the file is
// trusted: every sector and every directory entry is given out once only, so
// time and memory stay within a small multiple of the file's size however its
// tables are twisted, and no walk recurses. Throws StoredError.
class CompoundFileReader {
public:
    using Kind = EntryKind;

    struct Entry {
        std::u16string name;
        Kind kind = Kind::Unused;
        StoredAuid classId{};
        std::uint32_t left = 0;
        std::uint32_t right = 0;
        std::uint32_t child = 0;
        std::uint32_t start = 0;
        std::uint64_t size = 0;
        bool placed = false;                                // stands in some storage
        std::map<std::u16string, std::uint32_t> contained;  // of a storage
    };

    // The bytes must outlive the reader.
    explicit CompoundFileReader(const Bytes& file);

    SectorSize sectorSize() const { return SectorSize(sectorSize_); }
    const StoredAuid& signature() const { return signature_; }

    static constexpr std::uint32_t kRootIndex = 0;
    const Entry& entry(std::uint32_t index) const { return entries_[index]; }

    // The content of a stream; each stream can be read once.
    Bytes Read(std::uint32_t index);

private:
    void ReadHeader();
    void ReadAllocationTable();
    void ReadDirectory();
    void PlaceEntries(std::uint32_t storage);
    void ReadSmallStreams();

    const std::uint8_t* sector(std::uint32_t number) const;
    void AppendSector(Bytes& out, std::uint32_t number) const;
    std::vector<std::uint32_t> numbers(std::uint32_t number) const;
    std::vector<std::uint32_t> chain(std::uint32_t first);
    std::uint32_t HeaderNumber(std::size_t offset) const;
    void Claim(std::uint32_t number);

    const Bytes& file_;
    StoredAuid signature_{};
    std::uint32_t sectorSize_ = 0;
    std::uint32_t sectorCount_ = 0;
    std::vector<bool> claimed_;
    std::vector<std::uint32_t> table_;  // the sector after each sector
    std::vector<Entry> entries_;
    Bytes small_;  // what the small sectors are cut from
    std::vector<bool> smallClaimed_;
    std::vector<std::uint32_t> smallTable_;
};

}  // namespace aaf::stored
