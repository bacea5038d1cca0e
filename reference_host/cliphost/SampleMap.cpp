// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/SampleMap.h"

#include <fmt/format.h>

#include <algorithm>

namespace cliphost {
namespace {

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

NCFRESULT ReadStored(NMA::ISampleMapping& map, ncfUInt32 track, std::uint64_t sample,
                     Stored& stored) {
    ncfUInt64 size = 0;  // the low half is written
    ncfUInt64 position = 0;
    NCFRESULT result = map.GetSampleSize(track, sample, &size);
    if (result >= 0) {
        result = map.GetSamplePosition(track, sample, &position);
    }
    stored = {position, size};
    return result;
}

// Adds up the samples of a run, the first of the `samples` that are left to measure,
// until their packets have the bytes of the run.
class RunMeasure {
public:
    RunMeasure(NMA::ISampleMapping& map, ncfUInt32 track, std::uint64_t samples, SampleRun& run)
        : map_(map), track_(track), left_(samples - run.first), run_(run) {}

    // `sum`: the bytes of the packets.
    NCFRESULT Run(std::uint64_t& sum) {
        NCFRESULT result = Read(0, first_);
        bool isEven = false;
        if (result >= 0) {
            result = MeasureEvenPackets(isEven);
        }
        if (result < 0 || isEven) {
            sum = run_.bytes;
            return result;
        }
        return MeasureEachSample(sum);
    }

private:
    NCFRESULT Read(std::uint64_t sample, Stored& stored) {
        return ReadStored(map_, track_, run_.first + sample, stored);
    }

    // How many samples the first packet holds, in steps that grow and then halve.
    NCFRESULT CountInFirstPacket(std::uint64_t& count) {
        std::uint64_t inside = 0, outside = left_;
        for (std::uint64_t step = 1; inside + 1 < outside;) {
            const bool isGrowing = step > 0 && step < outside - inside;
            const std::uint64_t at = isGrowing ? inside + step : inside + (outside - inside) / 2;
            Stored stored;
            const NCFRESULT result = Read(at, stored);
            if (result < 0) {
                return result;
            }
            const bool isInside = stored.SharesPacketWith(first_);
            (isInside ? inside : outside) = at;
            step = isGrowing && isInside ? step * 2 : 0;
        }
        count = inside + 1;
        return NCF_OK;
    }

    // Packets that all have one size and hold equally many samples, as those of
    // PCM, need not be asked one by one.
    NCFRESULT MeasureEvenPackets(bool& isEven) {
        if (first_.size == 0 || run_.bytes == 0 || run_.bytes % first_.size != 0) {
            return NCF_OK;
        }
        const std::uint64_t packets = run_.bytes / first_.size;
        std::uint64_t inPacket = 1;
        NCFRESULT result = CountInFirstPacket(inPacket);
        if (result < 0 || packets - 1 > (left_ - 1) / inPacket) {
            return result;
        }
        const std::uint64_t begin = (packets - 1) * inPacket;  // of the last packet
        const std::uint64_t count = begin + std::min(inPacket, left_ - begin);
        const Stored wanted{run_.position + (packets - 1) * first_.size, first_.size};
        for (const std::uint64_t at : {begin, count - 1}) {
            Stored stored;
            result = Read(at, stored);
            if (result < 0 || !stored.SharesPacketWith(wanted)) {
                return result;
            }
        }
        isEven = true;
        run_.count = count;
        return NCF_OK;
    }

    NCFRESULT MeasureEachSample(std::uint64_t& sum) {
        Stored last = first_;
        sum = first_.size;
        for (run_.count = 1; run_.count < left_; ++run_.count) {
            Stored stored;
            const NCFRESULT result = Read(run_.count, stored);
            if (result < 0) {
                return result;
            }
            const bool isNew = !stored.SharesPacketWith(last);
            if (isNew && sum >= run_.bytes) {
                break;
            }
            sum += isNew ? stored.size : 0;
            last = stored;
        }
        return NCF_OK;
    }

    NMA::ISampleMapping& map_;
    ncfUInt32 track_;
    std::uint64_t left_;
    SampleRun& run_;
    Stored first_;
};

}  // namespace

NCFRESULT ReadMappedSample(NMA::ISampleMapping& map, ncfUInt32 track, std::uint64_t number,
                           MappedSample& sample, TemporalOffsets* offsets) {
    sample = {};
    sample.number = number;
    ncfUInt64 flags = 0, runBytes = 0;
    ncfUInt32 dependencies = 0;
    ncfSInt64 runSamples = 0;
    Stored stored;
    NCFRESULT result = ReadStored(map, track, number, stored);
    if (result >= 0) {
        result = map.GetSampleProperties(track, number, &flags, &dependencies);
    }
    if (result >= 0) {
        result = map.GetNumberOfContiguousSamples(track, number, &runSamples);
    }
    if (result >= 0) {
        result = map.GetNumberOfContiguousBytes(track, number, &runBytes);
    }
    if (result < 0) {
        return result;
    }
    sample.position = stored.position;
    sample.size = stored.size;
    sample.properties = flags;
    sample.dependencies = dependencies;
    sample.contiguousSamples = runSamples;
    sample.contiguousBytes = runBytes;
    sample.temporalOffset = offsets ? offsets->Of(number) : AskOffset(map, track, number);
    return NCF_OK;
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
    ncfUInt64 samples = 0;
    found.result = map.GetNumberOfSamples(track, &samples);
    found.samples = samples;
    std::uint64_t next = 0;
    while (found.result >= 0 && next < found.samples) {
        SampleRun run{next, 0, 0, 0};
        ncfUInt64 position = 0, bytes = 0;
        std::uint64_t sum = 0;
        found.result = map.GetSamplePosition(track, next, &position);
        if (found.result >= 0) {
            found.result = map.GetNumberOfContiguousBytes(track, next, &bytes);
        }
        run.position = position;
        run.bytes = bytes;
        if (found.result >= 0) {
            found.result = RunMeasure(map, track, found.samples, run).Run(sum);
        }
        if (found.result < 0) {
            break;
        }
        if (sum != run.bytes) {
            Tell(found,
                 fmt::format("from sample {} on {} bytes follow each other, but the sizes of "
                             "the samples come to {}",
                             next, run.bytes, sum));
        }
        if (run.position > fileSize || run.bytes > fileSize - run.position) {
            Tell(found, fmt::format("{} at bytes {} to {}, and the file ends at {}",
                                    run.count == 1 ? fmt::format("sample {} lies", next)
                                                   : fmt::format("samples {} to {} lie", next,
                                                                 next + run.count - 1),
                                    run.position, run.position + run.bytes, fileSize));
        }
        found.bytes += sum;
        next += run.count;
        found.runs.push_back(run);
    }
    return found;
}

}  // namespace cliphost
