// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/validate/Media.h"

#include <algorithm>
#include <utility>

#include "reference_host/framework/HostPath.h"
#include "reference_host/util/text/HostText.h"

namespace validate {
namespace {

bool ClaimsMovies(NMA::IMediaContainer3* container) {
    const ncfUInt32 count = container->GetFileTypeCount();
    for (ncfUInt32 i = 0; i < count; ++i) {
        host::Ref<INCFString> extension;
        if (container->GetFileType(i, extension.Out(), nullptr, nullptr) >= 0 &&
            host::text::ReadUtf8(extension.get()) == "MOV") {
            return true;
        }
    }
    return false;
}

bool DoesClaim(Trial& trial, NMA::IMediaVolume& volume, const std::filesystem::path& folder) {
    const auto path = host::ModulePath(folder);
    const NCFRESULT result = volume.IsMediaVolume(path.get());
    trial.Expect(result == 0 || result == 1, "1 or 0, whatever happens", trial.Text(result));
    return result == 1;
}

// An empty folder for the component with this number.
std::filesystem::path FolderOf(const Trial& trial, std::size_t number) {
    std::filesystem::path folder = trial.folder() / std::to_string(number);
    MakeFolder(folder);
    return folder;
}

// One of those that take the movies, and how many do. What the check does with it is told with its
// name, unless it is the only one. The check is skipped where there is none.
template <class Component, class Takes>
std::pair<Component, std::size_t> Choose(Trial& trial, std::vector<Component> components,
                                         std::size_t number, const Takes& takes,
                                         const char* otherwise) {
    components.erase(
        std::remove_if(components.begin(), components.end(),
                       [&](const Component& component) { return !takes(component.object.get()); }),
        components.end());
    if (number >= components.size()) {
        trial.Skip(otherwise);
    }
    if (components.size() > 1) {
        trial.With(components[number].name);
    }
    return {components[number], components.size()};
}

// Does a check with one component after the other; `check` tells how many there are.
void OneByOne(Trial& trial,
              const std::function<void(std::size_t number, std::size_t& count)>& check) {
    std::size_t count = 1;
    std::vector<std::string> reasons;
    for (std::size_t number = 0; number < count; ++number) {
        trial.With({});
        const auto skipped = trial.Part([&] { check(number, count); });
        if (skipped) {
            reasons.push_back(*skipped);
        }
    }
    if (reasons.size() == count) {
        trial.Skip(reasons[0]);
    }
}

}  // namespace

Containers::Containers(Trial& trial, std::size_t number,
                       const std::function<void(host::Host&)>& prepare)
    : module_(trial), folder_(FolderOf(trial, number)) {
    if (prepare) {
        prepare(module_.host());
    }
    module_.Start();
    const auto [chosen, count] =
        Choose(trial, MediaOf<NMA::IMediaContainer3>(module_, "container"), number, ClaimsMovies,
               "the module's container does not claim *.mov, and other files are not made");
    factory_ = chosen.factory;
    count_ = count;
}

host::Ref<NMA::IMediaContainer3> Containers::New() {
    void* out = nullptr;
    const NCFRESULT result =
        factory_->CreateInstance(module_.unknown(), nullptr, NMA::IID_IMediaContainer3, &out);
    auto made = host::Ref<NMA::IMediaContainer3>::Adopt(static_cast<NMA::IMediaContainer3*>(out));
    if (result < 0 || !made) {
        trial().Skip("its object can't be made: " + trial().Text(result));
    }
    return made;
}

host::Ref<NMA::IMediaContainer3> Containers::Open(const std::filesystem::path& file) {
    host::Ref<NMA::IMediaContainer3> container = New();
    const auto path = host::ModulePath(file);
    const NCFRESULT result = container->SetFilePath(path.get());
    if (result < 0) {
        trial().Skip("the container takes no path: " + trial().Text(result));
    }
    return container;
}

host::Ref<NMA::IMediaContainer3> Containers::TryToOpen(const std::filesystem::path& file) {
    void* out = nullptr;
    const NCFRESULT result =
        factory_->CreateInstance(module_.unknown(), nullptr, NMA::IID_IMediaContainer3, &out);
    auto container =
        host::Ref<NMA::IMediaContainer3>::Adopt(static_cast<NMA::IMediaContainer3*>(out));
    trial().Expect((result >= 0) == static_cast<bool>(container),
                   "a container with success, or null with a failure",
                   trial().Text(result) + (container ? ", and a container" : ", and null"));
    const auto path = host::ModulePath(file);
    if (container && container->SetFilePath(path.get()) < 0) {
        container.Reset();
    }
    return container;
}

void ForEachContainer(Trial& trial, const std::function<void(Containers&)>& check,
                      const std::function<void(host::Host&)>& prepare) {
    OneByOne(trial, [&](std::size_t number, std::size_t& count) {
        Containers containers(trial, number, prepare);
        count = containers.count();
        check(containers);
    });
}

Described Describe(Trial& trial, NMA::IMediaContainer3* container) {
    Described described;
    described.result = container->GetAAFMasterClips(described.clips.Out());
    trial.Expect((described.result >= 0) == static_cast<bool>(described.clips),
                 "a list of clips with success, or null with a failure",
                 trial.Text(described.result) + (described.clips ? ", and a list" : ", and null"));
    if (described.result >= 0) {
        trial.Expect(described.clips->GetCount() >= 1, "one clip at least",
                     std::to_string(described.clips->GetCount()));
        described.result = described.clips->GetMetadata(0, described.file.Out());
        trial.Expect(
            (described.result >= 0) == static_cast<bool>(described.file),
            "a description with success, or null with a failure",
            trial.Text(described.result) + (described.file ? ", and an object" : ", and null"));
    }
    return described;
}

Described DescribeSound(Containers& containers, const std::filesystem::path& file) {
    Trial& trial = containers.trial();
    trial.Doing("describing " + host::DisplayPath(file.filename()));
    Described described = Describe(trial, containers.Open(file).get());
    if (described.result < 0) {
        trial.Skip("the module does not describe a sound movie: " + trial.Text(described.result));
    }
    return described;
}

void DescribeAnything(Containers& containers, const SampleMovie& movie) {
    Trial& trial = containers.trial();
    const auto container = containers.Open(movie.file);
    trial.Doing("asking whether a container supports a file: " + movie.about);
    IsSupported(trial, container.get());
    trial.Doing("describing a file: " + movie.about);
    Describe(trial, container.get());
    trial.Doing("asking for the sample mapping of a file: " + movie.about);
    host::Ref<NMA::ISampleMapping> mapping;
    const NCFRESULT result = container->GetSampleMapping(mapping.Out());
    trial.Expect((result >= 0) == static_cast<bool>(mapping),
                 "a mapping with success, or null with a failure",
                 trial.Text(result) + (mapping ? ", and a mapping" : ", and null"));
}

bool IsSupported(Trial& trial, NMA::IMediaContainer3* container) {
    try {
        const NCFRESULT result = container->IsContainerSupported();
        trial.Expect(result == 0 || result == 1, "1 or 0", trial.Text(result));
        return result == 1;
    } catch (NCFRESULT) {
        return false;
    }
}

Volumes::Volumes(Trial& trial, std::size_t number)
    : module_(trial), scratch_(FolderOf(trial, number)), folder_(scratch_ / "movies") {
    module_.Start();
    MakeFolder(folder_);
    movies_ = WriteSoundMovies(folder_);
    const auto [chosen, count] = Choose(
        trial, MediaOf<NMA::IMediaVolume>(module_, "volume"), number,
        [&](NMA::IMediaVolume* volume) { return DoesClaim(trial, *volume, folder_); },
        "the module's volume does not claim a folder of *.mov, and others are not made");
    volume_ = chosen.object;
    count_ = count;
}

bool Volumes::Claims(const std::filesystem::path& folder) {
    return DoesClaim(trial(), *volume_, folder);
}

void ForEachVolume(Trial& trial, const std::function<void(Volumes&)>& check) {
    OneByOne(trial, [&](std::size_t number, std::size_t& count) {
        Volumes volumes(trial, number);
        count = volumes.count();
        check(volumes);
    });
}

host::Ref<NMA::IAAFClips> Volumes::ClipsOf(const std::filesystem::path& folder) {
    const auto path = host::ModulePath(folder);
    host::Ref<NMA::IMediaFormat> format;
    NCFRESULT result = volume_->GetMediaFormat(path.get(), format.Out());
    trial().ExpectSuccess(result, "GetMediaFormat succeeds for a folder that is claimed");
    trial().Expect(static_cast<bool>(format), "a format", "null");
    host::Ref<NMA::IAAFClips> clips;
    result = format->GetAAFClips(clips.Out());
    trial().ExpectSuccess(result, "GetAAFClips succeeds for a folder that is claimed");
    trial().Expect(static_cast<bool>(clips), "a list of clips", "null");
    return clips;
}

}  // namespace validate
