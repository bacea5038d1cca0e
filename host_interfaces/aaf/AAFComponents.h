// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/aaf/AAFUnknown.h"

// Segments: what a mob's slot plays. A clip refers to a slot of another mob, a filler
// to nothing; sequences, groups and scopes hold several. The module gives each slot
// one clip, filler or sequence; the host prints them by their properties
// (AAFObjects.h). Lengths are in edit units of the slot. A holder owns its parts: a
// segment that has an owner can't be given to a second one.

struct IAAFComponent;
struct IAAFDataDef;
struct IAAFKLVData;
struct IAAFMob;
struct IAAFSegment;
struct IAAFSourceClip;
struct IAAFSourceReference;
struct IAAFTaggedValue;
struct IEnumAAFComponents;
struct IEnumAAFKLVData;
struct IEnumAAFSegments;
struct IEnumAAFTaggedValues;

// Answered by AAFSegment.
struct IAAFSegment : IUnknown {
    virtual HRESULT SegmentOffsetToTC(aafPosition_t* offset, aafTimecode_t* timecode) = 0;  // 3
    virtual HRESULT SegmentTCToOffset(aafTimecode_t* timecode, aafRational_t* editRate,
                                      aafFrameOffset_t* offset) = 0;  // 4

protected:
    ~IAAFSegment() = default;
};

inline constexpr GUID IID_IAAFSegment = ncfGuid("7A2F0570-1BA3-11D2-BFAA-006097116212");
constexpr const GUID& aafIdOf(const IAAFSegment*) {
    return IID_IAAFSegment;
}

// Answered by AAFComponent.
struct IAAFComponent : IUnknown {
    virtual HRESULT SetLength(aafLength_constref length) = 0;      // 3
    virtual HRESULT GetLength(aafLength_t* length) = 0;            // 4
    virtual HRESULT SetDataDef(IAAFDataDef* dataDef) = 0;          // 5
    virtual HRESULT GetDataDef(IAAFDataDef** datadef) = 0;         // 6
    virtual HRESULT AppendKLVData(IAAFKLVData* data) = 0;          // 7
    virtual HRESULT CountKLVData(aafUInt32* numData) = 0;          // 8
    virtual HRESULT GetKLVData(IEnumAAFKLVData** enumerator) = 0;  // 9
    virtual HRESULT RemoveKLVData(IAAFKLVData* data) = 0;          // 10

protected:
    ~IAAFComponent() = default;
};

inline constexpr GUID IID_IAAFComponent = ncfGuid("38E6F8A1-2A2C-11D2-8411-00600832ACB8");
constexpr const GUID& aafIdOf(const IAAFComponent*) {
    return IID_IAAFComponent;
}

// Answered by AAFComponent.
struct IAAFComponent2 : IUnknown {
    virtual HRESULT SetLength(aafLength_constref length) = 0;      // 3
    virtual HRESULT GetLength(aafLength_t* length) = 0;            // 4
    virtual HRESULT SetDataDef(IAAFDataDef* dataDef) = 0;          // 5
    virtual HRESULT GetDataDef(IAAFDataDef** datadef) = 0;         // 6
    virtual HRESULT AppendKLVData(IAAFKLVData* data) = 0;          // 7
    virtual HRESULT CountKLVData(aafUInt32* numData) = 0;          // 8
    virtual HRESULT GetKLVData(IEnumAAFKLVData** enumerator) = 0;  // 9
    virtual HRESULT RemoveKLVData(IAAFKLVData* data) = 0;          // 10
    virtual HRESULT AppendComment(aafCharacter_constptr name,
                                  aafCharacter_constptr value) = 0;      // 11
    virtual HRESULT CountComments(aafUInt32* numComments) = 0;           // 12
    virtual HRESULT GetComments(IEnumAAFTaggedValues** enumerator) = 0;  // 13
    virtual HRESULT RemoveComment(IAAFTaggedValue* comment) = 0;         // 14
    virtual HRESULT AppendAttribute(aafCharacter_constptr name,
                                    aafCharacter_constptr value) = 0;      // 15
    virtual HRESULT CountAttributes(aafUInt32* numAttributes) = 0;         // 16
    virtual HRESULT GetAttributes(IEnumAAFTaggedValues** enumerator) = 0;  // 17
    virtual HRESULT RemoveAttribute(IAAFTaggedValue* attribute) = 0;       // 18

protected:
    ~IAAFComponent2() = default;
};

inline constexpr GUID IID_IAAFComponent2 = ncfGuid("C703E7F5-B97F-44FB-87DA-A412E60EA6AA");
constexpr const GUID& aafIdOf(const IAAFComponent2*) {
    return IID_IAAFComponent2;
}

// Answered by AAFSequence.
struct IAAFSequence : IUnknown {
    virtual HRESULT Initialize(IAAFDataDef* dataDef) = 0;                              // 3
    virtual HRESULT AppendComponent(IAAFComponent* component) = 0;                     // 4
    virtual HRESULT PrependComponent(IAAFComponent* component) = 0;                    // 5
    virtual HRESULT InsertComponentAt(aafUInt32 index, IAAFComponent* component) = 0;  // 6
    virtual HRESULT GetComponentAt(aafUInt32 index, IAAFComponent** component) = 0;    // 7
    virtual HRESULT RemoveComponentAt(aafUInt32 index) = 0;                            // 8
    virtual HRESULT CountComponents(aafUInt32* result) = 0;                            // 9
    virtual HRESULT GetComponents(IEnumAAFComponents** enumerator) = 0;                // 10

protected:
    ~IAAFSequence() = default;
};

inline constexpr GUID IID_IAAFSequence = ncfGuid("66E855F0-2BC2-11D2-BFAA-006097116212");
constexpr const GUID& aafIdOf(const IAAFSequence*) {
    return IID_IAAFSequence;
}

// Answered by EnumAAFComponents.
struct IEnumAAFComponents : IUnknown {
    virtual HRESULT NextOne(IAAFComponent** component) = 0;  // 3
    virtual HRESULT Next(aafUInt32 count, IAAFComponent** components,
                         aafUInt32* numFetched) = 0;             // 4
    virtual HRESULT Skip(aafUInt32 count) = 0;                   // 5
    virtual HRESULT Reset() = 0;                                 // 6
    virtual HRESULT Clone(IEnumAAFComponents** enumerator) = 0;  // 7

protected:
    ~IEnumAAFComponents() = default;
};

inline constexpr GUID IID_IEnumAAFComponents = ncfGuid("B1A21394-1A7D-11D2-BF78-00104BC9156D");
constexpr const GUID& aafIdOf(const IEnumAAFComponents*) {
    return IID_IEnumAAFComponents;
}

// Answered by AAFSourceReference.
struct IAAFSourceReference : IUnknown {
    virtual HRESULT GetSourceID(aafMobID_t* sourceID) = 0;           // 3
    virtual HRESULT SetSourceID(aafMobID_constref sourceID) = 0;     // 4
    virtual HRESULT GetSourceMobSlotID(aafSlotID_t* mobSlotID) = 0;  // 5
    virtual HRESULT SetSourceMobSlotID(aafSlotID_t mobSlotID) = 0;   // 6

protected:
    ~IAAFSourceReference() = default;
};

inline constexpr GUID IID_IAAFSourceReference = ncfGuid("92B88033-2B2B-11D2-BF7E-00104BC9156D");
constexpr const GUID& aafIdOf(const IAAFSourceReference*) {
    return IID_IAAFSourceReference;
}

// Answered by AAFSourceReference.
struct IAAFSourceReference2 : IUnknown {
    virtual HRESULT GetSourceID(aafMobID_t* sourceID) = 0;                               // 3
    virtual HRESULT SetSourceID(aafMobID_constref sourceID) = 0;                         // 4
    virtual HRESULT GetSourceMobSlotID(aafSlotID_t* mobSlotID) = 0;                      // 5
    virtual HRESULT SetSourceMobSlotID(aafSlotID_t mobSlotID) = 0;                       // 6
    virtual HRESULT SetChannelIDs(aafUInt32 numberElements, aafUInt32* channelIDs) = 0;  // 7
    virtual HRESULT GetChannelIDs(aafUInt32 numberElements, aafUInt32* channelIDs) = 0;  // 8
    virtual HRESULT GetChannelIDsSize(aafUInt32* size) = 0;                              // 9
    virtual HRESULT SetMonoSourceSlotIDs(aafUInt32 numberElements,
                                         aafUInt32* monoSourceSlotIDs) = 0;  // 10
    virtual HRESULT GetMonoSourceSlotIDs(aafUInt32 numberElements,
                                         aafUInt32* monoSourceSlotIDs) = 0;  // 11
    virtual HRESULT GetMonoSourceSlotIDsSize(aafUInt32* size) = 0;           // 12

protected:
    ~IAAFSourceReference2() = default;
};

inline constexpr GUID IID_IAAFSourceReference2 = ncfGuid("EB3094C4-F60E-4AA3-B500-BA72C4C791B7");
constexpr const GUID& aafIdOf(const IAAFSourceReference2*) {
    return IID_IAAFSourceReference2;
}

// Answered by AAFSourceClip.
struct IAAFSourceClip : IUnknown {
    virtual HRESULT Initialize(IAAFDataDef* dataDef, aafLength_constref length,
                               aafSourceRef_t sourceRef) = 0;  // 3
    virtual HRESULT GetFade(aafLength_t* fadeInLen, aafFadeType_t* fadeInType,
                            aafBoolean_t* fadeInPresent, aafLength_t* fadeOutLen,
                            aafFadeType_t* fadeOutType, aafBoolean_t* fadeOutPresent) = 0;  // 4
    virtual HRESULT ResolveRef(IAAFMob** mob) = 0;                                          // 5
    virtual HRESULT GetSourceReference(aafSourceRef_t* sourceRef) = 0;                      // 6
    virtual HRESULT SetFade(aafInt32 fadeInLen, aafFadeType_t fadeInType, aafInt32 fadeOutLen,
                            aafFadeType_t fadeOutType) = 0;            // 7
    virtual HRESULT SetSourceReference(aafSourceRef_t sourceRef) = 0;  // 8

protected:
    ~IAAFSourceClip() = default;
};

inline constexpr GUID IID_IAAFSourceClip = ncfGuid("38E6F8A7-2A2C-11D2-8411-00600832ACB8");
constexpr const GUID& aafIdOf(const IAAFSourceClip*) {
    return IID_IAAFSourceClip;
}

// Answered by AAFFiller.
struct IAAFFiller : IUnknown {
    virtual HRESULT Initialize(IAAFDataDef* dataDef, aafLength_t length) = 0;  // 3

protected:
    ~IAAFFiller() = default;
};

inline constexpr GUID IID_IAAFFiller = ncfGuid("38E6F8A9-2A2C-11D2-8411-00600832ACB8");
constexpr const GUID& aafIdOf(const IAAFFiller*) {
    return IID_IAAFFiller;
}

// Answered by EnumAAFSegments.
struct IEnumAAFSegments : IUnknown {
    virtual HRESULT NextOne(IAAFSegment** segments) = 0;                                       // 3
    virtual HRESULT Next(aafUInt32 count, IAAFSegment** segments, aafUInt32* numFetched) = 0;  // 4
    virtual HRESULT Skip(aafUInt32 count) = 0;                                                 // 5
    virtual HRESULT Reset() = 0;                                                               // 6
    virtual HRESULT Clone(IEnumAAFSegments** enumerator) = 0;                                  // 7

protected:
    ~IEnumAAFSegments() = default;
};

inline constexpr GUID IID_IEnumAAFSegments = ncfGuid("B1A213A2-1A7D-11D2-BF78-00104BC9156D");
constexpr const GUID& aafIdOf(const IEnumAAFSegments*) {
    return IID_IEnumAAFSegments;
}

// Answered by AAFEssenceGroup.
struct IAAFEssenceGroup : IUnknown {
    virtual HRESULT SetStillFrame(IAAFSourceClip* stillFrame) = 0;             // 3
    virtual HRESULT GetStillFrame(IAAFSourceClip** stillFrame) = 0;            // 4
    virtual HRESULT AppendChoice(IAAFSegment* choice) = 0;                     // 5
    virtual HRESULT PrependChoice(IAAFSegment* choice) = 0;                    // 6
    virtual HRESULT InsertChoiceAt(aafUInt32 index, IAAFSegment* choice) = 0;  // 7
    virtual HRESULT CountChoices(aafUInt32* count) = 0;                        // 8
    virtual HRESULT GetChoiceAt(aafUInt32 index, IAAFSegment** choice) = 0;    // 9
    virtual HRESULT RemoveChoiceAt(aafUInt32 index) = 0;                       // 10

protected:
    ~IAAFEssenceGroup() = default;
};

inline constexpr GUID IID_IAAFEssenceGroup = ncfGuid("E58A8567-2A3E-11D2-BFA4-006097116212");
constexpr const GUID& aafIdOf(const IAAFEssenceGroup*) {
    return IID_IAAFEssenceGroup;
}

// Answered by AAFNestedScope.
struct IAAFNestedScope : IUnknown {
    virtual HRESULT AppendSegment(IAAFSegment* segment) = 0;                     // 3
    virtual HRESULT PrependSegment(IAAFSegment* segment) = 0;                    // 4
    virtual HRESULT InsertSegmentAt(aafUInt32 index, IAAFSegment* segment) = 0;  // 5
    virtual HRESULT RemoveSegmentAt(aafUInt32 index) = 0;                        // 6
    virtual HRESULT CountSegments(aafUInt32* result) = 0;                        // 7
    virtual HRESULT GetSegmentAt(aafUInt32 index, IAAFSegment** segment) = 0;    // 8
    virtual HRESULT GetSegments(IEnumAAFSegments** enumerator) = 0;              // 9

protected:
    ~IAAFNestedScope() = default;
};

inline constexpr GUID IID_IAAFNestedScope = ncfGuid("E44BE451-2099-11D2-BF98-006097116212");
constexpr const GUID& aafIdOf(const IAAFNestedScope*) {
    return IID_IAAFNestedScope;
}

// Answered by AAFScopeReference.
struct IAAFScopeReference : IUnknown {
    virtual HRESULT Create(aafUInt32 relativeScope, aafUInt32 relativeSlot) = 0;  // 3
    virtual HRESULT Initialize(IAAFDataDef* dataDef, aafUInt32 relativeScope,
                               aafUInt32 relativeSlot) = 0;            // 4
    virtual HRESULT GetRelativeScope(aafUInt32* pnRelativeScope) = 0;  // 5
    virtual HRESULT GetRelativeSlot(aafUInt32* pnRelativeSlot) = 0;    // 6

protected:
    ~IAAFScopeReference() = default;
};

inline constexpr GUID IID_IAAFScopeReference = ncfGuid("E44BE453-2099-11D2-BF98-006097116212");
constexpr const GUID& aafIdOf(const IAAFScopeReference*) {
    return IID_IAAFScopeReference;
}

// Answered by AAFSelector.
struct IAAFSelector : IUnknown {
    virtual HRESULT GetSelectedSegment(IAAFSegment** selSegment) = 0;          // 3
    virtual HRESULT SetSelectedSegment(IAAFSegment* selSegment) = 0;           // 4
    virtual HRESULT AppendAlternateSegment(IAAFSegment* segment) = 0;          // 5
    virtual HRESULT GetNumAlternateSegments(aafInt32* numSegments) = 0;        // 6
    virtual HRESULT EnumAlternateSegments(IEnumAAFSegments** enumerator) = 0;  // 7
    virtual HRESULT RemoveAlternateSegment(IAAFSegment* segment) = 0;          // 8

protected:
    ~IAAFSelector() = default;
};

inline constexpr GUID IID_IAAFSelector = ncfGuid("E684D788-B935-11D2-BF9D-00104BC9156D");
constexpr const GUID& aafIdOf(const IAAFSelector*) {
    return IID_IAAFSelector;
}
