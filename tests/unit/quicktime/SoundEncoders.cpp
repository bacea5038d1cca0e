// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "tests/unit/quicktime/SoundEncoders.h"

namespace quicktime_tests {

void PrintTo(const SoundEncoder& encoder, std::ostream* out) {
    *out << encoder.name;
}

const std::vector<SoundEncoder>& SoundEncoders() {
    static const std::vector<SoundEncoder> encoders = {
        {"S16le", "-c:a pcm_s16le", ".mov"},
        {"S16be", "-c:a pcm_s16be", ".mov"},
        {"S24le", "-c:a pcm_s24le", ".mov"},
        {"S24be", "-c:a pcm_s24be", ".mov"},
        {"S32le", "-c:a pcm_s32le", ".mov"},
        {"S32be", "-c:a pcm_s32be", ".mov"},
        {"S64le", "-c:a pcm_s64le", ".mov"},
        {"F32le", "-c:a pcm_f32le", ".mov"},
        {"F32be", "-c:a pcm_f32be", ".mov"},
        {"F64le", "-c:a pcm_f64le", ".mov"},
        {"F64be", "-c:a pcm_f64be", ".mov"},
        {"U8", "-c:a pcm_u8", ".mov"},
        {"S8", "-c:a pcm_s8", ".mov"},
        {"Alaw", "-c:a pcm_alaw", ".mov"},
        {"Mulaw", "-c:a pcm_mulaw", ".mov"},
        {"AlacMov", "-c:a alac", ".mov"},
        {"AlacMp4", "-c:a alac", ".mp4"},
        {"FlacMp4", "-c:a flac -strict -2", ".mp4"},
        {"Ima4", "-c:a adpcm_ima_qt", ".mov"},
        {"ImaWav", "-c:a adpcm_ima_wav", ".mov"},
        {"MsAdpcm", "-c:a adpcm_ms", ".mov"},
        {"SwfAdpcm", "-c:a adpcm_swf", ".mov", 44100, 1},
        {"YamahaAdpcm", "-c:a adpcm_yamaha", ".mov"},
        {"G722", "-c:a g722", ".mov", 16000, 1},
        {"G726", "-c:a g726", ".mov", 8000, 1},
        {"G7231", "-c:a g723_1", ".mov", 8000, 1},
        {"Gsm", "-c:a libgsm", ".mov", 8000, 1},
        {"GsmMs", "-c:a libgsm_ms", ".mov", 8000, 1},
        {"AacMov", "-c:a aac -aac_pns 0", ".mov"},
        {"AacMp4", "-c:a aac -aac_pns 0", ".mp4"},
        {"AacMono44100", "-c:a aac -aac_pns 0", ".mp4", 44100, 1},
        {"AacSurround", "-c:a aac -aac_pns 0", ".mp4", 48000, 6},
        {"Aac96000", "-c:a aac -aac_pns 0", ".mov", 96000, 2},
        {"AacNoise", "-c:a aac -b:a 48k", ".mov", 48000, 2, false},
        {"Ac3Mov", "-c:a ac3", ".mov"},
        {"Ac3Mp4", "-c:a ac3", ".mp4", 44100, 1},
        {"Ac3Surround", "-c:a ac3", ".mov", 48000, 6},
        {"Ac3Fixed", "-c:a ac3_fixed", ".mp4"},
        {"Eac3Mov", "-c:a eac3", ".mov"},
        {"Eac3Mp4", "-c:a eac3", ".mp4", 48000, 6},
        {"Dts", "-c:a dca -strict -2", ".mov"},
        {"DtsMp4", "-c:a dca -strict -2", ".mp4", 48000, 6},
        {"Mp2Mov", "-c:a mp2", ".mov"},
        {"Mp2Mp4", "-c:a mp2", ".mp4", 44100, 1},
        {"Mp2Fixed", "-c:a mp2fixed", ".mov"},
        {"Twolame", "-c:a libtwolame", ".mp4"},
        {"Mp3Mov", "-c:a libmp3lame", ".mov"},
        {"Mp3Mp4", "-c:a libmp3lame", ".mp4", 44100, 1},
        {"Mp3Variable", "-c:a libmp3lame -q:a 3", ".mp4"},
        {"Mp3Low", "-c:a libmp3lame", ".mp4", 22050, 2},
        {"Shine", "-c:a libshine -strict -2", ".mov"},
        {"OpusMp4", "-c:a libopus", ".mp4"},
        {"OpusMono", "-c:a libopus -b:a 24k", ".mp4", 48000, 1},
        {"VorbisMov", "-c:a libvorbis", ".mov"},
        {"VorbisMp4", "-c:a libvorbis", ".mp4", 44100, 1},
        {"OpusNative", "-c:a opus -strict -2", ".mp4"},
        {"VorbisNative", "-c:a vorbis -strict -2", ".mov"},
        {"Nellymoser", "-c:a nellymoser", ".mov", 8000, 1},
        {"Speex", "-c:a libspeex", ".mov", 8000, 1},
        {"Truehd", "-c:a truehd -strict -2", ".mp4"},
    };
    return encoders;
}

std::string SoundOf(const SoundEncoder& encoder, double seconds) {
    const std::string rate = std::to_string(encoder.rate);
    const std::string lasts = ":d=" + std::to_string(seconds);
    return "-f lavfi -i anoisesrc=c=pink:seed=1:a=0.2:r=" + rate + lasts +
           " -f lavfi -i sine=440:b=4:r=" + rate + lasts + " -filter_complex [0][1]amix=2 -ac " +
           std::to_string(encoder.channels) + " ";
}

}  // namespace quicktime_tests
