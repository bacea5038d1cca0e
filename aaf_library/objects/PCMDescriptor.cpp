// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/objects/PCMDescriptor.h"

namespace aaf {

HRESULT PCMDescriptor::Initialize() {
    if (IsInitialized()) {
        return AAFRESULT_ALREADY_INITIALIZED;
    }
    PutInteger(prop::SoundDescriptor_Channels, 0);
    PutInteger(prop::SoundDescriptor_QuantizationBits, 0);
    PutStruct(prop::SoundDescriptor_AudioSamplingRate, aafRational_t{0, 0});
    PutInteger(prop::PCMDescriptor_AverageBPS, 0);
    return PutInteger(prop::PCMDescriptor_BlockAlign, 0);
}

HRESULT PCMDescriptor::AreAllPeakEnvelopePropertiesPresent(aafBoolean_t* arePresent) {
    if (!IsInitialized()) {
        return AAFRESULT_NOT_INITIALIZED;
    }
    if (arePresent == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    *arePresent = kAAFTrue;
    for (const PropertyKey& key :
         {prop::PCMDescriptor_PeakEnvelopeVersion, prop::PCMDescriptor_PeakEnvelopeFormat,
          prop::PCMDescriptor_PointsPerPeakValue, prop::PCMDescriptor_PeakEnvelopeBlockSize,
          prop::PCMDescriptor_PeakChannels, prop::PCMDescriptor_PeakFrames,
          prop::PCMDescriptor_PeakOfPeaksPosition, prop::PCMDescriptor_PeakEnvelopeTimestamp,
          prop::PCMDescriptor_PeakEnvelopeData}) {
        if (!IsPresent(key)) {
            *arePresent = kAAFFalse;
        }
    }
    return AAFRESULT_SUCCESS;
}

}  // namespace aaf
