// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/stored/CompoundFileWriter.h"

#include "aaf_library/stored/LittleEndian.h"
#include "aaf_library/stored/StoredError.h"
#include "aaf_library/stored/StoredNames.h"
#include "aaf_library/stored/UpperCase.h"

#include <algorithm>
#include <string_view>
#include <utility>

namespace aaf::stored {

namespace {

bool IsInNoName(char16_t unit) {
    return unit == u'/' || unit == u'\\' || unit == u':' || unit == u'!' || unit == u'\0';
}

void CheckName(const std::u16string& name) {
    if (name.empty() || name.size() > kLongestName ||
        std::any_of(name.begin(), name.end(), IsInNoName)) {
        throw StoredError("\"" + ToUtf8(name) + "\" cannot be the name of a storage or stream");
    }
}

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
    AddEntry(kRoot, u"Root Entry", EntryKind::Root);
}

void CompoundFileWriter::SetClass(Storage storage, const StoredAuid& classId) {
    std::copy(classId.begin(), classId.end(), EntryAt(storage) + kEntryClassOffset);
}

CompoundFileWriter::Storage CompoundFileWriter::AddStorage(Storage holder,
                                                           const std::u16string& name) {
    return AddEntry(holder, name, EntryKind::Storage);
}

void CompoundFileWriter::AddStream(Storage holder, const std::u16string& name,
                                   const Bytes& content) {
    const std::uint32_t index = AddEntry(holder, name, EntryKind::Stream);
    if (!content.empty()) {
        const bool small = content.size() < kSmallStreamLimit;
        SetContent(index, small ? AppendSmallSectors(content) : AppendSectors(content),
                   content.size());
    }
}

void CompoundFileWriter::AddPart(Storage holder, const std::u16string& name,
                                 const CompoundPart& part) {
    const Storage storage = AddEntry(holder, name, EntryKind::Storage);
    const auto sectorsBefore = static_cast<std::uint32_t>(smallTable_.size());
    if (part.directory.size() > directory_.size()) {
        // Leaves room for what follows the large part of a file.
        directory_.reserve(part.directory.size() * 3 / 2);
        small_.reserve(small_.size() + part.small.size() * 3 / 2);
        smallTable_.reserve(smallTable_.size() + part.smallTable.size() * 3 / 2);
    }
    // Its root becomes this storage, and its other entries stand behind it.
    directory_.insert(directory_.end(), part.directory.begin() + kDirectoryEntrySize,
                      part.directory.end());
    const std::uint8_t* const root = part.directory.data();
    std::copy_n(root + kEntryClassOffset, sizeof(StoredAuid), EntryAt(storage) + kEntryClassOffset);
    std::copy_n(root + kEntryChildOffset, 4, EntryAt(storage) + kEntryChildOffset);
    const auto moveBy = [](std::uint8_t* at, std::uint32_t distance) {
        const std::uint32_t number = NumberIn(at);
        PutNumber(at, number > kLastPlainSector ? number : number + distance);
    };
    for (std::size_t at = storage * kDirectoryEntrySize; at < directory_.size();
         at += kDirectoryEntrySize) {
        std::uint8_t* const entry = directory_.data() + at;
        moveBy(entry + kEntryRightOffset, storage);
        moveBy(entry + kEntryChildOffset, storage);
        moveBy(entry + kEntryStartOffset, sectorsBefore);
    }
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
    LinkSiblings();
    return CompoundPart{std::move(directory_), std::move(small_), std::move(smallTable_)};
}

Bytes CompoundFileWriter::Finish() {
    Bytes file;
    for (const Bytes& piece : FinishPieces()) {
        file.insert(file.end(), piece.begin(), piece.end());
    }
    return file;
}

std::vector<Bytes> CompoundFileWriter::FinishPieces() {
    LinkSiblings();
    if (!small_.empty()) {
        SetContent(kRoot, NumberSectors(small_.size()), small_.size());
    }
    Bytes smallTable = SmallTable();
    SetHeader(kFirstDirectoryOffset, NumberSectors(directory_.size()));
    SetHeader(kDirectoryCountOffset, large_ ? CountOf(directory_.size(), sectorSize_) : 0);
    Bytes table = Table();
    for (Bytes* const piece : {&small_, &directory_}) {
        piece->resize(CountOf(piece->size(), sectorSize_) * sectorSize_);
    }
    std::vector<Bytes> pieces;
    for (Bytes* const piece : {&file_, &small_, &smallTable, &directory_, &table}) {
        pieces.push_back(std::move(*piece));
    }
    return pieces;
}

std::uint32_t CompoundFileWriter::AddEntry(Storage holder, const std::u16string& name,
                                           EntryKind kind) {
    CheckName(name);
    const auto index = static_cast<std::uint32_t>(directory_.size() / kDirectoryEntrySize);
    Place& place = places_.emplace_back();
    place.holder = holder;
    place.length = name.size();
    std::transform(name.begin(), name.end(), place.name.begin(), UpperCase);
    place.index = index;

    directory_.resize(directory_.size() + kDirectoryEntrySize);
    std::uint8_t* const entry = EntryAt(index);
    for (std::size_t i = 0; i < name.size(); ++i) {
        PutNumber(entry + 2 * i, name[i]);
    }
    PutNumber(entry + kEntryNameSizeOffset, static_cast<std::uint16_t>(2 * name.size() + 2));
    PutNumber(entry + kEntryKindOffset, static_cast<std::uint8_t>(kind));
    PutNumber(entry + kEntryColourOffset, kBlack);
    for (std::size_t link : {kEntryLeftOffset, kEntryRightOffset, kEntryChildOffset}) {
        PutNumber(entry + link, kNoEntry);
    }
    SetContent(index, kEndOfChain, 0);
    return index;
}

std::uint8_t* CompoundFileWriter::EntryAt(std::uint32_t index) {
    return directory_.data() + index * kDirectoryEntrySize;
}

std::u16string CompoundFileWriter::NameOf(std::uint32_t index) {
    const std::uint8_t* const entry = EntryAt(index);
    ByteReader size(entry + kEntryNameSizeOffset, 2);
    std::u16string name(size.TakeNumber<std::uint16_t>() / 2 - 1, u'\0');
    ByteReader units(entry, 2 * name.size());
    for (char16_t& unit : name) {
        unit = units.TakeNumber<std::uint16_t>();
    }
    return name;
}

void CompoundFileWriter::SetContent(std::uint32_t index, std::uint32_t start, std::size_t size) {
    PutNumber(EntryAt(index) + kEntryStartOffset, start);
    PutNumber(EntryAt(index) + kEntrySizeOffset, std::uint64_t{size});
}

void CompoundFileWriter::SetHeader(std::size_t offset, std::size_t value) {
    PutNumber(file_.data() + offset, static_cast<std::uint32_t>(value));
}

// The entries of a storage are a search tree by length of name, then by its
// text in upper case. Each is the right neighbour of the one before and all
// are black: the simplest tree that the format allows.
void CompoundFileWriter::LinkSiblings() {
    const auto order = [](const Place& left, const Place& right) {
        if (left.holder != right.holder) {
            return left.holder < right.holder ? -1 : 1;
        }
        if (left.length != right.length) {
            return left.length < right.length ? -1 : 1;
        }
        return std::u16string_view(left.name.data(), left.length)
            .compare(std::u16string_view(right.name.data(), right.length));
    };
    std::vector<const Place*> sorted;
    sorted.reserve(places_.size());
    for (std::size_t i = 1; i < places_.size(); ++i) {
        sorted.push_back(&places_[i]);
    }
    std::sort(sorted.begin(), sorted.end(),
              [&](const Place* left, const Place* right) { return order(*left, *right) < 0; });
    const Place* before = nullptr;
    for (const Place* const place : sorted) {
        const bool first = before == nullptr || before->holder != place->holder;
        if (!first && order(*before, *place) == 0) {
            throw StoredError("\"" + ToUtf8(NameOf(std::max(before->index, place->index))) +
                              "\" is twice in one storage");
        }
        PutNumber(first ? EntryAt(place->holder) + kEntryChildOffset
                        : EntryAt(before->index) + kEntryRightOffset,
                  place->index);
        before = place;
    }
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
