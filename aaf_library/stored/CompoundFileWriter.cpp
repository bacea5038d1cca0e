// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/stored/CompoundFileWriter.h"

#include "aaf_library/stored/LittleEndian.h"

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

// The entries of a run that begins behind the last one.
void AppendRun(std::vector<std::uint32_t>& table, std::size_t count) {
    const std::size_t first = table.size();
    table.resize(first + std::max<std::size_t>(count, 1));
    for (std::size_t at = first; at < table.size(); ++at) {
        table[at] = static_cast<std::uint32_t>(at + 1);
    }
    table.back() = kEndOfChain;
}

void FillUp(std::vector<std::uint32_t>& numbers, std::size_t perSector) {
    numbers.resize(CountOf(numbers.size(), perSector) * perSector, kFreeSector);
}

}  // namespace

CompoundFileWriter::CompoundFileWriter(SectorSize sectorSize)
    : sectorSize_(static_cast<std::size_t>(sectorSize)),
      large_(sectorSize == SectorSize::Bytes4096),
      file_(sectorSize_) {
    std::uint8_t* const header = file_.data();
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
    const std::uint32_t index = directory_.Add(holder, name, EntryKind::Stream);
    if (!content.empty()) {
        const bool small = content.size() < kSmallStreamLimit;
        directory_.SetContent(index, small ? AppendSmallSectors(content) : AppendSectors(content),
                              content.size());
    }
}

void CompoundFileWriter::AddPart(Storage holder, const std::u16string& name,
                                 const CompoundPart& part) {
    const auto sectorsBefore = static_cast<std::uint32_t>(smallTable_.size());
    if (part.small.size() > small_.size()) {
        // Leaves room for what follows the large part of a file.
        small_.reserve(small_.size() + part.small.size() * 3 / 2);
        smallTable_.reserve(smallTable_.size() + part.smallTable.size() * 3 / 2);
    }
    directory_.AddLinked(holder, name, part.directory, sectorsBefore);
    small_.insert(small_.end(), part.small.begin(), part.small.end());
    smallTable_.insert(smallTable_.end(), part.smallTable.begin(), part.smallTable.end());
    for (std::size_t at = sectorsBefore; at < smallTable_.size(); ++at) {
        std::uint32_t& next = smallTable_[at];
        next = next > kLastPlainSector ? next : next + sectorsBefore;
    }
}

std::optional<CompoundPart> CompoundFileWriter::FinishPart() {
    if (!table_.empty()) {
        return std::nullopt;
    }
    directory_.Link();
    return CompoundPart{std::move(directory_.bytes()), std::move(small_), std::move(smallTable_)};
}

Bytes CompoundFileWriter::Finish() {
    Bytes file;
    for (const Bytes& piece : FinishPieces()) {
        file.insert(file.end(), piece.begin(), piece.end());
    }
    return file;
}

std::vector<Bytes> CompoundFileWriter::FinishPieces() {
    directory_.Link();
    if (!small_.empty()) {
        directory_.SetContent(kRoot, NumberSectors(small_.size()), small_.size());
    }
    Bytes smallTable = SmallTable();
    directory_.FillUp(sectorSize_);
    Bytes& directory = directory_.bytes();
    SetHeader(kFirstDirectoryOffset, NumberSectors(directory.size()));
    SetHeader(kDirectoryCountOffset, large_ ? directory.size() / sectorSize_ : 0);
    Bytes table = Table();
    small_.resize(CountOf(small_.size(), sectorSize_) * sectorSize_);
    std::vector<Bytes> pieces;
    for (Bytes* const piece : {&file_, &small_, &smallTable, &directory, &table}) {
        pieces.push_back(std::move(*piece));
    }
    return pieces;
}

void CompoundFileWriter::SetHeader(std::size_t offset, std::size_t value) {
    PutNumber(file_.data() + offset, static_cast<std::uint32_t>(value));
}

// Gives the number of the first sector.
std::uint32_t CompoundFileWriter::NumberSectors(std::size_t size) {
    const auto first = static_cast<std::uint32_t>(table_.size());
    AppendRun(table_, CountOf(size, sectorSize_));
    return first;
}

std::uint32_t CompoundFileWriter::AppendSectors(const Bytes& content) {
    const std::uint32_t first = NumberSectors(content.size());
    file_.insert(file_.end(), content.begin(), content.end());
    file_.resize((table_.size() + 1) * sectorSize_);
    return first;
}

std::uint32_t CompoundFileWriter::AppendSmallSectors(const Bytes& content) {
    const auto first = static_cast<std::uint32_t>(smallTable_.size());
    AppendRun(smallTable_, CountOf(content.size(), kSmallSectorSize));
    small_.insert(small_.end(), content.begin(), content.end());
    small_.resize(smallTable_.size() * kSmallSectorSize);
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
    const std::size_t used = table_.size();
    std::size_t tables = 0;
    std::size_t lists = 0;
    for (std::size_t wanted = 1; tables < wanted;) {
        tables = wanted;
        lists = CountOf(tables - std::min<std::size_t>(tables, kHeaderTableCount), perSector - 1);
        wanted = CountOf(used + tables + lists, perSector);
    }
    table_.insert(table_.end(), tables, kTableSector);
    table_.insert(table_.end(), lists, kTableListSector);
    FillUp(table_, perSector);
    std::vector<std::uint32_t> list(kHeaderTableCount + lists * perSector, kFreeSector);
    std::size_t at = 0;
    for (std::size_t i = 0; i < tables; ++i) {
        list[at] = static_cast<std::uint32_t>(used + i);
        ++at;
        // The last number of a sector of the list leads to the next one.
        if (at > kHeaderTableCount && (at - kHeaderTableCount) % perSector == perSector - 1) {
            const std::size_t next = used + tables + (at - kHeaderTableCount) / perSector + 1;
            list[at] = static_cast<std::uint32_t>(next);
            ++at;
        }
    }
    if (lists > 0) {
        list.back() = kEndOfChain;
    }
    SetHeader(kTableCountOffset, tables);
    SetHeader(kFirstTableListOffset, lists == 0 ? kEndOfChain : used + tables);
    SetHeader(kTableListCountOffset, lists);

    Bytes table = NumberBytes(table_);
    const Bytes listed = NumberBytes(list);
    const auto behindHeader = listed.begin() + kHeaderTableCount * 4;
    std::copy(listed.begin(), behindHeader, file_.begin() + kTableListOffset);
    table.insert(table.end(), behindHeader, listed.end());
    return table;
}

}  // namespace aaf::stored
