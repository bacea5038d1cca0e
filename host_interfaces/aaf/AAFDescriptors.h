// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/aaf/AAFUnknown.h"

// What a source mob says of its essence, of whatever kind: a file, several files in
// one, an import, a tape. The mob owns its descriptor, and the descriptor its
// locators. The module gives the file mob a multiple descriptor, with a child for
// each track, and the source mob an import descriptor. Pictures and sound:
// AAFPictureDescriptors.h, AAFSoundDescriptors.h.

struct IAAFCodecDef;
struct IAAFContainerDef;
struct IAAFFileDescriptor;
struct IAAFLocator;
struct IEnumAAFFileDescriptors;
struct IEnumAAFLocators;

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
