// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/objects/Timecode.h"

#include <cstring>

#include "aaf_library/model/Model.h"
#include "aaf_library/objects/Checks.h"
#include "aaf_library/objects/Rates.h"
#include "host_interfaces/aaf/AAFClassIds.h"
#include "host_interfaces/aaf/AAFDefinitionIds.h"

namespace aaf {

namespace {

// Gives a component the data definition of that id, which every dictionary has.
HRESULT PutBuiltInDataDefinition(Object& component, const aafUID_t& id) {
    Unknown* definition = component.model()->FindTarget(AUID_AAFDataDef, id);
    return definition == nullptr
               ? AAFRESULT_NO_MORE_OBJECTS
               : component.PutWeak(prop::Component_DataDefinition, definition->Identity());
}

bool IsDrop(aafDropType_t drop) {
    return drop == kAAFTcNonDrop || drop == kAAFTcDrop;
}

}  // namespace

HRESULT Timecode::Initialize(aafLength_t length, aafTimecode_t* timecode) {
    if (timecode == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    if (IsInitialized()) {
        return AAFRESULT_ALREADY_INITIALIZED;
    }
    if (!IsDrop(timecode->drop)) {
        return AAFRESULT_INVALID_TIMECODE;
    }
    HRESULT result = SetLength(length);
    if (result >= 0) {
        result = PutBuiltInDataDefinition(*this, kAAFDataDef_LegacyTimecode);
    }
    return result < 0 ? result : Store(*timecode);
}

HRESULT Timecode::GetTimecode(aafTimecode_t* timecode) {
    if (timecode == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    if (!IsInitialized()) {
        return AAFRESULT_NOT_INITIALIZED;
    }
    std::memset(timecode, 0, sizeof *timecode);
    timecode->startFrame = IntegerOr(prop::Timecode_Start, 0);
    timecode->drop = static_cast<aafDropType_t>(IntegerOr(prop::Timecode_Drop, 0));
    timecode->fps = static_cast<aafUInt16>(IntegerOr(prop::Timecode_FPS, 0));
    return AAFRESULT_SUCCESS;
}

HRESULT Timecode::SetTimecode(aafTimecode_t* timecode) {
    if (timecode == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    if (!IsInitialized()) {
        return AAFRESULT_NOT_INITIALIZED;
    }
    return IsDrop(timecode->drop) ? Store(*timecode) : AAFRESULT_INVALID_TIMECODE;
}

HRESULT Timecode::Store(const aafTimecode_t& timecode) {
    PutInteger(prop::Timecode_Start, timecode.startFrame);
    PutInteger(prop::Timecode_Drop, timecode.drop);
    return PutInteger(prop::Timecode_FPS, timecode.fps);
}

HRESULT Timecode::SegmentOffsetToTC(aafPosition_t* offset, aafTimecode_t* timecode) {
    if (offset == nullptr || timecode == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    aafTimecode_t found{};
    if (const HRESULT result = GetTimecode(&found); result < 0) {
        return result;
    }
    if (__builtin_add_overflow(found.startFrame, *offset, &found.startFrame)) {
        return AAFRESULT_INVALID_PARAM;
    }
    *timecode = found;
    return AAFRESULT_SUCCESS;
}

HRESULT Timecode::SegmentTCToOffset(aafTimecode_t* timecode, aafRational_t* editRate,
                                    aafFrameOffset_t* offset) {
    if (timecode == nullptr || editRate == nullptr || offset == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    aafTimecode_t own{};
    if (const HRESULT result = GetTimecode(&own); result < 0) {
        return result;
    }
    const aafInt64 nominal = NominalFrames(*editRate);
    if (nominal == 0) {
        return AAFRESULT_BADRATE;
    }
    if (timecode->fps != own.fps || timecode->drop != own.drop || own.fps == 0) {
        return AAFRESULT_INVALID_TIMECODE;
    }
    aafFrameOffset_t frames = 0;
    if (__builtin_sub_overflow(timecode->startFrame, own.startFrame, &frames) || frames < 0 ||
        frames >= IntegerOr(prop::Component_Length, 0)) {
        return AAFRESULT_BADSAMPLEOFFSET;
    }
    // A count of 30 in a slot of 29.97 still is one to one.
    *offset = nominal == own.fps ? frames : Rescaled(frames, {own.fps, 1}, *editRate);
    return AAFRESULT_SUCCESS;
}

bool Edgecode::IsKnown(aafFilmType_t filmKind, aafEdgeType_t codeFormat) {
    return IsWithin(filmKind, kAAFFtNull, kAAFFt65MM) &&
           (IsWithin(codeFormat, kAAFEtNull, kAAFEtEdgenum5) || codeFormat == kAAFEtHeaderSize);
}

HRESULT Edgecode::Initialize(aafLength_t length, aafEdgecode_t edgecode) {
    if (!IsKnown(edgecode.filmKind, edgecode.codeFormat)) {
        return AAFRESULT_INVALID_ENUM_VALUE;
    }
    HRESULT result = SetLength(length);
    if (result >= 0) {
        result = PutBuiltInDataDefinition(*this, kAAFDataDef_Edgecode);
    }
    if (result < 0) {
        return result;
    }
    PutInteger(prop::EdgeCode_Start, edgecode.startFrame);
    PutInteger(prop::EdgeCode_FilmKind, edgecode.filmKind);
    PutInteger(prop::EdgeCode_CodeFormat, edgecode.codeFormat);
    return PutNative(prop::EdgeCode_Header, edgecode.header, sizeof edgecode.header);
}

HRESULT Edgecode::GetEdgecode(aafEdgecode_t* edgecode) {
    if (edgecode == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    aafEdgecode_t found{};
    HRESULT result = ReadInteger(prop::EdgeCode_Start, &found.startFrame);
    if (result >= 0) {
        result = ReadInteger(prop::EdgeCode_FilmKind, &found.filmKind);
    }
    if (result >= 0) {
        result = ReadInteger(prop::EdgeCode_CodeFormat, &found.codeFormat);
    }
    if (result < 0) {
        return result;
    }
    ReadNative(prop::EdgeCode_Header, found.header, sizeof found.header);
    *edgecode = found;
    return AAFRESULT_SUCCESS;
}

}  // namespace aaf
