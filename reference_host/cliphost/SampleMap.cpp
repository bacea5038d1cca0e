// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/SampleMap.h"

#include <fmt/format.h>

#include <algorithm>

#include "reference_host/framework/Guard.h"

namespace cliphost {
namespace {

using host::Check;

struct Property {
    std::uint64_t value;
    const char* words;
};
constexpr Property kProperties[] = {
    {1024, "stands alone"}, {2048, "needs one other"}, {4096, "needs two others"}};

// One cause makes many faults; the first few show it.
constexpr std::size_t kMostFaults = 8;

void Tell(RunMap& map, std::string fault) {
    if (map.faults.size() < kMostFaults) {
        map.faults.push_back(std::move(fault));
    } else if (map.faults.size() == kMostFaults) {
        map.faults.emplace_back("... and more");
    }
}

// Where a sample is. Sound may have several samples in a packet, which all have the
// packet's place.
struct Stored {
    std::uint64_t position = 0;
    std::uint64_t size = 0;

    bool SharesPacketWith(const Stored& other) const {
        return size > 0 && size == other.size && position == other.position;
    }
};

Stored ReadStored(NMA::ISampleMapping& map, ncfUInt32 track, std::uint64_t sample) {
    ncfUInt64 size = 0;  // the low half is written
    ncfUInt64 position = 0;
    Check(map.GetSampleSize(track, sample, &size));
    Check(map.GetSamplePosition(track, sample, &position));
    return {position, size};
}

// Adds up the samples of a run, the first of the `samples` that are left to measure,
// until their packets have the bytes of the run.
class RunMeasure {
public:
    RunMeasure(NMA::ISampleMapping& map, ncfUInt32 track, std::uint64_t samples, SampleRun& run)
        : map_(map), track_(track), left_(samples - run.first), run_(run) {}

    // Gives the bytes of the packets.
    std::uint64_t Run() {
        first_ = Read(0);
        return ArePacketsEven() ? run_.bytes : MeasureEachSample();
    }

private:
    Stored Read(std::uint64_t sample) { return ReadStored(map_, track_, run_.first + sample); }

    // How many samples the first packet holds, in steps that grow and then halve.
    std::uint64_t CountInFirstPacket() {
        std::uint64_t inside = 0, outside = left_;
        for (std::uint64_t step = 1; inside + 1 < outside;) {
            const bool isGrowing = step > 0 && step < outside - inside;
            const std::uint64_t at = isGrowing ? inside + step : inside + (outside - inside) / 2;
            const bool isInside = Read(at).SharesPacketWith(first_);
            (isInside ? inside : outside) = at;
            step = isGrowing && isInside ? step * 2 : 0;
        }
        return inside + 1;
    }

    // Packets that all have one size and hold equally many samples, as those of
    // PCM, need not be asked one by one.
    bool ArePacketsEven() {
        if (first_.size == 0 || run_.bytes == 0 || run_.bytes % first_.size != 0) {
            return false;
        }
        const std::uint64_t packets = run_.bytes / first_.size;
        const std::uint64_t inPacket = CountInFirstPacket();
        if (packets - 1 > (left_ - 1) / inPacket) {
            return false;
        }
        const std::uint64_t begin = (packets - 1) * inPacket;  // of the last packet
        const std::uint64_t count = begin + std::min(inPacket, left_ - begin);
        const Stored last{run_.position + (packets - 1) * first_.size, first_.size};
        if (!Read(begin).SharesPacketWith(last) || !Read(count - 1).SharesPacketWith(last)) {
            return false;
        }
        run_.count = count;
        return true;
    }

    std::uint64_t MeasureEachSample() {
        Stored last = first_;
        std::uint64_t sum = first_.size;
        for (run_.count = 1; run_.count < left_; ++run_.count) {
            const Stored stored = Read(run_.count);
            const bool isNew = !stored.SharesPacketWith(last);
            if (isNew && sum >= run_.bytes) {
                break;
            }
            sum += isNew ? stored.size : 0;
            last = stored;
        }
        return sum;
    }

    NMA::ISampleMapping& map_;
    ncfUInt32 track_;
    std::uint64_t left_;
    SampleRun& run_;
    Stored first_;
};

// Reads the run that begins with a sample, and tells what is wrong with it.
SampleRun ReadRun(NMA::ISampleMapping& map, ncfUInt32 track, std::uint64_t first,
                  std::uint64_t fileSize, RunMap& found) {
    SampleRun run{first, 0, 0, 0};
    ncfUInt64 position = 0, bytes = 0;
    Check(map.GetSamplePosition(track, first, &position));
    Check(map.GetNumberOfContiguousBytes(track, first, &bytes));
    run.position = position;
    run.bytes = bytes;
    const std::uint64_t sum = RunMeasure(map, track, found.samples, run).Run();
    if (sum != run.bytes) {
        Tell(found, fmt::format("from sample {} on {} bytes follow each other, but the sizes of "
                                "the samples come to {}",
                                first, run.bytes, sum));
    }
    if (run.position > fileSize || run.bytes > fileSize - run.position) {
        Tell(found, fmt::format("{} at bytes {} to {}, and the file ends at {}",
                                run.count == 1 ? fmt::format("sample {} lies", first)
                                               : fmt::format("samples {} to {} lie", first,
                                                             first + run.count - 1),
                                run.position, run.position + run.bytes, fileSize));
    }
    found.bytes += sum;
    return run;
}

}  // namespace

NCFRESULT ReadMappedSample(NMA::ISampleMapping& map, ncfUInt32 track, std::uint64_t number,
                           MappedSample& sample, TemporalOffsets* offsets) {
    sample = {};
    sample.number = number;
    const NCFRESULT result = host::Guarded([&] {
        ncfUInt64 flags = 0, runBytes = 0;
        ncfUInt32 dependencies = 0;
        ncfSInt64 runSamples = 0;
        const Stored stored = ReadStored(map, track, number);
        Check(map.GetSampleProperties(track, number, &flags, &dependencies));
        Check(map.GetNumberOfContiguousSamples(track, number, &runSamples));
        Check(map.GetNumberOfContiguousBytes(track, number, &runBytes));
        sample.position = stored.position;
        sample.size = stored.size;
        sample.properties = flags;
        sample.dependencies = dependencies;
        sample.contiguousSamples = runSamples;
        sample.contiguousBytes = runBytes;
        return NCF_OK;
    });
    if (result >= 0) {
        sample.temporalOffset = offsets ? offsets->Of(number) : AskOffset(map, track, number);
    }
    return result;
}

std::string WordsForProperties(std::uint64_t properties) {
    for (const Property& property : kProperties) {
        if (property.value == properties) {
            return property.words;
        }
    }
    return fmt::format("{}", properties);
}

RunMap ReadRuns(NMA::ISampleMapping& map, ncfUInt32 track, std::uint64_t fileSize) {
    RunMap found;
    try {
        ncfUInt64 samples = 0;
        found.result = map.GetNumberOfSamples(track, &samples);
        found.samples = samples;
        Check(found.result);
        for (std::uint64_t next = 0; next < found.samples; next += found.runs.back().count) {
            found.runs.push_back(ReadRun(map, track, next, fileSize, found));
        }
    } catch (NCFRESULT failure) {  // memory that runs out is not the movie's fault
        found.result = failure;
    }
    return found;
}

}  // namespace cliphost
