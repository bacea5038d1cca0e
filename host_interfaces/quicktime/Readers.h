// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/framework/Unknown.h"

namespace QTWrapper {

// The one mode in which a video reader is started.
inline constexpr ncfUInt32 kUseDecompressionSession = 0;

// Decodes pictures of the movie's first video track. Frame i is the i-th
// presented picture in display order, edit list applied.
//
// One reader serves all mappings of a clip, one frame at a time: who wants a
// frame sets its format, asks for its size and reads it, and nobody else may set
// a format before that is done. ReadFrame is not told how much its destination
// holds.
struct IQTVideoReader : INCFUnknown {
    // 3. Code of the pixels that ReadFrame delivers. An unknown one is a
    // failure and the one before stays.
    virtual NCFRESULT SetOutputPixelFormat(ncfUInt32 fourCC, ncfUInt32, ncfUInt32) = 0;
    // 4. `sample` from zero. NMA_E_NODATA past the last picture. Writes
    // exactly GetFrameBufferSize bytes.
    virtual NCFRESULT ReadFrame(ncfUInt64 sample, void* destination, ncfUInt32, ncfUInt32,
                                ncfUInt32) = 0;
    // 5. Bytes of one picture in the format set; 0 without a format. The first
    // argument is 0xFFFFFFFF.
    virtual ncfUInt32 GetFrameBufferSize(ncfUInt32 all, ncfUInt64 sample, ncfUInt32) = 0;
    // 6. Again while started: NCF_OK.
    virtual NCFRESULT InitQT(ncfUInt32 mode) = 0;
    virtual NCFRESULT ReservedVideoReaderOperation() = 0;  // 7
    // 8. Gives decoder and kept pictures back; started again, the next ReadFrame
    // makes them anew, and until then answers NMA_E_NOTINITIALIZED. Again while
    // released: NCF_OK.
    virtual NCFRESULT ReleaseQT() = 0;

protected:
    ~IQTVideoReader() = default;
};

inline constexpr GUID IID_IQTVideoReader = ncfGuid("A5B2D8E1-36F7-4C90-8A14-E7C05F2D6B09");
constexpr const GUID& ncfIdOf(const IQTVideoReader*) {
    return IID_IQTVideoReader;
}

// Delivers interleaved sound of any audio track, at the rate of its beginning: sound
// that changes its rate or channels on the way is converted, nothing else is.
struct IQTAudioReader : INCFUnknown {
    virtual NCFRESULT ReservedAudioReaderOperation() = 0;  // 3
    // 4. Form of the sound of one track; the channel count is written back.
    virtual NCFRESULT SetParams(ncfUInt32 track, ncfUInt32 bytesPerSample, ncfUInt8 littleEndian,
                                double sampleRate, ncfUInt32& channels) = 0;
    // 5. `count` frames from `sample`; past the end zeros. Writes at most
    // `size` bytes. NMA_E_NOTINITIALIZED before SetParams.
    virtual NCFRESULT ReadSamples(ncfUInt32 track, ncfUInt64 sample, ncfUInt64* count,
                                  void* destination, ncfUInt64 size, ncfUInt8, ncfUInt8) = 0;

protected:
    ~IQTAudioReader() = default;
};

inline constexpr GUID IID_IQTAudioReader = ncfGuid("D92C4F73-81AE-4B05-9E6D-530BA8C1F70A");
constexpr const GUID& ncfIdOf(const IQTAudioReader*) {
    return IID_IQTAudioReader;
}

}  // namespace QTWrapper
