// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Descriptors and locators, and names of data definitions.

#include "host_interfaces/aaf/AAFDefinitions.h"
#include "host_interfaces/aaf/AAFDescriptors.h"
#include "host_interfaces/aaf/AAFPictureDescriptors.h"
#include "host_interfaces/aaf/AAFSoundDescriptors.h"
#include "tests/unit/aaf/support/FakeAAFObject.h"

namespace {

struct MultipleDescriptorFace final : FakeAAFFace<IAAFMultipleDescriptor> {
    using FakeAAFFace::FakeAAFFace;
    HRESULT Initialize() override { return note("Initialize"); }
    HRESULT AppendFileDescriptor(IAAFFileDescriptor* child) override {
        const HRESULT refused = note("AppendFileDescriptor", (IUnknown*)child);
        if (!refused) {
            self_.keep(FakeAAFObject::of(child));
        }
        return refused;
    }
};

struct FileDescriptorFace final : FakeAAFFace<IAAFFileDescriptor> {
    using FakeAAFFace::FakeAAFFace;
    HRESULT SetLength(aafLength_t length) override { return note("SetLength", length); }
    HRESULT SetSampleRate(aafRational_constref rate) override {
        const HRESULT refused = note("SetSampleRate", rate);
        if (!refused) {
            self_.sampleRate = rate;
        }
        return refused;
    }
    HRESULT GetSampleRate(aafRational_t* rate) override {
        const HRESULT refused = note("GetSampleRate");
        if (!refused) {
            *rate = self_.sampleRate;
        }
        return refused;
    }
    HRESULT SetContainerFormat(IAAFContainerDef* format) override {
        return note("SetContainerFormat", (IUnknown*)format);
    }
};

struct EssenceDescriptorFace final : FakeAAFFace<IAAFEssenceDescriptor> {
    using FakeAAFFace::FakeAAFFace;
    HRESULT AppendLocator(IAAFLocator* locator) override {
        return note("AppendLocator", (IUnknown*)locator);
    }
};

struct ImportDescriptorFace final : FakeAAFFace<IAAFImportDescriptor> {
    using FakeAAFFace::FakeAAFFace;
    HRESULT Initialize() override { return note("Initialize"); }
};

struct NetworkLocatorFace final : FakeAAFFace<IAAFNetworkLocator> {
    using FakeAAFFace::FakeAAFFace;
};

struct LocatorFace final : FakeAAFFace<IAAFLocator> {
    using FakeAAFFace::FakeAAFFace;
    HRESULT SetPath(aafCharacter_constptr path) override { return note("SetPath", path); }
};

struct MPEGFace final : FakeAAFFace<IAAFMPEGVideoDescriptor> {
    using FakeAAFFace::FakeAAFFace;
    HRESULT Initialize() override { return note("InitializeMPEG"); }
    HRESULT SetMaxGOP(aafUInt16 value) override { return note("SetMaxGOP", value); }
    HRESULT SetBitRate(aafUInt32 value) override { return note("SetBitRate", value); }
    HRESULT SetProfileAndLevel(aafUInt8 value) override {
        return note("SetProfileAndLevel", (int)value);
    }
};

struct RGBAFace final : FakeAAFFace<IAAFRGBADescriptor2> {
    using FakeAAFFace::FakeAAFFace;
    HRESULT SetPixelLayout(aafUInt32 count, aafRGBAComponent_t* layout) override {
        std::vector<std::string> arguments;
        for (aafUInt32 i = 0; i < count; ++i) {
            arguments.push_back(Shown(layout[i].Code) + "x" + Shown((int)layout[i].Size));
        }
        return self_.note("SetPixelLayout", arguments);
    }
    HRESULT SetComponentMaxRef(aafUInt32 value) override {
        return note("SetComponentMaxRef", value);
    }
    HRESULT SetComponentMinRef(aafUInt32 value) override {
        return note("SetComponentMinRef", value);
    }
};

struct CDCIFace final : FakeAAFFace<IAAFCDCIDescriptor> {
    using FakeAAFFace::FakeAAFFace;
    HRESULT Initialize() override { return note("Initialize"); }
    HRESULT SetComponentWidth(aafInt32 value) override { return note("SetComponentWidth", value); }
    HRESULT SetHorizontalSubsampling(aafUInt32 value) override {
        return note("SetHorizontalSubsampling", value);
    }
    HRESULT SetVerticalSubsampling(aafUInt32 value) override {
        return note("SetVerticalSubsampling", value);
    }
    HRESULT SetColorSiting(aafColorSiting_t value) override {
        return note("SetColorSiting", value);
    }
    HRESULT SetBlackReferenceLevel(aafUInt32 value) override {
        return note("SetBlackReferenceLevel", value);
    }
    HRESULT SetWhiteReferenceLevel(aafUInt32 value) override {
        return note("SetWhiteReferenceLevel", value);
    }
    HRESULT SetColorRange(aafUInt32 value) override { return note("SetColorRange", value); }
};

struct ImageFace final : FakeAAFFace<IAAFDigitalImageDescriptor> {
    using FakeAAFFace::FakeAAFFace;
    HRESULT SetCompression(aafUID_constref id) override { return note("SetCompression", id); }
    HRESULT SetStoredView(aafUInt32 height, aafUInt32 width) override {
        return note("SetStoredView", height, width);
    }
    HRESULT SetSampledView(aafUInt32 height, aafUInt32 width, aafInt32 x, aafInt32 y) override {
        return note("SetSampledView", height, width, x, y);
    }
    HRESULT SetDisplayView(aafUInt32 height, aafUInt32 width, aafInt32 x, aafInt32 y) override {
        return note("SetDisplayView", height, width, x, y);
    }
    HRESULT SetFrameLayout(aafFrameLayout_t layout) override {
        return note("SetFrameLayout", layout);
    }
    HRESULT SetVideoLineMap(aafUInt32 count, aafInt32* lines) override {
        std::vector<std::string> arguments;
        for (aafUInt32 i = 0; i < count; ++i) {
            arguments.push_back(Shown(lines[i]));
        }
        const HRESULT refused = self_.note("SetVideoLineMap", arguments);
        return refused ? refused : lines ? AAFRESULT_SUCCESS : AAFRESULT_NULL_PARAM;
    }
    HRESULT SetImageAspectRatio(aafRational_t ratio) override {
        return note("SetImageAspectRatio", ratio);
    }
};

struct ImageFace2 final : FakeAAFFace<IAAFDigitalImageDescriptor2> {
    using FakeAAFFace::FakeAAFFace;
    HRESULT SetTransferCharacteristic(aafUID_constref id) override {
        return note("SetTransferCharacteristic", id);
    }
    HRESULT SetColorPrimaries(aafUID_constref id) override { return note("SetColorPrimaries", id); }
    HRESULT SetFieldStartOffset(aafUInt32 offset) override {
        return note("SetFieldStartOffset", offset);
    }
};

struct PCMFace final : FakeAAFFace<IAAFPCMDescriptor> {
    using FakeAAFFace::FakeAAFFace;
    HRESULT Initialize() override { return note("Initialize"); }
    HRESULT SetBlockAlign(aafUInt16 value) override { return note("SetBlockAlign", value); }
    HRESULT SetAverageBPS(aafUInt32 value) override { return note("SetAverageBPS", value); }
};

struct SoundFace final : FakeAAFFace<IAAFSoundDescriptor> {
    using FakeAAFFace::FakeAAFFace;
    HRESULT SetCompression(aafUID_constref id) override { return note("SetCompression", id); }
    HRESULT SetChannelCount(aafUInt32 value) override { return note("SetChannelCount", value); }
    HRESULT SetAudioSamplingRate(aafRational_t rate) override {
        return note("SetAudioSamplingRate", rate);
    }
    HRESULT SetQuantizationBits(aafUInt32 value) override {
        return note("SetQuantizationBits", value);
    }
};

struct DataDefFace final : FakeAAFFace<IAAFDataDef> {
    using FakeAAFFace::FakeAAFFace;
};

}  // namespace

FakeAAFFaceMaker FindDescriptorFace(const GUID& iid) {
    static const FakeAAFFaceEntry entries[] = {
        {IID_IAAFMultipleDescriptor,
         MakeFakeAAFFace<MultipleDescriptorFace, IAAFMultipleDescriptor>},
        {IID_IAAFFileDescriptor, MakeFakeAAFFace<FileDescriptorFace, IAAFFileDescriptor>},
        {IID_IAAFEssenceDescriptor, MakeFakeAAFFace<EssenceDescriptorFace, IAAFEssenceDescriptor>},
        {IID_IAAFImportDescriptor, MakeFakeAAFFace<ImportDescriptorFace, IAAFImportDescriptor>},
        {IID_IAAFNetworkLocator, MakeFakeAAFFace<NetworkLocatorFace, IAAFNetworkLocator>},
        {IID_IAAFLocator, MakeFakeAAFFace<LocatorFace, IAAFLocator>},
        {IID_IAAFMPEGVideoDescriptor, MakeFakeAAFFace<MPEGFace, IAAFMPEGVideoDescriptor>},
        {IID_IAAFRGBADescriptor2, MakeFakeAAFFace<RGBAFace, IAAFRGBADescriptor2>},
        {IID_IAAFCDCIDescriptor, MakeFakeAAFFace<CDCIFace, IAAFCDCIDescriptor>},
        {IID_IAAFDigitalImageDescriptor, MakeFakeAAFFace<ImageFace, IAAFDigitalImageDescriptor>},
        {IID_IAAFDigitalImageDescriptor2, MakeFakeAAFFace<ImageFace2, IAAFDigitalImageDescriptor2>},
        {IID_IAAFPCMDescriptor, MakeFakeAAFFace<PCMFace, IAAFPCMDescriptor>},
        {IID_IAAFSoundDescriptor, MakeFakeAAFFace<SoundFace, IAAFSoundDescriptor>},
        {IID_IAAFDataDef, MakeFakeAAFFace<DataDefFace, IAAFDataDef>},
    };
    return FindFace(entries, iid);
}
