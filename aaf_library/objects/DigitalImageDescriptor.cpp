// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/objects/DigitalImageDescriptor.h"

namespace aaf {

namespace {

struct ViewKeys {
    PropertyKey height;
    PropertyKey width;
    PropertyKey xOffset;
    PropertyKey yOffset;
};

constexpr ViewKeys kSampledView{
    prop::DigitalImageDescriptor_SampledHeight, prop::DigitalImageDescriptor_SampledWidth,
    prop::DigitalImageDescriptor_SampledXOffset, prop::DigitalImageDescriptor_SampledYOffset};
constexpr ViewKeys kDisplayView{
    prop::DigitalImageDescriptor_DisplayHeight, prop::DigitalImageDescriptor_DisplayWidth,
    prop::DigitalImageDescriptor_DisplayXOffset, prop::DigitalImageDescriptor_DisplayYOffset};

HRESULT PutView(Object& object, const ViewKeys& keys, aafUInt32 height, aafUInt32 width,
                aafInt32 xOffset, aafInt32 yOffset) {
    object.PutInteger(keys.height, height);
    object.PutInteger(keys.width, width);
    object.PutInteger(keys.xOffset, xOffset);
    return object.PutInteger(keys.yOffset, yOffset);
}

HRESULT ReadView(const Object& object, const ViewKeys& keys, aafUInt32* height, aafUInt32* width,
                 aafInt32* xOffset, aafInt32* yOffset) {
    if (height == nullptr || width == nullptr || xOffset == nullptr || yOffset == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    for (const PropertyKey& key : {keys.height, keys.width, keys.xOffset, keys.yOffset}) {
        if (!object.IsPresent(key)) {
            return AAFRESULT_PROP_NOT_PRESENT;
        }
    }
    object.ReadInteger(keys.height, height);
    object.ReadInteger(keys.width, width);
    object.ReadInteger(keys.xOffset, xOffset);
    return object.ReadInteger(keys.yOffset, yOffset);
}

}  // namespace

void DigitalImageDescriptor::SetDefaults() {
    FileDescriptor::SetDefaults();
    const aafInt32 lines[] = {0, 1};
    SetStoredView(0, 0);
    PutInteger(prop::DigitalImageDescriptor_FrameLayout, kAAFFullFrame);
    PutNative(prop::DigitalImageDescriptor_VideoLineMap, lines, sizeof lines);
    PutStruct(prop::DigitalImageDescriptor_ImageAspectRatio, aafRational_t{0, 1});
}

HRESULT DigitalImageDescriptor::SetStoredView(aafUInt32 storedHeight, aafUInt32 storedWidth) {
    PutInteger(prop::DigitalImageDescriptor_StoredHeight, storedHeight);
    return PutInteger(prop::DigitalImageDescriptor_StoredWidth, storedWidth);
}

HRESULT DigitalImageDescriptor::GetStoredView(aafUInt32* storedHeight, aafUInt32* storedWidth) {
    if (storedHeight == nullptr || storedWidth == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    const HRESULT result = ReadInteger(prop::DigitalImageDescriptor_StoredHeight, storedHeight);
    return result < 0 ? result : ReadInteger(prop::DigitalImageDescriptor_StoredWidth, storedWidth);
}

HRESULT DigitalImageDescriptor::SetSampledView(aafUInt32 sampledHeight, aafUInt32 sampledWidth,
                                               aafInt32 sampledXOffset, aafInt32 sampledYOffset) {
    return PutView(*this, kSampledView, sampledHeight, sampledWidth, sampledXOffset,
                   sampledYOffset);
}

HRESULT DigitalImageDescriptor::GetSampledView(aafUInt32* sampledHeight, aafUInt32* sampledWidth,
                                               aafInt32* sampledXOffset, aafInt32* sampledYOffset) {
    return ReadView(*this, kSampledView, sampledHeight, sampledWidth, sampledXOffset,
                    sampledYOffset);
}

HRESULT DigitalImageDescriptor::SetDisplayView(aafUInt32 displayHeight, aafUInt32 displayWidth,
                                               aafInt32 displayXOffset, aafInt32 displayYOffset) {
    return PutView(*this, kDisplayView, displayHeight, displayWidth, displayXOffset,
                   displayYOffset);
}

HRESULT DigitalImageDescriptor::GetDisplayView(aafUInt32* displayHeight, aafUInt32* displayWidth,
                                               aafInt32* displayXOffset, aafInt32* displayYOffset) {
    return ReadView(*this, kDisplayView, displayHeight, displayWidth, displayXOffset,
                    displayYOffset);
}

HRESULT DigitalImageDescriptor::SetVideoLineMap(aafUInt32 numberElements, aafInt32* videoLineMap) {
    if (videoLineMap == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    if (numberElements == 0) {
        return AAFRESULT_SUCCESS;
    }
    return PutNative(prop::DigitalImageDescriptor_VideoLineMap, videoLineMap,
                     std::size_t{numberElements} * sizeof *videoLineMap);
}

HRESULT DigitalImageDescriptor::SetFieldDominance(aafFieldNumber_t fieldDominance) {
    if (!IsWithin(fieldDominance, kAAFUnspecifiedField, kAAFFieldTwo)) {
        return AAFRESULT_INVALID_ENUM_VALUE;
    }
    // A picture is dominated by one of its fields or the property stays away.
    if (fieldDominance == kAAFUnspecifiedField) {
        return AAFRESULT_ILLEGAL_VALUE;
    }
    return PutInteger(prop::DigitalImageDescriptor_FieldDominance, fieldDominance);
}

}  // namespace aaf
