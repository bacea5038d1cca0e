// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "tests/system/media/Probe.h"

#include <algorithm>
#include <cstdio>
#include <cstdlib>
#include <nlohmann/json.hpp>
#include <sstream>

#include "tests/system/Command.h"

namespace {

double Quotient(const std::string& text) {
    double numerator = 0, denominator = 0;
    return std::sscanf(text.c_str(), "%lf/%lf", &numerator, &denominator) == 2 && denominator != 0
               ? numerator / denominator
               : 0;
}

double Number(const nlohmann::json& from, const char* name) {
    return std::atof(from.value(name, "0").c_str());
}

ProbedStream StreamOf(const nlohmann::json& json) {
    ProbedStream stream;
    stream.id = static_cast<std::uint32_t>(std::strtoul(json.value("id", "0").c_str(), nullptr, 0));
    stream.kind = json.value("codec_type", "");
    stream.tag = json.value("codec_tag_string", "");
    stream.width = json.value("width", 0);
    stream.height = json.value("height", 0);
    stream.averageRate = Quotient(json.value("avg_frame_rate", "0/0"));
    stream.start = Number(json, "start_time");
    stream.duration = Number(json, "duration");
    stream.samples = static_cast<std::uint64_t>(Number(json, "nb_frames"));
    stream.sampleRate = static_cast<int>(Number(json, "sample_rate"));
    stream.channels = json.value("channels", 0);
    stream.isPicture = json.contains("disposition") && json["disposition"].value("attached_pic", 0);
    if (json.contains("tags")) {
        stream.timecode = json["tags"].value("timecode", "");
    }
    return stream;
}

}  // namespace

std::vector<ProbedStream> ProbedFile::Of(const std::string& kind) const {
    std::vector<ProbedStream> found;
    for (const ProbedStream& stream : streams) {
        if (stream.kind == kind && !stream.isPicture) {
            found.push_back(stream);
        }
    }
    return found;
}

ProbedFile ProbeFile(const std::filesystem::path& file) {
    const std::string text = RunCommand(
                                 "ffprobe -v quiet -print_format json -show_streams "
                                 "-show_format " +
                                 Quoted(std::filesystem::absolute(file)))
                                 .out;
    ProbedFile probed;
    const nlohmann::json json = nlohmann::json::parse(text, nullptr, false);
    if (json.is_discarded() || !json.contains("format")) {
        return probed;
    }
    probed.isReadable = true;
    probed.format = json["format"].value("format_name", "");
    probed.duration = Number(json["format"], "duration");
    for (const nlohmann::json& stream : json.value("streams", nlohmann::json::array())) {
        probed.streams.push_back(StreamOf(stream));
    }
    return probed;
}

void MeasurePackets(const std::filesystem::path& file, ProbedFile& probed) {
    std::istringstream lines(
        RunCommand("ffprobe -v quiet -of csv=p=0 -show_entries packet=stream_index,duration_time " +
                   Quoted(std::filesystem::absolute(file)))
            .out);
    struct Sum {
        double packets = 0;
        double timed = 0;  // packets whose duration is told
        double seconds = 0;
    };
    std::vector<Sum> sums(probed.streams.size());
    for (std::string line; std::getline(lines, line);) {
        std::size_t stream = 0;
        double seconds = 0;
        const int read = std::sscanf(line.c_str(), "%zu,%lf", &stream, &seconds);
        if (read < 1 || stream >= sums.size()) {
            continue;
        }
        ++sums[stream].packets;
        sums[stream].timed += read == 2;
        sums[stream].seconds += read == 2 ? seconds : 0;
    }
    probed.duration = 0;
    for (std::size_t i = 0; i < sums.size(); ++i) {
        if (sums[i].timed > 0) {
            probed.streams[i].duration = sums[i].seconds / sums[i].timed * sums[i].packets;
            probed.duration = std::max(probed.duration, probed.streams[i].duration);
        }
    }
}
