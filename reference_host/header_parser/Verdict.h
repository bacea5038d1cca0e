// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <optional>
#include <string>
#include <utility>

#include "host_interfaces/framework/ResultCodes.h"
#include "reference_host/header_parser/Atom.h"

namespace header_parser {

// Outcome of reading a part of the header: fine, or why the file is given up, in
// words for people with the numbers that tell.
struct [[nodiscard]] Verdict {
    NCFRESULT code = NCF_OK;
    std::string reason = {};
    // The atom that is wrong: where it lies in the header's bytes, or in the file
    // as long as the header is not gathered.
    const ncfUInt8* at = nullptr;
    std::optional<ncfUInt64> position = {};

    bool Refused() const { return code != NCF_OK; }
};

inline Verdict Fine() {
    return {};
}
// The bytes contradict themselves or each other.
inline Verdict Broken(std::string reason) {
    return {NCF_E_FAIL, std::move(reason)};
}
inline Verdict Broken(const Atom& atom, std::string reason) {
    return {NCF_E_FAIL, std::move(reason), atom.start};
}
// A sound file of a kind that this parser leaves to others.
inline Verdict NotSupported(std::string reason) {
    return {NCF_E_NOTSUPPORTED, std::move(reason)};
}
inline Verdict NotSupported(const Atom& atom, std::string reason) {
    return {NCF_E_NOTSUPPORTED, std::move(reason), atom.start};
}
// The file ends where the header should go on.
inline Verdict NoData(std::string reason) {
    return {NMA_E_NODATA, std::move(reason)};
}
// One of ParserLimits, or the memory itself.
inline Verdict TooMuch(std::string reason) {
    return {NCF_E_OUTOFMEMORY, std::move(reason)};
}
inline Verdict TooMuch(const Atom& atom, std::string reason) {
    return {NCF_E_OUTOFMEMORY, std::move(reason), atom.start};
}

// "1 byte", "2 bytes", "3 entries".
std::string Counted(ncfUInt64 number, const char* noun);

// Reasons that many atoms share.
Verdict CutShort(const Atom& atom);
Verdict OfUnknownVersion(const Atom& atom, unsigned version);
Verdict ClaimsTooMany(const Atom& atom, ncfUInt64 entries, ncfUInt64 bytesLeft);
// Finds the entries of the table that an atom holds behind version, flags and their
// count.
Verdict OpenTable(const Atom& atom, ncfUInt64 entrySize, const ncfUInt8*& entries,
                  ncfUInt32& count);
// What a list of atoms that broke off says of itself; fine for one that did not.
// Zeros in it are what a header looks like behind the end of a cut file.
Verdict VerdictOn(const AtomList& atoms, const std::string& parent);

}  // namespace header_parser
