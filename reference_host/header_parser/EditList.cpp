// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/header_parser/EditList.h"

#include <fmt/format.h>

#include <algorithm>
#include <limits>

namespace header_parser {

namespace {

constexpr ncfSInt32 kNormalRate = 0x10000;
constexpr ncfSInt64 kMaxTime = std::numeric_limits<ncfSInt64>::max() / 4;

// Media time that plays while `elapsed` movie units pass.
ncfSInt64 Played(ncfUInt64 elapsed, ncfSInt32 rate, const EditList::Scales& scales) {
    const ncfUInt64 media = MultiplyDivide(elapsed, scales.media, scales.movie);
    const auto speed = static_cast<ncfUInt32>(rate < 0 ? -static_cast<ncfSInt64>(rate) : rate);
    const ncfUInt64 played = MultiplyDivide(media, speed, kNormalRate);
    const auto bounded =
        static_cast<ncfSInt64>(std::min<ncfUInt64>(played, static_cast<ncfUInt64>(kMaxTime)));
    return rate < 0 ? -bounded : bounded;
}

}  // namespace

ncfUInt64 MultiplyDivide(ncfUInt64 a, ncfUInt32 b, ncfUInt32 c) {
    const ncfUInt64 whole = a / c;
    const ncfUInt64 rest = a % c * b / c;
    if (b != 0 && whole > (std::numeric_limits<ncfUInt64>::max() - rest) / b) {
        return std::numeric_limits<ncfUInt64>::max();
    }
    return whole * b + rest;
}

Verdict EditList::Read(const Atom& elst, const ParserLimits& limits) {
    ByteReader reader(elst.begin, elst.end);
    const unsigned version = reader.U8();
    reader.Skip(3);
    const ncfUInt32 count = reader.U32();
    if (version > 1) {
        return OfUnknownVersion(elst, version);
    }
    if (reader.Failed()) {
        return CutShort(elst);
    }
    if (count > reader.Left() / (version == 1 ? 20 : 12)) {
        return ClaimsTooMany(elst, count, reader.Left());
    }
    if (count > limits.maxEditsInTrack) {
        return TooMuch(elst, fmt::format("'elst' holds {} edits, at most {} are read", count,
                                         limits.maxEditsInTrack));
    }
    edits_.reserve(count);
    for (ncfUInt32 i = 0; i < count; ++i) {
        Edit edit{};
        edit.start = duration_;
        edit.duration = version == 1 ? reader.U64() : reader.U32();
        edit.mediaTime = version == 1 ? reader.S64() : reader.S32();
        edit.rate = reader.S32();
        if (edit.mediaTime < -1 || edit.mediaTime > kMaxTime) {
            return Broken(elst, fmt::format("edit {} begins at the impossible media time {}", i + 1,
                                            edit.mediaTime));
        }
        if (edit.duration > static_cast<ncfUInt64>(kMaxTime) - duration_) {
            return Broken(
                elst, fmt::format("edits 1 to {} last longer than {} in total", i + 1, kMaxTime));
        }
        duration_ += edit.duration;
        edits_.push_back(edit);
    }
    // Entries without length play nothing, but for a single one: it stands
    // for all of the media behind its start.
    if (duration_ != 0) {
        edits_.erase(std::remove_if(edits_.begin(), edits_.end(),
                                    [](const Edit& edit) { return edit.duration == 0; }),
                     edits_.end());
    } else if (edits_.size() > 1) {
        edits_.resize(1);
    }
    return Fine();
}

ncfUInt64 EditList::Filled(ncfUInt64 mediaEnd, const Scales& scales) const {
    const auto unitsBehind = [&](ncfSInt64 mediaTime) {
        const auto start = static_cast<ncfUInt64>(mediaTime);
        return mediaEnd > start ? MultiplyDivide(mediaEnd - start, scales.movie, scales.media) : 0;
    };
    if (duration_ == 0) {
        return unitsBehind(Offset());
    }
    ncfUInt64 filled = 0;
    for (const Edit& edit : edits_) {
        const bool playsForward = edit.mediaTime >= 0 && edit.rate > 0;
        filled += playsForward ? std::min(edit.duration,
                                          MultiplyDivide(unitsBehind(edit.mediaTime), kNormalRate,
                                                         static_cast<ncfUInt32>(edit.rate)))
                               : edit.duration;
    }
    return filled;
}

// Several edits count as one where each goes on at the media time at which the
// one before it ended, give or take the rounding of a movie unit.
bool EditList::IsProportional(const Scales& scales) const {
    for (std::size_t i = 0; i < edits_.size(); ++i) {
        const Edit& edit = edits_[i];
        if (edit.mediaTime < 0 || edit.rate <= 0) {
            return false;
        }
        if (i == 0) {
            continue;
        }
        const Edit& before = edits_[i - 1];
        const ncfSInt64 expected = before.mediaTime + Played(before.duration, before.rate, scales);
        const ncfSInt64 tolerance = Played(1, before.rate, scales) + 1;
        const ncfSInt64 difference = edit.mediaTime - expected;
        if (edit.rate != before.rate || difference > tolerance || difference < -tolerance) {
            return false;
        }
    }
    return true;
}

bool EditList::IsLinear(const Scales& scales) const {
    return IsProportional(scales) && (edits_.empty() || edits_[0].rate == kNormalRate);
}

ncfSInt64 EditList::Offset() const {
    return edits_.empty() ? 0 : std::max<ncfSInt64>(edits_[0].mediaTime, 0);
}

ncfSInt64 EditList::MediaTimeAt(ncfUInt64 trackTime, const Scales& scales) const {
    if (edits_.empty()) {
        return Played(trackTime, kNormalRate, scales);
    }
    const auto edit =
        std::upper_bound(edits_.begin(), edits_.end(), trackTime,
                         [](ncfUInt64 time, const Edit& e) { return time < e.start; }) -
        1;
    if (edit->mediaTime < 0) {
        return -1;
    }
    const ncfSInt64 played = Played(trackTime - edit->start, edit->rate, scales);
    return std::max<ncfSInt64>(edit->mediaTime + played, 0);
}

}  // namespace header_parser
