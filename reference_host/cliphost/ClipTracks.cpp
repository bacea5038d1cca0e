// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/ClipTracks.h"

#include <fmt/format.h>

#include <algorithm>

#include "host_interfaces/aaf/AAFDescriptors.h"
#include "host_interfaces/aaf/AAFMobs.h"
#include "host_interfaces/aaf/AAFPictureDescriptors.h"
#include "host_interfaces/aaf/AAFSoundDescriptors.h"
#include "reference_host/cliphost/AafQuery.h"

namespace cliphost {
namespace {

// The descriptor of the one mob that has several in one: the movie file.
host::Ref<IAAFMultipleDescriptor> FileDescriptors(IAAFFile* file) {
    host::Ref<IAAFHeader> header;
    host::Ref<IEnumAAFMobs> mobs;
    if (!file || file->GetHeader(header.Out()) < 0 || header->GetMobs(nullptr, mobs.Out()) < 0) {
        return {};
    }
    host::Ref<IAAFMob> mob;
    while (mobs->NextOne(mob.Out()) >= 0) {
        const auto source = As<IAAFSourceMob>(mob.get());
        host::Ref<IAAFEssenceDescriptor> essence;
        if (source && source->GetEssenceDescriptor(essence.Out()) >= 0) {
            if (auto several = As<IAAFMultipleDescriptor>(essence.get())) {
                return several;
            }
        }
    }
    return {};
}

ClipTrack ReadTrack(IAAFFileDescriptor* descriptor) {
    ClipTrack track;
    aafLength_t length = 0;
    if (descriptor->GetLength(&length) >= 0) {
        track.length = static_cast<std::uint64_t>(std::max<aafLength_t>(length, 0));
    }
    descriptor->GetSampleRate(&track.rate);
    if (const auto sound = As<IAAFSoundDescriptor>(descriptor)) {
        track.kind = TrackKind::Sound;
        aafUInt32 channels = 0;
        sound->GetChannelCount(&channels);
        track.channels = static_cast<ncfUInt32>(channels);
        sound->GetAudioSamplingRate(&track.rate);
    } else if (const auto picture = As<IAAFDigitalImageDescriptor>(descriptor)) {
        picture->GetImageAspectRatio(&track.shape);
    }
    return track;
}

}  // namespace

const char* NameOf(TrackKind kind) {
    switch (kind) {
        case TrackKind::Picture:
            return "picture";
        case TrackKind::Alpha:
            return "alpha";
        default:
            return "sound";
    }
}

std::string RateText(const ClipTrack& track) {
    return fmt::format("{}/{}", track.rate.numerator, track.rate.denominator);
}

std::string RateWords(const ClipTrack& track) {
    const char* const thing = track.kind == TrackKind::Sound ? "sample" : "frame";
    if (track.RateAsNumber() <= 0.0) {
        return fmt::format("{}s a second not known", thing);
    }
    const std::string number =
        track.rate.denominator == 1 ? fmt::format("{}", track.rate.numerator) : RateText(track);
    return fmt::format("{} {}{} a second", number, thing, number == "1" ? "" : "s");
}

std::vector<ClipTrack> ReadClipTracks(IAAFFile* file) {
    std::vector<ClipTrack> tracks;
    const auto descriptors = FileDescriptors(file);
    aafUInt32 count = 0;
    if (!descriptors || descriptors->CountFileDescriptors(&count) < 0) {
        return tracks;
    }
    bool hasPicture = false;
    for (aafUInt32 i = 0; i < count; ++i) {
        host::Ref<IAAFFileDescriptor> descriptor;
        if (descriptors->GetFileDescriptorAt(i, descriptor.Out()) < 0) {
            break;
        }
        ClipTrack track = ReadTrack(descriptor.get());
        track.number = i;
        if (track.kind == TrackKind::Picture) {
            track.kind = hasPicture ? TrackKind::Alpha : TrackKind::Picture;
            hasPicture = true;
        }
        tracks.push_back(track);
    }
    return tracks;
}

}  // namespace cliphost
