// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include <fmt/format.h>

#include "reference_host/cliphost/Essence.h"
#include "reference_host/cliphost/ImageFormats.h"
#include "reference_host/cliphost/JsonAnswer.h"
#include "reference_host/cliphost/MachinePath.h"
#include "reference_host/cliphost/ParameterOptions.h"
#include "reference_host/cliphost/PathOption.h"
#include "reference_host/cliphost/RouteTaken.h"
#include "reference_host/cliphost/Verbs.h"
#include "reference_host/cliphost/Words.h"
#include "reference_host/framework/HostPath.h"

namespace cliphost {
namespace {

using Json = nlohmann::ordered_json;

constexpr ncfUInt32 kLittleEndian = 0x4132434C;  // 'A2CL'

// The module only tells the buffer size of the format that is set, so each is set.
Json PictureFormat(Essence& essence, const ClipTrack& track, const ImageFormat& format) {
    NMA::IUncompressedImageProvider& pictures = essence.pictures();
    ncfUInt16 alignment = 0;
    ncfUInt64 size = 0;
    NCFRESULT result = pictures.SetWorkingImageFormat(track.number, format.index);
    if (result >= 0) {
        result = pictures.GetWorkingImageBufferRequirements(track.number, &alignment, &size);
    }
    essence.CheckSamples(result, track, fmt::format("format {} can't be set", format.index));
    return {{"index", format.index},
            {"name", NameOf(format)},
            {"words", WordsFor(format)},
            {"bufferBytes", size},
            {"pixelFormat", format.pixels},
            {"chromaSubsampling", format.chroma},
            {"componentType", format.component},
            {"componentRange", format.range},
            {"colorSpace", format.colorSpace},
            {"fieldOrder", format.fieldOrder},
            {"frameLayout", format.frameLayout},
            {"orientation", format.orientation}};
}

void AddPicture(Essence& essence, const ClipTrack& track, Json& json) {
    const std::vector<ImageFormat> formats = essence.PictureFormats(track);
    ncfUInt32 width = 0, height = 0;
    if (essence.pictures().GetWorkingImageSize(track.number, &width, &height) >= 0) {
        json["width"] = width;
        json["height"] = height;
        const bool isInterlaced = !formats.empty() && formats[0].fieldOrder != format::kProgressive;
        json["heightIsOf"] = isInterlaced ? "field" : "frame";
    }
    json["formats"] = Json::array();
    for (const ImageFormat& one : formats) {
        json["formats"].push_back(PictureFormat(essence, track, one));
    }
}

void AddSound(Essence& essence, const ClipTrack& track, Json& json) {
    json["channels"] = track.channels;
    NMA::IUncompressedAudioProvider& sounds = essence.sounds();
    ncfUInt32 count = 0;
    NCFRESULT result = sounds.GetNumberOfAudioFormats(track.number, &count);
    json["formats"] = Json::array();
    for (ncfUInt32 i = 0; i < count && result >= 0; ++i) {
        ncfUInt32 order = 0;
        ncfUInt16 bytes = 0, bits = 0;
        result = sounds.GetAudioFormat(track.number, i, &order, &bytes, &bits);
        const bool isLittle = order == kLittleEndian;
        const auto aSecond =
            static_cast<std::uint64_t>(track.RateAsNumber()) * bytes * track.channels;
        const Json bufferBytes = aSecond == 0 ? Json() : Json(aSecond);  // no rate, no second
        json["formats"].push_back({{"index", i},
                                   {"name", isLittle ? "A2CL" : "A2CB"},
                                   {"words", fmt::format("{}-bit PCM in {} bytes, {}-endian, "
                                                         "interleaved",
                                                         bits, bytes, isLittle ? "little" : "big")},
                                   {"bufferBytes", bufferBytes}});
    }
    essence.Check(result, track, "no sound formats");
}

Json FormatsOf(Essence& essence) {
    Json list = Json::array();
    for (const ClipTrack& track : essence.tracks()) {
        Json json = {{"track", track.number},
                     {"kind", NameOf(track.kind)},
                     {"length", track.length},
                     {"rate", track.RateAsNumber() > 0.0 ? Json(RateText(track)) : Json()}};
        if (const Problem obstacle = essence.Obstacle(track)) {
            AddProblem(obstacle, json);
        } else if (track.kind == TrackKind::Sound) {
            AddSound(essence, track, json);
        } else {
            AddPicture(essence, track, json);
        }
        list.push_back(std::move(json));
    }
    return list;
}

std::string BufferWords(const Json& format, bool isSound) {
    const Json& bytes = format["bufferBytes"];
    if (!bytes.is_number()) {
        return "bytes a second not known";
    }
    return Counted(bytes.get<std::uint64_t>(), "byte") + (isSound ? " a second" : " a frame");
}

void PrintTrack(const ClipTrack& facts, const Json& track) {
    const bool isSound = facts.kind == TrackKind::Sound;
    fmt::print("track {}: {}, {}, {}", facts.number, NameOf(facts.kind),
               Counted(facts.length, isSound ? "sample" : "frame"), RateWords(facts));
    if (track.contains("width")) {
        fmt::print(", {} {} x {}", track["heightIsOf"].get<std::string>(),
                   track["width"].get<int>(), track["height"].get<int>());
    }
    if (track.contains("channels")) {
        fmt::print(", {}", Counted(facts.channels, "channel"));
    }
    fmt::print("\n");
    if (track.contains("reason")) {
        const bool hasHint = track["hint"].is_string();
        fmt::print("  {}{}\n", track["reason"].get<std::string>(),
                   hasHint ? "; " + track["hint"].get<std::string>() : "");
        return;
    }
    for (const Json& one : track["formats"]) {
        fmt::print("  {} {:<10} {}\n               {}\n", one["index"].get<int>(),
                   one["name"].get<std::string>(), one["words"].get<std::string>(),
                   BufferWords(one, isSound));
    }
    if (track["formats"].empty()) {
        fmt::print("  no format is offered\n");
    }
}

void Show(Essence& essence, bool json) {
    const Json list = FormatsOf(essence);
    if (json) {
        Json answer = {{"movie", MachinePath(essence.movie())}};
        AddProblemOrRoute(essence.undescribed(), essence.movie(), answer);
        answer["tracks"] = list;
        PrintJson(schema::kFormats, std::move(answer));
        return;
    }
    fmt::print("{}\n", host::DisplayPath(essence.movie()));
    for (std::size_t i = 0; i < list.size(); ++i) {
        PrintTrack(essence.tracks()[i], list[i]);
    }
}

}  // namespace

void AddFormats(CLI::App& app, const SessionOptions& session, int&) {
    auto* const verb = app.add_subcommand(
        "formats", "List the formats in which the module offers each track of a movie");
    verb->footer(
        "Examples:\n"
        "  cliphost formats clip.mov\n"
        "  cliphost formats clip.mov --use-alpha\n"
        "  cliphost formats clip.mov --json");
    auto movie = std::make_shared<std::filesystem::path>();
    auto json = std::make_shared<bool>(false);
    auto parameters = std::make_shared<ParameterOptions>();
    AddPath(*verb, "movie", *movie, "The movie")->required();
    verb->add_flag("--json", *json, kJsonHelp);
    parameters->AddTo(*verb);
    verb->callback([&session, movie, json, parameters] {
        AnswerFailureToo(*json, schema::kFormats, {{"movie", MachinePath(*movie)}}, [&] {
            Session running(session);
            Essence essence = OpenEssence(running, *movie, *parameters);
            Show(essence, *json);
        });
    });
}

}  // namespace cliphost
