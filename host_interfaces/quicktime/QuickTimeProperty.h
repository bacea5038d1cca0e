// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/framework/Buffer.h"
#include "host_interfaces/framework/String.h"

namespace QuickTime {

// Answers about the codec of a movie's picture: what a mapping's formats are made
// of, and a codec's name for a description.
//
// Implemented by the host as a component; the module creates one for a clip when it
// first needs it. All mappings of the clip share it, so it may be asked on several
// threads at once. 4, 6 and 7 need operation 3 before them.
struct IQuickTimeProperty : INCFUnknown {
    // 3. Opens the movie that the other operations speak of. May come again, for the
    // same movie or another.
    virtual NCFRESULT CreateMovie(INCFString* path) = 0;
    // 4. Codes of pixel formats, `count` 32-bit numbers in the codec's order of
    // preference. The caller owns the buffer. A count of 0 is allowed.
    virtual NCFRESULT GetCodecPixelFormats(INCFBuffer** codes, ncfUInt32* count) = 0;
    // 5. A person's name for the codec, assigned to the caller's string; empty
    // for a well-formed but unknown code, a failure for code 0 or unprintable
    // ones. Works before CreateMovie.
    virtual NCFRESULT GetCodecName(ncfUInt32 codecType, INCFString* name) = 0;
    virtual NCFRESULT GetCodecStorageType(ncfUInt32* type) = 0;       // 6. 0 Y'CbCr, 1 RGB
    virtual NCFRESULT DoesCodecSupportRGB_CCIR(ncfUInt32* flag) = 0;  // 7. RGB in video range

protected:
    ~IQuickTimeProperty() = default;
};

inline constexpr GUID CompID_QuickTimeProperty = ncfGuid("962000B9-686A-4AB8-B7B3-C4DE54843FDC");
inline constexpr GUID IID_IQuickTimeProperty = ncfGuid("B353C798-86C5-4DBF-8C46-FA9310EB5B2E");
constexpr const GUID& ncfIdOf(const IQuickTimeProperty*) {
    return IID_IQuickTimeProperty;
}

}  // namespace QuickTime
