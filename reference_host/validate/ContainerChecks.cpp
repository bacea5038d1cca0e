// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/framework/HostPath.h"
#include "reference_host/system/ProcessFacts.h"
#include "reference_host/util/text/HostText.h"
#include "reference_host/validate/Locks.h"
#include "reference_host/validate/Media.h"

namespace validate {
namespace {

void TellsFileTypes(Containers& containers) {
    Trial& trial = containers.trial();
    const auto container = containers.New();
    const ncfUInt32 count = container->GetFileTypeCount();
    for (ncfUInt32 i = 0; i < count; ++i) {
        trial.Doing("asking for file type " + std::to_string(i) + " of " + std::to_string(count));
        host::Ref<INCFString> extension, description, group;
        trial.ExpectSuccess(
            container->GetFileType(i, extension.Out(), description.Out(), group.Out()));
        trial.Expect(extension && description && group, "three strings", "null");
        const std::string ending = host::text::ReadUtf8(extension.get());
        trial.Expect(!ending.empty() && ending[0] != '.', "an extension without a dot",
                     "\"" + ending + "\"");
        trial.ExpectSuccess(container->GetFileType(i, nullptr, nullptr, nullptr),
                            "success with null for outputs that are not wanted");
    }
    for (const ncfUInt32 index : {count, 0xFFFFFFFFu}) {
        trial.Doing("asking for file type " + std::to_string(index) + " of " +
                    std::to_string(count));
        host::Ref<INCFString> extension;
        trial.ExpectResult(NCF_E_NOTFOUND,
                           container->GetFileType(index, extension.Out(), nullptr, nullptr),
                           "NCF_E_NOTFOUND");
    }
}

void TellsCapabilities(Containers& containers) {
    Trial& trial = containers.trial();
    trial.Doing("calling GetCapabilities of a container without a path");
    constexpr ncfUInt32 kUnset = 0xA5A5A5A5;
    ncfUInt32 flags = kUnset;
    trial.ExpectSuccess(containers.New()->GetCapabilities(&flags));
    trial.Expect(flags != kUnset, "the output is set", "it is left as it was");
}

void TakesAPath(Containers& containers) {
    Trial& trial = containers.trial();
    const SampleMovie movie = WriteSoundMovie(containers.folder());
    const auto path = host::ModulePath(movie.file);
    trial.Doing("calling SetFilePath with the path of a movie");
    trial.ExpectSuccess(containers.New()->SetFilePath(path.get()));
}

void DescribesAMovie(Containers& containers) {
    Trial& trial = containers.trial();
    const auto container = containers.Open(WriteSoundMovie(containers.folder()).file);
    trial.Doing("describing a sound movie with picture, sound and timecode");
    trial.ExpectSuccess(Describe(trial, container.get()).result,
                        "a description, since the container claims *.mov");
}

void TakesOnePath(Containers& containers) {
    Trial& trial = containers.trial();
    const SampleMovie movie = WriteSoundMovie(containers.folder());
    const auto container = containers.Open(movie.file);
    trial.Doing("calling SetFilePath a second time");
    const auto path = host::ModulePath(movie.file);
    trial.ExpectResult(NMA_E_ALREADYSET, container->SetFilePath(path.get()), "NMA_E_ALREADYSET");
}

void CopiesThePath(Containers& containers) {
    Trial& trial = containers.trial();
    const SampleMovie movie = WriteSoundMovie(containers.folder());
    DescribeSound(containers, movie.file);
    const auto container = containers.New();
    const auto path = host::ModulePath(movie.file);
    container->SetFilePath(path.get());
    trial.Doing("describing a movie after the string with its path has changed");
    path->HoldUtf8("/no/such/file.mov");
    trial.ExpectSuccess(Describe(trial, container.get()).result,
                        "the string was copied, so the movie is described");
}

void NeedsAPath(Containers& containers) {
    Trial& trial = containers.trial();
    const auto container = containers.New();
    trial.Doing("describing without a path");
    trial.ExpectRefusal(Describe(trial, container.get()).result);
    trial.Doing("asking for a sample mapping without a path");
    host::Ref<NMA::ISampleMapping> mapping;
    const NCFRESULT result = container->GetSampleMapping(mapping.Out());
    trial.Expect((result >= 0) == static_cast<bool>(mapping),
                 "a mapping with success, or null with a failure",
                 trial.Text(result) + (mapping ? ", and a mapping" : ", and null"));
}

void ContainerRefusesNull(Containers& containers) {
    Trial& trial = containers.trial();
    const auto container = containers.New();
    trial.Doing("calling SetFilePath with null for the path");
    trial.ExpectRefusal(container->SetFilePath(nullptr));
    trial.Doing("calling GetCapabilities with null for the output");
    trial.ExpectRefusal(container->GetCapabilities(nullptr));
    const auto whole = containers.Open(WriteSoundMovie(containers.folder()).file);
    trial.Doing("calling GetAAFMasterClips with null for the output");
    trial.ExpectRefusal(whole->GetAAFMasterClips(nullptr));
    trial.Doing("calling GetSampleMapping with null for the output");
    trial.ExpectRefusal(whole->GetSampleMapping(nullptr));
}

void GivesLocksBack(Containers& containers, const LockCalls& calls) {
    Trial& trial = containers.trial();
    const SampleMovie movie = WriteSoundMovie(containers.folder());
    DescribeAnything(containers, movie);
    trial.Doing("counting the locks that were taken while a movie was described");
    ExpectGivenBack(trial, calls);
    for (const SampleMovie& broken : WriteBrokenMovies(containers.folder())) {
        DescribeAnything(containers, broken);
        trial.Doing("counting the locks that were taken for a file: " + broken.about);
        ExpectGivenBack(trial, calls);
    }
}

void GivesLocksBack(Trial& trial) {
    LockCalls calls;  // outlives the modules' hosts
    ForEachContainer(
        trial, [&](Containers& containers) { GivesLocksBack(containers, calls); },
        [&](host::Host& host) { RegisterCountingLocks(host, calls); });
}

void RefusesMissingFiles(Containers& containers) {
    Trial& trial = containers.trial();
    for (const auto& [what, path] :
         {std::pair("a file that is not there", containers.folder() / "absent.mov"),
          std::pair("a folder", containers.folder())}) {
        const auto container = containers.Open(path);
        trial.Doing(std::string("describing ") + what);
        trial.ExpectRefusal(Describe(trial, container.get()).result);
        trial.Doing(std::string("asking whether a container supports ") + what);
        trial.Expect(!IsSupported(trial, container.get()), "0, or a failure", "1");
    }
}

void SupportsWhatItDescribes(Containers& containers) {
    Trial& trial = containers.trial();
    for (const SampleMovie& movie : WriteSoundMovies(containers.folder())) {
        const auto container = containers.Open(movie.file);
        trial.Doing("asking whether a container supports a movie: " + movie.about);
        const bool isSupported = IsSupported(trial, container.get());
        trial.Doing("describing a movie: " + movie.about);
        const NCFRESULT result = Describe(trial, container.get()).result;
        trial.Expect(isSupported || result < 0, "a file that is described is supported",
                     "IsContainerSupported answers 0");
    }
}

void DescribesAgain(Containers& containers) {
    Trial& trial = containers.trial();
    const SampleMovie movie = WriteSoundMovie(containers.folder());
    DescribeSound(containers, movie.file);
    const auto container = containers.Open(movie.file);
    std::vector<host::Ref<IAAFFile>> files;
    for (int round = 1; round <= 3; ++round) {
        trial.Doing("describing with the same container, time " + std::to_string(round));
        const Described described = Describe(trial, container.get());
        trial.ExpectSuccess(described.result);
        files.push_back(described.file);
    }
}

void ClosesTheFile(Containers& containers) {
    Trial& trial = containers.trial();
    const SampleMovie movie = WriteSoundMovie(containers.folder());
    DescribeSound(containers, movie.file);  // whatever is opened once and for all is open now
    const std::size_t before = host::system::OwnFacts().handles;
    for (int round = 0; round < 10; ++round) {
        DescribeSound(containers, movie.file);
    }
    trial.Doing("releasing containers that have described a movie");
    const std::size_t after = host::system::OwnFacts().handles;
    trial.Expect(after <= before, "a container that is gone holds no file open",
                 std::to_string(after - before) + " more after ten movies");
}

void LeavesNothingAlive(Containers& containers) {
    Trial& trial = containers.trial();
    const SampleMovie movie = WriteSoundMovie(containers.folder());
    DescribeSound(containers, movie.file);
    containers.NoMore();
    trial.Doing("calling NCFCanUnloadNow after a movie was described and released");
    ExpectIdle(containers.module(), "when container and description are released");
}

void LeavesTheFileAlone(Containers& containers) {
    Trial& trial = containers.trial();
    const SampleMovie movie = WriteSoundMovie(containers.folder());
    const auto size = std::filesystem::file_size(movie.file);
    const auto date = std::filesystem::last_write_time(movie.file);
    DescribeAnything(containers, movie);
    trial.Doing("looking at a movie after it was described");
    trial.Expect(std::filesystem::exists(movie.file) &&
                     std::filesystem::file_size(movie.file) == size &&
                     std::filesystem::last_write_time(movie.file) == date,
                 "the movie is as it was", "it was written or removed");
    const auto entries = std::distance(std::filesystem::directory_iterator(containers.folder()),
                                       std::filesystem::directory_iterator());
    trial.Expect(entries == 1, "nothing is written beside a movie",
                 std::to_string(entries) + " files instead of 1");
}

void WorksOnThreads(Containers& containers) {
    Trial& trial = containers.trial();
    const SampleMovie movie = WriteSoundMovie(containers.folder());
    DescribeSound(containers, movie.file);
    trial.Doing("describing a movie with a container on each of four threads, ten times");
    OnThreads(4, [&](unsigned) {
        for (int round = 0; round < 10; ++round) {
            const auto container = containers.Open(movie.file);
            trial.ExpectSuccess(Describe(trial, container.get()).result,
                                "success, as on one thread");
        }
    });
}

void TakesOddNames(Containers& containers) {
    Trial& trial = containers.trial();
    DescribeSound(containers, WriteSoundMovie(containers.folder()).file);
    const std::filesystem::path folder = containers.folder() / "odd";
    MakeFolder(folder);
    for (const SampleMovie& movie : WriteOddlyNamedMovies(folder)) {
        trial.Doing("describing a movie called " + host::DisplayPath(movie.file.filename()));
        trial.ExpectSuccess(Describe(trial, containers.Open(movie.file).get()).result,
                            "it is described, as the same movie under another name is");
    }
}

template <Refused refused>
void DescriptionRefused(Containers& containers) {
    Trial& trial = containers.trial();
    const SampleMovie movie = WriteSoundMovie(containers.folder());
    DescribeSound(containers, movie.file);
    RefuseEach(
        containers.module(), refused,
        [&](int number) {
            trial.Doing(std::string("describing a movie while the host refuses ") +
                        WordOf(refused) + " " + std::to_string(number));
        },
        [&] {
            const auto made = containers.TryToOpen(movie.file);
            if (made) {
                Describe(trial, made.get());
            }
        });
    trial.Doing("describing a movie after the host has refused something");
    trial.ExpectSuccess(Describe(trial, containers.Open(movie.file).get()).result,
                        "success, as before the refusals");
}

}  // namespace

std::vector<Check> ContainerChecks() {
    static constexpr char kRefusal[] =
        "a result is not looked at, or an output is set although a later step fails";
    return {
        {"container-file-types",
         "A container tells its file types: strings for each index, NCF_E_NOTFOUND beyond, and "
         "outputs that may be null.",
         "an output is used before it is looked at, or the index is not compared",
         OfEachContainer<TellsFileTypes>},
        {"container-capabilities", "A container tells its capabilities, before it has a path.",
         "the output is not set, or a path is needed", OfEachContainer<TellsCapabilities>},
        {"container-takes-path", "A container takes the path of a movie.",
         "the path is refused in the form that hosts give it", OfEachContainer<TakesAPath>},
        {"container-describes", "A container that claims *.mov describes a sound movie.",
         "a part of a common movie is not understood", OfEachContainer<DescribesAMovie>},
        {"container-path-once", "A container takes one path; another gets NMA_E_ALREADYSET.",
         "the path is replaced", OfEachContainer<TakesOnePath>},
        {"container-path-copied", "A container copies its path.",
         "the host's string is kept instead of its text", OfEachContainer<CopiesThePath>},
        {"container-without-path", "A container without a path refuses to describe.",
         "the path is used before it is looked at", OfEachContainer<NeedsAPath>},
        {"container-null-arguments", "A container refuses null for a path and for an output.",
         "the argument is used before it is looked at", OfEachContainer<ContainerRefusesNull>},
        {"container-locks",
         "A description gives each lock of the host's back that it takes, and so does a refusal.",
         "a way out of a function passes over the Unlock", GivesLocksBack},
        {"container-missing-file", "A container refuses a file that is not there, and a folder.",
         "the file is not opened before the description is made",
         OfEachContainer<RefusesMissingFiles>},
        {"container-supports", "What a container describes it also supports.",
         "the two go by different rules", OfEachContainer<SupportsWhatItDescribes>},
        {"container-describes-again",
         "A container describes its clip anew as often as it is asked.",
         "something is used up by the first description", OfEachContainer<DescribesAgain>},
        {"container-closes-file", "A container that is gone holds no file open.",
         "a file is opened and never closed", OfEachContainer<ClosesTheFile>},
        {"container-leaves-nothing",
         "When a container and its description are released, the module can be unloaded.",
         "clip and container hold each other", OfEachContainer<LeavesNothingAlive>},
        {"container-leaves-file",
         "A container only reads: the movie stays as it is, and nothing is written beside it.",
         "the file is opened for writing, or a cache is put beside it",
         OfEachContainer<LeavesTheFileAlone>},
        {"container-threads", "Containers of their own work on several threads at once.",
         "containers share something that has no lock", OfEachContainer<WorksOnThreads>},
        {"container-odd-names",
         "A movie is described under any name: blanks, quotes, per cent signs, other scripts, line "
         "ends, long ones.",
         "a path is used as a format, or converted through another encoding",
         OfEachContainer<TakesOddNames>},
        {"container-creations-refused",
         "When the host refuses to make the n-th component that a description asks for, for every "
         "n, the movie is described or refused, and the next one works.",
         kRefusal, OfEachContainer<DescriptionRefused<Refused::kCreations>>},
        {"container-queries-refused",
         "When the host refuses the n-th interface that a description asks for, for every n, the "
         "movie is described or refused, and the next one works.",
         kRefusal, OfEachContainer<DescriptionRefused<Refused::kQueries>>},
    };
}

}  // namespace validate
