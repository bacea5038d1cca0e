// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include <fmt/format.h>
#include <zlib.h>

#include <algorithm>

#include "reference_host/header_parser/Movie.h"

// A compressed movie header:
//
//     moov [ cmov [ dcom "zlib" | cmvd: size of the plain header, packed bytes ] ]
//
// What is packed is a moov atom of its own, header included.

namespace header_parser {

namespace {

constexpr ncfUInt64 kPiece = 256 * 1024;

// Closes the inflater however the function ends.
struct Inflater {
    z_stream stream{};
    bool isOpen = false;

    bool Open() { return isOpen = inflateInit(&stream) == Z_OK; }
    ~Inflater() {
        if (isOpen) {
            inflateEnd(&stream);
        }
    }
};

// Grows as the bytes really come out, whatever size was claimed.
Verdict Unpack(const ncfUInt8* from, ncfUInt64 count, ncfUInt64 limit, HeaderBytes& plain) {
    Inflater inflater;
    if (count > 0xFFFFFFFFu || !inflater.Open()) {
        return TooMuch("no memory for the compressed movie header");
    }
    inflater.stream.next_in = const_cast<ncfUInt8*>(from);
    inflater.stream.avail_in = static_cast<uInt>(count);
    for (;;) {
        const ncfUInt64 piece = std::min(kPiece, limit + 1 - plain.Size());
        ncfUInt8* room = plain.Room(piece);
        if (room == nullptr) {
            return TooMuch("no memory for the compressed movie header");
        }
        inflater.stream.next_out = room;
        inflater.stream.avail_out = static_cast<uInt>(piece);
        const int result = inflate(&inflater.stream, Z_NO_FLUSH);
        plain.Extend(piece - inflater.stream.avail_out);
        if (plain.Size() > limit) {
            return TooMuch(
                fmt::format("the compressed movie header unpacks to more than {} bytes", limit));
        }
        if (result == Z_STREAM_END) {
            return Fine();
        }
        if (result != Z_OK) {
            return Broken(
                inflater.stream.avail_in == 0
                    ? fmt::format("the compressed movie header is cut short: its {} unpack to no "
                                  "end",
                                  Counted(count, "byte"))
                    : fmt::format("the compressed movie header can't be unpacked behind byte {} "
                                  "of {}",
                                  count - inflater.stream.avail_in, count));
        }
    }
}

}  // namespace

Verdict Inflate(HeaderBytes& bytes, const ParserLimits& limits, bool* isUnpacked) {
    const Atom cmov = FindAtom(bytes.begin(), bytes.end(), Code("cmov"));
    if (!cmov) {
        return Fine();
    }
    const Atom dcom = FindAtom(cmov.begin, cmov.end, Code("dcom"));
    const Atom cmvd = FindAtom(cmov.begin, cmov.end, Code("cmvd"));
    if (dcom.Size() < 4 || cmvd.Size() < 4) {
        return Broken(cmov, dcom.Size() < 4 ? "'cmov' has no 'dcom' that names its compression"
                                            : "'cmov' has no 'cmvd' with packed bytes");
    }
    if (LoadU32(dcom.begin) != Code("zlib")) {
        return NotSupported(dcom,
                            fmt::format("the movie header is compressed by {}, only 'zlib' is "
                                        "known",
                                        NameOf(LoadU32(dcom.begin))));
    }
    const ncfUInt64 limit =
        std::min(cmvd.Size() * limits.maxInflationRatio, limits.maxInflatedBytes);
    HeaderBytes plain;
    Verdict verdict = Unpack(cmvd.begin + 4, cmvd.Size() - 4, limit, plain);
    if (verdict.Refused()) {
        verdict.at = cmvd.start;
        return verdict;
    }
    if (plain.Size() != LoadU32(cmvd.begin)) {
        return Broken(cmvd, fmt::format("'cmvd' says that it unpacks to {} bytes, it unpacks to {}",
                                        LoadU32(cmvd.begin), plain.Size()));
    }
    const Atom moov = FindAtom(plain.begin(), plain.end(), Code("moov"));
    if (!moov) {
        return Broken(cmvd, "what 'cmvd' unpacks to holds no 'moov'");
    }
    HeaderBytes inner;
    if (!inner.Append(moov.begin, moov.Size())) {
        return TooMuch("no memory for the compressed movie header");
    }
    bytes = std::move(inner);
    if (isUnpacked != nullptr) {
        *isUnpacked = true;
    }
    return Fine();
}

}  // namespace header_parser
