// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/model/Object.h"
#include "host_interfaces/aaf/AAFComponents.h"
#include "not_implemented/AAFComponents.h"

namespace aaf {

// A stretch of essence of one kind. Owned by the slot, sequence or other
// component that it is a part of.
class Component : public Implements<Object, IAAFComponent, IAAFComponent2> {
public:
    HRESULT SetLength(aafLength_constref length) override;
    HRESULT GetLength(aafLength_t* length) override;
    HRESULT SetDataDef(IAAFDataDef* dataDef) override;
    HRESULT GetDataDef(IAAFDataDef** dataDef) override;

    HRESULT AppendKLVData(IAAFKLVData* data) override;
    HRESULT CountKLVData(aafUInt32* numData) override;
    HRESULT GetKLVData(IEnumAAFKLVData** enumerator) override;
    HRESULT RemoveKLVData(IAAFKLVData* data) override;
    HRESULT AppendComment(aafCharacter_constptr name, aafCharacter_constptr value) override;
    HRESULT CountComments(aafUInt32* numComments) override;
    HRESULT GetComments(IEnumAAFTaggedValues** enumerator) override;
    HRESULT RemoveComment(IAAFTaggedValue* comment) override;
    HRESULT AppendAttribute(aafCharacter_constptr name, aafCharacter_constptr value) override;
    HRESULT CountAttributes(aafUInt32* numAttributes) override;
    HRESULT GetAttributes(IEnumAAFTaggedValues** enumerator) override;
    HRESULT RemoveAttribute(IAAFTaggedValue* attribute) override;
};

// A component that can stand in a slot.
class Segment : public Implements<Component, IAAFSegment> {};

// Nothing, for a while.
class Filler : public Implements<Segment, IAAFFiller> {
public:
    HRESULT Initialize(IAAFDataDef* dataDef, aafLength_t length) override;
};

}  // namespace aaf
