// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/ReportClip.h"

#include <fmt/format.h>

#include <nlohmann/json.hpp>

#include "reference_host/cliphost/AafLocators.h"
#include "reference_host/cliphost/AafTree.h"
#include "reference_host/cliphost/ClipParameters.h"
#include "reference_host/cliphost/FileFields.h"
#include "reference_host/cliphost/MovieEntry.h"
#include "reference_host/cliphost/ReportPictures.h"
#include "reference_host/cliphost/ReportSamples.h"
#include "reference_host/cliphost/ReportSound.h"
#include "reference_host/cliphost/ReportTraits.h"
#include "reference_host/cliphost/RouteTaken.h"
#include "reference_host/report/PageText.h"
#include "reference_host/util/text/Number.h"

namespace cliphost {
namespace {

using catalog::Entry;
using catalog::Row;
using Json = nlohmann::ordered_json;

// Waves of further sound tracks are not drawn.
constexpr std::size_t kMostWaves = 16;

enum class Kind { Text, Number, Flag };
struct Column {
    const char* from;  // of a catalog
    const char* to;
    Kind kind;
};
constexpr Column kFacts[] = {{"name", "name", Kind::Text},
                             {"master_mob", "id", Kind::Text},
                             {"route", "route", Kind::Text},
                             {"length", "length", Kind::Number},
                             {"start", "start", Kind::Text},
                             {"codec", "codec", Kind::Text},
                             {"codec_name", "codecName", Kind::Text},
                             {"width", "width", Kind::Number},
                             {"height", "height", Kind::Number},
                             {"alpha", "alpha", Kind::Flag},
                             {"sound_codec", "soundCodec", Kind::Text},
                             {"sound_name", "soundName", Kind::Text},
                             {"sound_rate", "soundRate", Kind::Number},
                             {"channels", "channels", Kind::Number}};
constexpr Column kTrack[] = {
    {"number", "number", Kind::Number}, {"kind", "kind", Kind::Text},
    {"codec", "codec", Kind::Text},     {"codec_name", "codecName", Kind::Text},
    {"length", "length", Kind::Number}, {"width", "width", Kind::Number},
    {"height", "height", Kind::Number}, {"channels", "channels", Kind::Number},
    {"bits", "bits", Kind::Number}};
constexpr Column kColumn[] = {{"name", "name", Kind::Text}, {"value", "value", Kind::Text}};
constexpr Column kWarning[] = {{"kind", "kind", Kind::Text},
                               {"reason", "reason", Kind::Text},
                               {"hint", "hint", Kind::Text},
                               {"code", "code", Kind::Text}};

std::int64_t NumberOf(const Row& row, const char* column) {
    const auto cell = row.find(column);
    std::int64_t number = 0;
    return cell != row.end() && host::text::ReadNumber(std::string_view(cell->second), number)
               ? number
               : 0;
}

template <std::size_t count>
Json JsonOf(const Row& row, const Column (&columns)[count]) {
    Json json = Json::object();
    for (const Column& column : columns) {
        const auto cell = row.find(column.from);
        if (cell == row.end() || cell->second.empty()) {
            continue;
        }
        switch (column.kind) {
            case Kind::Text:
                json[column.to] = cell->second;
                break;
            case Kind::Number:
                json[column.to] = NumberOf(row, column.from);
                break;
            case Kind::Flag:
                json[column.to] = cell->second != "0";
                break;
        }
    }
    return json;
}

template <std::size_t count>
Json ListOf(const Entry& entry, const char* table, const Column (&columns)[count]) {
    Json list = Json::array();
    if (const auto rows = entry.find(table); rows != entry.end()) {
        for (const Row& row : rows->second) {
            list.push_back(JsonOf(row, columns));
        }
    }
    return list;
}

// Sets "rate", and gives it as a number; 0 for none.
double AddRate(const Row& row, Json& json) {
    const std::int64_t numerator = NumberOf(row, "rate_numerator");
    const std::int64_t denominator = NumberOf(row, "rate_denominator");
    if (numerator <= 0 || denominator <= 0) {
        return 0;
    }
    json["rate"] = fmt::format("{}/{}", numerator, denominator);
    return static_cast<double>(numerator) / static_cast<double>(denominator);
}

void AddPoster(const Entry& entry, Json& facts) {
    const auto rows = entry.find("thumbnails");
    if (rows == entry.end() || rows->second.empty()) {
        return;
    }
    const Row& row = rows->second.front();
    const auto picture = row.find("picture");
    if (picture != row.end()) {
        const auto* const bytes = reinterpret_cast<const unsigned char*>(picture->second.data());
        facts["poster"] = {{"type", kPng},
                           {"width", NumberOf(row, "width")},
                           {"height", NumberOf(row, "height")},
                           {"data", report::Base64(bytes, picture->second.size())}};
    }
}

// Does a part of the work; without it the clip is what it is, and says so.
template <class Work>
void TryPart(const Session& session, const char* kind, const std::filesystem::path& movie,
             Json& facts, const Work& work) {
    Problem problem;
    try {
        work();
    } catch (const Failure& failure) {
        problem = failure.problem();
    } catch (NCFRESULT result) {
        problem = {movie, "its samples can't be mapped", "", result};
    }
    if (problem) {
        problem.reason = fmt::format("{}: {}", kind, problem.reason);
        TellProblem(problem, session.verbosity());
        facts["warnings"].push_back(WarningOf(problem, kind));
    }
}

void AddParameters(Session& session, const std::filesystem::path& movie,
                   NMA::IMediaContainer3& container, Json& details) {
    const FileFields file = ReadFileFields(container);
    Json list = Json::array();
    for (const ClipParameter& one : ClipParameters(session, movie, container).List()) {
        list.push_back({{"name", one.info.name},
                        {"label", one.info.label},
                        {"words", WordsForValue(one.info, one.value, file)},
                        {"defaultWords", WordsForValue(one.info, one.defaultValue, file)}});
    }
    details["parameters"] = std::move(list);
}

// What was not read is not known to be silence.
bool IsSilence(const Json& wave) {
    return wave["isWhole"].get<bool>() && !wave["lacksSamples"].get<bool>() &&
           wave["highest"].is_null();
}

void AddSounds(Essence& essence, Json& facts, Json& details) {
    Json waves = Json::array();
    bool isSilent = essence.First(TrackKind::Sound) != nullptr;
    for (const ClipTrack& track : essence.tracks()) {
        if (track.kind != TrackKind::Sound) {
            continue;
        }
        if (waves.size() == kMostWaves) {
            isSilent = false;
            break;
        }
        bool isTrackSilent = false;
        TryPart(essence.session(), "sound", essence.movie(), facts, [&] {
            Json wave = ReadWave(essence, track);
            isTrackSilent = IsSilence(wave);
            waves.push_back(std::move(wave));
        });
        isSilent = isSilent && isTrackSilent;
    }
    if (isSilent) {
        AddTrait(trait::kSilent, "all of its sound is silence", facts);
    }
    details["waves"] = std::move(waves);
}

// The multimedia library tells places in the file for few containers; that is no fault of a movie.
Json SamplesIfMapped(const Essence& essence, const Json& facts) {
    try {
        return ReadReportSamples(essence);
    } catch (NCFRESULT result) {
        if (result != NCF_E_NOTSUPPORTED || facts.value("route", "") != route::kLibrary) {
            throw;
        }
        return {};
    }
}

void AddSamples(Essence& essence, Json& facts, Json& details) {
    Json samples = SamplesIfMapped(essence, facts);
    if (samples.is_null()) {
        return;
    }
    const auto apart = samples.find("interleaving");
    if (apart != samples.end() && !(*apart)["breaks"].empty()) {
        AddTrait(trait::kNotInterleaved,
                 fmt::format("sound and picture of one time lie up to {:.3g} s apart in the file",
                             (*apart)["widest"].get<double>()),
                 facts);
    }
    details["samples"] = std::move(samples);
}

void AddEssence(Session& session, const std::filesystem::path& movie, Json& facts, Json& details) {
    Essence essence(session, movie);
    if (const ClipTrack* const track = essence.First(TrackKind::Picture)) {
        TryPart(session, "pictures", movie, facts, [&] {
            ReportPictures pictures =
                ReadReportPictures(essence, *track, facts.value("start", std::string()));
            facts["poster"] = std::move(pictures.poster);
            details["strip"] = std::move(pictures.strip);
        });
    }
    AddSounds(essence, facts, details);
    TryPart(session, "samples", movie, facts, [&] { AddSamples(essence, facts, details); });
}

}  // namespace

Json WarningOf(const Problem& problem, const char* kind) {
    return JsonOf(WarningRow(problem, kind, 0), kWarning);
}

Json ClipOf(const Entry& entry) {
    const Row& movie = entry.at("movies").at(0);
    Json facts = JsonOf(movie, kFacts);
    if (const double rate = AddRate(movie, facts); rate > 0 && facts.contains("length")) {
        facts["seconds"] = facts["length"].get<double>() / rate;
    }
    if (facts.contains("start")) {
        facts["drop"] = facts["start"].get_ref<const std::string&>().find(';') != std::string::npos;
    }
    facts["traits"] = Json::array();
    facts["warnings"] = ListOf(entry, "warnings", kWarning);
    AddPoster(entry, facts);
    Json details = Json::object();
    if (const auto reason = movie.find("route_reason"); reason != movie.end()) {
        details["routeReason"] = reason->second;
    }
    details["tracks"] = ListOf(entry, "tracks", kTrack);
    if (const auto rows = entry.find("tracks"); rows != entry.end()) {
        for (std::size_t i = 0; i < rows->second.size(); ++i) {
            AddRate(rows->second[i], details["tracks"][i]);
        }
    }
    details["columns"] = ListOf(entry, "columns", kColumn);
    if (facts.contains("width") && facts.value("channels", 0) == 0) {
        AddTrait(trait::kNoSound, "no sound track", facts);
    }
    return {{"facts", std::move(facts)}, {"details", std::move(details)}};
}

MovieAnswer ReportAnswer(Session& session, CodecReader& codecs, const PathMaps& maps,
                         const std::filesystem::path& movie) {
    host::Ref<NMA::IMediaContainer3> container;
    if (OpenContainer(session, movie, container) < 0) {
        return StartAnswer(session, DescribeMovie(session, movie));
    }
    const Description description = DescribeContainer(session, container.get(), movie);
    MovieAnswer answer = StartAnswer(session, description);
    if (!description.file) {
        return answer;
    }
    TellRoute(movie, session.verbosity());
    PathMaps used = maps;
    MapLocators(description.file.get(), used);
    answer.mapsUsed = used.used();
    Json clip = ClipOf(EntryOf(description, codecs));
    Json& facts = clip["facts"];
    Json& details = clip["details"];
    AddHeaderFacts(movie, header_parser::InspectHeaders(movie), facts);
    AddServedMedia(MediaServed(description.notices), facts);
    TryPart(session, "parameters", movie, facts,
            [&] { AddParameters(session, movie, *container, details); });
    TryPart(session, "media", movie, facts, [&] { AddEssence(session, movie, facts, details); });
    details["description"] = Json::parse(ToJson(ReadTree(description.file.get())));
    answer.description = clip.dump(-1, ' ', false, Json::error_handler_t::replace);
    return answer;
}

}  // namespace cliphost
