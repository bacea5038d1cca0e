// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/SampleMap.h"

#include <fmt/format.h>

namespace cliphost {
namespace {

struct Property {
    std::uint64_t value;
    const char* words;
};
constexpr Property kProperties[] = {
    {1024, "stands alone"}, {2048, "needs one other"}, {4096, "needs two others"}};

// Faults of one kind come in crowds; the first few tell.
constexpr std::size_t kMostFaults = 8;

void Tell(RunMap& map, std::string fault) {
    if (map.faults.size() < kMostFaults) {
        map.faults.push_back(std::move(fault));
    } else if (map.faults.size() == kMostFaults) {
        map.faults.emplace_back("... and more");
    }
}

NCFRESULT SizeOf(NMA::ISampleMapping& map, ncfUInt32 track, std::uint64_t sample,
                 std::uint64_t& size) {
    ncfUInt64 answer = 0;  // the low half is written
    const NCFRESULT result = map.GetSampleSize(track, sample, &answer);
    size = answer;
    return result;
}

// Goes over samples until their sizes make up the run's bytes. Samples that all
// have one size, as those of PCM, need not be asked one by one.
NCFRESULT MeasureRun(NMA::ISampleMapping& map, ncfUInt32 track, std::uint64_t samples,
                     SampleRun& run, std::uint64_t& sum) {
    std::uint64_t first = 0, last = 0;
    NCFRESULT result = SizeOf(map, track, run.first, first);
    if (result < 0) {
        return result;
    }
    const std::uint64_t left = samples - run.first;
    if (first > 0 && run.bytes % first == 0 && run.bytes / first <= left &&
        SizeOf(map, track, run.first + run.bytes / first - 1, last) >= 0 && last == first) {
        ncfUInt64 lastPosition = 0;
        const std::uint64_t count = run.bytes / first;
        result = map.GetSamplePosition(track, run.first + count - 1, &lastPosition);
        if (result < 0) {
            return result;
        }
        if (lastPosition - run.position == (count - 1) * first) {
            run.count = count;
            sum = run.bytes;
            return NCF_OK;
        }
    }
    sum = 0;
    run.count = 0;
    do {
        std::uint64_t size = 0;
        result = SizeOf(map, track, run.first + run.count, size);
        if (result < 0) {
            return result;
        }
        sum += size;
        ++run.count;
    } while (sum < run.bytes && run.count < left);
    return NCF_OK;
}

}  // namespace

NCFRESULT ReadMappedSample(NMA::ISampleMapping& map, ncfUInt32 track, std::uint64_t number,
                           MappedSample& sample, TemporalOffsets* offsets) {
    sample = {};
    sample.number = number;
    ncfUInt64 position = 0, flags = 0, runBytes = 0;
    ncfUInt32 dependencies = 0;
    ncfSInt64 runSamples = 0;
    NCFRESULT result = SizeOf(map, track, number, sample.size);
    if (result >= 0) {
        result = map.GetSamplePosition(track, number, &position);
    }
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
    sample.position = position;
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
            found.result = MeasureRun(map, track, found.samples, run, sum);
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
