// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/stored/CompoundFileReader.h"

#include "aaf_library/stored/LittleEndian.h"

#include <algorithm>

namespace aaf::stored {

namespace {

constexpr std::size_t kLongestNameBytes = 2 * (kLongestName + 1);  // with the terminator

CompoundFileReader::Entry ParseEntry(const std::uint8_t* bytes) {
    CompoundFileReader::Entry entry;
    ByteReader from(bytes, kDirectoryEntrySize);
    const Bytes units = from.TakeBytes(kLongestNameBytes);
    const auto length = from.TakeNumber<std::uint16_t>();
    entry.kind = CompoundFileReader::Kind(from.TakeNumber<std::uint8_t>());
    if (entry.kind == CompoundFileReader::Kind::Unused) {
        return entry;
    }
    if (length < 4 || length > kLongestNameBytes || length % 2 != 0) {
        throw StoredError("a directory entry with a name of " + std::to_string(length) + " bytes");
    }
    entry.name = ByteReader(units.data(), length).TakeText();
    from.TakeNumber<std::uint8_t>();  // the colour in the search tree, which nobody needs
    entry.left = from.TakeNumber<std::uint32_t>();
    entry.right = from.TakeNumber<std::uint32_t>();
    entry.child = from.TakeNumber<std::uint32_t>();
    const Bytes classId = from.TakeBytes(entry.classId.size());
    std::copy(classId.begin(), classId.end(), entry.classId.begin());
    from.TakeBytes(4 + 8 + 8);  // user flags and times
    entry.start = from.TakeNumber<std::uint32_t>();
    entry.size = from.TakeNumber<std::uint64_t>();
    return entry;
}

}  // namespace

CompoundFileReader::CompoundFileReader(const Bytes& file) : file_(file) {
    ReadHeader();
    ReadAllocationTable();
    ReadDirectory();
    ReadSmallStreams();
}

void CompoundFileReader::ReadHeader() {
    if (file_.size() < kHeaderSize ||
        !std::equal(std::begin(kCompoundMagic), std::end(kCompoundMagic), file_.begin())) {
        throw StoredError("is no compound file");
    }
    std::copy_n(file_.begin() + kSignatureOffset, signature_.size(), signature_.begin());
    ByteReader from(file_.data() + kByteOrderOffset, 6);
    const auto order = from.TakeNumber<std::uint16_t>();
    const auto shift = from.TakeNumber<std::uint16_t>();
    const auto smallShift = from.TakeNumber<std::uint16_t>();
    if (order != kByteOrderMark || (shift != 9 && shift != 12) || smallShift != kSmallSectorShift ||
        HeaderNumber(kSmallLimitOffset) != kSmallStreamLimit) {
        throw StoredError("a kind of compound file that AAF does not use");
    }
    sectorSize_ = 1u << shift;
    const std::size_t count = file_.size() / sectorSize_;
    if (count < 2 || count > kLastPlainSector) {
        throw StoredError("the file ends after its header");
    }
    sectorCount_ = static_cast<std::uint32_t>(count - 1);
    claimed_.resize(sectorCount_);
}

void CompoundFileReader::ReadAllocationTable() {
    const std::uint32_t perSector = sectorSize_ / 4;
    const std::uint32_t wanted = HeaderNumber(kTableCountOffset);
    if (wanted > sectorCount_) {
        throw StoredError("the header counts " + std::to_string(wanted) + " table sectors, " +
                          std::to_string(sectorCount_) + " sectors are in the file");
    }
    std::vector<std::uint32_t> listed;
    for (std::uint32_t i = 0; i < std::min(wanted, kHeaderTableCount); ++i) {
        listed.push_back(HeaderNumber(kTableListOffset + 4 * i));
    }
    std::uint32_t at = HeaderNumber(kFirstTableListOffset);
    while (listed.size() < wanted) {
        Claim(at);
        const std::vector<std::uint32_t> more = numbers(at);
        for (std::uint32_t i = 0; i + 1 < perSector && listed.size() < wanted; ++i) {
            listed.push_back(more[i]);
        }
        at = more.back();
    }
    table_.reserve(std::size_t{wanted} * perSector);
    for (std::uint32_t number : listed) {
        Claim(number);
        const std::vector<std::uint32_t> part = numbers(number);
        table_.insert(table_.end(), part.begin(), part.end());
    }
    // An entry is only looked up for a sector of the file.
    table_.resize(sectorCount_, kFreeSector);
}

void CompoundFileReader::ReadDirectory() {
    for (std::uint32_t number : chain(HeaderNumber(kFirstDirectoryOffset))) {
        for (std::size_t at = 0; at < sectorSize_; at += kDirectoryEntrySize) {
            entries_.push_back(ParseEntry(sector(number) + at));
        }
    }
    if (entries_.empty() || entries_.front().kind != Kind::Root) {
        throw StoredError("the directory has no root");
    }
    entries_.front().placed = true;
    std::vector<std::uint32_t> storages = {kRootIndex};
    while (!storages.empty()) {
        const std::uint32_t storage = storages.back();
        storages.pop_back();
        PlaceEntries(storage);
        for (const auto& contained : entries_[storage].contained) {
            if (entries_[contained.second].kind == Kind::Storage) {
                storages.push_back(contained.second);
            }
        }
    }
}

// The entries of a storage are the nodes of a search tree; its order is not
// relied on.
void CompoundFileReader::PlaceEntries(std::uint32_t storage) {
    std::vector<std::uint32_t> open = {entries_[storage].child};
    while (!open.empty()) {
        const std::uint32_t index = open.back();
        open.pop_back();
        if (index == kFreeSector) {
            continue;
        }
        if (index >= entries_.size() || entries_[index].placed) {
            throw StoredError("the directory names an entry twice or one that it does not have");
        }
        Entry& entry = entries_[index];
        if (entry.kind != Kind::Storage && entry.kind != Kind::Stream) {
            throw StoredError("a directory entry of unknown kind");
        }
        entry.placed = true;
        if (!entries_[storage].contained.emplace(entry.name, index).second) {
            throw StoredError("the directory has a name twice in one storage");
        }
        open.push_back(entry.left);
        open.push_back(entry.right);
    }
}

void CompoundFileReader::ReadSmallStreams() {
    const std::uint32_t tableStart = HeaderNumber(kFirstSmallTableOffset);
    if (tableStart == kFreeSector || entries_.front().size == 0) {
        return;
    }
    for (std::uint32_t number : chain(tableStart)) {
        const std::vector<std::uint32_t> part = numbers(number);
        smallTable_.insert(smallTable_.end(), part.begin(), part.end());
    }
    for (std::uint32_t number : chain(entries_.front().start)) {
        AppendSector(small_, number);
    }
    if (entries_.front().size > small_.size()) {
        throw StoredError("the small sectors end early");
    }
    smallClaimed_.resize(small_.size() / kSmallSectorSize);
    smallTable_.resize(smallClaimed_.size(), kFreeSector);
}

Bytes CompoundFileReader::Read(std::uint32_t index) {
    const Entry& entry = entries_[index];
    // Half of the size field may hold anything in files with small sectors.
    const std::uint64_t size = sectorSize_ == 512 ? entry.size & 0xFFFFFFFF : entry.size;
    Bytes content;
    if (size == 0) {
        return content;
    }
    if (size > file_.size()) {
        throw StoredError("a stream claims " + std::to_string(size) + " bytes");
    }
    if (size >= kSmallStreamLimit) {
        std::uint32_t at = entry.start;
        while (content.size() < size) {
            Claim(at);
            AppendSector(content, at);
            at = table_[at];
        }
    } else {
        std::uint32_t at = entry.start;
        while (content.size() < size) {
            if (at >= smallClaimed_.size() || smallClaimed_[at]) {
                throw StoredError("a stream runs into a small sector that is not its own");
            }
            smallClaimed_[at] = true;
            const auto from = small_.begin() + std::ptrdiff_t{at} * kSmallSectorSize;
            content.insert(content.end(), from, from + kSmallSectorSize);
            at = smallTable_[at];
        }
    }
    content.resize(static_cast<std::size_t>(size));
    return content;
}

const std::uint8_t* CompoundFileReader::sector(std::uint32_t number) const {
    return file_.data() + (std::size_t{number} + 1) * sectorSize_;
}

void CompoundFileReader::AppendSector(Bytes& out, std::uint32_t number) const {
    out.insert(out.end(), sector(number), sector(number) + sectorSize_);
}

std::vector<std::uint32_t> CompoundFileReader::numbers(std::uint32_t number) const {
    std::vector<std::uint32_t> out;
    out.reserve(sectorSize_ / 4);
    for (std::size_t at = 0; at < sectorSize_; at += 4) {
        out.push_back(NumberIn(sector(number) + at));
    }
    return out;
}

std::vector<std::uint32_t> CompoundFileReader::chain(std::uint32_t first) {
    std::vector<std::uint32_t> out;
    for (std::uint32_t at = first; at != kEndOfChain; at = table_[at]) {
        Claim(at);
        out.push_back(at);
    }
    return out;
}

std::uint32_t CompoundFileReader::HeaderNumber(std::size_t offset) const {
    return NumberIn(file_.data() + offset);
}

void CompoundFileReader::Claim(std::uint32_t number) {
    if (number >= sectorCount_) {
        throw StoredError("sector " + std::to_string(number) + " lies beyond the end of the file");
    }
    if (claimed_[number]) {
        throw StoredError("sector " + std::to_string(number) + " is used twice");
    }
    claimed_[number] = true;
}

}  // namespace aaf::stored
