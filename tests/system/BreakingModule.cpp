// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// A module that does to its process what a movie might that breaks a decoder: which harm, the
// movie's name says. Everything else it leaves to the real module.

#include <cstddef>
#include <filesystem>
#include <string>
#include <utility>

#include "host_interfaces/framework/PluginEntry.h"
#include "host_interfaces/media/MediaContainer.h"
#include "host_interfaces/media/SampleMapping.h"
#include "reference_host/util/Ref.h"
#include "reference_host/util/text/HostText.h"
#include "tests/system/Harms.h"

namespace {

template <class Function>
Function Real(const char* name) {
    return reinterpret_cast<Function>(RealFunction(name));
}

// The harm in a name such as "crash-at-40" is done once frame 40 is asked for; "" where that is
// not the name's form.
std::string HarmAt(const std::filesystem::path& movie, ncfUInt64 frame) {
    const std::string stem = movie.stem().u8string(), ending = "-at-" + std::to_string(frame);
    const bool isHere = stem.size() > ending.size() &&
                        stem.compare(stem.size() - ending.size(), ending.size(), ending) == 0;
    return isHere ? stem.substr(0, stem.size() - ending.size()) : std::string();
}

// Both interfaces of the mapping that a host reads frames through.
class Mapping final : public NMA::ISampleMapping, public NMA::ISampleProvider {
public:
    Mapping(host::Ref<NMA::ISampleMapping> real, std::filesystem::path movie)
        : real_(std::move(real)), movie_(std::move(movie)) {
        real_->QueryInterface(NMA::IID_ISampleProvider, reinterpret_cast<void**>(provider_.Out()));
    }

    NCFRESULT QueryInterface(const GUID& iid, void** out) override {
        if (iid == NMA::IID_ISampleProvider) {
            *out = static_cast<NMA::ISampleProvider*>(this);
        } else if (iid == NMA::IID_ISampleMapping) {
            *out = static_cast<NMA::ISampleMapping*>(this);
        } else {
            return real_->QueryInterface(iid, out);
        }
        AddRef();
        return NCF_OK;
    }
    ncfUInt32 AddRef() override { return ++references_; }
    ncfUInt32 Release() override {
        const ncfUInt32 left = --references_;
        if (left == 0) {
            delete this;
        }
        return left;
    }

    NCFRESULT ProvideSampleRange(INCFAVBuffer* request, ncfUInt32 flags) override {
        ncfUInt32 track = 0;
        ncfUInt64 frame = 0, count = 0;
        request->GetSampleRange(&track, &frame, &count);
        DoHarm(HarmAt(movie_, frame), movie_);
        return provider_->ProvideSampleRange(request, flags);
    }
    NCFRESULT Setup(ncfUInt32 track) override {
        // The process that reads a range's plan has no folder.
        if (movie_.stem() == "crash-at-setup" && !OwnFolder().empty()) {
            DoHarm("crash", movie_);
        }
        return provider_->Setup(track);
    }
    NCFRESULT ProviderUnsupportedOperation(ncfUInt32 track, ncfUInt64 a, ncfUInt64 b) override {
        return provider_->ProviderUnsupportedOperation(track, a, b);
    }
    NCFRESULT ProviderNoOperationA(ncfUInt32 track, ncfUInt64 a, ncfUInt64 b) override {
        return provider_->ProviderNoOperationA(track, a, b);
    }
    NCFRESULT ProviderNoOperationB() override { return provider_->ProviderNoOperationB(); }
    NCFRESULT Cleanup(ncfUInt32 track) override { return provider_->Cleanup(track); }

    ncfSInt32 GetNumberOfTracks() override { return real_->GetNumberOfTracks(); }
    NCFRESULT GetNumberOfChannels(ncfUInt32 track, ncfUInt32* out) override {
        return real_->GetNumberOfChannels(track, out);
    }
    NCFRESULT GetNumberOfSamples(ncfUInt32 track, ncfUInt64* out) override {
        return real_->GetNumberOfSamples(track, out);
    }
    NCFRESULT GetSampleStride(ncfUInt32 track, ncfUInt64 sample, ncfUInt64* out) override {
        return real_->GetSampleStride(track, sample, out);
    }
    NCFRESULT GetSampleSize(ncfUInt32 track, ncfUInt64 sample, ncfUInt64* out) override {
        return real_->GetSampleSize(track, sample, out);
    }
    NCFRESULT GetSamplePosition(ncfUInt32 track, ncfUInt64 sample, ncfUInt64* out) override {
        return real_->GetSamplePosition(track, sample, out);
    }
    NCFRESULT GetSampleTemporalOffset(ncfUInt32 track, ncfUInt64 sample, ncfSInt64* out) override {
        return real_->GetSampleTemporalOffset(track, sample, out);
    }
    NCFRESULT GetSampleProperties(ncfUInt32 track, ncfUInt64 sample, ncfUInt64* flags,
                                  ncfUInt32* dependencies) override {
        return real_->GetSampleProperties(track, sample, flags, dependencies);
    }
    NCFRESULT GetSampleDependency(ncfUInt32 track, ncfUInt64 sample, ncfUInt32 a,
                                  ncfSInt64* out) override {
        return real_->GetSampleDependency(track, sample, a, out);
    }
    NCFRESULT GetNumberOfEncodedUnits(ncfUInt32 track, ncfUInt64* out) override {
        return real_->GetNumberOfEncodedUnits(track, out);
    }
    NCFRESULT GetEncodedUnitStride(ncfUInt32 track, ncfUInt64 unit, ncfUInt64* out) override {
        return real_->GetEncodedUnitStride(track, unit, out);
    }
    NCFRESULT GetEncodedUnitPosition(ncfUInt32 track, ncfUInt64 unit, ncfUInt64* out) override {
        return real_->GetEncodedUnitPosition(track, unit, out);
    }
    NCFRESULT GetEncodedUnitSize(ncfUInt32 track, ncfUInt64 unit, ncfUInt64* out) override {
        return real_->GetEncodedUnitSize(track, unit, out);
    }
    NCFRESULT GetEncodedUnitSizeInSamples(ncfUInt32 track, ncfUInt64 unit,
                                          ncfUInt64* out) override {
        return real_->GetEncodedUnitSizeInSamples(track, unit, out);
    }
    NCFRESULT GetEncodedUnitFirstSample(ncfUInt32 track, ncfUInt64 unit, ncfUInt64* out) override {
        return real_->GetEncodedUnitFirstSample(track, unit, out);
    }
    NCFRESULT GetEncodedUnitContainingSample(ncfUInt32 track, ncfUInt64 sample,
                                             ncfUInt64* out) override {
        return real_->GetEncodedUnitContainingSample(track, sample, out);
    }
    NCFRESULT GetNumberOfContiguousSamples(ncfUInt32 track, ncfUInt64 sample,
                                           ncfSInt64* out) override {
        return real_->GetNumberOfContiguousSamples(track, sample, out);
    }
    NCFRESULT GetNumberOfContiguousBytes(ncfUInt32 track, ncfUInt64 sample,
                                         ncfUInt64* out) override {
        return real_->GetNumberOfContiguousBytes(track, sample, out);
    }
    NCFRESULT GetNumberOfContiguousEncodedUnits(ncfUInt32 track, ncfUInt64 unit,
                                                ncfSInt64* out) override {
        return real_->GetNumberOfContiguousEncodedUnits(track, unit, out);
    }
    NCFRESULT RegisterSampleRangeHint(ncfUInt32 track, ncfUInt64 a, ncfUInt64 b) override {
        return real_->RegisterSampleRangeHint(track, a, b);
    }
    NCFRESULT UnregisterSampleRangeHint(ncfUInt32 track, ncfUInt64 a, ncfUInt64 b) override {
        return real_->UnregisterSampleRangeHint(track, a, b);
    }
    NCFRESULT SetStorageCallback(INCFUnknown* callback) override {
        return real_->SetStorageCallback(callback);
    }

private:
    ~Mapping() = default;

    host::Ref<NMA::ISampleMapping> real_;
    host::Ref<NMA::ISampleProvider> provider_;
    std::filesystem::path movie_;
    ncfUInt32 references_ = 1;
};

class Container final : public NMA::IMediaContainer3 {
public:
    explicit Container(host::Ref<NMA::IMediaContainer3> real) : real_(std::move(real)) {}

    NCFRESULT QueryInterface(const GUID& iid, void** out) override {
        *out = nullptr;
        for (const GUID& own : {IID_INCFUnknown, NMA::IID_IMediaContainer,
                                NMA::IID_IMediaContainer2, NMA::IID_IMediaContainer3}) {
            if (iid == own) {
                AddRef();
                *out = static_cast<NMA::IMediaContainer3*>(this);
                return NCF_OK;
            }
        }
        return real_->QueryInterface(iid, out);
    }
    ncfUInt32 AddRef() override { return ++references_; }
    ncfUInt32 Release() override {
        const ncfUInt32 left = --references_;
        if (left == 0) {
            delete this;
        }
        return left;
    }

    NCFRESULT IsContainerSupported() override { return real_->IsContainerSupported(); }
    NCFRESULT ContainerFlag() override { return real_->ContainerFlag(); }
    NCFRESULT ContainerUnsupportedA(void* a, void* b, void* c) override {
        return real_->ContainerUnsupportedA(a, b, c);
    }
    NCFRESULT GetAAFMasterClips(NMA::IAAFClips** clips) override {
        DoHarm(movie_.stem().u8string(), movie_);
        return real_->GetAAFMasterClips(clips);
    }
    NCFRESULT SetFilePath(INCFString* path) override {
        std::string name = host::text::ReadUtf8(path);
        for (char& c : name) {
            c = c == '\\' ? '/' : c;
        }
        movie_ = std::filesystem::u8path(name);
        return real_->SetFilePath(path);
    }
    NCFRESULT GetSampleMapping(NMA::ISampleMapping** mapping) override {
        host::Ref<NMA::ISampleMapping> real;
        const NCFRESULT result = real_->GetSampleMapping(real.Out());
        *mapping = real ? new Mapping(real, movie_) : nullptr;
        return result;
    }
    NCFRESULT ContainerUnsupportedB(void* reserved) override {
        return real_->ContainerUnsupportedB(reserved);
    }
    NCFRESULT GetCapabilities(ncfUInt32* flags) override { return real_->GetCapabilities(flags); }
    ncfUInt32 GetFileTypeCount() override { return real_->GetFileTypeCount(); }
    NCFRESULT GetFileType(ncfUInt32 index, INCFString** extension, INCFString** description,
                          INCFString** group) override {
        return real_->GetFileType(index, extension, description, group);
    }

private:
    ~Container() = default;

    host::Ref<NMA::IMediaContainer3> real_;
    std::filesystem::path movie_;
    ncfUInt32 references_ = 1;
};

class Factory final : public INCFClassFactory {
public:
    explicit Factory(host::Ref<INCFClassFactory> real) : real_(std::move(real)) {}

    NCFRESULT QueryInterface(const GUID& iid, void** out) override {
        *out = nullptr;
        if (iid != IID_INCFUnknown && iid != IID_INCFClassFactory) {
            return NCF_E_NOINTERFACE;
        }
        AddRef();
        *out = this;
        return NCF_OK;
    }
    ncfUInt32 AddRef() override { return ++references_; }
    ncfUInt32 Release() override {
        const ncfUInt32 left = --references_;
        if (left == 0) {
            delete this;
        }
        return left;
    }
    NCFRESULT CreateInstance(INCFUnknown* host, INCFUnknown* outer, const GUID& iid,
                             void** out) override {
        *out = nullptr;
        host::Ref<NMA::IMediaContainer3> real;
        real_->CreateInstance(host, outer, NMA::IID_IMediaContainer3,
                              reinterpret_cast<void**>(real.Out()));
        if (!real) {
            return real_->CreateInstance(host, outer, iid, out);  // another class
        }
        auto* const container = new Container(real);
        const NCFRESULT result = container->QueryInterface(iid, out);
        container->Release();
        return result;
    }

private:
    ~Factory() = default;

    host::Ref<INCFClassFactory> real_;
    ncfUInt32 references_ = 1;
};

}  // namespace

NCF_PLUGIN_EXPORT NCFRESULT NCFRegisterPlugin(INCFUnknown* host, INCFPluginDefinition** out) {
    return Real<NCFRegisterPluginFunction>("NCFRegisterPlugin")(host, out);
}

NCF_PLUGIN_EXPORT NCFRESULT NCFRegisterComponent(INCFUnknown* host, ncfUInt32 index,
                                                 INCFComponentDefinition** out) {
    return Real<NCFRegisterComponentFunction>("NCFRegisterComponent")(host, index, out);
}

NCF_PLUGIN_EXPORT NCFRESULT NCFGetClassFactory(INCFUnknown* host, const GUID& classId,
                                               const GUID& interfaceId, void** out) {
    *out = nullptr;
    host::Ref<INCFClassFactory> real;
    const NCFRESULT made = Real<NCFGetClassFactoryFunction>("NCFGetClassFactory")(
        host, classId, IID_INCFClassFactory, reinterpret_cast<void**>(real.Out()));
    if (made < 0) {
        return made;
    }
    auto* const factory = new Factory(real);
    const NCFRESULT result = factory->QueryInterface(interfaceId, out);
    factory->Release();
    return result;
}

NCF_PLUGIN_EXPORT NCFRESULT NCFCanUnloadNow(INCFUnknown* host) {
    return Real<NCFCanUnloadNowFunction>("NCFCanUnloadNow")(host);
}

NCF_PLUGIN_EXPORT NCFRESULT NCFStartup(INCFUnknown* host) {
    return Real<NCFStartupFunction>("NCFStartup")(host);
}

NCF_PLUGIN_EXPORT NCFRESULT NCFShutdown(INCFUnknown* host) {
    return Real<NCFShutdownFunction>("NCFShutdown")(host);
}
