// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <memory>

#include "host_interfaces/quicktime/QuickTimeWrapper.h"
#include "reference_host/framework/Component.h"
#include "reference_host/quicktime/MovieFile.h"

namespace host {

// The movie wrapper over the multimedia library. Readers and sample table open
// the file for themselves, so they live on when the wrapper has gone. What is
// told of pictures stands in QuickTimeWrapperPicture.cpp, of single tracks in
// QuickTimeWrapperTracks.cpp, of rates and lengths in QuickTimeWrapperLengths.cpp.
class QuickTimeWrapper final : public Component<QTWrapper::IQuickTimeWrapper> {
public:
    NCFRESULT PreparePixelFormat(ncfUInt32 fourCC) override;
    NCFRESULT GetSampleTable(QTWrapper::IQTWSampleTable** table) override;
    NCFRESULT GetQTAudioReader(QTWrapper::IQTAudioReader** reader) override;
    NCFRESULT GetQTVideoReader(QTWrapper::IQTVideoReader** reader) override;
    NCFRESULT QueryVideoDescBufferDetails(ncfUInt32* interlaced, ncfUInt32* bits) override;
    NCFRESULT GetCodecColorSpaceInfo(ncfBool* found709, ncfBool* found601) override;
    ncfBool MovieHasOneFrame() override;
    ncfUInt32 GetResolutionId(ncfUInt32 track) override;
    NCFRESULT GetCodecTypeName(ncfUInt32 track, INCFString* name) override;
    NCFRESULT MovieTrackDurationIssues(ncfSInt32 rateNum, ncfSInt32 rateDen, ncfUInt64 length,
                                       ncfBool* sound, ncfBool* picture) override;
    ncfBool MovieHasMultipleVideoTracks(ncfUInt32, ncfUInt32) override;
    ncfBool GetFirstVideoTrack(ncfUInt32* track) override;
    ncfBool GetFieldLayoutForTrack(ncfUInt32 track, ncfUInt32* fieldCount) override;
    NCFRESULT GetFourCCFromImageDescrptor(ncfUInt32 track, ncfUInt8* fourBytes) override;
    ncfUInt32 GetImageDescriptionCount(ncfUInt32 track) override;
    NCFRESULT MovieContainsAlpha(ncfUInt32 kind, ncfBool* alpha) override;
    NCFRESULT GetAudioInfoForTrack(ncfUInt32 track, ncfUInt32* channels, double* sampleRate,
                                   ncfUInt32* formatID, ncfUInt32* formatFlags,
                                   ncfUInt32* bytesPerPacket, ncfUInt32* framesPerPacket,
                                   ncfUInt32* bitsPerChannel, ncfUInt8* isBigEndian,
                                   ncfUInt8* isConstantBitRate) override;
    NCFRESULT GetMovieBox(ncfUInt32* width, ncfUInt32* height, ncfUInt32* aspectNum,
                          ncfUInt32* aspectDen) override;
    ncfUInt64 GetMovieCreationTime() override;
    ncfUInt32 GetDescribedTrackCount() override;
    ncfUInt32 MovieIsSelfContained(ncfUInt32, ncfUInt32, ncfUInt32) override;
    NCFRESULT GetTimeCodeInfoForTrack(ncfUInt32 track, ncfUInt8* hours, ncfUInt8* minutes,
                                      ncfUInt8* seconds, ncfUInt8* frames, ncfUInt32* timeScale,
                                      ncfUInt32* frameDuration, ncfUInt32* drop,
                                      ncfUInt32* numFrames) override;
    ncfBool IsVideoTrack(ncfUInt32 track) override;
    ncfBool IsAudioTrack(ncfUInt32 track) override;
    ncfBool IsTimeCodeTrack(ncfUInt32 track) override;
    ncfUInt32 GetNumberOfTracks() override;
    ncfBool MovieHasAudio() override;
    NCFRESULT NewMovieFromFilePath(INCFString* path) override;
    NCFRESULT DetermineMovieEditRateAndLength(double forcedRate, double editorRate,
                                              ncfUInt32 singleFrameDuration, ncfSInt32* num,
                                              ncfSInt32* den, ncfUInt64* length,
                                              ncfUInt64* trackLengths, ncfUInt32 trackLengthCount,
                                              ncfBool useMovieHeader) override;
    NCFRESULT QTWSetMovieBox(ncfSInt16 top, ncfSInt16 left, ncfSInt16 bottom,
                             ncfSInt16 right) override;
    NCFRESULT GetVendor(ncfUInt32 track, ncfUInt32* vendor) override;
    ncfUInt64 GetTrackDuration(ncfUInt32 track) override;
    ncfUInt32 GetMovieTimeScale() override;

private:
    // Within a guarded body: ends it without a movie, without such a track.
    MovieFile& Movie() const;
    const AVStream& Track(ncfUInt32 track) const;
    NCFRESULT EditRateAndLength(double forcedRate, double editorRate, ncfUInt32 singleFrameDuration,
                                bool useMovieHeader, double& rate, ncfUInt64& length);
    const AVStream& DetailedFirstVideo() const;

    std::unique_ptr<MovieFile> movie_;  // null until a movie is open
};

}  // namespace host
