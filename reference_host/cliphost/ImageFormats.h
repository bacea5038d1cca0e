// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <string>
#include <vector>

#include "host_interfaces/media/SampleMapping.h"

namespace cliphost {

// A picture format as a module offers it: the host's numbers for its layout.
struct ImageFormat {
    ncfUInt32 index = 0;  // in the track's list
    ncfUInt32 pixels = 0;
    ncfUInt32 chroma = 0;
    ncfUInt32 component = 0;
    ncfUInt32 range = 0;
    ncfUInt32 colorSpace = 0;
    ncfUInt32 fieldOrder = 0;
    ncfUInt32 frameLayout = 0;
    ncfUInt32 orientation = 0;
};

// The numbers that tell how bytes are to be read.
namespace format {
inline constexpr ncfUInt32 kCbYCrY = 2;  // pixels
inline constexpr ncfUInt32 kARGB = 4;
inline constexpr ncfUInt32 kBGRA = 8;
inline constexpr ncfUInt32 kMono = 1024;
inline constexpr ncfUInt32 kBytes = 1;  // component
inline constexpr ncfUInt32 kTenBits = 2;
inline constexpr ncfUInt32 kV210 = 1024;
inline constexpr ncfUInt32 kBytesFullRange = 2048;
inline constexpr ncfUInt32 kWordsVideoRange = 4096;
inline constexpr ncfUInt32 kWordsFullRange = 8192;
inline constexpr ncfUInt32 kVideoRange = 1;  // range
inline constexpr ncfUInt32 kFullRange = 2;
inline constexpr ncfUInt32 kRec601 = 4;  // colour space
inline constexpr ncfUInt32 kRec709 = 8;
inline constexpr ncfUInt32 kProgressive = 256;  // field order
inline constexpr ncfUInt32 kTopFirst = 512;
inline constexpr ncfUInt32 kBottomFirst = 4096;
inline constexpr ncfUInt32 kMerged = 256;  // frame layout
inline constexpr ncfUInt32 kSplit = 512;
}  // namespace format

// The layout of the bytes of a delivered picture.
enum class PictureBytes {
    CbYCrY8,
    Bgra8,
    Argb16,   // big-endian
    Alpha8,   // a byte a pixel
    Alpha10,  // a plane of the upper eight bits, then one of the lower two
    Unusable  // its label and its bytes differ
};

// What the program knows about a layout; one row for each in a table.
struct ImageLayout {
    const char* name;  // on the command line
    ncfUInt32 pixels;
    ncfUInt32 component;
    ncfUInt32 range;  // 0: any
    PictureBytes bytes;
    int bytesPerPixel;
    int bits;
    const char* words;
    const char* rawName;  // FFmpeg's name of the bytes, null: it has none
};

// Null for a layout that the program does not know.
const ImageLayout* LayoutOf(const ImageFormat& format);
// Whether a picture can be made of it.
bool IsUsable(const ImageFormat& format);
// The layout's name, or its numbers.
std::string NameOf(const ImageFormat& format);
// A format for people: "8-bit Y'CbCr 4:2:2 ..., Rec. 709, video range, ...".
std::string WordsFor(const ImageFormat& format);

// All formats of a picture or alpha track. The result is the module's.
NCFRESULT ReadImageFormats(NMA::IUncompressedImageProvider& provider, ncfUInt32 track,
                           std::vector<ImageFormat>& formats);

// The format that a person asked for: a name, an index, "deepest", or nothing
// for the first that a picture can be made of. Null when there is none such.
const ImageFormat* ChooseFormat(const std::vector<ImageFormat>& formats, const std::string& asked);

}  // namespace cliphost
