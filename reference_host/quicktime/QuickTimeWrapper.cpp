// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/quicktime/QuickTimeWrapper.h"

#include <algorithm>

#include "reference_host/framework/Guard.h"
#include "reference_host/framework/HostPath.h"
#include "reference_host/quicktime/AudioReader.h"
#include "reference_host/quicktime/MovieSampleTable.h"
#include "reference_host/quicktime/VideoReader.h"

namespace host {

MovieFile& QuickTimeWrapper::Movie() const {
    Need(movie_, NMA_E_NOTINITIALIZED);
    return *movie_;
}

const AVStream& QuickTimeWrapper::Track(ncfUInt32 track) const {
    const AVStream* const stream = Movie().FindTrack(track);
    Need(stream, NCF_E_NOTFOUND);
    return *stream;
}

NCFRESULT QuickTimeWrapper::NewMovieFromFilePath(INCFString* path) {
    movie_.reset();
    return Guarded([&] {
        std::filesystem::path file;
        Check(PathFrom(path, file));
        std::string reason;
        movie_ = MovieFile::Open(file, reason);
        return movie_ ? NCF_OK : NCF_E_FAIL;
    });
}

NCFRESULT QuickTimeWrapper::PreparePixelFormat(ncfUInt32 fourCC) {
    if (!movie_) {
        return NMA_E_NOTINITIALIZED;
    }
    return IsKnownLayout(fourCC) ? NCF_OK : NCF_E_NOTSUPPORTED;
}

NCFRESULT QuickTimeWrapper::GetSampleTable(QTWrapper::IQTWSampleTable** table) {
    return Guarded([&] {
        Need(table);
        *table = nullptr;
        Need(movie_, NMA_E_NOTINITIALIZED);
        MovieSampleTable::Source source;
        source.path = movie_->Path();
        source.streams = movie_->StreamsByTrack();
        source.indexIsWhole = movie_->IndexIsWhole();
        for (const auto& [track, stream] : source.streams) {
            if (const MovieAtoms::Track* const atoms = movie_->FindAtoms(track)) {
                source.descriptionChanges[stream] = atoms->descriptionChanges;
            }
        }
        *table = MakeRef<MovieSampleTable>(std::move(source)).Detach();
        return NCF_OK;
    });
}

NCFRESULT QuickTimeWrapper::GetQTAudioReader(QTWrapper::IQTAudioReader** reader) {
    return Guarded([&] {
        Need(reader);
        *reader = nullptr;
        Need(movie_, NMA_E_NOTINITIALIZED);
        std::map<ncfUInt32, EditedSound::Source> streams;
        for (const auto& [track, stream] : movie_->StreamsByTrack()) {
            if (movie_->IsAudio(track)) {
                EditedSound::Source& source = streams[track];
                source.stream = stream;
                source.timeScale = movie_->Atoms().timeScale;
                source.mediaUnit = movie_->FindTrack(track)->time_base;
                const SoundForm* const form = movie_->SoundFormOf(track);
                source.form = form ? *form : SoundForm();
                if (const MovieAtoms::Track* const atoms = movie_->FindAtoms(track)) {
                    source.edits = atoms->edits;
                }
            }
        }
        Need(!streams.empty(), NMA_E_NODATA);
        *reader = MakeRef<AudioReader>(movie_->Path(), std::move(streams), movie_->IndexIsWhole())
                      .Detach();
        return NCF_OK;
    });
}

NCFRESULT QuickTimeWrapper::GetQTVideoReader(QTWrapper::IQTVideoReader** reader) {
    return Guarded([&] {
        Need(reader);
        *reader = nullptr;
        Need(movie_, NMA_E_NOTINITIALIZED);
        const ncfUInt32 track = movie_->FirstVideo();
        Need(track != 0, NMA_E_NODATA);
        VideoReader::Source source;
        source.path = movie_->Path();
        source.stream = movie_->StreamOf(track);
        source.indexIsWhole = movie_->IndexIsWhole();
        const MovieFile::Raster raster = movie_->RasterOf(track);
        source.width = static_cast<ncfUInt32>(std::max(raster.width, 0));
        source.height = static_cast<ncfUInt32>(std::max(raster.height, 0));
        *reader = MakeRef<VideoReader>(std::move(source)).Detach();
        return NCF_OK;
    });
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
    return movie_ && movie_->FirstAudio() != 0;
}

ncfBool QuickTimeWrapper::GetFirstVideoTrack(ncfUInt32* track) {
    if (!movie_ || !track || movie_->FirstVideo() == 0) {
        return 0;
    }
    *track = movie_->FirstVideo();
    return 1;
}

ncfBool QuickTimeWrapper::MovieHasMultipleVideoTracks(ncfUInt32, ncfUInt32) {
    return movie_ && std::count_if(movie_->Numbers().begin(), movie_->Numbers().end(),
                                   [this](ncfUInt32 track) { return movie_->IsVideo(track); }) > 1;
}

ncfUInt32 QuickTimeWrapper::MovieIsSelfContained(ncfUInt32, ncfUInt32, ncfUInt32) {
    return movie_ && std::none_of(movie_->Atoms().tracks.begin(), movie_->Atoms().tracks.end(),
                                  [](const auto& track) { return track.needsOtherFiles; });
}

}  // namespace host
