// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/model/Object.h"
#include "host_interfaces/aaf/AAFEssenceData.h"
#include "not_implemented/AAFEssenceData.h"

namespace aaf {

// Essence inside the file, under the id of the file mob that describes it.
// Owned by the content storage.
class EssenceData
    : public Implements<Object, IAAFEssenceData, IAAFEssenceDataEx, IAAFEssenceData2> {
public:
    void SetDefaults() override;
    aafMobID_t mobId() const;

    HRESULT Initialize(IAAFSourceMob* fileMob) override { return SetFileMob(fileMob); }
    HRESULT SetFileMob(IAAFSourceMob* fileMob) override;
    HRESULT GetFileMob(IAAFSourceMob** fileMob) override;
    HRESULT GetFileMobID(aafMobID_t* fileMobID) override;

    // The essence itself, read and written at one moving position.
    HRESULT Write(aafUInt32 bytes, aafDataBuffer_t buffer, aafUInt32* bytesWritten) override;
    HRESULT Read(aafUInt32 bytes, aafDataBuffer_t buffer, aafUInt32* bytesRead) override;
    HRESULT SetPosition(aafPosition_t offset) override;
    HRESULT GetPosition(aafPosition_t* offset) override;
    HRESULT GetSize(aafLength_t* size) override;

    // Where its samples are, in a form that the codec knows.
    HRESULT WriteSampleIndex(aafUInt32 bytes, aafDataBuffer_t buffer,
                             aafUInt32* bytesWritten) override;
    HRESULT ReadSampleIndex(aafUInt32 bytes, aafDataBuffer_t buffer, aafUInt32* bytesRead) override;
    HRESULT SetSampleIndexPosition(aafPosition_t offset) override;
    HRESULT GetSampleIndexPosition(aafPosition_t* offset) override;
    HRESULT GetSampleIndexSize(aafLength_t* size) override;
};

}  // namespace aaf
