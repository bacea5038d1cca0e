// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/objects/Component.h"
#include "not_implemented/AAFTimecodes.h"

namespace aaf {

// Timecode that counts on from a start. It brings its length and the timecode
// data definition along by itself.
class Timecode : public Implements<Segment, IAAFTimecode> {
public:
    HRESULT Initialize(aafLength_t length, aafTimecode_t* timecode) override;
    HRESULT GetTimecode(aafTimecode_t* timecode) override;
    HRESULT SetTimecode(aafTimecode_t* timecode) override;

    HRESULT SegmentOffsetToTC(aafPosition_t* offset, aafTimecode_t* timecode) override;
    // The offset of a timecode of the same count, in edit units of that rate. Outside the segment:
    // AAFRESULT_BADSAMPLEOFFSET.
    HRESULT SegmentTCToOffset(aafTimecode_t* timecode, aafRational_t* editRate,
                              aafFrameOffset_t* offset) override;
    bool HasTimecode() const override { return true; }

private:
    bool IsInitialized() const { return IsPresent(prop::Timecode_Start); }
    HRESULT Store(const aafTimecode_t& timecode);
};

// Edge code of film that counts on from a start.
class Edgecode : public Implements<Segment, IAAFEdgecode> {
public:
    // Whether both are members of their enumerations.
    static bool IsKnown(aafFilmType_t filmKind, aafEdgeType_t codeFormat);

    HRESULT Initialize(aafLength_t length, aafEdgecode_t edgecode) override;
    HRESULT GetEdgecode(aafEdgecode_t* edgecode) override;
};

}  // namespace aaf
