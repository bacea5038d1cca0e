// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/objects/Definitions.h"
#include "aaf_library/objects/EssenceDescriptor.h"
#include "host_interfaces/aaf/AAFClassIds.h"
#include "host_interfaces/aaf/AAFDefinitions.h"
#include "not_implemented/AAFDescriptors.h"

namespace aaf {

// Essence in a file: how long, in which rate, in which container.
class FileDescriptor
    : public Implements<EssenceDescriptor, IAAFFileDescriptor, IAAFFileDescriptor2> {
public:
    void SetDefaults() override;
    aafMobKind_t MobKind() const override { return kAAFFileMob; }

    HRESULT SetLength(aafLength_t length) override {
        return PutInteger(prop::FileDescriptor_Length, length);
    }
    HRESULT GetLength(aafLength_t* length) override {
        return ReadInteger(prop::FileDescriptor_Length, length);
    }
    HRESULT SetCodecDef(IAAFCodecDef* codecDef) override {
        return PutDefinition(*this, prop::FileDescriptor_CodecDefinition, AUID_AAFCodecDef,
                             codecDef, AAFRESULT_INVALID_OBJ);
    }
    HRESULT GetCodecDef(IAAFCodecDef** codecDef) override {
        return ReadWeak(prop::FileDescriptor_CodecDefinition, codecDef);
    }
    HRESULT SetSampleRate(aafRational_constref rate) override {
        return PutStruct(prop::FileDescriptor_SampleRate, rate);
    }
    HRESULT GetSampleRate(aafRational_t* rate) override {
        return ReadStruct(prop::FileDescriptor_SampleRate, rate);
    }
    HRESULT SetContainerFormat(IAAFContainerDef* format) override {
        return PutDefinition(*this, prop::FileDescriptor_ContainerFormat, AUID_AAFContainerDef,
                             format, AAFRESULT_INVALID_OBJ);
    }
    HRESULT GetContainerFormat(IAAFContainerDef** format) override {
        return ReadWeak(prop::FileDescriptor_ContainerFormat, format);
    }
    HRESULT SetLinkedSlotID(aafUInt32 linkedSlotID) override {
        return PutInteger(prop::FileDescriptor_LinkedSlotID, linkedSlotID);
    }
    HRESULT GetLinkedSlotID(aafUInt32* linkedSlotID) override;
};

}  // namespace aaf
