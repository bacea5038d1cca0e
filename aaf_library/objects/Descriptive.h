// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <functional>

#include "aaf_library/objects/Arrays.h"
#include "aaf_library/objects/OtherComponents.h"
#include "aaf_library/objects/SourceClip.h"
#include "not_implemented/AAFEvents.h"
#include "not_implemented/AAFObjects.h"

// Descriptive metadata, which other programs define and write. This system
// only reads and copies it.

namespace aaf {

// Bases of the classes that a scheme of descriptive metadata defines.
class DescriptiveObject : public Implements<Object, IAAFDescriptiveObject> {};
class DescriptiveFramework : public Implements<Object, IAAFDescriptiveFramework> {};

class DescriptiveMarker : public Implements<CommentMarker, IAAFDescriptiveMarker> {
public:
    HRESULT Initialize() override { return AAFRESULT_SUCCESS; }
    HRESULT SetDescribedSlotIDs(aafUInt32 numberElements, aafUInt32* ids) override {
        return ids == nullptr
                   ? AAFRESULT_NULL_PARAM
                   : PutSet(*this, prop::DescriptiveMarker_DescribedSlots,
                            std::vector<aafUInt32>(ids, ids + numberElements), std::less<>());
    }
    HRESULT GetDescribedSlotIDs(aafUInt32 numberElements, aafUInt32* ids) override {
        return ReadArray(*this, prop::DescriptiveMarker_DescribedSlots, ids,
                         std::size_t{numberElements} * sizeof *ids);
    }
    HRESULT GetDescribedSlotIDsSize(aafUInt32* numberElements) override {
        return CountElements(*this, prop::DescriptiveMarker_DescribedSlots, sizeof(aafUInt32),
                             numberElements);
    }
    HRESULT SetDescriptiveFramework(IAAFDescriptiveFramework* framework) override {
        return PutObject(prop::DescriptiveMarker_Description, framework);
    }
    HRESULT GetDescriptiveFramework(IAAFDescriptiveFramework** framework) override {
        return ReadObject(prop::DescriptiveMarker_Description, framework);
    }
};

class DescriptiveClip : public Implements<SourceClip, IAAFDescriptiveClip> {
public:
    HRESULT Initialize(IAAFDataDef* dataDef, aafLength_constref length,
                       aafSourceRef_t sourceRef) override {
        return SourceClip::Initialize(dataDef, length, sourceRef);
    }
    HRESULT CountDescribedSlotIDs(aafUInt32* count) override {
        return CountElements(*this, prop::DescriptiveClip_DescribedSlotIDs, sizeof(aafUInt32),
                             count);
    }
    HRESULT GetDescribedSlotIDs(aafUInt32 maximum, aafUInt32* ids) override {
        return ReadArray(*this, prop::DescriptiveClip_DescribedSlotIDs, ids,
                         std::size_t{maximum} * sizeof *ids);
    }
    HRESULT IsDescribedSlotIDPresent(aafUInt32 id, aafBoolean_t* isPresent) override {
        return IsElement(*this, prop::DescriptiveClip_DescribedSlotIDs, id, isPresent);
    }
    HRESULT AddDescribedSlotID(aafUInt32 id) override {
        return AddElement(*this, prop::DescriptiveClip_DescribedSlotIDs, id, std::less<>());
    }
    HRESULT RemoveDescribedSlotID(aafUInt32 id) override {
        return RemoveElement(*this, prop::DescriptiveClip_DescribedSlotIDs, id, std::less<>());
    }
};

}  // namespace aaf
