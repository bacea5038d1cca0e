// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/validate/Media.h"

namespace validate {
namespace {

template <std::vector<SampleMovie> (*write)(const std::filesystem::path& folder)>
void DescribeAll(Containers& containers) {
    Trial& trial = containers.trial();
    for (const SampleMovie& movie : write(containers.folder())) {
        DescribeAnything(containers, movie);
    }
    containers.NoMore();
    trial.Doing("calling NCFCanUnloadNow after all of these files");
    ExpectIdle(containers.module(), "when all containers are released");
}

void GoodAfterBad(Containers& containers) {
    Trial& trial = containers.trial();
    const SampleMovie good = WriteSoundMovie(containers.folder());
    DescribeSound(containers, good.file);
    for (const SampleMovie& movie : WriteBrokenMovies(containers.folder())) {
        trial.Doing("describing a file, and a sound movie after it: " + movie.about);
        IsSupported(trial, containers.Open(movie.file).get());
        Describe(trial, containers.Open(movie.file).get());
        trial.ExpectSuccess(Describe(trial, containers.Open(good.file).get()).result,
                            "the sound movie is described, as before");
    }
}

void FileShrinks(Containers& containers) {
    Trial& trial = containers.trial();
    const SampleMovie movie = WriteSoundMovie(containers.folder());
    DescribeSound(containers, movie.file);
    const auto container = containers.Open(movie.file);
    Describe(trial, container.get());
    CutFile(movie.file, 100);
    trial.Doing("describing a movie again after its file has shrunk");
    Describe(trial, container.get());
    std::filesystem::remove(movie.file);
    trial.Doing("describing a movie again after its file was removed");
    Describe(trial, container.get());
}

}  // namespace

std::vector<Check> BadFileChecks() {
    static constexpr char kTrust[] =
        "a number of the file is used before it is compared with its size";
    return {
        {"files-broken",
         "Empty, cut and foreign files are refused or described; nothing is left of them.", kTrust,
         OfEachContainer<DescribeAll<WriteBrokenMovies>>},
        {"files-hostile",
         "Files whose numbers lie are refused or described, in time and without much memory.",
         kTrust, OfEachContainer<DescribeAll<WriteHostileMovies>>},
        {"files-huge", "Movies beyond 4 GiB and of very many samples are described or refused.",
         "positions or sizes are kept in 32 bits", OfEachContainer<DescribeAll<WriteHugeMovies>>},
        {"files-good-after-bad", "After a bad file the next sound movie is described.",
         "a failure leaves a flag or a lock behind", OfEachContainer<GoodAfterBad>},
        {"files-that-change", "A file that shrinks or goes while its container lives does no harm.",
         "the file is mapped, or what was read before is taken for what is there",
         OfEachContainer<FileShrinks>},
    };
}

}  // namespace validate
