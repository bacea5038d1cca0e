// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/validate/Media.h"

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

}  // namespace

host::Ref<INCFClassFactory> FactoryOfMedia(Module& module, const GUID& interfaceId,
                                           const char* what) {
    for (const host::ComponentFacts& component : module.Components()) {
        host::Ref<INCFClassFactory> factory = FactoryOf(module, component);
        if (!factory) {
            continue;
        }
        void* out = nullptr;
        const NCFRESULT result =
            factory->CreateInstance(module.unknown(), nullptr, interfaceId, &out);
        const auto made = host::Ref<INCFUnknown>::Adopt(static_cast<INCFUnknown*>(out));
        if (result >= 0 && made) {
            return factory;
        }
    }
    module.trial().Skip(std::string("the module has no ") + what);
}

Containers::Containers(Trial& trial, const std::function<void(host::Host&)>& prepare)
    : module_(trial) {
    if (prepare) {
        prepare(module_.host());
    }
    module_.Start();
    module_.OfferComponents();
    trial.Doing("looking for a component that is a container");
    factory_ = FactoryOfMedia(module_, NMA::IID_IMediaContainer3, "container");
    if (!ClaimsMovies(New().get())) {
        trial.Skip("the module's container does not claim *.mov, and other files are not made");
    }
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

Volumes::Volumes(Trial& trial) : module_(trial), folder_(trial.folder() / "movies") {
    module_.Start();
    module_.OfferComponents();
    trial.Doing("looking for a component that is a volume");
    const auto factory = FactoryOfMedia(module_, NMA::IID_IMediaVolume, "volume");
    volume_ = Make<NMA::IMediaVolume>(module_, factory.get());
    MakeFolder(folder_);
    movies_ = WriteSoundMovies(folder_);
    if (!Claims(folder_)) {
        trial.Skip("the module's volume does not claim a folder of *.mov, and others are not made");
    }
}

bool Volumes::Claims(const std::filesystem::path& folder) {
    const auto path = host::ModulePath(folder);
    const NCFRESULT result = volume_->IsMediaVolume(path.get());
    trial().Expect(result == 0 || result == 1, "1 or 0, whatever happens", trial().Text(result));
    return result == 1;
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
