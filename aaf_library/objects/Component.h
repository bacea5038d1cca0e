// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/model/Object.h"
#include "aaf_library/objects/Annotations.h"
#include "host_interfaces/aaf/AAFComponents.h"
#include "host_interfaces/aaf/AAFDefinitions.h"
#include "not_implemented/AAFComponents.h"

namespace aaf {

// A stretch of essence of one kind. Owned by the slot, sequence or other
// component that it is a part of.
class Component : public Implements<Object, IAAFComponent, IAAFComponent2> {
public:
    HRESULT SetLength(aafLength_constref length) override;
    HRESULT GetLength(aafLength_t* length) override {
        return ReadInteger(prop::Component_Length, length);
    }
    HRESULT SetDataDef(IAAFDataDef* dataDef) override {
        return PutWeak(prop::Component_DataDefinition, dataDef);
    }
    HRESULT GetDataDef(IAAFDataDef** dataDef) override;

    HRESULT AppendKLVData(IAAFKLVData* data) override {
        return AppendObject(prop::Component_KLVData, data);
    }
    HRESULT CountKLVData(aafUInt32* numData) override {
        return ReadCount(prop::Component_KLVData, numData);
    }
    HRESULT GetKLVData(IEnumAAFKLVData** enumerator) override {
        return EnumerateList<IAAFKLVData>(this, prop::Component_KLVData, enumerator);
    }
    HRESULT RemoveKLVData(IAAFKLVData* data) override {
        return RemoveFromList(*this, prop::Component_KLVData, data);
    }
    HRESULT AppendComment(aafCharacter_constptr name, aafCharacter_constptr value) override {
        return AppendTaggedText(*this, prop::Component_UserComments, name, value);
    }
    HRESULT CountComments(aafUInt32* numComments) override {
        return ReadCount(prop::Component_UserComments, numComments);
    }
    HRESULT GetComments(IEnumAAFTaggedValues** enumerator) override {
        return EnumerateList<IAAFTaggedValue>(this, prop::Component_UserComments, enumerator);
    }
    HRESULT RemoveComment(IAAFTaggedValue* comment) override {
        return RemoveFromList(*this, prop::Component_UserComments, comment);
    }
    HRESULT AppendAttribute(aafCharacter_constptr name, aafCharacter_constptr value) override {
        return AppendTaggedText(*this, prop::Component_Attributes, name, value);
    }
    HRESULT CountAttributes(aafUInt32* numAttributes) override {
        return ReadCount(prop::Component_Attributes, numAttributes);
    }
    HRESULT GetAttributes(IEnumAAFTaggedValues** enumerator) override {
        return EnumerateList<IAAFTaggedValue>(this, prop::Component_Attributes, enumerator);
    }
    HRESULT RemoveAttribute(IAAFTaggedValue* attribute) override;
};

// A component that can stand in a slot.
class Segment : public Implements<Component, IAAFSegment> {
public:
    // AAFRESULT_TIMECODE_NOT_FOUND but for timecodes and sequences of them.
    HRESULT SegmentOffsetToTC(aafPosition_t* offset, aafTimecode_t* timecode) override;
    HRESULT SegmentTCToOffset(aafTimecode_t* timecode, aafRational_t* editRate,
                              aafFrameOffset_t* offset) override;
    virtual bool HasTimecode() const { return false; }
};

// Nothing, for a while.
class Filler : public Implements<Segment, IAAFFiller> {
public:
    HRESULT Initialize(IAAFDataDef* dataDef, aafLength_t length) override;
};

}  // namespace aaf
