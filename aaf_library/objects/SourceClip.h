// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/objects/Arrays.h"
#include "aaf_library/objects/Checks.h"
#include "aaf_library/objects/Component.h"
#include "aaf_library/objects/MobId.h"
#include "host_interfaces/aaf/AAFDefinitions.h"
#include "not_implemented/AAFComponents.h"

namespace aaf {

// Refers to a slot of another mob, or of the same one.
class SourceReference : public Implements<Segment, IAAFSourceReference, IAAFSourceReference2> {
public:
    void SetDefaults() override;

    HRESULT GetSourceID(aafMobID_t* sourceID) override {
        return ReadStruct(prop::SourceReference_SourceID, sourceID);
    }
    HRESULT SetSourceID(aafMobID_constref sourceID) override {
        return PutStruct(prop::SourceReference_SourceID, sourceID);
    }
    HRESULT GetSourceMobSlotID(aafSlotID_t* mobSlotID) override {
        return ReadInteger(prop::SourceReference_SourceMobSlotID, mobSlotID);
    }
    HRESULT SetSourceMobSlotID(aafSlotID_t mobSlotID) override {
        return PutInteger(prop::SourceReference_SourceMobSlotID, mobSlotID);
    }
    HRESULT SetChannelIDs(aafUInt32 numberElements, aafUInt32* channelIDs) override {
        return PutNative(prop::SourceReference_ChannelIDs, channelIDs,
                         std::size_t{numberElements} * sizeof *channelIDs);
    }
    HRESULT GetChannelIDs(aafUInt32 numberElements, aafUInt32* channelIDs) override {
        return ReadArray(*this, prop::SourceReference_ChannelIDs, channelIDs,
                         std::size_t{numberElements} * sizeof *channelIDs);
    }
    HRESULT GetChannelIDsSize(aafUInt32* size) override {
        return CountElements(*this, prop::SourceReference_ChannelIDs, sizeof(aafUInt32), size);
    }
    HRESULT SetMonoSourceSlotIDs(aafUInt32 numberElements, aafUInt32* monoSourceSlotIDs) override {
        return PutNative(prop::SourceReference_MonoSourceSlotIDs, monoSourceSlotIDs,
                         std::size_t{numberElements} * sizeof *monoSourceSlotIDs);
    }
    HRESULT GetMonoSourceSlotIDs(aafUInt32 numberElements, aafUInt32* monoSourceSlotIDs) override {
        return ReadArray(*this, prop::SourceReference_MonoSourceSlotIDs, monoSourceSlotIDs,
                         std::size_t{numberElements} * sizeof *monoSourceSlotIDs);
    }
    HRESULT GetMonoSourceSlotIDsSize(aafUInt32* size) override;
};

// Where a stretch of essence comes from. A reference of zeros ends the chain.
class SourceClip : public Implements<SourceReference, IAAFSourceClip> {
public:
    HRESULT Initialize(IAAFDataDef* dataDef, aafLength_constref length,
                       aafSourceRef_t sourceRef) override;
    HRESULT GetFade(aafLength_t* fadeInLen, aafFadeType_t* fadeInType, aafBoolean_t* fadeInPresent,
                    aafLength_t* fadeOutLen, aafFadeType_t* fadeOutType,
                    aafBoolean_t* fadeOutPresent) override;
    HRESULT ResolveRef(IAAFMob** mob) override;
    HRESULT GetSourceReference(aafSourceRef_t* sourceRef) override;
    HRESULT SetFade(aafInt32 fadeInLen, aafFadeType_t fadeInType, aafInt32 fadeOutLen,
                    aafFadeType_t fadeOutType) override;
    HRESULT SetSourceReference(aafSourceRef_t sourceRef) override;

    // The part of Initialize that is not the data definition.
    HRESULT SetSource(aafLength_t length, const aafSourceRef_t& sourceRef);
};

}  // namespace aaf
