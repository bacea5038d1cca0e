// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "tests/system/Facts.h"

#include <map>
#include <set>

using cliphost::TreeNode;

namespace {

const TreeNode& Nothing() {
    static const TreeNode nothing{"nothing", {}, {}};
    return nothing;
}

// Name of an enumeration's value, without its number.
std::string EnumName(const std::string& value) {
    return value.substr(0, value.find(" ("));
}

const TreeNode& Only(const TreeNode& node, const std::string& branch) {
    const auto& parts = Parts(node, branch);
    return parts.size() == 1 ? parts[0] : Nothing();
}

std::vector<TreeNode> Descriptors(const TreeNode& tree, bool sound) {
    std::vector<TreeNode> found;
    const TreeNode& all = Only(Mob(tree, kFileMob), "EssenceDescription");
    for (const TreeNode& descriptor : Parts(all, "FileDescriptors")) {
        if ((descriptor.title == "PCMDescriptor") == sound) {
            found.push_back(descriptor);
        }
    }
    return found;
}

std::string SlotKind(const TreeNode& slot) {
    const std::string definition = Fact(Only(slot, "Segment"), "DataDefinition");
    if (definition.find("LegacyPicture") != std::string::npos) {
        return "picture";
    }
    if (definition.find("LegacySound") != std::string::npos) {
        return "sound";
    }
    const std::string name = Fact(slot, "SlotName");
    return name.size() > 2 ? name.substr(1, name.size() - 2) : "unnamed";
}

bool IsEssence(const TreeNode& slot) {
    const std::string kind = SlotKind(slot);
    return kind == "picture" || kind == "sound";
}

std::string Joined(const std::set<std::string>& values) {
    std::string text;
    for (const std::string& value : values) {
        text += (text.empty() ? "" : " and ") + value;
    }
    return text.empty() ? "none" : text;
}

}  // namespace

std::string Fact(const TreeNode& node, const std::string& name) {
    for (const TreeNode::Fact& fact : node.facts) {
        if (fact.name == name) {
            return fact.value;
        }
    }
    return "-";
}

const std::vector<TreeNode>& Parts(const TreeNode& node, const std::string& name) {
    static const std::vector<TreeNode> none;
    for (const TreeNode::Branch& branch : node.branches) {
        if (branch.name == name) {
            return branch.nodes;
        }
    }
    return none;
}

const TreeNode& Mob(const TreeNode& tree, MobPlace place) {
    const auto& mobs = Parts(tree, "Mobs");
    return mobs.size() == 3 ? mobs[place] : Nothing();
}

std::vector<TreeNode> Pictures(const TreeNode& tree) {
    return Descriptors(tree, false);
}

std::vector<TreeNode> Sounds(const TreeNode& tree) {
    return Descriptors(tree, true);
}

std::vector<std::string> Column(const TreeNode& tree, const std::string& name) {
    std::vector<std::string> cells;
    for (const TreeNode& comment : Parts(Mob(tree, kMasterMob), "UserComments")) {
        if (Fact(comment, "Name") == "\"" + name + "\"") {
            const std::string value = Fact(comment, "Value");
            cells.push_back(value.size() < 2 ? value : value.substr(1, value.size() - 2));
        }
    }
    return cells;
}

std::string Url(const TreeNode& tree, MobPlace place) {
    const TreeNode& descriptor = Only(Mob(tree, place), "EssenceDescription");
    const std::string url = Fact(Only(descriptor, "Locator"), "URLString");
    return url.size() < 2 ? url : url.substr(1, url.size() - 2);
}

std::string RateAndLength(const TreeNode& tree) {
    std::set<std::string> found;
    for (const MobPlace place : {kMasterMob, kFileMob}) {
        for (const TreeNode& slot : Parts(Mob(tree, place), "Slots")) {
            found.insert(Fact(slot, "EditRate") + " x " + Fact(Only(slot, "Segment"), "Length"));
        }
    }
    return Joined(found);
}

std::string SlotList(const TreeNode& tree, MobPlace place) {
    std::string text;
    for (const TreeNode& slot : Parts(Mob(tree, place), "Slots")) {
        text += (text.empty() ? "" : ", ") + Fact(slot, "SlotID") + " " + SlotKind(slot);
    }
    return text;
}

std::string PictureLine(const TreeNode& tree, std::size_t index) {
    const auto pictures = Pictures(tree);
    if (index >= pictures.size()) {
        return "none";
    }
    const TreeNode& picture = pictures[index];
    const std::string coding = Fact(picture, "Compression");
    const auto names = Column(tree, "Video");
    std::string text = "native " + coding;
    if (coding == "{0E040201-027F-0000-060E-2B3404010101}") {
        text = "provider " + (index < names.size() ? names[index] : "without a name");
    }
    return text + " stored " + Fact(picture, "StoredWidth") + "x" + Fact(picture, "StoredHeight") +
           " shows " + Fact(picture, "DisplayWidth") + "x" + Fact(picture, "DisplayHeight") + " " +
           EnumName(Fact(picture, "FrameLayout")) + " " + Fact(picture, "ImageAspectRatio");
}

std::string SoundLine(const TreeNode& tree, std::size_t index) {
    const auto sounds = Sounds(tree);
    if (index >= sounds.size()) {
        return "none";
    }
    static const std::map<std::string, std::string> labels = {
        {"{04020202-0000-0000-060E-2B3404010101}", "provider"},
        {"{04020202-0301-0100-060E-2B3404010101}", "little-endian"},
        {"{0F020202-0301-0100-060E-2B3404010101}", "big-endian"}};
    const TreeNode& sound = sounds[index];
    const auto label = labels.find(Fact(sound, "Compression"));
    const std::string rate = Fact(sound, "AudioSamplingRate");
    return (label == labels.end() ? Fact(sound, "Compression") : label->second) + " " +
           Fact(sound, "Channels") + " x " + rate +
           (Fact(sound, "SampleRate") == rate ? "" : " sampled at " + Fact(sound, "SampleRate")) +
           " Hz " + Fact(sound, "QuantizationBits") + " bit, " + Fact(sound, "Length") +
           " samples, " + Fact(sound, "AverageBPS") + " a second, block " +
           Fact(sound, "BlockAlign");
}

std::string TimecodeLine(const TreeNode& tree) {
    std::string text = "none";
    for (const TreeNode& slot : Parts(Mob(tree, kSourceMob), "Slots")) {
        if (IsEssence(slot)) {
            continue;
        }
        const auto& components = Parts(Only(slot, "Segment"), "Components");
        if (components.size() == 1) {
            text = Fact(components[0], "FPS") + " fps" +
                   (EnumName(Fact(components[0], "Drop")) == "True" ? " drop" : "");
            break;
        }
    }
    std::set<std::string> starts;
    for (const TreeNode& slot : Parts(Mob(tree, kFileMob), "Slots")) {
        starts.insert(Fact(Only(slot, "Segment"), "StartTime"));
    }
    return text + ", clip enters at " + Joined(starts);
}

std::string BoxesLine(const TreeNode& tree) {
    const auto pictures = Pictures(tree);
    if (pictures.empty()) {
        return "none";
    }
    std::set<std::string> found;
    for (const char* const box : {"BoundsBox", "EssenceBox", "SourceBox", "ValidBox"}) {
        std::string value = Fact(pictures[0], box);
        for (const char* const word : {"PositionX ", "PositionY ", "Width ", "Height ", ","}) {
            for (std::size_t at = 0; (at = value.find(word)) != std::string::npos;) {
                value.erase(at, std::string(word).size());
            }
        }
        found.insert(value);
    }
    return Joined(found);
}
