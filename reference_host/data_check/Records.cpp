// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/data_check/Records.h"

#include <fmt/format.h>

#include <algorithm>
#include <map>

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
constexpr std::uint32_t kFields = 1;
constexpr NumberRule kStoredWidth = {"rp210:StoredWidth", IsNotZero, kNotZero, true};
constexpr NumberRule kStoredHeight = {"rp210:StoredHeight", IsNotZero, kNotZero, true};
constexpr NumberRule kSampledWidth = {"rp210:SampledWidth", IsNotZero, kNotZero, false};
constexpr NumberRule kDisplayHeight = {"rp210:DisplayHeight", IsNotZero, kNotZero, false};
constexpr NumberRule kDisplayWidth = {"rp210:DisplayWidth", IsNotZero, kNotZero, false};
constexpr NumberRule kDisplayYOffset = {"rp210:DisplayYOffset", IsAny, kAny, false};
constexpr NumberRule kCommon[] = {
    kDisplayWidth,
    kDisplayYOffset,
    {"rp210:ImageStartOffset", IsAny, kAny, false},
    {"rp210:ImageAlignmentOffset", IsAny, kAny, false},
};
constexpr NumberRule kComponentDepth = {"rp210:ComponentDepth",
                                        [](std::uint32_t n) { return n >= 1 && n <= 16; },
                                        "1 to 16 bits", true};
constexpr NumberRule kColorRange = {"rp210:ColorRange", IsNotZero, kNotZero, true};
constexpr NumberRule kBlack = {"rp210:BlackRefLevel", IsAny, kAny, true};
constexpr NumberRule kWhite = {"rp210:WhiteReflevel", IsNotZero, kNotZero, true};
constexpr NumberRule kCdci[] = {
    kComponentDepth,
    {"rp210:HorizontalSubsampling", [](std::uint32_t n) { return n == 1 || n == 2 || n == 4; },
     "1, 2 or 4", true},
    {"rp210:VerticalSubsampling", [](std::uint32_t n) { return n == 1 || n == 2; }, "1 or 2", true},
    {"rp210:ColorSiting", [](std::uint32_t n) { return n <= 4 || n == 255; }, "0 to 4, or 255",
     true},
    kColorRange,
    kBlack,
    kWhite,
    {"AVCSliceCounter", IsNotZero, kNotZero, false},
};
constexpr NumberRule kMpeg2[] = {
    {"rp210:BitRate", IsNotZero, kNotZero, true},
    {"rp210:MaxGOP", [](std::uint32_t n) { return n <= 0xFFFF; }, "a whole number up to 65535",
     true},
};
constexpr NumberRule kMaxRef = {"rp210:ComponentMaxRef", IsNotZero, kNotZero, true};
constexpr NumberRule kMinRef = {"rp210:ComponentMinRef", IsAny, kAny, true};
constexpr NumberRule kRgba[] = {kMaxRef, kMinRef};
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
constexpr char kLetter[] = "rp210:Code";
constexpr char kProfile[] = "rp210:ProfileAndLevel";
constexpr const char* kLabels[] = {"rp210:PictureEssenceCoding", "rp210:EssenceContainerLabel"};

constexpr char kCdciKind[] = "groups:CDCIDescriptor";
constexpr char kMpeg2Kind[] = "groups:MPEG2VideoDescriptor";
constexpr char kRgbaKind[] = "groups:RGBADescriptor";
constexpr const char* kKinds[] = {kCdciKind, kMpeg2Kind, kRgbaKind};

// Letters of components in an AAF library; those of colours and alpha may stand there once.
constexpr std::string_view kComponents = "RGBAFP0";
constexpr std::string_view kOnce = "RGBAP";
constexpr std::string_view kColours = "RGB";
constexpr char kPalette = 'P';

// What an element says: equal for elements that say the same in another order or form. Elements of
// one name keep their order, as the lines of fields do.
std::string ValuesOf(const PlacedElement& element) {
    std::vector<std::pair<std::string_view, std::string>> items;
    for (const host::PlacedAttribute& attribute : element.attributes) {
        items.emplace_back(attribute.name, '=' + attribute.value);
    }
    for (const PlacedElement& child : element.elements) {
        items.emplace_back(child.name, child.attributes.empty() && child.elements.empty()
                                           ? '=' + child.text
                                           : ValuesOf(child));
    }
    std::stable_sort(items.begin(), items.end(),
                     [](const auto& a, const auto& b) { return a.first < b.first; });
    std::string values = "{";
    for (const auto& [name, value] : items) {
        // A line end can't stand in a name, nor in a value that is sound.
        values.append(name).append(value) += '\n';
    }
    return values + '}';
}

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
        reader_.CheckNames(*descriptor, NamesOf(*descriptor));
        std::optional<Record> record = ReadRaster(*descriptor);
        CheckDescriptor(*descriptor);
        if (!record || !id) {
            return std::nullopt;
        }
        record->id = *id;
        record->place = entry.place;
        record->values = ValuesOf(entry);
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
        numbers_.clear();
        Record record;
        record.layout = Number(descriptor, kLayout).value_or(0);
        record.storedWidth = Number(descriptor, kStoredWidth).value_or(0);
        record.storedHeight = Number(descriptor, kStoredHeight).value_or(0);
        record.sampledWidth = Number(descriptor, kSampledWidth).value_or(record.storedWidth);
        record.displayHeight = Number(descriptor, kDisplayHeight).value_or(record.storedHeight);
        const bool hasAll = NumberOf(kLayout) && NumberOf(kStoredWidth) && NumberOf(kStoredHeight);
        return hasAll && findings_.count() == before ? std::optional<Record>(record) : std::nullopt;
    }

    // What the module reads of a descriptor.
    static std::vector<const char*> NamesOf(const PlacedElement& descriptor) {
        std::vector<const char*> names = {kSampleRate,        kAspect,
                                          kLineMap,           kLayout.name,
                                          kStoredWidth.name,  kStoredHeight.name,
                                          kSampledWidth.name, kDisplayHeight.name};
        names.insert(names.end(), std::begin(kLabels), std::end(kLabels));
        const auto add = [&](const auto& rules) {
            for (const NumberRule& rule : rules) {
                names.push_back(rule.name);
            }
        };
        add(kCommon);
        if (descriptor.name == kRgbaKind) {
            add(kRgba);
            names.push_back(kPixelLayout);
        } else {
            add(kCdci);
        }
        if (descriptor.name == kMpeg2Kind) {
            add(kMpeg2);
            names.push_back(kProfile);
        }
        return names;
    }

    void CheckDescriptor(const PlacedElement& descriptor) {
        CheckNumbers(descriptor, kCommon);
        for (const char* const label : kLabels) {
            CheckLabel(descriptor, label);
        }
        CheckAspect(descriptor);
        CheckLineMap(descriptor);
        CheckSizes(descriptor);
        if (descriptor.name == kRgbaKind) {
            CheckNumbers(descriptor, kRgba);
            CheckLevels(descriptor, kMinRef, kMaxRef, CheckPixelLayout(descriptor));
        } else {
            CheckNumbers(descriptor, kCdci);
            const std::uint32_t depth = NumberOf(kComponentDepth).value_or(0);
            CheckLevels(descriptor, kBlack, kWhite, depth);
            CheckDepth(descriptor, kColorRange, depth);
        }
        if (descriptor.name == kMpeg2Kind) {
            CheckNumbers(descriptor, kMpeg2);
            CheckProfile(descriptor);
        }
    }

    template <std::size_t count>
    void CheckNumbers(const PlacedElement& descriptor, const NumberRule (&rules)[count]) {
        for (const NumberRule& rule : rules) {
            static_cast<void>(Number(descriptor, rule));
        }
    }

    std::optional<std::uint32_t> Number(const PlacedElement& descriptor, const NumberRule& rule) {
        const std::optional<std::uint32_t> number = reader_.Number(descriptor, rule);
        if (number) {
            numbers_[rule.name] = *number;
        }
        return number;
    }
    // Of the descriptor at hand; nothing where it lacks or is wrong.
    std::optional<std::uint32_t> NumberOf(const NumberRule& rule) const {
        const auto found = numbers_.find(rule.name);
        return found == numbers_.end() ? std::nullopt : std::optional<std::uint32_t>(found->second);
    }

    // Tells a number that is too large for another one.
    void CheckAtMost(const PlacedElement& descriptor, const NumberRule& rule, std::uint64_t most,
                     const std::string& why) {
        const std::optional<std::uint32_t> number = NumberOf(rule);
        if (number && *number > most) {
            reader_.Tell(ItemsOf(descriptor, rule.name)[0].place,
                         fmt::format("{} can't be {}: {}", rule.name, *number, why),
                         fmt::format("give {} at most, or correct the other value", most));
        }
    }

    // What is shown and what was sampled are parts of what is stored.
    void CheckSizes(const PlacedElement& descriptor) {
        if (const auto width = NumberOf(kStoredWidth)) {
            const std::string why = fmt::format("{} is {}", kStoredWidth.name, *width);
            CheckAtMost(descriptor, kSampledWidth, *width, why);
            CheckAtMost(descriptor, kDisplayWidth, *width, why);
        }
        const auto height = NumberOf(kStoredHeight);
        if (!height) {
            return;
        }
        const std::string why = fmt::format("{} is {}", kStoredHeight.name, *height);
        CheckAtMost(descriptor, kDisplayHeight, *height, why);
        const std::uint32_t shown = NumberOf(kDisplayHeight).value_or(*height);
        if (shown <= *height) {
            CheckAtMost(descriptor, kDisplayYOffset, *height - shown,
                        fmt::format("{} of {} lines are shown", shown, *height));
        }
    }

    // Tells a number that components of so many bits can't have; 0: the bits are not known.
    void CheckDepth(const PlacedElement& descriptor, const NumberRule& rule, std::uint32_t bits) {
        if (bits > 0 && bits < 32) {
            CheckAtMost(descriptor, rule, (std::uint64_t{1} << bits) - 1,
                        fmt::format("components have {} bits", bits));
        }
    }

    void CheckLevels(const PlacedElement& descriptor, const NumberRule& black,
                     const NumberRule& white, std::uint32_t bits) {
        CheckDepth(descriptor, white, bits);
        if (const auto level = NumberOf(white)) {
            CheckAtMost(descriptor, black, *level - 1, fmt::format("{} is {}", white.name, *level));
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
        } else if (lines.size() == 1 && NumberOf(kLayout) == kFields) {
            reader_.Tell(map->place, fmt::format("{} has no line for the second field", kLineMap),
                         "give two line numbers, since the picture is stored in fields");
        }
    }

    // Gives the bits of the deepest component; 0 where none is known.
    std::uint32_t CheckPixelLayout(const PlacedElement& descriptor) {
        constexpr std::size_t kMost = 8;
        constexpr char kHint[] =
            "give one to eight, such as <rp210:RGBALayout rp210:Code=\"R\" rp210:Depth=\"8\"/>";
        const PlacedElement* const layout = reader_.OneChild(descriptor, kPixelLayout, kHint);
        if (layout == nullptr) {
            return 0;
        }
        reader_.CheckNames(*layout, {kComponent});
        std::size_t components = 0;
        std::string letters;
        std::uint32_t deepest = 0;
        for (const PlacedElement& component : layout->elements) {
            if (component.name != kComponent) {
                continue;
            }
            ++components;
            reader_.CheckNames(component, {kLetter, kDepth.name});
            if (const auto code =
                    reader_.One(component, kLetter, "give the letter of a component")) {
                CheckLetter(*code, letters);
                letters += code->value[0];
            }
            deepest = std::max(deepest, reader_.Number(component, kDepth).value_or(0));
        }
        for (const char colour : kColours) {
            if (components > 0 && letters.size() == components &&
                letters.find(colour) == letters.npos && letters.find(kPalette) == letters.npos) {
                reader_.Tell(layout->place, fmt::format("{} has no {}", kPixelLayout, colour),
                             "give the three colours of a picture, or P for a palette");
            }
        }
        if (components < 1 || components > kMost) {
            reader_.Tell(layout->place,
                         fmt::format("{} has {} components", kPixelLayout, components), kHint);
        }
        return deepest;
    }

    void CheckLetter(const Item& code, const std::string& before) {
        const char letter = code.value[0];
        if (code.value.size() > 1) {
            reader_.Tell(code.place, fmt::format("{} is more than one letter", kLetter),
                         "give one letter; the module takes the first");
        } else if (kComponents.find(letter) == kComponents.npos) {
            reader_.Tell(code.place, fmt::format("{} can't be \"{}\"", kLetter, letter),
                         "give R, G, B, A (alpha), F (fill), P (palette) or 0 (none)");
        } else if (kOnce.find(letter) != kOnce.npos && before.find(letter) != before.npos) {
            reader_.Tell(code.place, fmt::format("{} stands here a second time", letter),
                         "give each component once; F may fill what is left of a pixel");
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
                         fmt::format("{} can't be \"{}\"", kProfile, Shown(item->value)), kHint);
        }
    }

    Findings& findings_;
    EntryReader reader_;
    std::map<std::string_view, std::uint32_t> numbers_;  // of the descriptor at hand, by names
};

}  // namespace

Records ReadRecords(const PlacedElement& root, Findings& findings) {
    return RecordReader(findings).ReadAll(root);
}

}  // namespace data_check
