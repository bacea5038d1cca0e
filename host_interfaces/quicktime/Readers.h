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
// Implemented by the host, given out by IQuickTimeWrapper. The module takes one for
// a clip when a picture format is first chosen, and keeps it with the clip; what it
// delivers goes into memory of the caller. Each operation may come on any thread,
// but a frame takes three of them.
//
// One reader serves all mappings of a clip, one frame at a time: who wants a
// frame sets its format, asks for its size and reads it, and nobody else may set
// a format before that is done. ReadFrame is not told how much its destination
// holds.
struct IQTVideoReader : INCFUnknown {
    // 3. Code of the pixels that ReadFrame delivers, with the first character in the
    // most significant byte. An unknown one is a failure and the one before stays.
    virtual NCFRESULT SetOutputPixelFormat(ncfUInt32 fourCC, ncfUInt32 reservedA,
                                           ncfUInt32 reservedB) = 0;
    // 4. Frame `sample`, from zero. NMA_E_NODATA past the last picture. Writes
    // exactly GetFrameBufferSize bytes.
    virtual NCFRESULT ReadFrame(ncfUInt64 sample, void* destination, ncfUInt32 reservedA,
                                ncfUInt32 reservedB, ncfUInt32 reservedC) = 0;
    // 5. Bytes of one picture in the format set, the same for every frame; 0 without
    // a format. `all` is 0xFFFFFFFF.
    virtual ncfUInt32 GetFrameBufferSize(ncfUInt32 all, ncfUInt64 sample, ncfUInt32 reserved) = 0;
    // 6. Starts decoding; `mode` is kUseDecompressionSession. Again while started:
    // NCF_OK.
    virtual NCFRESULT InitQT(ncfUInt32 mode) = 0;
    virtual NCFRESULT ReservedVideoReaderOperation() { return NCF_E_NOTIMPL; }  // 7
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
//
// Implemented by the host, given out by IQuickTimeWrapper. The module takes one for
// a clip at the first query for its sound formats, and keeps it with the clip; what
// it delivers goes into memory of the caller. Each operation may come on any thread.
// Tracks have the movie's own ids.
struct IQTAudioReader : INCFUnknown {
    virtual NCFRESULT ReservedAudioReaderOperation() { return NCF_E_NOTIMPL; }  // 3
    // 4. How the sound of one track is to be delivered: integers of 1 to 4 bytes, in
    // little-endian order or not (0). The rate, in frames per second, is the track's
    // own; it changes nothing. `channels` comes back as the number that will be
    // interleaved.
    virtual NCFRESULT SetParams(ncfUInt32 track, ncfUInt32 bytesPerSample, ncfUInt8 littleEndian,
                                double sampleRate, ncfUInt32& channels) = 0;
    // 5. `count` frames of sound from frame `sample`, counted from zero; past the end
    // zeros. Writes at most `size` bytes. `count` comes back as the number of frames
    // up to the last that the track has; NMA_E_NODATA when there is none.
    // NMA_E_NOTINITIALIZED before SetParams.
    virtual NCFRESULT ReadSamples(ncfUInt32 track, ncfUInt64 sample, ncfUInt64* count,
                                  void* destination, ncfUInt64 size, ncfUInt8 reservedA,
                                  ncfUInt8 reservedB) = 0;

protected:
    ~IQTAudioReader() = default;
};

inline constexpr GUID IID_IQTAudioReader = ncfGuid("D92C4F73-81AE-4B05-9E6D-530BA8C1F70A");
constexpr const GUID& ncfIdOf(const IQTAudioReader*) {
    return IID_IQTAudioReader;
}

}  // namespace QTWrapper
