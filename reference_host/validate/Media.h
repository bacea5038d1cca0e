// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <filesystem>

#include "host_interfaces/aaf/AAFFile.h"
#include "host_interfaces/media/MediaContainer.h"
#include "host_interfaces/media/MediaVolume.h"
#include "host_interfaces/media/SampleMapping.h"
#include "reference_host/validate/Movies.h"
#include "reference_host/validate/Steps.h"

namespace validate {

// Volumes and containers of a module. Checks of them are skipped where it has none, and where one
// does not do the least: `container-takes-path`, `container-describes` and `volume-claims` fail
// then.

// A component that makes objects with a media interface, and one of them.
template <class Interface>
struct MediaComponent {
    std::string name;
    host::Ref<INCFClassFactory> factory;
    host::Ref<Interface> object;
};

// Those of a started module, whose components it offers to the host. The check is skipped where
// there is none.
template <class Interface>
std::vector<MediaComponent<Interface>> MediaOf(Module& module, const char* what) {
    Trial& trial = module.trial();
    module.OfferComponents();
    trial.Doing(std::string("looking for components that are a ") + what);
    const std::vector<host::ComponentFacts> components = module.Components();
    std::vector<MediaComponent<Interface>> found;
    for (std::size_t i = 0; i < components.size(); ++i) {
        const host::Ref<INCFClassFactory> factory = FactoryOf(module, components[i]);
        if (!factory) {
            continue;
        }
        void* out = nullptr;
        const NCFRESULT result = factory->CreateInstance(
            module.unknown(), nullptr, ncfIdOf(static_cast<const Interface*>(nullptr)), &out);
        auto object = host::Ref<Interface>::Adopt(static_cast<Interface*>(out));
        if (result >= 0 && object) {
            found.push_back({NameOf(components[i], i), factory, std::move(object)});
        }
    }
    if (found.empty()) {
        trial.Skip(std::string("the module has no ") + what);
    }
    return found;
}

// A started module, and one of its components that are containers for *.mov.
class Containers {
public:
    // The component with this number among them. `prepare` gets the host before the module starts.
    Containers(Trial& trial, std::size_t number,
               const std::function<void(host::Host&)>& prepare = {});

    Trial& trial() { return module_.trial(); }
    Module& module() { return module_; }
    // How many such components there are.
    std::size_t count() const { return count_; }
    // Where a check may write; no other component's files are there.
    const std::filesystem::path& folder() const { return folder_; }
    host::Ref<NMA::IMediaContainer3> New();
    // One that has a path.
    host::Ref<NMA::IMediaContainer3> Open(const std::filesystem::path& file);
    // The same while the host may refuse something: empty where a step of it fails.
    host::Ref<NMA::IMediaContainer3> TryToOpen(const std::filesystem::path& file);
    // Gives up the class factory: from now on only what the check holds is alive.
    void NoMore() { factory_.Reset(); }

private:
    Module module_;
    std::filesystem::path folder_;
    host::Ref<INCFClassFactory> factory_;
    std::size_t count_ = 0;
};

// Does a check with each component that is a container for *.mov, each in a module started anew.
// One that skips it keeps it from no other; where all do, it is skipped.
void ForEachContainer(Trial& trial, const std::function<void(Containers&)>& check,
                      const std::function<void(host::Host&)>& prepare = {});
// The same, for the tables of checks.
template <void (*check)(Containers&)>
void OfEachContainer(Trial& trial) {
    ForEachContainer(trial, check);
}

// What a container says of a file. The file's description comes with success alone.
struct Described {
    NCFRESULT result = NCF_OK;
    host::Ref<NMA::IAAFClips> clips;
    host::Ref<IAAFFile> file;  // of the first clip
};
// Ends the check as failed where an output does not fit its result.
Described Describe(Trial& trial, NMA::IMediaContainer3* container);
// The same of a file that the module has to describe. The check is skipped where it does not,
// since `container-describes` fails.
Described DescribeSound(Containers& containers, const std::filesystem::path& file);
// The same, whatever the file is: it is described or refused, and nothing is left of it.
void DescribeAnything(Containers& containers, const SampleMovie& movie);

// Whether the file could be loaded. An exception of the kind that the interface allows is a no.
bool IsSupported(Trial& trial, NMA::IMediaContainer3* container);

// A started module, one of its components that are volumes, and a folder of sound movies that it
// claims.
class Volumes {
public:
    // The component with this number among those that claim the folder.
    Volumes(Trial& trial, std::size_t number);

    Trial& trial() { return module_.trial(); }
    Module& module() { return module_; }
    // How many such components there are.
    std::size_t count() const { return count_; }
    NMA::IMediaVolume* volume() { return volume_.get(); }
    // Where a check may write; no other component's files are there.
    const std::filesystem::path& scratch() const { return scratch_; }
    const std::filesystem::path& folder() const { return folder_; }
    const std::vector<SampleMovie>& movies() const { return movies_; }
    bool Claims(const std::filesystem::path& folder);
    void Release() { volume_.Reset(); }
    // The clips of a folder.
    host::Ref<NMA::IAAFClips> ClipsOf(const std::filesystem::path& folder);

private:
    Module module_;
    host::Ref<NMA::IMediaVolume> volume_;
    std::filesystem::path scratch_;
    std::filesystem::path folder_;
    std::vector<SampleMovie> movies_;
    std::size_t count_ = 0;
};

// Does a check with each component that is a volume and claims a folder of sound movies, as
// ForEachContainer.
void ForEachVolume(Trial& trial, const std::function<void(Volumes&)>& check);
template <void (*check)(Volumes&)>
void OfEachVolume(Trial& trial) {
    ForEachVolume(trial, check);
}

}  // namespace validate
