// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <memory>

#include "host_interfaces/framework/Capability.h"
#include "host_interfaces/framework/Console.h"
#include "host_interfaces/media/MediaContainer.h"
#include "source/aaf/AAFSmartPointer.h"
#include "source/plugin/CNCFUnknown.h"
#include "source/plugin/NCFSmartPtr.h"
#include "source/plugin/Tr1Memory.h"

class BaseClip;

namespace NMA::Impl {

// The host's handle on one movie file: loads the clip on demand, describes it,
// and makes its sample mapping. Owns the description; shares the clip with the
// mappings, so a clip may outlive its container.
class QuickTimeContainer final : public CNCFComponent<IMediaContainer3, IAAFClips> {
public:
    explicit QuickTimeContainer(INCFUnknown* outer) : CNCFComponent(outer) {}

    NCFRESULT InitializeInstance(INCFUnknown* host) override;
    NCFRESULT InternalQueryInterface(const GUID& iid, void** out) override;

    NCFRESULT IsContainerSupported() override;
    NCFRESULT ContainerFlag() override { return 1; }
    NCFRESULT ContainerUnsupportedA(void*, void*, void*) override { return NCF_E_NOTIMPL; }
    NCFRESULT GetAAFMasterClips(IAAFClips** ppClips) override;
    NCFRESULT SetFilePath(INCFString* path) override;
    NCFRESULT GetSampleMapping(ISampleMapping** ppSampleMapping) override;
    NCFRESULT ContainerUnsupportedB(void*) override { return NCF_E_NOTIMPL; }
    NCFRESULT GetCapabilities(ncfUInt32* flags) override;
    ncfUInt32 GetFileTypeCount() override;
    NCFRESULT GetFileType(ncfUInt32 index, INCFString** extension, INCFString** description,
                          INCFString** group) override;

    ncfSInt32 GetCount() override { return 1; }
    NCFRESULT GetMetadata(ncfSInt32 index, IAAFFile** ppData) override;
    NCFRESULT GetClipPath(ncfSInt32, INCFString*) override { return NCF_E_NOTIMPL; }

private:
    NCFSmartPtr<INCFComponentFactory> componentFactory_;
    IAAFSmartPointer<IAAFFile> aafFile_;
    NCFSmartPtr<INCFString> filePath_;
    NCFSmartPtr<INCFConsole> console_;
    NCFSmartPtr<INCFUnknown> reserved_;  // never filled
    std::tr1::shared_ptr<BaseClip> media_;
    NCFSmartPtr<INCFCapability> settings_;
};

}  // namespace NMA::Impl
