// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/ReportSound.h"

#include <algorithm>
#include <cmath>
#include <cstdlib>
#include <nlohmann/json.hpp>

#include "reference_host/cliphost/Failure.h"
#include "reference_host/cliphost/SoundReader.h"

namespace cliphost {
namespace {

using Json = nlohmann::ordered_json;

constexpr std::uint64_t kColumnsOfWave = 240;
constexpr std::uint64_t kBlock = 65'536;  // samples of each channel read at a time
// Sound of more samples, half an hour at 48 kHz, is looked at in pieces.
constexpr std::uint64_t kMostWhole = 86'400'000;
constexpr std::uint64_t kPiece = 16'384;
constexpr double kMost = 8'388'608;  // of 24 bits

class Level {
public:
    void Add(const SoundReader::Block& block) {
        for (std::size_t at = 0; at + 3 <= block.size; at += 3) {
            const std::int32_t sample =
                static_cast<std::int32_t>(std::uint32_t{block.bytes[at]} << 8 |
                                          std::uint32_t{block.bytes[at + 1]} << 16 |
                                          std::uint32_t{block.bytes[at + 2]} << 24) /
                256;
            peak_ = std::max(peak_, std::abs(sample));
            squares_ += static_cast<double>(sample) * sample;
            ++count_;
        }
    }
    double Peak() const { return std::min(1.0, peak_ / kMost); }
    double Mean() const { return count_ == 0 ? 0.0 : std::sqrt(squares_ / count_) / kMost; }

private:
    std::int32_t peak_ = 0;
    double squares_ = 0;
    double count_ = 0;
};

int StepsOf(double level) {
    // The least sound is not nothing.
    return level > 0 ? std::max(1, static_cast<int>(std::lround(std::sqrt(level) * 255))) : 0;
}

}  // namespace

Json ReadWave(Essence& essence, const ClipTrack& track) {
    SoundReader sound(essence, track);
    if (sound.form().bits != 24) {
        throw Failure(kExitFile, essence.movie(), "its sound is not delivered in 24 bits");
    }
    const std::uint64_t count = sound.Count();
    const bool isWhole = count <= kMostWhole;
    const std::uint64_t columns = std::min(kColumnsOfWave, count);
    Json peaks = Json::array();
    Json means = Json::array();
    double highest = 0;
    bool hasSilence = false;
    for (std::uint64_t column = 0; column < columns; ++column) {
        const std::uint64_t first = count * column / columns;
        const std::uint64_t all = count * (column + 1) / columns - first;
        const std::uint64_t wanted = isWhole ? all : std::min(all, kPiece);
        Level level;
        for (std::uint64_t done = 0; done < wanted; done += kBlock) {
            const SoundReader::Block block =
                sound.Read(first + done, std::min(kBlock, wanted - done));
            hasSilence = hasSilence || block.isSilence;
            level.Add(block);
        }
        highest = std::max(highest, level.Peak());
        peaks.push_back(StepsOf(level.Peak()));
        means.push_back(StepsOf(level.Mean()));
    }
    Json wave = {
        {"track", track.number},
        {"seconds", sound.form().rate == 0 ? 0.0 : static_cast<double>(count) / sound.form().rate},
        {"isWhole", isWhole},
        {"lacksSamples", hasSilence},
        {"highest", highest > 0 ? Json(20 * std::log10(highest)) : Json()}};
    wave["peaks"] = std::move(peaks);
    wave["means"] = std::move(means);
    return wave;
}

}  // namespace cliphost
