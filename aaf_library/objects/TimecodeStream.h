// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/objects/Checks.h"
#include "aaf_library/objects/Component.h"
#include "not_implemented/AAFTimecodes.h"

// Timecode as it was recorded, frame by frame. This system only reads and
// copies it.

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
};

class TimecodeStream12M : public Implements<TimecodeStream, IAAFTimecodeStream12M> {};

}  // namespace aaf
