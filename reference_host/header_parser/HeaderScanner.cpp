// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/header_parser/HeaderScanner.h"

#include <fmt/format.h>

#include <algorithm>
#include <iterator>

#include "reference_host/header_parser/Atom.h"
#include "reference_host/header_parser/NumberLimits.h"

namespace header_parser {

namespace {

// A multiple of what any disk reads at once.
constexpr ncfUInt64 kSector = 4096;

// What may open a file of this family. Behind that, other types are passed
// over as long as they are text.
constexpr ncfUInt32 kOpeningAtoms[] = {
    Code("ftyp"), Code("moov"), Code("mdat"), Code("free"), Code("skip"),
    Code("wide"), Code("pnot"), Code("PICT"), Code("uuid"), Code("udta"),
    Code("meta"), Code("junk"), Code("prfl"), Code("pdin"),
};

// It begins the types of old user data.
constexpr ncfUInt32 kCopyrightSign = 0xA9;

bool MayOpenAFile(ncfUInt32 type) {
    return std::find(std::begin(kOpeningAtoms), std::end(kOpeningAtoms), type) !=
           std::end(kOpeningAtoms);
}

bool BelongsToFragments(ncfUInt32 type) {
    return type == Code("moof") || type == Code("styp") || type == Code("sidx") ||
           type == Code("mfra");
}

Verdict At(ncfUInt64 position, Verdict verdict) {
    verdict.position = position;
    return verdict;
}

Verdict TooLarge(ncfUInt64 size, const ParserLimits& limits) {
    return TooMuch(fmt::format("the movie header claims {} bytes, at most {} are read", size,
                               limits.maxHeaderBytes));
}

Verdict NoMemory(ncfUInt64 size) {
    return TooMuch(fmt::format("there is no memory for a movie header of {} bytes", size));
}

}  // namespace

// What of a fed range lies behind the cursor.
struct HeaderScanner::Range {
    const ncfUInt8* at;
    const ncfUInt8* end;

    ncfUInt64 Left() const { return static_cast<ncfUInt64>(end - at); }
};

// A long range is asked for in pieces that end where sectors do: such reads need no
// copy.
Verdict HeaderScanner::Want(ncfUInt64 position, ncfUInt64 size) {
    isWaiting_ = true;
    wantedPosition_ = position;
    if (size > limits_.maxReadSize) {
        const ncfUInt64 odd = (position + limits_.maxReadSize) % kSector;
        size = limits_.maxReadSize - (odd < limits_.maxReadSize ? odd : 0);
    }
    wantedSize_ = static_cast<ncfUInt32>(size);
    return Fine();
}

Verdict HeaderScanner::Feed(const ncfUInt8* begin, const ncfUInt8* end, ncfUInt64 position,
                            Progress& progress) {
    progress = Progress::kMore;
    const auto size = static_cast<ncfUInt64>(end - begin);
    const ncfUInt64 needed = state_ == State::kConfirm ? wantedPosition_ : cursor_;
    const bool isShort = isWaiting_ && position + size < wantedPosition_ + wantedSize_;
    if (position > needed || size <= needed - position || isShort) {
        return {NCF_E_INVALIDARG, "the bytes given are not those asked for"};
    }
    isWaiting_ = false;
    Range range{begin + (needed - position), end};
    while (!isWaiting_ && state_ != State::kWhole) {
        Verdict verdict;
        switch (state_) {
            case State::kWalk:
                verdict = Walk(range);
                break;
            case State::kGather:
                verdict = Gather(range);
                break;
            case State::kGatherToEnd:
                verdict = GatherToEnd(range);
                break;
            case State::kConfirm:
                state_ = State::kWhole;
                break;
            case State::kWhole:
                break;
        }
        if (verdict.Refused()) {
            return verdict;
        }
    }
    if (state_ == State::kWhole) {
        progress = Progress::kWhole;
    }
    return Fine();
}

Verdict HeaderScanner::Walk(Range& range) {
    ByteReader reader(range.at, range.end);
    const AtomHead head(reader);
    if (!head.isWhole) {
        return Want(cursor_, limits_.scanReadSize);
    }
    const ncfUInt32 type = head.type;
    const ncfUInt64 size = head.size;
    if (head.IsOpen() && type == 0) {
        return At(cursor_, NoData("zeros where an atom should begin, before any movie header"));
    }
    if (atomsSeen_ == 0 ? !MayOpenAFile(type) && !BelongsToFragments(type)
                        : !IsText(type, kCopyrightSign)) {
        return NoAtomHere(type);
    }
    if (BelongsToFragments(type)) {
        return At(cursor_,
                  NotSupported(fmt::format("the movie is fragmented, as {} shows", NameOf(type))));
    }
    if (++atomsSeen_ > limits_.maxTopLevelAtoms) {
        return At(cursor_, TooMuch(fmt::format("more than {} atoms come before the movie "
                                               "header",
                                               limits_.maxTopLevelAtoms)));
    }
    if (!head.IsOpen() && (size < head.length || size > kMaxPosition - cursor_)) {
        return At(cursor_,
                  Broken(fmt::format("{} has the impossible size {}", NameOf(type), size)));
    }
    if (type == Code("moov")) {
        range.at += head.length;
        return EnterHeader(size, head.length, head.IsOpen());
    }
    if (head.IsOpen()) {
        return At(cursor_,
                  NoData(fmt::format("{} reaches to the end of the file, before any movie header",
                                     NameOf(type))));
    }
    last_ = {type, cursor_, size};
    cursor_ += size;
    if (size >= range.Left()) {
        return Want(cursor_, limits_.scanReadSize);
    }
    range.at += size;
    return Fine();
}

// Behind other atoms, one of their sizes may have led astray.
Verdict HeaderScanner::NoAtomHere(ncfUInt32 type) const {
    if (atomsSeen_ == 0) {
        return At(0, NotSupported(fmt::format("its first atom would be {}, and no movie of the "
                                              "QuickTime family begins with that",
                                              NameOf(type))));
    }
    return At(cursor_,
              NotSupported(fmt::format("no atom begins where {} ends, which is at byte {} and "
                                       "claims {} bytes",
                                       NameOf(last_.type), last_.position, last_.size)));
}

Verdict HeaderScanner::Missing(ncfUInt64 fileSize) const {
    if (state_ != State::kWalk) {
        return At(
            atomPosition_,
            NoData(state_ == State::kGatherToEnd
                       ? fmt::format("'moov' reaches to the end of the file at byte {}, in the "
                                     "middle of an atom",
                                     fileSize)
                       : fmt::format("'moov' claims {} bytes, the file ends at byte {}", atomSize_,
                                     fileSize)));
    }
    if (atomsSeen_ == 0) {
        return At(0,
                  NoData(fmt::format("the file holds {} and no atom", Counted(fileSize, "byte"))));
    }
    if (cursor_ < fileSize) {
        return At(cursor_,
                  NoData(fmt::format(
                      "the file ends at byte {}, inside an atom's header, before any movie header",
                      fileSize)));
    }
    if (cursor_ > fileSize) {
        return At(last_.position,
                  NoData(fmt::format(
                      "{} claims {} bytes, the file ends at byte {}, before any movie header",
                      NameOf(last_.type), last_.size, fileSize)));
    }
    return At(cursor_, NoData("the file ends without 'moov', the movie header"));
}

bool HeaderScanner::WalkedToEnd(ncfUInt64 fileSize) const {
    return state_ == State::kWalk && cursor_ + 8 > fileSize;
}

Verdict HeaderScanner::EnterHeader(ncfUInt64 size, ncfUInt64 headerSize, bool toEnd) {
    atomPosition_ = cursor_;
    atomSize_ = size;
    atomHeaderSize_ = headerSize;
    cursor_ += headerSize;
    state_ = toEnd ? State::kGatherToEnd : State::kGather;
    if (!toEnd && size > limits_.maxHeaderBytes) {
        return At(atomPosition_, TooLarge(size, limits_));
    }
    payload_.Expect(toEnd ? 0 : size - headerSize);
    return Fine();
}

Verdict HeaderScanner::Gather(Range& range) {
    const ncfUInt64 missing = atomSize_ - atomHeaderSize_ - payload_.Size();
    const ncfUInt64 taken = std::min(missing, range.Left());
    if (!payload_.Append(range.at, taken)) {
        return At(atomPosition_, NoMemory(atomSize_));
    }
    range.at += taken;
    cursor_ += taken;
    return taken == missing ? Finish() : Want(cursor_, missing - taken);
}

// The atom's size is 0: it ends with the last child in front of the zeros
// that stand behind the end of the file.
Verdict HeaderScanner::GatherToEnd(Range& range) {
    const ncfUInt64 taken = range.Left();
    if (payload_.Size() + taken > limits_.maxHeaderBytes) {
        return At(atomPosition_, TooLarge(payload_.Size() + taken, limits_));
    }
    if (!payload_.Append(range.at, taken)) {
        return At(atomPosition_, NoMemory(payload_.Size() + taken));
    }
    range.at += taken;
    cursor_ += taken;
    ncfUInt64 childSize = 0;
    while (payload_.Size() - walked_ >= 8) {
        ByteReader reader(payload_.begin() + walked_, payload_.end());
        const AtomHead child(reader);
        if (child.IsOpen()) {
            payload_.Shorten(walked_);
            atomSize_ = atomHeaderSize_ + walked_;
            cursor_ = atomPosition_ + atomSize_;
            return Finish();
        }
        if (!child.isWhole) {
            break;
        }
        childSize = child.size;
        if (childSize < 8 || childSize > limits_.maxHeaderBytes) {
            return At(PayloadPosition() + walked_,
                      Broken(fmt::format("{} in 'moov' has the impossible size {}",
                                         NameOf(child.type), childSize)));
        }
        if (childSize > payload_.Size() - walked_) {
            break;
        }
        walked_ += childSize;
        childSize = 0;
    }
    // What is behind the last whole child may be the end of the file already, so
    // the read begins with the child's last byte, which is there.
    const ncfUInt64 known = payload_.Size() - walked_;
    const ncfUInt64 missing = childSize > known ? childSize - known : 0;
    const ncfUInt64 back = missing > 0 ? 0 : known + 1;
    return Want(cursor_ - back, std::max<ncfUInt64>(missing, limits_.scanReadSize));
}

Verdict HeaderScanner::Finish() {
    const bool isCertain = payload_.Size() == 0 || payload_.end()[-1] != 0;
    if (isCertain) {
        state_ = State::kWhole;
        return Fine();
    }
    state_ = State::kConfirm;
    return Want(atomPosition_ + atomSize_ - 1, 1);
}

}  // namespace header_parser
