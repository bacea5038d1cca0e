// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/objects/EssenceDescriptor.h"
#include "not_implemented/AAFDescriptors.h"

namespace aaf {

// Essence in a file: how long, in which rate, in which container.
class FileDescriptor
    : public Implements<EssenceDescriptor, IAAFFileDescriptor, IAAFFileDescriptor2> {
public:
    void SetDefaults() override;
    aafMobKind_t MobKind() const override { return kAAFFileMob; }

    HRESULT SetLength(aafLength_t length) override;
    HRESULT GetLength(aafLength_t* length) override;
    HRESULT SetCodecDef(IAAFCodecDef* codecDef) override;
    HRESULT GetCodecDef(IAAFCodecDef** codecDef) override;
    HRESULT SetSampleRate(aafRational_constref rate) override;
    HRESULT GetSampleRate(aafRational_t* rate) override;
    HRESULT SetContainerFormat(IAAFContainerDef* format) override;
    HRESULT GetContainerFormat(IAAFContainerDef** format) override;
    HRESULT SetLinkedSlotID(aafUInt32 linkedSlotID) override;
    HRESULT GetLinkedSlotID(aafUInt32* linkedSlotID) override;
};

}  // namespace aaf
