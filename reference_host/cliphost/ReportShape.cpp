// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/ReportShape.h"

#include <nlohmann/json.hpp>

#include "reference_host/report/PageText.h"

namespace cliphost {
namespace {

using Json = nlohmann::ordered_json;

// Each value stands for all of its kind: 0 for whole numbers, 0.5 for any, "base64" for bytes,
// null for a tree of an AAF file. A list has the kind of its items.
constexpr char kShape[] = R"({
"facts": {
    "name": "", "id": "", "route": "", "rate": "", "length": 0, "seconds": 0.5, "start": "",
    "drop": true, "hasTimecode": true, "codec": "", "codecName": "", "width": 0, "height": 0,
    "alpha": true, "soundCodec": "", "soundName": "", "soundRate": 0, "channels": 0, "colors": "",
    "traits": [{"id": "", "words": ""}],
    "warnings": [{"kind": "", "reason": "", "hint": "", "code": ""}],
    "poster": {"type": "", "width": 0, "height": 0, "data": "base64"}
},
"details": {
    "routeReason": "",
    "tracks": [{
        "number": 0, "kind": "", "codec": "", "codecName": "", "rate": "", "length": 0,
        "width": 0, "height": 0, "channels": 0, "bits": 0}],
    "columns": [{"name": "", "value": ""}],
    "parameters": [{"name": "", "label": "", "words": "", "defaultWords": ""}],
    "strip": {
        "type": "", "width": 0, "height": 0, "data": "base64",
        "frames": [{"frame": 0, "timecode": "", "problem": ""}]},
    "waves": [{
        "track": 0, "seconds": 0.5, "isWhole": true, "lacksSamples": true, "highest": 0.5,
        "peaks": [0], "means": [0]}],
    "samples": {
        "tracks": [{
            "track": 0, "kind": "", "samples": 0, "bytes": 0, "runs": 0, "faults": [""],
            "smallest": 0, "largest": 0, "sizes": [0],
            "groups": {"count": 0, "shortest": 0, "longest": 0, "mean": 0.5}}],
        "interleaving": {
            "widest": 0.5,
            "breaks": [{"position": 0, "track": 0, "from": 0, "at": 0.5, "seconds": 0.5}]}},
    "description": null
}})";
constexpr int kDeepest = 64;

bool IsTree(const Json& given, int depth) {
    if (depth > kDeepest) {
        return false;
    }
    if (!given.is_structured()) {
        return given.is_string();
    }
    for (const Json& part : given) {
        if (!IsTree(part, depth + 1)) {
            return false;
        }
    }
    return true;
}

bool IsOfKind(const Json& given, const Json& shape) {
    switch (shape.type()) {
        case Json::value_t::null:
            return IsTree(given, 0);
        case Json::value_t::string:
            return given.is_string() &&
                   (shape != "base64" || report::IsBase64(given.get_ref<const std::string&>()));
        case Json::value_t::number_float:
            return given.is_number();
        case Json::value_t::number_integer:
        case Json::value_t::number_unsigned:
            return given.is_number_integer();
        default:
            return given.type() == shape.type();
    }
}

Json Kept(Json given, const Json& shape) {
    if (shape.is_array()) {
        Json list = Json::array();
        for (Json& item : given) {
            if (IsOfKind(item, shape[0])) {
                list.push_back(Kept(std::move(item), shape[0]));
            }
        }
        return list;
    }
    if (!shape.is_object()) {
        return given;
    }
    Json object = Json::object();
    for (const auto& [name, kind] : shape.items()) {
        const auto member = given.find(name);
        if (member != given.end() && IsOfKind(*member, kind)) {
            object[name] = Kept(std::move(*member), kind);
        }
    }
    return object;
}

}  // namespace

Json ClipFrom(const std::string& json) {
    static const Json shape = Json::parse(kShape);
    Json given = Json::parse(json, nullptr, false);
    Json clip = {{"facts", Json::object()}, {"details", Json::object()}};
    clip.update(Kept(given.is_object() ? std::move(given) : Json::object(), shape));
    return clip;
}

}  // namespace cliphost
