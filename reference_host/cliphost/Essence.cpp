// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/Essence.h"

#include <fmt/format.h>

#include "reference_host/cliphost/Describe.h"
#include "reference_host/cliphost/Failure.h"
#include "reference_host/cliphost/Notice.h"
#include "reference_host/cliphost/RouteTaken.h"
#include "reference_host/cliphost/SampleDiagnosis.h"
#include "reference_host/framework/HostPath.h"

namespace cliphost {

Essence::Essence(Session& session, std::filesystem::path movie, const ParameterOptions& parameters)
    : session_(session), movie_(std::move(movie)) {
    host::Ref<NMA::IMediaContainer3> container;
    const NCFRESULT opened = OpenContainer(session_, movie_, container);
    if (opened < 0) {
        throw Failure(ProblemWith(session_, movie_, opened));
    }
    const Description description = DescribeContainer(session_, container.get(), movie_);
    undescribed_ = description.problem;
    // Before there is a mapping: it then makes no format of the former fields.
    parameters.ApplyTo(session_, movie_, *container);
    Map(*container);
    tracks_ = description.file ? ReadClipTracks(description.file.get()) : FindTracks();
}

// When the description failed as well, its reason is the better one.
void Essence::Map(NMA::IMediaContainer3& container) {
    const NCFRESULT mapped = container.GetSampleMapping(map_.Out());
    const NCFRESULT provided = mapped < 0 ? mapped : host::Query(map_.get(), provider_);
    if (provided < 0) {
        throw Failure(undescribed_ ? undescribed_ : ProblemWith(session_, movie_, provided));
    }
}

// Without a description, a track's kind is found by asking which of the two
// providers accepts its number.
std::vector<ClipTrack> Essence::FindTracks() {
    std::vector<ClipTrack> tracks;
    host::Query(map_.get(), pictures_);
    host::Query(map_.get(), sounds_);
    for (;;) {
        ClipTrack track;
        track.number = static_cast<ncfUInt32>(tracks.size());
        ncfUInt32 count = 0;
        std::vector<ImageFormat> formats;
        if (pictures_ && ReadImageFormats(*pictures_, track.number, formats) >= 0) {
            const bool isAlpha = !formats.empty() && formats[0].pixels == format::kMono;
            track.kind = isAlpha ? TrackKind::Alpha : TrackKind::Picture;
        } else if (sounds_ && sounds_->GetNumberOfAudioFormats(track.number, &count) >= 0) {
            track.kind = TrackKind::Sound;
            map_->GetNumberOfChannels(track.number, &track.channels);
        } else {
            break;
        }
        ncfUInt64 samples = 0;
        map_->GetNumberOfSamples(track.number, &samples);
        track.length = samples;
        tracks.push_back(track);
    }
    session_.TakeNotices();
    if (tracks.empty()) {
        throw Failure(undescribed_);
    }
    return tracks;
}

NMA::IUncompressedImageProvider& Essence::pictures() {
    if (!pictures_) {
        const NCFRESULT result = host::Query(map_.get(), pictures_);
        if (result < 0) {
            Fail("no picture formats", result);
        }
    }
    return *pictures_;
}

NMA::IUncompressedAudioProvider& Essence::sounds() {
    if (!sounds_) {
        const NCFRESULT result = host::Query(map_.get(), sounds_);
        if (result < 0) {
            Fail("no sound reader", result);
        }
    }
    return *sounds_;
}

std::vector<ImageFormat> Essence::PictureFormats(const ClipTrack& track) {
    std::vector<ImageFormat> formats;
    Check(ReadImageFormats(pictures(), track.number, formats), track, "no picture formats");
    return formats;
}

const ClipTrack* Essence::First(TrackKind kind) const {
    for (const ClipTrack& track : tracks_) {
        if (track.kind == kind) {
            return &track;
        }
    }
    return nullptr;
}

const ClipTrack& Essence::Track(std::optional<ncfUInt32> number, TrackKind kind) const {
    const bool wantsSound = kind == TrackKind::Sound;
    if (!number) {
        if (const ClipTrack* const track = First(kind)) {
            return *track;
        }
        throw Failure(kExitFile, movie_, fmt::format("it has no {} track", NameOf(kind)),
                      TrackList());
    }
    if (*number >= tracks_.size()) {
        throw Failure(kExitCaller, movie_, fmt::format("there is no track {}", *number),
                      TrackList());
    }
    const ClipTrack& track = tracks_[*number];
    if (wantsSound != (track.kind == TrackKind::Sound)) {
        throw Failure(kExitCaller, movie_,
                      fmt::format("track {} is no {} track", *number, NameOf(kind)), TrackList());
    }
    return track;
}

std::string Essence::TrackList() const {
    std::string list;
    for (const ClipTrack& track : tracks_) {
        list +=
            fmt::format("{}{} ({})", list.empty() ? "" : ", ", track.number, NameOf(track.kind));
    }
    return tracks_.empty()       ? "it has no tracks"
           : tracks_.size() == 1 ? "its one track is " + list
                                 : "its tracks are " + list;
}

// The module counts every picture track of a movie but describes only the first to
// the host. So with a second picture track the two sides number sound tracks
// differently, and a request for sound would reach a picture.
Problem Essence::Obstacle(const ClipTrack& track) {
    ncfUInt32 count = 0;
    if (track.kind != TrackKind::Sound) {
        return {};
    }
    const NCFRESULT result = sounds().GetNumberOfAudioFormats(track.number, &count);
    if (result == NCF_E_INVALIDARG) {
        return {movie_,
                fmt::format("track {}: the movie has more than one picture track, and the module "
                            "counts all of them before the sound, so this sound can't be "
                            "delivered",
                            track.number),
                kTakeSoundOut, result};
    }
    if (result < 0) {
        return {movie_, fmt::format("track {}: no sound formats", track.number), {}, result};
    }
    return {};
}

void Essence::NeedDelivery(const ClipTrack& track) {
    if (const Problem obstacle = Obstacle(track)) {
        throw Failure(kExitFile, obstacle);
    }
    // The library would read what lies at the same place of this file.
    if (!WhatLiesElsewhere(movie_, Which(track)).empty()) {
        FailSamples(track, {}, NCF_E_FAIL);
    }
}

void Essence::Fail(const std::string& what, NCFRESULT result) const {
    throw Failure(kExitFile, Problem{movie_, what, {}, result});
}

void Essence::Check(NCFRESULT result, const ClipTrack& track, const std::string& what) const {
    if (result < 0) {
        Fail(fmt::format("track {}: {}", track.number, what), result);
    }
}

void Essence::CheckSamples(NCFRESULT result, const ClipTrack& track,
                           const std::string& what) const {
    if (result < 0) {
        FailSamples(track, fmt::format("track {}: {}", track.number, what), result);
    }
}

void Essence::FailSamples(const ClipTrack& track, const std::string& what, NCFRESULT result,
                          std::uint64_t sample) const {
    Problem problem = DiagnoseSamples(movie_, Which(track), sample);
    if (!problem) {
        Fail(what, result);
    }
    problem.code = result;
    throw Failure(kExitFile, std::move(problem));
}

Problem Essence::WhyUnread(const ClipTrack& track, std::uint64_t sample, NCFRESULT result) const {
    Problem problem = DiagnoseSamples(movie_, Which(track), sample);
    problem.subject = movie_;
    problem.code = result;
    if (!problem) {
        problem.reason =
            result == NMA_E_NODATA ? WhyNotShown(movie_, Which(track)) : "it can't be decoded";
    }
    return problem;
}

SoundAlone Essence::SoundOf(const ClipTrack& track) const {
    return SoundWithoutDescription(movie_, Which(track).place);
}

bool Essence::LacksPictures() const {
    return !WhatPictureLacks(movie_, 0).empty();
}

// The alpha is part of the picture.
WhichTrack Essence::Which(const ClipTrack& track) const {
    WhichTrack which{track.kind};
    for (const ClipTrack& other : tracks_) {
        const bool isBefore = other.number < track.number && track.kind == TrackKind::Sound;
        which.place += isBefore && other.kind == track.kind ? 1 : 0;
    }
    return which;
}

Essence OpenEssence(Session& session, const std::filesystem::path& movie,
                    const ParameterOptions& parameters) {
    Essence essence(session, movie, parameters);
    if (essence.undescribed()) {
        TellProblem(essence.undescribed(), session.verbosity());
        Notice("  what can be mapped is still delivered\n");
    } else {
        TellRoute(movie, session.verbosity());
    }
    return essence;
}

}  // namespace cliphost
