// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/ImageFormats.h"

#include <fmt/format.h>

namespace cliphost {
namespace {

using namespace format;

constexpr ImageLayout kImageLayouts[] = {
    {"2vuy", kCbYCrY, kBytes, 0, PictureBytes::CbYCrY8, 2, 8, "8-bit Y'CbCr 4:2:2, bytes Cb Y Cr Y",
     "uyvy422"},
    {"v210", kCbYCrY, kV210, 0, PictureBytes::Unusable, 4, 10,
     "labelled 10-bit Y'CbCr 4:2:2, but holds other bytes: no picture can be made of it", nullptr},
    {"bgra", kBGRA, kBytes, kFullRange, PictureBytes::Bgra8, 4, 8,
     "8-bit R'G'B' 4:4:4:4, bytes B G R A", "bgra"},
    {"bgra", kBGRA, kBytesFullRange, 0, PictureBytes::Bgra8, 4, 8,
     "8-bit R'G'B' 4:4:4:4, bytes B G R A", "bgra"},
    {"bgra-video", kBGRA, kBytes, kVideoRange, PictureBytes::Bgra8, 4, 8,
     "8-bit R'G'B' 4:4:4:4, bytes B G R A", "bgra"},
    {"b64a", kARGB, kWordsVideoRange, 0, PictureBytes::Argb16, 8, 16,
     "16-bit R'G'B' 4:4:4:4, big-endian words A R G B", nullptr},
    {"b64a-full", kARGB, kWordsFullRange, 0, PictureBytes::Argb16, 8, 16,
     "16-bit R'G'B' 4:4:4:4, big-endian words A R G B", nullptr},
    {"a8", kMono, kBytes, 0, PictureBytes::Alpha8, 1, 8, "8-bit alpha, a byte a pixel", "gray"},
    {"a10", kMono, kTenBits, 0, PictureBytes::Alpha10, 2, 10,
     "10-bit alpha, a plane of the upper 8 bits, then one of the lower 2", nullptr},
};

struct Word {
    ncfUInt32 value;
    const char* text;
};
constexpr Word kRanges[] = {{kVideoRange, "video range"}, {kFullRange, "full range"}};
constexpr Word kSpaces[] = {{kRec601, "Rec. 601"}, {kRec709, "Rec. 709"}};
constexpr Word kFields[] = {{kProgressive, "progressive"},
                            {kTopFirst, "interlaced, top field first"},
                            {kBottomFirst, "interlaced, bottom field first"}};
constexpr Word kFrameLayouts[] = {{kMerged, "both fields in one frame"},
                                  {kSplit, "each field by itself"}};

template <std::size_t count>
void Append(std::string& text, const Word (&words)[count], ncfUInt32 value) {
    for (const Word& word : words) {
        if (word.value == value) {
            text += std::string(", ") + word.text;
        }
    }
}

int BitsOf(const ImageFormat& format) {
    const ImageLayout* const layout = LayoutOf(format);
    return layout ? layout->bits : 0;
}

}  // namespace

const ImageLayout* LayoutOf(const ImageFormat& format) {
    for (const ImageLayout& layout : kImageLayouts) {
        if (layout.pixels == format.pixels && layout.component == format.component &&
            (layout.range == 0 || layout.range == format.range)) {
            return &layout;
        }
    }
    return nullptr;
}

bool IsUsable(const ImageFormat& format) {
    const ImageLayout* const layout = LayoutOf(format);
    return layout && layout->bytes != PictureBytes::Unusable;
}

std::string NameOf(const ImageFormat& format) {
    const ImageLayout* const layout = LayoutOf(format);
    return layout ? layout->name : fmt::format("{}/{}", format.pixels, format.component);
}

std::string WordsFor(const ImageFormat& format) {
    const ImageLayout* const layout = LayoutOf(format);
    std::string text = layout ? std::string(layout->words)
                              : fmt::format("pixels {}, components {}: not known to this program",
                                            format.pixels, format.component);
    Append(text, kSpaces, format.colorSpace);
    Append(text, kRanges, format.range);
    Append(text, kFields, format.fieldOrder);
    if (format.fieldOrder != kProgressive || format.frameLayout == kSplit) {
        Append(text, kFrameLayouts, format.frameLayout);
    }
    return text;
}

NCFRESULT ReadImageFormats(NMA::IUncompressedImageProvider& provider, ncfUInt32 track,
                           std::vector<ImageFormat>& formats) {
    formats.clear();
    ncfUInt32 count = 0;
    NCFRESULT result = provider.GetNumberOfImageFormats(track, &count);
    for (ncfUInt32 i = 0; i < count && result >= 0; ++i) {
        ImageFormat one;
        one.index = i;
        result = provider.GetImageFormat(track, i, &one.pixels, &one.chroma, &one.component,
                                         &one.range, &one.colorSpace, &one.fieldOrder,
                                         &one.frameLayout, &one.orientation);
        if (result >= 0) {
            formats.push_back(one);
        }
    }
    return result;
}

const ImageFormat* ChooseFormat(const std::vector<ImageFormat>& formats, const std::string& asked) {
    const ImageFormat* chosen = nullptr;
    for (const ImageFormat& one : formats) {
        const bool isNamed = asked == NameOf(one) || asked == std::to_string(one.index);
        if (!IsUsable(one) || (!asked.empty() && asked != "deepest" && !isNamed)) {
            continue;
        }
        if (!chosen || (asked == "deepest" && BitsOf(one) > BitsOf(*chosen))) {
            chosen = &one;
        }
    }
    return chosen;
}

}  // namespace cliphost
