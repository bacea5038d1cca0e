// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/objects/Component.h"

namespace aaf {

HRESULT Component::SetLength(aafLength_constref length) {
    if (length < 0) {
        return AAFRESULT_BAD_LENGTH;
    }
    return PutInteger(prop::Component_Length, length);
}

HRESULT Component::GetDataDef(IAAFDataDef** dataDef) {
    const HRESULT result = ReadWeak(prop::Component_DataDefinition, dataDef);
    return result == AAFRESULT_PROP_NOT_PRESENT ? AAFRESULT_OBJECT_NOT_FOUND : result;
}

HRESULT Component::RemoveAttribute(IAAFTaggedValue* attribute) {
    return RemoveFromList(*this, prop::Component_Attributes, attribute);
}

HRESULT Segment::SegmentOffsetToTC(aafPosition_t* offset, aafTimecode_t* timecode) {
    return offset == nullptr || timecode == nullptr ? AAFRESULT_NULL_PARAM
                                                    : AAFRESULT_TIMECODE_NOT_FOUND;
}

HRESULT Segment::SegmentTCToOffset(aafTimecode_t* timecode, aafRational_t* editRate,
                                   aafFrameOffset_t* offset) {
    return timecode == nullptr || editRate == nullptr || offset == nullptr
               ? AAFRESULT_NULL_PARAM
               : AAFRESULT_TIMECODE_NOT_FOUND;
}

HRESULT Filler::Initialize(IAAFDataDef* dataDef, aafLength_t length) {
    if (dataDef == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    if (length < 0) {
        return AAFRESULT_BAD_LENGTH;
    }
    const HRESULT result = SetDataDef(dataDef);
    return result < 0 ? result : SetLength(length);
}

}  // namespace aaf
