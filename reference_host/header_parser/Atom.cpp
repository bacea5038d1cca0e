// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/header_parser/Atom.h"

namespace header_parser {

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
    if (left < 4) {
        return Stop(true);
    }
    const ncfUInt32 shortSize = reader_.U32();
    if (shortSize == 0) {
        closed_ = true;
        return Stop(false);
    }
    atom.type = reader_.U32();
    const bool isLarge = shortSize == 1;
    const ncfUInt64 size = isLarge ? reader_.U64() : shortSize;
    const ncfUInt64 headerSize = isLarge ? 16 : 8;
    if (reader_.Failed() || size < headerSize || size > left) {
        return Stop(true);
    }
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
