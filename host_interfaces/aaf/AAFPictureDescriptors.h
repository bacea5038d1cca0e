// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/aaf/AAFUnknown.h"

// What a source mob says of pictures: size, layout, sampling, levels, codec. Sizes are
// in pixels and lines, of one field when fields are stored apart. The module fills
// one for each picture track; the host reads them when it prints a description.

// Answered by AAFDigitalImageDescriptor.
struct IAAFDigitalImageDescriptor : IUnknown {
    virtual HRESULT SetCompression(aafUID_constref compression) = 0;                     // 3
    virtual HRESULT GetCompression(aafUID_t* compression) = 0;                           // 4
    virtual HRESULT SetStoredView(aafUInt32 storedHeight, aafUInt32 storedWidth) = 0;    // 5
    virtual HRESULT GetStoredView(aafUInt32* storedHeight, aafUInt32* storedWidth) = 0;  // 6
    virtual HRESULT SetSampledView(aafUInt32 sampledHeight, aafUInt32 sampledWidth,
                                   aafInt32 sampledXOffset, aafInt32 sampledYOffset) = 0;  // 7
    virtual HRESULT GetSampledView(aafUInt32* sampledHeight, aafUInt32* sampledWidth,
                                   aafInt32* sampledXOffset, aafInt32* sampledYOffset) = 0;  // 8
    virtual HRESULT SetDisplayView(aafUInt32 displayHeight, aafUInt32 displayWidth,
                                   aafInt32 displayXOffset, aafInt32 displayYOffset) = 0;  // 9
    virtual HRESULT GetDisplayView(aafUInt32* displayHeight, aafUInt32* displayWidth,
                                   aafInt32* displayXOffset, aafInt32* displayYOffset) = 0;  // 10
    virtual HRESULT SetFrameLayout(aafFrameLayout_t frameLayout) = 0;                        // 11
    virtual HRESULT GetFrameLayout(aafFrameLayout_t* frameLayout) = 0;                       // 12
    virtual HRESULT SetVideoLineMap(aafUInt32 numberElements, aafInt32* videoLineMap) = 0;   // 13
    virtual HRESULT GetVideoLineMap(aafUInt32 numberElements, aafInt32* videoLineMap) = 0;   // 14
    virtual HRESULT GetVideoLineMapSize(aafUInt32* numberElements) = 0;                      // 15
    virtual HRESULT SetImageAspectRatio(aafRational_t imageAspectRatio) = 0;                 // 16
    virtual HRESULT GetImageAspectRatio(aafRational_t* imageAspectRatio) = 0;                // 17
    virtual HRESULT SetAlphaTransparency(aafAlphaTransparency_t alphaTransparency) = 0;      // 18
    virtual HRESULT GetAlphaTransparency(aafAlphaTransparency_t* alphaTransparency) = 0;     // 19
    virtual HRESULT SetGamma(aafUID_t gamma) = 0;                                            // 20
    virtual HRESULT GetGamma(aafUID_t* gamma) = 0;                                           // 21
    virtual HRESULT SetImageAlignmentFactor(aafUInt32 imageAlignmentFactor) = 0;             // 22
    virtual HRESULT GetImageAlignmentFactor(aafUInt32* imageAlignmentFactor) = 0;            // 23

protected:
    ~IAAFDigitalImageDescriptor() = default;
};

inline constexpr GUID IID_IAAFDigitalImageDescriptor =
    ncfGuid("44861701-8AEA-11D2-813C-006097310172");
constexpr const GUID& aafIdOf(const IAAFDigitalImageDescriptor*) {
    return IID_IAAFDigitalImageDescriptor;
}

// Answered by AAFDigitalImageDescriptor.
struct IAAFDigitalImageDescriptor2 : IUnknown {
    virtual HRESULT SetCompression(aafUID_constref compression) = 0;                     // 3
    virtual HRESULT GetCompression(aafUID_t* compression) = 0;                           // 4
    virtual HRESULT SetStoredView(aafUInt32 storedHeight, aafUInt32 storedWidth) = 0;    // 5
    virtual HRESULT GetStoredView(aafUInt32* storedHeight, aafUInt32* storedWidth) = 0;  // 6
    virtual HRESULT SetSampledView(aafUInt32 sampledHeight, aafUInt32 sampledWidth,
                                   aafInt32 sampledXOffset, aafInt32 sampledYOffset) = 0;  // 7
    virtual HRESULT GetSampledView(aafUInt32* sampledHeight, aafUInt32* sampledWidth,
                                   aafInt32* sampledXOffset, aafInt32* sampledYOffset) = 0;  // 8
    virtual HRESULT SetDisplayView(aafUInt32 displayHeight, aafUInt32 displayWidth,
                                   aafInt32 displayXOffset, aafInt32 displayYOffset) = 0;  // 9
    virtual HRESULT GetDisplayView(aafUInt32* displayHeight, aafUInt32* displayWidth,
                                   aafInt32* displayXOffset, aafInt32* displayYOffset) = 0;  // 10
    virtual HRESULT SetFrameLayout(aafFrameLayout_t frameLayout) = 0;                        // 11
    virtual HRESULT GetFrameLayout(aafFrameLayout_t* frameLayout) = 0;                       // 12
    virtual HRESULT SetVideoLineMap(aafUInt32 numberElements, aafInt32* videoLineMap) = 0;   // 13
    virtual HRESULT GetVideoLineMap(aafUInt32 numberElements, aafInt32* videoLineMap) = 0;   // 14
    virtual HRESULT GetVideoLineMapSize(aafUInt32* numberElements) = 0;                      // 15
    virtual HRESULT SetImageAspectRatio(aafRational_t imageAspectRatio) = 0;                 // 16
    virtual HRESULT GetImageAspectRatio(aafRational_t* imageAspectRatio) = 0;                // 17
    virtual HRESULT SetAlphaTransparency(aafAlphaTransparency_t alphaTransparency) = 0;      // 18
    virtual HRESULT GetAlphaTransparency(aafAlphaTransparency_t* alphaTransparency) = 0;     // 19
    virtual HRESULT SetImageAlignmentFactor(aafUInt32 imageAlignmentFactor) = 0;             // 20
    virtual HRESULT GetImageAlignmentFactor(aafUInt32* imageAlignmentFactor) = 0;            // 21
    virtual HRESULT SetTransferCharacteristic(aafUID_constref transferCharacteristic) = 0;   // 22
    virtual HRESULT GetTransferCharacteristic(aafUID_t* transferCharacteristic) = 0;         // 23
    virtual HRESULT SetCodingEquations(aafUID_constref codingEquations) = 0;                 // 24
    virtual HRESULT GetCodingEquations(aafUID_t* codingEquations) = 0;                       // 25
    virtual HRESULT SetColorPrimaries(aafUID_constref colorPrimaries) = 0;                   // 26
    virtual HRESULT GetColorPrimaries(aafUID_t* colorPrimaries) = 0;                         // 27
    virtual HRESULT SetFieldStartOffset(aafUInt32 fieldStartOffset) = 0;                     // 28
    virtual HRESULT GetFieldStartOffset(aafUInt32* fieldStartOffset) = 0;                    // 29
    virtual HRESULT SetFieldEndOffset(aafUInt32 fieldEndOffset) = 0;                         // 30
    virtual HRESULT GetFieldEndOffset(aafUInt32* fieldEndOffset) = 0;                        // 31
    virtual HRESULT SetFieldDominance(aafFieldNumber_t fieldDominance) = 0;                  // 32
    virtual HRESULT GetFieldDominance(aafFieldNumber_t* fieldDominance) = 0;                 // 33
    virtual HRESULT SetDisplayF2Offset(aafInt32 displayF2Offset) = 0;                        // 34
    virtual HRESULT GetDisplayF2Offset(aafInt32* displayF2Offset) = 0;                       // 35
    virtual HRESULT SetStoredF2Offset(aafInt32 storedF2Offset) = 0;                          // 36
    virtual HRESULT GetStoredF2Offset(aafInt32* storedF2Offset) = 0;                         // 37
    virtual HRESULT SetActiveFormatDescriptor(aafUInt8 activeFormatDescriptor) = 0;          // 38
    virtual HRESULT GetActiveFormatDescriptor(aafUInt8* activeFormatDescriptor) = 0;         // 39
    virtual HRESULT SetSignalStandard(aafSignalStandard_t signalStandard) = 0;               // 40
    virtual HRESULT GetSignalStandard(aafSignalStandard_t* signalStandard) = 0;              // 41

protected:
    ~IAAFDigitalImageDescriptor2() = default;
};

inline constexpr GUID IID_IAAFDigitalImageDescriptor2 =
    ncfGuid("F7B9D3BE-773E-4910-9888-C9C4D71561CC");
constexpr const GUID& aafIdOf(const IAAFDigitalImageDescriptor2*) {
    return IID_IAAFDigitalImageDescriptor2;
}

// Answered by AAFCDCIDescriptor.
struct IAAFCDCIDescriptor : IUnknown {
    virtual HRESULT Initialize() = 0;                                                // 3
    virtual HRESULT SetComponentWidth(aafInt32 componentWidth) = 0;                  // 4
    virtual HRESULT GetComponentWidth(aafInt32* componentWidth) = 0;                 // 5
    virtual HRESULT SetHorizontalSubsampling(aafUInt32 horizontalSubsampling) = 0;   // 6
    virtual HRESULT GetHorizontalSubsampling(aafUInt32* horizontalSubsampling) = 0;  // 7
    virtual HRESULT SetVerticalSubsampling(aafUInt32 verticalSubsampling) = 0;       // 8
    virtual HRESULT GetVerticalSubsampling(aafUInt32* verticalSubsampling) = 0;      // 9
    virtual HRESULT SetColorSiting(aafColorSiting_t colorSiting) = 0;                // 10
    virtual HRESULT GetColorSiting(aafColorSiting_t* colorSiting) = 0;               // 11
    virtual HRESULT SetBlackReferenceLevel(aafUInt32 blackReferenceLevel) = 0;       // 12
    virtual HRESULT GetBlackReferenceLevel(aafUInt32* blackReferenceLevel) = 0;      // 13
    virtual HRESULT SetWhiteReferenceLevel(aafUInt32 whiteReferenceLevel) = 0;       // 14
    virtual HRESULT GetWhiteReferenceLevel(aafUInt32* whiteReferenceLevel) = 0;      // 15
    virtual HRESULT SetColorRange(aafUInt32 colorRange) = 0;                         // 16
    virtual HRESULT GetColorRange(aafUInt32* colorRange) = 0;                        // 17
    virtual HRESULT SetPaddingBits(aafInt16 paddingBits) = 0;                        // 18
    virtual HRESULT GetPaddingBits(aafInt16* paddingBits) = 0;                       // 19

protected:
    ~IAAFCDCIDescriptor() = default;
};

inline constexpr GUID IID_IAAFCDCIDescriptor = ncfGuid("44861703-8AEA-11D2-813C-006097310172");
constexpr const GUID& aafIdOf(const IAAFCDCIDescriptor*) {
    return IID_IAAFCDCIDescriptor;
}

// Answered by AAFCDCIDescriptor.
struct IAAFCDCIDescriptor2 : IUnknown {
    virtual HRESULT Initialize() = 0;                                                // 3
    virtual HRESULT SetComponentWidth(aafInt32 componentWidth) = 0;                  // 4
    virtual HRESULT GetComponentWidth(aafInt32* componentWidth) = 0;                 // 5
    virtual HRESULT SetHorizontalSubsampling(aafUInt32 horizontalSubsampling) = 0;   // 6
    virtual HRESULT GetHorizontalSubsampling(aafUInt32* horizontalSubsampling) = 0;  // 7
    virtual HRESULT SetVerticalSubsampling(aafUInt32 verticalSubsampling) = 0;       // 8
    virtual HRESULT GetVerticalSubsampling(aafUInt32* verticalSubsampling) = 0;      // 9
    virtual HRESULT SetColorSiting(aafColorSiting_t colorSiting) = 0;                // 10
    virtual HRESULT GetColorSiting(aafColorSiting_t* colorSiting) = 0;               // 11
    virtual HRESULT SetBlackReferenceLevel(aafUInt32 blackReferenceLevel) = 0;       // 12
    virtual HRESULT GetBlackReferenceLevel(aafUInt32* blackReferenceLevel) = 0;      // 13
    virtual HRESULT SetWhiteReferenceLevel(aafUInt32 whiteReferenceLevel) = 0;       // 14
    virtual HRESULT GetWhiteReferenceLevel(aafUInt32* whiteReferenceLevel) = 0;      // 15
    virtual HRESULT SetColorRange(aafUInt32 colorRange) = 0;                         // 16
    virtual HRESULT GetColorRange(aafUInt32* colorRange) = 0;                        // 17
    virtual HRESULT SetPaddingBits(aafInt16 paddingBits) = 0;                        // 18
    virtual HRESULT GetPaddingBits(aafInt16* paddingBits) = 0;                       // 19
    virtual HRESULT SetAlphaSamplingWidth(aafUInt32 alphaSamplingWidth) = 0;         // 20
    virtual HRESULT GetAlphaSamplingWidth(aafUInt32* alphaSamplingWidth) = 0;        // 21
    virtual HRESULT SetReversedByteOrder(aafBoolean_t reversedByteOrder) = 0;        // 22
    virtual HRESULT GetReversedByteOrder(aafBoolean_t* reversedByteOrder) = 0;       // 23

protected:
    ~IAAFCDCIDescriptor2() = default;
};

inline constexpr GUID IID_IAAFCDCIDescriptor2 = ncfGuid("82B83210-7E2C-417E-92BA-8F42C195906E");
constexpr const GUID& aafIdOf(const IAAFCDCIDescriptor2*) {
    return IID_IAAFCDCIDescriptor2;
}

// Answered by AAFRGBADescriptor.
struct IAAFRGBADescriptor : IUnknown {
    virtual HRESULT SetPixelLayout(aafUInt32 numberElements,
                                   aafRGBAComponent_t* pixelLayoutArray) = 0;  // 3
    virtual HRESULT CountPixelLayoutElements(aafUInt32* result) = 0;           // 4
    virtual HRESULT GetPixelLayout(aafUInt32 numberElements,
                                   aafRGBAComponent_t* pixelLayoutArray) = 0;     // 5
    virtual HRESULT SetPalette(aafUInt32 numberElements, aafUInt8* palette) = 0;  // 6
    virtual HRESULT GetPalette(aafUInt32 numberRecords, aafUInt8* palette) = 0;   // 7
    virtual HRESULT GetPaletteSize(aafUInt32* numberBytes) = 0;                   // 8
    virtual HRESULT CountPaletteLayoutElements(aafUInt32* result) = 0;            // 9
    virtual HRESULT SetPaletteLayout(aafUInt32 numberElements,
                                     aafRGBAComponent_t* paletteLayoutArray) = 0;  // 10
    virtual HRESULT GetPaletteLayout(aafUInt32 numberElements,
                                     aafRGBAComponent_t* paletteLayoutArray) = 0;  // 11

protected:
    ~IAAFRGBADescriptor() = default;
};

inline constexpr GUID IID_IAAFRGBADescriptor = ncfGuid("E684D772-B935-11D2-BF9D-00104BC9156D");
constexpr const GUID& aafIdOf(const IAAFRGBADescriptor*) {
    return IID_IAAFRGBADescriptor;
}

// Answered by AAFRGBADescriptor.
struct IAAFRGBADescriptor2 : IUnknown {
    virtual HRESULT SetPixelLayout(aafUInt32 numberElements,
                                   aafRGBAComponent_t* pixelLayoutArray) = 0;  // 3
    virtual HRESULT CountPixelLayoutElements(aafUInt32* result) = 0;           // 4
    virtual HRESULT GetPixelLayout(aafUInt32 numberElements,
                                   aafRGBAComponent_t* pixelLayoutArray) = 0;     // 5
    virtual HRESULT SetPalette(aafUInt32 numberElements, aafUInt8* palette) = 0;  // 6
    virtual HRESULT GetPalette(aafUInt32 numberRecords, aafUInt8* palette) = 0;   // 7
    virtual HRESULT GetPaletteSize(aafUInt32* numberBytes) = 0;                   // 8
    virtual HRESULT CountPaletteLayoutElements(aafUInt32* result) = 0;            // 9
    virtual HRESULT SetPaletteLayout(aafUInt32 numberElements,
                                     aafRGBAComponent_t* paletteLayoutArray) = 0;  // 10
    virtual HRESULT GetPaletteLayout(aafUInt32 numberElements,
                                     aafRGBAComponent_t* paletteLayoutArray) = 0;         // 11
    virtual HRESULT SetComponentMaxRef(aafUInt32 componentMaxRef) = 0;                    // 12
    virtual HRESULT GetComponentMaxRef(aafUInt32* componentMaxRef) = 0;                   // 13
    virtual HRESULT SetComponentMinRef(aafUInt32 componentMinRef) = 0;                    // 14
    virtual HRESULT GetComponentMinRef(aafUInt32* componentMinRef) = 0;                   // 15
    virtual HRESULT SetAlphaMaxRef(aafUInt32 alphaMaxRef) = 0;                            // 16
    virtual HRESULT GetAlphaMaxRef(aafUInt32* alphaMaxRef) = 0;                           // 17
    virtual HRESULT SetAlphaMinRef(aafUInt32 alphaMinRef) = 0;                            // 18
    virtual HRESULT GetAlphaMinRef(aafUInt32* alphaMinRef) = 0;                           // 19
    virtual HRESULT SetScanningDirection(aafScanningDirection_t scanningDirection) = 0;   // 20
    virtual HRESULT GetScanningDirection(aafScanningDirection_t* scanningDirection) = 0;  // 21

protected:
    ~IAAFRGBADescriptor2() = default;
};

inline constexpr GUID IID_IAAFRGBADescriptor2 = ncfGuid("205C5AAE-727A-46C3-8368-CD8B1D14FBDD");
constexpr const GUID& aafIdOf(const IAAFRGBADescriptor2*) {
    return IID_IAAFRGBADescriptor2;
}

// Answered by AAFMPEGVideoDescriptor.
struct IAAFMPEGVideoDescriptor : IUnknown {
    virtual HRESULT Initialize() = 0;                                                   // 3
    virtual HRESULT SetSingleSequence(aafBoolean_t singleSequence) = 0;                 // 4
    virtual HRESULT GetSingleSequence(aafBoolean_t* singleSequence) = 0;                // 5
    virtual HRESULT SetConstantBPictureCount(aafBoolean_t constantBPictureCount) = 0;   // 6
    virtual HRESULT GetConstantBPictureCount(aafBoolean_t* constantBPictureCount) = 0;  // 7
    virtual HRESULT SetCodedContentScanning(
        aafContentScanningType_t codedContentScanning) = 0;                                  // 8
    virtual HRESULT GetCodedContentScanning(aafContentScanningType_t* contentScanning) = 0;  // 9
    virtual HRESULT SetLowDelay(aafBoolean_t lowDelay) = 0;                                  // 10
    virtual HRESULT GetLowDelay(aafBoolean_t* lowDelay) = 0;                                 // 11
    virtual HRESULT SetClosedGOP(aafBoolean_t closedGOP) = 0;                                // 12
    virtual HRESULT GetClosedGOP(aafBoolean_t* closedGOP) = 0;                               // 13
    virtual HRESULT SetIdenticalGOP(aafBoolean_t identicalGOP) = 0;                          // 14
    virtual HRESULT GetIdenticalGOP(aafBoolean_t* identicalGOP) = 0;                         // 15
    virtual HRESULT SetMaxGOP(aafUInt16 maxGOP) = 0;                                         // 16
    virtual HRESULT GetMaxGOP(aafUInt16* maxGOP) = 0;                                        // 17
    virtual HRESULT SetMaxBPictureCount(aafUInt16 maxBPictureCount) = 0;                     // 18
    virtual HRESULT GetMaxBPictureCount(aafUInt16* maxBPictureCount) = 0;                    // 19
    virtual HRESULT SetBitRate(aafUInt32 bitRate) = 0;                                       // 20
    virtual HRESULT GetBitRate(aafUInt32* bitRate) = 0;                                      // 21
    virtual HRESULT SetProfileAndLevel(aafUInt8 profileAndLevel) = 0;                        // 22
    virtual HRESULT GetProfileAndLevel(aafUInt8* profileAndLevel) = 0;                       // 23

protected:
    ~IAAFMPEGVideoDescriptor() = default;
};

inline constexpr GUID IID_IAAFMPEGVideoDescriptor = ncfGuid("F2768AAC-ED68-4ACE-A8A3-3304E94C799F");
constexpr const GUID& aafIdOf(const IAAFMPEGVideoDescriptor*) {
    return IID_IAAFMPEGVideoDescriptor;
}

// Answered by AAFTIFFDescriptor.
struct IAAFTIFFDescriptor : IUnknown {
    virtual HRESULT SetIsUniform(aafBoolean_t isUniform) = 0;                // 3
    virtual HRESULT GetIsUniform(aafBoolean_t* isUniform) = 0;               // 4
    virtual HRESULT SetIsContiguous(aafBoolean_t isContiguous) = 0;          // 5
    virtual HRESULT GetIsContiguous(aafBoolean_t* isContiguous) = 0;         // 6
    virtual HRESULT SetLeadingLines(aafInt32 leadingLines) = 0;              // 7
    virtual HRESULT GetLeadingLines(aafInt32* leadingLines) = 0;             // 8
    virtual HRESULT SetTrailingLines(aafInt32 trailingLines) = 0;            // 9
    virtual HRESULT GetTrailingLines(aafInt32* trailingLines) = 0;           // 10
    virtual HRESULT SetJPEGTableID(aafJPEGTableID_t JPEGTableID) = 0;        // 11
    virtual HRESULT GetJPEGTableID(aafJPEGTableID_t* JPEGTableID) = 0;       // 12
    virtual HRESULT GetSummary(aafUInt32 size, aafDataValue_t summary) = 0;  // 13
    virtual HRESULT GetSummaryBufferSize(aafUInt32* size) = 0;               // 14
    virtual HRESULT SetSummary(aafUInt32 size, aafDataValue_t summary) = 0;  // 15

protected:
    ~IAAFTIFFDescriptor() = default;
};

inline constexpr GUID IID_IAAFTIFFDescriptor = ncfGuid("E684D76C-B935-11D2-BF9D-00104BC9156D");
constexpr const GUID& aafIdOf(const IAAFTIFFDescriptor*) {
    return IID_IAAFTIFFDescriptor;
}
