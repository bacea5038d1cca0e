// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/objects/SoundDescriptor.h"
#include "not_implemented/AAFSoundDescriptors.h"

namespace aaf {

// Sound as plain samples. Its own operations and the setters of any sound need Initialize, which
// takes the sound's values back to their defaults.
class PCMDescriptor : public Implements<SoundDescriptor, IAAFPCMDescriptor> {
public:
    HRESULT Initialize() override;

    // -- IAAFSoundDescriptor
    HRESULT SetCompression(aafUID_constref compression) override {
        return IsInitialized() ? SoundDescriptor::SetCompression(compression)
                               : AAFRESULT_NOT_INITIALIZED;
    }
    HRESULT SetChannelCount(aafUInt32 count) override {
        return IsInitialized() ? SoundDescriptor::SetChannelCount(count)
                               : AAFRESULT_NOT_INITIALIZED;
    }
    HRESULT SetAudioSamplingRate(aafRational_t rate) override {
        return IsInitialized() ? SoundDescriptor::SetAudioSamplingRate(rate)
                               : AAFRESULT_NOT_INITIALIZED;
    }
    HRESULT SetIsLocked(aafBoolean_t locked) override {
        return IsInitialized() ? SoundDescriptor::SetIsLocked(locked) : AAFRESULT_NOT_INITIALIZED;
    }
    HRESULT SetElectroSpatialFormulation(aafElectroSpatialFormulation_t formulation) override {
        return IsInitialized() ? SoundDescriptor::SetElectroSpatialFormulation(formulation)
                               : AAFRESULT_NOT_INITIALIZED;
    }
    HRESULT SetAudioRefLevel(aafInt8 level) override {
        return IsInitialized() ? SoundDescriptor::SetAudioRefLevel(level)
                               : AAFRESULT_NOT_INITIALIZED;
    }
    HRESULT SetDialNorm(aafInt8 dialNorm) override {
        return IsInitialized() ? SoundDescriptor::SetDialNorm(dialNorm) : AAFRESULT_NOT_INITIALIZED;
    }
    HRESULT SetQuantizationBits(aafUInt32 bitsCount) override {
        return IsInitialized() ? SoundDescriptor::SetQuantizationBits(bitsCount)
                               : AAFRESULT_NOT_INITIALIZED;
    }

    // -- IAAFPCMDescriptor
    HRESULT SetBlockAlign(aafUInt16 blockAlign) override {
        return IsInitialized() ? PutInteger(prop::PCMDescriptor_BlockAlign, blockAlign)
                               : AAFRESULT_NOT_INITIALIZED;
    }
    HRESULT GetBlockAlign(aafUInt16* blockAlign) override {
        return IsInitialized() ? ReadInteger(prop::PCMDescriptor_BlockAlign, blockAlign)
                               : AAFRESULT_NOT_INITIALIZED;
    }
    HRESULT SetSequenceOffset(aafUInt8 offset) override {
        return IsInitialized() ? PutInteger(prop::PCMDescriptor_SequenceOffset, offset)
                               : AAFRESULT_NOT_INITIALIZED;
    }
    HRESULT GetSequenceOffset(aafUInt8* offset) override {
        return IsInitialized() ? ReadInteger(prop::PCMDescriptor_SequenceOffset, offset)
                               : AAFRESULT_NOT_INITIALIZED;
    }
    HRESULT SetAverageBPS(aafUInt32 bps) override {
        return IsInitialized() ? PutInteger(prop::PCMDescriptor_AverageBPS, bps)
                               : AAFRESULT_NOT_INITIALIZED;
    }
    HRESULT GetAverageBPS(aafUInt32* bps) override {
        return IsInitialized() ? ReadInteger(prop::PCMDescriptor_AverageBPS, bps)
                               : AAFRESULT_NOT_INITIALIZED;
    }
    HRESULT SetChannelAssignment(aafUID_constref assignment) override {
        return IsInitialized() ? PutStruct(prop::PCMDescriptor_ChannelAssignment, assignment)
                               : AAFRESULT_NOT_INITIALIZED;
    }
    HRESULT GetChannelAssignment(aafUID_t* assignment) override {
        return IsInitialized() ? ReadStruct(prop::PCMDescriptor_ChannelAssignment, assignment)
                               : AAFRESULT_NOT_INITIALIZED;
    }
    HRESULT AreAllPeakEnvelopePropertiesPresent(aafBoolean_t* arePresent) override;
    HRESULT SetPeakEnvelopeVersion(aafUInt32 version) override {
        return IsInitialized() ? PutInteger(prop::PCMDescriptor_PeakEnvelopeVersion, version)
                               : AAFRESULT_NOT_INITIALIZED;
    }
    HRESULT GetPeakEnvelopeVersion(aafUInt32* version) override {
        return IsInitialized() ? ReadInteger(prop::PCMDescriptor_PeakEnvelopeVersion, version)
                               : AAFRESULT_NOT_INITIALIZED;
    }
    HRESULT SetPeakEnvelopeFormat(aafUInt32 format) override {
        return IsInitialized() ? PutInteger(prop::PCMDescriptor_PeakEnvelopeFormat, format)
                               : AAFRESULT_NOT_INITIALIZED;
    }
    HRESULT GetPeakEnvelopeFormat(aafUInt32* format) override {
        return IsInitialized() ? ReadInteger(prop::PCMDescriptor_PeakEnvelopeFormat, format)
                               : AAFRESULT_NOT_INITIALIZED;
    }
    HRESULT SetPointsPerPeakValue(aafUInt32 pointCount) override {
        return IsInitialized() ? PutInteger(prop::PCMDescriptor_PointsPerPeakValue, pointCount)
                               : AAFRESULT_NOT_INITIALIZED;
    }
    HRESULT GetPointsPerPeakValue(aafUInt32* pointCount) override {
        return IsInitialized() ? ReadInteger(prop::PCMDescriptor_PointsPerPeakValue, pointCount)
                               : AAFRESULT_NOT_INITIALIZED;
    }
    HRESULT SetPeakEnvelopeBlockSize(aafUInt32 blockSize) override {
        return IsInitialized() ? PutInteger(prop::PCMDescriptor_PeakEnvelopeBlockSize, blockSize)
                               : AAFRESULT_NOT_INITIALIZED;
    }
    HRESULT GetPeakEnvelopeBlockSize(aafUInt32* blockSize) override {
        return IsInitialized() ? ReadInteger(prop::PCMDescriptor_PeakEnvelopeBlockSize, blockSize)
                               : AAFRESULT_NOT_INITIALIZED;
    }
    HRESULT SetPeakChannelCount(aafUInt32 count) override {
        return IsInitialized() ? PutInteger(prop::PCMDescriptor_PeakChannels, count)
                               : AAFRESULT_NOT_INITIALIZED;
    }
    HRESULT GetPeakChannelCount(aafUInt32* count) override {
        return IsInitialized() ? ReadInteger(prop::PCMDescriptor_PeakChannels, count)
                               : AAFRESULT_NOT_INITIALIZED;
    }
    HRESULT SetPeakFrameCount(aafUInt32 count) override {
        return IsInitialized() ? PutInteger(prop::PCMDescriptor_PeakFrames, count)
                               : AAFRESULT_NOT_INITIALIZED;
    }
    HRESULT GetPeakFrameCount(aafUInt32* count) override {
        return IsInitialized() ? ReadInteger(prop::PCMDescriptor_PeakFrames, count)
                               : AAFRESULT_NOT_INITIALIZED;
    }
    HRESULT SetPeakOfPeaksPosition(aafPosition_t position) override {
        return IsInitialized() ? PutInteger(prop::PCMDescriptor_PeakOfPeaksPosition, position)
                               : AAFRESULT_NOT_INITIALIZED;
    }
    HRESULT GetPeakOfPeaksPosition(aafPosition_t* position) override {
        return IsInitialized() ? ReadInteger(prop::PCMDescriptor_PeakOfPeaksPosition, position)
                               : AAFRESULT_NOT_INITIALIZED;
    }
    HRESULT SetPeakEnvelopeTimestamp(aafTimeStamp_constref timeStamp) override {
        return IsInitialized() ? PutStruct(prop::PCMDescriptor_PeakEnvelopeTimestamp, timeStamp)
                               : AAFRESULT_NOT_INITIALIZED;
    }
    HRESULT GetPeakEnvelopeTimestamp(aafTimeStamp_t* timeStamp) override {
        return IsInitialized() ? ReadStruct(prop::PCMDescriptor_PeakEnvelopeTimestamp, timeStamp)
                               : AAFRESULT_NOT_INITIALIZED;
    }

private:
    // Block align is a required value that Initialize brings into being.
    bool IsInitialized() const { return IsPresent(prop::PCMDescriptor_BlockAlign); }
};

// Sound in the frames of a professional digital interface.
class AES3PCMDescriptor
    : public Implements<PCMDescriptor, IAAFAES3PCMDescriptor, IAAFAES3PCMDescriptor2> {
public:
    HRESULT Initialize() override { return PCMDescriptor::Initialize(); }
    HRESULT SetEmphasis(aafEmphasisType_t emphasis) override {
        if (!(IsWithin(emphasis, kAAFEmphasis_Unknown, kAAFEmphasis_ITU))) {
            return AAFRESULT_INVALID_ENUM_VALUE;
        }
        return PutInteger(prop::AES3PCMDescriptor_Emphasis, emphasis);
    }
    HRESULT GetEmphasis(aafEmphasisType_t* emphasis) override {
        return ReadInteger(prop::AES3PCMDescriptor_Emphasis, emphasis);
    }
    HRESULT SetBlockStartOffset(aafUInt16 offset) override {
        return PutInteger(prop::AES3PCMDescriptor_BlockStartOffset, offset);
    }
    HRESULT GetBlockStartOffset(aafUInt16* offset) override {
        return ReadInteger(prop::AES3PCMDescriptor_BlockStartOffset, offset);
    }
    HRESULT SetAuxBitsMode(aafAuxBitsModeType_t mode) override {
        if (!(IsWithin(mode, kAAFAuxBitsMode_NotDefined, kAAFAuxBitsMode_Reserved3))) {
            return AAFRESULT_INVALID_ENUM_VALUE;
        }
        return PutInteger(prop::AES3PCMDescriptor_AuxBitsMode, mode);
    }
    HRESULT GetAuxBitsMode(aafAuxBitsModeType_t* mode) override {
        return ReadInteger(prop::AES3PCMDescriptor_AuxBitsMode, mode);
    }
};

}  // namespace aaf
