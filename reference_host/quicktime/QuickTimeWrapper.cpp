// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/quicktime/QuickTimeWrapper.h"

#include "reference_host/framework/HostPath.h"
#include "reference_host/quicktime/CodecNames.h"
#include "reference_host/quicktime/SoundForm.h"

namespace host {
namespace {

// Fills an output that may be null.
template <class Out, class Value>
void Give(Out* out, Value value) {
    if (out) {
        *out = static_cast<Out>(value);
    }
}

}  // namespace

NCFRESULT QuickTimeWrapper::NewMovieFromFilePath(INCFString* path) {
    movie_.reset();
    std::filesystem::path file;
    const NCFRESULT read = PathFrom(path, file);
    if (read < 0) {
        return read;
    }
    std::string reason;
    movie_ = MovieFile::Open(file, reason);
    return movie_ ? NCF_OK : NCF_E_FAIL;
}

NCFRESULT QuickTimeWrapper::GetAudioInfoForTrack(ncfUInt32 track, ncfUInt32* channels,
                                                 double* sampleRate, ncfUInt32* formatID,
                                                 ncfUInt32* formatFlags, ncfUInt32* bytesPerPacket,
                                                 ncfUInt32* framesPerPacket,
                                                 ncfUInt32* bitsPerChannel, ncfUInt8* isBigEndian,
                                                 ncfUInt8* isConstantBitRate) {
    if (!movie_) {
        return NMA_E_NOTINITIALIZED;
    }
    const AVStream* const stream = movie_->FindTrack(track);
    if (!stream) {
        return NCF_E_NOTFOUND;
    }
    SoundForm form;
    if (!ReadSoundForm(*stream, form)) {
        return NCF_E_FAIL;
    }
    Give(channels, form.channels);
    Give(sampleRate, form.sampleRate);
    Give(formatID, form.formatId);
    Give(formatFlags, form.formatFlags);
    Give(bytesPerPacket, form.bytesPerPacket);
    Give(framesPerPacket, form.framesPerPacket);
    Give(bitsPerChannel, form.bitsPerChannel);
    Give(isBigEndian, form.isBigEndian);
    Give(isConstantBitRate, form.isConstantBitRate);
    return NCF_OK;
}

ncfUInt64 QuickTimeWrapper::GetMovieCreationTime() {
    return movie_ ? movie_->CreationTime() : 0;
}

ncfBool QuickTimeWrapper::IsVideoTrack(ncfUInt32 track) {
    return movie_ && movie_->IsVideo(track);
}
ncfBool QuickTimeWrapper::IsAudioTrack(ncfUInt32 track) {
    return movie_ && movie_->IsAudio(track);
}
ncfBool QuickTimeWrapper::IsTimeCodeTrack(ncfUInt32 track) {
    return movie_ && movie_->IsTimecode(track);
}
ncfUInt32 QuickTimeWrapper::GetNumberOfTracks() {
    return movie_ ? movie_->HighestTrack() : 0;
}
ncfUInt32 QuickTimeWrapper::GetDescribedTrackCount() {
    return movie_ ? movie_->TrackCount() : 0;
}

ncfBool QuickTimeWrapper::MovieHasAudio() {
    const ncfUInt64 highest = GetNumberOfTracks();
    for (ncfUInt64 track = 1; track <= highest; ++track) {
        if (IsAudioTrack(static_cast<ncfUInt32>(track))) {
            return 1;
        }
    }
    return 0;
}

// --- what comes with frames, sound and other containers ------------------------

NCFRESULT QuickTimeWrapper::PreparePixelFormat(ncfUInt32) {
    return lacking();
}
NCFRESULT QuickTimeWrapper::GetSampleTable(QTWrapper::IQTWSampleTable** table) {
    Give(table, nullptr);
    return lacking();
}
NCFRESULT QuickTimeWrapper::GetQTAudioReader(QTWrapper::IQTAudioReader** reader) {
    Give(reader, nullptr);
    return lacking();
}
NCFRESULT QuickTimeWrapper::GetQTVideoReader(QTWrapper::IQTVideoReader** reader) {
    Give(reader, nullptr);
    return lacking();
}
NCFRESULT QuickTimeWrapper::QueryVideoDescBufferDetails(ncfUInt32*, ncfUInt32*) {
    return lacking();
}
NCFRESULT QuickTimeWrapper::GetCodecColorSpaceInfo(ncfBool*, ncfBool*) {
    return lacking();
}
ncfBool QuickTimeWrapper::MovieHasOneFrame() {
    return 0;
}
ncfUInt32 QuickTimeWrapper::GetResolutionId(ncfUInt32) {
    return 0;
}
NCFRESULT QuickTimeWrapper::GetCodecTypeName(ncfUInt32, INCFString*) {
    return lacking();
}
NCFRESULT QuickTimeWrapper::MovieTrackDurationIssues(ncfSInt32, ncfSInt32, ncfUInt64, ncfBool*,
                                                     ncfBool*) {
    return lacking();
}
ncfBool QuickTimeWrapper::MovieHasMultipleVideoTracks(ncfUInt32, ncfUInt32) {
    return 0;
}
ncfBool QuickTimeWrapper::GetFirstVideoTrack(ncfUInt32*) {
    return 0;
}
ncfBool QuickTimeWrapper::GetFieldLayoutForTrack(ncfUInt32, ncfUInt32*) {
    return 0;
}
NCFRESULT QuickTimeWrapper::GetFourCCFromImageDescrptor(ncfUInt32, ncfUInt8*) {
    return lacking();
}
ncfUInt32 QuickTimeWrapper::GetImageDescriptionCount(ncfUInt32) {
    return 0;
}
NCFRESULT QuickTimeWrapper::MovieContainsAlpha(ncfUInt32, ncfBool*) {
    return lacking();
}
NCFRESULT QuickTimeWrapper::GetMovieBox(ncfUInt32*, ncfUInt32*, ncfUInt32*, ncfUInt32*) {
    return lacking();
}
ncfUInt32 QuickTimeWrapper::MovieIsSelfContained(ncfUInt32, ncfUInt32, ncfUInt32) {
    return 0;
}
NCFRESULT QuickTimeWrapper::GetTimeCodeInfoForTrack(ncfUInt32, ncfUInt8*, ncfUInt8*, ncfUInt8*,
                                                    ncfUInt8*, ncfUInt32*, ncfUInt32*, ncfUInt32*,
                                                    ncfUInt32*) {
    return lacking();
}
NCFRESULT QuickTimeWrapper::DetermineMovieEditRateAndLength(double, double, ncfUInt32, ncfSInt32*,
                                                            ncfSInt32*, ncfUInt64*, ncfUInt64*,
                                                            ncfUInt32, ncfBool) {
    return lacking();
}
NCFRESULT QuickTimeWrapper::QTWSetMovieBox(ncfSInt16, ncfSInt16, ncfSInt16, ncfSInt16) {
    return lacking();
}
NCFRESULT QuickTimeWrapper::GetVendor(ncfUInt32, ncfUInt32*) {
    return lacking();
}
ncfUInt64 QuickTimeWrapper::GetTrackDuration(ncfUInt32) {
    return 0;
}
ncfUInt32 QuickTimeWrapper::GetMovieTimeScale() {
    return 0;
}

}  // namespace host
