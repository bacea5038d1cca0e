// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/stored/CompoundFileWriter.h"

#include "aaf_library/stored/CompoundFileLimits.h"
#include "aaf_library/stored/LittleEndian.h"
#include "aaf_library/stored/StoredError.h"

#include <algorithm>
#include <utility>

namespace aaf::stored {

namespace {

Bytes NumberBytes(const std::vector<std::uint32_t>& numbers) {
    Bytes bytes(numbers.size() * 4);
    std::uint8_t* at = bytes.data();
    for (std::uint32_t number : numbers) {
        PutNumber(at, number);
        at += 4;
    }
    return bytes;
}

std::size_t CountOf(std::size_t size, std::size_t part) {
    return (size + part - 1) / part;
}

void FillUp(std::vector<std::uint32_t>& numbers, std::size_t perSector) {
    numbers.resize(CountOf(numbers.size(), perSector) * perSector, kFreeSector);
}

void FillUp(Bytes& bytes, std::size_t sectorSize) {
    bytes.resize(CountOf(bytes.size(), sectorSize) * sectorSize);
}

// Adds a distance to the numbers of sectors from one of them on.
void MoveLinks(std::vector<std::uint32_t>& table, std::size_t from, std::uint32_t distance) {
    for (std::size_t at = from; distance != 0 && at < table.size(); ++at) {
        table[at] = table[at] > kLastPlainSector ? table[at] : table[at] + distance;
    }
}

// Puts zeros between pieces, or into one that reaches beyond that place.
void OpenGap(std::vector<Piece>& pieces, std::size_t place, std::size_t size) {
    for (auto piece = pieces.begin(); piece != pieces.end(); ++piece) {
        if (place < piece->size) {
            Piece behind = *piece;
            behind.data += place;
            behind.size -= place;
            piece->size = place;
            pieces.insert(piece + 1, {Piece(Bytes(size)), std::move(behind)});
            return;
        }
        place -= piece->size;
    }
}

}  // namespace

CompoundFileWriter::CompoundFileWriter(SectorSize sectorSize)
    : sectorSize_(static_cast<std::size_t>(sectorSize)),
      lockSector_(LockSector(sectorSize)),
      large_(sectorSize == SectorSize::Bytes4096),
      pieces_{Bytes(sectorSize_)} {
    std::uint8_t* const header = pieces_.front().data();
    std::copy(std::begin(kCompoundMagic), std::end(kCompoundMagic), header);
    const StoredAuid& signature = large_ ? kSignature4096 : kSignature512;
    std::copy(signature.begin(), signature.end(), header + kSignatureOffset);
    PutNumber(header + kMinorVersionOffset, kMinorVersion);
    PutNumber(header + kMajorVersionOffset, std::uint16_t(large_ ? 4 : 3));
    PutNumber(header + kByteOrderOffset, kByteOrderMark);
    PutNumber(header + kSectorShiftOffset, std::uint16_t(large_ ? 12 : 9));
    PutNumber(header + kSmallSectorShiftOffset, kSmallSectorShift);
    SetHeader(kSmallLimitOffset, kSmallStreamLimit);
    directory_.Add(kRoot, u"Root Entry", EntryKind::Root);
}

void CompoundFileWriter::SetClass(Storage storage, const StoredAuid& classId) {
    directory_.SetClass(storage, classId);
}

CompoundFileWriter::Storage CompoundFileWriter::AddStorage(Storage holder,
                                                           const std::u16string& name) {
    return directory_.Add(holder, name, EntryKind::Storage);
}

void CompoundFileWriter::AddStream(Storage holder, const std::u16string& name,
                                   const Bytes& content) {
    CheckSize(BytesSoFar() + content.size());
    const std::uint32_t index = directory_.Add(holder, name, EntryKind::Stream);
    if (!content.empty()) {
        const bool small = content.size() < kSmallStreamLimit;
        directory_.SetContent(index, small ? AppendSmallSectors(content) : AppendSectors(content),
                              content.size());
    }
}

void CompoundFileWriter::AddPart(Storage holder, const std::u16string& name,
                                 const CompoundPart& part) {
    CheckSize(BytesSoFar() + part.small->size() + part.directory->size());
    const auto sectorsBefore = static_cast<std::uint32_t>(smallTable_.size());
    const bool isInPlace = part.place == CompoundPlace{directory_.Count(), sectorsBefore};
    directory_.AddLinked(holder, name, part.directory, part.place, sectorsBefore);
    if (isInPlace) {
        small_.Share(part.small, 0);
        // As much room as there is for the streams.
        smallTable_.reserve(smallTable_.size() + part.smallTable.size() * 5 / 4);
    } else {
        Bytes& own = small_.own();
        own.insert(own.end(), part.small->begin(), part.small->end());
    }
    smallTable_.insert(smallTable_.end(), part.smallTable.begin(), part.smallTable.end());
    MoveLinks(smallTable_, sectorsBefore, sectorsBefore - part.place.sector);
}

std::optional<CompoundPart> CompoundFileWriter::FinishPart(CompoundPlace place) {
    if (!table_.empty()) {
        return std::nullopt;
    }
    directory_.Link();
    MoveLinks(smallTable_, 0, place.sector);
    return CompoundPart{std::make_shared<const Bytes>(directory_.TakeFrom(place)),
                        std::make_shared<const Bytes>(std::move(small_.own())),
                        std::move(smallTable_), place};
}

Bytes CompoundFileWriter::Finish() {
    Bytes file;
    for (const Piece& piece : FinishPieces()) {
        file.insert(file.end(), piece.data, piece.data + piece.size);
    }
    return file;
}

std::vector<Piece> CompoundFileWriter::FinishPieces() {
    directory_.Link();
    if (small_.size() != 0) {
        directory_.SetContent(kRoot, NumberSectors(small_.size()), small_.size());
    }
    Bytes smallTable = SmallTable();
    directory_.FillUp(sectorSize_);
    PiecedBytes& directory = directory_.bytes();
    SetHeader(kFirstDirectoryOffset, NumberSectors(directory.size()));
    SetHeader(kDirectoryCountOffset, large_ ? directory.size() / sectorSize_ : 0);
    Bytes table = Table();
    small_.own().resize(small_.own().size() + CountOf(small_.size(), sectorSize_) * sectorSize_ -
                        small_.size());
    std::vector<Piece> pieces;
    for (Bytes& piece : pieces_) {
        pieces.emplace_back(std::move(piece));
    }
    small_.MoveTo(pieces);
    pieces.emplace_back(std::move(smallTable));
    directory.MoveTo(pieces);
    pieces.emplace_back(std::move(table));
    if (lockSector_ != kFreeSector) {
        OpenGap(pieces, (lockSector_ + std::size_t{1}) * sectorSize_, sectorSize_);
    }
    return pieces;
}

void CompoundFileWriter::SetHeader(std::size_t offset, std::size_t value) {
    PutNumber(pieces_.front().data() + offset, static_cast<std::uint32_t>(value));
}

std::uint64_t CompoundFileWriter::BytesSoFar() {
    return (std::uint64_t{table_.size()} + 1) * sectorSize_ + small_.size() +
           directory_.bytes().size();
}

void CompoundFileWriter::CheckSize(std::uint64_t size) const {
    const auto sectorSize = static_cast<SectorSize>(sectorSize_);
    const std::uint64_t most = LargestFile(sectorSize);
    if (size <= most) {
        return;
    }
    std::string text = "takes more than " + std::to_string(most) +
                       " bytes, the most that a file with sectors of " +
                       std::to_string(sectorSize_) + " bytes may have";
    if (!large_) {
        text += "; one with sectors of 4096 bytes may have " +
                std::to_string(LargestFile(SectorSize::Bytes4096));
    }
    throw TooLargeError(text);
}

// Gives the numbers of the next sectors, each of which is marked so in the table.
std::vector<std::uint32_t> CompoundFileWriter::TakeSectors(std::size_t count, std::uint32_t mark) {
    std::vector<std::uint32_t> numbers(count);
    for (std::uint32_t& number : numbers) {
        if (table_.size() == lockSector_) {
            table_.push_back(kEndOfChain);
        }
        number = static_cast<std::uint32_t>(table_.size());
        table_.push_back(mark);
    }
    return numbers;
}

// Gives the number of the first sector.
std::uint32_t CompoundFileWriter::NumberSectors(std::size_t size) {
    const std::vector<std::uint32_t> chain = TakeSectors(CountOf(size, sectorSize_), kEndOfChain);
    for (std::size_t i = 1; i < chain.size(); ++i) {
        table_[chain[i - 1]] = chain[i];
    }
    return chain.front();
}

// Pieces grow with the file up to a mebibyte, and nothing in them is moved.
Bytes& CompoundFileWriter::PieceWithRoomFor(std::size_t size) {
    const Bytes& last = pieces_.back();
    if (last.capacity() - last.size() < size) {
        constexpr std::size_t most = 1 << 20;
        pieces_.emplace_back().reserve(std::max(size, std::min(most, table_.size() * sectorSize_)));
    }
    return pieces_.back();
}

std::uint32_t CompoundFileWriter::AppendSectors(const Bytes& content) {
    Bytes& piece = PieceWithRoomFor(CountOf(content.size(), sectorSize_) * sectorSize_);
    piece.insert(piece.end(), content.begin(), content.end());
    FillUp(piece, sectorSize_);
    return NumberSectors(content.size());
}

std::uint32_t CompoundFileWriter::AppendSmallSectors(const Bytes& content) {
    const auto first = static_cast<std::uint32_t>(smallTable_.size());
    const auto end = first + static_cast<std::uint32_t>(CountOf(content.size(), kSmallSectorSize));
    for (std::uint32_t next = first + 1; next < end; ++next) {
        smallTable_.push_back(next);
    }
    smallTable_.push_back(kEndOfChain);
    Bytes& own = small_.own();
    own.insert(own.end(), content.begin(), content.end());
    own.resize(own.size() + CountOf(content.size(), kSmallSectorSize) * kSmallSectorSize -
               content.size());
    return first;
}

Bytes CompoundFileWriter::SmallTable() {
    FillUp(smallTable_, sectorSize_ / 4);
    Bytes table = NumberBytes(smallTable_);
    SetHeader(kFirstSmallTableOffset, table.empty() ? kEndOfChain : NumberSectors(table.size()));
    SetHeader(kSmallTableCountOffset, table.size() / sectorSize_);
    return table;
}

// The table has entries for its own sectors, too, and for those of the list
// that goes on where the header's list of its sectors is full. That list comes
// with it.
Bytes CompoundFileWriter::Table() {
    const std::size_t perSector = sectorSize_ / 4;
    // The last number of a sector of the list leads to the next one.
    const std::size_t perList = perSector - 1;
    const std::size_t used = table_.size();
    std::size_t tableCount = 0;
    std::size_t listCount = 0;
    for (std::size_t wanted = 1; tableCount < wanted;) {
        tableCount = wanted;
        listCount =
            CountOf(tableCount - std::min<std::size_t>(tableCount, kHeaderTableCount), perList);
        const std::size_t end = used + tableCount + listCount;
        const bool isLockAmongThem = used <= lockSector_ && lockSector_ < end;
        wanted = CountOf(end + (isLockAmongThem ? 1 : 0), perSector);
    }
    const std::vector<std::uint32_t> tables = TakeSectors(tableCount, kTableSector);
    const std::vector<std::uint32_t> lists = TakeSectors(listCount, kTableListSector);
    CheckSize((std::uint64_t{table_.size()} + 1) * sectorSize_);
    FillUp(table_, perSector);

    std::vector<std::uint32_t> list(kHeaderTableCount + listCount * perSector, kFreeSector);
    for (std::size_t i = 0; i < tableCount; ++i) {
        const std::size_t linksBefore =
            i < kHeaderTableCount ? 0 : (i - kHeaderTableCount) / perList;
        list[i + linksBefore] = tables[i];
    }
    for (std::size_t i = 0; i < listCount; ++i) {
        list[kHeaderTableCount + i * perSector + perList] =
            i + 1 < listCount ? lists[i + 1] : kEndOfChain;
    }
    SetHeader(kTableCountOffset, tableCount);
    SetHeader(kFirstTableListOffset, lists.empty() ? kEndOfChain : lists.front());
    SetHeader(kTableListCountOffset, listCount);

    Bytes table = NumberBytes(table_);
    const Bytes listed = NumberBytes(list);
    const auto behindHeader = listed.begin() + kHeaderTableCount * 4;
    std::copy(listed.begin(), behindHeader, pieces_.front().begin() + kTableListOffset);
    table.insert(table.end(), behindHeader, listed.end());
    return table;
}

}  // namespace aaf::stored
