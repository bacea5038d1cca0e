// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/objects/Checks.h"
#include "aaf_library/objects/FileDescriptor.h"
#include "not_implemented/AAFSoundDescriptors.h"

namespace aaf {

// Sound of any kind.
class SoundDescriptor : public Implements<FileDescriptor, IAAFSoundDescriptor> {
public:
    void SetDefaults() override {
        FileDescriptor::SetDefaults();
        PutInteger(prop::SoundDescriptor_Channels, 0);
        PutStruct(prop::SoundDescriptor_AudioSamplingRate, aafRational_t{0, 0});
        PutInteger(prop::SoundDescriptor_QuantizationBits, 0);
    }

    HRESULT SetCompression(aafUID_constref compression) override {
        return PutStruct(prop::SoundDescriptor_Compression, compression);
    }
    HRESULT GetCompression(aafUID_t* compression) override {
        return ReadStruct(prop::SoundDescriptor_Compression, compression);
    }
    HRESULT SetChannelCount(aafUInt32 count) override {
        return PutInteger(prop::SoundDescriptor_Channels, count);
    }
    HRESULT GetChannelCount(aafUInt32* count) override {
        return ReadInteger(prop::SoundDescriptor_Channels, count);
    }
    HRESULT SetAudioSamplingRate(aafRational_t rate) override {
        return PutStruct(prop::SoundDescriptor_AudioSamplingRate, rate);
    }
    HRESULT GetAudioSamplingRate(aafRational_t* rate) override {
        return ReadStruct(prop::SoundDescriptor_AudioSamplingRate, rate);
    }
    HRESULT SetIsLocked(aafBoolean_t locked) override {
        return PutBoolean(prop::SoundDescriptor_Locked, locked);
    }
    HRESULT IsLocked(aafBoolean_t* locked) override {
        return ReadInteger(prop::SoundDescriptor_Locked, locked);
    }
    HRESULT SetElectroSpatialFormulation(aafElectroSpatialFormulation_t formulation) override {
        return IsFormulation(formulation)
                   ? PutInteger(prop::SoundDescriptor_ElectroSpatial, formulation)
                   : AAFRESULT_INVALID_ENUM_VALUE;
    }
    HRESULT GetElectroSpatialFormulation(aafElectroSpatialFormulation_t* formulation) override {
        return ReadInteger(prop::SoundDescriptor_ElectroSpatial, formulation);
    }
    HRESULT SetAudioRefLevel(aafInt8 level) override {
        return PutInteger(prop::SoundDescriptor_AudioRefLevel, level);
    }
    HRESULT GetAudioRefLevel(aafInt8* level) override {
        return ReadInteger(prop::SoundDescriptor_AudioRefLevel, level);
    }
    HRESULT SetDialNorm(aafInt8 dialNorm) override {
        return PutInteger(prop::SoundDescriptor_DialNorm, dialNorm);
    }
    HRESULT GetDialNorm(aafInt8* dialNorm) override {
        return ReadInteger(prop::SoundDescriptor_DialNorm, dialNorm);
    }
    HRESULT SetQuantizationBits(aafUInt32 bitsCount) override {
        return PutInteger(prop::SoundDescriptor_QuantizationBits, bitsCount);
    }
    HRESULT GetQuantizationBits(aafUInt32* bitsCount) override {
        return ReadInteger(prop::SoundDescriptor_QuantizationBits, bitsCount);
    }

protected:
    // 5 and 6 and 10 to 14 are no members.
    static bool IsFormulation(aafElectroSpatialFormulation_t value) {
        return IsWithin(value, 0, 4) || IsWithin(value, 7, 9) || value == 15;
    }
};

}  // namespace aaf
