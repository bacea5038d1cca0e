// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/stored/CompoundDirectory.h"
#include "aaf_library/stored/CompoundFileFormat.h"
#include "aaf_library/stored/Pieces.h"
#include "aaf_library/stored/StoredTree.h"

#include <memory>
#include <optional>
#include <string>
#include <vector>

namespace aaf::stored {

// A storage with all that it contains, short streams alone, to be put into any file.
struct CompoundPart {
    std::shared_ptr<const Bytes> directory;
    std::shared_ptr<const Bytes> small;
    std::vector<std::uint32_t> smallTable;
    // Its entries and sectors count from here. In that place files refer to its bytes; elsewhere
    // they hold a copy with other numbers.
    CompoundPlace place;
};

// Lays a compound file out in memory. Its sectors come in this order: long
// streams as they are added, the short streams as one and their table, the
// directory, the allocation table, the list of its sectors.
// The same calls give the same bytes. Throws StoredError, and TooLargeError as
// soon as it is known that the file would be too large.
class CompoundFileWriter {
public:
    // A storage by the number of its directory entry.
    using Storage = std::uint32_t;
    static constexpr Storage kRoot = 0;

    explicit CompoundFileWriter(SectorSize sectorSize);

    void SetClass(Storage storage, const StoredAuid& classId);
    Storage AddStorage(Storage holder, const std::u16string& name);
    void AddStream(Storage holder, const std::u16string& name, const Bytes& content);

    // With all that the part contains, under a name of its own.
    void AddPart(Storage holder, const std::u16string& name, const CompoundPart& part);

    // Gives the whole file, signature included; once. In pieces, which follow each other, nothing
    // of it is copied once more.
    Bytes Finish();
    std::vector<Piece> FinishPieces();
    // Or the root as a part; none when it holds a long stream.
    std::optional<CompoundPart> FinishPart(CompoundPlace place = {});

private:
    void SetHeader(std::size_t offset, std::size_t value);
    std::uint64_t BytesSoFar();
    void CheckSize(std::uint64_t size) const;
    std::vector<std::uint32_t> TakeSectors(std::size_t count, std::uint32_t mark);
    std::uint32_t NumberSectors(std::size_t size);
    Bytes& PieceWithRoomFor(std::size_t size);
    std::uint32_t AppendSectors(const Bytes& content);
    std::uint32_t AppendSmallSectors(const Bytes& content);
    Bytes SmallTable();
    Bytes Table();

    const std::size_t sectorSize_;
    const std::uint32_t lockSector_;
    const bool large_;
    std::vector<Bytes> pieces_;         // the header, then the long streams
    std::vector<std::uint32_t> table_;  // the sector after each sector
    PiecedBytes small_;                 // the short streams
    std::vector<std::uint32_t> smallTable_;
    CompoundDirectory directory_;
};

}  // namespace aaf::stored
