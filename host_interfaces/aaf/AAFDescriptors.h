// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/aaf/AAFUnknown.h"

// What a source mob says of its essence.

struct IAAFCodecDef;
struct IAAFContainerDef;
struct IAAFFileDescriptor;
struct IAAFLocator;
struct IAAFRIFFChunk;
struct IEnumAAFFileDescriptors;
struct IEnumAAFLocators;
struct IEnumAAFRIFFChunks;

// Answered by AAFEssenceDescriptor.
struct IAAFEssenceDescriptor : IUnknown {
    virtual HRESULT CountLocators(aafUInt32* result) = 0;                        // 3
    virtual HRESULT AppendLocator(IAAFLocator* locator) = 0;                     // 4
    virtual HRESULT PrependLocator(IAAFLocator* locator) = 0;                    // 5
    virtual HRESULT InsertLocatorAt(aafUInt32 index, IAAFLocator* locator) = 0;  // 6
    virtual HRESULT GetLocatorAt(aafUInt32 index, IAAFLocator** locator) = 0;    // 7
    virtual HRESULT RemoveLocatorAt(aafUInt32 index) = 0;                        // 8
    virtual HRESULT GetLocators(IEnumAAFLocators** enumerator) = 0;              // 9

protected:
    ~IAAFEssenceDescriptor() = default;
};

inline constexpr GUID IID_IAAFEssenceDescriptor = ncfGuid("94659783-2A3C-11D2-BFA4-006097116212");
constexpr const GUID& aafIdOf(const IAAFEssenceDescriptor*) {
    return IID_IAAFEssenceDescriptor;
}

// Answered by AAFFileDescriptor.
struct IAAFFileDescriptor : IUnknown {
    virtual HRESULT SetLength(aafLength_t length) = 0;                  // 3
    virtual HRESULT GetLength(aafLength_t* length) = 0;                 // 4
    virtual HRESULT SetCodecDef(IAAFCodecDef* codecDef) = 0;            // 5
    virtual HRESULT GetCodecDef(IAAFCodecDef** codecDef) = 0;           // 6
    virtual HRESULT SetSampleRate(aafRational_constref rate) = 0;       // 7
    virtual HRESULT GetSampleRate(aafRational_t* rate) = 0;             // 8
    virtual HRESULT SetContainerFormat(IAAFContainerDef* format) = 0;   // 9
    virtual HRESULT GetContainerFormat(IAAFContainerDef** format) = 0;  // 10

protected:
    ~IAAFFileDescriptor() = default;
};

inline constexpr GUID IID_IAAFFileDescriptor = ncfGuid("E58A8561-2A3E-11D2-BFA4-006097116212");
constexpr const GUID& aafIdOf(const IAAFFileDescriptor*) {
    return IID_IAAFFileDescriptor;
}

// Answered by AAFFileDescriptor.
struct IAAFFileDescriptor2 : IUnknown {
    virtual HRESULT SetLength(aafLength_t length) = 0;                  // 3
    virtual HRESULT GetLength(aafLength_t* length) = 0;                 // 4
    virtual HRESULT SetCodecDef(IAAFCodecDef* codecDef) = 0;            // 5
    virtual HRESULT GetCodecDef(IAAFCodecDef** codecDef) = 0;           // 6
    virtual HRESULT SetSampleRate(aafRational_constref rate) = 0;       // 7
    virtual HRESULT GetSampleRate(aafRational_t* rate) = 0;             // 8
    virtual HRESULT SetContainerFormat(IAAFContainerDef* format) = 0;   // 9
    virtual HRESULT GetContainerFormat(IAAFContainerDef** format) = 0;  // 10
    virtual HRESULT SetLinkedSlotID(aafUInt32 linkedSlotID) = 0;        // 11
    virtual HRESULT GetLinkedSlotID(aafUInt32* linkedSlotID) = 0;       // 12

protected:
    ~IAAFFileDescriptor2() = default;
};

inline constexpr GUID IID_IAAFFileDescriptor2 = ncfGuid("38C1088B-F0F2-47C7-9413-361262AE9F07");
constexpr const GUID& aafIdOf(const IAAFFileDescriptor2*) {
    return IID_IAAFFileDescriptor2;
}

// Answered by AAFMultipleDescriptor.
struct IAAFMultipleDescriptor : IUnknown {
    virtual HRESULT Initialize() = 0;                                               // 3
    virtual HRESULT CountFileDescriptors(aafUInt32* result) = 0;                    // 4
    virtual HRESULT AppendFileDescriptor(IAAFFileDescriptor* fileDescriptor) = 0;   // 5
    virtual HRESULT PrependFileDescriptor(IAAFFileDescriptor* fileDescriptor) = 0;  // 6
    virtual HRESULT InsertFileDescriptorAt(aafUInt32 index,
                                           IAAFFileDescriptor* fileDescriptor) = 0;  // 7
    virtual HRESULT GetFileDescriptorAt(aafUInt32 index,
                                        IAAFFileDescriptor** fileDescriptor) = 0;  // 8
    virtual HRESULT RemoveFileDescriptorAt(aafUInt32 index) = 0;                   // 9
    virtual HRESULT GetFileDescriptors(IEnumAAFFileDescriptors** enumerator) = 0;  // 10

protected:
    ~IAAFMultipleDescriptor() = default;
};

inline constexpr GUID IID_IAAFMultipleDescriptor = ncfGuid("DABF53CF-1EC3-43A2-9418-F22FB87C38F4");
constexpr const GUID& aafIdOf(const IAAFMultipleDescriptor*) {
    return IID_IAAFMultipleDescriptor;
}

// Answered by EnumAAFFileDescriptors.
struct IEnumAAFFileDescriptors : IUnknown {
    virtual HRESULT NextOne(IAAFFileDescriptor** fileDescriptors) = 0;  // 3
    virtual HRESULT Next(aafUInt32 count, IAAFFileDescriptor** fileDescriptors,
                         aafUInt32* numFetched) = 0;                  // 4
    virtual HRESULT Skip(aafUInt32 count) = 0;                        // 5
    virtual HRESULT Reset() = 0;                                      // 6
    virtual HRESULT Clone(IEnumAAFFileDescriptors** enumerator) = 0;  // 7

protected:
    ~IEnumAAFFileDescriptors() = default;
};

inline constexpr GUID IID_IEnumAAFFileDescriptors = ncfGuid("FD4B6BC0-0787-4F5E-9FBD-37282B8706E7");
constexpr const GUID& aafIdOf(const IEnumAAFFileDescriptors*) {
    return IID_IEnumAAFFileDescriptors;
}

// Answered by AAFImportDescriptor.
struct IAAFImportDescriptor : IUnknown {
    virtual HRESULT Initialize() = 0;  // 3

protected:
    ~IAAFImportDescriptor() = default;
};

inline constexpr GUID IID_IAAFImportDescriptor = ncfGuid("2CAA17DF-DDBC-4AC5-A87E-166FCD06CC9C");
constexpr const GUID& aafIdOf(const IAAFImportDescriptor*) {
    return IID_IAAFImportDescriptor;
}

// Answered by AAFPhysicalDescriptor.
struct IAAFPhysicalDescriptor : IUnknown {
protected:
    ~IAAFPhysicalDescriptor() = default;
};

inline constexpr GUID IID_IAAFPhysicalDescriptor = ncfGuid("E3A1234E-A544-448E-95F0-ED4944EDAFC8");
constexpr const GUID& aafIdOf(const IAAFPhysicalDescriptor*) {
    return IID_IAAFPhysicalDescriptor;
}

// Answered by AAFRecordingDescriptor.
struct IAAFRecordingDescriptor : IUnknown {
    virtual HRESULT Initialize() = 0;  // 3

protected:
    ~IAAFRecordingDescriptor() = default;
};

inline constexpr GUID IID_IAAFRecordingDescriptor = ncfGuid("A6542226-19A7-40EE-9650-A3B9C66CCFE7");
constexpr const GUID& aafIdOf(const IAAFRecordingDescriptor*) {
    return IID_IAAFRecordingDescriptor;
}

// Answered by AAFAuxiliaryDescriptor.
struct IAAFAuxiliaryDescriptor : IUnknown {
    virtual HRESULT Initialize() = 0;                                            // 3
    virtual HRESULT SetMimeType(aafCharacter_constptr mimeType) = 0;             // 4
    virtual HRESULT GetMimeType(aafCharacter* mimeType, aafUInt32 bufSize) = 0;  // 5
    virtual HRESULT GetMimeTypeBufLen(aafUInt32* bufSize) = 0;                   // 6
    virtual HRESULT SetCharSet(aafCharacter_constptr charSet) = 0;               // 7
    virtual HRESULT GetCharSet(aafCharacter* charSet, aafUInt32 bufSize) = 0;    // 8
    virtual HRESULT GetCharSetBufLen(aafUInt32* bufSize) = 0;                    // 9

protected:
    ~IAAFAuxiliaryDescriptor() = default;
};

inline constexpr GUID IID_IAAFAuxiliaryDescriptor = ncfGuid("197A9CB2-48DE-40A3-B965-59531D3FCF23");
constexpr const GUID& aafIdOf(const IAAFAuxiliaryDescriptor*) {
    return IID_IAAFAuxiliaryDescriptor;
}

// Answered by AAFTapeDescriptor.
struct IAAFTapeDescriptor : IUnknown {
    virtual HRESULT Initialize() = 0;                                                 // 3
    virtual HRESULT SetTapeManufacturer(aafCharacter_constptr tapeManufacturer) = 0;  // 4
    virtual HRESULT GetTapeManufacturer(aafCharacter* tapeManufacturer,
                                        aafUInt32 bufSize) = 0;                    // 5
    virtual HRESULT GetTapeManufacturerBufLen(aafUInt32* bufSize) = 0;             // 6
    virtual HRESULT SetTapeModel(aafCharacter_constptr tapeModel) = 0;             // 7
    virtual HRESULT GetTapeModel(aafCharacter* tapeModel, aafUInt32 bufSize) = 0;  // 8
    virtual HRESULT GetTapeModelBufLen(aafUInt32* bufSize) = 0;                    // 9
    virtual HRESULT SetTapeFormFactor(aafTapeCaseType_t formFactor) = 0;           // 10
    virtual HRESULT GetTapeFormFactor(aafTapeCaseType_t* formFactor) = 0;          // 11
    virtual HRESULT SetSignalType(aafVideoSignalType_t videoSignal) = 0;           // 12
    virtual HRESULT GetSignalType(aafVideoSignalType_t* videoSignal) = 0;          // 13
    virtual HRESULT SetTapeFormat(aafTapeFormatType_t tapeFormat) = 0;             // 14
    virtual HRESULT GetTapeFormat(aafTapeFormatType_t* tapeFormat) = 0;            // 15
    virtual HRESULT SetTapeLength(aafUInt32 tapeLength) = 0;                       // 16
    virtual HRESULT GetTapeLength(aafUInt32* tapeLength) = 0;                      // 17

protected:
    ~IAAFTapeDescriptor() = default;
};

inline constexpr GUID IID_IAAFTapeDescriptor = ncfGuid("E58A8569-2A3E-11D2-BFA4-006097116212");
constexpr const GUID& aafIdOf(const IAAFTapeDescriptor*) {
    return IID_IAAFTapeDescriptor;
}

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

// Answered by AAFPCMDescriptor.
struct IAAFPCMDescriptor : IUnknown {
    virtual HRESULT Initialize() = 0;                                                   // 3
    virtual HRESULT SetBlockAlign(aafUInt16 blockAlign) = 0;                            // 4
    virtual HRESULT GetBlockAlign(aafUInt16* blockAlign) = 0;                           // 5
    virtual HRESULT SetSequenceOffset(aafUInt8 offset) = 0;                             // 6
    virtual HRESULT GetSequenceOffset(aafUInt8* offset) = 0;                            // 7
    virtual HRESULT SetAverageBPS(aafUInt32 bps) = 0;                                   // 8
    virtual HRESULT GetAverageBPS(aafUInt32* bps) = 0;                                  // 9
    virtual HRESULT SetChannelAssignment(aafUID_constref channelAssignment) = 0;        // 10
    virtual HRESULT GetChannelAssignment(aafUID_t* channelAssignment) = 0;              // 11
    virtual HRESULT AreAllPeakEnvelopePropertiesPresent(aafBoolean_t* arePresent) = 0;  // 12
    virtual HRESULT SetPeakEnvelopeVersion(aafUInt32 version) = 0;                      // 13
    virtual HRESULT GetPeakEnvelopeVersion(aafUInt32* version) = 0;                     // 14
    virtual HRESULT SetPeakEnvelopeFormat(aafUInt32 format) = 0;                        // 15
    virtual HRESULT GetPeakEnvelopeFormat(aafUInt32* format) = 0;                       // 16
    virtual HRESULT SetPointsPerPeakValue(aafUInt32 pointCount) = 0;                    // 17
    virtual HRESULT GetPointsPerPeakValue(aafUInt32* pointCount) = 0;                   // 18
    virtual HRESULT SetPeakEnvelopeBlockSize(aafUInt32 blockSize) = 0;                  // 19
    virtual HRESULT GetPeakEnvelopeBlockSize(aafUInt32* blockSize) = 0;                 // 20
    virtual HRESULT SetPeakChannelCount(aafUInt32 channelCount) = 0;                    // 21
    virtual HRESULT GetPeakChannelCount(aafUInt32* channelCount) = 0;                   // 22
    virtual HRESULT SetPeakFrameCount(aafUInt32 frameCount) = 0;                        // 23
    virtual HRESULT GetPeakFrameCount(aafUInt32* frameCount) = 0;                       // 24
    virtual HRESULT SetPeakOfPeaksPosition(aafPosition_t position) = 0;                 // 25
    virtual HRESULT GetPeakOfPeaksPosition(aafPosition_t* position) = 0;                // 26
    virtual HRESULT SetPeakEnvelopeTimestamp(aafTimeStamp_constref timeStamp) = 0;      // 27
    virtual HRESULT GetPeakEnvelopeTimestamp(aafTimeStamp_t* timeStamp) = 0;            // 28
    virtual HRESULT SetPeakEnvelopeDataPosition(aafPosition_t position) = 0;            // 29
    virtual HRESULT GetPeakEnvelopeDataPosition(aafPosition_t* position) = 0;           // 30
    virtual HRESULT GetPeakEnvelopeDataSize(aafLength_t* size) = 0;                     // 31
    virtual HRESULT WritePeakEnvelopeData(aafUInt32 bytes, aafDataBuffer_t buffer,
                                          aafUInt32* bytesWritten) = 0;  // 32
    virtual HRESULT ReadPeakEnvelopeData(aafUInt32 bytes, aafDataBuffer_t buffer,
                                         aafUInt32* bytesRead) = 0;  // 33

protected:
    ~IAAFPCMDescriptor() = default;
};

inline constexpr GUID IID_IAAFPCMDescriptor = ncfGuid("F17D58D8-5107-47E4-9ABA-8329FC1B2C84");
constexpr const GUID& aafIdOf(const IAAFPCMDescriptor*) {
    return IID_IAAFPCMDescriptor;
}

// Answered by AAFSoundDescriptor.
struct IAAFSoundDescriptor : IUnknown {
    virtual HRESULT SetCompression(aafUID_constref compression) = 0;  // 3
    virtual HRESULT GetCompression(aafUID_t* compression) = 0;        // 4
    virtual HRESULT SetChannelCount(aafUInt32 channelCount) = 0;      // 5
    virtual HRESULT GetChannelCount(aafUInt32* channelCount) = 0;     // 6
    virtual HRESULT SetAudioSamplingRate(aafRational_t rate) = 0;     // 7
    virtual HRESULT GetAudioSamplingRate(aafRational_t* rate) = 0;    // 8
    virtual HRESULT SetIsLocked(aafBoolean_t locked) = 0;             // 9
    virtual HRESULT IsLocked(aafBoolean_t* locked) = 0;               // 10
    virtual HRESULT SetElectroSpatialFormulation(
        aafElectroSpatialFormulation_t formulation) = 0;  // 11
    virtual HRESULT GetElectroSpatialFormulation(
        aafElectroSpatialFormulation_t* formulation) = 0;           // 12
    virtual HRESULT SetAudioRefLevel(aafInt8 level) = 0;            // 13
    virtual HRESULT GetAudioRefLevel(aafInt8* level) = 0;           // 14
    virtual HRESULT SetDialNorm(aafInt8 dialNorm) = 0;              // 15
    virtual HRESULT GetDialNorm(aafInt8* dialNorm) = 0;             // 16
    virtual HRESULT SetQuantizationBits(aafUInt32 bitsCount) = 0;   // 17
    virtual HRESULT GetQuantizationBits(aafUInt32* bitsCount) = 0;  // 18

protected:
    ~IAAFSoundDescriptor() = default;
};

inline constexpr GUID IID_IAAFSoundDescriptor = ncfGuid("DDC8931E-1A32-4362-BD78-450D0D970047");
constexpr const GUID& aafIdOf(const IAAFSoundDescriptor*) {
    return IID_IAAFSoundDescriptor;
}

// Answered by AAFAES3PCMDescriptor.
struct IAAFAES3PCMDescriptor : IUnknown {
    virtual HRESULT Initialize() = 0;  // 3

protected:
    ~IAAFAES3PCMDescriptor() = default;
};

inline constexpr GUID IID_IAAFAES3PCMDescriptor = ncfGuid("2EBFFDE0-5997-414D-808B-6BAA4A74F40F");
constexpr const GUID& aafIdOf(const IAAFAES3PCMDescriptor*) {
    return IID_IAAFAES3PCMDescriptor;
}

// Answered by AAFAES3PCMDescriptor.
struct IAAFAES3PCMDescriptor2 : IUnknown {
    virtual HRESULT Initialize() = 0;                                       // 3
    virtual HRESULT GetEmphasis(aafEmphasisType_t* emphasisType) = 0;       // 4
    virtual HRESULT SetEmphasis(aafEmphasisType_t emphasisType) = 0;        // 5
    virtual HRESULT GetBlockStartOffset(aafUInt16* blockStartOffset) = 0;   // 6
    virtual HRESULT SetBlockStartOffset(aafUInt16 blockStartOffset) = 0;    // 7
    virtual HRESULT GetAuxBitsMode(aafAuxBitsModeType_t* auxBitsMode) = 0;  // 8
    virtual HRESULT SetAuxBitsMode(aafAuxBitsModeType_t auxBitsMode) = 0;   // 9
    virtual HRESULT GetChannelStatusModeAt(
        aafUInt32 index,
        aafChannelStatusModeType_t* channelStatusMode) = 0;  // 10
    virtual HRESULT SetChannelStatusModeAt(aafUInt32 index,
                                           aafChannelStatusModeType_t channelStatusMode) = 0;  // 11
    virtual HRESULT GetFixedChannelStatusDataAt(aafUInt32 index, aafUInt32 sizeOfBuffer,
                                                aafUInt8* fixedChannelStatusData) = 0;  // 12
    virtual HRESULT SetFixedChannelStatusDataAt(aafUInt32 index, aafUInt32 sizeOfBuffer,
                                                aafUInt8* fixedChannelStatusData) = 0;  // 13
    virtual HRESULT GetUserDataModeAt(aafUInt32 index,
                                      aafUserDataModeType_t* userDataMode) = 0;  // 14
    virtual HRESULT SetUserDataModeAt(aafUInt32 index,
                                      aafUserDataModeType_t userDataMode) = 0;  // 15
    virtual HRESULT GetFixedUserDataAt(aafUInt32 index, aafUInt32 sizeOfBuffer,
                                       aafUInt8* fixedUserData) = 0;  // 16
    virtual HRESULT SetFixedUserDataAt(aafUInt32 index, aafUInt32 sizeOfBuffer,
                                       aafUInt8* fixedUserData) = 0;  // 17

protected:
    ~IAAFAES3PCMDescriptor2() = default;
};

inline constexpr GUID IID_IAAFAES3PCMDescriptor2 = ncfGuid("5D7D099B-02EB-4DC8-AFE8-01CE131F5663");
constexpr const GUID& aafIdOf(const IAAFAES3PCMDescriptor2*) {
    return IID_IAAFAES3PCMDescriptor2;
}

// Answered by AAFAIFCDescriptor.
struct IAAFAIFCDescriptor : IUnknown {
    virtual HRESULT Initialize() = 0;                                        // 3
    virtual HRESULT GetSummary(aafUInt32 size, aafDataValue_t summary) = 0;  // 4
    virtual HRESULT GetSummaryBufferSize(aafUInt32* size) = 0;               // 5
    virtual HRESULT SetSummary(aafUInt32 size, aafDataValue_t summary) = 0;  // 6

protected:
    ~IAAFAIFCDescriptor() = default;
};

inline constexpr GUID IID_IAAFAIFCDescriptor = ncfGuid("E684D774-B935-11D2-BF9D-00104BC9156D");
constexpr const GUID& aafIdOf(const IAAFAIFCDescriptor*) {
    return IID_IAAFAIFCDescriptor;
}

// Answered by AAFBWFImportDescriptor.
struct IAAFBWFImportDescriptor : IUnknown {
    virtual HRESULT Initialize() = 0;                                                      // 3
    virtual HRESULT SetFileSecurityReport(aafUInt32 fileSecurityReport) = 0;               // 4
    virtual HRESULT GetFileSecurityReport(aafUInt32* fileSecurityReport) = 0;              // 5
    virtual HRESULT SetFileSecurityWave(aafUInt32 fileSecurityWave) = 0;                   // 6
    virtual HRESULT GetFileSecurityWave(aafUInt32* fileSecurityWave) = 0;                  // 7
    virtual HRESULT CountUnknownBWFChunks(aafUInt32* numData) = 0;                         // 8
    virtual HRESULT AppendUnknownBWFChunk(IAAFRIFFChunk* data) = 0;                        // 9
    virtual HRESULT PrependUnknownBWFChunk(IAAFRIFFChunk* data) = 0;                       // 10
    virtual HRESULT InsertUnknownBWFChunkAt(aafUInt32 index, IAAFRIFFChunk* data) = 0;     // 11
    virtual HRESULT GetUnknownBWFChunkAt(aafUInt32 index, IAAFRIFFChunk** data) = 0;       // 12
    virtual HRESULT RemoveUnknownBWFChunkAt(aafUInt32 index) = 0;                          // 13
    virtual HRESULT GetUnknownBWFChunks(IEnumAAFRIFFChunks** enumerator) = 0;              // 14
    virtual HRESULT SetCodingHistory(aafCharacter_constptr codingHistory) = 0;             // 15
    virtual HRESULT GetCodingHistory(aafCharacter* codingHistory, aafUInt32 bufSize) = 0;  // 16
    virtual HRESULT GetCodingHistoryBufLen(aafUInt32* bufSize) = 0;                        // 17
    virtual HRESULT SetBasicData(aafCharacter_constptr basicData) = 0;                     // 18
    virtual HRESULT GetBasicData(aafCharacter* basicData, aafUInt32 bufSize) = 0;          // 19
    virtual HRESULT GetBasicDataBufLen(aafUInt32* bufSize) = 0;                            // 20
    virtual HRESULT SetStartOfModulation(aafCharacter_constptr startOfModulation) = 0;     // 21
    virtual HRESULT GetStartOfModulation(aafCharacter* startOfModulation,
                                         aafUInt32 bufSize) = 0;                               // 22
    virtual HRESULT GetStartOfModulationBufLen(aafUInt32* bufSize) = 0;                        // 23
    virtual HRESULT SetQualityEvent(aafCharacter_constptr qualityEvent) = 0;                   // 24
    virtual HRESULT GetQualityEvent(aafCharacter* qualityEvent, aafUInt32 bufSize) = 0;        // 25
    virtual HRESULT GetQualityEventBufLen(aafUInt32* bufSize) = 0;                             // 26
    virtual HRESULT SetEndOfModulation(aafCharacter_constptr endOfModulation) = 0;             // 27
    virtual HRESULT GetEndOfModulation(aafCharacter* endOfModulation, aafUInt32 bufSize) = 0;  // 28
    virtual HRESULT GetEndOfModulationBufLen(aafUInt32* bufSize) = 0;                          // 29
    virtual HRESULT SetQualityParameter(aafCharacter_constptr qualityParameter) = 0;           // 30
    virtual HRESULT GetQualityParameter(aafCharacter* qualityParameter,
                                        aafUInt32 bufSize) = 0;                                // 31
    virtual HRESULT GetQualityParameterBufLen(aafUInt32* bufSize) = 0;                         // 32
    virtual HRESULT SetOperatorComment(aafCharacter_constptr operatorComment) = 0;             // 33
    virtual HRESULT GetOperatorComment(aafCharacter* operatorComment, aafUInt32 bufSize) = 0;  // 34
    virtual HRESULT GetOperatorCommentBufLen(aafUInt32* bufSize) = 0;                          // 35
    virtual HRESULT SetCueSheet(aafCharacter_constptr cueSheet) = 0;                           // 36
    virtual HRESULT GetCueSheet(aafCharacter* cueSheet, aafUInt32 bufSize) = 0;                // 37
    virtual HRESULT GetCueSheetBufLen(aafUInt32* bufSize) = 0;                                 // 38

protected:
    ~IAAFBWFImportDescriptor() = default;
};

inline constexpr GUID IID_IAAFBWFImportDescriptor = ncfGuid("480B4328-DA10-44D4-BB50-1BAFBFBAF86A");
constexpr const GUID& aafIdOf(const IAAFBWFImportDescriptor*) {
    return IID_IAAFBWFImportDescriptor;
}

// Answered by AAFDataEssenceDescriptor.
struct IAAFDataEssenceDescriptor : IUnknown {
    virtual HRESULT Initialize() = 0;                                             // 3
    virtual HRESULT SetDataEssenceCoding(aafUID_constref dataEssenceCoding) = 0;  // 4
    virtual HRESULT GetDataEssenceCoding(aafUID_t* dataEssenceCoding) = 0;        // 5

protected:
    ~IAAFDataEssenceDescriptor() = default;
};

inline constexpr GUID IID_IAAFDataEssenceDescriptor =
    ncfGuid("28AEF97C-5127-4435-98C8-BAF906B5A6A9");
constexpr const GUID& aafIdOf(const IAAFDataEssenceDescriptor*) {
    return IID_IAAFDataEssenceDescriptor;
}

// Answered by AAFFilmDescriptor.
struct IAAFFilmDescriptor : IUnknown {
    virtual HRESULT SetFilmManufacturer(aafCharacter_constptr filmManufacturer) = 0;  // 3
    virtual HRESULT GetFilmManufacturer(aafCharacter* filmManufacturer,
                                        aafUInt32 bufSize) = 0;                    // 4
    virtual HRESULT GetFilmManufacturerBufLen(aafUInt32* bufSize) = 0;             // 5
    virtual HRESULT SetFilmModel(aafCharacter_constptr filmModel) = 0;             // 6
    virtual HRESULT GetFilmModel(aafCharacter* filmModel, aafUInt32 bufSize) = 0;  // 7
    virtual HRESULT GetFilmModelBufLen(aafUInt32* bufSize) = 0;                    // 8
    virtual HRESULT GetFilmFormat(aafFilmType_t* filmFormat) = 0;                  // 9
    virtual HRESULT GetFrameRate(aafUInt32* rate) = 0;                             // 10
    virtual HRESULT GetPerfPerFrame(aafUInt8* perfPerFrame) = 0;                   // 11
    virtual HRESULT GetFilmAspectRatio(aafRational_t* aspectRatio) = 0;            // 12
    virtual HRESULT SetFilmFormat(aafFilmType_t filmFormat) = 0;                   // 13
    virtual HRESULT SetFrameRate(aafUInt32 rate) = 0;                              // 14
    virtual HRESULT SetPerfPerFrame(aafUInt8 perfPerFrame) = 0;                    // 15
    virtual HRESULT SetFilmAspectRatio(aafRational_t aspectRatio) = 0;             // 16

protected:
    ~IAAFFilmDescriptor() = default;
};

inline constexpr GUID IID_IAAFFilmDescriptor = ncfGuid("E58A8563-2A3E-11D2-BFA4-006097116212");
constexpr const GUID& aafIdOf(const IAAFFilmDescriptor*) {
    return IID_IAAFFilmDescriptor;
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

// Answered by AAFWAVEDescriptor.
struct IAAFWAVEDescriptor : IUnknown {
    virtual HRESULT Initialize() = 0;                                        // 3
    virtual HRESULT GetSummary(aafUInt32 size, aafDataValue_t summary) = 0;  // 4
    virtual HRESULT GetSummaryBufferSize(aafUInt32* size) = 0;               // 5
    virtual HRESULT SetSummary(aafUInt32 size, aafDataValue_t summary) = 0;  // 6

protected:
    ~IAAFWAVEDescriptor() = default;
};

inline constexpr GUID IID_IAAFWAVEDescriptor = ncfGuid("4C2E1692-8AE6-11D2-813C-006097310172");
constexpr const GUID& aafIdOf(const IAAFWAVEDescriptor*) {
    return IID_IAAFWAVEDescriptor;
}
