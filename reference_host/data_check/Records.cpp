// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/data_check/Records.h"

#include <fmt/format.h>

#include <algorithm>

namespace data_check {
namespace {

using host::PlacedElement;

bool IsAny(std::uint32_t) {
    return true;
}
bool IsNotZero(std::uint32_t number) {
    return number != 0;
}
constexpr char kAny[] = "a whole number";
constexpr char kNotZero[] = "a whole number above 0";

// Beyond these, an AAF library refuses the description.
constexpr NumberRule kLayout = {"rp210:FrameLayout", [](std::uint32_t n) { return n <= 4; },
                                "0 (frames), 1 (fields) or another layout up to 4", true};
constexpr NumberRule kStoredWidth = {"rp210:StoredWidth", IsNotZero, kNotZero, true};
constexpr NumberRule kStoredHeight = {"rp210:StoredHeight", IsNotZero, kNotZero, true};
constexpr NumberRule kSampledWidth = {"rp210:SampledWidth", IsNotZero, kNotZero, false};
constexpr NumberRule kDisplayHeight = {"rp210:DisplayHeight", IsNotZero, kNotZero, false};
constexpr NumberRule kCommon[] = {
    {"rp210:DisplayWidth", IsNotZero, kNotZero, false},
    {"rp210:DisplayYOffset", IsAny, kAny, false},
    {"rp210:ImageStartOffset", IsAny, kAny, false},
    {"rp210:ImageAlignmentOffset", IsAny, kAny, false},
};
constexpr NumberRule kCdci[] = {
    {"rp210:ComponentDepth", [](std::uint32_t n) { return n >= 1 && n <= 16; }, "1 to 16 bits",
     true},
    {"rp210:HorizontalSubsampling", [](std::uint32_t n) { return n == 1 || n == 2 || n == 4; },
     "1, 2 or 4", true},
    {"rp210:VerticalSubsampling", [](std::uint32_t n) { return n == 1 || n == 2; }, "1 or 2", true},
    {"rp210:ColorSiting", [](std::uint32_t n) { return n <= 4 || n == 255; }, "0 to 4, or 255",
     true},
    {"rp210:ColorRange", IsNotZero, kNotZero, true},
    {"rp210:BlackRefLevel", IsAny, kAny, true},
    {"rp210:WhiteReflevel", IsNotZero, kNotZero, true},
    {"AVCSliceCounter", IsNotZero, kNotZero, false},
};
constexpr NumberRule kMpeg2[] = {
    {"rp210:BitRate", IsNotZero, kNotZero, true},
    {"rp210:MaxGOP", [](std::uint32_t n) { return n <= 0xFFFF; }, "a whole number up to 65535",
     true},
};
constexpr NumberRule kRgba[] = {
    {"rp210:ComponentMaxRef", IsNotZero, kNotZero, true},
    {"rp210:ComponentMinRef", IsAny, kAny, true},
};
constexpr NumberRule kDepth = {"rp210:Depth", [](std::uint32_t n) { return n >= 1 && n <= 64; },
                               "1 to 64 bits", true};
constexpr NumberRule kNumerator = {"types:Numerator", IsNotZero, kNotZero, true};
constexpr NumberRule kDenominator = {"types:Denominator", IsNotZero, kNotZero, true};
constexpr NumberRule kId = {"ResolutionID", IsId, "a whole number from 1 to 2147483647", true};

constexpr char kSampleRate[] = "rp210:SampleRate";
constexpr char kAspect[] = "rp210:AspectRatio";
constexpr char kLineMap[] = "rp210:VideoLineMap";
constexpr NumberRule kLine = {"rp210:Element", IsAny, kAny, true};
constexpr char kPixelLayout[] = "rp210:PixelLayout";
constexpr char kComponent[] = "rp210:RGBALayout";
constexpr char kProfile[] = "rp210:ProfileAndLevel";
constexpr const char* kLabels[] = {"rp210:PictureEssenceCoding", "rp210:EssenceContainerLabel"};

constexpr char kCdciKind[] = "groups:CDCIDescriptor";
constexpr char kMpeg2Kind[] = "groups:MPEG2VideoDescriptor";
constexpr char kRgbaKind[] = "groups:RGBADescriptor";
constexpr const char* kKinds[] = {kCdciKind, kMpeg2Kind, kRgbaKind};

class RecordReader {
public:
    explicit RecordReader(Findings& findings)
        : findings_(findings), reader_(DataFile::Info, findings) {}

    Records ReadAll(const PlacedElement& root) {
        Records all;
        for (const PlacedElement* const entry :
             EntriesOf(root, "MediaDescriptorSignature", reader_)) {
            if (const std::optional<Record> record = Read(*entry)) {
                all.records.push_back(*record);
            } else {
                all.isWhole = false;
            }
        }
        return all;
    }

private:
    // Nothing where it can't be told what finds it.
    std::optional<Record> Read(const PlacedElement& entry) {
        reader_.CheckNames(entry, {"NivoInfo", kCdciKind, kMpeg2Kind, kRgbaKind});
        const std::optional<std::uint32_t> id = ReadId(entry);
        const PlacedElement* const descriptor = DescriptorOf(entry);
        if (descriptor == nullptr) {
            return std::nullopt;
        }
        std::optional<Record> record = ReadRaster(*descriptor);
        CheckDescriptor(*descriptor);
        if (!record || !id) {
            return std::nullopt;
        }
        record->id = *id;
        record->place = entry.place;
        return record;
    }

    std::optional<std::uint32_t> ReadId(const PlacedElement& entry) {
        const PlacedElement* const info =
            reader_.OneChild(entry, "NivoInfo",
                             "add <NivoInfo ResolutionID=\"...\"/>; without it the record counts "
                             "for the id of the one before");
        if (info == nullptr) {
            return std::nullopt;
        }
        reader_.CheckNames(*info, {kId.name});
        return reader_.Number(*info, kId);
    }

    const PlacedElement* DescriptorOf(const PlacedElement& entry) {
        const PlacedElement* found = nullptr;
        for (const PlacedElement& child : entry.elements) {
            const bool isOne = std::any_of(std::begin(kKinds), std::end(kKinds),
                                           [&](const char* kind) { return child.name == kind; });
            if (isOne && found != nullptr) {
                reader_.Tell(child.place, "this is a second descriptor",
                             "give it a record of its own");
            }
            found = isOne && found == nullptr ? &child : found;
        }
        if (found == nullptr) {
            reader_.Tell(entry.place, "the record has no descriptor",
                         fmt::format("add a {}, {} or {}", kCdciKind, kMpeg2Kind, kRgbaKind));
        }
        return found;
    }

    std::optional<Record> ReadRaster(const PlacedElement& descriptor) {
        const std::size_t before = findings_.count();
        Record record;
        record.layout = reader_.Number(descriptor, kLayout).value_or(0);
        record.storedWidth = reader_.Number(descriptor, kStoredWidth).value_or(0);
        record.storedHeight = reader_.Number(descriptor, kStoredHeight).value_or(0);
        record.sampledWidth =
            reader_.Number(descriptor, kSampledWidth).value_or(record.storedWidth);
        record.displayHeight =
            reader_.Number(descriptor, kDisplayHeight).value_or(record.storedHeight);
        return findings_.count() == before ? std::optional<Record>(record) : std::nullopt;
    }

    void CheckDescriptor(const PlacedElement& descriptor) {
        std::vector<const char*> known = {kSampleRate,        kAspect,
                                          kLineMap,           kLayout.name,
                                          kStoredWidth.name,  kStoredHeight.name,
                                          kSampledWidth.name, kDisplayHeight.name};
        CheckNumbers(descriptor, kCommon, known);
        for (const char* const label : kLabels) {
            known.push_back(label);
            CheckLabel(descriptor, label);
        }
        CheckAspect(descriptor);
        CheckLineMap(descriptor);
        if (descriptor.name == kRgbaKind) {
            CheckNumbers(descriptor, kRgba, known);
            known.push_back(kPixelLayout);
            CheckPixelLayout(descriptor);
        } else {
            CheckNumbers(descriptor, kCdci, known);
        }
        if (descriptor.name == kMpeg2Kind) {
            CheckNumbers(descriptor, kMpeg2, known);
            known.push_back(kProfile);
            CheckProfile(descriptor);
        }
        reader_.CheckNames(descriptor, known);
    }

    template <std::size_t count>
    void CheckNumbers(const PlacedElement& descriptor, const NumberRule (&rules)[count],
                      std::vector<const char*>& known) {
        for (const NumberRule& rule : rules) {
            known.push_back(rule.name);
            static_cast<void>(reader_.Number(descriptor, rule));
        }
    }

    // A byte of 80h or more in its second half would set all bits before it.
    void CheckLabel(const PlacedElement& descriptor, const char* name) {
        constexpr std::size_t kLongest = 36;
        constexpr std::size_t kDigits = 32;
        constexpr char kHint[] =
            "write a universal label as registers print it, such as "
            "060e2b34-04010101-04010202-02010100";
        const std::optional<Item> item = reader_.One(descriptor, name, kHint);
        if (!item) {
            return;
        }
        std::string digits = item->value.substr(0, kLongest + 1);
        digits.erase(std::remove(digits.begin(), digits.end(), '-'), digits.end());
        const bool isLabel = item->value.size() <= kLongest && digits.size() == kDigits &&
                             digits.compare(0, 8, "060e2b34") == 0 &&
                             digits.find_first_not_of("0123456789abcdefABCDEF") == digits.npos;
        if (!isLabel) {
            reader_.Tell(item->place,
                         fmt::format("{} is no universal label: \"{}\"", name, Shown(item->value)),
                         kHint);
            return;
        }
        for (std::size_t i = kDigits / 2; i < kDigits; i += 2) {
            if (digits[i] > '7') {
                reader_.Tell(item->place,
                             fmt::format("{} has a byte of 80h or more in its second half", name),
                             "take another label; the module spoils this one");
                return;
            }
        }
    }

    void CheckAspect(const PlacedElement& descriptor) {
        const PlacedElement* const aspect =
            reader_.OneChild(descriptor, kAspect,
                             "add <rp210:AspectRatio types:Numerator=\"16\" "
                             "types:Denominator=\"9\"/>");
        if (aspect != nullptr) {
            reader_.CheckNames(*aspect, {kNumerator.name, kDenominator.name});
            static_cast<void>(reader_.Number(*aspect, kNumerator));
            static_cast<void>(reader_.Number(*aspect, kDenominator));
        }
    }

    void CheckLineMap(const PlacedElement& descriptor) {
        constexpr char kHint[] =
            "give the first line of each field, such as "
            "<rp210:VideoLineMap><rp210:Element>42</rp210:Element></rp210:VideoLineMap>";
        const PlacedElement* const map = reader_.OneChild(descriptor, kLineMap, kHint);
        if (map == nullptr) {
            return;
        }
        reader_.CheckNames(*map, {kLine.name});
        const std::vector<Item> lines = ItemsOf(*map, kLine.name);
        for (const Item& line : lines) {
            static_cast<void>(reader_.NumberOf(line, kLine));
        }
        if (lines.empty() || lines.size() > 2) {
            reader_.Tell(map->place, fmt::format("{} must have one or two line numbers", kLineMap),
                         kHint);
        }
    }

    void CheckPixelLayout(const PlacedElement& descriptor) {
        constexpr std::size_t kMost = 8;
        constexpr char kHint[] =
            "give one to eight, such as <rp210:RGBALayout rp210:Code=\"R\" rp210:Depth=\"8\"/>";
        const PlacedElement* const layout = reader_.OneChild(descriptor, kPixelLayout, kHint);
        if (layout == nullptr) {
            return;
        }
        reader_.CheckNames(*layout, {kComponent});
        std::size_t components = 0;
        for (const PlacedElement& component : layout->elements) {
            if (component.name != kComponent) {
                continue;
            }
            ++components;
            reader_.CheckNames(component, {"rp210:Code", kDepth.name});
            const std::optional<Item> code =
                reader_.One(component, "rp210:Code", "give the letter of a component");
            if (code && code->value.size() > 1) {
                reader_.Tell(code->place, "rp210:Code is more than one letter",
                             "give one letter; the module takes the first");
            }
            static_cast<void>(reader_.Number(component, kDepth));
        }
        if (components < 1 || components > kMost) {
            reader_.Tell(layout->place,
                         fmt::format("{} has {} components", kPixelLayout, components), kHint);
        }
    }

    void CheckProfile(const PlacedElement& descriptor) {
        constexpr char kHint[] = "write 0x and two digits, such as 0x82";
        const std::optional<Item> item = reader_.One(descriptor, kProfile, kHint);
        const auto isDigit = [&](std::size_t at) {
            return std::string_view("0123456789abcdefABCDEF").find(item->value[at]) !=
                   std::string_view::npos;
        };
        if (item && (item->value.size() != 4 || item->value.compare(0, 2, "0x") != 0 ||
                     !isDigit(2) || !isDigit(3))) {
            reader_.Tell(item->place,
                         fmt::format("{} can't be \"{}\"", kProfile, Shown(item->value)),
                         kHint);
        }
    }

    Findings& findings_;
    EntryReader reader_;
};

}  // namespace

Records ReadRecords(const PlacedElement& root, Findings& findings) {
    return RecordReader(findings).ReadAll(root);
}

}  // namespace data_check
