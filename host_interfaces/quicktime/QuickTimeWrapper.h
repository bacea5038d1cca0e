// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/framework/String.h"
#include "host_interfaces/quicktime/Readers.h"
#include "host_interfaces/quicktime/SampleTable.h"

namespace QTWrapper {

// How thoroughly MovieContainsAlpha looks.
inline constexpr ncfUInt32 kAlphaCheckForImport = 0;  // what the container says
inline constexpr ncfUInt32 kAlphaCheckForQTNMA = 1;   // the first decoded picture

// A movie opened through the multimedia library: everything that a clip needs when
// the header parser refuses its file, and the readers of every clip.
//
// Implemented by the host as a component. The module creates one for a clip when it
// first needs it, calls NewMovieFromFilePath once, and then asks as it likes, until
// the clip ends. One thread at a time: what asks one clip on several takes turns
// (SampleMapping.h). Until a movie is open every operation answers
// NMA_E_NOTINITIALIZED, 0 or false. Table and readers belong to the caller and
// outlive the wrapper.
//
// Tracks have the movie's own ids, never 0. Flags are 0 or not. Outputs that may be
// null are skipped then.
struct IQuickTimeWrapper : INCFUnknown {
    // 3. Whether the video reader knows a pixel format; NCF_E_NOTSUPPORTED if not.
    virtual NCFRESULT PreparePixelFormat(ncfUInt32 fourCC) = 0;
    virtual NCFRESULT GetSampleTable(IQTWSampleTable** table) = 0;    // 4
    virtual NCFRESULT GetQTAudioReader(IQTAudioReader** reader) = 0;  // 5. for all tracks
    virtual NCFRESULT GetQTVideoReader(IQTVideoReader** reader) = 0;  // 6. of track 14
    // 7. Whether a frame has two fields; `bits`: 1 top field first, 8 fields stored
    // apart. NMA_E_FIELDS when the movie does not say.
    virtual NCFRESULT QueryVideoDescBufferDetails(ncfUInt32* interlaced, ncfUInt32* bits) = 0;
    // 8. Which of the two matrices the picture names; neither is possible.
    virtual NCFRESULT GetCodecColorSpaceInfo(ncfBool* found709, ncfBool* found601) = 0;
    virtual ncfBool MovieHasOneFrame() = 0;                                     // 9
    virtual ncfUInt32 GetResolutionId(ncfUInt32 track) = 0;                     // 10. 0 = none
    virtual NCFRESULT GetCodecTypeName(ncfUInt32 track, INCFString* name) = 0;  // 11. assigned to
    // 12. Each flag tells whether the tracks of that kind disagree with the length,
    // which is in edit units of the rate `rateNum` / `rateDen`, a second.
    virtual NCFRESULT MovieTrackDurationIssues(ncfSInt32 rateNum, ncfSInt32 rateDen,
                                               ncfUInt64 length, ncfBool* sound,
                                               ncfBool* picture) = 0;
    virtual ncfBool MovieHasMultipleVideoTracks(ncfUInt32 reservedA,
                                                ncfUInt32 reservedB) = 0;  // 13
    // 14. The one whose pictures the video reader delivers: the first of the file,
    // or of the lowest number where no clip can be made of the movie's header.
    virtual ncfBool GetFirstVideoTrack(ncfUInt32* track) = 0;
    // 15. Fields in a frame, 1 or 2; 0 as the answer: unknown.
    virtual ncfBool GetFieldLayoutForTrack(ncfUInt32 track, ncfUInt32* fieldCount) = 0;
    // 16. Code of the sample description of any kind of track, four bytes in
    // text order.
    virtual NCFRESULT GetFourCCFromImageDescrptor(ncfUInt32 track, ncfUInt8* fourBytes) = 0;
    virtual ncfUInt32 GetImageDescriptionCount(ncfUInt32 track) = 0;  // 17
    // 18. `kind` is one of the two ways of looking above.
    virtual NCFRESULT MovieContainsAlpha(ncfUInt32 kind, ncfBool* alpha) = 0;
    // 19. Each output may be null. `sampleRate` is in frames per second. `formatID`
    // is a code of the sound system, 'lpcm' for every linear kind; `formatFlags` are
    // that system's. Bits are 0 for compressed sound.
    virtual NCFRESULT GetAudioInfoForTrack(ncfUInt32 track, ncfUInt32* channels, double* sampleRate,
                                           ncfUInt32* formatID, ncfUInt32* formatFlags,
                                           ncfUInt32* bytesPerPacket, ncfUInt32* framesPerPacket,
                                           ncfUInt32* bitsPerChannel, ncfUInt8* isBigEndian,
                                           ncfUInt8* isConstantBitRate) = 0;
    // 20. Stored size in pixels and ratio of the picture; the last two may be
    // null.
    virtual NCFRESULT GetMovieBox(ncfUInt32* width, ncfUInt32* height, ncfUInt32* aspectNum,
                                  ncfUInt32* aspectDen) = 0;
    virtual ncfUInt64 GetMovieCreationTime() = 0;  // 21. seconds from 1904 UTC
    // 22. How many numbers, from 1, operation 16 is asked for the content hash.
    virtual ncfUInt32 GetDescribedTrackCount() = 0;
    // 23. Only the low byte of the answer counts: not 0 when all media is in the
    // file.
    virtual ncfUInt32 MovieIsSelfContained(ncfUInt32 reservedA, ncfUInt32 reservedB,
                                           ncfUInt32 reservedC) = 0;
    // 24. As IQTParser::GetTimeCodeInfo, of one track.
    virtual NCFRESULT GetTimeCodeInfoForTrack(ncfUInt32 track, ncfUInt8* hours, ncfUInt8* minutes,
                                              ncfUInt8* seconds, ncfUInt8* frames,
                                              ncfUInt32* timeScale, ncfUInt32* frameDuration,
                                              ncfUInt32* drop, ncfUInt32* numFrames) = 0;
    virtual ncfBool IsVideoTrack(ncfUInt32 track) = 0;     // 25
    virtual ncfBool IsAudioTrack(ncfUInt32 track) = 0;     // 26
    virtual ncfBool IsTimeCodeTrack(ncfUInt32 track) = 0;  // 27
    virtual ncfUInt32 GetNumberOfTracks() = 0;             // 28. highest track number
    virtual ncfBool MovieHasAudio() = 0;                   // 29
    // 30. Opens a file. A failure leaves no movie open.
    virtual NCFRESULT NewMovieFromFilePath(INCFString* path) = 0;
    // 31. The movie's edit rate, `num` / `den` a second, and its length in edit
    // units. Rates that go in are in frames per second, 0 when not given; the forced
    // one wins. `singleFrameDuration` is the length of a movie of one frame, in edit
    // units. `trackLengths` has `trackLengthCount` entries: entry i is filled with
    // the length of track i + 1, in edit units. `useMovieHeader` (not 0) takes the
    // length from the header instead of from the tracks.
    virtual NCFRESULT DetermineMovieEditRateAndLength(double forcedRate, double editorRate,
                                                      ncfUInt32 singleFrameDuration, ncfSInt32* num,
                                                      ncfSInt32* den, ncfUInt64* length,
                                                      ncfUInt64* trackLengths,
                                                      ncfUInt32 trackLengthCount,
                                                      ncfBool useMovieHeader) = 0;
    // 32. A box in pixels. Any will do: pictures come at their stored size.
    virtual NCFRESULT QTWSetMovieBox(ncfSInt16 top, ncfSInt16 left, ncfSInt16 bottom,
                                     ncfSInt16 right) = 0;
    virtual NCFRESULT GetVendor(ncfUInt32 track, ncfUInt32* vendor) = 0;  // 33. 0: none
    virtual ncfUInt64 GetTrackDuration(ncfUInt32 track) = 0;              // 34. movie time units
    virtual ncfUInt32 GetMovieTimeScale() = 0;                            // 35. units per second

protected:
    ~IQuickTimeWrapper() = default;
};

inline constexpr GUID CompID_QuickTimeWrapper = ncfGuid("0B4C3D37-C23C-48D8-9A8F-BD71C3544465");
inline constexpr GUID IID_IQuickTimeWrapper = ncfGuid("024F29AE-2898-4EE8-80D8-D4D54DFAC861");
constexpr const GUID& ncfIdOf(const IQuickTimeWrapper*) {
    return IID_IQuickTimeWrapper;
}

}  // namespace QTWrapper
