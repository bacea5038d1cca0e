// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/stored/CompoundDirectory.h"

#include "aaf_library/stored/LittleEndian.h"
#include "aaf_library/stored/StoredError.h"
#include "aaf_library/stored/StoredNames.h"
#include "aaf_library/stored/UpperCase.h"

#include <algorithm>
#include <numeric>
#include <string_view>

namespace aaf::stored {

namespace {

// Most units are letters, which lie behind these.
constexpr auto IsInNoName = [](char16_t unit) {
    return unit <= u'\\' &&
           (unit == u'/' || unit == u'\\' || unit == u':' || unit == u'!' || unit == u'\0');
};

void CheckName(const std::u16string& name) {
    if (name.empty() || name.size() > kLongestName ||
        std::any_of(name.begin(), name.end(), IsInNoName)) {
        throw StoredError("\"" + ToUtf8(name) + "\" cannot be the name of a storage or stream");
    }
}

void LeadNowhere(std::uint8_t* entry) {
    for (std::size_t link : {kEntryLeftOffset, kEntryRightOffset, kEntryChildOffset}) {
        PutNumber(entry + link, kNoEntry);
    }
}

// Adds distances to the numbers of entries and of sectors in these entries.
void MoveNumbers(Bytes& entries, std::size_t from, CompoundPlace by) {
    const auto move = [](std::uint8_t* at, std::uint32_t distance) {
        const std::uint32_t number = NumberIn(at);
        PutNumber(at, number > kLastPlainSector ? number : number + distance);
    };
    for (std::size_t at = from; at < entries.size(); at += kDirectoryEntrySize) {
        std::uint8_t* const entry = entries.data() + at;
        move(entry + kEntryLeftOffset, by.entry);
        move(entry + kEntryRightOffset, by.entry);
        move(entry + kEntryChildOffset, by.entry);
        if (entry[kEntryKindOffset] == static_cast<std::uint8_t>(EntryKind::Stream)) {
            move(entry + kEntryStartOffset, by.sector);
        }
    }
}

// How many levels of a tree of the least height are full.
int FullLevels(std::size_t count) {
    int levels = 0;
    while (count >= (std::size_t{2} << levels) - 1) {
        ++levels;
    }
    return levels;
}

}  // namespace

std::uint32_t CompoundDirectory::Add(std::uint32_t holder, const std::u16string& name,
                                     EntryKind kind) {
    CheckName(name);
    const std::uint32_t index = Count();
    Place& place = places_.emplace_back();
    place.holder = holder;
    place.index = index;
    place.length = name.size();

    Bytes& own = bytes_.own();
    own.resize(own.size() + kDirectoryEntrySize);
    std::uint8_t* const entry = own.data() + own.size() - kDirectoryEntrySize;
    for (std::size_t i = 0; i < name.size(); ++i) {
        PutNumber(entry + 2 * i, name[i]);
        place.name[i] = UpperCase(name[i]);
    }
    PutNumber(entry + kEntryNameSizeOffset, static_cast<std::uint16_t>(2 * name.size() + 2));
    PutNumber(entry + kEntryKindOffset, static_cast<std::uint8_t>(kind));
    PutNumber(entry + kEntryColourOffset, kBlack);
    LeadNowhere(entry);
    if (kind != EntryKind::Storage) {
        SetContent(index, kEndOfChain, 0);
    }
    return index;
}

void CompoundDirectory::SetClass(std::uint32_t index, const StoredAuid& classId) {
    std::copy(classId.begin(), classId.end(), EntryAt(index) + kEntryClassOffset);
}

void CompoundDirectory::SetContent(std::uint32_t index, std::uint32_t start, std::size_t size) {
    PutNumber(EntryAt(index) + kEntryStartOffset, start);
    PutNumber(EntryAt(index) + kEntrySizeOffset, std::uint64_t{size});
}

void CompoundDirectory::AddLinked(std::uint32_t holder, const std::u16string& name,
                                  const std::shared_ptr<const Bytes>& linked, CompoundPlace place,
                                  std::uint32_t sectorsBefore) {
    const std::uint32_t storage = Add(holder, name, EntryKind::Storage);
    // Its root becomes this storage, and its other entries stand behind it.
    const CompoundPlace distance = {storage - place.entry, sectorsBefore - place.sector};
    const std::uint8_t* const root = linked->data();
    std::copy_n(root + kEntryClassOffset, sizeof(StoredAuid), EntryAt(storage) + kEntryClassOffset);
    const std::uint32_t child = NumberIn(root + kEntryChildOffset);
    PutNumber(EntryAt(storage) + kEntryChildOffset,
              child > kLastPlainSector ? child : child + distance.entry);
    if (distance == CompoundPlace{}) {
        bytes_.Share(linked, kDirectoryEntrySize);
        return;
    }
    Bytes& own = bytes_.own();
    const std::size_t first = own.size();
    own.insert(own.end(), linked->begin() + kDirectoryEntrySize, linked->end());
    MoveNumbers(own, first, distance);
}

std::uint32_t CompoundDirectory::Count() const {
    return static_cast<std::uint32_t>(bytes_.size() / kDirectoryEntrySize);
}

Bytes CompoundDirectory::TakeFrom(CompoundPlace place) {
    MoveNumbers(bytes_.own(), 0, place);
    return std::move(bytes_.own());
}

// Readers look a name up in a tree that is red and black, and some walk it by recursion. So it has
// the least height: all levels are full but the last, whose entries are red, and all others are
// black.
void CompoundDirectory::Link() {
    const Places sorted = InOrder();
    RefuseTwins(sorted);
    for (std::size_t first = 0, end = 0; first < sorted.size(); first = end) {
        const std::uint32_t holder = sorted[first]->holder;
        while (end < sorted.size() && sorted[end]->holder == holder) {
            ++end;
        }
        const std::size_t count = end - first;
        const std::uint32_t top = LinkTree(sorted.data() + first, count, FullLevels(count));
        PutNumber(EntryAt(holder) + kEntryChildOffset, top);
    }
}

void CompoundDirectory::FillUp(std::size_t pieceSize) {
    const std::size_t used = bytes_.size();
    Bytes& own = bytes_.own();
    const std::size_t first = own.size();
    own.resize(first + (used + pieceSize - 1) / pieceSize * pieceSize - used);
    for (std::size_t at = first; at < own.size(); at += kDirectoryEntrySize) {
        LeadNowhere(own.data() + at);
    }
}

// By storage, then by length of name, then by its text in upper case.
int CompoundDirectory::Order(const Place& left, const Place& right) {
    if (left.holder != right.holder) {
        return left.holder < right.holder ? -1 : 1;
    }
    if (left.length != right.length) {
        return left.length < right.length ? -1 : 1;
    }
    return std::u16string_view(left.name.data(), left.length)
        .compare(std::u16string_view(right.name.data(), right.length));
}

std::uint8_t* CompoundDirectory::EntryAt(std::uint32_t index) {
    return bytes_.own().data() + bytes_.PlaceOf(std::size_t{index} * kDirectoryEntrySize);
}

std::u16string CompoundDirectory::NameOf(std::uint32_t index) {
    const std::uint8_t* const entry = EntryAt(index);
    ByteReader size(entry + kEntryNameSizeOffset, 2);
    std::u16string name(size.TakeNumber<std::uint16_t>() / 2 - 1, u'\0');
    ByteReader units(entry, 2 * name.size());
    for (char16_t& unit : name) {
        unit = units.TakeNumber<std::uint16_t>();
    }
    return name;
}

// All but the root, storage by storage.
CompoundDirectory::Places CompoundDirectory::InOrder() const {
    std::vector<std::size_t> ends(Count() + std::size_t{1});
    for (std::size_t i = 1; i < places_.size(); ++i) {
        ++ends[places_[i].holder + std::size_t{1}];
    }
    std::partial_sum(ends.begin(), ends.end(), ends.begin());
    Places sorted(places_.size() - 1);
    for (std::size_t i = 1; i < places_.size(); ++i) {
        sorted[ends[places_[i].holder]++] = &places_[i];
    }
    const auto isBefore = [](const Place* left, const Place* right) {
        return Order(*left, *right) < 0;
    };
    for (auto first = sorted.begin(); first != sorted.end();) {
        const auto end = sorted.begin() + static_cast<std::ptrdiff_t>(ends[(*first)->holder]);
        std::sort(first, end, isBefore);
        first = end;
    }
    return sorted;
}

void CompoundDirectory::RefuseTwins(const Places& sorted) {
    const auto twins = std::adjacent_find(
        sorted.begin(), sorted.end(),
        [](const Place* left, const Place* right) { return Order(*left, *right) == 0; });
    if (twins != sorted.end()) {
        throw StoredError("\"" + ToUtf8(NameOf(std::max(twins[0]->index, twins[1]->index))) +
                          "\" is twice in one storage");
    }
}

// Gives the entry at the top. Recurses as deep as the tree is high.
std::uint32_t CompoundDirectory::LinkTree(const Place* const* first, std::size_t count,
                                          int blackLevels) {
    if (count == 0) {
        return kNoEntry;
    }
    const std::size_t before = count / 2;
    const std::uint32_t top = first[before]->index;
    std::uint8_t* const entry = EntryAt(top);
    PutNumber(entry + kEntryColourOffset, blackLevels > 0 ? kBlack : kRed);
    PutNumber(entry + kEntryLeftOffset, LinkTree(first, before, blackLevels - 1));
    PutNumber(entry + kEntryRightOffset,
              LinkTree(first + before + 1, count - before - 1, blackLevels - 1));
    return top;
}

}  // namespace aaf::stored
