// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "tests/system/codecs/SoundCheck.h"

#include <fmt/format.h>

#include <algorithm>
#include <random>

#include "reference_host/cliphost/SoundReader.h"
#include "tests/system/EssenceSupport.h"

namespace {

using cliphost::SoundReader;

EssenceBytes ReadAll(SoundReader& reader, std::vector<std::string>& differences) {
    EssenceBytes all;
    constexpr std::uint64_t piece = 1021;  // divides nothing
    for (std::uint64_t at = 0; at < reader.Count(); at += piece) {
        const auto block = reader.Read(at, std::min(piece, reader.Count() - at));
        if (block.isSilence) {
            differences.push_back(fmt::format("silence for what can't be read, from {}", at));
            return all;
        }
        all.insert(all.end(), block.bytes, block.bytes + block.size);
    }
    return all;
}

void CompareRanges(SoundReader& reader, const EssenceBytes& all,
                   std::vector<std::string>& differences) {
    const std::size_t frame = reader.form().FrameBytes();
    if (all.size() != reader.Count() * frame) {
        differences.push_back("the whole is not read");
        return;
    }
    std::mt19937 random(20260131);
    for (int i = 0; i < 12; ++i) {
        const std::uint64_t at = random() % reader.Count();
        const std::uint64_t count =
            1 + random() % std::min<std::uint64_t>(5000, reader.Count() - at);
        const auto block = reader.Read(at, count);
        if (block.size != count * frame ||
            !std::equal(block.bytes, block.bytes + block.size,
                        all.begin() + static_cast<std::ptrdiff_t>(at * frame))) {
            differences.push_back(fmt::format(
                "{} samples from {} read alone differ from those of a whole read", count, at));
            return;
        }
    }
}

}  // namespace

std::vector<std::string> SoundDifferences(cliphost::Essence& essence, const std::string& reading) {
    const cliphost::ClipTrack* const track = essence.First(cliphost::TrackKind::Sound);
    if (!track) {
        return {"there is no sound track"};
    }
    SoundReader reader(essence, *track);
    std::vector<std::string> differences;
    const EssenceBytes got = ReadAll(reader, differences);
    // What an edit leaves empty in front is silence, as in a player.
    const EssenceBytes wanted = Decoded(
        essence.movie(), "-map 0:a:0 -af aresample=async=1:first_pts=0 -f s24le -c:a pcm_s24le",
        "-copyts " + reading);
    if (got.empty() || wanted.empty()) {
        return {fmt::format("{} bytes, ffmpeg gives {}", got.size(), wanted.size())};
    }
    const std::size_t frame = reader.form().FrameBytes();
    // ffmpeg plays the last packet out; a clip of sound alone ends with its last
    // whole frame of the editor's 25 a second.
    const std::size_t most = 8192 * frame;
    if (got.size() > wanted.size() || wanted.size() - got.size() >= most) {
        differences.push_back(
            fmt::format("{} samples, ffmpeg gives {}", got.size() / frame, wanted.size() / frame));
    }
    const std::size_t both = std::min(got.size(), wanted.size());
    const auto unlike =
        std::mismatch(got.begin(), got.begin() + static_cast<std::ptrdiff_t>(both), wanted.begin());
    const auto same = static_cast<std::size_t>(unlike.first - got.begin());
    if (same < both) {
        differences.push_back(
            fmt::format("sample {} of channel {} is another", same / frame, same % frame / 3));
    }
    return differences;
}

std::vector<std::string> SoundRangeDifferences(cliphost::Essence& essence) {
    const cliphost::ClipTrack* const track = essence.First(cliphost::TrackKind::Sound);
    if (!track) {
        return {"there is no sound track"};
    }
    SoundReader reader(essence, *track);
    std::vector<std::string> differences;
    CompareRanges(reader, ReadAll(reader, differences), differences);
    return differences;
}
