// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/header_parser/Refusal.h"

#include <fmt/format.h>

#include <algorithm>
#include <iterator>

#include "reference_host/header_parser/HeaderBytes.h"
#include "reference_host/header_parser/Verdict.h"

namespace header_parser {
namespace {

// Atoms that hold nothing but atoms.
constexpr ncfUInt32 kLists[] = {Code("trak"), Code("edts"), Code("mdia"), Code("minf"),
                                Code("dinf"), Code("stbl"), Code("cmov")};

bool IsList(ncfUInt32 type) {
    return std::find(std::begin(kLists), std::end(kLists), type) != std::end(kLists);
}

// Goes down from the header to the atom that begins at `at`. One that stands in
// no list, such as an entry of a table, leaves the path at the table.
void Find(const ncfUInt8* at, const HeaderBytes& bytes, Refusal& refusal) {
    AtomList atoms(bytes.begin(), bytes.end());
    ncfUInt32 tracks = 0;
    for (Atom atom; atoms.Next(atom);) {
        tracks += refusal.track == 0 && atom.type == Code("trak") ? 1 : 0;
        if (at < atom.start || at >= atom.end) {
            continue;
        }
        if (atom.type == Code("trak")) {
            refusal.track = tracks;
        }
        refusal.atom += "/" + PlainNameOf(atom.type);
        if (at == atom.start || !IsList(atom.type)) {
            return;
        }
        atoms = AtomList(atom);
    }
}

}  // namespace

Refusal Locate(const Verdict& verdict) {
    Refusal refusal{verdict.code, verdict.reason};
    refusal.offset = verdict.position;
    return refusal;
}

Refusal Locate(const Verdict& verdict, const HeaderBytes& bytes,
               std::optional<ncfUInt64> position) {
    Refusal refusal = Locate(verdict);
    refusal.atom = "moov";
    if (verdict.at == nullptr) {
        return refusal;
    }
    Find(verdict.at, bytes, refusal);
    refusal.isUnpacked = !position;
    refusal.offset = position.value_or(0) + static_cast<ncfUInt64>(verdict.at - bytes.begin());
    return refusal;
}

std::string Refusal::Sentence() const {
    const std::string inTrack = track != 0 ? fmt::format("track {}: ", track) : std::string();
    const std::string place = offset ? fmt::format(" (at byte {}{})", *offset,
                                                   isUnpacked ? " of the unpacked header" : "")
                                     : std::string();
    return inTrack + reason + place;
}

}  // namespace header_parser
