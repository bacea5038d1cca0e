// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/objects/DigitalImageDescriptor.h"
#include "not_implemented/AAFPictureDescriptors.h"

namespace aaf {

// A picture of one luminance and two colour difference components.
class CDCIDescriptor
    : public Implements<DigitalImageDescriptor, IAAFCDCIDescriptor, IAAFCDCIDescriptor2> {
public:
    void SetDefaults() override;

    HRESULT Initialize() override { return AAFRESULT_SUCCESS; }
    HRESULT SetComponentWidth(aafInt32 componentWidth) override;
    HRESULT GetComponentWidth(aafInt32* componentWidth) override {
        return ReadInteger(prop::CDCIDescriptor_ComponentWidth, componentWidth);
    }
    HRESULT SetHorizontalSubsampling(aafUInt32 subsampling) override;
    HRESULT GetHorizontalSubsampling(aafUInt32* subsampling) override {
        return ReadInteger(prop::CDCIDescriptor_HorizontalSubsampling, subsampling);
    }
    HRESULT SetVerticalSubsampling(aafUInt32 subsampling) override;
    HRESULT GetVerticalSubsampling(aafUInt32* subsampling) override {
        return ReadInteger(prop::CDCIDescriptor_VerticalSubsampling, subsampling);
    }
    HRESULT SetColorSiting(aafColorSiting_t siting) override {
        if (!(IsWithin(siting, kAAFCoSiting, kAAFRec601) || siting == kAAFUnknownSiting)) {
            return AAFRESULT_INVALID_ENUM_VALUE;
        }
        return PutInteger(prop::CDCIDescriptor_ColorSiting, siting);
    }
    HRESULT GetColorSiting(aafColorSiting_t* siting) override {
        return ReadInteger(prop::CDCIDescriptor_ColorSiting, siting);
    }
    HRESULT SetBlackReferenceLevel(aafUInt32 level) override {
        return PutInteger(prop::CDCIDescriptor_BlackReferenceLevel, level);
    }
    HRESULT GetBlackReferenceLevel(aafUInt32* level) override {
        return ReadInteger(prop::CDCIDescriptor_BlackReferenceLevel, level);
    }
    HRESULT SetWhiteReferenceLevel(aafUInt32 level) override {
        return PutInteger(prop::CDCIDescriptor_WhiteReferenceLevel, level);
    }
    HRESULT GetWhiteReferenceLevel(aafUInt32* level) override {
        return ReadInteger(prop::CDCIDescriptor_WhiteReferenceLevel, level);
    }
    HRESULT SetColorRange(aafUInt32 range) override {
        return PutInteger(prop::CDCIDescriptor_ColorRange, range);
    }
    HRESULT GetColorRange(aafUInt32* range) override {
        return ReadInteger(prop::CDCIDescriptor_ColorRange, range);
    }
    HRESULT SetPaddingBits(aafInt16 bits) override {
        return PutInteger(prop::CDCIDescriptor_PaddingBits, bits);
    }
    HRESULT GetPaddingBits(aafInt16* bits) override {
        return ReadInteger(prop::CDCIDescriptor_PaddingBits, bits);
    }
    HRESULT SetAlphaSamplingWidth(aafUInt32 width) override {
        return PutInteger(prop::CDCIDescriptor_AlphaSamplingWidth, width);
    }
    HRESULT GetAlphaSamplingWidth(aafUInt32* width) override {
        return ReadInteger(prop::CDCIDescriptor_AlphaSamplingWidth, width);
    }
    HRESULT SetReversedByteOrder(aafBoolean_t reversed) override {
        return PutBoolean(prop::CDCIDescriptor_ReversedByteOrder, reversed);
    }
    HRESULT GetReversedByteOrder(aafBoolean_t* reversed) override {
        return ReadInteger(prop::CDCIDescriptor_ReversedByteOrder, reversed);
    }
};

}  // namespace aaf
