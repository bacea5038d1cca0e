// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/objects/CDCIDescriptor.h"
#include "not_implemented/AAFPictureDescriptors.h"

namespace aaf {

// An MPEG picture. It may be initialized through this interface and through
// the one of its base class, in any order; settings in between stay.
class MPEGVideoDescriptor : public Implements<CDCIDescriptor, IAAFMPEGVideoDescriptor> {
public:
    HRESULT Initialize() override { return AAFRESULT_SUCCESS; }
    HRESULT SetSingleSequence(aafBoolean_t single) override {
        return PutBoolean(prop::MPEGVideoDescriptor_SingleSequence, single);
    }
    HRESULT GetSingleSequence(aafBoolean_t* single) override {
        return ReadInteger(prop::MPEGVideoDescriptor_SingleSequence, single);
    }
    HRESULT SetConstantBPictureCount(aafBoolean_t constant) override {
        return PutBoolean(prop::MPEGVideoDescriptor_ConstantBPictureCount, constant);
    }
    HRESULT GetConstantBPictureCount(aafBoolean_t* constant) override {
        return ReadInteger(prop::MPEGVideoDescriptor_ConstantBPictureCount, constant);
    }
    HRESULT SetCodedContentScanning(aafContentScanningType_t scanning) override {
        if (!(IsWithin(scanning, kAAFContentScanning_NotKnown, kAAFContentScanning_Mixed))) {
            return AAFRESULT_INVALID_ENUM_VALUE;
        }
        return PutInteger(prop::MPEGVideoDescriptor_CodedContentScanning, scanning);
    }
    HRESULT GetCodedContentScanning(aafContentScanningType_t* scanning) override {
        return ReadInteger(prop::MPEGVideoDescriptor_CodedContentScanning, scanning);
    }
    HRESULT SetLowDelay(aafBoolean_t low) override {
        return PutBoolean(prop::MPEGVideoDescriptor_LowDelay, low);
    }
    HRESULT GetLowDelay(aafBoolean_t* low) override {
        return ReadInteger(prop::MPEGVideoDescriptor_LowDelay, low);
    }
    HRESULT SetClosedGOP(aafBoolean_t closed) override {
        return PutBoolean(prop::MPEGVideoDescriptor_ClosedGOP, closed);
    }
    HRESULT GetClosedGOP(aafBoolean_t* closed) override {
        return ReadInteger(prop::MPEGVideoDescriptor_ClosedGOP, closed);
    }
    HRESULT SetIdenticalGOP(aafBoolean_t identical) override {
        return PutBoolean(prop::MPEGVideoDescriptor_IdenticalGOP, identical);
    }
    HRESULT GetIdenticalGOP(aafBoolean_t* identical) override {
        return ReadInteger(prop::MPEGVideoDescriptor_IdenticalGOP, identical);
    }
    HRESULT SetMaxGOP(aafUInt16 maximum) override {
        return PutInteger(prop::MPEGVideoDescriptor_MaxGOP, maximum);
    }
    HRESULT GetMaxGOP(aafUInt16* maximum) override {
        return ReadInteger(prop::MPEGVideoDescriptor_MaxGOP, maximum);
    }
    HRESULT SetMaxBPictureCount(aafUInt16 maximum) override {
        return PutInteger(prop::MPEGVideoDescriptor_MaxBPictureCount, maximum);
    }
    HRESULT GetMaxBPictureCount(aafUInt16* maximum) override {
        return ReadInteger(prop::MPEGVideoDescriptor_MaxBPictureCount, maximum);
    }
    HRESULT SetBitRate(aafUInt32 rate) override {
        return PutInteger(prop::MPEGVideoDescriptor_BitRate, rate);
    }
    HRESULT GetBitRate(aafUInt32* rate) override {
        return ReadInteger(prop::MPEGVideoDescriptor_BitRate, rate);
    }
    HRESULT SetProfileAndLevel(aafUInt8 profileAndLevel) override {
        return PutInteger(prop::MPEGVideoDescriptor_ProfileAndLevel, profileAndLevel);
    }
    HRESULT GetProfileAndLevel(aafUInt8* profileAndLevel) override {
        return ReadInteger(prop::MPEGVideoDescriptor_ProfileAndLevel, profileAndLevel);
    }
};

}  // namespace aaf
