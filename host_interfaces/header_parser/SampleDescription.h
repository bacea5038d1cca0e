// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/framework/String.h"

// What a movie stores about the resolution of its picture: the id of a row in the
// module's data files, and room that is zero.
struct QTNivoResolution {
    ncfUInt32 id;
    ncfUInt32 reserved[7];
};
static_assert(sizeof(QTNivoResolution) == 32, "the parser fills a record of 32 bytes");

// Video sample description (ISO/IEC 14496-12, 12.1.3; QuickTime File Format,
// Video Media): what the samples of a video track are.
//
// Implemented by the host's header parser, given out by IVideoTrackInfo; the module
// asks the first description of the first video track while it loads and describes
// a clip. One thread at a time; nothing changes. Strings belong to the caller.
// Four-character codes are numbers with the first character in the most significant
// byte.
struct IVideoSampleDescription : INCFUnknown {
    virtual NCFRESULT GetDataFormat(ncfUInt32* dataFormat) = 0;              // 3. a code
    virtual NCFRESULT ReservedVideoDescription4() { return NCF_E_NOTIMPL; }  // 4
    // 5. Pixels of the encoded picture.
    virtual NCFRESULT GetEncodedWidthAndHeight(ncfUInt16* width, ncfUInt16* height) = 0;
    virtual NCFRESULT ReservedVideoDescription6() { return NCF_E_NOTIMPL; }  // 6
    virtual NCFRESULT ReservedVideoDescription7() { return NCF_E_NOTIMPL; }  // 7
    virtual NCFRESULT ReservedVideoDescription8() { return NCF_E_NOTIMPL; }  // 8
    virtual NCFRESULT ReservedVideoDescription9() { return NCF_E_NOTIMPL; }  // 9
    // 10. Not 0: depth 32, or a codec that carries alpha by itself.
    virtual NCFRESULT HasAlpha(ncfSInt32* hasAlpha) = 0;
    virtual NCFRESULT ReservedVideoDescription11() { return NCF_E_NOTIMPL; }  // 11
    // 12. Fields in a frame, 1 or 2, whether the top one is first and whether
    // they are stored apart. NCF_E_PARAMETERNOTAVAILABLE without field atom.
    // The last two may be null.
    virtual NCFRESULT GetFieldInfo(ncfUInt32* fieldCount, ncfUInt32* topFieldFirst,
                                   ncfUInt32* split) = 0;
    virtual NCFRESULT ReservedVideoDescription13() { return NCF_E_NOTIMPL; }  // 13
    virtual NCFRESULT ReservedVideoDescription14() { return NCF_E_NOTIMPL; }  // 14
    virtual NCFRESULT ReservedVideoDescription15() { return NCF_E_NOTIMPL; }  // 15
    virtual NCFRESULT ReservedVideoDescription16() { return NCF_E_NOTIMPL; }  // 16
    virtual NCFRESULT ReservedVideoDescription17() { return NCF_E_NOTIMPL; }  // 17
    // 18. A code, 0 when the description names none.
    virtual NCFRESULT GetVendor(ncfUInt32* vendor) = 0;
    // 19. Ratio of the whole picture, clean aperture times pixel aspect,
    // reduced; both numbers above 0.
    virtual NCFRESULT GetImageAspectRatio(ncfUInt32* numerator, ncfUInt32* denominator) = 0;
    // 20. Primaries, transfer and matrix in the codes of ISO/IEC 23091-2;
    // `codes` holds three. NCF_E_PARAMETERNOTAVAILABLE without colour atom.
    virtual NCFRESULT GetVideoColorSpaceDetails(ncfUInt32* codes) = 0;
    virtual NCFRESULT ReservedVideoDescription21() { return NCF_E_NOTIMPL; }  // 21
    virtual NCFRESULT ReservedVideoDescription22() { return NCF_E_NOTIMPL; }  // 22
    virtual NCFRESULT ReservedVideoDescription23() { return NCF_E_NOTIMPL; }  // 23
    // 24, 25. Alpha codings that a code of the form NV.. lists, `index` from zero;
    // a coding of 0 is "no alpha".
    virtual NCFRESULT GetNivoAlphaCodingCount(ncfUInt32* count) = 0;
    virtual NCFRESULT GetNivoAlphaCoding(ncfUInt32 index, ncfUInt32* coding) = 0;
    // 26. NCF_E_PARAMETERNOTAVAILABLE without resolution atom.
    virtual NCFRESULT GetNivoResolution(QTNivoResolution* resolution) = 0;
    virtual NCFRESULT ReservedVideoDescription27() { return NCF_E_NOTIMPL; }  // 27
    virtual NCFRESULT ReservedVideoDescription28() { return NCF_E_NOTIMPL; }  // 28
    // 29, 30. XML texts of the raster and of the colour management; the caller
    // owns the string. Absent: NCF_E_PARAMETERNOTAVAILABLE and null.
    virtual NCFRESULT GetRIAttributes(INCFString** text) = 0;
    virtual NCFRESULT GetCMAttributes(INCFString** text) = 0;

protected:
    ~IVideoSampleDescription() = default;
};

inline constexpr GUID IID_IVideoSampleDescription = ncfGuid("2B7A6E90-4D5C-4F1B-A3C8-5F0B9E7D1402");
constexpr const GUID& ncfIdOf(const IVideoSampleDescription*) {
    return IID_IVideoSampleDescription;
}

// Sound sample description, versions 0, 1 and 2 (QuickTime File Format, Sound
// Media; ISO/IEC 14496-12, 12.2.3): what the samples of a sound track are.
//
// Implemented by the host's header parser, given out by IAudioTrackInfo; the module
// asks the first description of each sound track while it describes and maps a
// clip. One thread at a time; nothing changes.
struct IAudioSampleDescription : INCFUnknown {
    virtual NCFRESULT ReservedAudioDescription3() { return NCF_E_NOTIMPL; }  // 3
    virtual NCFRESULT ReservedAudioDescription4() { return NCF_E_NOTIMPL; }  // 4
    virtual NCFRESULT GetChannelsPerFrame(ncfUInt32* channels) = 0;          // 5
    // 6. True depth of one channel in bits, 0 for compressed sound.
    virtual NCFRESULT GetBitsPerChannel(ncfUInt32* bits) = 0;
    // 7. Frames per second, above 0 and at most 10^9.
    virtual NCFRESULT GetSampleRate(double* rate) = 0;
    virtual NCFRESULT IsConstantBitRate(ncfBool* constant) = 0;  // 8. not 0: it is
    virtual NCFRESULT IsLPCM(ncfBool* isLPCM) = 0;               // 9. not 0: it is
    // 10. Bytes of one frame of all channels for linear sound, of one packet
    // for compressed sound of constant size, else 0.
    virtual NCFRESULT GetBytesPerPacket(ncfUInt32* bytes) = 0;
    virtual NCFRESULT IsLittleEndian(ncfBool* littleEndian) = 0;  // 11. not 0: it is

protected:
    ~IAudioSampleDescription() = default;
};

inline constexpr GUID IID_IAudioSampleDescription = ncfGuid("61E0C7F4-2A93-4E58-9B0D-C4A7183F5D03");
constexpr const GUID& ncfIdOf(const IAudioSampleDescription*) {
    return IID_IAudioSampleDescription;
}
