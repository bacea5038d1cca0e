// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "tests/support/codecs/SoundCodecs.h"

#include "tests/system/codecs/Codecs.h"

namespace {

constexpr double kSeconds = 0.6;

// Movies whose sound lies or is presented in another way than from the first
// packet to the last.
struct SoundFeature {
    const char* name;
    const char* encoder;
    const char* ending;
    const char* copyBefore = "";
    const char* copyBehind = "";
    const char* rate = "48000";
};

constexpr const char* kAac = "-c:a aac -aac_pns 0";

constexpr SoundFeature kSoundFeatures[] = {
    {"aac_in_fragments", "-c:a aac -aac_pns 0 -movflags +frag_keyframe+empty_moov", "mp4"},
    {"aac_with_an_edit", kAac, "mov", "-ss 0.2"},
    {"aac_with_an_edit_in_the_first_packet", kAac, "mp4", "-ss 0.005"},
    {"aac_in_another_time_scale", kAac, "mp4", "", "-movie_timescale 48000", "44100"},
    {"aac_with_a_gap_in_front", kAac, "mov", "-itsoffset 0.25"},
    {"alac_with_an_edit", "-c:a alac", "mov", "-ss 0.2"},
    {"mp3_with_an_edit", "-c:a libmp3lame", "mp4", "-ss 0.2"},
    {"opus_with_an_edit", "-c:a libopus", "mp4", "-ss 0.2"},
    {"pcm_header_first", "-c:a pcm_s24le -movflags +faststart", "mov"},
    {"pcm_in_fragments", "-c:a pcm_s16le -movflags +frag_keyframe+empty_moov -frag_duration 200000",
     "mov"},
    {"pcm_with_an_edit", "-c:a pcm_s16le", "mov", "-ss 0.2"},
    {"pcm_with_a_gap_in_front", "-c:a pcm_s16le", "mov", "-itsoffset 0.25"},
};

}  // namespace

std::vector<CodecCase> SoundCodecCases() {
    std::vector<CodecCase> cases;
    for (const SoundCase& codec : SoundCases()) {
        cases.push_back({codec.name, SoundSource(codec.rate, codec.layout, kSeconds), codec.encoder,
                         codec.ending, codec.isBroad ? TestSet::kBroad : TestSet::kThorough, "", "",
                         codec.reading, codec.isExactAnywhere});
    }
    for (const SoundFeature& feature : kSoundFeatures) {
        cases.push_back({feature.name, SoundSource(feature.rate, "stereo", kSeconds),
                         feature.encoder, feature.ending, TestSet::kAlways, feature.copyBefore,
                         feature.copyBehind});
    }
    return cases;
}
