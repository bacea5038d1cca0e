// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/movie_writer/TrackAtoms.h"

#include <algorithm>
#include <cmath>

namespace movies {

namespace {

void PutInto(Box& parent, const Box& child, const Track& track) {
    Put(parent, child, track.replaced, track.omitted);
}

void Time(Box& box, unsigned version, std::uint64_t value) {
    version == 1 ? box.U64(value) : box.U32(value);
}

Box TrackHeader(const Track& track, std::uint32_t id, std::uint32_t movieTimeScale,
                std::uint64_t creationTime) {
    Box box("tkhd");
    box.Version(track.headerVersion, track.flags);
    Time(box, track.headerVersion, creationTime);
    Time(box, track.headerVersion, creationTime);
    box.U32(id).U32(0);
    Time(box, track.headerVersion,
         track.trackDuration.value_or(TrackDurationOf(track, movieTimeScale)));
    box.U64(0).U16(0).U16(0).U16(track.handler == "soun" ? 0x0100 : 0).U16(0);
    for (std::size_t i = 0; i < 9; ++i) {
        i % 3 == 2 ? box.Fixed30(track.matrix[i]) : box.Fixed16(track.matrix[i]);
    }
    return box.Fixed16(track.width).Fixed16(track.height);
}

Box EditList(const Track& track) {
    Box box("elst");
    box.Version(track.editVersion).U32(track.edits.size());
    for (const Edit& edit : track.edits) {
        Time(box, track.editVersion, edit.duration);
        Time(box, track.editVersion, static_cast<std::uint64_t>(edit.mediaTime));
        box.Fixed16(edit.rate);
    }
    return box;
}

Box MediaHeader(const Track& track, std::uint64_t creationTime) {
    Box box("mdhd");
    box.Version(track.headerVersion);
    Time(box, track.headerVersion, creationTime);
    Time(box, track.headerVersion, creationTime);
    box.U32(track.mediaTimeScale);
    Time(box, track.headerVersion, track.mediaDuration.value_or(MediaDurationOf(track)));
    return box.U16(0x55C4).U16(0);
}

Box KindHeader(const Track& track) {
    if (track.handler == "vide") {
        return Box("vmhd").Version(0, 1).Zeros(8);
    }
    if (track.handler == "soun") {
        return Box("smhd").Version(0).Zeros(4);
    }
    return Box("gmhd").Add(Box("gmin").Version(0).Zeros(12));
}

Box DataInformation(const Track& track) {
    Box references("dref");
    references.Version(0).U32(track.dataReferences.size());
    for (const DataReference& reference : track.dataReferences) {
        references.Add(
            Box(reference.type).Version(0, reference.selfContained ? 1 : 0).Text(reference.text));
    }
    Box box("dinf");
    PutInto(box, references, track);
    return box;
}

// Writes (count, value) pairs of equal neighbours.
template <typename ValueOf>
Box RunTable(const char* type, unsigned version, const Track& track, ValueOf valueOf) {
    std::vector<std::pair<std::uint64_t, std::uint32_t>> runs;
    for (const SampleRun& run : track.samples) {
        const auto value = static_cast<std::uint32_t>(valueOf(run));
        if (!runs.empty() && runs.back().second == value) {
            runs.back().first += run.count;
        } else if (run.count > 0) {
            runs.emplace_back(run.count, value);
        }
    }
    Box box(type);
    box.Version(version).U32(runs.size());
    for (const auto& [count, value] : runs) {
        box.U32(count).U32(value);
    }
    return box;
}

std::uint64_t SampleCount(const Track& track) {
    std::uint64_t count = 0;
    for (const SampleRun& run : track.samples) {
        count += run.count;
    }
    return count;
}

template <typename Visit>
void ForEachSample(const Track& track, Visit visit) {
    std::uint64_t number = 0;
    for (const SampleRun& run : track.samples) {
        for (std::uint64_t i = 0; i < run.count; ++i) {
            visit(run, ++number);
        }
    }
}

bool SizesAreEqual(const Track& track) {
    return std::all_of(track.samples.begin(), track.samples.end(), [&](const SampleRun& run) {
        return run.size == track.samples.front().size;
    });
}

Box CompactSizes(const Track& track) {
    Box box("stz2");
    box.Version(0).U32(track.compactSizeBits).U32(SampleCount(track));
    unsigned half = 0;
    ForEachSample(track, [&](const SampleRun& run, std::uint64_t number) {
        if (track.compactSizeBits == 16) {
            box.U16(run.size);
        } else if (track.compactSizeBits == 8) {
            box.U8(run.size);
        } else if (number % 2 == 1) {
            half = run.size << 4;
        } else {
            box.U8(half | run.size);
            half = 0;
        }
    });
    if (track.compactSizeBits == 4 && SampleCount(track) % 2 == 1) {
        box.U8(half);
    }
    return box;
}

Box Sizes(const Track& track) {
    if (track.compactSizeBits != 0) {
        return CompactSizes(track);
    }
    Box box("stsz");
    box.Version(0);
    if (track.claimedSampleSize) {
        return box.U32(*track.claimedSampleSize).U32(SampleCount(track));
    }
    if (!track.samples.empty() && SizesAreEqual(track) && track.samples.front().size != 0) {
        return box.U32(track.samples.front().size).U32(SampleCount(track));
    }
    box.U32(0).U32(SampleCount(track));
    ForEachSample(track, [&](const SampleRun& run, std::uint64_t) { box.U32(run.size); });
    return box;
}

Box SamplesToChunks(const std::vector<Chunk>& chunks) {
    std::vector<std::size_t> starts;
    for (std::size_t i = 0; i < chunks.size(); ++i) {
        if (i == 0 || chunks[i].samples != chunks[i - 1].samples ||
            chunks[i].description != chunks[i - 1].description) {
            starts.push_back(i);
        }
    }
    Box box("stsc");
    box.Version(0).U32(starts.size());
    for (const std::size_t start : starts) {
        box.U32(start + 1).U32(chunks[start].samples).U32(chunks[start].description);
    }
    return box;
}

Box ChunkPositions(const Track& track, const std::vector<Chunk>& chunks) {
    Box box(track.largeOffsets ? "co64" : "stco");
    box.Version(0).U32(chunks.size());
    for (const Chunk& chunk : chunks) {
        track.largeOffsets ? box.U64(chunk.position) : box.U32(chunk.position);
    }
    return box;
}

Box SyncSamples(const Track& track) {
    std::vector<std::uint64_t> numbers;
    ForEachSample(track, [&](const SampleRun& run, std::uint64_t number) {
        if (run.sync) {
            numbers.push_back(number);
        }
    });
    Box box("stss");
    box.Version(0).U32(numbers.size());
    for (const std::uint64_t number : numbers) {
        box.U32(number);
    }
    return box;
}

Box Dependencies(const Track& track) {
    Box box("sdtp");
    box.Version(0);
    ForEachSample(track, [&](const SampleRun& run, std::uint64_t) {
        box.U8((run.sync ? 2u : 1u) << 4 | (run.disposable ? 2u : 1u) << 2);
    });
    return box;
}

template <typename Test>
bool Any(const Track& track, Test test) {
    return std::any_of(track.samples.begin(), track.samples.end(), test);
}

Box SampleTable(const Track& track, const std::vector<Chunk>& chunks) {
    Box table("stbl");
    Box descriptions("stsd");
    descriptions.Version(0).U32(track.descriptions.size()).Add(track.descriptions);
    PutInto(table, descriptions, track);
    PutInto(table, RunTable("stts", 0, track, [](const SampleRun& run) { return run.duration; }),
            track);
    if (Any(track, [](const SampleRun& run) { return run.displayOffset != 0; })) {
        PutInto(table,
                RunTable("ctts", track.offsetVersion, track,
                         [](const SampleRun& run) { return run.displayOffset; }),
                track);
    }
    if (Any(track, [](const SampleRun& run) { return !run.sync; })) {
        PutInto(table, SyncSamples(track), track);
    }
    if (Any(track, [](const SampleRun& run) { return run.disposable; })) {
        PutInto(table, Dependencies(track), track);
    }
    PutInto(table, SamplesToChunks(chunks), track);
    PutInto(table, Sizes(track), track);
    PutInto(table, ChunkPositions(track, chunks), track);
    table.Add(track.added);
    return table;
}

}  // namespace

std::vector<Chunk> ChunksOf(const Track& track) {
    std::vector<Chunk> chunks;
    std::uint64_t number = 0;
    for (const SampleRun& run : track.samples) {
        std::uint64_t left = run.count;
        while (left > 0) {
            if (chunks.empty() || chunks.back().samples == track.samplesPerChunk ||
                chunks.back().description != run.description) {
                chunks.push_back({number, 0, run.description, 0, 0});
            }
            Chunk& chunk = chunks.back();
            const std::uint64_t taken = std::min(left, track.samplesPerChunk - chunk.samples);
            chunk.samples += taken;
            chunk.size += taken * run.size;
            number += taken;
            left -= taken;
        }
    }
    return chunks;
}

std::uint64_t MediaDurationOf(const Track& track) {
    std::uint64_t duration = 0;
    for (const SampleRun& run : track.samples) {
        duration += run.count * run.duration;
    }
    return duration;
}

std::uint64_t TrackDurationOf(const Track& track, std::uint32_t movieTimeScale) {
    if (!track.edits.empty()) {
        std::uint64_t duration = 0;
        for (const Edit& edit : track.edits) {
            duration += edit.duration;
        }
        return duration;
    }
    const double seconds =
        static_cast<double>(MediaDurationOf(track)) / std::max(track.mediaTimeScale, 1u);
    return static_cast<std::uint64_t>(std::llround(seconds * movieTimeScale));
}

void Put(Box& parent, const Box& child, const std::vector<Box>& replaced,
         const std::vector<std::string>& omitted) {
    if (std::find(omitted.begin(), omitted.end(), child.Type()) != omitted.end()) {
        return;
    }
    const auto other = std::find_if(replaced.begin(), replaced.end(),
                                    [&](const Box& box) { return box.Type() == child.Type(); });
    parent.Add(other == replaced.end() ? child : *other);
}

Box TrackBox(const Track& track, std::uint32_t id, std::uint32_t movieTimeScale,
             std::uint64_t creationTime, const std::vector<Chunk>& chunks) {
    Box information("minf");
    PutInto(information, KindHeader(track), track);
    PutInto(information, DataInformation(track), track);
    PutInto(information, SampleTable(track, chunks), track);

    Box media("mdia");
    PutInto(media, MediaHeader(track, creationTime), track);
    PutInto(media,
            Box("hdlr").Version(0).Code("mhlr").Code(track.handler).Zeros(12).Pascal("handler", 8),
            track);
    PutInto(media, information, track);

    Box box("trak");
    PutInto(box, TrackHeader(track, id, movieTimeScale, creationTime), track);
    if (!track.edits.empty()) {
        Box edits("edts");
        PutInto(edits, EditList(track), track);
        PutInto(box, edits, track);
    }
    PutInto(box, media, track);
    if (!track.userData.empty()) {
        box.Add(Box("udta").Add(track.userData).U32(0));
    }
    return box.Add(track.inTrack);
}

}  // namespace movies
