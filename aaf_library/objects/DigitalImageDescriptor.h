// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/objects/Arrays.h"
#include "aaf_library/objects/Checks.h"
#include "aaf_library/objects/FileDescriptor.h"
#include "not_implemented/AAFPictureDescriptors.h"

namespace aaf {

// A picture: its views, fields, shape and colour labels. Values are stored as
// given; only enumerated ones are checked.
class DigitalImageDescriptor
    : public Implements<FileDescriptor, IAAFDigitalImageDescriptor, IAAFDigitalImageDescriptor2> {
public:
    void SetDefaults() override;

    // Views; the sampled and the display view exist as a whole or not at all.
    HRESULT SetStoredView(aafUInt32 storedHeight, aafUInt32 storedWidth) override;
    HRESULT GetStoredView(aafUInt32* storedHeight, aafUInt32* storedWidth) override;
    HRESULT SetSampledView(aafUInt32 sampledHeight, aafUInt32 sampledWidth, aafInt32 sampledXOffset,
                           aafInt32 sampledYOffset) override;
    HRESULT GetSampledView(aafUInt32* sampledHeight, aafUInt32* sampledWidth,
                           aafInt32* sampledXOffset, aafInt32* sampledYOffset) override;
    HRESULT SetDisplayView(aafUInt32 displayHeight, aafUInt32 displayWidth, aafInt32 displayXOffset,
                           aafInt32 displayYOffset) override;
    HRESULT GetDisplayView(aafUInt32* displayHeight, aafUInt32* displayWidth,
                           aafInt32* displayXOffset, aafInt32* displayYOffset) override;

    // An empty map leaves the stored one as it was.
    HRESULT SetVideoLineMap(aafUInt32 numberElements, aafInt32* videoLineMap) override;
    HRESULT GetVideoLineMap(aafUInt32 numberElements, aafInt32* videoLineMap) override {
        return ReadArray(*this, prop::DigitalImageDescriptor_VideoLineMap, videoLineMap,
                         std::size_t{numberElements} * sizeof *videoLineMap);
    }
    HRESULT GetVideoLineMapSize(aafUInt32* numberElements) override {
        return CountElements(*this, prop::DigitalImageDescriptor_VideoLineMap, sizeof(aafInt32),
                             numberElements);
    }

    HRESULT SetFieldDominance(aafFieldNumber_t fieldDominance) override;
    HRESULT GetFieldDominance(aafFieldNumber_t* fieldDominance) override {
        return ReadInteger(prop::DigitalImageDescriptor_FieldDominance, fieldDominance);
    }

    HRESULT SetCompression(aafUID_constref compression) override {
        return PutStruct(prop::DigitalImageDescriptor_Compression, compression);
    }
    HRESULT GetCompression(aafUID_t* compression) override {
        return ReadStruct(prop::DigitalImageDescriptor_Compression, compression);
    }
    HRESULT SetFrameLayout(aafFrameLayout_t frameLayout) override {
        if (!(IsWithin(frameLayout, kAAFFullFrame, kAAFSegmentedFrame))) {
            return AAFRESULT_INVALID_ENUM_VALUE;
        }
        return PutInteger(prop::DigitalImageDescriptor_FrameLayout, frameLayout);
    }
    HRESULT GetFrameLayout(aafFrameLayout_t* frameLayout) override {
        return ReadInteger(prop::DigitalImageDescriptor_FrameLayout, frameLayout);
    }
    HRESULT SetImageAspectRatio(aafRational_t imageAspectRatio) override {
        return PutStruct(prop::DigitalImageDescriptor_ImageAspectRatio, imageAspectRatio);
    }
    HRESULT GetImageAspectRatio(aafRational_t* imageAspectRatio) override {
        return ReadStruct(prop::DigitalImageDescriptor_ImageAspectRatio, imageAspectRatio);
    }
    HRESULT SetAlphaTransparency(aafAlphaTransparency_t transparency) override {
        if (!(IsWithin(transparency, kAAFMinValueTransparent, kAAFMaxValueTransparent))) {
            return AAFRESULT_INVALID_ENUM_VALUE;
        }
        return PutInteger(prop::DigitalImageDescriptor_AlphaTransparency, transparency);
    }
    HRESULT GetAlphaTransparency(aafAlphaTransparency_t* transparency) override {
        return ReadInteger(prop::DigitalImageDescriptor_AlphaTransparency, transparency);
    }
    // The older name of the transfer characteristic.
    HRESULT SetGamma(aafUID_t gamma) override {
        return PutStruct(prop::DigitalImageDescriptor_TransferCharacteristic, gamma);
    }
    HRESULT GetGamma(aafUID_t* gamma) override {
        return ReadStruct(prop::DigitalImageDescriptor_TransferCharacteristic, gamma);
    }
    HRESULT SetTransferCharacteristic(aafUID_constref characteristic) override {
        return PutStruct(prop::DigitalImageDescriptor_TransferCharacteristic, characteristic);
    }
    HRESULT GetTransferCharacteristic(aafUID_t* characteristic) override {
        return ReadStruct(prop::DigitalImageDescriptor_TransferCharacteristic, characteristic);
    }
    HRESULT SetCodingEquations(aafUID_constref equations) override {
        return PutStruct(prop::DigitalImageDescriptor_CodingEquations, equations);
    }
    HRESULT GetCodingEquations(aafUID_t* equations) override {
        return ReadStruct(prop::DigitalImageDescriptor_CodingEquations, equations);
    }
    HRESULT SetColorPrimaries(aafUID_constref primaries) override {
        return PutStruct(prop::DigitalImageDescriptor_ColorPrimaries, primaries);
    }
    HRESULT GetColorPrimaries(aafUID_t* primaries) override {
        return ReadStruct(prop::DigitalImageDescriptor_ColorPrimaries, primaries);
    }
    HRESULT SetImageAlignmentFactor(aafUInt32 factor) override {
        return PutInteger(prop::DigitalImageDescriptor_ImageAlignmentFactor, factor);
    }
    HRESULT GetImageAlignmentFactor(aafUInt32* factor) override {
        return ReadInteger(prop::DigitalImageDescriptor_ImageAlignmentFactor, factor);
    }
    HRESULT SetFieldStartOffset(aafUInt32 offset) override {
        return PutInteger(prop::DigitalImageDescriptor_FieldStartOffset, offset);
    }
    HRESULT GetFieldStartOffset(aafUInt32* offset) override {
        return ReadInteger(prop::DigitalImageDescriptor_FieldStartOffset, offset);
    }
    HRESULT SetFieldEndOffset(aafUInt32 offset) override {
        return PutInteger(prop::DigitalImageDescriptor_FieldEndOffset, offset);
    }
    HRESULT GetFieldEndOffset(aafUInt32* offset) override {
        return ReadInteger(prop::DigitalImageDescriptor_FieldEndOffset, offset);
    }
    HRESULT SetDisplayF2Offset(aafInt32 offset) override {
        return PutInteger(prop::DigitalImageDescriptor_DisplayF2Offset, offset);
    }
    HRESULT GetDisplayF2Offset(aafInt32* offset) override {
        return ReadInteger(prop::DigitalImageDescriptor_DisplayF2Offset, offset);
    }
    HRESULT SetStoredF2Offset(aafInt32 offset) override {
        return PutInteger(prop::DigitalImageDescriptor_StoredF2Offset, offset);
    }
    HRESULT GetStoredF2Offset(aafInt32* offset) override {
        return ReadInteger(prop::DigitalImageDescriptor_StoredF2Offset, offset);
    }
    HRESULT SetActiveFormatDescriptor(aafUInt8 descriptor) override {
        return PutInteger(prop::DigitalImageDescriptor_ActiveFormatDescriptor, descriptor);
    }
    HRESULT GetActiveFormatDescriptor(aafUInt8* descriptor) override {
        return ReadInteger(prop::DigitalImageDescriptor_ActiveFormatDescriptor, descriptor);
    }
    HRESULT SetSignalStandard(aafSignalStandard_t standard) override {
        if (!(IsWithin(standard, kAAFSignalStandard_None, kAAFSignalStandard_SMPTE349M))) {
            return AAFRESULT_INVALID_ENUM_VALUE;
        }
        return PutInteger(prop::DigitalImageDescriptor_SignalStandard, standard);
    }
    HRESULT GetSignalStandard(aafSignalStandard_t* standard) override {
        return ReadInteger(prop::DigitalImageDescriptor_SignalStandard, standard);
    }
};

}  // namespace aaf
