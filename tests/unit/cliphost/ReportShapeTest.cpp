// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/ReportShape.h"

#include <gtest/gtest.h>

#include <cstdint>
#include <nlohmann/json.hpp>
#include <string>
#include <vector>

using cliphost::ClipFrom;
using Json = nlohmann::ordered_json;
using Pointer = Json::json_pointer;

namespace {

std::string Kept(const std::string& json) {
    return ClipFrom(json).dump();
}

constexpr char kNothing[] = R"({"facts":{},"details":{}})";

// All members there are.
constexpr char kWhole[] = R"({
"facts": {
    "name": "a", "id": "urn", "route": "header", "rate": "25/1", "length": 3, "seconds": 0.12,
    "start": "01:00:00:00", "drop": false, "hasTimecode": true, "codec": "apcn", "codecName": "b",
    "width": 4, "height": 2, "alpha": true, "soundCodec": "sowt", "soundName": "c",
    "soundRate": 48000, "channels": 2, "colors": "d", "traits": [{"id": "edits", "words": "e"}],
    "warnings": [{"kind": "doubt", "reason": "f", "hint": "g", "code": "h"}],
    "poster": {"type": "image/webp", "width": 4, "height": 2, "data": "AAAA"}},
"details": {
    "routeReason": "i",
    "tracks": [{"number": 0, "kind": "picture", "codec": "apcn", "codecName": "b", "rate": "25/1",
                "length": 3, "width": 4, "height": 2, "channels": 0, "bits": 16}],
    "columns": [{"name": "j", "value": "k"}],
    "parameters": [{"name": "l", "label": "m", "words": "n", "defaultWords": "o"}],
    "strip": {"type": "image/png", "width": 4, "height": 2, "data": "AAAA",
              "frames": [{"frame": 0, "timecode": "01:00:00:00", "problem": "p"}]},
    "waves": [{"track": 1, "seconds": 0.12, "isWhole": true, "lacksSamples": false,
               "highest": -6.5, "peaks": [1, 2], "means": [0, 1]}],
    "samples": {
        "tracks": [{"track": 0, "kind": "picture", "samples": 3, "bytes": 30, "runs": 1,
                    "faults": ["q"], "smallest": 9, "largest": 11, "sizes": [9, 11],
                    "groups": {"count": 1, "shortest": 3, "longest": 3, "mean": 3.0}}],
        "interleaving": {
            "widest": 2.5, "count": 1,
            "breaks": [{"position": 8, "track": 0, "from": 1, "at": -0.5, "seconds": 2.5}]}},
    "description": {"class": "Header", "Mobs": [{"class": "MasterMob", "Name": "r"}]}}})";

TEST(ClipsOfReports, KeepWhatHasItsKind) {
    EXPECT_EQ(Kept(kWhole), Json::parse(kWhole).dump());
}

TEST(ClipsOfReports, LeaveOutValuesOfAnotherKind) {
    EXPECT_EQ(
        Kept(R"({"facts":{"name":1,"length":"3","seconds":"x","alpha":0,"traits":{},"poster":[],)"
             R"("rate":null,"width":1.5,"height":-1}})"),
        kNothing);
}

TEST(ClipsOfReports, LeaveOutMembersThatNobodyKnows) {
    EXPECT_EQ(Kept(R"({"facts":{"onload":"x","__proto__":{"a":1}},"details":{"x":1},"more":[]})"),
              kNothing);
}

TEST(ClipsOfReports, LeaveOutItemsOfAnotherKindAndKeepTheOthers) {
    const std::string trait = R"({"id":"edits","words":"a"})";
    EXPECT_EQ(Kept(R"({"facts":{"traits":[1,)" + trait + R"(,[],null,"a"]}})"),
              R"({"facts":{"traits":[)" + trait + R"(]},"details":{}})");
}

struct Lack {
    const char* of;       // what lacks it
    const char* without;  // the member
};
constexpr Lack kLacks[] = {{"/facts/traits/0", "id"},
                           {"/facts/traits/0", "words"},
                           {"/facts/warnings/0", "kind"},
                           {"/facts/warnings/0", "reason"},
                           {"/facts/poster", "type"},
                           {"/facts/poster", "width"},
                           {"/facts/poster", "height"},
                           {"/facts/poster", "data"},
                           {"/details/tracks/0", "number"},
                           {"/details/tracks/0", "kind"},
                           {"/details/columns/0", "name"},
                           {"/details/columns/0", "value"},
                           {"/details/parameters/0", "name"},
                           {"/details/parameters/0", "label"},
                           {"/details/parameters/0", "words"},
                           {"/details/parameters/0", "defaultWords"},
                           {"/details/strip", "type"},
                           {"/details/strip", "width"},
                           {"/details/strip", "height"},
                           {"/details/strip", "data"},
                           {"/details/strip", "frames"},
                           {"/details/strip/frames/0", "frame"},
                           {"/details/strip/frames/0", "timecode"},
                           {"/details/waves/0", "track"},
                           {"/details/waves/0", "seconds"},
                           {"/details/waves/0", "isWhole"},
                           {"/details/waves/0", "lacksSamples"},
                           {"/details/waves/0", "peaks"},
                           {"/details/waves/0", "means"},
                           {"/details/samples", "tracks"},
                           {"/details/samples/tracks/0", "track"},
                           {"/details/samples/tracks/0", "kind"},
                           {"/details/samples/tracks/0", "samples"},
                           {"/details/samples/tracks/0", "bytes"},
                           {"/details/samples/tracks/0", "runs"},
                           {"/details/samples/tracks/0", "faults"},
                           {"/details/samples/tracks/0/groups", "count"},
                           {"/details/samples/tracks/0/groups", "shortest"},
                           {"/details/samples/tracks/0/groups", "longest"},
                           {"/details/samples/tracks/0/groups", "mean"},
                           {"/details/samples/interleaving", "widest"},
                           {"/details/samples/interleaving", "count"},
                           {"/details/samples/interleaving", "breaks"},
                           {"/details/samples/interleaving/breaks/0", "position"},
                           {"/details/samples/interleaving/breaks/0", "track"},
                           {"/details/samples/interleaving/breaks/0", "from"},
                           {"/details/samples/interleaving/breaks/0", "at"},
                           {"/details/samples/interleaving/breaks/0", "seconds"}};

// Takes out what a path of JSON leads to.
void Remove(Json& json, const std::string& path) {
    const std::size_t slash = path.rfind('/');
    Json& owner = json[Pointer(path.substr(0, slash))];
    const std::string last = path.substr(slash + 1);
    if (owner.is_array()) {
        owner.erase(std::stoul(last));
    } else {
        owner.erase(last);
    }
}

TEST(ClipsOfReports, LeaveOutWhatLacksSomethingThatThePageNeedsAndNothingElse) {
    for (const Lack& lack : kLacks) {
        Json given = Json::parse(kWhole);
        given[Pointer(lack.of)].erase(lack.without);
        Json wanted = Json::parse(kWhole);
        Remove(wanted, lack.of);
        EXPECT_EQ(Kept(given.dump()), wanted.dump()) << lack.of << " without " << lack.without;
    }
}

TEST(ClipsOfReports, KeepPicturesOfKindsThatBrowsersShowAlone) {
    for (const char* const type :
         {"", "image", "image/svg+xml", "text/html", "image/webp;a", "image/webp,<svg>"}) {
        for (const char* const picture : {"/facts/poster", "/details/strip"}) {
            Json given = Json::parse(kWhole);
            given[Pointer(picture)]["type"] = type;
            Json wanted = Json::parse(kWhole);
            Remove(wanted, picture);
            EXPECT_EQ(Kept(given.dump()), wanted.dump()) << picture << " of " << type;
        }
    }
}

TEST(ClipsOfReports, LeaveOutPicturesThatAreNoBase64) {
    EXPECT_EQ(Kept(R"({"facts":{"poster":{"type":"image/webp","width":1,"height":1,)"
                   R"("data":"\"><script>"}}})"),
              kNothing);
}

// Every path of JSON that leads to something within.
void AddPaths(const Json& json, const std::string& path, std::vector<std::string>& paths) {
    paths.push_back(path);
    if (json.is_structured()) {
        for (const auto& [key, part] : json.items()) {
            AddPaths(part, path + "/" + key, paths);
        }
    }
}

// What comes of JSON that is wrong in one place is whole: it would be kept as it is, and all that
// does not hold the wrong place is as it was.
TEST(ClipsOfReports, AreWholeWhateverIsWrongInThem) {
    const Json whole = Json::parse(kWhole);
    std::vector<std::string> paths;
    AddPaths(whole, "", paths);
    const Json wrong[] = {Json(),
                          Json(true),
                          Json(-1),
                          Json(0.5),
                          Json(~std::uint64_t{0}),
                          Json(1e300),
                          Json("x"),
                          Json(std::string(1'000, 'x')),
                          Json::array(),
                          Json::object(),
                          Json::array({Json::array({1})}),
                          Json{{"__proto__", {{"a", 1}}}}};
    for (const std::string& path : paths) {
        for (const Json& value : wrong) {
            Json given = whole;
            given[Pointer(path)] = value;
            const std::string once = Kept(given.dump());
            EXPECT_EQ(Kept(once), once) << path << " = " << value.dump().substr(0, 20);
            const Json kept = Json::parse(once);
            for (const char* const part : {"facts", "details"}) {
                for (const auto& [name, member] : whole[part].items()) {
                    const std::string place = std::string("/") + part + "/" + name;
                    const bool isWithin =
                        path.rfind(place, 0) == 0 || place.rfind(path + "/", 0) == 0;
                    EXPECT_TRUE(isWithin || kept[part].value(name, Json()) == member)
                        << place << " with " << path << " = " << value.dump().substr(0, 20);
                }
            }
        }
    }
}

TEST(ClipsOfReports, AreEmptyOfWhatIsNoJson) {
    for (const char* const text : {"", "{", "[]", "1", "null", "{\"facts\":[],\"details\":1}"}) {
        EXPECT_EQ(Kept(text), kNothing) << text;
    }
}

TEST(ClipsOfReports, KeepTreesOfTextsAlone) {
    const std::string tree =
        R"({"facts":{},"details":{"description":{"class":"a","Mobs":[{"class":"b"}]}}})";
    EXPECT_EQ(Kept(tree), tree);
    EXPECT_EQ(Kept(R"({"details":{"description":{"class":"a","Mobs":[1]}}})"), kNothing);
}

TEST(ClipsOfReports, LeaveOutTreesThatAreTooDeep) {
    const auto nested = [](int depth) {
        return "{\"details\":{\"description\":" + std::string(depth, '[') +
               std::string(depth, ']') + "}}";
    };
    EXPECT_NE(Kept(nested(60)), kNothing);
    EXPECT_EQ(Kept(nested(70)), kNothing);
    EXPECT_EQ(Kept(nested(1'000'000)), kNothing);
}

}  // namespace
