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

// The first component that makes objects with an interface, and its factory.
host::Ref<INCFClassFactory> FactoryOfMedia(Module& module, const GUID& interfaceId,
                                           const char* what);

template <class Interface>
host::Ref<Interface> Make(Module& module, INCFClassFactory* factory) {
    void* out = nullptr;
    const NCFRESULT result = factory->CreateInstance(
        module.unknown(), nullptr, ncfIdOf(static_cast<const Interface*>(nullptr)), &out);
    auto made = host::Ref<Interface>::Adopt(static_cast<Interface*>(out));
    if (result < 0 || !made) {
        module.trial().Skip("its object can't be made: " + module.trial().Text(result));
    }
    return made;
}

// A started module that has containers for *.mov.
class Containers {
public:
    // `prepare` gets the host before the module starts.
    explicit Containers(Trial& trial, const std::function<void(host::Host&)>& prepare = {});

    Trial& trial() { return module_.trial(); }
    Module& module() { return module_; }
    host::Ref<NMA::IMediaContainer3> New() {
        return Make<NMA::IMediaContainer3>(module_, factory_.get());
    }
    // One that has a path.
    host::Ref<NMA::IMediaContainer3> Open(const std::filesystem::path& file);
    // The same while the host may refuse something: empty where a step of it fails.
    host::Ref<NMA::IMediaContainer3> TryToOpen(const std::filesystem::path& file);
    // Gives up the class factory: from now on only what the check holds is alive.
    void NoMore() { factory_.Reset(); }

private:
    Module module_;
    host::Ref<INCFClassFactory> factory_;
};

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

// A started module with a volume, and a folder of sound movies that it claims.
class Volumes {
public:
    explicit Volumes(Trial& trial);

    Trial& trial() { return module_.trial(); }
    Module& module() { return module_; }
    NMA::IMediaVolume* volume() { return volume_.get(); }
    const std::filesystem::path& folder() const { return folder_; }
    const std::vector<SampleMovie>& movies() const { return movies_; }
    bool Claims(const std::filesystem::path& folder);
    void Release() { volume_.Reset(); }
    // The clips of a folder.
    host::Ref<NMA::IAAFClips> ClipsOf(const std::filesystem::path& folder);

private:
    Module module_;
    host::Ref<NMA::IMediaVolume> volume_;
    std::filesystem::path folder_;
    std::vector<SampleMovie> movies_;
};

}  // namespace validate
