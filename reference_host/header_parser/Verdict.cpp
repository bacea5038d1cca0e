// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/header_parser/Verdict.h"

#include <fmt/format.h>

namespace header_parser {

std::string Counted(ncfUInt64 number, const char* noun) {
    std::string word = noun;
    if (number != 1) {
        const bool isEntry = word.back() == 'y';
        word = isEntry ? word.substr(0, word.size() - 1) + "ies" : word + "s";
    }
    return fmt::format("{} {}", number, word);
}

Verdict CutShort(const Atom& atom) {
    return Broken(atom, fmt::format("{} is cut short: it holds {}", NameOf(atom.type),
                                    Counted(atom.Size(), "byte")));
}

Verdict OfUnknownVersion(const Atom& atom, unsigned version) {
    return Broken(atom, fmt::format("{} is of the unknown version {}", NameOf(atom.type), version));
}

Verdict ClaimsTooMany(const Atom& atom, ncfUInt64 entries, ncfUInt64 bytesLeft) {
    return Broken(atom, fmt::format("{} claims {}, {} left", NameOf(atom.type),
                                    Counted(entries, "entry"), Counted(bytesLeft, "byte")));
}

Verdict OpenTable(const Atom& atom, ncfUInt64 entrySize, const ncfUInt8*& entries,
                  ncfUInt32& count) {
    ByteReader reader(atom.begin, atom.end);
    reader.Skip(4);
    count = reader.U32();
    entries = reader.At();
    if (reader.Failed()) {
        return CutShort(atom);
    }
    return count <= reader.Left() / entrySize ? Fine() : ClaimsTooMany(atom, count, reader.Left());
}

Verdict VerdictOn(const AtomList& atoms, const std::string& parent) {
    std::string reason;
    if (atoms.Broken() && atoms.BytesLeft() < 8) {
        reason = fmt::format("{} ends with {} that are not an atom", parent,
                             Counted(atoms.BytesLeft(), "byte"));
    } else if (atoms.Broken() && atoms.ClaimedSize() > atoms.BytesLeft()) {
        reason = fmt::format("{} claims {} bytes, {} left in {}", NameOf(atoms.StoppedType()),
                             atoms.ClaimedSize(), atoms.BytesLeft(), parent);
    } else if (atoms.Broken()) {
        reason = fmt::format("{} in {} has the impossible size {}", NameOf(atoms.StoppedType()),
                             parent, atoms.ClaimedSize());
    } else if (atoms.Closed()) {
        reason = fmt::format("zeros in {} where an atom should begin", parent);
    } else {
        return Fine();
    }
    return {NCF_E_FAIL, std::move(reason), atoms.StoppedAt()};
}

}  // namespace header_parser
