// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/aaf/AAFDescriptors.h"
#include "host_interfaces/aaf/AAFResultCodes.h"
#include "reference_host/aaf/model/NotImplemented.h"

// Bodies for operations that a class leaves out; see NotImplemented.h.
namespace aaf {

template <>
class NotImplemented<IAAFEssenceDescriptor> : public IAAFEssenceDescriptor {
public:
    HRESULT CountLocators(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT AppendLocator(IAAFLocator*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT PrependLocator(IAAFLocator*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT InsertLocatorAt(aafUInt32, IAAFLocator*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetLocatorAt(aafUInt32, IAAFLocator**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT RemoveLocatorAt(aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetLocators(IEnumAAFLocators**) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFFileDescriptor> : public IAAFFileDescriptor {
public:
    HRESULT SetLength(aafLength_t) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetLength(aafLength_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetCodecDef(IAAFCodecDef*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetCodecDef(IAAFCodecDef**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetSampleRate(aafRational_constref) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetSampleRate(aafRational_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetContainerFormat(IAAFContainerDef*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetContainerFormat(IAAFContainerDef**) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFFileDescriptor2> : public IAAFFileDescriptor2 {
public:
    HRESULT SetLength(aafLength_t) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetLength(aafLength_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetCodecDef(IAAFCodecDef*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetCodecDef(IAAFCodecDef**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetSampleRate(aafRational_constref) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetSampleRate(aafRational_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetContainerFormat(IAAFContainerDef*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetContainerFormat(IAAFContainerDef**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetLinkedSlotID(aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetLinkedSlotID(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFMultipleDescriptor> : public IAAFMultipleDescriptor {
public:
    HRESULT Initialize() override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT CountFileDescriptors(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT AppendFileDescriptor(IAAFFileDescriptor*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT PrependFileDescriptor(IAAFFileDescriptor*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT InsertFileDescriptorAt(aafUInt32, IAAFFileDescriptor*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetFileDescriptorAt(aafUInt32, IAAFFileDescriptor**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT RemoveFileDescriptorAt(aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetFileDescriptors(IEnumAAFFileDescriptors**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IEnumAAFFileDescriptors> : public IEnumAAFFileDescriptors {
public:
    HRESULT NextOne(IAAFFileDescriptor**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Next(aafUInt32, IAAFFileDescriptor**, aafUInt32*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT Skip(aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Reset() override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Clone(IEnumAAFFileDescriptors**) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFImportDescriptor> : public IAAFImportDescriptor {
public:
    HRESULT Initialize() override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFPhysicalDescriptor> : public IAAFPhysicalDescriptor {
protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFRecordingDescriptor> : public IAAFRecordingDescriptor {
public:
    HRESULT Initialize() override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFAuxiliaryDescriptor> : public IAAFAuxiliaryDescriptor {
public:
    HRESULT Initialize() override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetMimeType(aafCharacter_constptr) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetMimeType(aafCharacter*, aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetMimeTypeBufLen(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetCharSet(aafCharacter_constptr) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetCharSet(aafCharacter*, aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetCharSetBufLen(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFTapeDescriptor> : public IAAFTapeDescriptor {
public:
    HRESULT Initialize() override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetTapeManufacturer(aafCharacter_constptr) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetTapeManufacturer(aafCharacter*, aafUInt32) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetTapeManufacturerBufLen(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetTapeModel(aafCharacter_constptr) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetTapeModel(aafCharacter*, aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetTapeModelBufLen(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetTapeFormFactor(aafTapeCaseType_t) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetTapeFormFactor(aafTapeCaseType_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetSignalType(aafVideoSignalType_t) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetSignalType(aafVideoSignalType_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetTapeFormat(aafTapeFormatType_t) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetTapeFormat(aafTapeFormatType_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetTapeLength(aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetTapeLength(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFDigitalImageDescriptor> : public IAAFDigitalImageDescriptor {
public:
    HRESULT SetCompression(aafUID_constref) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetCompression(aafUID_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetStoredView(aafUInt32, aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetStoredView(aafUInt32*, aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetSampledView(aafUInt32, aafUInt32, aafInt32, aafInt32) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetSampledView(aafUInt32*, aafUInt32*, aafInt32*, aafInt32*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT SetDisplayView(aafUInt32, aafUInt32, aafInt32, aafInt32) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetDisplayView(aafUInt32*, aafUInt32*, aafInt32*, aafInt32*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT SetFrameLayout(aafFrameLayout_t) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetFrameLayout(aafFrameLayout_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetVideoLineMap(aafUInt32, aafInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetVideoLineMap(aafUInt32, aafInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetVideoLineMapSize(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetImageAspectRatio(aafRational_t) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetImageAspectRatio(aafRational_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetAlphaTransparency(aafAlphaTransparency_t) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetAlphaTransparency(aafAlphaTransparency_t*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT SetGamma(aafUID_t) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetGamma(aafUID_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetImageAlignmentFactor(aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetImageAlignmentFactor(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFDigitalImageDescriptor2> : public IAAFDigitalImageDescriptor2 {
public:
    HRESULT SetCompression(aafUID_constref) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetCompression(aafUID_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetStoredView(aafUInt32, aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetStoredView(aafUInt32*, aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetSampledView(aafUInt32, aafUInt32, aafInt32, aafInt32) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetSampledView(aafUInt32*, aafUInt32*, aafInt32*, aafInt32*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT SetDisplayView(aafUInt32, aafUInt32, aafInt32, aafInt32) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetDisplayView(aafUInt32*, aafUInt32*, aafInt32*, aafInt32*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT SetFrameLayout(aafFrameLayout_t) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetFrameLayout(aafFrameLayout_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetVideoLineMap(aafUInt32, aafInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetVideoLineMap(aafUInt32, aafInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetVideoLineMapSize(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetImageAspectRatio(aafRational_t) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetImageAspectRatio(aafRational_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetAlphaTransparency(aafAlphaTransparency_t) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetAlphaTransparency(aafAlphaTransparency_t*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT SetImageAlignmentFactor(aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetImageAlignmentFactor(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetTransferCharacteristic(aafUID_constref) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetTransferCharacteristic(aafUID_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetCodingEquations(aafUID_constref) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetCodingEquations(aafUID_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetColorPrimaries(aafUID_constref) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetColorPrimaries(aafUID_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetFieldStartOffset(aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetFieldStartOffset(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetFieldEndOffset(aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetFieldEndOffset(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetFieldDominance(aafFieldNumber_t) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetFieldDominance(aafFieldNumber_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetDisplayF2Offset(aafInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetDisplayF2Offset(aafInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetStoredF2Offset(aafInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetStoredF2Offset(aafInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetActiveFormatDescriptor(aafUInt8) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetActiveFormatDescriptor(aafUInt8*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetSignalStandard(aafSignalStandard_t) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetSignalStandard(aafSignalStandard_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFCDCIDescriptor> : public IAAFCDCIDescriptor {
public:
    HRESULT Initialize() override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetComponentWidth(aafInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetComponentWidth(aafInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetHorizontalSubsampling(aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetHorizontalSubsampling(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetVerticalSubsampling(aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetVerticalSubsampling(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetColorSiting(aafColorSiting_t) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetColorSiting(aafColorSiting_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetBlackReferenceLevel(aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetBlackReferenceLevel(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetWhiteReferenceLevel(aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetWhiteReferenceLevel(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetColorRange(aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetColorRange(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetPaddingBits(aafInt16) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetPaddingBits(aafInt16*) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFCDCIDescriptor2> : public IAAFCDCIDescriptor2 {
public:
    HRESULT Initialize() override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetComponentWidth(aafInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetComponentWidth(aafInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetHorizontalSubsampling(aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetHorizontalSubsampling(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetVerticalSubsampling(aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetVerticalSubsampling(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetColorSiting(aafColorSiting_t) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetColorSiting(aafColorSiting_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetBlackReferenceLevel(aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetBlackReferenceLevel(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetWhiteReferenceLevel(aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetWhiteReferenceLevel(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetColorRange(aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetColorRange(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetPaddingBits(aafInt16) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetPaddingBits(aafInt16*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetAlphaSamplingWidth(aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetAlphaSamplingWidth(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetReversedByteOrder(aafBoolean_t) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetReversedByteOrder(aafBoolean_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFRGBADescriptor> : public IAAFRGBADescriptor {
public:
    HRESULT SetPixelLayout(aafUInt32, aafRGBAComponent_t*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT CountPixelLayoutElements(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetPixelLayout(aafUInt32, aafRGBAComponent_t*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT SetPalette(aafUInt32, aafUInt8*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetPalette(aafUInt32, aafUInt8*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetPaletteSize(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT CountPaletteLayoutElements(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetPaletteLayout(aafUInt32, aafRGBAComponent_t*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetPaletteLayout(aafUInt32, aafRGBAComponent_t*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFRGBADescriptor2> : public IAAFRGBADescriptor2 {
public:
    HRESULT SetPixelLayout(aafUInt32, aafRGBAComponent_t*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT CountPixelLayoutElements(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetPixelLayout(aafUInt32, aafRGBAComponent_t*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT SetPalette(aafUInt32, aafUInt8*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetPalette(aafUInt32, aafUInt8*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetPaletteSize(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT CountPaletteLayoutElements(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetPaletteLayout(aafUInt32, aafRGBAComponent_t*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetPaletteLayout(aafUInt32, aafRGBAComponent_t*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT SetComponentMaxRef(aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetComponentMaxRef(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetComponentMinRef(aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetComponentMinRef(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetAlphaMaxRef(aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetAlphaMaxRef(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetAlphaMinRef(aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetAlphaMinRef(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetScanningDirection(aafScanningDirection_t) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetScanningDirection(aafScanningDirection_t*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFMPEGVideoDescriptor> : public IAAFMPEGVideoDescriptor {
public:
    HRESULT Initialize() override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetSingleSequence(aafBoolean_t) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetSingleSequence(aafBoolean_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetConstantBPictureCount(aafBoolean_t) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetConstantBPictureCount(aafBoolean_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetCodedContentScanning(aafContentScanningType_t) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetCodedContentScanning(aafContentScanningType_t*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT SetLowDelay(aafBoolean_t) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetLowDelay(aafBoolean_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetClosedGOP(aafBoolean_t) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetClosedGOP(aafBoolean_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetIdenticalGOP(aafBoolean_t) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetIdenticalGOP(aafBoolean_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetMaxGOP(aafUInt16) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetMaxGOP(aafUInt16*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetMaxBPictureCount(aafUInt16) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetMaxBPictureCount(aafUInt16*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetBitRate(aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetBitRate(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetProfileAndLevel(aafUInt8) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetProfileAndLevel(aafUInt8*) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFPCMDescriptor> : public IAAFPCMDescriptor {
public:
    HRESULT Initialize() override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetBlockAlign(aafUInt16) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetBlockAlign(aafUInt16*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetSequenceOffset(aafUInt8) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetSequenceOffset(aafUInt8*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetAverageBPS(aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetAverageBPS(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetChannelAssignment(aafUID_constref) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetChannelAssignment(aafUID_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT AreAllPeakEnvelopePropertiesPresent(aafBoolean_t*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT SetPeakEnvelopeVersion(aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetPeakEnvelopeVersion(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetPeakEnvelopeFormat(aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetPeakEnvelopeFormat(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetPointsPerPeakValue(aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetPointsPerPeakValue(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetPeakEnvelopeBlockSize(aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetPeakEnvelopeBlockSize(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetPeakChannelCount(aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetPeakChannelCount(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetPeakFrameCount(aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetPeakFrameCount(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetPeakOfPeaksPosition(aafPosition_t) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetPeakOfPeaksPosition(aafPosition_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetPeakEnvelopeTimestamp(aafTimeStamp_constref) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetPeakEnvelopeTimestamp(aafTimeStamp_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetPeakEnvelopeDataPosition(aafPosition_t) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetPeakEnvelopeDataPosition(aafPosition_t*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetPeakEnvelopeDataSize(aafLength_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT WritePeakEnvelopeData(aafUInt32, aafDataBuffer_t, aafUInt32*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT ReadPeakEnvelopeData(aafUInt32, aafDataBuffer_t, aafUInt32*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFSoundDescriptor> : public IAAFSoundDescriptor {
public:
    HRESULT SetCompression(aafUID_constref) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetCompression(aafUID_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetChannelCount(aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetChannelCount(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetAudioSamplingRate(aafRational_t) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetAudioSamplingRate(aafRational_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetIsLocked(aafBoolean_t) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT IsLocked(aafBoolean_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetElectroSpatialFormulation(aafElectroSpatialFormulation_t) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetElectroSpatialFormulation(aafElectroSpatialFormulation_t*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT SetAudioRefLevel(aafInt8) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetAudioRefLevel(aafInt8*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetDialNorm(aafInt8) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetDialNorm(aafInt8*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetQuantizationBits(aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetQuantizationBits(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFAES3PCMDescriptor> : public IAAFAES3PCMDescriptor {
public:
    HRESULT Initialize() override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFAES3PCMDescriptor2> : public IAAFAES3PCMDescriptor2 {
public:
    HRESULT Initialize() override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetEmphasis(aafEmphasisType_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetEmphasis(aafEmphasisType_t) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetBlockStartOffset(aafUInt16*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetBlockStartOffset(aafUInt16) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetAuxBitsMode(aafAuxBitsModeType_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetAuxBitsMode(aafAuxBitsModeType_t) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetChannelStatusModeAt(aafUInt32, aafChannelStatusModeType_t*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT SetChannelStatusModeAt(aafUInt32, aafChannelStatusModeType_t) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetFixedChannelStatusDataAt(aafUInt32, aafUInt32, aafUInt8*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT SetFixedChannelStatusDataAt(aafUInt32, aafUInt32, aafUInt8*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetUserDataModeAt(aafUInt32, aafUserDataModeType_t*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT SetUserDataModeAt(aafUInt32, aafUserDataModeType_t) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetFixedUserDataAt(aafUInt32, aafUInt32, aafUInt8*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT SetFixedUserDataAt(aafUInt32, aafUInt32, aafUInt8*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFAIFCDescriptor> : public IAAFAIFCDescriptor {
public:
    HRESULT Initialize() override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetSummary(aafUInt32, aafDataValue_t) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetSummaryBufferSize(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetSummary(aafUInt32, aafDataValue_t) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFBWFImportDescriptor> : public IAAFBWFImportDescriptor {
public:
    HRESULT Initialize() override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetFileSecurityReport(aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetFileSecurityReport(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetFileSecurityWave(aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetFileSecurityWave(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT CountUnknownBWFChunks(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT AppendUnknownBWFChunk(IAAFRIFFChunk*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT PrependUnknownBWFChunk(IAAFRIFFChunk*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT InsertUnknownBWFChunkAt(aafUInt32, IAAFRIFFChunk*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetUnknownBWFChunkAt(aafUInt32, IAAFRIFFChunk**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT RemoveUnknownBWFChunkAt(aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetUnknownBWFChunks(IEnumAAFRIFFChunks**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetCodingHistory(aafCharacter_constptr) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetCodingHistory(aafCharacter*, aafUInt32) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetCodingHistoryBufLen(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetBasicData(aafCharacter_constptr) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetBasicData(aafCharacter*, aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetBasicDataBufLen(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetStartOfModulation(aafCharacter_constptr) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetStartOfModulation(aafCharacter*, aafUInt32) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetStartOfModulationBufLen(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetQualityEvent(aafCharacter_constptr) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetQualityEvent(aafCharacter*, aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetQualityEventBufLen(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetEndOfModulation(aafCharacter_constptr) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetEndOfModulation(aafCharacter*, aafUInt32) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetEndOfModulationBufLen(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetQualityParameter(aafCharacter_constptr) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetQualityParameter(aafCharacter*, aafUInt32) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetQualityParameterBufLen(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetOperatorComment(aafCharacter_constptr) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetOperatorComment(aafCharacter*, aafUInt32) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetOperatorCommentBufLen(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetCueSheet(aafCharacter_constptr) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetCueSheet(aafCharacter*, aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetCueSheetBufLen(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFDataEssenceDescriptor> : public IAAFDataEssenceDescriptor {
public:
    HRESULT Initialize() override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetDataEssenceCoding(aafUID_constref) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetDataEssenceCoding(aafUID_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFFilmDescriptor> : public IAAFFilmDescriptor {
public:
    HRESULT SetFilmManufacturer(aafCharacter_constptr) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetFilmManufacturer(aafCharacter*, aafUInt32) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetFilmManufacturerBufLen(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetFilmModel(aafCharacter_constptr) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetFilmModel(aafCharacter*, aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetFilmModelBufLen(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetFilmFormat(aafFilmType_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetFrameRate(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetPerfPerFrame(aafUInt8*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetFilmAspectRatio(aafRational_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetFilmFormat(aafFilmType_t) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetFrameRate(aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetPerfPerFrame(aafUInt8) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetFilmAspectRatio(aafRational_t) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFTIFFDescriptor> : public IAAFTIFFDescriptor {
public:
    HRESULT SetIsUniform(aafBoolean_t) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetIsUniform(aafBoolean_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetIsContiguous(aafBoolean_t) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetIsContiguous(aafBoolean_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetLeadingLines(aafInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetLeadingLines(aafInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetTrailingLines(aafInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetTrailingLines(aafInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetJPEGTableID(aafJPEGTableID_t) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetJPEGTableID(aafJPEGTableID_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetSummary(aafUInt32, aafDataValue_t) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetSummaryBufferSize(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetSummary(aafUInt32, aafDataValue_t) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFWAVEDescriptor> : public IAAFWAVEDescriptor {
public:
    HRESULT Initialize() override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetSummary(aafUInt32, aafDataValue_t) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetSummaryBufferSize(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetSummary(aafUInt32, aafDataValue_t) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

}  // namespace aaf
