// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/objects/Arrays.h"
#include "aaf_library/objects/DigitalImageDescriptor.h"
#include "not_implemented/AAFPictureDescriptors.h"

namespace aaf {

// A picture of red, green, blue and alpha components in any order.
class RGBADescriptor
    : public Implements<DigitalImageDescriptor, IAAFRGBADescriptor, IAAFRGBADescriptor2> {
public:
    void SetDefaults() override;

    // Layouts have eight places; those behind the last component are stored as
    // empty ones.
    HRESULT SetPixelLayout(aafUInt32 numberElements, aafRGBAComponent_t* pixelLayout) override;
    HRESULT CountPixelLayoutElements(aafUInt32* result) override;
    HRESULT GetPixelLayout(aafUInt32 numberElements, aafRGBAComponent_t* pixelLayout) override;
    HRESULT SetPaletteLayout(aafUInt32 numberElements, aafRGBAComponent_t* paletteLayout) override;
    HRESULT CountPaletteLayoutElements(aafUInt32* result) override;
    HRESULT GetPaletteLayout(aafUInt32 numberElements, aafRGBAComponent_t* paletteLayout) override;
    HRESULT SetPalette(aafUInt32 numberElements, aafUInt8* palette) override {
        return PutNative(prop::RGBADescriptor_Palette, palette, numberElements);
    }
    HRESULT GetPalette(aafUInt32 numberRecords, aafUInt8* palette) override {
        return ReadArray(*this, prop::RGBADescriptor_Palette, palette, numberRecords);
    }
    HRESULT GetPaletteSize(aafUInt32* numberBytes) override {
        return ReadNativeSize(prop::RGBADescriptor_Palette, numberBytes);
    }

    HRESULT SetComponentMaxRef(aafUInt32 level) override {
        return PutInteger(prop::RGBADescriptor_ComponentMaxRef, level);
    }
    HRESULT GetComponentMaxRef(aafUInt32* level) override {
        return ReadInteger(prop::RGBADescriptor_ComponentMaxRef, level);
    }
    HRESULT SetComponentMinRef(aafUInt32 level) override {
        return PutInteger(prop::RGBADescriptor_ComponentMinRef, level);
    }
    HRESULT GetComponentMinRef(aafUInt32* level) override {
        return ReadInteger(prop::RGBADescriptor_ComponentMinRef, level);
    }
    HRESULT SetAlphaMaxRef(aafUInt32 level) override {
        return PutInteger(prop::RGBADescriptor_AlphaMaxRef, level);
    }
    HRESULT GetAlphaMaxRef(aafUInt32* level) override {
        return ReadInteger(prop::RGBADescriptor_AlphaMaxRef, level);
    }
    HRESULT SetAlphaMinRef(aafUInt32 level) override {
        return PutInteger(prop::RGBADescriptor_AlphaMinRef, level);
    }
    HRESULT GetAlphaMinRef(aafUInt32* level) override {
        return ReadInteger(prop::RGBADescriptor_AlphaMinRef, level);
    }
    HRESULT SetScanningDirection(aafScanningDirection_t direction) override {
        if (!(IsWithin(direction, kAAFScanningDirection_LeftToRightTopToBottom,
                       kAAFScanningDirection_BottomToTopRightToLeft))) {
            return AAFRESULT_INVALID_ENUM_VALUE;
        }
        return PutInteger(prop::RGBADescriptor_ScanningDirection, direction);
    }
    HRESULT GetScanningDirection(aafScanningDirection_t* direction) override {
        return ReadInteger(prop::RGBADescriptor_ScanningDirection, direction);
    }
};

}  // namespace aaf
