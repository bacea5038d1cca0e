// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <algorithm>
#include <array>
#include <vector>

#include "reference_host/header_parser/Atom.h"
#include "reference_host/header_parser/ByteSource.h"

namespace header_parser {

// An atom by its place in a source, with what stands behind its head.
struct StoredAtom {
    ncfUInt32 type = 0;
    ncfUInt64 begin = 0;
    ncfUInt64 end = 0;
    bool isOpen = false;      // claims no size, and ends with what holds it
    bool isCutShort = false;  // claims more than what holds it, and ends with that

    ncfUInt64 Size() const { return end - begin; }
};

// Walks atoms in place and steps over what they hold, so that the cost does
// not grow with the media. Ends at the first that is no atom.
class StoredAtoms {
public:
    explicit StoredAtoms(ByteSource& source) : StoredAtoms(source, 0, source.Length()) {}
    StoredAtoms(ByteSource& source, ncfUInt64 begin, ncfUInt64 end)
        : source_(source), at_(begin), end_(end) {}

    bool Next(StoredAtom& atom);

private:
    ByteSource& source_;
    ncfUInt64 at_;
    const ncfUInt64 end_;
};

// The table that an atom holds behind version, flags and the count of entries.
struct StoredTable {
    ncfUInt64 begin = 0;
    ncfUInt64 count = 0;  // that the atom really holds

    StoredTable() = default;
    StoredTable(ByteSource& source, ncfUInt64 from, ncfUInt64 to, ncfUInt64 entrySize);
};

// Reads the entries of a table, each of some numbers of 32 bits, many at a time.
template <std::size_t Numbers>
class StoredEntries {
public:
    using Entry = std::array<ncfUInt32, Numbers>;

    StoredEntries(ByteSource& source, const StoredTable& table) : source_(source), table_(table) {}

    bool Next(Entry& entry) {
        if (failed_ || (next_ == bytes_.size() && !ReadPiece())) {
            return false;
        }
        for (ncfUInt32& number : entry) {
            number = LoadU32(&bytes_[next_]);
            next_ += 4;
        }
        return true;
    }
    // Ended before the last of them.
    bool Failed() const { return failed_; }

private:
    static constexpr ncfUInt64 kPiece = 4096;
    static constexpr ncfUInt64 kSize = Numbers * 4;

    bool ReadPiece() {
        const ncfUInt64 count = std::min(kPiece, table_.count);
        bytes_.resize(static_cast<std::size_t>(count * kSize));
        next_ = 0;
        failed_ = count > 0 && !source_.Read(table_.begin, bytes_.data(), bytes_.size());
        table_.begin += bytes_.size();
        table_.count -= count;
        return count > 0 && !failed_;
    }

    ByteSource& source_;
    StoredTable table_;  // what is left of it
    std::vector<ncfUInt8> bytes_;
    std::size_t next_ = 0;
    bool failed_ = false;
};

}  // namespace header_parser
