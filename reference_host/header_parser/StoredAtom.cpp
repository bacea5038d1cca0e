// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/header_parser/StoredAtom.h"

namespace header_parser {

bool StoredAtoms::Next(StoredAtom& atom) {
    ncfUInt8 bytes[16];
    const ncfUInt64 left = end_ - at_;
    const ncfUInt64 known = std::min<ncfUInt64>(left, sizeof bytes);
    if (left < 8 || !source_.Read(at_, bytes, known)) {
        return false;
    }
    ByteReader reader(bytes, bytes + known);
    const AtomHead head(reader);
    const bool endsWithParent = head.IsOpen() || head.size > left;
    const ncfUInt64 size = endsWithParent ? left : head.size;
    if (!head.isWhole || size < head.length) {
        return false;
    }
    atom = {head.type, at_ + head.length, at_ + size, head.IsOpen(), head.size > left};
    at_ += size;
    return true;
}

StoredTable::StoredTable(ByteSource& source, ncfUInt64 from, ncfUInt64 to, ncfUInt64 entrySize)
    : begin(from + 8) {
    if (begin <= to) {
        count = std::min<ncfUInt64>(source.U32(from + 4), (to - begin) / entrySize);
    }
}

}  // namespace header_parser
