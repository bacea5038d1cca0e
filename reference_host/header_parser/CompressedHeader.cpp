// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
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

// Closes the inflater on every road.
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
            return TooMuch("the compressed movie header grows too large");
        }
        if (result == Z_STREAM_END) {
            return Fine();
        }
        if (result != Z_OK) {
            return Broken("the compressed movie header cannot be unpacked");
        }
    }
}

}  // namespace

Verdict Inflate(HeaderBytes& bytes, const ParserLimits& limits) {
    const Atom cmov = FindAtom(bytes.begin(), bytes.end(), Code("cmov"));
    if (!cmov) {
        return Fine();
    }
    const Atom dcom = FindAtom(cmov.begin, cmov.end, Code("dcom"));
    const Atom cmvd = FindAtom(cmov.begin, cmov.end, Code("cmvd"));
    if (dcom.Size() < 4 || cmvd.Size() < 4) {
        return Broken("the compressed movie header lacks its parts");
    }
    if (LoadU32(dcom.begin) != Code("zlib")) {
        return NotSupported("the movie header is compressed in an unknown way");
    }
    const ncfUInt64 limit =
        std::min(cmvd.Size() * limits.maxInflationRatio, limits.maxInflatedBytes);
    HeaderBytes plain;
    Verdict verdict = Unpack(cmvd.begin + 4, cmvd.Size() - 4, limit, plain);
    if (verdict.Refused()) {
        return verdict;
    }
    if (plain.Size() != LoadU32(cmvd.begin)) {
        return Broken("the compressed movie header has another size than it says");
    }
    const Atom moov = FindAtom(plain.begin(), plain.end(), Code("moov"));
    if (!moov) {
        return Broken("the compressed movie header holds no movie header");
    }
    HeaderBytes inner;
    if (!inner.Append(moov.begin, moov.Size())) {
        return TooMuch("no memory for the compressed movie header");
    }
    bytes = std::move(inner);
    return Fine();
}

}  // namespace header_parser
