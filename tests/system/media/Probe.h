// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>
#include <filesystem>
#include <optional>
#include <string>
#include <vector>

// What ffprobe says of a file, as far as a description tells it too.
struct ProbedStream {
    std::uint32_t id = 0;    // of the track
    std::string kind;        // video, audio, data ...
    std::string tag;         // four-character code
    bool isPicture = false;  // an attached picture, no track
    int width = 0;
    int height = 0;
    double averageRate = 0;
    double start = 0;     // seconds
    double duration = 0;  // seconds, as edited
    std::uint64_t samples = 0;
    int sampleRate = 0;
    int channels = 0;
    std::string timecode;
};

struct ProbedFile {
    bool isReadable = false;
    std::string format;
    double duration = 0;
    std::vector<ProbedStream> streams;

    std::vector<ProbedStream> Of(const std::string& kind) const;
};

ProbedFile ProbeFile(const std::filesystem::path& file);

// Takes the lengths of the streams from their packets: what the header of a
// fragmented file says of them may be anything.
void MeasurePackets(const std::filesystem::path& file, ProbedFile& probed);
