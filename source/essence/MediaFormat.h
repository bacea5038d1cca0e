// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>

#include "source/plugin/PixelEnums.h"
#include "source/plugin/Rational.h"

// One format in which a track's samples can be delivered. Immutable once it is in a
// track's list.
class MediaFormat {
public:
    virtual ~MediaFormat() = default;
};

// Interleaved PCM.
class QTAudioFormat final : public MediaFormat {
public:
    QTAudioFormat(ncfUInt32 format, ncfUInt16 bytes, ncfUInt16 bits)
        : sampleFormat(format), bytesPerSample(bytes), bitsPerSample(bits) {}

    ncfUInt32 GetSampleFormat() const { return sampleFormat; }

    ncfUInt32 sampleFormat;
    ncfUInt16 bytesPerSample;
    ncfUInt16 bitsPerSample;
};

inline bool operator==(const QTAudioFormat& left, const QTAudioFormat& right) {
    return left.sampleFormat == right.sampleFormat && left.bytesPerSample == right.bytesPerSample &&
           left.bitsPerSample == right.bitsPerSample;
}

class LevelPass;

// Turns a decoded frame into the layout that was promised. Sizes in bytes;
// never reads or writes beyond them. `levels` goes over the destination: what is
// sent through it as soon as it is made is still in the processor's cache, the
// caller sends the rest.
using PixelConversion = void (*)(const ncfUInt8* source, ncfUInt8* destination,
                                 std::size_t sourceSize, std::size_t destinationSize,
                                 ncfUInt32 width, ncfUInt32 height, LevelPass& levels);

// How a picture format is made: what to ask of the reader, what a pixel takes
// before and after, and what runs between.
struct QTPixelParams {
    ncfUInt32 fourCC = 0;
    Rational decodedBytesPerPixel;
    Rational outputBytesPerPixel;
    PixelConversion convert = nullptr;
};

// What the host sees of a picture format, and the recipe that it doesn't see.
// Field order, layout and orientation are the clip's when the format was made.
class QTImageFormat final : public MediaFormat {
public:
    ncfUInt32 pixelFormat = PF_UNDEFINED;
    ncfUInt32 chromaSubSampling = 0;
    ncfUInt32 componentFormat = kNotSet;
    ncfUInt32 componentRangeType = kNotSet;
    ncfUInt32 colorSpace = CS_UNDEFINED;
    ncfUInt32 fieldOrder = 0;
    ncfUInt32 frameLayout = 0;
    ncfUInt32 orientation = 0;
    QTPixelParams qt_params;
};

// The conversion takes no part: two formats that differ in nothing else are
// the same to host and reader.
inline bool operator==(const QTImageFormat& left, const QTImageFormat& right) {
    return left.pixelFormat == right.pixelFormat &&
           left.chromaSubSampling == right.chromaSubSampling &&
           left.componentFormat == right.componentFormat &&
           left.componentRangeType == right.componentRangeType &&
           left.colorSpace == right.colorSpace && left.fieldOrder == right.fieldOrder &&
           left.frameLayout == right.frameLayout && left.orientation == right.orientation &&
           left.qt_params.fourCC == right.qt_params.fourCC &&
           left.qt_params.decodedBytesPerPixel == right.qt_params.decodedBytesPerPixel &&
           left.qt_params.outputBytesPerPixel == right.qt_params.outputBytesPerPixel;
}
