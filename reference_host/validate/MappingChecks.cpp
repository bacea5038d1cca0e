// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include <algorithm>

#include "reference_host/validate/Media.h"

namespace validate {
namespace {

// A mapping of a sound movie; the check is skipped where the module gives none.
host::Ref<NMA::ISampleMapping> MappingOf(Trial& trial, NMA::IMediaContainer3* container) {
    trial.Doing("asking for a movie's sample mapping");
    host::Ref<NMA::ISampleMapping> mapping;
    const NCFRESULT result = container->GetSampleMapping(mapping.Out());
    if (result < 0 || !mapping) {
        trial.Skip("the module gives no sample mapping of a sound movie: " + trial.Text(result));
    }
    return mapping;
}

// A module that counts wrongly has another check against it.
ncfUInt32 TracksOf(NMA::ISampleMapping& mapping) {
    return static_cast<ncfUInt32>(std::max<ncfSInt32>(mapping.GetNumberOfTracks(), 0));
}

// The first track that tells how many samples it has; the check is skipped where none does.
ncfUInt32 TrackWithSamples(Trial& trial, NMA::ISampleMapping& mapping) {
    const ncfUInt32 tracks = TracksOf(mapping);
    ncfUInt64 samples = 0;
    for (ncfUInt32 track = 0; track < tracks; ++track) {
        if (mapping.GetNumberOfSamples(track, &samples) >= 0) {
            return track;
        }
    }
    trial.Skip("no track of a sound movie tells how many samples it has");
}

// Calls `visit` with each track of a sound movie that has samples, and their number. A mapping may
// count tracks that have none, such as timecode.
void ForEachTrack(Containers& containers,
                  const std::function<void(NMA::ISampleMapping&, ncfUInt32 track, ncfUInt64 samples,
                                           std::uintmax_t fileSize)>& visit) {
    Trial& trial = containers.trial();
    const SampleMovie movie = WriteSoundMovie(containers.folder());
    const auto container = containers.Open(movie.file);
    const auto mapping = MappingOf(trial, container.get());
    const ncfUInt32 tracks = TracksOf(*mapping);
    bool isAny = false;
    for (ncfUInt32 track = 0; track < tracks; ++track) {
        trial.Doing("asking for the number of samples of track " + std::to_string(track));
        ncfUInt64 samples = 0;
        if (mapping->GetNumberOfSamples(track, &samples) >= 0) {
            isAny = true;
            visit(*mapping, track, samples, std::filesystem::file_size(movie.file));
        }
    }
    trial.Expect(isAny, "the number of samples of one track at least", "none is told");
}

void HasTracks(Containers& containers) {
    Trial& trial = containers.trial();
    const auto container = containers.Open(WriteSoundMovie(containers.folder()).file);
    const auto mapping = MappingOf(trial, container.get());
    trial.Doing("calling GetNumberOfTracks for a movie with picture and sound");
    const ncfSInt32 tracks = mapping->GetNumberOfTracks();
    trial.Expect(tracks >= 1, "one track at least", std::to_string(tracks));
}

void TracksHaveSamples(Containers& containers) {
    Trial& trial = containers.trial();
    ForEachTrack(containers, [&](NMA::ISampleMapping& mapping, ncfUInt32 track, ncfUInt64 samples,
                                 std::uintmax_t) {
        trial.Expect(samples >= 1, "one sample at least", "none");
        trial.Doing("asking for the number of channels of track " + std::to_string(track));
        ncfUInt32 channels = 0;
        trial.ExpectSuccess(mapping.GetNumberOfChannels(track, &channels));
        trial.Expect(channels >= 1, "one channel at least", "none");
    });
}

void SamplesLieInTheFile(Containers& containers) {
    Trial& trial = containers.trial();
    ForEachTrack(containers, [&](NMA::ISampleMapping& mapping, ncfUInt32 track, ncfUInt64 samples,
                                 std::uintmax_t fileSize) {
        for (const ncfUInt64 sample : {ncfUInt64{0}, samples / 2, samples - 1}) {
            trial.Doing("asking where sample " + std::to_string(sample) + " of track " +
                        std::to_string(track) + " lies");
            ncfUInt64 position = 0;
            ncfUInt64 size = 0;
            trial.ExpectSuccess(mapping.GetSamplePosition(track, sample, &position));
            trial.ExpectSuccess(mapping.GetSampleSize(track, sample, &size));
            trial.Expect(size > 0 && position + size <= fileSize, "bytes of the movie's file",
                         std::to_string(size) + " bytes at " + std::to_string(position) +
                             " of a file of " + std::to_string(fileSize));
        }
    });
}

void RefusesOtherTracks(Containers& containers) {
    Trial& trial = containers.trial();
    const auto container = containers.Open(WriteSoundMovie(containers.folder()).file);
    const auto mapping = MappingOf(trial, container.get());
    const ncfUInt32 tracks = TracksOf(*mapping);
    for (const ncfUInt32 track : {tracks, 0x7FFFFFFFu, 0xFFFFFFFFu}) {
        trial.Doing("asking for samples of track " + std::to_string(track) + " of " +
                    std::to_string(tracks));
        ncfUInt64 number = 0;
        trial.ExpectRefusal(mapping->GetNumberOfSamples(track, &number));
        trial.ExpectRefusal(mapping->GetSamplePosition(track, 0, &number));
        trial.ExpectRefusal(mapping->GetSampleSize(track, 0, &number));
        ncfUInt32 count = 0;
        trial.ExpectRefusal(mapping->GetNumberOfChannels(track, &count));
        trial.ExpectRefusal(mapping->GetSampleProperties(track, 0, &number, &count));
        ncfSInt64 offset = 0;
        trial.ExpectRefusal(mapping->GetSampleTemporalOffset(track, 0, &offset));
    }
}

void MappingRefusesNull(Containers& containers) {
    Trial& trial = containers.trial();
    ForEachTrack(containers, [&](NMA::ISampleMapping& mapping, ncfUInt32 track, ncfUInt64,
                                 std::uintmax_t) {
        trial.Doing("asking about track " + std::to_string(track) + " with null for the output");
        trial.ExpectRefusal(mapping.GetNumberOfChannels(track, nullptr));
        trial.ExpectRefusal(mapping.GetNumberOfSamples(track, nullptr));
        trial.ExpectRefusal(mapping.GetSampleSize(track, 0, nullptr));
        trial.ExpectRefusal(mapping.GetSamplePosition(track, 0, nullptr));
        trial.ExpectRefusal(mapping.GetSampleTemporalOffset(track, 0, nullptr));
        trial.ExpectRefusal(mapping.GetSampleProperties(track, 0, nullptr, nullptr));
        trial.ExpectRefusal(mapping.GetNumberOfContiguousSamples(track, 0, nullptr));
        trial.ExpectRefusal(mapping.GetNumberOfContiguousBytes(track, 0, nullptr));
    });
}

void RefusesOtherSamples(Containers& containers) {
    Trial& trial = containers.trial();
    ForEachTrack(containers, [&](NMA::ISampleMapping& mapping, ncfUInt32 track, ncfUInt64 samples,
                                 std::uintmax_t fileSize) {
        trial.Doing("asking where sample " + std::to_string(samples) + " of track " +
                    std::to_string(track) + " lies, one beyond the last");
        ncfUInt64 position = 0;
        const NCFRESULT result = mapping.GetSamplePosition(track, samples, &position);
        trial.Expect(result < 0 || position <= fileSize,
                     "a refusal, or a place in the movie's file",
                     std::to_string(position) + " of a file of " + std::to_string(fileSize));
    });
}

template <Refused refused>
void MappingRefused(Containers& containers) {
    Trial& trial = containers.trial();
    const SampleMovie movie = WriteSoundMovie(containers.folder());
    MappingOf(trial, containers.Open(movie.file).get());
    RefuseEach(
        containers.module(), refused,
        [&](int number) {
            trial.Doing(std::string("asking for a movie's sample mapping while the host refuses ") +
                        WordOf(refused) + " " + std::to_string(number));
        },
        [&] {
            const auto container = containers.TryToOpen(movie.file);
            host::Ref<NMA::ISampleMapping> mapping;
            const NCFRESULT result =
                container ? container->GetSampleMapping(mapping.Out()) : NCF_E_FAIL;
            trial.Expect((result >= 0) == static_cast<bool>(mapping),
                         "a mapping with success, or null with a failure",
                         trial.Text(result) + (mapping ? ", and a mapping" : ", and null"));
        });
    trial.Doing("asking for a movie's sample mapping after the host has refused something");
    host::Ref<NMA::ISampleMapping> mapping;
    trial.ExpectSuccess(containers.Open(movie.file)->GetSampleMapping(mapping.Out()),
                        "success, as before the refusals");
}

void MappingOutlivesTheContainer(Containers& containers) {
    Trial& trial = containers.trial();
    auto container = containers.Open(WriteSoundMovie(containers.folder()).file);
    const auto mapping = MappingOf(trial, container.get());
    const ncfUInt32 track = TrackWithSamples(trial, *mapping);
    container.Reset();
    trial.Doing("using a mapping after its container's end");
    ncfUInt64 samples = 0;
    trial.ExpectSuccess(mapping->GetNumberOfSamples(track, &samples));
    trial.ExpectRefusal(containers.module().canUnloadNow(containers.module().unknown()),
                        "a mapping counts as alive");
}

}  // namespace

std::vector<Check> MappingChecks() {
    static constexpr char kRefusal[] =
        "a result is not looked at, or the output is set although a later step fails";
    return {
        {"mapping-tracks", "A movie with picture and sound has tracks in its sample mapping.",
         "the answer is a result instead of the number", OfEachContainer<HasTracks>},
        {"mapping-samples", "Each track of a mapping tells how many samples and channels it has.",
         "an output is left as it was", OfEachContainer<TracksHaveSamples>},
        {"mapping-in-file", "The samples of a mapping lie within the movie's file.",
         "positions are those of a chunk or of the media", OfEachContainer<SamplesLieInTheFile>},
        {"mapping-other-tracks", "A mapping refuses a track that is not there.",
         "the number is not compared", OfEachContainer<RefusesOtherTracks>},
        {"mapping-other-samples",
         "For a sample beyond the last, a mapping names no place outside of the file.",
         "the number is not compared", OfEachContainer<RefusesOtherSamples>},
        {"mapping-null-outputs", "A mapping refuses null for an output.",
         "the output is used before it is looked at", OfEachContainer<MappingRefusesNull>},
        {"mapping-creations-refused",
         "When the host refuses to make the n-th component that a sample mapping asks for, for "
         "every n, it is made or refused, and the next one works.",
         kRefusal, OfEachContainer<MappingRefused<Refused::kCreations>>},
        {"mapping-queries-refused",
         "When the host refuses the n-th interface that a sample mapping asks for, for every n, "
         "it is made or refused, and the next one works.",
         kRefusal, OfEachContainer<MappingRefused<Refused::kQueries>>},
        {"mapping-outlives",
         "A mapping goes on when its container is released, and counts as "
         "alive.",
         "the mapping points into the container", OfEachContainer<MappingOutlivesTheContainer>},
    };
}

}  // namespace validate
