// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <filesystem>
#include <map>
#include <memory>
#include <optional>
#include <string>
#include <vector>

#include "host_interfaces/framework/Types.h"
#include "reference_host/quicktime/AvOwners.h"
#include "reference_host/quicktime/MovieAtoms.h"
#include "reference_host/quicktime/SoundForm.h"

namespace host {

// A movie opened through the multimedia library. Tracks have the movie's own
// ids where it numbers them well, else 1 to n in the order of the streams.
class MovieFile {
public:
    // Null with a sentence in `reason` that says what was wrong.
    static std::unique_ptr<MovieFile> Open(const std::filesystem::path& path, std::string& reason);

    const std::filesystem::path& Path() const { return path_; }
    const AVFormatContext& Input() const { return *input_; }
    const MovieAtoms& Atoms() const { return atoms_; }
    // Whether the container's index names every sample.
    bool IndexIsWhole() const;

    // What the file's own atoms say of a track; null when they do not.
    const MovieAtoms::Track* FindAtoms(ncfUInt32 track) const;

    // The stream of a track, by its number or by the id that the file gives it;
    // null for a track that there is not.
    const AVStream* FindTrack(ncfUInt32 track) const;
    int StreamOf(ncfUInt32 track) const;  // -1 for none
    ncfUInt32 HighestTrack() const;
    ncfUInt32 TrackCount() const { return static_cast<ncfUInt32>(numbers_.size()); }
    const std::vector<ncfUInt32>& Numbers() const { return numbers_; }  // in stream order

    bool IsVideo(ncfUInt32 track) const;  // pictures attached to sound are none
    bool IsAudio(ncfUInt32 track) const;
    bool IsTimecode(ncfUInt32 track) const;
    // The picture track that is described and delivered, 0 for none: of a movie
    // whose header a clip is made of, the first that its parser names; who has
    // nothing but the wrapper walks the numbers from the lowest.
    ncfUInt32 FirstVideo() const { return firstVideo_; }
    ncfUInt32 FirstAudio() const;                     // of the lowest number
    std::map<ncfUInt32, int> StreamsByTrack() const;  // ids included

    // What the headers left open is read from the media before this answers.
    const AVStream* FindDetailedTrack(ncfUInt32 track);
    // Field order as the container tells it, before that.
    AVFieldOrder ContainerFieldOrder(ncfUInt32 track) const;
    // Stored size of a track's pictures and their pixels' aspect, always the
    // same: movies tell it, of other files the codec does. 0 for unknown.
    struct Raster {
        int width = 0;
        int height = 0;
        AVRational pixelAspect{0, 1};
    };
    Raster RasterOf(ncfUInt32 track);
    // The form in which a track's sound is delivered; null when it is no sound.
    const SoundForm* SoundFormOf(ncfUInt32 track);
    // Pictures a second of the first picture track, 0.0 when nothing tells.
    double PictureRate();

    // Pictures that the first picture track presents, at most `enough`.
    ncfUInt64 CountPictures(ncfUInt64 enough);
    // Seconds of a track, or of the movie for 0.
    double Seconds(ncfUInt32 track);

    // Seconds from 1904-01-01 UTC, 0 when the movie does not say.
    ncfUInt64 CreationTime() const;

private:
    MovieFile(std::filesystem::path path, InputOwner input);
    bool HasTooManyChannels();
    void NumberTracks();
    ncfUInt32 ChooseFirstVideo() const;
    ncfUInt32 IdOf(unsigned stream) const;  // 0 for none
    bool NeedsPacketTimes() const;
    bool MayHoldFieldsApart(int stream) const;
    std::optional<double> RateOfTable(int stream) const;
    bool HoldsSamples(int stream) const;
    double MeanRateOfMedia(int stream) const;
    double MeanRateOfPackets(int stream);
    double SecondsOfPackets(int stream);
    std::vector<ncfUInt32> TracksWhere(bool (MovieFile::*test)(ncfUInt32) const) const;

    std::filesystem::path path_;
    InputOwner input_;
    MovieAtoms atoms_;
    std::vector<ncfUInt32> numbers_;  // of the stream at the same place
    ncfUInt32 firstVideo_ = 0;
    struct Told {
        AVFieldOrder fieldOrder;
        AVRational rate;
        Raster raster;
    };
    std::vector<Told> told_;  // of each stream, by the container
    bool hasDetails_ = false;
    ncfUInt64 counted_ = 0;  // pictures found so far
    bool countedAll_ = false;
    std::map<int, double> secondsOfPackets_;
    std::optional<std::map<int, SoundForm>> soundForms_;  // by stream
};

}  // namespace host
