// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/stored/CompoundFileFormat.h"
#include "aaf_library/stored/Pieces.h"
#include "aaf_library/stored/StoredTree.h"

#include <array>
#include <string>
#include <vector>

namespace aaf::stored {

// Where numbers of entries and of small sectors begin.
struct CompoundPlace {
    std::uint32_t entry = 0;
    std::uint32_t sector = 0;
};
inline bool operator==(const CompoundPlace& left, const CompoundPlace& right) {
    return left.entry == right.entry && left.sector == right.sector;
}

// The directory of a compound file that is written. An entry is known by its number, the root by 0.
// Throws StoredError.
class CompoundDirectory {
public:
    std::uint32_t Add(std::uint32_t holder, const std::u16string& name, EntryKind kind);
    void SetClass(std::uint32_t index, const StoredAuid& classId);
    void SetContent(std::uint32_t index, std::uint32_t start, std::size_t size);

    // Adds a storage that holds what the root of another directory does, which is linked and whose
    // numbers count from its place. Its streams begin behind so many small sectors.
    void AddLinked(std::uint32_t holder, const std::u16string& name,
                   const std::shared_ptr<const Bytes>& linked, CompoundPlace place,
                   std::uint32_t sectorsBefore);

    // The number of the next entry.
    std::uint32_t Count() const;

    // Makes a search tree of the entries of each storage; once, when all are there.
    void Link();

    // With spare entries until it fills whole pieces of that size.
    void FillUp(std::size_t pieceSize);

    // Instead of a file: numbers count from this place. Nothing in it is shared.
    Bytes TakeFrom(CompoundPlace place);

    // Entry after entry, as they stand in the file.
    PiecedBytes& bytes() { return bytes_; }

private:
    // An entry among those of its storage.
    struct Place {
        std::uint32_t holder = 0;
        std::uint32_t index = 0;
        std::size_t length = 0;
        std::array<char16_t, kLongestName> name{};  // in upper case
    };
    using Places = std::vector<const Place*>;

    static int Order(const Place& left, const Place& right);
    std::uint8_t* EntryAt(std::uint32_t index);
    std::u16string NameOf(std::uint32_t index);
    Places InOrder() const;
    void RefuseTwins(const Places& sorted);
    std::uint32_t LinkTree(const Place* const* first, std::size_t count, int blackLevels);

    PiecedBytes bytes_;
    std::vector<Place> places_;
};

}  // namespace aaf::stored
