// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <optional>
#include <string>

#include "host_interfaces/framework/ResultCodes.h"
#include "host_interfaces/framework/Types.h"

namespace header_parser {

struct Verdict;
class HeaderBytes;

// Why the header of a file was refused, and where.
struct Refusal {
    NCFRESULT code = NCF_OK;               // fine for none
    std::string reason = {};               // a sentence, with its numbers
    std::string atom = {};                 // as in "moov/trak/mdia/minf/stbl/stsz"; empty for none
    ncfUInt32 track = 0;                   // in the order of the file, from 1; 0 for none
    std::optional<ncfUInt64> offset = {};  // of the atom
    // The offset counts in what a compressed header unpacks to, not in the file.
    bool isUnpacked = false;

    explicit operator bool() const { return code != NCF_OK; }
    // "track 2: 'stsz' claims 900 entries, 12 bytes left (at byte 1234)"
    std::string Sentence() const;
};

// What a verdict comes to in the header whose bytes it points into. `position` is
// that of the bytes in the file, and nothing for those of an unpacked header.
Refusal Locate(const Verdict& verdict, const HeaderBytes& bytes, std::optional<ncfUInt64> position);
// The same for one on a part of the file in front of the header.
Refusal Locate(const Verdict& verdict);

}  // namespace header_parser
