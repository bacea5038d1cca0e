// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/objects/Checks.h"
#include "aaf_library/objects/SoundDescriptor.h"
#include "aaf_library/objects/StreamAccess.h"
#include "not_implemented/AAFSoundDescriptors.h"

namespace aaf {

// Sound as plain samples. Its own operations and the setters of any sound need Initialize, which
// takes the sound's values back to their defaults. What is no member of an enumeration is refused
// before that.
class PCMDescriptor : public Implements<SoundDescriptor, IAAFPCMDescriptor> {
public:
    HRESULT Initialize() override;

    // -- IAAFSoundDescriptor
    HRESULT SetCompression(aafUID_constref compression) override {
        return OnceInitialized(IsInitialized(),
                               [&] { return SoundDescriptor::SetCompression(compression); });
    }
    HRESULT SetChannelCount(aafUInt32 count) override {
        return OnceInitialized(IsInitialized(),
                               [&] { return SoundDescriptor::SetChannelCount(count); });
    }
    HRESULT SetAudioSamplingRate(aafRational_t rate) override {
        return OnceInitialized(IsInitialized(),
                               [&] { return SoundDescriptor::SetAudioSamplingRate(rate); });
    }
    HRESULT SetIsLocked(aafBoolean_t locked) override {
        return OnceInitialized(IsInitialized() || !IsBoolean(locked),
                               [&] { return SoundDescriptor::SetIsLocked(locked); });
    }
    HRESULT SetElectroSpatialFormulation(aafElectroSpatialFormulation_t formulation) override {
        return OnceInitialized(IsInitialized() || !IsFormulation(formulation), [&] {
            return SoundDescriptor::SetElectroSpatialFormulation(formulation);
        });
    }
    HRESULT SetAudioRefLevel(aafInt8 level) override {
        return OnceInitialized(IsInitialized(),
                               [&] { return SoundDescriptor::SetAudioRefLevel(level); });
    }
    HRESULT SetDialNorm(aafInt8 dialNorm) override {
        return OnceInitialized(IsInitialized(),
                               [&] { return SoundDescriptor::SetDialNorm(dialNorm); });
    }
    HRESULT SetQuantizationBits(aafUInt32 bitsCount) override {
        return OnceInitialized(IsInitialized(),
                               [&] { return SoundDescriptor::SetQuantizationBits(bitsCount); });
    }

    // -- IAAFPCMDescriptor
    HRESULT SetBlockAlign(aafUInt16 blockAlign) override {
        return OnceInitialized(IsInitialized(), [&] {
            return PutInteger(prop::PCMDescriptor_BlockAlign, blockAlign);
        });
    }
    HRESULT GetBlockAlign(aafUInt16* blockAlign) override {
        return OnceInitialized(IsInitialized(), [&] {
            return ReadInteger(prop::PCMDescriptor_BlockAlign, blockAlign);
        });
    }
    HRESULT SetSequenceOffset(aafUInt8 offset) override {
        return OnceInitialized(IsInitialized(), [&] {
            return PutInteger(prop::PCMDescriptor_SequenceOffset, offset);
        });
    }
    HRESULT GetSequenceOffset(aafUInt8* offset) override {
        return OnceInitialized(IsInitialized(), [&] {
            return ReadInteger(prop::PCMDescriptor_SequenceOffset, offset);
        });
    }
    HRESULT SetAverageBPS(aafUInt32 bps) override {
        return OnceInitialized(IsInitialized(),
                               [&] { return PutInteger(prop::PCMDescriptor_AverageBPS, bps); });
    }
    HRESULT GetAverageBPS(aafUInt32* bps) override {
        return OnceInitialized(IsInitialized(),
                               [&] { return ReadInteger(prop::PCMDescriptor_AverageBPS, bps); });
    }
    HRESULT SetChannelAssignment(aafUID_constref assignment) override {
        return OnceInitialized(IsInitialized(), [&] {
            return PutStruct(prop::PCMDescriptor_ChannelAssignment, assignment);
        });
    }
    HRESULT GetChannelAssignment(aafUID_t* assignment) override {
        return OnceInitialized(IsInitialized(), [&] {
            return ReadStruct(prop::PCMDescriptor_ChannelAssignment, assignment);
        });
    }
    HRESULT AreAllPeakEnvelopePropertiesPresent(aafBoolean_t* arePresent) override;
    HRESULT SetPeakEnvelopeVersion(aafUInt32 version) override {
        return OnceInitialized(IsInitialized(), [&] {
            return PutInteger(prop::PCMDescriptor_PeakEnvelopeVersion, version);
        });
    }
    HRESULT GetPeakEnvelopeVersion(aafUInt32* version) override {
        return OnceInitialized(IsInitialized(), [&] {
            return ReadInteger(prop::PCMDescriptor_PeakEnvelopeVersion, version);
        });
    }
    HRESULT SetPeakEnvelopeFormat(aafUInt32 format) override {
        return OnceInitialized(IsInitialized(), [&] {
            return PutInteger(prop::PCMDescriptor_PeakEnvelopeFormat, format);
        });
    }
    HRESULT GetPeakEnvelopeFormat(aafUInt32* format) override {
        return OnceInitialized(IsInitialized(), [&] {
            return ReadInteger(prop::PCMDescriptor_PeakEnvelopeFormat, format);
        });
    }
    HRESULT SetPointsPerPeakValue(aafUInt32 pointCount) override {
        return OnceInitialized(IsInitialized(), [&] {
            return PutInteger(prop::PCMDescriptor_PointsPerPeakValue, pointCount);
        });
    }
    HRESULT GetPointsPerPeakValue(aafUInt32* pointCount) override {
        return OnceInitialized(IsInitialized(), [&] {
            return ReadInteger(prop::PCMDescriptor_PointsPerPeakValue, pointCount);
        });
    }
    HRESULT SetPeakEnvelopeBlockSize(aafUInt32 blockSize) override {
        return OnceInitialized(IsInitialized(), [&] {
            return PutInteger(prop::PCMDescriptor_PeakEnvelopeBlockSize, blockSize);
        });
    }
    HRESULT GetPeakEnvelopeBlockSize(aafUInt32* blockSize) override {
        return OnceInitialized(IsInitialized(), [&] {
            return ReadInteger(prop::PCMDescriptor_PeakEnvelopeBlockSize, blockSize);
        });
    }
    HRESULT SetPeakChannelCount(aafUInt32 count) override {
        return OnceInitialized(IsInitialized(),
                               [&] { return PutInteger(prop::PCMDescriptor_PeakChannels, count); });
    }
    HRESULT GetPeakChannelCount(aafUInt32* count) override {
        return OnceInitialized(
            IsInitialized(), [&] { return ReadInteger(prop::PCMDescriptor_PeakChannels, count); });
    }
    HRESULT SetPeakFrameCount(aafUInt32 count) override {
        return OnceInitialized(IsInitialized(),
                               [&] { return PutInteger(prop::PCMDescriptor_PeakFrames, count); });
    }
    HRESULT GetPeakFrameCount(aafUInt32* count) override {
        return OnceInitialized(IsInitialized(),
                               [&] { return ReadInteger(prop::PCMDescriptor_PeakFrames, count); });
    }
    HRESULT SetPeakOfPeaksPosition(aafPosition_t position) override {
        return OnceInitialized(IsInitialized(), [&] {
            return PutInteger(prop::PCMDescriptor_PeakOfPeaksPosition, position);
        });
    }
    HRESULT GetPeakOfPeaksPosition(aafPosition_t* position) override {
        return OnceInitialized(IsInitialized(), [&] {
            return ReadInteger(prop::PCMDescriptor_PeakOfPeaksPosition, position);
        });
    }
    HRESULT SetPeakEnvelopeTimestamp(aafTimeStamp_constref timeStamp) override {
        return OnceInitialized(IsInitialized(), [&] {
            return PutStruct(prop::PCMDescriptor_PeakEnvelopeTimestamp, timeStamp);
        });
    }
    HRESULT GetPeakEnvelopeTimestamp(aafTimeStamp_t* timeStamp) override {
        return OnceInitialized(IsInitialized(), [&] {
            return ReadStruct(prop::PCMDescriptor_PeakEnvelopeTimestamp, timeStamp);
        });
    }

    HRESULT SetPeakEnvelopeDataPosition(aafPosition_t position) override {
        return OnceInitialized(IsInitialized(), [&] {
            return SetStreamPosition(*this, prop::PCMDescriptor_PeakEnvelopeData, position);
        });
    }
    HRESULT GetPeakEnvelopeDataPosition(aafPosition_t* position) override {
        return OnceInitialized(IsInitialized(), [&] {
            return ReadStreamPosition(*this, prop::PCMDescriptor_PeakEnvelopeData, position);
        });
    }
    HRESULT GetPeakEnvelopeDataSize(aafLength_t* size) override {
        return OnceInitialized(IsInitialized(), [&] {
            return ReadStreamSize(*this, prop::PCMDescriptor_PeakEnvelopeData, size);
        });
    }
    HRESULT WritePeakEnvelopeData(aafUInt32 bytes, aafDataBuffer_t buffer,
                                  aafUInt32* bytesWritten) override {
        return OnceInitialized(IsInitialized(), [&] {
            return WriteStream(*this, prop::PCMDescriptor_PeakEnvelopeData, bytes, buffer,
                               bytesWritten);
        });
    }
    HRESULT ReadPeakEnvelopeData(aafUInt32 bytes, aafDataBuffer_t buffer,
                                 aafUInt32* bytesRead) override {
        return OnceInitialized(IsInitialized(), [&] {
            return ReadStream(*this, prop::PCMDescriptor_PeakEnvelopeData, bytes, buffer,
                              bytesRead);
        });
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

    // What each channel says, by its index. A setter may name the channel behind the last one told
    // so far; further on there is AAFRESULT_BADINDEX.
    HRESULT GetChannelStatusModeAt(aafUInt32 index, aafChannelStatusModeType_t* mode) override;
    HRESULT SetChannelStatusModeAt(aafUInt32 index, aafChannelStatusModeType_t mode) override;
    HRESULT GetUserDataModeAt(aafUInt32 index, aafUserDataModeType_t* mode) override;
    HRESULT SetUserDataModeAt(aafUInt32 index, aafUserDataModeType_t mode) override;
    // The 24 bytes of a block; a buffer for fewer is AAFRESULT_SMALLBUF.
    HRESULT GetFixedChannelStatusDataAt(aafUInt32 index, aafUInt32 sizeOfBuffer,
                                        aafUInt8* data) override;
    HRESULT SetFixedChannelStatusDataAt(aafUInt32 index, aafUInt32 sizeOfBuffer,
                                        aafUInt8* data) override;
    HRESULT GetFixedUserDataAt(aafUInt32 index, aafUInt32 sizeOfBuffer, aafUInt8* data) override;
    HRESULT SetFixedUserDataAt(aafUInt32 index, aafUInt32 sizeOfBuffer, aafUInt8* data) override;
};

}  // namespace aaf
