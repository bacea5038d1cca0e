// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/objects/Checks.h"
#include "aaf_library/objects/Component.h"
#include "not_implemented/AAFTimecodes.h"

// Timecode as it was recorded, frame by frame.

namespace aaf {

class TimecodeStream : public Implements<Segment, IAAFTimecodeStream> {
public:
    HRESULT SetSampleRate(aafRational_t sampleRate) override {
        return PutStruct(prop::TimecodeStream_SampleRate, sampleRate);
    }
    HRESULT GetSampleRate(aafRational_t* sampleRate) override {
        return ReadStruct(prop::TimecodeStream_SampleRate, sampleRate);
    }
    HRESULT SetSourceType(aafTimecodeSourceType_t sourceType) override {
        if (!(IsWithin(sourceType, kAAFTimecodeLTC, kAAFTimecodeVITC))) {
            return AAFRESULT_INVALID_ENUM_VALUE;
        }
        return PutInteger(prop::TimecodeStream_SourceType, sourceType);
    }
    HRESULT GetSourceType(aafTimecodeSourceType_t* sourceType) override {
        return ReadInteger(prop::TimecodeStream_SourceType, sourceType);
    }

    // The recording as a whole.
    HRESULT GetSampleSize(aafUInt32* sampleSize) override;
    HRESULT GetSource(aafUInt32 valueSize, aafDataBuffer_t value, aafUInt32* bytesRead) override;
    HRESULT GetSourceBufLen(aafUInt32* len) override;
    HRESULT SetSource(aafUInt32 valueSize, aafDataBuffer_t value) override;

    // One frame of it, counted in frames of the sample rate. A setter may name the frame behind the
    // last; further on there is AAFRESULT_BADSAMPLEOFFSET. What is set as timecode leaves the user
    // bits alone, and the other way round.
    HRESULT GetPositionTimecode(aafPosition_t position, aafTimecode_t* timecode) override;
    HRESULT SetPositionTimecode(aafPosition_t position, aafTimecode_t timecode) override;
    HRESULT GetUserDataLength(aafInt32* length) override;
    HRESULT GetUserDataAtPosition(aafPosition_t position, aafInt32 buflen,
                                  aafDataBuffer_t buffer) override;
    HRESULT SetUserDataAtPosition(aafPosition_t position, aafInt32 buflen,
                                  aafDataBuffer_t buffer) override;

protected:
    // How many bytes a frame has; 0 for a kind of recording that isn't known, whose frames can't be
    // told apart (AAFRESULT_BAD_TYPE).
    virtual std::size_t SampleBytes() const { return 0; }

private:
    aafInt64 FramesPerSecond() const;
    HRESULT FindSample(aafPosition_t position, std::size_t* at) const;
    HRESULT RequireSample(aafPosition_t position, std::size_t* at);
};

// Words of linear timecode, with or without the bits that tell where one starts.
class TimecodeStream12M : public Implements<TimecodeStream, IAAFTimecodeStream12M> {
protected:
    std::size_t SampleBytes() const override;
};

}  // namespace aaf
