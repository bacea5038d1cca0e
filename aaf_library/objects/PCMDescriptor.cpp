// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/objects/PCMDescriptor.h"

#include <algorithm>

namespace aaf {

namespace {

// Channel status and user data come in blocks of 192 bits.
constexpr std::size_t kBlockBytes = 24;

// The piece of that size for a channel, in a property with one after the other.
HRESULT ReadChannel(const Object& object, const PropertyKey& key, aafUInt32 index,
                    std::size_t bytes, aafUInt8* out) {
    const PropertyValue* const value = object.FindValue(key);
    if (value == nullptr) {
        return AAFRESULT_PROP_NOT_PRESENT;
    }
    if (index >= value->bytes().size() / bytes) {
        return AAFRESULT_BADINDEX;
    }
    std::copy_n(value->bytes().data() + index * bytes, bytes, out);
    return AAFRESULT_SUCCESS;
}

HRESULT PutChannel(Object& object, const PropertyKey& key, aafUInt32 index, std::size_t bytes,
                   const aafUInt8* data) {
    const PropertyValue* const present = object.FindValue(key);
    if (index > (present == nullptr ? 0 : present->bytes().size() / bytes)) {
        return AAFRESULT_BADINDEX;
    }
    Bytes& stored = object.RequireValue(key)->BytesToChange();
    stored.resize(std::max(stored.size(), (index + 1) * bytes));
    std::copy_n(data, bytes, stored.data() + index * bytes);
    return AAFRESULT_SUCCESS;
}

HRESULT ReadChannelMode(const Object& object, const PropertyKey& key, aafUInt32 index,
                        aafInt32* mode) {
    if (mode == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    aafUInt8 stored = 0;
    const HRESULT result = ReadChannel(object, key, index, 1, &stored);
    if (result >= 0) {
        *mode = stored;
    }
    return result;
}

HRESULT PutChannelMode(Object& object, const PropertyKey& key, aafUInt32 index, aafInt32 mode,
                       aafInt32 last) {
    if (!IsWithin(mode, 0, last)) {
        return AAFRESULT_INVALID_ENUM_VALUE;
    }
    const auto stored = static_cast<aafUInt8>(mode);
    return PutChannel(object, key, index, 1, &stored);
}

HRESULT CheckBlock(const aafUInt8* data, aafUInt32 sizeOfBuffer) {
    if (data == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    return sizeOfBuffer < kBlockBytes ? AAFRESULT_SMALLBUF : AAFRESULT_SUCCESS;
}

HRESULT ReadBlock(const Object& object, const PropertyKey& key, aafUInt32 index,
                  aafUInt32 sizeOfBuffer, aafUInt8* data) {
    const HRESULT result = CheckBlock(data, sizeOfBuffer);
    return result < 0 ? result : ReadChannel(object, key, index, kBlockBytes, data);
}

HRESULT PutBlock(Object& object, const PropertyKey& key, aafUInt32 index, aafUInt32 sizeOfBuffer,
                 const aafUInt8* data) {
    const HRESULT result = CheckBlock(data, sizeOfBuffer);
    return result < 0 ? result : PutChannel(object, key, index, kBlockBytes, data);
}

}  // namespace

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

HRESULT AES3PCMDescriptor::GetChannelStatusModeAt(aafUInt32 index,
                                                  aafChannelStatusModeType_t* mode) {
    return ReadChannelMode(*this, prop::AES3PCMDescriptor_ChannelStatusMode, index, mode);
}

HRESULT AES3PCMDescriptor::SetChannelStatusModeAt(aafUInt32 index,
                                                  aafChannelStatusModeType_t mode) {
    return PutChannelMode(*this, prop::AES3PCMDescriptor_ChannelStatusMode, index, mode,
                          kAAFChannelStatusMode_Essence);
}

HRESULT AES3PCMDescriptor::GetUserDataModeAt(aafUInt32 index, aafUserDataModeType_t* mode) {
    return ReadChannelMode(*this, prop::AES3PCMDescriptor_UserDataMode, index, mode);
}

HRESULT AES3PCMDescriptor::SetUserDataModeAt(aafUInt32 index, aafUserDataModeType_t mode) {
    return PutChannelMode(*this, prop::AES3PCMDescriptor_UserDataMode, index, mode,
                          kAAFUserDataMode_Reserved9);
}

HRESULT AES3PCMDescriptor::GetFixedChannelStatusDataAt(aafUInt32 index, aafUInt32 sizeOfBuffer,
                                                       aafUInt8* data) {
    return ReadBlock(*this, prop::AES3PCMDescriptor_FixedChannelStatusData, index, sizeOfBuffer,
                     data);
}

HRESULT AES3PCMDescriptor::SetFixedChannelStatusDataAt(aafUInt32 index, aafUInt32 sizeOfBuffer,
                                                       aafUInt8* data) {
    return PutBlock(*this, prop::AES3PCMDescriptor_FixedChannelStatusData, index, sizeOfBuffer,
                    data);
}

HRESULT AES3PCMDescriptor::GetFixedUserDataAt(aafUInt32 index, aafUInt32 sizeOfBuffer,
                                              aafUInt8* data) {
    return ReadBlock(*this, prop::AES3PCMDescriptor_FixedUserData, index, sizeOfBuffer, data);
}

HRESULT AES3PCMDescriptor::SetFixedUserDataAt(aafUInt32 index, aafUInt32 sizeOfBuffer,
                                              aafUInt8* data) {
    return PutBlock(*this, prop::AES3PCMDescriptor_FixedUserData, index, sizeOfBuffer, data);
}

}  // namespace aaf
