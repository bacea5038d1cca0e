// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "tests/system/EssenceSupport.h"

#include <gtest/gtest.h>

#include <cmath>
#include <limits>
#include <sstream>

namespace {

template <class Number>
double Ratio(const std::vector<Number>& a, const std::vector<Number>& b, double most) {
    if (a.size() != b.size() || a.empty()) {
        return 0.0;
    }
    double sum = 0.0;
    for (std::size_t i = 0; i < a.size(); ++i) {
        const double difference = static_cast<double>(a[i]) - static_cast<double>(b[i]);
        sum += difference * difference;
    }
    return sum == 0.0 ? std::numeric_limits<double>::infinity()
                      : 10.0 * std::log10(most * most * static_cast<double>(a.size()) / sum);
}

}  // namespace

EssenceBytes Decoded(const std::filesystem::path& movie, const std::string& arguments,
                     const std::string& before) {
    const CommandResult result = RunCommand("ffmpeg -nostdin -v quiet " + before + " -i " +
                                            Quoted(movie) + " " + arguments + " -");
    EXPECT_EQ(result.status, 0) << movie << " " << arguments;
    return {result.out.begin(), result.out.end()};
}

std::vector<Packet> PacketsOf(const std::filesystem::path& movie, const std::string& stream) {
    const CommandResult result =
        RunCommand("ffprobe -v error -ignore_editlist 1 -select_streams " + stream +
                   " -show_entries packet=pts,size,pos,flags -of csv=p=0 " + Quoted(movie));
    EXPECT_EQ(result.status, 0) << movie;
    std::vector<Packet> packets;
    std::istringstream lines(result.out);
    for (std::string line; std::getline(lines, line);) {
        Packet packet;
        char flag = 0;
        long long time = 0;
        unsigned long long size = 0, position = 0;
        if (std::sscanf(line.c_str(), "%lld,%llu,%llu,%c", &time, &size, &position, &flag) == 4) {
            packet.time = time;
            packet.size = size;
            packet.position = position;
            packet.isKey = flag == 'K';
            packets.push_back(packet);
        }
    }
    return packets;
}

EssenceBytes OneFrame(cliphost::FrameReader& reader, std::uint64_t frame) {
    const NCFRESULT result = reader.Read(frame);
    if (result != NCF_OK) {
        ADD_FAILURE() << "frame " << frame << " gave " << std::hex << result;
        return {};
    }
    return {reader.bytes(), reader.bytes() + reader.frameBytes()};
}

EssenceBytes AllFrames(cliphost::Essence& essence, cliphost::TrackKind kind,
                       const std::string& format) {
    const cliphost::ClipTrack* const track = essence.First(kind);
    if (!track) {
        ADD_FAILURE() << essence.movie() << " has no such track";
        return {};
    }
    cliphost::FrameReader reader(essence, *track, format);
    EssenceBytes all;
    const std::uint64_t count = reader.Count();
    for (std::uint64_t frame = 0; frame < count; ++frame) {
        const EssenceBytes one = OneFrame(reader, frame);
        all.insert(all.end(), one.begin(), one.end());
    }
    return all;
}

double SignalToNoise(const EssenceBytes& a, const EssenceBytes& b) {
    return Ratio(a, b, 255.0);
}
double SignalToNoise16(const std::vector<std::uint16_t>& a, const std::vector<std::uint16_t>& b) {
    return Ratio(a, b, 65535.0);
}

void ExpectRandomRange(cliphost::SoundReader& reader, std::mt19937& random,
                       const EssenceBytes& all) {
    const std::size_t frame = reader.form().FrameBytes();
    const std::uint64_t at = random() % reader.Count();
    const std::uint64_t count = 1 + random() % std::min<std::uint64_t>(5000, reader.Count() - at);
    const auto block = reader.Read(at, count);
    ASSERT_EQ(block.size, count * frame);
    ASSERT_TRUE(std::equal(block.bytes, block.bytes + block.size,
                           all.begin() + static_cast<std::ptrdiff_t>(at * frame)))
        << count << " from " << at;
}
