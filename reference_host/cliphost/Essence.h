// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <filesystem>
#include <optional>
#include <string>
#include <vector>

#include "host_interfaces/media/MediaContainer.h"
#include "host_interfaces/media/SampleMapping.h"
#include "reference_host/cliphost/ClipTracks.h"
#include "reference_host/cliphost/HeaderTracks.h"
#include "reference_host/cliphost/ImageFormats.h"
#include "reference_host/cliphost/MissingMedia.h"
#include "reference_host/cliphost/ParameterOptions.h"
#include "reference_host/cliphost/Problem.h"
#include "reference_host/cliphost/Session.h"
#include "reference_host/cliphost/SoundAlone.h"

namespace cliphost {

// A movie opened for its samples: described first, as every host does, then
// given its parameters, then mapped. A movie that can be mapped but not
// described, such as one whose end was cut off, has the tracks that the module
// delivers; their rates are not known then. Owns the mapping; the session must
// outlive it.
class Essence {
public:
    // Throws a Failure.
    Essence(Session& session, std::filesystem::path movie, const ParameterOptions& parameters = {});

    Session& session() const { return session_; }
    const std::filesystem::path& movie() const { return movie_; }
    const std::vector<ClipTrack>& tracks() const { return tracks_; }
    // Why there is no description; nothing when there is one.
    const Problem& undescribed() const { return undescribed_; }

    NMA::ISampleMapping& map() const { return *map_; }
    NMA::ISampleProvider& provider() const { return *provider_; }
    // Made when first asked for: these open the codec and the readers. Throw a
    // Failure.
    NMA::IUncompressedImageProvider& pictures();
    std::vector<ImageFormat> PictureFormats(const ClipTrack& track);
    NMA::IUncompressedAudioProvider& sounds();

    // The track of a number, or the first of a kind for none. Throws a Failure
    // for the caller when there is none, or none of that kind.
    const ClipTrack& Track(std::optional<ncfUInt32> number, TrackKind kind) const;
    const ClipTrack* First(TrackKind kind) const;

    // Which one of the file's tracks of its kind it is.
    WhichTrack Which(const ClipTrack& track) const;

    // All tracks by number and kind, for people.
    std::string TrackList() const;

    // Why nothing of a track can be delivered; nothing when it can.
    Problem Obstacle(const ClipTrack& track);
    // Throws a Failure with the obstacle, also where the track lies in another file.
    void NeedDelivery(const ClipTrack& track);

    // Throws a Failure for a step that the module refused.
    [[noreturn]] void Fail(const std::string& what, NCFRESULT result) const;
    // The same for one with a track, where it was.
    void Check(NCFRESULT result, const ClipTrack& track, const std::string& what) const;

    // The same where the samples themselves may be the cause: it is told instead.
    [[noreturn]] void FailSamples(const ClipTrack& track, const std::string& what, NCFRESULT result,
                                  std::uint64_t sample = 0) const;
    void CheckSamples(NCFRESULT result, const ClipTrack& track, const std::string& what) const;
    // Why a sample of a track could not be read; what is said where nothing but the
    // decoder could tell.
    Problem WhyUnread(const ClipTrack& track, std::uint64_t sample, NCFRESULT result) const;

    // The part of a sound track that the file is too short for, by the samples a
    // second that are delivered.
    MissingSound MissingPart(const ClipTrack& track, unsigned rate) const {
        return {movie_, Which(track).place, rate};
    }
    // What is known of the sound of a movie without description.
    SoundAlone SoundOf(const ClipTrack& track) const;
    // Whether the file is too short for some of its pictures.
    bool LacksPictures() const;

private:
    void Map(NMA::IMediaContainer3& container);
    std::vector<ClipTrack> FindTracks();

    Session& session_;
    std::filesystem::path movie_;
    std::vector<ClipTrack> tracks_;
    Problem undescribed_;
    host::Ref<NMA::ISampleMapping> map_;
    host::Ref<NMA::ISampleProvider> provider_;
    host::Ref<NMA::IUncompressedImageProvider> pictures_;
    host::Ref<NMA::IUncompressedAudioProvider> sounds_;
};

// The same for a verb: what keeps a movie from being described goes to standard
// error.
Essence OpenEssence(Session& session, const std::filesystem::path& movie,
                    const ParameterOptions& parameters = {});

}  // namespace cliphost
