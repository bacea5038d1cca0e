// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include <fmt/format.h>

#include <algorithm>
#include <limits>

#include "reference_host/header_parser/Movie.h"
#include "reference_host/header_parser/NumberLimits.h"

// One function for each atom of a track:
//
//     trak [ tkhd | edts [ elst ] | mdia [ mdhd | hdlr | minf [ dinf [ dref ] | stbl ] ] ]
//
// The atoms of one list may stand in any order, so a list is sorted first and
// read in the order in which its parts need each other. Of several atoms of
// one kind the first counts.

namespace header_parser {

namespace {

struct TrackAtoms {
    Atom tkhd, elst, mdhd, hdlr, vmhd, smhd, dref, stsd;
    SampleTableAtoms tables;
};

// Where a child of a known type is kept; a list of them is one level.
struct Slot {
    ncfUInt32 type;
    Atom* place;
};

Verdict SortChildren(const Atom& parent, std::initializer_list<Slot> slots) {
    AtomList atoms(parent);
    Atom atom;
    while (atoms.Next(atom)) {
        for (const Slot& slot : slots) {
            if (slot.type == atom.type && !*slot.place) {
                *slot.place = atom;
            }
        }
    }
    return VerdictOn(atoms, NameOf(parent.type));
}

Verdict SortMediaInformation(const Atom& minf, TrackAtoms& atoms) {
    Atom dinf;
    Atom stbl;
    Verdict verdict = SortChildren(minf, {{Code("vmhd"), &atoms.vmhd},
                                          {Code("smhd"), &atoms.smhd},
                                          {Code("dinf"), &dinf},
                                          {Code("stbl"), &stbl}});
    if (!verdict.Refused() && dinf) {
        verdict = SortChildren(dinf, {{Code("dref"), &atoms.dref}});
    }
    if (!verdict.Refused() && !stbl) {
        verdict = Broken(minf, "it lacks 'stbl', the sample table");
    }
    if (verdict.Refused()) {
        return verdict;
    }
    SampleTableAtoms& tables = atoms.tables;
    return SortChildren(stbl, {{Code("stsd"), &atoms.stsd},
                               {Code("stts"), &tables.stts},
                               {Code("ctts"), &tables.ctts},
                               {Code("stsc"), &tables.stsc},
                               {Code("stsz"), &tables.stsz},
                               {Code("stz2"), &tables.stz2},
                               {Code("stco"), &tables.stco},
                               {Code("co64"), &tables.co64},
                               {Code("stss"), &tables.stss},
                               {Code("stps"), &tables.stps},
                               {Code("sdtp"), &tables.sdtp}});
}

Verdict SortTrack(const Atom& trak, TrackAtoms& atoms) {
    Atom edts;
    Atom mdia;
    Atom minf;
    Verdict verdict = SortChildren(
        trak, {{Code("tkhd"), &atoms.tkhd}, {Code("edts"), &edts}, {Code("mdia"), &mdia}});
    if (!verdict.Refused() && edts) {
        verdict = SortChildren(edts, {{Code("elst"), &atoms.elst}});
    }
    if (!verdict.Refused() && mdia) {
        verdict = SortChildren(
            mdia,
            {{Code("mdhd"), &atoms.mdhd}, {Code("hdlr"), &atoms.hdlr}, {Code("minf"), &minf}});
    }
    if (!verdict.Refused() && !minf) {
        verdict = mdia ? Broken(mdia, "it lacks 'minf', the media information")
                       : Broken(trak, "it lacks 'mdia', the media");
    }
    return verdict.Refused() ? verdict : SortMediaInformation(minf, atoms);
}

// A duration as it stands, or nothing where it is 0 or unknown.
std::optional<ncfUInt64> KnownDuration(ncfUInt64 duration, unsigned version) {
    const ncfUInt64 unknown = version == 1 ? std::numeric_limits<ncfUInt64>::max() : kMax32;
    return duration == 0 || duration == unknown ? std::nullopt : std::optional(duration);
}

Verdict VerdictOnHeader(const Atom& header, const char* what, unsigned version,
                        const ByteReader& reader) {
    if (!header) {
        return Broken(std::string("it lacks ") + what);
    }
    if (version > 1) {
        return OfUnknownVersion(header, version);
    }
    return reader.Failed() ? CutShort(header) : Fine();
}

Verdict ReadTrackHeader(const Atom& tkhd, Track& track, std::optional<ncfUInt64>& duration) {
    ByteReader reader(tkhd.begin, tkhd.end);
    const unsigned version = reader.U8();
    reader.Skip(3u + (version == 1 ? 16 : 8));
    track.id = reader.U32();
    reader.Skip(4);
    duration = KnownDuration(version == 1 ? reader.U64() : reader.U32(), version);
    reader.Skip(16);  // reserved, layer, group, volume
    for (std::size_t i = 0; i < track.matrix.size(); ++i) {
        const float unit = i % 3 == 2 ? 1073741824.0f : 65536.0f;
        track.matrix[i] = static_cast<float>(reader.S32()) / unit;
    }
    const Verdict verdict = VerdictOnHeader(tkhd, "'tkhd', the track header", version, reader);
    if (verdict.Refused()) {
        return verdict;
    }
    return track.id != 0 ? Fine() : Broken(tkhd, "'tkhd' gives it the number 0");
}

Verdict ReadMediaHeader(const Atom& mdhd, Track& track, std::optional<ncfUInt64>& duration) {
    ByteReader reader(mdhd.begin, mdhd.end);
    const unsigned version = reader.U8();
    reader.Skip(3u + (version == 1 ? 16 : 8));
    track.mediaTimeScale = reader.U32();
    duration = KnownDuration(version == 1 ? reader.U64() : reader.U32(), version);
    const Verdict verdict = VerdictOnHeader(mdhd, "'mdhd', the media header", version, reader);
    if (verdict.Refused()) {
        return verdict;
    }
    return track.mediaTimeScale != 0 ? Fine() : Broken(mdhd, "'mdhd' gives a time scale of 0");
}

// By the handler; a very old file may have none, then by the media header.
TrackKind KindOf(const TrackAtoms& atoms) {
    const ncfUInt32 handler = atoms.hdlr.Size() >= 12 ? LoadU32(atoms.hdlr.begin + 8) : 0;
    if (handler == Code("vide") || (handler == 0 && atoms.vmhd)) {
        return TrackKind::kVideo;
    }
    if (handler == Code("soun") || (handler == 0 && atoms.smhd)) {
        return TrackKind::kSound;
    }
    return handler == Code("tmcd") ? TrackKind::kTimecode : TrackKind::kOther;
}

Verdict HoldsFewer(const Atom& table, ncfUInt32 claimed, std::size_t held) {
    return Broken(table, fmt::format("{} claims {} and holds {}", NameOf(table.type),
                                     Counted(claimed, "entry"), held));
}

// Which data references are this file itself. Without a table all are.
Verdict ReadDataReferences(const Atom& dref, std::vector<bool>& isInFile) {
    const ncfUInt8* begin = nullptr;
    ncfUInt32 count = 0;
    if (Verdict verdict = OpenTable(dref, 8, begin, count); verdict.Refused()) {
        return verdict;
    }
    AtomList entries(begin, dref.end);
    Atom entry;
    while (isInFile.size() < count && entries.Next(entry)) {
        const ncfUInt32 flags = entry.Size() >= 4 ? LoadU32(entry.begin) : 0;
        isInFile.push_back((flags & 1) != 0);
    }
    return isInFile.size() == count ? Fine() : HoldsFewer(dref, count, isInFile.size());
}

Verdict ReadDescription(const Atom& entry, bool isIso, const ParserLimits& limits, Track& track) {
    switch (track.kind) {
        case TrackKind::kVideo:
            track.video.emplace_back();
            return ReadVideoDescription(entry, limits, track.video.back());
        case TrackKind::kSound:
            track.sound.emplace_back();
            return ReadSoundDescription(entry, isIso, track.mediaTimeScale, track.sound.back());
        case TrackKind::kTimecode:
            if (track.isInFile.empty()) {
                track.timecode = ReadTimecodeDescription(entry);
            }
            return Fine();
        case TrackKind::kOther:
            break;
    }
    return Fine();
}

Verdict ReadDescriptions(const Atom& stsd, const std::vector<bool>& references, bool hasReferences,
                         const ParserLimits& limits, Track& track) {
    if (!stsd) {
        return Broken("it lacks 'stsd', the sample descriptions");
    }
    const ncfUInt8* begin = nullptr;
    ncfUInt32 count = 0;
    if (Verdict verdict = OpenTable(stsd, 16, begin, count); verdict.Refused()) {
        return verdict;
    }
    const bool isIso = stsd.begin[0] != 0;
    if (count > limits.maxDescriptionsInTrack) {
        return TooMuch(stsd, fmt::format("'stsd' holds {} sample descriptions, at most {} are read",
                                         count, limits.maxDescriptionsInTrack));
    }
    AtomList entries(begin, stsd.end);
    Atom entry;
    while (track.isInFile.size() < count && entries.Next(entry)) {
        if (entry.Size() < 8) {
            return CutShort(entry);
        }
        const Verdict verdict = ReadDescription(entry, isIso, limits, track);
        if (verdict.Refused()) {
            return verdict;
        }
        const unsigned reference = LoadU16(entry.begin + 6);
        const bool isListed = reference != 0 && reference <= references.size();
        // Some recorders name no reference where they mean their own file, and
        // some descriptions of other data do not even have the field.
        if (hasReferences && !isListed && reference != 0 && track.kind != TrackKind::kOther) {
            return Broken(entry, fmt::format("{} names data reference {}, 'dref' has {}",
                                             NameOf(entry.type), reference, references.size()));
        }
        track.isInFile.push_back(!isListed || references[reference - 1]);
    }
    track.descriptionCount = count;
    return track.isInFile.size() == count ? Fine() : HoldsFewer(stsd, count, track.isInFile.size());
}

// Whether the track plays its media whole by what the headers of both say, to
// the nearest unit of the media. None of the three is above 32 bits.
bool PlaysAll(ncfUInt64 duration, ncfUInt64 mediaDuration, const EditList::Scales& scales) {
    const ncfUInt64 played = duration * scales.media;
    const ncfUInt64 held = mediaDuration * scales.movie;
    return (played > held ? played - held : held - played) <= scales.movie / 2;
}

// A medium lasts as long as its samples. Its header is believed where it says so
// too, give or take a sample.
ncfUInt64 DurationOfMedia(std::optional<ncfUInt64> header, const SampleTimes& samples) {
    const ncfUInt64 sum = samples.TotalDuration();
    const ncfUInt64 told = header.value_or(sum);
    const ncfUInt64 difference = told > sum ? told - sum : sum - told;
    return sum != 0 && difference > samples.MeanDuration() ? sum : told;
}

// A track lasts as long as it tells, but no longer than its media, give or take a
// sample and a unit. One that shows none of its media has nothing to go by.
ncfUInt64 DurationOfTrack(ncfUInt64 told, ncfUInt64 mediaDuration, const EditList::Scales& scales,
                          const Track& track) {
    const SampleTimes& samples = track.samples.Times();
    const bool isTimed = samples.TotalDuration() != 0 &&
                         (track.kind == TrackKind::kVideo || track.kind == TrackKind::kSound);
    const ncfUInt64 filled =
        isTimed ? track.edits.Filled(std::max(mediaDuration, samples.DisplayEnd()), scales) : 0;
    const ncfUInt64 sample = MultiplyDivide(samples.MeanDuration(), scales.movie, scales.media);
    return filled != 0 && told > filled && told - filled > sample + 1 ? filled : told;
}

// Plain sound whose track and media headers agree is read from the file by hosts,
// up to the end that both tell: they go on agreeing, whatever the samples say.
Verdict SetDurations(std::optional<ncfUInt64> header, std::optional<ncfUInt64> media,
                     ncfUInt32 movieTimeScale, Track& track) {
    const EditList::Scales scales{movieTimeScale, track.mediaTimeScale};
    std::optional<ncfUInt64> told = header;
    if (track.edits.Duration() != 0) {
        told = track.edits.Duration();
    }
    ncfUInt64 mediaDuration = DurationOfMedia(media, track.samples.Times());
    const ncfUInt64 duration =
        told.value_or(MultiplyDivide(mediaDuration, scales.movie, scales.media));
    const ncfUInt64 longest = std::max({media.value_or(0), mediaDuration, duration});
    if (longest > kMax32) {
        return NotSupported(fmt::format("its duration of {} units does not fit 32 bits", longest));
    }
    const ncfUInt64 bounded = DurationOfTrack(duration, mediaDuration, scales, track);
    if (!track.sound.empty() && track.sound.front().isLinear && told && media &&
        PlaysAll(duration, *media, scales)) {
        mediaDuration =
            bounded == duration ? *media : MultiplyDivide(bounded, scales.media, scales.movie);
    }
    track.isShorterThanTold = bounded < duration;
    track.toldMediaDuration = static_cast<ncfUInt32>(media.value_or(0));
    track.mediaDuration = static_cast<ncfUInt32>(mediaDuration);
    track.duration = static_cast<ncfUInt32>(bounded);
    return Fine();
}

}  // namespace

Verdict ReadTrack(const Atom& trak, ncfUInt32 movieTimeScale, const ParserLimits& limits,
                  Track& track) {
    TrackAtoms atoms;
    std::optional<ncfUInt64> headerDuration;
    std::optional<ncfUInt64> mediaDuration;
    Verdict verdict = SortTrack(trak, atoms);
    if (!verdict.Refused()) {
        verdict = ReadTrackHeader(atoms.tkhd, track, headerDuration);
    }
    if (!verdict.Refused()) {
        verdict = ReadMediaHeader(atoms.mdhd, track, mediaDuration);
    }
    if (!verdict.Refused() && atoms.elst) {
        verdict = track.edits.Read(atoms.elst, limits);
    }
    std::vector<bool> references;
    if (!verdict.Refused() && atoms.dref) {
        verdict = ReadDataReferences(atoms.dref, references);
    }
    track.kind = KindOf(atoms);
    if (!verdict.Refused()) {
        verdict =
            ReadDescriptions(atoms.stsd, references, static_cast<bool>(atoms.dref), limits, track);
    }
    if (!verdict.Refused()) {
        const PacketLayout oldSound =
            track.sound.empty() ? PacketLayout() : track.sound.front().OldLayout();
        verdict = track.samples.Read(atoms.tables, oldSound, track.isInFile);
    }
    if (!verdict.Refused()) {
        verdict = SetDurations(headerDuration, mediaDuration, movieTimeScale, track);
    }
    // What is missing is missing in the track.
    if (verdict.Refused() && verdict.at == nullptr) {
        verdict.at = trak.start;
    }
    return verdict;
}

}  // namespace header_parser
