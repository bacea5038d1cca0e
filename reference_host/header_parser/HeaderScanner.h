// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "reference_host/header_parser/HeaderBytes.h"
#include "reference_host/header_parser/ParserLimits.h"
#include "reference_host/header_parser/Verdict.h"

namespace header_parser {

// Finds the movie header at the top level of a file that is fed to it in
// ranges, and gathers its bytes.
//
//     ftyp | wide | mdat ........ | moov [ mvhd trak trak udta ]
//     ^ walk from atom to atom      ^ gather
//
// Each range that is asked for begins further on than the one before, so a
// file is through after a bounded number of passes whatever it says.
//
// The feeder pads a short read with zeros and fails past the end of the file,
// so the end itself is not seen here. Zeros are therefore never taken for an
// atom; and when the header's last byte is zero it is asked for once more by
// itself, which fails where the file was cut.
class HeaderScanner {
public:
    explicit HeaderScanner(const ParserLimits& limits) : limits_(limits) {}

    enum class Progress { kMore, kWhole };

    // Takes [begin, end), which stand at `position`. Unless the verdict is a
    // refusal, `progress` tells whether the header is whole or the range of
    // WantedPosition is to be fed next.
    Verdict Feed(const ncfUInt8* begin, const ncfUInt8* end, ncfUInt64 position,
                 Progress& progress);

    ncfUInt64 WantedPosition() const { return wantedPosition_; }
    ncfUInt32 WantedSize() const { return wantedSize_; }

    // What a file that ends at `fileSize` lacks, when the scanner waits for more.
    Verdict Missing(ncfUInt64 fileSize) const;
    // Whether it came to that end while it looked for the header.
    bool WalkedToEnd(ncfUInt64 fileSize) const;

    // Of the atom in the file, its header included.
    ncfUInt64 AtomPosition() const { return atomPosition_; }
    ncfUInt64 AtomSize() const { return atomSize_; }
    ncfUInt64 PayloadPosition() const { return atomPosition_ + atomHeaderSize_; }
    // What stands behind the atom's header; to be taken once.
    HeaderBytes& Payload() { return payload_; }

private:
    enum class State { kWalk, kGather, kGatherToEnd, kConfirm, kWhole };
    struct Range;
    // An atom of the top level.
    struct TopAtom {
        ncfUInt32 type = 0;
        ncfUInt64 position = 0;
        ncfUInt64 size = 0;
    };

    Verdict NoAtomHere(ncfUInt32 type) const;
    Verdict Walk(Range& range);
    Verdict EnterHeader(ncfUInt64 size, ncfUInt64 headerSize, bool toEnd);
    Verdict Gather(Range& range);
    Verdict GatherToEnd(Range& range);
    Verdict Finish();
    Verdict Want(ncfUInt64 position, ncfUInt64 size);

    ParserLimits limits_;
    State state_ = State::kWalk;
    ncfUInt64 cursor_ = 0;  // first byte of the file that is not used up
    ncfUInt32 atomsSeen_ = 0;
    TopAtom last_;  // the one in front of the cursor
    bool isWaiting_ = false;
    ncfUInt64 wantedPosition_ = 0;
    ncfUInt32 wantedSize_ = 0;
    ncfUInt64 atomPosition_ = 0;
    ncfUInt64 atomSize_ = 0;
    ncfUInt64 atomHeaderSize_ = 0;
    ncfUInt64 walked_ = 0;  // of the payload, when the atom's size is open
    HeaderBytes payload_;
};

}  // namespace header_parser
