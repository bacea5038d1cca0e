// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/header_parser/SoundDescription.h"

#include <fmt/format.h>

#include <algorithm>
#include <cmath>
#include <iterator>

#include "reference_host/header_parser/SoundConfig.h"

namespace header_parser {

namespace {

// No recorder writes more; a number from a broken header would size buffers.
constexpr ncfUInt32 kMaxChannels = 1024;

enum LinearFlags : ncfUInt32 {
    kFlagBigEndian = 2,
    kFlagNonInterleaved = 32,
};

// Linear sound by its code. A depth of 0 is taken from the bits field, which
// is only true for the old codes.
struct LinearCode {
    ncfUInt32 codec;
    ncfUInt32 bits;
    bool isLittleEndian;
    bool followsEnda;
};

constexpr LinearCode kLinearCodes[] = {
    {Code("sowt"), 0, true, false},
    {Code("twos"), 0, false, false},
    {Code("raw "), 0, false, false},
    {Code("NONE"), 0, false, false},
    {0, 0, false, false},
    {Code("in24"), 24, false, true},
    {Code("in32"), 32, false, true},
    {Code("fl32"), 32, false, true},
    {Code("fl64"), 64, false, true},
};

// Compressed sound whose packets have a size that the code fixes.
struct PacketCode {
    ncfUInt32 codec;
    ncfUInt32 framesPerPacket;
    ncfUInt32 bytesPerChannel;
};

constexpr PacketCode kPacketCodes[] = {
    {Code("ulaw"), 1, 1}, {Code("alaw"), 1, 1}, {Code("ima4"), 64, 34},
    {Code("MAC3"), 6, 2}, {Code("MAC6"), 6, 1},
};

template <typename Entry, std::size_t kCount>
const Entry* Find(const Entry (&table)[kCount], ncfUInt32 codec) {
    const Entry* found = std::find_if(std::begin(table), std::end(table),
                                      [&](const Entry& entry) { return entry.codec == codec; });
    return found == std::end(table) ? nullptr : found;
}

// What the description's fields say, before the code is looked at.
struct RawFields {
    unsigned version = 0;
    ncfUInt32 channels = 0;
    ncfUInt32 bits = 0;
    ncfSInt32 compressionId = 0;
    double rate = 0;
    ncfUInt32 framesPerPacket = 0;  // version 1 and 2
    ncfUInt32 bytesPerPacket = 0;   // of all channels
    ncfUInt32 linearFlags = 0;      // version 2
};

RawFields ReadFields(ByteReader& reader, bool isIso, bool hasWholeRate) {
    RawFields raw;
    reader.Skip(8);
    raw.version = reader.U16();
    reader.Skip(6);  // revision, vendor
    raw.channels = reader.U16();
    raw.bits = reader.U16();
    raw.compressionId = static_cast<ncfSInt16>(reader.U16());
    reader.Skip(2);
    raw.rate = reader.U32() / (hasWholeRate ? 1.0 : 65536.0);
    if (raw.version == 1 && !isIso) {
        raw.framesPerPacket = reader.U32();
        reader.Skip(4);  // bytes of one channel
        raw.bytesPerPacket = reader.U32();
        reader.Skip(4);
    } else if (raw.version == 2) {
        const ncfUInt32 size = reader.U32();
        raw.rate = reader.Double();
        raw.channels = reader.U32();
        reader.Skip(4);
        raw.bits = reader.U32();
        raw.linearFlags = reader.U32();
        raw.bytesPerPacket = reader.U32();
        raw.framesPerPacket = reader.U32();
        reader.Skip(size > 72 ? size - 72 : 0);
    }
    return raw;
}

// `enda` stands in the `wave` atom, or beside it.
bool IsMarkedLittleEndian(const ncfUInt8* begin, const ncfUInt8* end) {
    Atom enda = FindAtom(begin, end, Code("enda"));
    if (!enda) {
        const Atom wave = FindAtom(begin, end, Code("wave"));
        enda = wave ? FindAtom(wave.begin, wave.end, Code("enda")) : Atom();
    }
    return enda.Size() >= 2 && LoadU16(enda.begin) != 0;
}

// `ipcm` and `fpcm`: the atom `pcmC` behind the fields tells byte order and depth.
Verdict DescribeIsoLinear(const Atom& entry, const RawFields& raw, const Atom& pcmC,
                          SoundDescription& description) {
    constexpr ncfUInt64 kSize = 6;  // version and flags, byte order, depth
    const bool isTold = pcmC.Size() >= kSize;
    const ncfUInt32 bits = isTold ? pcmC.begin[5] : raw.bits;
    const bool isFloat = description.codec == Code("fpcm");
    const bool isPossible = bits == 32 || (isFloat ? bits == 64 : bits == 16 || bits == 24);
    if (raw.channels == 0 || !isPossible) {
        return Broken(entry, fmt::format("{} has {} channels of {} bits", NameOf(entry.type),
                                         raw.channels, bits));
    }
    description.bits = bits;
    description.isLinear = true;
    description.isLittleEndian = isTold && (pcmC.begin[4] & 1) != 0;
    description.isConstantBitRate = true;
    description.framesPerPacket = 1;
    description.bytesPerPacket = description.channels * (bits / 8);
    return Fine();
}

void DescribeLinear(const LinearCode& code, const RawFields& raw, bool isLittleEndian,
                    SoundDescription& description) {
    description.bits = code.bits;
    if (code.bits == 0) {
        const bool isKnown = raw.bits == 8 || raw.bits == 16 || raw.bits == 24 || raw.bits == 32;
        const bool isBytes = code.codec == Code("raw ") || code.codec == Code("NONE");
        description.bits = isKnown ? raw.bits : isBytes ? 8u : 16u;
    }
    description.isLinear = true;
    description.isLittleEndian = code.isLittleEndian || (code.followsEnda && isLittleEndian);
    description.isConstantBitRate = true;
    description.framesPerPacket = 1;
    description.bytesPerPacket = description.channels * (description.bits / 8);
}

// `lpcm` of version 2: the flags tell. What is not interleaved or does not
// fill its bytes is constant, but no plain linear sound.
void DescribeByFlags(const RawFields& raw, SoundDescription& description) {
    const ncfUInt32 frameBytes = raw.channels * ((raw.bits + 7) / 8);
    description.bits = raw.bits;
    description.isLittleEndian = (raw.linearFlags & kFlagBigEndian) == 0;
    description.isConstantBitRate = true;
    description.bytesPerPacket = raw.bytesPerPacket != 0 ? raw.bytesPerPacket : frameBytes;
    description.framesPerPacket = raw.framesPerPacket != 0 ? raw.framesPerPacket : 1;
    description.isLinear = description.bytesPerPacket == frameBytes &&
                           description.framesPerPacket == 1 &&
                           (raw.linearFlags & kFlagNonInterleaved) == 0;
}

void DescribeCompressed(const RawFields& raw, SoundDescription& description) {
    const bool varies = raw.compressionId == -2 && raw.version != 2;
    if (raw.bytesPerPacket != 0 && raw.framesPerPacket != 0 && !varies) {
        description.bytesPerPacket = raw.bytesPerPacket;
        description.framesPerPacket = raw.framesPerPacket;
    } else if (const PacketCode* code = Find(kPacketCodes, description.codec)) {
        description.bytesPerPacket = code->bytesPerChannel * description.channels;
        description.framesPerPacket = code->framesPerPacket;
    }
    description.isConstantBitRate = description.bytesPerPacket != 0;
}

}  // namespace

Verdict ReadSoundDescription(const Atom& entry, bool isIso, ncfUInt32 mediaTimeScale,
                             SoundDescription& description) {
    ByteReader reader(entry.begin, entry.end);
    // The rates of TrueHD do not fit into the whole half of the field.
    const RawFields raw = ReadFields(reader, isIso, entry.type == Code("mlpa"));
    if (raw.version > 2) {
        return OfUnknownVersion(entry, raw.version);
    }
    if (reader.Failed()) {
        return CutShort(entry);
    }
    if (raw.channels > kMaxChannels) {
        return Broken(entry, fmt::format("{} has {} channels, at most {} are read",
                                         NameOf(entry.type), raw.channels, kMaxChannels));
    }
    description.codec = entry.type;
    description.channels = raw.channels;
    description.rate = raw.rate == 0.0 ? mediaTimeScale : raw.rate;
    if (!std::isfinite(description.rate) || description.rate < 1.0 || description.rate > 1e9) {
        return Broken(entry, fmt::format("{} has the impossible rate {}", NameOf(entry.type),
                                         description.rate));
    }
    if (entry.type == Code("lpcm") && raw.version == 2) {
        if (raw.channels == 0 || raw.bits == 0 || raw.bits > 64) {
            return Broken(entry,
                          fmt::format("'lpcm' has {} channels of {} bits", raw.channels, raw.bits));
        }
        DescribeByFlags(raw, description);
        return Fine();
    }
    if (const LinearCode* code = Find(kLinearCodes, entry.type)) {
        if (raw.channels == 0) {
            return Broken(entry, fmt::format("{} has no channels", NameOf(entry.type)));
        }
        DescribeLinear(*code, raw, IsMarkedLittleEndian(reader.At(), reader.End()), description);
        return Fine();
    }
    if (entry.type == Code("ipcm") || entry.type == Code("fpcm")) {
        return DescribeIsoLinear(entry, raw, FindAtom(reader.At(), reader.End(), Code("pcmC")),
                                 description);
    }
    ReadSoundConfig(entry.type, reader.At(), reader.End(), description);
    DescribeCompressed(raw, description);
    return Fine();
}

}  // namespace header_parser
