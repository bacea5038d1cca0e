// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/header_parser/TrackInfo.h"

// Reads the headers of a QuickTime or ISO base media file from bytes that the
// caller feeds it. The parser never opens the file itself.
//
// Implemented by the host as a component; the module creates one for each movie
// that it tries to read by its headers, and keeps it as long as the clip. One
// parser reads one file, on one thread at a time. First comes a loop of operations
// 18 and 19; everything else answers NMA_E_NOTINITIALIZED until the headers are
// whole, and then as often as it is asked, without reading. Tracks are numbered from
// zero within their kind. Track objects belong to the caller and hold what they need
// of the header themselves.
struct IQTParser : INCFUnknown {
    // 3. Seconds from 1904-01-01 UTC.
    virtual NCFRESULT GetCreationTime(ncfUInt64* seconds) = 0;
    virtual NCFRESULT ReservedParser4() { return NCF_E_NOTIMPL; }  // 4
    // 5. Movie time units per second, above 0.
    virtual NCFRESULT GetTimeScale(ncfUInt32* timescale) = 0;
    // 6. In movie time units.
    virtual NCFRESULT GetMovieDuration(ncfUInt32* duration) = 0;
    virtual NCFRESULT ReservedParser7() { return NCF_E_NOTIMPL; }   // 7
    virtual NCFRESULT ReservedParser8() { return NCF_E_NOTIMPL; }   // 8
    virtual NCFRESULT ReservedParser9() { return NCF_E_NOTIMPL; }   // 9
    virtual NCFRESULT GetVideoTrackCount(ncfUInt32* count) = 0;     // 10
    virtual NCFRESULT GetAudioTrackCount(ncfUInt32* count) = 0;     // 11
    virtual NCFRESULT GetTimeCodeTrackCount(ncfUInt32* count) = 0;  // 12
    virtual NCFRESULT GetOtherTrackCount(ncfUInt32* count) = 0;     // 13
    // 14 to 17. `index` from zero; NCF_E_NOTFOUND beyond the count.
    virtual NCFRESULT GetVideoTrackInfo(ncfUInt32 index, IVideoTrackInfo** track) = 0;  // 14
    virtual NCFRESULT GetAudioTrackInfo(ncfUInt32 index, IAudioTrackInfo** track) = 0;  // 15
    virtual NCFRESULT GetTimeCodeTrackInfo(ncfUInt32 index, ITrackInfo** track) = 0;    // 16
    virtual NCFRESULT GetOtherTrackInfo(ncfUInt32 index, ITrackInfo** track) = 0;       // 17
    // 18. Takes the bytes [begin, end) from `position`, in bytes from the start of
    // the file; behind the end of the file they may be zeros. NCF_OK when all headers
    // are known, QT_E_MOREDATA when it wants the range of operation 19, any other
    // code to give the file up.
    virtual NCFRESULT ParseHeaders(const ncfUInt8* begin, const ncfUInt8* end,
                                   ncfUInt64 position) = 0;
    // 19. Offset and size of the next read, valid after QT_E_MOREDATA. The
    // size is at most 1 MiB and never 0: a longer header is asked for in pieces.
    virtual NCFRESULT GetRecomendedReadPosition(ncfUInt64* position, ncfUInt32* size) = 0;
    // 20. Start address and rate of the first timecode track: a frame lasts
    // `frameDuration` of `timeScale` units per second. `drop` is 0 or 1;
    // `numFrames` is the number of frames in a second of its counting.
    virtual NCFRESULT GetTimeCodeInfo(ncfUInt8* hours, ncfUInt8* minutes, ncfUInt8* seconds,
                                      ncfUInt8* frames, ncfUInt32* timeScale,
                                      ncfUInt32* frameDuration, ncfUInt32* drop,
                                      ncfUInt32* numFrames) = 0;
    // 21. 0 when any sample description refers to another file, else not 0.
    virtual NCFRESULT IsMovieSelfContained(ncfBool* selfContained) = 0;
    // 22. Place and size of the movie atom in bytes, its header included.
    virtual NCFRESULT GetMOOVAtom(ncfUInt64* position, ncfUInt64* size) = 0;

protected:
    ~IQTParser() = default;
};

inline constexpr GUID NCFCompID_QTParser = ncfGuid("40558D46-6475-4E06-9205-162807DB9B7D");
inline constexpr GUID IID_IQTParser = ncfGuid("EA8F868F-6685-49F0-B014-E3D1BB96AD2A");
constexpr const GUID& ncfIdOf(const IQTParser*) {
    return IID_IQTParser;
}

// Further interface that a parser may have: two flags about the colour of the
// picture, returned by value.
//
// The module queries IQTParser for it while it loads the picture. Without it, or
// when neither flag is 0, the colour comes from the sample description; when one is
// 0 the picture is taken for RGB. The reference host's parser leaves it out.
struct IQTParserColor : INCFUnknown {
    virtual ncfUInt32 ColorFlagA() = 0;  // 3
    virtual ncfUInt32 ColorFlagB() = 0;  // 4

protected:
    ~IQTParserColor() = default;
};

inline constexpr GUID IID_IQTParserColor = ncfGuid("98280716-4567-4664-B096-4DC66278A762");
constexpr const GUID& ncfIdOf(const IQTParserColor*) {
    return IID_IQTParserColor;
}
