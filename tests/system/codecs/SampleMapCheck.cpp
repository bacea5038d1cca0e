// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "tests/system/codecs/SampleMapCheck.h"

#include <fmt/format.h>

#include <algorithm>
#include <numeric>

#include "reference_host/cliphost/SampleMap.h"
#include "tests/system/EssenceSupport.h"

namespace {

using cliphost::MappedSample;

constexpr ncfUInt64 kStandsAlone = 1024;

// The numbers of the packets in the order of display.
std::vector<std::size_t> Shown(const std::vector<Packet>& packets) {
    std::vector<std::size_t> shown(packets.size());
    std::iota(shown.begin(), shown.end(), 0);
    std::stable_sort(shown.begin(), shown.end(), [&](std::size_t a, std::size_t b) {
        return packets[a].time < packets[b].time;
    });
    return shown;
}

std::vector<std::string> ComparePackets(cliphost::Essence& essence, bool isPicture,
                                        const std::vector<Packet>& packets) {
    const auto shown = Shown(packets);
    std::vector<std::string> differences;
    const auto compare = [&](std::size_t i, const char* what, auto got, auto wanted) {
        if (got != wanted && differences.size() < 5) {
            differences.push_back(
                fmt::format("sample {}: {} {}, ffprobe has {}", i, what, got, wanted));
        }
    };
    for (std::size_t i = 0; i < packets.size(); ++i) {
        MappedSample sample;
        if (cliphost::ReadMappedSample(essence.map(), 0, i, sample) != NCF_OK) {
            differences.push_back(fmt::format("sample {} is not mapped", i));
            return differences;
        }
        compare(i, "position", sample.position, packets[i].position);
        compare(i, "size", sample.size, packets[i].size);
        if (!isPicture) {
            continue;
        }
        compare(i, "standing alone", sample.properties == kStandsAlone, packets[i].isKey);
        compare(i, "steps to what is shown there", sample.temporalOffset.value_or(INT64_MIN),
                static_cast<std::int64_t>(shown[i]) - static_cast<std::int64_t>(i));
    }
    return differences;
}

std::vector<std::string> CompareRuns(cliphost::Essence& essence,
                                     const std::vector<Packet>& packets) {
    const auto map =
        cliphost::ReadRuns(essence.map(), 0, std::filesystem::file_size(essence.movie()));
    std::vector<std::string> differences = map.faults;
    std::vector<std::pair<std::uint64_t, std::uint64_t>> wanted, got;
    const auto join = [](auto& runs, std::uint64_t position, std::uint64_t size) {
        if (!runs.empty() && runs.back().first + runs.back().second == position) {
            runs.back().second += size;
        } else {
            runs.emplace_back(position, size);
        }
    };
    for (const Packet& packet : packets) {
        join(wanted, packet.position, packet.size);
    }
    for (const auto& run : map.runs) {
        join(got, run.position, run.bytes);
    }
    if (got != wanted) {
        differences.push_back(
            fmt::format("{} runs, the first of {} bytes from {}; ffprobe has {}, "
                        "of {} from {}",
                        got.size(), got.empty() ? 0 : got[0].second, got.empty() ? 0 : got[0].first,
                        wanted.size(), wanted.empty() ? 0 : wanted[0].second,
                        wanted.empty() ? 0 : wanted[0].first));
    }
    return differences;
}

}  // namespace

std::vector<std::string> SampleMapDifferences(cliphost::Essence& essence) {
    if (essence.tracks().empty()) {
        return {"there is no track"};
    }
    const bool isPicture = essence.tracks()[0].kind == cliphost::TrackKind::Picture;
    const auto packets = PacketsOf(essence.movie(), isPicture ? "v:0" : "a:0");
    if (packets.empty()) {
        return {"ffprobe finds no packets"};
    }
    ncfUInt64 count = 0;
    if (essence.map().GetNumberOfSamples(0, &count) != NCF_OK) {
        return {"the samples are not counted"};
    }
    if (!isPicture && count != packets.size()) {
        return CompareRuns(essence, packets);
    }
    if (count != packets.size()) {
        return {fmt::format("{} samples, ffprobe has {} packets", count, packets.size())};
    }
    return ComparePackets(essence, isPicture, packets);
}
