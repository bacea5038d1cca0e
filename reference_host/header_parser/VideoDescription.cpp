// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/header_parser/VideoDescription.h"

#include <fmt/format.h>

#include <algorithm>
#include <iterator>

namespace header_parser {

namespace {

// Codes whose samples hold alpha whatever the depth field says. For all others
// a depth of 32 tells.
constexpr ncfUInt32 kAlphaCodes[] = {
    Code("v408"), Code("r408"), Code("v4ra"), Code("y416"), Code("r4fl"), Code("b64a"),
    Code("b32a"), Code("a2vy"), Code("Hap5"), Code("HapA"), Code("HapM"), Code("DXT5"),
};

void ReadFields(const Atom& atom, VideoDescription& description) {
    ByteReader reader(atom.begin, atom.end);
    const unsigned count = reader.U8();
    const unsigned detail = reader.U8();
    if (reader.Failed() || count < 1 || count > 2) {
        return;
    }
    bool topFirst = detail == 1 || detail == 9;
    if (count == 2 && detail == 0) {
        // Order unknown: systems of 525 lines begin with the lower field.
        topFirst = !(description.height >= 480 && description.height <= 512);
    }
    description.fields = VideoDescription::Fields{count, count == 2 && topFirst,
                                                  count == 2 && (detail == 1 || detail == 6)};
}

void ReadColors(const Atom& atom, VideoDescription& description) {
    ByteReader reader(atom.begin, atom.end);
    const ncfUInt32 kind = reader.U32();
    VideoDescription::Colors colors{};
    colors.primaries = reader.U16();
    colors.transfer = reader.U16();
    colors.matrix = reader.U16();
    if (!reader.Failed() && (kind == Code("nclc") || kind == Code("nclx"))) {
        description.colors = colors;
    }
}

void ReadPixelAspect(const Atom& atom, VideoDescription& description) {
    ByteReader reader(atom.begin, atom.end);
    const Ratio ratio{reader.U32(), reader.U32()};
    if (!reader.Failed() && ratio.numerator != 0 && ratio.denominator != 0) {
        description.pixelAspect = ratio;
    }
}

// Both numbers are signed in the file; what is not positive, or larger than
// the picture, is no aperture.
bool IsWithin(const Ratio& part, ncfUInt32 whole) {
    constexpr ncfUInt32 kMax = 0x7FFFFFFF;
    return part.numerator != 0 && part.numerator <= kMax && part.denominator != 0 &&
           part.denominator <= kMax && part.numerator <= ncfUInt64{whole} * part.denominator;
}

void ReadCleanAperture(const Atom& atom, VideoDescription& description) {
    ByteReader reader(atom.begin, atom.end);
    CleanAperture clean;
    clean.width = {reader.U32(), reader.U32()};
    clean.height = {reader.U32(), reader.U32()};
    reader.Skip(16);  // the offsets of its centre
    if (!reader.Failed() && IsWithin(clean.width, description.width) &&
        IsWithin(clean.height, description.height)) {
        description.cleanAperture = clean;
    }
}

void ReadResolution(const Atom& atom, VideoDescription& description) {
    ByteReader reader(atom.begin, atom.end);
    const ncfUInt32 version = reader.U32() >> 24;
    const ncfUInt32 id = reader.U32();
    if (!reader.Failed() && version == 0) {
        description.resolutionId = id;
    }
}

void ReadAlphaCodings(const Atom& atom, VideoDescription& description) {
    ByteReader reader(atom.begin, atom.end);
    const ncfUInt32 version = reader.U32() >> 24;
    const ncfUInt32 count = reader.U32();
    if (!reader.Failed() && version == 0 && count <= reader.Left() / 4) {
        description.alphaCodings = reader.At();
        description.alphaCodingCount = count;
    }
}

struct Extension {
    ncfUInt32 type;
    void (*read)(const Atom& atom, VideoDescription& description);
};

constexpr Extension kExtensions[] = {
    {Code("fiel"), ReadFields},
    {Code("colr"), ReadColors},
    {Code("pasp"), ReadPixelAspect},
    {Code("clap"), ReadCleanAperture},
    {Code("chRS"), ReadResolution},
    {Code("chAC"), ReadAlphaCodings},
    {Code("chRI"), [](const Atom& atom, VideoDescription& d) { d.rasterText = atom; }},
    {Code("chCM"), [](const Atom& atom, VideoDescription& d) { d.colorText = atom; }},
};

// A picture of few colours may carry its table in front of the extensions.
void SkipColorTable(ByteReader& reader, unsigned depth, unsigned tableId) {
    const bool isIndexed = depth == 1 || depth == 2 || depth == 4 || depth == 8;
    if (!isIndexed || tableId != 0) {
        return;
    }
    reader.Skip(6);
    const ncfUInt32 count = reader.U16() + 1u;
    reader.Skip(ncfUInt64{count} * 8);
}

}  // namespace

Verdict ReadVideoDescription(const Atom& entry, const ParserLimits& limits,
                             VideoDescription& description) {
    ByteReader reader(entry.begin, entry.end);
    description.codec = entry.type;
    reader.Skip(6 + 2 + 2 + 2);  // reserved, data reference, version, revision
    description.vendor = reader.U32();
    reader.Skip(8);  // qualities
    description.width = reader.U16();
    description.height = reader.U16();
    reader.Skip(4 + 4 + 4 + 2 + 32);  // resolution, data size, frame count, name
    description.depth = reader.U16();
    const unsigned colorTable = reader.U16();
    if (reader.Failed()) {
        return CutShort(entry);
    }
    description.hasAlpha =
        description.depth == 32 || std::find(std::begin(kAlphaCodes), std::end(kAlphaCodes),
                                             description.codec) != std::end(kAlphaCodes);
    SkipColorTable(reader, description.depth, colorTable);
    AtomList extensions(reader.At(), reader.Failed() ? reader.At() : reader.End());
    Atom atom;
    ncfUInt32 seen = 0;  // one bit for each extension: the first of a kind counts
    while (extensions.Next(atom)) {
        for (std::size_t i = 0; i < std::size(kExtensions); ++i) {
            const ncfUInt32 bit = 1u << i;
            // A profile in `colr` does not stand in the way of codes behind it.
            const bool isOpen =
                (seen & bit) == 0 || (atom.type == Code("colr") && !description.colors);
            if (atom.type == kExtensions[i].type && isOpen) {
                seen |= bit;
                kExtensions[i].read(atom, description);
            }
        }
    }
    if (description.rasterText.Size() > limits.maxAttributeText ||
        description.colorText.Size() > limits.maxAttributeText) {
        return TooMuch(entry, fmt::format("an attribute text of {} has more than {} bytes",
                                          NameOf(entry.type), limits.maxAttributeText));
    }
    return Fine();
}

}  // namespace header_parser
