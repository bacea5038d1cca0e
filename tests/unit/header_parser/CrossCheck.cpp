// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Compares the header parser with ffprobe over real movies:
//
//     header_parser_crosscheck FOLDER|FILE ...
//
// For each file it prints what was refused and why, or compares every track:
// kind, number of samples, rate and size, and each packet's place, size, sync
// flag, duration and display offset. Exit status 1 when anything differs.

#include <algorithm>
#include <cstdio>
#include <filesystem>
#include <fstream>
#include <map>
#include <nlohmann/json.hpp>
#include <string>
#include <vector>

#include "reference_host/header_parser/QTParser.h"
#include "reference_host/util/Ref.h"
#include "tests/support/Quoted.h"

namespace {

using header_parser::QTParser;
using nlohmann::json;

int differences = 0;

void Differ(const std::string& file, const std::string& what) {
    std::printf("%s: DIFFERS: %s\n", file.c_str(), what.c_str());
    ++differences;
}

json Probe(const std::string& file) {
    const std::string command =
        "ffprobe -v quiet -ignore_editlist 1 -of json -show_streams -show_packets "
        "-show_entries packet=stream_index,pts,dts,duration,size,pos,flags " +
        Quoted(file);
    std::string text;
    if (FILE* pipe = popen(command.c_str(), "r")) {
        char buffer[65536];
        for (std::size_t n; (n = fread(buffer, 1, sizeof buffer, pipe)) > 0;) {
            text.append(buffer, n);
        }
        pclose(pipe);
    }
    return json::parse(text, nullptr, false);
}

struct Packet {
    ncfUInt64 position;
    ncfUInt64 size;
    ncfSInt64 offset;  // presentation minus decode
    ncfSInt64 decode;
    bool isKey;
    ncfSInt64 duration = -1;
};

using Packets = std::map<int, std::vector<Packet>>;

Packets PacketsOf(const json& probe) {
    Packets packets;
    for (const json& item : probe.value("packets", json::array())) {
        if (!item.contains("pos")) {
            continue;
        }
        const ncfSInt64 dts = item.value("dts", ncfSInt64{0});
        packets[item.value("stream_index", -1)].push_back(
            {std::stoull(item.value("pos", "0")), std::stoull(item.value("size", "0")),
             item.value("pts", dts) - dts, dts, item.value("flags", "").substr(0, 1) == "K"});
    }
    // A packet's own duration may be a guess of the decoder's, the distance of
    // decode times is none; the last packet has no next, so -1.
    for (auto& [index, list] : packets) {
        for (std::size_t i = 0; i < list.size(); ++i) {
            list[i].duration = i + 1 < list.size() ? list[i + 1].decode - list[i].decode : -1;
        }
    }
    return packets;
}

// Packets of the demuxer hold one sample, or many frames of linear sound.
void CompareSamples(const std::string& name, IQTSampleTable& table, std::vector<Packet> packets,
                    bool isSound) {
    std::sort(packets.begin(), packets.end(),
              [](const Packet& a, const Packet& b) { return a.position < b.position; });
    ncfUInt64 count = 0;
    table.GetNumSamples(&count);
    std::map<ncfUInt64, ncfUInt64> samples;  // place to sample, for samples with bytes
    ncfUInt64 bytes = 0;
    for (ncfUInt64 i = 1; i <= count; ++i) {
        ncfUInt64 position = 0;
        ncfUInt32 size = 0;
        table.GetDataOffset(i, &position);
        table.GetDataSizePerSample(i, &size);
        bytes += size;
        if (size > 0) {
            samples[position] = i;
        }
    }
    ncfUInt64 packetBytes = 0;
    int wrong = 0;
    bool hasShift = false;
    ncfSInt64 shift = 0;
    for (const Packet& packet : packets) {
        packetBytes += packet.size;
        const auto found = samples.find(packet.position);
        if (found == samples.end()) {
            ++wrong;
            continue;
        }
        ncfUInt32 size = 0;
        ncfUInt32 flags = 0;
        ncfSInt64 duration = 0;
        ncfSInt64 offset = 0;
        table.GetDataSizePerSample(found->second, &size);
        table.GetSampleFlags(found->second, &flags);
        table.GetDecodeDuration(found->second, &duration);
        table.GetDisplayOffset(found->second, &offset);
        const bool isWhole = size == packet.size;
        if (!hasShift) {
            shift = packet.offset - offset;
            hasShift = true;
        }
        const bool isSame =
            (isWhole && (packet.duration < 0 || duration == packet.duration) &&
             (flags == kQTSampleSync) == packet.isKey && offset + shift == packet.offset) ||
            (isSound && packet.size % size == 0);
        wrong += isSame ? 0 : 1;
        if (!isSame) {
            std::printf(
                "  at %llu: size %u/%llu flags %u key %d duration %lld/%lld offset %lld/%lld\n",
                static_cast<unsigned long long>(packet.position), size,
                static_cast<unsigned long long>(packet.size), flags, packet.isKey,
                static_cast<long long>(duration), static_cast<long long>(packet.duration),
                static_cast<long long>(offset + shift), static_cast<long long>(packet.offset));
        }
    }
    if (wrong > 0) {
        Differ(name, std::to_string(wrong) + " of " + std::to_string(packets.size()) + " packets");
    }
    if (bytes != packetBytes) {
        Differ(name, "bytes " + std::to_string(bytes) + ", packets " + std::to_string(packetBytes));
    }
}

template <typename Info>
void CompareTrack(const std::string& file, Info& track, const char* kind, const json& probe,
                  const Packets& packets) {
    ncfUInt32 id = 0;
    track.GetTrackId(&id);
    const std::string name = file + ": " + kind + " track " + std::to_string(id);
    for (const json& stream : probe.value("streams", json::array())) {
        if (std::stoul(stream.value("id", "0"), nullptr, 16) != id) {
            continue;
        }
        ncfUInt32 scale = 0;
        ncfUInt32 duration = 0;
        track.GetMediaTS(&scale);
        track.GetMediaDuration(&duration);
        if (stream.value("time_base", "") != "1/" + std::to_string(scale)) {
            Differ(name, "time scale " + std::to_string(scale));
        }
        const bool isMain = kind[0] == 'v' || kind[0] == 's';
        if (isMain && duration != 0 && stream.contains("duration_ts") &&
            stream["duration_ts"] != duration) {
            Differ(name, "media duration " + std::to_string(duration) + ", ffprobe " +
                             stream["duration_ts"].dump());
        }
        host::Ref<IQTSampleTable> table;
        track.GetSampleTable(table.Out());
        ncfUInt64 count = 0;
        table->GetNumSamples(&count);
        if (stream.contains("nb_frames") && stream["nb_frames"] != std::to_string(count)) {
            Differ(name, "samples " + std::to_string(count));
        }
        std::printf("%s: %llu samples, scale %u, duration %u, codec %s\n", name.c_str(),
                    static_cast<unsigned long long>(count), scale, duration,
                    stream.value("codec_tag_string", "?").c_str());
        const auto found = packets.find(stream.value("index", -1));
        if (found != packets.end()) {
            CompareSamples(name, *table, found->second, kind[0] == 's');
        }
        return;
    }
    Differ(name, "ffprobe has no such stream");
}

void CompareSound(const std::string& file, IAudioTrackInfo& track, const json& probe) {
    ncfUInt32 id = 0;
    track.GetTrackId(&id);
    host::Ref<IAudioSampleDescription> description;
    if (track.GetAudioSampleDescription(0, description.Out()) != NCF_OK) {
        return;
    }
    ncfUInt32 channels = 0, bits = 0, bytes = 0;
    double rate = 0;
    ncfBool linear = 0, little = 0;
    description->GetChannelsPerFrame(&channels);
    description->GetBitsPerChannel(&bits);
    description->GetSampleRate(&rate);
    description->GetBytesPerPacket(&bytes);
    description->IsLPCM(&linear);
    description->IsLittleEndian(&little);
    for (const json& stream : probe.value("streams", json::array())) {
        if (std::stoul(stream.value("id", "0"), nullptr, 16) != id) {
            continue;
        }
        std::printf("%s: sound %u channels, %u bits, rate %g, %u bytes, linear %d, little %d; %s\n",
                    file.c_str(), channels, bits, rate, bytes, linear, little,
                    stream.value("codec_name", "?").c_str());
        const std::string codec = stream.value("codec_name", "");
        const bool isPcm = codec.rfind("pcm_", 0) == 0;
        if (isPcm != (linear != 0)) {
            Differ(file, "linear " + std::to_string(linear) + ", ffprobe " + codec);
        }
        if (isPcm && stream.value("bits_per_sample", 0u) != bits) {
            Differ(file, "depth");
        }
        if (isPcm && bits > 8 && (codec.substr(codec.size() - 2) == "le") != (little != 0)) {
            Differ(file, "byte order");
        }
        if (isPcm && (stream.value("channels", 0u) != channels ||
                      std::stod(stream.value("sample_rate", "0")) != rate)) {
            Differ(file, "channels or rate");
        }
    }
}

void ComparePicture(const std::string& file, IVideoTrackInfo& track, const json& probe) {
    ncfUInt32 id = 0;
    track.GetTrackId(&id);
    host::Ref<IVideoSampleDescription> description;
    if (track.GetVideoSampleDescription(0, description.Out()) != NCF_OK) {
        return;
    }
    ncfUInt16 width = 0, height = 0;
    ncfUInt32 above = 0, below = 0, fields = 0, top = 0, split = 0, codes[3] = {};
    ncfSInt32 alpha = 0;
    float matrix[9] = {};
    description->GetEncodedWidthAndHeight(&width, &height);
    description->GetImageAspectRatio(&above, &below);
    description->GetFieldInfo(&fields, &top, &split);
    description->GetVideoColorSpaceDetails(codes);
    description->HasAlpha(&alpha);
    track.GetTrackMatrix(matrix);
    for (const json& stream : probe.value("streams", json::array())) {
        if (std::stoul(stream.value("id", "0"), nullptr, 16) != id) {
            continue;
        }
        std::printf(
            "%s: picture %ux%u, aspect %u/%u, fields %u top %u split %u, colours %u/%u/%u, "
            "alpha %d, a %g b %g; ffprobe %s order %s %s/%s/%s %s\n",
            file.c_str(), width, height, above, below, fields, top, split, codes[0], codes[1],
            codes[2], alpha, matrix[0], matrix[1],
            stream.value("display_aspect_ratio", "?").c_str(),
            stream.value("field_order", "?").c_str(), stream.value("color_primaries", "?").c_str(),
            stream.value("color_transfer", "?").c_str(), stream.value("color_space", "?").c_str(),
            stream.value("pix_fmt", "?").c_str());
        if (stream.value("width", 0) != width || stream.value("height", 0) != height) {
            Differ(file, "size, ffprobe " + std::to_string(stream.value("width", 0)));
        }
    }
}

void CompareTimecode(const std::string& file, QTParser& parser, const json& probe) {
    ncfUInt8 h = 0, m = 0, s = 0, f = 0;
    ncfUInt32 scale = 0, duration = 0, drop = 0, frames = 0;
    if (parser.GetTimeCodeInfo(&h, &m, &s, &f, &scale, &duration, &drop, &frames) != NCF_OK) {
        return;
    }
    char text[32];
    std::snprintf(text, sizeof text, "%02u:%02u:%02u%c%02u", h, m, s, drop ? ';' : ':', f);
    std::printf("%s: starts at %s, %u/%u, %u\n", file.c_str(), text, scale, duration, frames);
    for (const json& stream : probe.value("streams", json::array())) {
        if (stream.value("codec_tag_string", "") == "tmcd" &&
            stream.value("tags", json::object()).value("timecode", text) != std::string(text)) {
            Differ(file, "timecode, ffprobe " + stream["tags"]["timecode"].dump());
        }
    }
}

void CompareFile(const std::filesystem::path& path) {
    const std::string file = path.filename().u8string();
    const auto parser = host::MakeRef<QTParser>();
    std::ifstream stream(path, std::ios::binary);
    ncfUInt32 passes = 0;
    const NCFRESULT result = header_parser::ReadHeaders(
        *parser,
        [&](ncfUInt64 position, ncfUInt8* to, ncfUInt32 size) {
            stream.clear();
            stream.seekg(static_cast<std::streamoff>(position));
            stream.read(reinterpret_cast<char*>(to), size);
            return static_cast<ncfUInt32>(stream.gcount());
        },
        &passes);
    if (result != NCF_OK) {
        std::printf("%s: refused after %u passes with %08x: %s\n", file.c_str(), passes,
                    static_cast<unsigned>(result), parser->WhyRefused().Sentence().c_str());
        return;
    }
    const json probe = Probe(path.u8string());
    const Packets packets = PacketsOf(probe);
    ncfUInt32 scale = 0, duration = 0;
    ncfBool self = 0;
    parser->GetTimeScale(&scale);
    parser->GetMovieDuration(&duration);
    parser->IsMovieSelfContained(&self);
    std::printf("%s: %u passes, scale %u, duration %u, self contained %d\n", file.c_str(), passes,
                scale, duration, self);
    host::Ref<IVideoTrackInfo> video;
    for (ncfUInt32 i = 0; parser->GetVideoTrackInfo(i, video.Out()) == NCF_OK; ++i) {
        CompareTrack(file, *video, "video", probe, packets);
        ComparePicture(file, *video, probe);
    }
    host::Ref<IAudioTrackInfo> sound;
    for (ncfUInt32 i = 0; parser->GetAudioTrackInfo(i, sound.Out()) == NCF_OK; ++i) {
        CompareTrack(file, *sound, "sound", probe, packets);
        CompareSound(file, *sound, probe);
    }
    host::Ref<ITrackInfo> track;
    for (ncfUInt32 i = 0; parser->GetTimeCodeTrackInfo(i, track.Out()) == NCF_OK; ++i) {
        CompareTrack(file, *track, "timecode", probe, packets);
    }
    for (ncfUInt32 i = 0; parser->GetOtherTrackInfo(i, track.Out()) == NCF_OK; ++i) {
        CompareTrack(file, *track, "other", probe, packets);
    }
    CompareTimecode(file, *parser, probe);
}

}  // namespace

int main(int argc, char** argv) {
    std::vector<std::filesystem::path> files;
    for (int i = 1; i < argc; ++i) {
        if (!std::filesystem::is_directory(argv[i])) {
            files.emplace_back(argv[i]);
            continue;
        }
        for (const auto& entry : std::filesystem::directory_iterator(argv[i])) {
            if (entry.is_regular_file() && entry.path().extension() != ".md") {
                files.push_back(entry.path());
            }
        }
    }
    std::sort(files.begin(), files.end());
    for (const auto& file : files) {
        CompareFile(file);
    }
    std::printf("%zu files, %d differences\n", files.size(), differences);
    return differences == 0 ? 0 : 1;
}
