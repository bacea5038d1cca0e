// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Every sound codec that FFmpeg both writes into a movie and reads.

#include <algorithm>

#include "tests/system/codecs/Codecs.h"
#include "tests/system/codecs/Words.h"

namespace {

// Lists are words with a space between. Tested always are the first of each
// list, and the second of each.
struct SoundCodec {
    const char* name;
    const char* options;
    const char* endings;
    const char* rates = "48000 44100 22050 96000";
    const char* layouts = "stereo mono 5.1";
};

constexpr const char* kBroadcastRates = "48000 44100 32000";
constexpr const char* kLayer3Rates = "48000 44100 22050";

constexpr SoundCodec kCodecs[] = {
    {"aac", "-c:a aac -aac_pns 0", "mov mp4 m4a"},
    {"ac3", "-c:a ac3", "mov mp4", kBroadcastRates},
    {"adpcm_g722", "-c:a g722", "mov", "16000", "mono"},
    {"adpcm_g726", "-c:a g726", "mov", "8000", "mono"},
    {"adpcm_ima_qt", "-c:a adpcm_ima_qt", "mov", "48000 44100 22050 96000", "stereo mono"},
    {"adpcm_ima_wav", "-c:a adpcm_ima_wav", "mov", "48000 44100 22050 96000", "stereo mono"},
    {"adpcm_ms", "-c:a adpcm_ms", "mov", "48000 44100 22050 96000", "stereo mono"},
    {"adpcm_yamaha", "-c:a adpcm_yamaha", "mov", "48000 44100 22050 96000", "stereo mono"},
    {"alac", "-c:a alac", "mov mp4 m4a"},
    {"alac_24", "-c:a alac -sample_fmt s32p", "mov mp4"},
    {"dts", "-c:a dca -strict -2", "mp4 mov", kBroadcastRates, "stereo 5.1"},
    {"eac3", "-c:a eac3", "mov mp4", kBroadcastRates},
    {"flac", "-c:a flac -strict -2", "mp4"},
    {"flac_24", "-c:a flac -sample_fmt s32 -strict -2", "mp4"},
    {"g723_1", "-c:a g723_1 -b:a 6300", "mov", "8000", "mono"},
    {"gsm", "-c:a libgsm", "mov", "8000", "mono"},
    {"gsm_ms", "-c:a libgsm_ms", "mov", "8000", "mono"},
    {"mp2", "-c:a mp2", "mov mp4", kLayer3Rates, "stereo mono"},
    {"mp2_twolame", "-c:a libtwolame", "mov mp4", kLayer3Rates, "stereo mono"},
    {"mp3", "-c:a libmp3lame", "mov mp4", kLayer3Rates, "stereo mono"},
    {"opus", "-c:a libopus -mapping_family 1", "mp4", "48000"},
    {"opus_native", "-c:a opus -strict -2", "mp4", "48000", "stereo mono"},
    {"pcm_alaw", "-c:a pcm_alaw", "mov"},
    {"pcm_f32be", "-c:a pcm_f32be", "mov"},
    {"pcm_f32le", "-c:a pcm_f32le", "mov"},
    {"pcm_f64be", "-c:a pcm_f64be", "mov"},
    {"pcm_f64le", "-c:a pcm_f64le", "mov"},
    {"pcm_mulaw", "-c:a pcm_mulaw", "mov"},
    {"pcm_s16be", "-c:a pcm_s16be", "mov"},
    {"pcm_s16le", "-c:a pcm_s16le", "mov"},
    {"pcm_s24be", "-c:a pcm_s24be", "mov"},
    {"pcm_s24le", "-c:a pcm_s24le", "mov"},
    {"pcm_s32be", "-c:a pcm_s32be", "mov"},
    {"pcm_s32le", "-c:a pcm_s32le", "mov"},
    {"pcm_s8", "-c:a pcm_s8", "mov"},
    {"pcm_u8", "-c:a pcm_u8", "mov"},
    {"speex", "-c:a libspeex", "mov", "32000 16000 8000", "stereo mono"},
    {"truehd", "-c:a truehd -strict -2", "mp4", "48000 44100 96000", "stereo 5.1"},
    {"vorbis", "-c:a libvorbis", "mp4 mov"},
};

struct SoundFeature {
    const char* name;
    const char* options;
    const char* ending;
    const char* copyBefore = "";
    const char* copyBehind = "";
};

constexpr SoundFeature kFeatures[] = {
    {"aac_in_fragments", "-c:a aac -aac_pns 0 -movflags +frag_keyframe+empty_moov", "mp4"},
    {"aac_with_an_edit", "-c:a aac -aac_pns 0", "mov", "-ss 0.2"},
    {"pcm_with_an_edit", "-c:a pcm_s16le", "mov", "-ss 0.2"},
    {"pcm_with_a_gap_in_front", "-c:a pcm_s16le", "mov", "-itsoffset 0.25"},
    {"aac_in_another_time_scale", "-c:a aac -aac_pns 0 -ar 44100", "mp4", "",
     "-movie_timescale 48000"},
};

// A tone of its own in each channel.
std::string Source(const std::string& rate, const std::string& layout) {
    const std::string left = "0.3*sin(440*2*PI*t)";
    const std::string tones =
        layout == "mono"     ? left
        : layout == "stereo" ? left + "|0.2*sin(660*2*PI*t)"
                             : left + "|0.2*sin(660*2*PI*t)|0.25*sin(550*2*PI*t)|" +
                                   "0.1*sin(60*2*PI*t)|0.15*sin(880*2*PI*t)|0.2*sin(770*2*PI*t)";
    return "aevalsrc='" + tones + "':c=" + layout + ":s=" + rate + ":d=0.6";
}

}  // namespace

std::vector<CodecCase> SoundCases() {
    std::vector<CodecCase> cases;
    for (const SoundCodec& codec : kCodecs) {
        const auto endings = Words(codec.endings), rates = Words(codec.rates),
                   layouts = Words(codec.layouts);
        for (std::size_t e = 0; e < endings.size(); ++e) {
            for (std::size_t r = 0; r < rates.size(); ++r) {
                for (std::size_t l = 0; l < layouts.size(); ++l) {
                    const auto nth = [&](std::size_t n) {
                        return e == std::min(n, endings.size() - 1) &&
                               r == std::min(n, rates.size() - 1) &&
                               l == std::min(n, layouts.size() - 1);
                    };
                    cases.push_back({std::string(codec.name) + "_" + rates[r] + "_" + layouts[l] +
                                         "_" + endings[e],
                                     Source(rates[r], layouts[l]), codec.options, endings[e], "",
                                     "", nth(0) || nth(1)});
                }
            }
        }
    }
    for (const SoundFeature& feature : kFeatures) {
        cases.push_back({feature.name, Source("48000", "stereo"), feature.options, feature.ending,
                         feature.copyBefore, feature.copyBehind, true});
    }
    return cases;
}
