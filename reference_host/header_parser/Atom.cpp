// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/header_parser/Atom.h"

#include <fmt/format.h>

namespace header_parser {

std::string PlainNameOf(ncfUInt32 type) {
    std::string name;
    for (int shift = 24; shift >= 0; shift -= 8) {
        const ncfUInt32 c = type >> shift & 0xFF;
        const bool isPlain = c >= 0x20 && c < 0x7F && c != '\\';
        name += isPlain ? std::string(1, static_cast<char>(c)) : fmt::format("\\x{:02X}", c);
    }
    return name;
}

std::string NameOf(ncfUInt32 type) {
    return "'" + PlainNameOf(type) + "'";
}

bool AtomList::Stop(bool broken) {
    broken_ = broken;
    reader_ = ByteReader(reader_.End(), reader_.End());
    return false;
}

bool AtomList::Next(Atom& atom) {
    const ncfUInt64 left = reader_.Left();
    if (left == 0) {
        return false;
    }
    const ncfUInt8* const start = reader_.At();
    if (left < 4) {
        stoppedAt_ = start;
        left_ = left;
        return Stop(true);
    }
    const ncfUInt32 shortSize = reader_.U32();
    if (shortSize == 0) {
        closed_ = true;
        stoppedAt_ = start;
        return Stop(false);
    }
    atom.type = reader_.U32();
    const bool isLarge = shortSize == 1;
    const ncfUInt64 size = isLarge ? reader_.U64() : shortSize;
    const ncfUInt64 headerSize = isLarge ? 16 : 8;
    if (reader_.Failed() || size < headerSize || size > left) {
        stoppedAt_ = start;
        left_ = left;
        stoppedType_ = atom.type;
        claimed_ = size;
        return Stop(true);
    }
    atom.start = start;
    atom.begin = reader_.At();
    reader_.Skip(size - headerSize);
    atom.end = reader_.At();
    return true;
}

Atom FindAtom(const ncfUInt8* begin, const ncfUInt8* end, ncfUInt32 type) {
    AtomList atoms(begin, end);
    Atom atom;
    while (atoms.Next(atom)) {
        if (atom.type == type) {
            return atom;
        }
    }
    return Atom();
}

}  // namespace header_parser
