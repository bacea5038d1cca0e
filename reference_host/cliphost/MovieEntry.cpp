// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/MovieEntry.h"

#include <algorithm>
#include <charconv>
#include <nlohmann/json.hpp>
#include <optional>
#include <string_view>

#include "reference_host/cliphost/AafTree.h"
#include "reference_host/cliphost/ClipColumns.h"
#include "reference_host/cliphost/JsonText.h"
#include "reference_host/cliphost/PngFile.h"
#include "reference_host/cliphost/ResultText.h"
#include "reference_host/cliphost/RouteTaken.h"
#include "reference_host/util/text/Number.h"

namespace cliphost {
namespace {

using catalog::Entry;
using catalog::Row;

const std::vector<TreeNode> kNoNodes;

const std::vector<TreeNode>& PartsOf(const TreeNode& node, std::string_view name) {
    for (const TreeNode::Branch& branch : node.branches) {
        if (branch.name == name) {
            return branch.nodes;
        }
    }
    return kNoNodes;
}

const TreeNode* PartOf(const TreeNode& node, std::string_view name) {
    const std::vector<TreeNode>& parts = PartsOf(node, name);
    return parts.empty() ? nullptr : &parts.front();
}

// A text as a tree shows it stands in quotes.
std::string Unquoted(const std::string& value) {
    const bool isQuoted = value.size() > 1 && value.front() == '"' && value.back() == '"';
    return isQuoted ? value.substr(1, value.size() - 2) : value;
}

std::int64_t NumberOf(const std::string& value) {
    std::int64_t number = 0;
    return host::text::ReadNumber(std::string_view(value), number) ? number : 0;
}

void Set(Row& row, const char* column, std::string value) {
    if (!value.empty()) {
        row[column] = std::move(value);
    }
}

void SetRate(Row& row, const std::string& rate) {
    const std::size_t slash = rate.find('/');
    if (slash != std::string::npos && NumberOf(rate.substr(slash + 1)) != 0) {
        row["rate_numerator"] = rate.substr(0, slash);
        row["rate_denominator"] = rate.substr(slash + 1);
    }
}

bool IsOfPictures(const TreeNode& slot) {
    const TreeNode* const segment = PartOf(slot, "Segment");
    return segment && FactOf(*segment, "DataDefinition").find("Picture") != std::string::npos;
}

// The slot that a clip's rate and length are those of: its picture's, or else the first.
const TreeNode* LeadingSlot(const TreeNode& mob) {
    const std::vector<TreeNode>& slots = PartsOf(mob, "Slots");
    const auto picture = std::find_if(slots.begin(), slots.end(), IsOfPictures);
    return picture != slots.end() ? &*picture : slots.empty() ? nullptr : &slots.front();
}

constexpr char kMasterMobClass[] = "MasterMob";

// The mob whose descriptor has this class, or which has the class itself. A tape may be among them.
const TreeNode* MobOf(const TreeNode& description, std::string_view name) {
    for (const TreeNode& mob : PartsOf(description, "Mobs")) {
        const TreeNode* const descriptor = PartOf(mob, "EssenceDescription");
        if (name == (descriptor ? descriptor->title : mob.title)) {
            return &mob;
        }
    }
    return nullptr;
}

std::string PropertiesOf(const TreeNode& descriptor) {
    std::string json;
    for (const TreeNode::Fact& fact : descriptor.facts) {
        json += json.empty() ? '{' : ',';
        AppendJsonText(fact.name, json);
        json += ':';
        AppendJsonText(Unquoted(fact.value), json);
    }
    return json.empty() ? "{}" : json + '}';
}

// Where fields are stored apart, a descriptor tells the height of one.
std::string FrameHeight(const TreeNode& descriptor) {
    const std::string& height = FactOf(descriptor, "StoredHeight");
    const bool isOfField = FactOf(descriptor, "FrameLayout").compare(0, 14, "SeparateFields") == 0;
    return isOfField ? std::to_string(2 * NumberOf(height)) : height;
}

void AddTracks(const TreeNode& file, const MovieCodecs& codecs, Entry& entry) {
    const TreeNode* const multiple = PartOf(file, "EssenceDescription");
    if (!multiple) {
        return;
    }
    std::size_t pictures = 0;
    std::size_t sounds = 0;
    std::int64_t channels = 0;
    Row& movie = entry["movies"].front();
    for (const TreeNode& descriptor : PartsOf(*multiple, "FileDescriptors")) {
        Row track;
        const std::string number = std::to_string(entry["tracks"].size());
        const bool isPicture = !FactOf(descriptor, "StoredWidth").empty();
        const bool isAlpha = isPicture && pictures > 0;
        const auto& all = isPicture ? codecs.pictures : codecs.sounds;
        const std::size_t place = isPicture ? 0 : sounds;
        const TrackCodec codec = place < all.size() ? all[place] : TrackCodec{};
        track["number"] = number;
        track["kind"] = isAlpha ? "alpha" : isPicture ? "picture" : "sound";
        Set(track, "codec", codec.code);
        Set(track, "codec_name", codec.name);
        Set(track, "length", FactOf(descriptor, "Length"));
        Set(track, "bits", codec.bits == 0 ? "" : std::to_string(codec.bits));
        SetRate(track, FactOf(descriptor, isPicture ? "SampleRate" : "AudioSamplingRate"));
        if (isPicture) {
            // Descriptors tell the raster of some codecs, which is larger.
            const bool isKnown = codec.width != 0 && codec.height != 0;
            track["width"] =
                isKnown ? std::to_string(codec.width) : FactOf(descriptor, "StoredWidth");
            track["height"] = isKnown ? std::to_string(codec.height) : FrameHeight(descriptor);
            if (!isAlpha) {
                movie["width"] = track["width"];
                movie["height"] = track["height"];
                movie["alpha"] = codec.hasAlpha ? "1" : "0";
                Set(movie, "codec", codec.code);
                Set(movie, "codec_name", codec.name);
            }
            ++pictures;
        } else {
            Set(track, "channels", FactOf(descriptor, "Channels"));
            channels += NumberOf(FactOf(descriptor, "Channels"));
            if (sounds == 0) {
                Set(movie, "sound_codec", codec.code);
                Set(movie, "sound_name", codec.name);
                Set(movie, "sound_rate", track["rate_numerator"]);
            }
            ++sounds;
        }
        entry["tracks"].push_back(std::move(track));
        entry["descriptors"].push_back({{"number", number},
                                        {"class", descriptor.title},
                                        {"properties", PropertiesOf(descriptor)}});
    }
    movie["channels"] = std::to_string(channels);
}

void AddColumns(ColumnValues columns, const std::string& reel, Entry& entry) {
    if (!reel.empty()) {
        columns.emplace_back("Reel", reel);
    }
    for (auto& [name, value] : columns) {
        const std::string place = std::to_string(entry["columns"].size());
        entry["columns"].push_back(
            {{"place", place}, {"name", std::move(name)}, {"value", std::move(value)}});
    }
}

// What a table needs of each row that a process sent. The first column is its number.
struct Needed {
    std::string_view table;
    std::vector<const char*> columns;
};
const Needed kNeeded[] = {
    {"movies", {}},
    {"tracks", {"number", "kind"}},
    {"descriptors", {"number", "class", "properties"}},
    {"columns", {"place", "name", "value"}},
    {"warnings", {"place", "kind", "reason"}},
    {"thumbnails", {"type", "width", "height", "picture"}},
};
constexpr char kThumbnails[] = "thumbnails";
constexpr char kPicture[] = "picture";
constexpr char kDigits[] = "0123456789abcdef";

// Bytes travel as digits, since JSON has texts alone.
std::string DigitsOf(const std::vector<unsigned char>& bytes) {
    std::string digits;
    digits.reserve(2 * bytes.size());
    for (const unsigned char byte : bytes) {
        digits += kDigits[byte >> 4];
        digits += kDigits[byte & 15];
    }
    return digits;
}

// Nothing where other characters are in it.
std::string BytesOf(std::string_view digits) {
    std::string bytes;
    bytes.reserve(digits.size() / 2);
    for (std::size_t at = 0; at + 1 < digits.size(); at += 2) {
        unsigned byte = 0;
        const char* const end = digits.data() + at + 2;
        if (std::from_chars(digits.data() + at, end, byte, 16).ptr != end) {
            return {};
        }
        bytes += static_cast<char>(byte);
    }
    return bytes;
}

// Whole rows of what can be kept: one picture, as bytes.
void TakeThumbnail(Entry& entry) {
    const auto rows = entry.find(kThumbnails);
    if (rows == entry.end() || rows->second.empty()) {
        return;
    }
    rows->second.resize(1);
    std::string& picture = rows->second.front()[kPicture];
    picture = BytesOf(picture);
    if (picture.empty()) {
        entry.erase(rows);
    }
}

}  // namespace

Entry EntryOf(const Description& description, CodecReader& codecs) {
    Entry entry;
    Row& movie = entry["movies"].emplace_back();
    const header_parser::HeaderReport header = header_parser::InspectHeaders(description.movie);
    const RouteTaken taken = RouteOf(header);
    movie["route"] = taken.route;
    Set(movie, "route_reason", taken.reason);
    const TreeNode tree = ReadTree(description.file.get());
    const TreeNode* const master = MobOf(tree, kMasterMobClass);
    const TreeNode* const file = MobOf(tree, "MultipleDescriptor");
    const TreeNode* const source = MobOf(tree, "ImportDescriptor");
    if (!master || !file || !source) {
        return entry;
    }
    ClipTexts texts = TextsOf(description.file.get());
    Set(movie, "name", texts.name);
    movie["master_mob"] = FactOf(*master, "MobID");
    movie["file_mob"] = FactOf(*file, "MobID");
    movie["source_mob"] = FactOf(*source, "MobID");
    if (const TreeNode* const slot = LeadingSlot(*master)) {
        SetRate(movie, FactOf(*slot, "EditRate"));
        const TreeNode* const segment = PartOf(*slot, "Segment");
        Set(movie, "length", segment ? FactOf(*segment, "Length") : "");
    }
    Set(movie, "start", texts.start);
    AddTracks(*file, codecs.Read(description.movie, header), entry);
    AddColumns(std::move(texts.binColumns), texts.reel, entry);
    if (description.doubt) {
        entry["warnings"].push_back(WarningRow(description.doubt, "doubt", 0));
    }
    return entry;
}

Row WarningRow(const Problem& problem, const char* kind, std::size_t place) {
    Row row = {{"place", std::to_string(place)}, {"kind", kind}, {"reason", problem.reason}};
    Set(row, "hint", problem.hint);
    Set(row, "code", problem.code == NCF_OK ? "" : ResultName(problem.code));
    return row;
}

void AddThumbnail(const Picture& picture, Entry& entry) {
    entry[kThumbnails] = {{{"type", "image/png"},
                           {"width", std::to_string(picture.width)},
                           {"height", std::to_string(picture.height)},
                           {kPicture, DigitsOf(ToPng(picture))}}};
}

std::string ToJson(const Entry& entry) {
    std::string json;
    for (const auto& [table, rows] : entry) {
        json += json.empty() ? '{' : ',';
        AppendJsonText(table, json);
        json += ":[";
        for (const Row& row : rows) {
            json += &row == &rows.front() ? "{" : ",{";
            const char* between = "";
            for (const auto& [column, value] : row) {
                json += between;
                between = ",";
                AppendJsonText(column, json);
                json += ':';
                AppendJsonText(value, json);
            }
            json += '}';
        }
        json += ']';
    }
    return json.empty() ? "{}" : json + '}';
}

Entry EntryFrom(const std::string& json) {
    const nlohmann::json parsed = nlohmann::json::parse(json, nullptr, false);
    Entry entry;
    for (const Needed& needed : kNeeded) {
        const std::string table(needed.table);
        if (!parsed.is_object() || !parsed.contains(table)) {
            continue;
        }
        std::vector<Row>& rows = entry[table];
        for (const nlohmann::json& given : parsed[table]) {
            Row row;
            for (const char* const column : needed.columns) {
                row[column];
            }
            if (given.is_object()) {
                for (const auto& [column, value] : given.items()) {
                    if (value.is_string()) {
                        row[column] = value.get<std::string>();
                    }
                }
            }
            if (!needed.columns.empty() && needed.table != kThumbnails) {
                row[needed.columns.front()] = std::to_string(rows.size());
            }
            rows.push_back(std::move(row));
        }
    }
    entry["movies"].resize(1);
    TakeThumbnail(entry);
    return entry;
}

}  // namespace cliphost
