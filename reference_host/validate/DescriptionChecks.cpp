// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include <algorithm>
#include <cstring>

#include "host_interfaces/aaf/AAFEnumerations.h"
#include "host_interfaces/aaf/AAFMobs.h"
#include "reference_host/validate/Media.h"

namespace validate {
namespace {

using Bytes = std::vector<unsigned char>;

Bytes IdOf(IAAFMob* mob) {
    aafMobID_t id{};
    mob->GetMobID(&id);
    Bytes bytes(sizeof id);
    std::memcpy(bytes.data(), &id, sizeof id);
    return bytes;
}

host::Ref<IAAFHeader> HeaderOf(Trial& trial, IAAFFile* file) {
    host::Ref<IAAFHeader> header;
    const HRESULT result = file->GetHeader(header.Out());
    trial.Expect(result >= 0 && header, "the description is an open AAF file with a header",
                 trial.Text(result));
    return header;
}

std::vector<host::Ref<IAAFMob>> MobsOf(Trial& trial, IAAFFile* file) {
    const auto header = HeaderOf(trial, file);
    std::vector<host::Ref<IAAFMob>> mobs;
    host::Ref<IEnumAAFMobs> all;
    if (header->GetMobs(nullptr, all.Out()) >= 0 && all) {
        for (host::Ref<IAAFMob> mob; all->NextOne(mob.Out()) == 0 && mob;) {
            mobs.push_back(mob);
        }
    }
    return mobs;
}

// The ids of all mobs of a movie's description, in order.
std::vector<Bytes> IdsOf(Containers& containers, const std::filesystem::path& movie) {
    std::vector<Bytes> ids;
    const Described described = DescribeSound(containers, movie);
    for (const auto& mob : MobsOf(containers.trial(), described.file.get())) {
        ids.push_back(IdOf(mob.get()));
    }
    std::sort(ids.begin(), ids.end());
    return ids;
}

void IsAnAafFile(Containers& containers) {
    Trial& trial = containers.trial();
    for (const SampleMovie& movie : WriteSoundMovies(containers.folder())) {
        const Described described = DescribeSound(containers, movie.file);
        trial.Doing("reading the header of the description of a movie: " + movie.about);
        HeaderOf(trial, described.file.get());
    }
}

void HasAMasterMob(Containers& containers) {
    Trial& trial = containers.trial();
    for (const SampleMovie& movie : WriteSoundMovies(containers.folder())) {
        const Described described = DescribeSound(containers, movie.file);
        trial.Doing("counting the master mobs of the description of a movie: " + movie.about);
        aafNumSlots_t count = 0;
        HeaderOf(trial, described.file.get())->CountMobs(kAAFMasterMob, &count);
        trial.Expect(count >= 1, "a master mob, which is the clip in the bin", "there is none");
    }
}

void MobsHaveIds(Containers& containers) {
    Trial& trial = containers.trial();
    std::vector<Bytes> ids = IdsOf(containers, WriteSoundMovie(containers.folder()).file);
    trial.Doing("comparing the ids of the mobs of a description");
    trial.Expect(std::find(ids.begin(), ids.end(), Bytes(sizeof(aafMobID_t))) == ids.end(),
                 "each mob has an id", "one has zeros");
    trial.Expect(std::adjacent_find(ids.begin(), ids.end()) == ids.end(),
                 "each mob has an id of its own", "two have the same");
}

void IdsAreStable(Containers& containers) {
    Trial& trial = containers.trial();
    const SampleMovie movie = WriteSoundMovie(containers.folder());
    const auto first = IdsOf(containers, movie.file);
    trial.Doing("describing the same movie again");
    const auto again = IdsOf(containers, movie.file);
    trial.Expect(first == again, "the same mob ids each time", "others");
}

void IdsDiffer(Containers& containers) {
    Trial& trial = containers.trial();
    const auto movies = WriteSoundMovies(containers.folder());
    std::vector<Bytes> known;
    for (const SampleMovie& movie : movies) {
        for (Bytes& id : IdsOf(containers, movie.file)) {
            trial.Doing("comparing the mob ids of a movie with those of others: " + movie.about);
            trial.Expect(std::find(known.begin(), known.end(), id) == known.end(),
                         "movies with different content have different ids", "two share an id");
        }
        for (Bytes& id : IdsOf(containers, movie.file)) {
            known.push_back(std::move(id));
        }
    }
}

void MobsHaveSlots(Containers& containers) {
    Trial& trial = containers.trial();
    const Described described =
        DescribeSound(containers, WriteSoundMovie(containers.folder()).file);
    for (const auto& mob : MobsOf(trial, described.file.get())) {
        trial.Doing("counting the slots of a mob");
        aafNumSlots_t count = 0;
        mob->CountSlots(&count);
        trial.Expect(count >= 1, "one slot at least", "there is none");
    }
}

void OutlivesTheContainer(Containers& containers) {
    Trial& trial = containers.trial();
    const SampleMovie movie = WriteSoundMovie(containers.folder());
    const host::Ref<IAAFFile> file = DescribeSound(containers, movie.file).file;
    trial.Doing("reading a description after its container's end");
    trial.Expect(!MobsOf(trial, file.get()).empty(), "its mobs are still there", "there are none");
}

void RefusesOtherIndexes(Containers& containers) {
    Trial& trial = containers.trial();
    const Described described =
        DescribeSound(containers, WriteSoundMovie(containers.folder()).file);
    const ncfSInt32 count = described.clips->GetCount();
    for (const ncfSInt32 index : {count, -1, 0x7FFFFFFF}) {
        trial.Doing("asking a container's list for clip " + std::to_string(index) + " of " +
                    std::to_string(count));
        host::Ref<IAAFFile> file;
        trial.ExpectResult(NCF_E_NOTFOUND, described.clips->GetMetadata(index, file.Out()),
                           "NCF_E_NOTFOUND");
        trial.Expect(!file, "no description comes out", "an object");
    }
}

}  // namespace

std::vector<Check> DescriptionChecks() {
    return {
        {"description-is-aaf", "A description is an open AAF file with a header.",
         "the file is closed before it is handed out", OfEachContainer<IsAnAafFile>},
        {"description-master-mob", "A description has a master mob, which is the clip in a bin.",
         "the mob is not added to the header", OfEachContainer<HasAMasterMob>},
        {"description-ids", "Each mob of a description has an id of its own.",
         "an id is not set, or used for several mobs", OfEachContainer<MobsHaveIds>},
        {"description-ids-stable",
         "The same movie gets the same ids each time, so a host finds its clip again.",
         "ids are made up, or taken from the clock", OfEachContainer<IdsAreStable>},
        {"description-ids-differ",
         "Movies with different content get different ids, so a host keeps them apart.",
         "ids are made of too little of the movie", OfEachContainer<IdsDiffer>},
        {"description-slots", "Each mob of a description has slots.",
         "a mob is added and its tracks are not", OfEachContainer<MobsHaveSlots>},
        {"description-outlives", "A description goes on when its container is released.",
         "the container closes the file at its end", OfEachContainer<OutlivesTheContainer>},
        {"description-index",
         "A container's list refuses an index that is not there with NCF_E_NOTFOUND.",
         "the index is not compared, or as an unsigned number",
         OfEachContainer<RefusesOtherIndexes>},
    };
}

}  // namespace validate
