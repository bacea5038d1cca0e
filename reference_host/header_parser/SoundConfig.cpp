// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/header_parser/SoundConfig.h"

#include <algorithm>
#include <iterator>

#include "reference_host/header_parser/BitReader.h"

namespace header_parser {

namespace {

// What comes out; 0 for what is not told.
struct Told {
    ncfUInt32 channels = 0;
    ncfUInt32 rate = 0;
};

// Kinds of AAC by number.
enum ObjectType : ncfUInt32 {
    kSpectralBands = 5,      // doubles the rate of its core
    kParametricStereo = 29,  // the same, and makes two channels of one
    kEscape = 31,
};

ncfUInt32 TakeObjectType(BitReader& bits) {
    const ncfUInt32 type = bits.Take(5);
    return type == kEscape ? 32 + bits.Take(6) : type;
}

ncfUInt32 TakeAacRate(BitReader& bits) {
    constexpr ncfUInt32 kRates[] = {96000, 88200, 64000, 48000, 44100, 32000, 24000,
                                    22050, 16000, 12000, 11025, 8000,  7350};
    constexpr ncfUInt32 kRateFollows = 15;
    const ncfUInt32 index = bits.Take(4);
    if (index == kRateFollows) {
        return bits.Take(24);
    }
    return index < std::size(kRates) ? kRates[index] : 0;
}

// The kinds whose configuration goes on with that of the filter bank coder.
bool IsGeneralAudio(ncfUInt32 type) {
    constexpr ncfUInt32 kTypes[] = {1, 2, 3, 4, 7, 17, 19, 21, 22, 23};
    return std::find(std::begin(kTypes), std::end(kTypes), type) != std::end(kTypes);
}

// Channels of a program config element, which follows where no usual
// arrangement is named.
ncfUInt32 TakeProgramChannels(BitReader& bits) {
    bits.Skip(4 + 2 + 4);  // tag, kind, rate
    const ncfUInt32 pairs = bits.Take(4) + bits.Take(4) + bits.Take(4);
    const ncfUInt32 low = bits.Take(2);
    bits.Skip(3 + 4);  // data, coupling
    for (const unsigned mixdown : {4u, 4u, 3u}) {
        bits.Skip(bits.Flag() ? mixdown : 0);
    }
    ncfUInt32 channels = low;
    for (ncfUInt32 i = 0; i < pairs; ++i) {
        channels += bits.Flag() ? 2 : 1;
        bits.Skip(4);
    }
    return bits.Failed() ? 0 : channels;
}

// Whether packets hold an extension, as far as is told.
enum class Extension { kUntold, kNo, kYes };

// The configuration of AAC. Extensions are announced in front, in the place of
// the object type, or behind, where older decoders pass them over. Without
// either the packets may hold them all the same.
Told ReadAacConfig(const Atom& config) {
    constexpr ncfUInt32 kChannels[] = {0, 1, 2, 3, 4, 5, 6, 8, 0, 0, 0, 7, 8, 24, 8, 0};
    BitReader bits(config.begin, config.end);
    const ncfUInt32 type = TakeObjectType(bits);
    ncfUInt32 core = type;
    const ncfUInt32 rate = TakeAacRate(bits);
    const ncfUInt32 arrangement = bits.Take(4);
    Extension bands = Extension::kUntold;
    Extension stereo = type == kParametricStereo ? Extension::kYes : Extension::kUntold;
    ncfUInt32 extendedRate = 0;
    if (type == kSpectralBands || type == kParametricStereo) {
        bands = Extension::kYes;
        extendedRate = TakeAacRate(bits);
        core = TakeObjectType(bits);
    }
    Told told;
    told.channels = kChannels[arrangement];
    if (arrangement == 0 && IsGeneralAudio(core)) {
        BitReader program = bits;
        program.Skip(1);                        // length of a frame
        program.Skip(program.Flag() ? 14 : 0);  // delay of a core coder
        program.Skip(1);                        // more follows
        told.channels = TakeProgramChannels(program);
    }
    constexpr ncfUInt32 kBandsFollow = 0x2B7;
    constexpr ncfUInt32 kStereoFollows = 0x548;
    while (bands == Extension::kUntold && bits.Left() > 15) {
        if (bits.Show(11) != kBandsFollow) {
            bits.Skip(1);
            continue;
        }
        bits.Skip(11);
        const bool isThere = TakeObjectType(bits) == kSpectralBands && bits.Flag();
        bands = isThere ? Extension::kYes : Extension::kNo;
        extendedRate = isThere ? TakeAacRate(bits) : 0;
        if (isThere && bits.Left() > 11 && bits.Take(11) == kStereoFollows) {
            stereo = bits.Flag() ? Extension::kYes : Extension::kNo;
        }
    }
    if (bits.Failed() || rate == 0) {
        return Told();
    }
    if (bands == Extension::kYes && extendedRate == rate) {
        bands = Extension::kUntold;
    }
    // The decoder makes twice the core's rate, whatever the extension names, and
    // two channels of one unless it is told that it need not.
    const bool isDoubled = bands == Extension::kYes && extendedRate > rate;
    told.rate = isDoubled ? 2 * rate : rate;
    if (told.channels == 1 && bands == Extension::kYes && stereo != Extension::kNo) {
        told.channels = 2;
    }
    return told;
}

// The identification header is the first of those that Vorbis begins with.
Told ReadVorbisConfig(const Atom& config) {
    constexpr ncfUInt8 kOpening[] = {1, 'v', 'o', 'r', 'b', 'i', 's'};
    const ncfUInt8* const found =
        std::search(config.begin, config.end, std::begin(kOpening), std::end(kOpening));
    if (config.end - found < 16) {
        return Told();
    }
    const ncfUInt8* const rate = found + 12;
    Told told;
    told.channels = found[11];
    told.rate = static_cast<ncfUInt32>(rate[0] | rate[1] << 8 | rate[2] << 16) |
                static_cast<ncfUInt32>(rate[3]) << 24;
    return told;
}

// A length in seven bits a byte.
ncfUInt64 DescriptorSize(ByteReader& reader) {
    ncfUInt64 size = 0;
    for (int i = 0; i < 4; ++i) {
        const ncfUInt8 byte = reader.U8();
        size = size << 7 | (byte & 0x7Fu);
        if ((byte & 0x80) == 0) {
            break;
        }
    }
    return std::min(size, reader.Left());
}

// Enters the next descriptor when it has this tag.
bool EnterDescriptor(ByteReader& reader, unsigned tag) {
    if (reader.Left() < 2 || *reader.At() != tag) {
        return false;
    }
    reader.Skip(1);
    const ncfUInt64 size = DescriptorSize(reader);
    reader = ByteReader(reader.At(), reader.At() + size);
    return true;
}

// An elementary stream's descriptor tells the kind of sound by number and
// holds the configuration of that kind.
Told ReadStreamConfig(const Atom& esds) {
    ByteReader reader(esds.begin, esds.end);
    reader.Skip(4);  // version, flags
    if (EnterDescriptor(reader, 3)) {
        reader.Skip(2);  // id
        const unsigned flags = reader.U8();
        reader.Skip((flags & 0x80) != 0 ? 2 : 0);
        const unsigned url = (flags & 0x40) != 0 ? reader.U8() : 0;
        reader.Skip(url);
        reader.Skip((flags & 0x20) != 0 ? 2 : 0);
    }
    if (reader.Failed() || !EnterDescriptor(reader, 4)) {
        return Told();
    }
    const unsigned kind = reader.U8();
    reader.Skip(12);  // stream type, buffer, bit rates
    const bool hasConfig = !reader.Failed() && EnterDescriptor(reader, 5);
    const Atom config = hasConfig ? Atom{Code("esds"), reader.At(), reader.End()} : Atom();
    Told told;
    switch (kind) {
        case 0x40:
        case 0x66:
        case 0x67:
        case 0x68:
            return config.Size() >= 2 ? ReadAacConfig(config) : told;
        case 0xDD:
            return config ? ReadVorbisConfig(config) : told;
        default:
            return told;
    }
}

Told ReadOpusConfig(const Atom& dOps) {
    Told told;
    told.channels = dOps.Size() >= 11 ? dOps.begin[1] : 0;
    told.rate = 48000;
    return told;
}

ncfUInt32 Ac3Rate(ncfUInt32 code) {
    return code == 0 ? 48000 : code == 1 ? 44100 : code == 2 ? 32000 : 0;
}

ncfUInt32 TakeAc3Channels(BitReader& bits) {
    constexpr ncfUInt32 kChannels[] = {2, 1, 2, 3, 3, 4, 4, 5};
    const ncfUInt32 arrangement = bits.Take(3);
    return kChannels[arrangement] + bits.Take(1);
}

Told ReadAc3Config(const Atom& dac3) {
    BitReader bits(dac3.begin, dac3.end);
    Told told;
    const ncfUInt32 rate = Ac3Rate(bits.Take(2));
    const ncfUInt32 version = bits.Take(5);
    told.rate = version > 8 ? rate >> (version - 8) : rate;
    bits.Skip(3);
    told.channels = TakeAc3Channels(bits);
    return bits.Failed() ? Told() : told;
}

Told ReadEac3Config(const Atom& dec3) {
    BitReader bits(dec3.begin, dec3.end);
    bits.Skip(13 + 3);  // data rate, streams
    Told told;
    told.rate = Ac3Rate(bits.Take(2));
    bits.Skip(5 + 1 + 1 + 3);
    told.channels = TakeAc3Channels(bits);
    bits.Skip(3);
    if (bits.Take(4) != 0) {
        // Further places of speakers: single ones, and pairs. The pair between
        // the middle and the sides has the lowest bit.
        constexpr ncfUInt32 kSpeakers[] = {1, 1, 2, 2, 2, 1, 1, 2, 2};
        for (const ncfUInt32 speakers : kSpeakers) {
            told.channels += bits.Flag() ? speakers : 0;
        }
    }
    return bits.Failed() ? Told() : told;
}

Told ReadFlacConfig(const Atom& dfLa) {
    BitReader bits(dfLa.begin, dfLa.end);
    bits.Skip(8 * (4 + 4 + 10));  // version, block header, sizes
    Told told;
    told.rate = bits.Take(20);
    told.channels = bits.Take(3) + 1;
    return bits.Failed() ? Told() : told;
}

Told ReadAlacConfig(const Atom& alac) {
    constexpr ncfUInt64 kSize = 4 + 24;  // version and flags before the numbers
    Told told;
    if (alac.Size() >= kSize) {
        told.channels = alac.begin[4 + 9];
        told.rate = LoadU32(alac.begin + 4 + 20);
    }
    return told;
}

// TrueHD: the decoder gives the largest of the presentations in a stream.
Told ReadTrueHdConfig(const Atom& dmlp) {
    // Pairs and single ones, from the lowest bit.
    constexpr ncfUInt32 kSpeakers[] = {2, 1, 1, 2, 2, 2, 2, 1, 1, 2, 2, 1, 1};
    BitReader bits(dmlp.begin, dmlp.end);
    const ncfUInt32 rate = bits.Take(4);
    bits.Skip(1 + 1 + 2 + 2 + 2);  // kinds of channels
    const ncfUInt32 upToSix = bits.Take(5);
    bits.Skip(2);
    const ncfUInt32 upToEight = bits.Take(13);
    if (bits.Failed() || (rate & 7) > 2) {
        return Told();
    }
    Told told;
    told.rate = (rate < 8 ? 48000u : 44100u) << (rate & 7);
    const ncfUInt32 places = upToEight != 0 ? upToEight : upToSix;
    for (std::size_t i = 0; i < std::size(kSpeakers); ++i) {
        told.channels += (places >> i & 1) != 0 ? kSpeakers[i] : 0;
    }
    return told;
}

Told ReadNothing(const Atom&) {
    return {};
}

// Which atom holds the configuration, by code. Where the code fixes channels
// and rate itself no atom is named.
struct ConfigRow {
    ncfUInt32 codec;
    ncfUInt32 atom;
    Told (*read)(const Atom& config);
    Told fixed = {};
};

const ConfigRow kRows[] = {
    {Code("mp4a"), Code("esds"), ReadStreamConfig}, {Code("Opus"), Code("dOps"), ReadOpusConfig},
    {Code("ac-3"), Code("dac3"), ReadAc3Config},    {Code("ec-3"), Code("dec3"), ReadEac3Config},
    {Code("fLaC"), Code("dfLa"), ReadFlacConfig},   {Code("alac"), Code("alac"), ReadAlacConfig},
    {Code("mlpa"), Code("dmlp"), ReadTrueHdConfig}, {Code("samr"), 0, ReadNothing, {1, 8000}},
    {Code("sawb"), 0, ReadNothing, {1, 16000}},
};

Atom FindConfig(const ncfUInt8* begin, const ncfUInt8* end, ncfUInt32 type) {
    const Atom beside = FindAtom(begin, end, type);
    const Atom wave = beside ? Atom() : FindAtom(begin, end, Code("wave"));
    return wave ? FindAtom(wave.begin, wave.end, type) : beside;
}

}  // namespace

AacSound ReadAacSound(const ncfUInt8* begin, const ncfUInt8* end) {
    const Atom config{Code("esds"), begin, end};
    const Told told = config.Size() >= 2 ? ReadAacConfig(config) : Told();
    return {told.channels, told.rate};
}

void ReadSoundConfig(ncfUInt32 codec, const ncfUInt8* begin, const ncfUInt8* end,
                     SoundDescription& description) {
    const auto row = std::find_if(std::begin(kRows), std::end(kRows),
                                  [&](const ConfigRow& each) { return each.codec == codec; });
    if (row == std::end(kRows)) {
        return;
    }
    const Atom config = row->atom != 0 ? FindConfig(begin, end, row->atom) : Atom();
    const Told told = config ? row->read(config) : row->fixed;
    constexpr ncfUInt32 kHighestRate = 1000000000;
    if (told.channels != 0) {
        description.channels = told.channels;
    }
    if (told.rate != 0 && told.rate <= kHighestRate) {
        description.rate = told.rate;
    }
}

}  // namespace header_parser
