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

bool IsText(ncfUInt32 type, ncfUInt32 further) {
    for (int shift = 24; shift >= 0; shift -= 8) {
        const ncfUInt32 c = type >> shift & 0xFF;
        if (!(c >= 0x20 && c < 0x7F) && c != further) {
            return false;
        }
    }
    return true;
}

std::string NameOf(ncfUInt32 type) {
    return "'" + PlainNameOf(type) + "'";
}

bool AtomList::Stop(bool broken) {
    broken_ = broken;
    reader_ = ByteReader(reader_.End(), reader_.End());
    return false;
}

AtomHead::AtomHead(ByteReader& reader) {
    size = reader.U32();
    type = reader.U32();
    if (size == 1) {
        size = reader.U64();
        length = 16;
    }
    isWhole = !reader.Failed();
}

bool AtomList::Next(Atom& atom) {
    const ncfUInt64 left = reader_.Left();
    if (left == 0) {
        return false;
    }
    const ncfUInt8* const start = reader_.At();
    if (left >= 4 && LoadU32(start) == 0) {
        closed_ = true;
        stoppedAt_ = start;
        return Stop(false);
    }
    const AtomHead head(reader_);
    if (!head.isWhole || head.size < head.length || head.size > left) {
        stoppedAt_ = start;
        left_ = left;
        stoppedType_ = head.type;
        claimed_ = head.size;
        return Stop(true);
    }
    atom.type = head.type;
    atom.start = start;
    atom.begin = reader_.At();
    reader_.Skip(head.size - head.length);
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
