// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/ReportShape.h"

#include <nlohmann/json.hpp>
#include <optional>
#include <utility>

#include "reference_host/cliphost/ReportPictures.h"
#include "reference_host/report/PageText.h"

namespace cliphost {
namespace {

using Json = nlohmann::ordered_json;

// Each value stands for all of its kind: 0 for whole numbers from 0 on, 0.5 for any, "image" for
// what pictures say of themselves, "base64" for bytes, null for a tree of an AAF file. A list has
// the kind of its items. What lacks a member without a question mark is left out as a whole.
constexpr char kShape[] = R"({
"facts": {
    "name?": "", "id?": "", "route?": "", "rate?": "", "length?": 0, "seconds?": 0.5,
    "start?": "", "drop?": true, "hasTimecode?": true, "codec?": "", "codecName?": "",
    "width?": 0, "height?": 0, "alpha?": true, "soundCodec?": "", "soundName?": "",
    "soundRate?": 0, "channels?": 0, "colors?": "",
    "traits?": [{"id": "", "words": ""}],
    "warnings?": [{"kind": "", "reason": "", "hint?": "", "code?": ""}],
    "poster?": {"type": "image", "width": 0, "height": 0, "data": "base64"}
},
"details": {
    "routeReason?": "",
    "tracks?": [{
        "number": 0, "kind": "", "codec?": "", "codecName?": "", "rate?": "", "length?": 0,
        "width?": 0, "height?": 0, "channels?": 0, "bits?": 0}],
    "columns?": [{"name": "", "value": ""}],
    "parameters?": [{"name": "", "label": "", "words": "", "defaultWords": ""}],
    "strip?": {
        "type": "image", "width": 0, "height": 0, "data": "base64",
        "frames": [{"frame": 0, "timecode": "", "problem?": ""}]},
    "waves?": [{
        "track": 0, "seconds": 0.5, "isWhole": true, "lacksSamples": true, "highest?": 0.5,
        "peaks": [0], "means": [0]}],
    "samples?": {
        "tracks": [{
            "track": 0, "kind": "", "samples": 0, "bytes": 0, "runs": 0, "faults": [""],
            "smallest?": 0, "largest?": 0, "sizes?": [0],
            "groups?": {"count": 0, "shortest": 0, "longest": 0, "mean": 0.5}}],
        "interleaving?": {
            "widest": 0.5, "count": 0,
            "breaks": [{"position": 0, "track": 0, "from": 0, "at": 0.5, "seconds": 0.5}]}},
    "description?": null
}})";
constexpr char kMayLack = '?';
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

bool IsText(const std::string& text, const std::string& kind) {
    return kind == "base64"  ? report::IsBase64(text)
           : kind == "image" ? text == kWebp || text == kPng
                             : true;
}

bool IsOfKind(const Json& given, const Json& shape) {
    switch (shape.type()) {
        case Json::value_t::null:
            return IsTree(given, 0);
        case Json::value_t::string:
            return given.is_string() &&
                   IsText(given.get_ref<const std::string&>(), shape.get_ref<const std::string&>());
        case Json::value_t::number_float:
            return given.is_number();
        case Json::value_t::number_integer:
        case Json::value_t::number_unsigned:
            return given.is_number_unsigned();
        default:
            return given.type() == shape.type();
    }
}

std::optional<Json> Kept(Json given, const Json& shape);

Json KeptItems(Json given, const Json& kind) {
    Json list = Json::array();
    for (Json& item : given) {
        if (std::optional<Json> kept = Kept(std::move(item), kind)) {
            list.push_back(std::move(*kept));
        }
    }
    return list;
}

std::optional<Json> KeptMembers(Json given, const Json& shape) {
    Json object = Json::object();
    for (const auto& [key, kind] : shape.items()) {
        const bool mayLack = key.back() == kMayLack;
        const std::string name = key.substr(0, key.size() - (mayLack ? 1 : 0));
        const auto member = given.find(name);
        std::optional<Json> kept;
        if (member != given.end()) {
            kept = Kept(std::move(*member), kind);
        }
        if (kept) {
            object[name] = std::move(*kept);
        } else if (!mayLack) {
            return std::nullopt;
        }
    }
    return object;
}

// None where it is of another kind, or lacks what it needs.
std::optional<Json> Kept(Json given, const Json& shape) {
    if (!IsOfKind(given, shape)) {
        return std::nullopt;
    }
    return shape.is_array()    ? KeptItems(std::move(given), shape[0])
           : shape.is_object() ? KeptMembers(std::move(given), shape)
                               : std::optional<Json>(std::move(given));
}

}  // namespace

Json ClipFrom(const std::string& json) {
    static const Json shape = Json::parse(kShape);
    Json given = Json::parse(json, nullptr, false);
    Json clip = Json::object();
    for (const auto& [part, kind] : shape.items()) {
        std::optional<Json> kept;
        if (given.is_object() && given.contains(part)) {
            kept = Kept(std::move(given[part]), kind);
        }
        clip[part] = kept ? std::move(*kept) : Json::object();
    }
    return clip;
}

}  // namespace cliphost
