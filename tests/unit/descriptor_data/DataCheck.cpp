// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Checks of each entry by itself.

#include <algorithm>
#include <cctype>
#include <cstdlib>
#include <cstring>
#include <pugixml.hpp>

#include "tests/unit/descriptor_data/DataCheck.h"

namespace data_check {

namespace {

// An item is written as an attribute or as a child element.
std::vector<std::string> ItemsOf(const pugi::xml_node& parent, const char* name) {
    std::vector<std::string> items;
    for (const pugi::xml_attribute& attribute : parent.attributes()) {
        if (std::strcmp(attribute.name(), name) == 0) {
            items.push_back(attribute.value());
        }
    }
    for (const pugi::xml_node& child : parent.children(name)) {
        items.push_back(child.child_value());
    }
    return items;
}

std::vector<std::string> NamesOf(const pugi::xml_node& parent) {
    std::vector<std::string> names;
    for (const pugi::xml_attribute& attribute : parent.attributes()) {
        names.push_back(attribute.name());
    }
    for (const pugi::xml_node& child : parent.children()) {
        if (child.type() == pugi::node_element) {
            names.push_back(child.name());
        }
    }
    return names;
}

bool IsNumber(const std::string& text) {
    return !text.empty() && text.size() < 10 &&
           std::all_of(text.begin(), text.end(), [](unsigned char c) { return std::isdigit(c); }) &&
           (text.size() == 1 || text[0] != '0');
}

bool HasOuterSpace(const std::string& text) {
    return text.empty() || std::isspace(static_cast<unsigned char>(text.front())) ||
           std::isspace(static_cast<unsigned char>(text.back()));
}

// Tells findings of one entry.
class Entry {
public:
    Entry(const pugi::xml_node& node, const std::string& where, Findings& findings)
        : node_(node), where_(where), findings_(findings) {}

    void Tell(const std::string& what) const { findings_.push_back(where_ + ": " + what); }

    // The one value of an item, or "" with a finding when there is none or are
    // several.
    std::string One(const pugi::xml_node& parent, const char* name) const {
        const std::vector<std::string> items = ItemsOf(parent, name);
        if (items.empty()) {
            Tell(std::string(name) + " is missing");
        } else if (items.size() > 1) {
            Tell(std::string(name) + " stands there more than once");
        }
        return items.size() == 1 ? items[0] : "";
    }
    // The same, as a number with a check.
    template <class Accept>
    void Number(const pugi::xml_node& parent, const char* name, Accept accept) const {
        const std::string text = One(parent, name);
        if (text.empty()) {
            return;
        }
        if (!IsNumber(text) || !accept(std::strtoul(text.c_str(), nullptr, 10))) {
            Tell(std::string(name) + " can't be \"" + text + "\"");
        }
    }
    const pugi::xml_node& node() const { return node_; }

private:
    pugi::xml_node node_;
    std::string where_;
    Findings& findings_;
};

bool Any(unsigned long) {
    return true;
}
bool NotZero(unsigned long value) {
    return value != 0;
}

// Elements outside the AAF dictionary's own list are refused.
struct NumberRule {
    const char* name;
    bool (*accept)(unsigned long);
    bool mandatory;
};
const NumberRule kCommonNumbers[] = {
    {"rp210:FrameLayout", [](unsigned long v) { return v <= 4; }, true},
    {"rp210:StoredWidth", NotZero, true},
    {"rp210:StoredHeight", NotZero, true},
    {"rp210:SampledWidth", NotZero, false},
    {"rp210:DisplayWidth", NotZero, false},
    {"rp210:DisplayHeight", NotZero, false},
    {"rp210:DisplayYOffset", Any, false},
    {"rp210:ImageStartOffset", Any, false},
    {"rp210:ImageAlignmentOffset", Any, false},
};
const NumberRule kCDCINumbers[] = {
    {"rp210:ComponentDepth", [](unsigned long v) { return v >= 1 && v <= 16; }, true},
    {"rp210:HorizontalSubsampling", [](unsigned long v) { return v == 1 || v == 2 || v == 4; },
     true},
    {"rp210:VerticalSubsampling", [](unsigned long v) { return v == 1 || v == 2; }, true},
    {"rp210:ColorSiting", [](unsigned long v) { return v <= 4 || v == 255; }, true},
    {"rp210:ColorRange", NotZero, true},
    {"rp210:BlackRefLevel", Any, true},
    {"rp210:WhiteReflevel", NotZero, true},
    {"AVCSliceCounter", NotZero, false},
};
const NumberRule kMPEG2Numbers[] = {
    {"rp210:BitRate", NotZero, true},
    {"rp210:MaxGOP", [](unsigned long v) { return v <= 0xFFFF; }, true},
};
const NumberRule kRGBANumbers[] = {
    {"rp210:ComponentMaxRef", NotZero, true},
    {"rp210:ComponentMinRef", Any, true},
};
const char* const kOtherNames[] = {"rp210:SampleRate", "rp210:PictureEssenceCoding",
                                   "rp210:EssenceContainerLabel", "rp210:AspectRatio",
                                   "rp210:VideoLineMap"};

template <std::size_t count>
void CheckNumbers(const Entry& entry, const pugi::xml_node& descriptor,
                  const NumberRule (&rules)[count], std::vector<std::string>& known) {
    for (const NumberRule& rule : rules) {
        known.push_back(rule.name);
        if (rule.mandatory || !ItemsOf(descriptor, rule.name).empty()) {
            entry.Number(descriptor, rule.name, rule.accept);
        }
    }
}

// A universal label of at most 36 characters. One whose second half has a byte
// of 80h or more would come out with its bits set.
void CheckLabel(const Entry& entry, const pugi::xml_node& descriptor, const char* name) {
    const std::string text = entry.One(descriptor, name);
    std::string digits;
    std::copy_if(text.begin(), text.end(), std::back_inserter(digits),
                 [](char c) { return c != '-'; });
    const bool isLabel =
        text.size() <= 36 && digits.size() == 32 && digits.compare(0, 8, "060e2b34") == 0 &&
        std::all_of(digits.begin(), digits.end(), [](unsigned char c) { return std::isxdigit(c); });
    if (!text.empty() && !isLabel) {
        entry.Tell(std::string(name) + " is no universal label: \"" + text + "\"");
        return;
    }
    for (std::size_t i = 16; i < digits.size(); i += 2) {
        if (digits[i] > '7') {
            entry.Tell(std::string(name) + " has a byte of 80h or more in its second half");
        }
    }
}

void CheckLineMap(const Entry& entry, const pugi::xml_node& descriptor) {
    const std::vector<std::string> lines =
        ItemsOf(descriptor.child("rp210:VideoLineMap"), "rp210:Element");
    if (lines.empty() || lines.size() > 2 || !std::all_of(lines.begin(), lines.end(), IsNumber)) {
        entry.Tell("rp210:VideoLineMap must have one or two line numbers");
    }
}

void CheckPixelLayout(const Entry& entry, const pugi::xml_node& descriptor) {
    int components = 0;
    for (const pugi::xml_node& component :
         descriptor.child("rp210:PixelLayout").children("rp210:RGBALayout")) {
        ++components;
        if (entry.One(component, "rp210:Code").size() > 1) {
            entry.Tell("rp210:Code is more than one letter");
        }
        entry.Number(component, "rp210:Depth", [](unsigned long v) { return v >= 1 && v <= 64; });
    }
    if (components < 1 || components > 8) {
        entry.Tell("rp210:PixelLayout must have one to eight components");
    }
}

void CheckProfile(const Entry& entry, const pugi::xml_node& descriptor) {
    const std::string text = entry.One(descriptor, "rp210:ProfileAndLevel");
    if (text.size() != 4 || text.compare(0, 2, "0x") != 0 ||
        !std::isxdigit(static_cast<unsigned char>(text[2])) ||
        !std::isxdigit(static_cast<unsigned char>(text[3]))) {
        entry.Tell("rp210:ProfileAndLevel must be 0x and two digits, not \"" + text + "\"");
    }
}

void CheckDescriptor(const Entry& entry, const pugi::xml_node& descriptor) {
    const bool isRGBA = std::strcmp(descriptor.name(), "groups:RGBADescriptor") == 0;
    const bool isMPEG2 = std::strcmp(descriptor.name(), "groups:MPEG2VideoDescriptor") == 0;
    std::vector<std::string> known(std::begin(kOtherNames), std::end(kOtherNames));
    CheckNumbers(entry, descriptor, kCommonNumbers, known);
    CheckLabel(entry, descriptor, "rp210:PictureEssenceCoding");
    CheckLabel(entry, descriptor, "rp210:EssenceContainerLabel");
    const pugi::xml_node aspect = descriptor.child("rp210:AspectRatio");
    entry.Number(aspect, "types:Numerator", NotZero);
    entry.Number(aspect, "types:Denominator", NotZero);
    CheckLineMap(entry, descriptor);
    if (isRGBA) {
        CheckNumbers(entry, descriptor, kRGBANumbers, known);
        CheckPixelLayout(entry, descriptor);
        known.push_back("rp210:PixelLayout");
    } else {
        CheckNumbers(entry, descriptor, kCDCINumbers, known);
    }
    if (isMPEG2) {
        CheckNumbers(entry, descriptor, kMPEG2Numbers, known);
        CheckProfile(entry, descriptor);
        known.push_back("rp210:ProfileAndLevel");
    }
    for (const std::string& name : NamesOf(descriptor)) {
        if (std::find(known.begin(), known.end(), name) == known.end()) {
            entry.Tell(name + " means nothing there");
        }
    }
}

// A reader keeps the first piece of text after a leaf, blanks included.
void CheckLeafSpace(const pugi::xml_node& node, const std::string& where, Findings& findings) {
    for (const pugi::xml_attribute& attribute : node.attributes()) {
        if (HasOuterSpace(attribute.value()) && std::strcmp(attribute.name(), "FourChar") != 0) {
            findings.push_back(where + ": " + attribute.name() + " is empty or has outer blanks");
        }
    }
    bool hasElements = false;
    for (const pugi::xml_node& child : node.children()) {
        if (child.type() == pugi::node_element) {
            hasElements = true;
            CheckLeafSpace(child, where, findings);
        }
    }
    const bool isLeaf = !hasElements && !node.first_attribute();
    if (isLeaf && std::strcmp(node.name(), "FourChar") != 0 && HasOuterSpace(node.child_value())) {
        findings.push_back(where + ": " + node.name() + " is empty or has outer blanks");
    }
}

template <class Check>
void ForEachEntry(const std::string& file, const char* name, Findings& findings, Check check) {
    pugi::xml_document document;
    const pugi::xml_parse_result parsed =
        document.load_file(file.c_str(), pugi::parse_default | pugi::parse_ws_pcdata);
    if (!parsed) {
        findings.push_back(file + ": " + parsed.description());
        return;
    }
    int number = 0;
    for (const pugi::xml_node& node : document.document_element().children(name)) {
        const std::string where = file + ": entry " + std::to_string(++number);
        check(Entry(node, where, findings));
        CheckLeafSpace(node, where, findings);
    }
    if (number == 0) {
        findings.push_back(file + ": there is no " + name);
    }
}

}  // namespace

void CheckInfoText(const std::string& file, Findings& findings) {
    ForEachEntry(file, "MediaDescriptorSignature", findings, [](const Entry& entry) {
        const std::string id = entry.One(entry.node().child("NivoInfo"), "ResolutionID");
        if (!id.empty() && (!IsNumber(id) || id == "0")) {
            entry.Tell("ResolutionID can't be \"" + id + "\"");
        }
        int descriptors = 0;
        for (const char* kind :
             {"groups:CDCIDescriptor", "groups:MPEG2VideoDescriptor", "groups:RGBADescriptor"}) {
            for (const pugi::xml_node& descriptor : entry.node().children(kind)) {
                ++descriptors;
                CheckDescriptor(entry, descriptor);
            }
        }
        if (descriptors != 1) {
            entry.Tell("there must be one descriptor, not " + std::to_string(descriptors));
        }
    });
}

void CheckMapperText(const std::string& file, Findings& findings) {
    ForEachEntry(file, "FourCharMapping", findings, [](const Entry& entry) {
        const std::string code = entry.One(entry.node(), "FourChar");
        if (!code.empty() && code.size() != 4) {
            entry.Tell("FourChar must have four characters, not \"" + code + "\"");
        }
        if (!ItemsOf(entry.node(), "vcid").empty()) {
            entry.Number(entry.node(), "vcid", NotZero);
        }
        for (const std::string& name : NamesOf(entry.node())) {
            if (name != "FourChar" && name != "Vendor" && name != "vcid") {
                entry.Tell(name + " means nothing there");
            }
        }
    });
}

}  // namespace data_check

std::vector<std::string> CheckData(INCFComponentFactory* factory, const std::string& mapperFile,
                                   const std::string& infoFile) {
    data_check::Findings findings;
    data_check::CheckMapperText(mapperFile, findings);
    data_check::CheckInfoText(infoFile, findings);
    // What the readers make of the files means little while entries are wrong.
    if (findings.empty()) {
        data_check::CheckLookups(factory, mapperFile, infoFile, findings);
    }
    return findings;
}
