// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/framework/String.h"
#include "source/plugin/BoundsBox.h"
#include "source/plugin/NCFSmartPtr.h"
#include "source/plugin/PixelEnums.h"

// Plain records in which a clip hands out what it knows.

// A picture property that the clip has not determined.
inline constexpr ncfUInt32 kPropertyNotSet = kNotSet;

// Which field of a frame comes first in time.
enum TemporalFieldOrder : ncfUInt32 {
    kProgressive = 256,
    kTopFieldFirst = 512,
    kBottomFieldFirst = 4096,
    kFieldOrderUndetermined = 8192,
};

// Whether both fields of a frame lie woven in one buffer or apart.
enum FrameBufferLayout : ncfUInt32 {
    kLayoutMerged = 256,
    kLayoutSplit = 512,
};

// Kind of a track of the movie.
enum TrackType : ncfUInt32 {
    kTrackVideo = 0,
    kTrackAudio = 1,
    kTrackTimecode = 2,
    kTrackOther = 3,
};

// The options that the user edits for one clip. The clip owns the record; the
// parameters and the sample mapping read and write it in place.
struct ClipParams {
    ncfUInt32 fieldOrderInFile = kFieldOrderUndetermined;    // a field order overrides the file's
    ncfUInt32 levelRemap = 16;                               // 1 expand, 2 compress, 16 default
    ncfUInt32 fieldLayout = 1;                               // 2 merged, 3 split; else the file's
    ncfUInt32 detectedFieldOrder = kFieldOrderUndetermined;  // what the file says
};

// What the editor's project says while one clip is described.
struct EditorSettings {
    enum MovieDurationCalculation : ncfUInt32 {
        kUseTracks = 0,
        kUseMovieHeader = 1,
    };

    ncfUInt32 _areSettingsValid = 0;  // 1 when the host gave all it was asked for
    double _editorFrameRate = 0.0;
    ncfUInt32 _reservedSettingA = 0;
    ncfUInt32 _reservedSettingB = 0;
    ncfUInt32 _forcedFrameRateEnabled = 0;
    double _forcedFrameRate = 0.0;
    ncfUInt32 _singleFrameDuration = 60;
    ncfUInt32 _movieDurationCalculationToUse = kUseTracks;
};

struct AudioTrackMetadata {
    ncfUInt32 channelsPerFrame = 0;
    double sampleRate = 0.0;
    ncfUInt32 formatID = 0;  // kFormatLPCM, or 0
    ncfUInt32 bytesPerPacket = 0;
    ncfUInt32 bitsPerChannel = 0;
    ncfUInt8 isBigEndian = 0;
    ncfUInt8 isConstantBitRate = 0;
};

// 'lpcm', the first character in the top byte.
inline constexpr ncfUInt32 kFormatLPCM = 0x6C70636Du;

// First address of a timecode track and how it counts.
struct TimeCodeTrackMetadata {
    ncfUInt8 hours = 0;
    ncfUInt8 minutes = 0;
    ncfUInt8 seconds = 0;
    ncfUInt8 frames = 0;
    ncfUInt32 timeScale = 0;
    ncfUInt32 frameDuration = 0;
    ncfUInt32 drop = 0;
    ncfUInt32 numFrames = 0;
};
static_assert(sizeof(TimeCodeTrackMetadata) == 20, "cleared and filled as twenty bytes");

// Colour of the picture. The three codes are those of a movie's colour atom,
// where 2 is unspecified.
struct ColorDetails {
    // The descriptor is to carry the two levels and the transfer
    // characteristic of this record.
    bool hasVendorMetadata = false;
    ncfUInt32 colorPrimaries = 2;
    ncfUInt32 transferFunction = 2;
    ncfUInt32 matrix = 2;
    ncfSInt32 refBlack = -1;  // -1: not given
    ncfSInt32 refWhite = -1;
    NCFSmartPtr<INCFString> name;
    NCFSmartPtr<INCFString> transferCharacteristicName;
    GUID transferCharacteristicUID{};
};

struct GeometryDetails {
    BoundsBox framing;
    BoundsBox valid;
    BoundsBox essence;
    BoundsBox source;
};
