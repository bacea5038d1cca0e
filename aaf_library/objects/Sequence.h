// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/model/Enumerator.h"
#include "aaf_library/objects/Component.h"
#include "aaf_library/objects/Definitions.h"
#include "host_interfaces/aaf/AAFDefinitionIds.h"
#include "host_interfaces/aaf/AAFDefinitions.h"
#include "not_implemented/AAFComponents.h"

namespace aaf {

// Components one after the other. Its length grows with each component that is
// added and is then a value of its own: a later change of a component does not
// reach it.
class Sequence : public Implements<Segment, IAAFSequence> {
public:
    HRESULT Initialize(IAAFDataDef* dataDef) override { return SetDataDef(dataDef); }
    HRESULT AppendComponent(IAAFComponent* component) override {
        return InsertComponentAt(CountObjects(prop::Sequence_Components), component);
    }
    HRESULT PrependComponent(IAAFComponent* component) override {
        return InsertComponentAt(0, component);
    }
    HRESULT InsertComponentAt(aafUInt32 index, IAAFComponent* component) override;
    HRESULT GetComponentAt(aafUInt32 index, IAAFComponent** component) override {
        return ReadObjectAt(prop::Sequence_Components, index, component);
    }
    HRESULT RemoveComponentAt(aafUInt32 index) override;
    HRESULT CountComponents(aafUInt32* result) override {
        return ReadCount(prop::Sequence_Components, result);
    }
    HRESULT GetComponents(IEnumAAFComponents** enumerator) override;

    // -- IAAFSegment: of the component at the offset, or the first that has the timecode
    HRESULT SegmentOffsetToTC(aafPosition_t* offset, aafTimecode_t* timecode) override;
    HRESULT SegmentTCToOffset(aafTimecode_t* timecode, aafRational_t* editRate,
                              aafFrameOffset_t* offset) override;
    bool HasTimecode() const override;

private:
    // Whether a component of this data definition may stand in the sequence.
    HRESULT CheckDataDefinition(Component& component);
    HRESULT CheckNeighbours(const Component& component, aafUInt32 index) const;
    Component* ComponentAt(aafUInt32 index) const;
};

}  // namespace aaf
