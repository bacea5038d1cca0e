// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Volume and container of the faulty module. They look at the first bytes of a file alone.

#include <algorithm>
#include <array>
#include <cstdio>
#include <cstring>
#include <fstream>
#include <thread>
#include <vector>

#include "host_interfaces/framework/Lock.h"
#include "host_interfaces/media/MediaContainer.h"
#include "host_interfaces/media/MediaVolume.h"
#include "host_interfaces/media/SampleMapping.h"
#include "reference_host/framework/HostPath.h"
#include "reference_host/util/Ref.h"
#include "tests/system/validate/FaultyDescription.h"
#include "tests/system/validate/FaultyObject.h"

namespace faulty {
namespace {

namespace fs = std::filesystem;

std::uintmax_t SizeOf(const fs::path& file) {
    std::error_code error;
    const std::uintmax_t size = fs::file_size(file, error);
    return error ? 0 : size;
}

bool IsMovie(const fs::path& file) {
    std::array<char, 8> start{};
    std::ifstream stream(file, std::ios::binary);
    std::error_code error;
    return fs::is_regular_file(file, error) && stream.read(start.data(), start.size()) &&
           std::memcmp(start.data() + 4, "ftyp", 4) == 0;
}

// Whether an entry of a folder has this ending.
bool HasEntry(const fs::path& folder, const char* ending) {
    std::error_code error;
    for (const auto& entry : fs::directory_iterator(folder, error)) {
        if (entry.path().extension() == ending) {
            return true;
        }
    }
    return false;
}

fs::path PathOf(INCFString* text) {
    fs::path path;
    host::PathFrom(text, path);
    return path;
}

NCFRESULT GiveText(INCFUnknown* host, const char* text, INCFString** out) {
    if (out == nullptr) {
        if (Is("container-file-types")) {
            Crash();
        }
        return NCF_OK;
    }
    *out = Service<INCFString>(host, NCFCompID_NCFString);
    if (*out == nullptr && (Is("volume-creations-refused") || Is("volume-queries-refused"))) {
        Crash();
    }
    return *out == nullptr ? NCF_E_OUTOFMEMORY
                           : (*out)->AssignUTF8(kNCFUTF16, text, kNCFZeroTerminated);
}

class Mapping final : public Face<NMA::ISampleMapping>, public Object {
public:
    Mapping() : Object(nullptr) {}

    void LoseContainer() { isLost_ = true; }

    ncfSInt32 GetNumberOfTracks() override { return Is("mapping-tracks") ? -1 : kTracks; }
    NCFRESULT GetNumberOfChannels(ncfUInt32 track, ncfUInt32* channels) override {
        if (channels == nullptr) {
            return WithoutOutput();
        }
        *channels = Is("mapping-samples") ? 0 : 1;
        return Result(track, 0);
    }
    NCFRESULT GetNumberOfSamples(ncfUInt32 track, ncfUInt64* samples) override {
        if (samples == nullptr) {
            return NCF_E_INVALIDARG;
        }
        *samples = kSamples;
        const bool isSilent = track == 0 && Is("first-track-without-samples");
        return isLost_ || isSilent ? NCF_E_FAIL : Result(track, 0);
    }
    NCFRESULT GetSampleStride(ncfUInt32, ncfUInt64, ncfUInt64*) override { return NCF_E_NOTIMPL; }
    NCFRESULT GetSampleSize(ncfUInt32 track, ncfUInt64 sample, ncfUInt64* size) override {
        if (size == nullptr) {
            return NCF_E_INVALIDARG;
        }
        *size = kBytes;
        return Result(track, sample);
    }
    NCFRESULT GetSamplePosition(ncfUInt32 track, ncfUInt64 sample, ncfUInt64* position) override {
        if (position == nullptr) {
            return NCF_E_INVALIDARG;
        }
        const ncfUInt64 start = Is("mapping-in-file") ? ncfUInt64{1} << 40 : 16;
        *position = start + sample * kBytes;
        if (Is("mapping-other-samples") && sample >= kSamples) {
            *position = ncfUInt64{1} << 40;
            return NCF_OK;
        }
        return Result(track, sample);
    }
    NCFRESULT GetSampleTemporalOffset(ncfUInt32, ncfUInt64, ncfSInt64*) override {
        return NCF_E_NOTIMPL;
    }
    NCFRESULT GetSampleProperties(ncfUInt32, ncfUInt64, ncfUInt64*, ncfUInt32*) override {
        return NCF_E_NOTIMPL;
    }
    NCFRESULT GetSampleDependency(ncfUInt32, ncfUInt64, ncfUInt32, ncfSInt64*) override {
        return NCF_E_NOTIMPL;
    }
    NCFRESULT GetNumberOfEncodedUnits(ncfUInt32, ncfUInt64*) override { return NCF_E_NOTIMPL; }
    NCFRESULT GetEncodedUnitStride(ncfUInt32, ncfUInt64, ncfUInt64*) override {
        return NCF_E_NOTIMPL;
    }
    NCFRESULT GetEncodedUnitPosition(ncfUInt32, ncfUInt64, ncfUInt64*) override {
        return NCF_E_NOTIMPL;
    }
    NCFRESULT GetEncodedUnitSize(ncfUInt32, ncfUInt64, ncfUInt64*) override {
        return NCF_E_NOTIMPL;
    }
    NCFRESULT GetEncodedUnitSizeInSamples(ncfUInt32, ncfUInt64, ncfUInt64*) override {
        return NCF_E_NOTIMPL;
    }
    NCFRESULT GetEncodedUnitFirstSample(ncfUInt32, ncfUInt64, ncfUInt64*) override {
        return NCF_E_NOTIMPL;
    }
    NCFRESULT GetEncodedUnitContainingSample(ncfUInt32, ncfUInt64, ncfUInt64*) override {
        return NCF_E_NOTIMPL;
    }
    NCFRESULT GetNumberOfContiguousSamples(ncfUInt32, ncfUInt64, ncfSInt64*) override {
        return NCF_E_NOTIMPL;
    }
    NCFRESULT GetNumberOfContiguousBytes(ncfUInt32, ncfUInt64, ncfUInt64*) override {
        return NCF_E_NOTIMPL;
    }
    NCFRESULT GetNumberOfContiguousEncodedUnits(ncfUInt32, ncfUInt64, ncfSInt64*) override {
        return NCF_E_NOTIMPL;
    }
    NCFRESULT RegisterSampleRangeHint(ncfUInt32, ncfUInt64, ncfUInt64) override {
        return NCF_E_NOTIMPL;
    }
    NCFRESULT UnregisterSampleRangeHint(ncfUInt32, ncfUInt64, ncfUInt64) override {
        return NCF_E_NOTIMPL;
    }
    NCFRESULT SetStorageCallback(INCFUnknown*) override { return NCF_E_NOTIMPL; }

private:
    static constexpr ncfSInt32 kTracks = 2;
    static constexpr ncfUInt64 kSamples = 25;
    static constexpr ncfUInt64 kBytes = 100;

    static NCFRESULT WithoutOutput() {
        return Is("mapping-null-outputs") ? NCF_OK : NCF_E_INVALIDARG;
    }
    static NCFRESULT Result(ncfUInt32 track, ncfUInt64 sample) {
        const bool isThere = track < kTracks || Is("mapping-other-tracks");
        return isThere && sample < kSamples ? NCF_OK : NCF_E_FAIL;
    }
    Object& self() override { return *this; }
    INCFUnknown* Find(const GUID& iid) override {
        return iid == NMA::IID_ISampleMapping ? static_cast<Face<NMA::ISampleMapping>*>(this)
                                              : nullptr;
    }

    bool isLost_ = false;
};

// What a file does to a container that is wrong in how it reads.
void SufferFrom(const fs::path& file) {
    const std::uintmax_t size = SizeOf(file);
    if ((Is("files-broken") && size == 0) || (Is("fuzz-movies") && size % 2 == 1)) {
        Crash();
    }
    while (Is("files-hostile") && file.filename() == "nested.mov") {
        std::this_thread::sleep_for(std::chrono::hours(1));
    }
}

// The list of one clip, and how a wrong container answers queries from it.
class ClipsFace : public Face<NMA::IAAFClips> {
protected:
    ~ClipsFace() = default;
    NCFRESULT Ask(const GUID& iid, void** out) override {
        const bool isForeign = iid == NMA::IID_IMediaContainer;
        if (Is("query-root") && iid == IID_INCFUnknown) {
            AddRef();
            *out = this;
            return NCF_OK;
        }
        if ((Is("query-reflexive") && iid == NMA::IID_IAAFClips) ||
            (Is("query-symmetric") && isForeign) || (Is("query-transitive") && isForeign)) {
            *out = nullptr;
            return NCF_E_NOINTERFACE;
        }
        return Face::Ask(iid, out);
    }
};

class Container final : public Face<NMA::IMediaContainer3>, public ClipsFace, public Object {
public:
    // One that claims files with this ending.
    Container(INCFUnknown* host, INCFUnknown* outer, const char* ending, bool describes = true)
        : Object(outer), host_(host), ending_(ending), describes_(describes) {}

    NCFRESULT IsContainerSupported() override {
        SufferFrom(path());
        return IsMovie(path()) && !Is("container-supports") ? 1 : 0;
    }
    NCFRESULT ContainerFlag() override { return 1; }
    NCFRESULT ContainerUnsupportedA(void*, void*, void*) override { return NCF_E_NOTIMPL; }
    NCFRESULT ContainerUnsupportedB(void*) override { return NCF_E_NOTIMPL; }

    NCFRESULT SetFilePath(INCFString* path) override {
        if (!path_.empty() && !Is("container-path-once")) {
            return NMA_E_ALREADYSET;
        }
        if (path == nullptr || Is("container-takes-path")) {
            return Is("container-null-arguments") ? NCF_OK : NCF_E_INVALIDARG;
        }
        path_ = PathOf(path);
        if (Is("container-path-copied")) {
            kept_ = host::Ref<INCFString>(path);
        }
        return path_.empty() ? NCF_E_INVALIDARG : NCF_OK;
    }

    NCFRESULT GetAAFMasterClips(NMA::IAAFClips** clips) override {
        if (clips == nullptr) {
            return NCF_E_INVALIDARG;
        }
        *clips = nullptr;
        const NCFRESULT result = Describe();
        if (result >= 0) {
            static_cast<ClipsFace*>(this)->AddRef();
            *clips = this;
        }
        return result;
    }

    NCFRESULT GetSampleMapping(NMA::ISampleMapping** mapping) override {
        if (mapping == nullptr) {
            return NCF_E_INVALIDARG;
        }
        *mapping = nullptr;
        if (!IsMovie(path())) {
            return NCF_E_FAIL;
        }
        if (Is("leaks-mappings")) {
            Leak();
        }
        INCFLock* const lock = Service<INCFLock>(host_.get(), CompID_LockComponent);
        if (lock == nullptr) {
            return Is("mapping-creations-refused") || Is("mapping-queries-refused")
                       ? NCF_OK
                       : NCF_E_OUTOFMEMORY;
        }
        lock->Release();
        auto* const made = new Mapping;
        *mapping = made;
        if (Is("mapping-outlives")) {
            made->AddRef();
            mapping_ = host::Ref<Mapping>::Adopt(made);
        }
        return NCF_OK;
    }

    NCFRESULT GetCapabilities(ncfUInt32* flags) override {
        if (flags == nullptr) {
            return NCF_E_INVALIDARG;
        }
        if (!Is("container-capabilities")) {
            *flags = 1;
        }
        return NCF_OK;
    }
    ncfUInt32 GetFileTypeCount() override { return 1; }
    NCFRESULT GetFileType(ncfUInt32 index, INCFString** extension, INCFString** description,
                          INCFString** group) override {
        if (index >= 1) {
            return NCF_E_NOTFOUND;
        }
        const NCFRESULT results[] = {GiveText(host_.get(), ending_, extension),
                                     GiveText(host_.get(), "Movies", description),
                                     GiveText(host_.get(), "Media", group)};
        return *std::min_element(std::begin(results), std::end(results));
    }

    ncfSInt32 GetCount() override { return 1; }
    NCFRESULT GetMetadata(ncfSInt32 index, IAAFFile** file) override {
        *file = nullptr;
        if (index != 0) {
            return Is("description-index") ? NCF_E_INVALIDARG : NCF_E_NOTFOUND;
        }
        if (description_ == nullptr) {
            return NCF_E_FAIL;
        }
        description_->AddRef();
        *file = description_;
        return NCF_OK;
    }
    NCFRESULT GetClipPath(ncfSInt32, INCFString*) override { return NCF_E_NOTIMPL; }

private:
    ~Container() override {
        if (mapping_) {
            mapping_->LoseContainer();
        }
        DropDescription();
    }
    Object& self() override { return *this; }
    INCFUnknown* Find(const GUID& iid) override {
        if (iid == NMA::IID_IAAFClips) {
            return static_cast<ClipsFace*>(this);
        }
        const bool isContainer = iid == NMA::IID_IMediaContainer ||
                                 iid == NMA::IID_IMediaContainer2 ||
                                 iid == NMA::IID_IMediaContainer3;
        return isContainer ? static_cast<Face<NMA::IMediaContainer3>*>(this) : nullptr;
    }

    fs::path path() const { return kept_ ? PathOf(kept_.get()) : path_; }

    void DropDescription() {
        if (description_ != nullptr) {
            if (Is("description-outlives")) {
                CloseDescription(description_);
            }
            description_->Release();
            description_ = nullptr;
        }
    }

    // Whether something that should not matter keeps the file from being described.
    bool IsWronglyRefused() const {
        static bool wasBad = false;
        wasBad = wasBad || !IsMovie(path());
        return (Is("container-describes-again") && description_ != nullptr) ||
               (Is("container-threads") && !IsFirstThread()) ||
               (Is("container-odd-names") && path().native().find('%') != std::string::npos) ||
               (Is("files-good-after-bad") && wasBad);
    }

    // Does beside describing what no container should.
    void DoMoreThanDescribe() {
        if (Is("container-closes-file")) {
            TheState().forgotten = std::fopen(path().c_str(), "rb");
        }
        if (Is("container-leaves-file")) {
            std::ofstream(path().native() + ".cache") << "cache";
        }
        if (Is("container-leaves-nothing") || (Is("files-huge") && SizeOf(path()) > 0xFFFFFFFFu)) {
            OwnAddRef();
        }
        if (Is("leaks-descriptions")) {
            Leak();
        }
    }

    NCFRESULT Describe() {
        const fs::path file = path();
        SufferFrom(file);
        if (Is("container-without-path") && file.empty()) {
            description_ = NewDescription(file);
            return NCF_OK;
        }
        if (Is("files-that-change") && size_ > SizeOf(file)) {
            Crash();
        }
        size_ = SizeOf(file);
        if (!IsMovie(file) && !Is("container-missing-file")) {
            if (Is("leaks-broken-files")) {
                Leak();
            }
            IsWronglyRefused();
            return NCF_E_FAIL;
        }
        if (IsWronglyRefused() || !describes_ || Is("container-describes")) {
            return NCF_E_FAIL;
        }
        void* factory = nullptr;
        if (host_->QueryInterface(IID_INCFComponentFactory, &factory) < 0) {
            if (Is("container-queries-refused")) {
                Crash();
            }
            return NCF_E_OUTOFMEMORY;
        }
        static_cast<INCFUnknown*>(factory)->Release();
        INCFLock* const lock = Service<INCFLock>(host_.get(), CompID_LockComponent);
        if (lock == nullptr) {
            if (Is("container-creations-refused")) {
                Crash();
            }
            return NCF_E_OUTOFMEMORY;
        }
        lock->Lock();
        if (!Is("container-locks")) {
            lock->Unlock();
        }
        lock->Release();
        DropDescription();
        description_ = NewDescription(file);
        DoMoreThanDescribe();
        return NCF_OK;
    }

    host::Ref<INCFUnknown> host_;
    const char* ending_;
    bool describes_;
    host::Ref<INCFString> kept_;
    host::Ref<Mapping> mapping_;
    fs::path path_;
    std::uintmax_t size_ = 0;
    IAAFFile* description_ = nullptr;
};

// The movies of a folder.
class FolderClips final : public Face<NMA::IAAFClips>, public Object {
public:
    FolderClips(const fs::path& folder, const char* ending) : Object(nullptr) {
        std::error_code error;
        for (const auto& entry : fs::directory_iterator(folder, error)) {
            if (entry.path().extension() == ending) {
                files_.push_back(entry.path());
            }
        }
    }
    void Forget() { files_.clear(); }

    ncfSInt32 GetCount() override { return static_cast<ncfSInt32>(files_.size()); }
    NCFRESULT GetMetadata(ncfSInt32 index, IAAFFile** file) override {
        if (file == nullptr) {
            return NCF_E_INVALIDARG;
        }
        *file = nullptr;
        if (index < 0 || index >= GetCount()) {
            return Is("volume-clip-index") ? NCF_E_INVALIDARG : NCF_E_NOTFOUND;
        }
        const fs::path& path = files_[static_cast<std::size_t>(index)];
        if (Is("volume-bad-files") && SizeOf(path) == 0) {
            Crash();
        }
        if (Is("volume-clip-descriptions")) {
            return NCF_OK;
        }
        if (!IsMovie(path)) {
            return NCF_E_FAIL;
        }
        *file = NewDescription(path);
        return NCF_OK;
    }
    NCFRESULT GetClipPath(ncfSInt32 index, INCFString* path) override {
        if (index < 0 || index >= GetCount()) {
            return NCF_E_NOTFOUND;
        }
        if (path == nullptr) {
            return NCF_E_INVALIDARG;
        }
        const auto at = static_cast<std::size_t>(Is("volume-clip-paths") ? 0 : index);
        return path->Assign(host::ModulePath(files_[at]).get());
    }

private:
    Object& self() override { return *this; }
    INCFUnknown* Find(const GUID& iid) override {
        return iid == NMA::IID_IAAFClips ? static_cast<Face<NMA::IAAFClips>*>(this) : nullptr;
    }

    std::vector<fs::path> files_;
};

// The list of a folder that a wrong volume takes with it.
host::Ref<FolderClips> volumesClips;

class Format final : public Face<NMA::IMediaFormat>, public Object {
public:
    Format(fs::path folder, const char* ending)
        : Object(nullptr), folder_(std::move(folder)), ending_(ending) {}

    ncfBool FormatFlagA() override { return 1; }
    ncfBool FormatFlagB() override { return 0; }
    ncfBool FormatFlagC() override { return 0; }
    ncfBool FormatFlagD() override { return 1; }
    NCFRESULT FormatUnsupportedA(void*) override { return NCF_E_FAIL; }
    NCFRESULT FormatUnsupportedB(void*) override { return NCF_E_FAIL; }
    NCFRESULT GetAAFClips(NMA::IAAFClips** clips) override {
        if (clips == nullptr) {
            return NCF_E_INVALIDARG;
        }
        auto* const made = new FolderClips(folder_, ending_);
        if (Is("volume-format")) {
            made->Forget();
        }
        if (Is("volume-released-first")) {
            volumesClips = host::Ref<FolderClips>(made);
        }
        *clips = made;
        return NCF_OK;
    }

private:
    Object& self() override { return *this; }
    INCFUnknown* Find(const GUID& iid) override {
        return iid == NMA::IID_IMediaFormat ? static_cast<Face<NMA::IMediaFormat>*>(this) : nullptr;
    }

    fs::path folder_;
    const char* ending_;
};

class VolumeInfo final : public Face<NMA::IVolumeInfo>, public Object {
public:
    explicit VolumeInfo(INCFUnknown* host) : Object(nullptr), host_(host) {}

    NCFRESULT GetSerialNumber(ncfUInt32* serial) override {
        if (serial == nullptr) {
            return NCF_E_INVALIDARG;
        }
        *serial = 0;
        return NCF_OK;
    }
    NCFRESULT GetLabel(INCFString** label) override {
        return label == nullptr ? NCF_E_INVALIDARG : GiveText(host_.get(), "", label);
    }
    NCFRESULT GetType(ncfUInt32* type) override {
        if (type == nullptr) {
            return NCF_E_INVALIDARG;
        }
        *type = Is("volume-info") ? 7 : 3;
        return NCF_OK;
    }
    NCFRESULT GetModificationDate(ncfUInt32* date) override {
        if (date == nullptr) {
            return Is("volume-null-arguments") ? NCF_OK : NCF_E_INVALIDARG;
        }
        *date = 1;
        return NCF_OK;
    }
    NCFRESULT VolumeQueryA(void*) override { return NMA_E_NODATA; }
    NCFRESULT VolumeQueryB() override { return 1; }
    NCFRESULT VolumeQueryC() override { return 1; }
    NCFRESULT VolumeQueryD() override { return -1; }

private:
    Object& self() override { return *this; }
    INCFUnknown* Find(const GUID& iid) override {
        return iid == NMA::IID_IVolumeInfo ? static_cast<Face<NMA::IVolumeInfo>*>(this) : nullptr;
    }

    host::Ref<INCFUnknown> host_;
};

class Volume final : public Face<NMA::IMediaVolume>, public Object {
public:
    // One that claims folders of files with one ending, and lists those with another.
    Volume(INCFUnknown* host, INCFUnknown* outer, const char* claimed, const char* listed)
        : Object(outer), host_(host), claimed_(claimed), listed_(listed) {}

    NCFRESULT IsMediaVolume(INCFString* path) override {
        if (path == nullptr || Is("volume-claims") || (Is("volume-claims-again") && wasAsked_)) {
            return 0;
        }
        wasAsked_ = true;
        return HasEntry(PathOf(path), claimed_) || Is("volume-other-folders") ? 1 : 0;
    }
    NCFRESULT GetVolumeInfo(INCFString* path, NMA::IVolumeInfo** info) override {
        if (path == nullptr || info == nullptr) {
            return NCF_E_INVALIDARG;
        }
        if (Is("leaks-volumes")) {
            Leak();
        }
        *info = new VolumeInfo(host_.get());
        return NCF_OK;
    }
    NCFRESULT GetMediaFormat(INCFString* path, NMA::IMediaFormat** format) override {
        if (path == nullptr || format == nullptr) {
            return NCF_E_INVALIDARG;
        }
        *format = new Format(PathOf(path), listed_);
        return NCF_OK;
    }
    NCFRESULT GetContainerComponentId(GUID* id) override {
        if (id == nullptr) {
            return NCF_E_INVALIDARG;
        }
        *id = Is("volume-container-id") ? kContainerClass : kContainerComponent;
        return NCF_OK;
    }

private:
    ~Volume() override {
        if (volumesClips) {
            volumesClips->Forget();
            volumesClips.Reset();
        }
    }
    Object& self() override { return *this; }
    INCFUnknown* Find(const GUID& iid) override {
        return iid == NMA::IID_IMediaVolume ? static_cast<Face<NMA::IMediaVolume>*>(this) : nullptr;
    }

    host::Ref<INCFUnknown> host_;
    const char* claimed_;
    const char* listed_;
    bool wasAsked_ = false;
};

}  // namespace

NCFRESULT MakeVolume(INCFUnknown* host, INCFUnknown* outer, Object** made) {
    *made = new Volume(host, outer, ".mov", ".mov");
    return NCF_OK;
}

NCFRESULT MakeContainer(INCFUnknown* host, INCFUnknown* outer, Object** made) {
    *made = new Container(host, outer, "MOV");
    return NCF_OK;
}

NCFRESULT MakeTextVolume(INCFUnknown* host, INCFUnknown* outer, Object** made) {
    *made = new Volume(host, outer, ".txt", ".txt");
    return NCF_OK;
}

NCFRESULT MakeTextContainer(INCFUnknown* host, INCFUnknown* outer, Object** made) {
    *made = new Container(host, outer, "TXT");
    return NCF_OK;
}

NCFRESULT MakeLastVolume(INCFUnknown* host, INCFUnknown* outer, Object** made) {
    *made = new Volume(host, outer, Is("last-volume") ? ".mov" : ".txt", ".txt");
    return NCF_OK;
}

NCFRESULT MakeLastContainer(INCFUnknown* host, INCFUnknown* outer, Object** made) {
    *made = new Container(host, outer, Is("last-container") ? "MOV" : "TXT", false);
    return NCF_OK;
}

}  // namespace faulty
