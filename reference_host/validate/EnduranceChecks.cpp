// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include <random>

#include "reference_host/framework/HostPath.h"
#include "reference_host/system/ProcessFacts.h"
#include "reference_host/validate/KnownInterfaces.h"
#include "reference_host/validate/Media.h"

namespace validate {
namespace {

constexpr int kLeakRounds = 1000;
constexpr int kWarmUp = 50;

// Does something 1000 times, and ends the check as failed where each time leaves something. What
// is kept once and for all is there after the first rounds.
void ExpectNothingLeft(Trial& trial, const std::string& what, const std::function<void()>& round) {
    // A list that the system's allocator or a library grows now and then is no leak.
    constexpr std::size_t kLeastBytesOfARound = 16;
    for (int i = 0; i < kWarmUp; ++i) {
        round();
    }
    const host::system::ProcessFacts before = host::system::OwnFacts();
    trial.Doing(what + ", 1000 times");
    for (int i = 0; i < kLeakRounds; ++i) {
        round();
    }
    const host::system::ProcessFacts after = host::system::OwnFacts();
    trial.Expect(after.handles <= before.handles, "no file stays open",
                 std::to_string(after.handles - before.handles) + " more than before");
    const std::size_t threads = ThreadsLeft(before.threads);
    trial.Expect(threads <= before.threads, "no thread is left",
                 std::to_string(threads - before.threads) + " more than before");
    trial.Expect(after.memory < before.memory + kLeakRounds * kLeastBytesOfARound,
                 "all memory is given back",
                 std::to_string((after.memory - before.memory) / kLeakRounds) +
                     " bytes more with each round");
}

void ObjectsLeaveNothing(Trial& trial) {
    Module module(trial);
    module.Start();
    ForEachObject(module, [&](Made& made) {
        ExpectNothingLeft(trial, "making and releasing an object of " + made.name, [&] {
            void* out = nullptr;
            const auto factory = FactoryOf(module, made.component);
            trial.Expect(static_cast<bool>(factory), "a class factory, as before", "none");
            factory->CreateInstance(module.unknown(), nullptr, IID_INCFUnknown, &out);
            const auto object = host::Ref<INCFUnknown>::Adopt(static_cast<INCFUnknown*>(out));
            if (object) {
                for (const KnownInterface& known : KnownInterfaces()) {
                    void* found = nullptr;
                    object->QueryInterface(known.id, &found);
                    host::ReleaseOutput(found);
                }
            }
        });
    });
}

void RegistrationLeavesNothing(Trial& trial) {
    Module module(trial);
    ExpectNothingLeft(trial, "registering", [&] { module.Components(); });
}

void StartsLeaveNothing(Trial& trial) {
    Module module(trial);
    ExpectNothingLeft(trial, "calling NCFStartup and NCFShutdown", [&] {
        module.startup(module.unknown());
        module.shutdown(module.unknown());
    });
}

void RefusedCreationsLeaveNothing(Trial& trial) {
    constexpr GUID kUnknownInterface = ncfGuid("71D90B3E-6C42-4F85-9A17-E40C2B58D6F3");
    Module module(trial);
    module.Start();
    ForEachObject(module, [&](Made& made) {
        ExpectNothingLeft(trial, "asking for an object of " + made.name + " that it refuses", [&] {
            void* out = nullptr;
            made.factory->CreateInstance(module.unknown(), nullptr, kUnknownInterface, &out);
        });
    });
}

void DescriptionsLeaveNothing(Containers& containers) {
    Trial& trial = containers.trial();
    const SampleMovie movie = WriteSoundMovie(containers.folder());
    DescribeSound(containers, movie.file);
    ExpectNothingLeft(trial, "describing a movie",
                      [&] { Describe(trial, containers.Open(movie.file).get()); });
}

void BrokenFilesLeaveNothing(Containers& containers) {
    Trial& trial = containers.trial();
    const SampleMovie movie = WriteBrokenMovies(containers.folder())[2];
    ExpectNothingLeft(trial, "describing a file that is no movie",
                      [&] { Describe(trial, containers.Open(movie.file).get()); });
}

void MappingsLeaveNothing(Containers& containers) {
    Trial& trial = containers.trial();
    const SampleMovie movie = WriteSoundMovie(containers.folder());
    ExpectNothingLeft(trial, "asking for a movie's sample mapping", [&] {
        const auto container = containers.Open(movie.file);
        host::Ref<NMA::ISampleMapping> mapping;
        if (container->GetSampleMapping(mapping.Out()) >= 0 && mapping) {
            ncfUInt64 samples = 0;
            mapping->GetNumberOfSamples(0, &samples);
        }
    });
}

void VolumesLeaveNothing(Volumes& volumes) {
    Trial& trial = volumes.trial();
    const auto path = host::ModulePath(volumes.folder());
    ExpectNothingLeft(trial, "asking a volume for a folder's info and clips", [&] {
        volumes.Claims(volumes.folder());
        host::Ref<NMA::IVolumeInfo> info;
        volumes.volume()->GetVolumeInfo(path.get(), info.Out());
        host::Ref<INCFString> label;
        info->GetLabel(label.Out());
        const auto clips = volumes.ClipsOf(volumes.folder());
        const auto text = host::MakeRef<host::String>();
        clips->GetClipPath(0, text.get());
    });
}

// Calls in an order that the seed chooses, with objects that live for a while.
void CallsInAnyOrder(Trial& trial) {
    constexpr int kCalls = 20000;
    constexpr std::size_t kMostAlive = 64;
    Module module(trial);
    module.Start();
    std::vector<Made> kinds;
    ForEachObject(module, [&](Made& made) {
        made.object.Reset();
        kinds.push_back(made);
    });
    std::mt19937_64 numbers(trial.options().seed);
    std::vector<host::Ref<INCFUnknown>> alive;
    const auto any = [&](std::size_t count) { return static_cast<std::size_t>(numbers() % count); };
    const auto keep = [&](void* out) {
        auto object = host::Ref<INCFUnknown>::Adopt(static_cast<INCFUnknown*>(out));
        if (object && alive.size() < kMostAlive) {
            alive.push_back(std::move(object));
        }
    };
    for (int call = 1; call <= kCalls; ++call) {
        const Made& kind = kinds[any(kinds.size())];
        const KnownInterface& known = KnownInterfaces()[any(KnownInterfaces().size())];
        const std::string number = "call " + std::to_string(call) + ", ";
        void* out = nullptr;
        switch (any(6)) {
            case 0:
                trial.Doing(number + "making an object of " + kind.name);
                kind.factory->CreateInstance(module.unknown(), nullptr, IID_INCFUnknown, &out);
                keep(out);
                break;
            case 1:
                trial.Doing(number + "making an object of " + kind.name + " as " + known.name);
                kind.factory->CreateInstance(module.unknown(), nullptr, known.id, &out);
                keep(out);
                break;
            case 2:
                trial.Doing(number + "getting the class factory of " + kind.name);
                module.getClassFactory(module.unknown(), kind.component.classId, known.id, &out);
                keep(out);
                break;
            case 3:
                if (!alive.empty()) {
                    trial.Doing(number + "querying an object for " + known.name);
                    alive[any(alive.size())]->QueryInterface(known.id, &out);
                    keep(out);
                }
                break;
            case 4:
                if (!alive.empty()) {
                    trial.Doing(number + "releasing an object");
                    alive.erase(alive.begin() + static_cast<std::ptrdiff_t>(any(alive.size())));
                }
                break;
            default:
                trial.Doing(number + "asking whether to unload");
                trial.ExpectRefusal(module.canUnloadNow(module.unknown()),
                                    "a refusal, since class factories are alive");
                break;
        }
    }
    trial.Doing("releasing everything after 20000 calls");
    alive.clear();
    kinds.clear();
    ExpectIdle(module, "when everything is released");
}

void ChangedMovies(Containers& containers) {
    constexpr int kMovies = 300;
    Trial& trial = containers.trial();
    const movies::Bytes whole = BytesOfSoundMovie();
    std::mt19937_64 numbers(trial.options().seed);
    for (int number = 1; number <= kMovies; ++number) {
        const SampleMovie movie{"changed movie " + std::to_string(number) + " of seed " +
                                    std::to_string(trial.options().seed),
                                containers.folder() / "changed.mov"};
        WriteBytes(Changed(whole, numbers), movie.file);
        DescribeAnything(containers, movie);
    }
    containers.NoMore();
    trial.Doing("calling NCFCanUnloadNow after 300 changed movies");
    ExpectIdle(containers.module(), "when all containers are released");
}

}  // namespace

std::vector<Check> EnduranceChecks() {
    static constexpr char kLeak[] = "something that is taken in each round is given back in none";
    return {
        {"leaks-registration", "Registering 1000 times leaves no memory and no open file behind.",
         kLeak, RegistrationLeavesNothing},
        {"leaks-start", "Starting and stopping 1000 times leaves nothing behind.", kLeak,
         StartsLeaveNothing},
        {"leaks-objects", "Making and querying 1000 objects of a class leaves nothing behind.",
         kLeak, ObjectsLeaveNothing},
        {"leaks-refused-creation", "1000 creations that are refused leave nothing behind.", kLeak,
         RefusedCreationsLeaveNothing},
        {"leaks-descriptions", "Describing a movie 1000 times leaves nothing behind.", kLeak,
         OfEachContainer<DescriptionsLeaveNothing>},
        {"leaks-mappings", "1000 sample mappings of a movie leave nothing behind.", kLeak,
         OfEachContainer<MappingsLeaveNothing>},
        {"leaks-volumes", "Asking a volume for a folder 1000 times leaves nothing behind.", kLeak,
         OfEachVolume<VolumesLeaveNothing>},
        {"leaks-broken-files", "Refusing a file 1000 times leaves nothing behind.", kLeak,
         OfEachContainer<BrokenFilesLeaveNothing>},
        {"fuzz-calls",
         "Objects are made, queried and released in any order, and all are gone in the end.",
         "objects share something that one of them takes away", CallsInAnyOrder, true},
        {"fuzz-movies",
         "Movies with changed bytes are described or refused; nothing is left of them.",
         "a number of the file is used before it is compared with its size",
         OfEachContainer<ChangedMovies>, true},
    };
}

}  // namespace validate
