// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/aaf/AAFUnknown.h"

// Segments of slots and what they are made of.

struct IAAFComponent;
struct IAAFControlPoint;
struct IAAFDataDef;
struct IAAFDescriptiveFramework;
struct IAAFInterpolationDef;
struct IAAFKLVData;
struct IAAFMob;
struct IAAFOperationDef;
struct IAAFOperationGroup;
struct IAAFParameter;
struct IAAFParameterDef;
struct IAAFSegment;
struct IAAFSourceClip;
struct IAAFSourceReference;
struct IAAFTaggedValue;
struct IAAFTypeDef;
struct IAAFVaryingValue;
struct IEnumAAFComponents;
struct IEnumAAFControlPoints;
struct IEnumAAFKLVData;
struct IEnumAAFParameters;
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

// Answered by AAFTimecode.
struct IAAFTimecode : IUnknown {
    virtual HRESULT Initialize(aafLength_t length, aafTimecode_t* timecode) = 0;  // 3
    virtual HRESULT GetTimecode(aafTimecode_t* timecode) = 0;                     // 4
    virtual HRESULT SetTimecode(aafTimecode_t* timecode) = 0;                     // 5

protected:
    ~IAAFTimecode() = default;
};

inline constexpr GUID IID_IAAFTimecode = ncfGuid("92B88035-2B2B-11D2-BF7E-00104BC9156D");
constexpr const GUID& aafIdOf(const IAAFTimecode*) {
    return IID_IAAFTimecode;
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

// Answered by AAFCommentMarker.
struct IAAFCommentMarker : IUnknown {
    virtual HRESULT GetAnnotation(IAAFSourceReference** result) = 0;     // 3
    virtual HRESULT SetAnnotation(IAAFSourceReference* annotation) = 0;  // 4

protected:
    ~IAAFCommentMarker() = default;
};

inline constexpr GUID IID_IAAFCommentMarker = ncfGuid("E684D78A-B935-11D2-BF9D-00104BC9156D");
constexpr const GUID& aafIdOf(const IAAFCommentMarker*) {
    return IID_IAAFCommentMarker;
}

// Answered by AAFConstantValue.
struct IAAFConstantValue : IUnknown {
    virtual HRESULT Initialize(IAAFParameterDef* parameterDef, aafUInt32 valueSize,
                               aafDataBuffer_t value) = 0;  // 3
    virtual HRESULT GetValue(aafUInt32 valueSize, aafDataBuffer_t value,
                             aafUInt32* bytesRead) = 0;                        // 4
    virtual HRESULT GetValueBufLen(aafUInt32* len) = 0;                        // 5
    virtual HRESULT GetTypeDefinition(IAAFTypeDef** typeDef) = 0;              // 6
    virtual HRESULT SetValue(aafUInt32 valueSize, aafDataBuffer_t value) = 0;  // 7

protected:
    ~IAAFConstantValue() = default;
};

inline constexpr GUID IID_IAAFConstantValue = ncfGuid("B8DDC080-2AFA-11D2-BFA5-006097116212");
constexpr const GUID& aafIdOf(const IAAFConstantValue*) {
    return IID_IAAFConstantValue;
}

// Answered by AAFControlPoint.
struct IAAFControlPoint : IUnknown {
    virtual HRESULT Initialize(IAAFVaryingValue* varyingValue, aafRational_constref time,
                               aafUInt32 valueSize, aafDataBuffer_t value) = 0;  // 3
    virtual HRESULT GetTime(aafRational_t* time) = 0;                            // 4
    virtual HRESULT GetEditHint(aafEditHint_t* editHint) = 0;                    // 5
    virtual HRESULT GetValueBufLen(aafUInt32* len) = 0;                          // 6
    virtual HRESULT GetValue(aafUInt32 valueSize, aafDataBuffer_t value,
                             aafUInt32* bytesRead) = 0;                        // 7
    virtual HRESULT SetTime(aafRational_t time) = 0;                           // 8
    virtual HRESULT SetEditHint(aafEditHint_t editHint) = 0;                   // 9
    virtual HRESULT GetTypeDefinition(IAAFTypeDef** typeDef) = 0;              // 10
    virtual HRESULT SetValue(aafUInt32 valueSize, aafDataBuffer_t value) = 0;  // 11

protected:
    ~IAAFControlPoint() = default;
};

inline constexpr GUID IID_IAAFControlPoint = ncfGuid("86192DB1-2A23-11D2-BFA3-006097116212");
constexpr const GUID& aafIdOf(const IAAFControlPoint*) {
    return IID_IAAFControlPoint;
}

// Answered by AAFDescriptiveClip.
struct IAAFDescriptiveClip : IUnknown {
    virtual HRESULT Initialize(IAAFDataDef* dataDef, aafLength_constref length,
                               aafSourceRef_t sourceRef) = 0;     // 3
    virtual HRESULT CountDescribedSlotIDs(aafUInt32* count) = 0;  // 4
    virtual HRESULT GetDescribedSlotIDs(aafUInt32 maxDescribedSlotIDCount,
                                        aafUInt32* describedSlotIDs) = 0;  // 5
    virtual HRESULT IsDescribedSlotIDPresent(aafUInt32 describedSlotID,
                                             aafBoolean_t* isPresent) = 0;  // 6
    virtual HRESULT AddDescribedSlotID(aafUInt32 describedSlotID) = 0;      // 7
    virtual HRESULT RemoveDescribedSlotID(aafUInt32 describedSlotID) = 0;   // 8

protected:
    ~IAAFDescriptiveClip() = default;
};

inline constexpr GUID IID_IAAFDescriptiveClip = ncfGuid("2E777356-B7E4-43BA-BFD4-F964D90BC5E3");
constexpr const GUID& aafIdOf(const IAAFDescriptiveClip*) {
    return IID_IAAFDescriptiveClip;
}

// Answered by AAFDescriptiveMarker.
struct IAAFDescriptiveMarker : IUnknown {
    virtual HRESULT Initialize() = 0;  // 3
    virtual HRESULT SetDescribedSlotIDs(aafUInt32 numberElements,
                                        aafUInt32* describedSlotIDs) = 0;  // 4
    virtual HRESULT GetDescribedSlotIDs(aafUInt32 numberElements,
                                        aafUInt32* describedSlotIDs) = 0;    // 5
    virtual HRESULT GetDescribedSlotIDsSize(aafUInt32* numberElements) = 0;  // 6
    virtual HRESULT SetDescriptiveFramework(
        IAAFDescriptiveFramework* descriptiveFramework) = 0;  // 7
    virtual HRESULT GetDescriptiveFramework(
        IAAFDescriptiveFramework** descriptiveFramework) = 0;  // 8

protected:
    ~IAAFDescriptiveMarker() = default;
};

inline constexpr GUID IID_IAAFDescriptiveMarker = ncfGuid("C377B78E-591F-4BA9-A069-18438C626E34");
constexpr const GUID& aafIdOf(const IAAFDescriptiveMarker*) {
    return IID_IAAFDescriptiveMarker;
}

// Answered by AAFEdgecode.
struct IAAFEdgecode : IUnknown {
    virtual HRESULT Initialize(aafLength_t length, aafEdgecode_t edgecode) = 0;  // 3
    virtual HRESULT GetEdgecode(aafEdgecode_t* edgecode) = 0;                    // 4

protected:
    ~IAAFEdgecode() = default;
};

inline constexpr GUID IID_IAAFEdgecode = ncfGuid("38E6F8A4-2A2C-11D2-8411-00600832ACB8");
constexpr const GUID& aafIdOf(const IAAFEdgecode*) {
    return IID_IAAFEdgecode;
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

// Answered by AAFEvent.
struct IAAFEvent : IUnknown {
    virtual HRESULT GetPosition(aafPosition_t* position) = 0;                  // 3
    virtual HRESULT SetPosition(aafPosition_t position) = 0;                   // 4
    virtual HRESULT SetComment(aafCharacter_constptr comment) = 0;             // 5
    virtual HRESULT GetComment(aafCharacter* comment, aafUInt32 bufSize) = 0;  // 6
    virtual HRESULT GetCommentBufLen(aafUInt32* bufSize) = 0;                  // 7

protected:
    ~IAAFEvent() = default;
};

inline constexpr GUID IID_IAAFEvent = ncfGuid("E684D790-B935-11D2-BF9D-00104BC9156D");
constexpr const GUID& aafIdOf(const IAAFEvent*) {
    return IID_IAAFEvent;
}

// Answered by AAFGPITrigger.
struct IAAFGPITrigger : IUnknown {
    virtual HRESULT GetActiveState(aafBoolean_t* activeState) = 0;  // 3
    virtual HRESULT SetActiveState(aafBoolean_t activeState) = 0;   // 4

protected:
    ~IAAFGPITrigger() = default;
};

inline constexpr GUID IID_IAAFGPITrigger = ncfGuid("E684D78C-B935-11D2-BF9D-00104BC9156D");
constexpr const GUID& aafIdOf(const IAAFGPITrigger*) {
    return IID_IAAFGPITrigger;
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

// Answered by AAFOperationGroup.
struct IAAFOperationGroup : IUnknown {
    virtual HRESULT Initialize(IAAFDataDef* dataDef, aafLength_t length,
                               IAAFOperationDef* operationDef) = 0;                   // 3
    virtual HRESULT GetOperationDefinition(IAAFOperationDef** operationDef) = 0;      // 4
    virtual HRESULT SetOperationDefinition(IAAFOperationDef* operationDef) = 0;       // 5
    virtual HRESULT GetRender(IAAFSourceReference** sourceRef) = 0;                   // 6
    virtual HRESULT IsATimeWarp(aafBoolean_t* isTimeWarp) = 0;                        // 7
    virtual HRESULT GetBypassOverride(aafUInt32* bypassOverride) = 0;                 // 8
    virtual HRESULT CountSourceSegments(aafUInt32* result) = 0;                       // 9
    virtual HRESULT IsValidTranOperation(aafBoolean_t* validTransition) = 0;          // 10
    virtual HRESULT CountParameters(aafUInt32* result) = 0;                           // 11
    virtual HRESULT AddParameter(IAAFParameter* parameter) = 0;                       // 12
    virtual HRESULT AppendInputSegment(IAAFSegment* segment) = 0;                     // 13
    virtual HRESULT PrependInputSegment(IAAFSegment* segment) = 0;                    // 14
    virtual HRESULT InsertInputSegmentAt(aafUInt32 index, IAAFSegment* segment) = 0;  // 15
    virtual HRESULT SetRender(IAAFSourceReference* sourceRef) = 0;                    // 16
    virtual HRESULT SetBypassOverride(aafUInt32 bypassOverride) = 0;                  // 17
    virtual HRESULT GetParameters(IEnumAAFParameters** enumerator) = 0;               // 18
    virtual HRESULT LookupParameter(aafArgIDType_constref argID,
                                    IAAFParameter** parameter) = 0;                      // 19
    virtual HRESULT GetInputSegmentAt(aafUInt32 index, IAAFSegment** inputSegment) = 0;  // 20
    virtual HRESULT RemoveInputSegmentAt(aafUInt32 index) = 0;                           // 21

protected:
    ~IAAFOperationGroup() = default;
};

inline constexpr GUID IID_IAAFOperationGroup = ncfGuid("3AE3BA82-2C98-11D2-8042-006008143E6F");
constexpr const GUID& aafIdOf(const IAAFOperationGroup*) {
    return IID_IAAFOperationGroup;
}

// Answered by AAFParameter.
struct IAAFParameter : IUnknown {
    virtual HRESULT GetParameterDefinition(IAAFParameterDef** parmDef) = 0;  // 3
    virtual HRESULT GetTypeDefinition(IAAFTypeDef** typeDef) = 0;            // 4

protected:
    ~IAAFParameter() = default;
};

inline constexpr GUID IID_IAAFParameter = ncfGuid("9C568A81-2096-11D2-BF98-006097116212");
constexpr const GUID& aafIdOf(const IAAFParameter*) {
    return IID_IAAFParameter;
}

// Answered by AAFPulldown.
struct IAAFPulldown : IUnknown {
    virtual HRESULT GetInputSegment(IAAFSegment** inputSegment) = 0;                // 3
    virtual HRESULT SetInputSegment(IAAFSegment* inputSegment) = 0;                 // 4
    virtual HRESULT GetPulldownKind(aafPulldownKind_t* pulldownKind) = 0;           // 5
    virtual HRESULT SetPulldownKind(aafPulldownKind_t pulldownKind) = 0;            // 6
    virtual HRESULT GetPulldownDirection(aafPulldownDir_t* pulldownDirection) = 0;  // 7
    virtual HRESULT SetPulldownDirection(aafPulldownDir_t pulldownDirection) = 0;   // 8
    virtual HRESULT GetPhaseFrame(aafPhaseFrame_t* phaseFrame) = 0;                 // 9
    virtual HRESULT SetPhaseFrame(aafPhaseFrame_t phaseFrame) = 0;                  // 10

protected:
    ~IAAFPulldown() = default;
};

inline constexpr GUID IID_IAAFPulldown = ncfGuid("92B88031-2B2B-11D2-BF7E-00104BC9156D");
constexpr const GUID& aafIdOf(const IAAFPulldown*) {
    return IID_IAAFPulldown;
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

// Answered by AAFTimecodeStream.
struct IAAFTimecodeStream : IUnknown {
    virtual HRESULT GetPositionTimecode(aafPosition_t position, aafTimecode_t* timecode) = 0;  // 3
    virtual HRESULT SetPositionTimecode(aafPosition_t position, aafTimecode_t timecode) = 0;   // 4
    virtual HRESULT GetUserDataLength(aafInt32* length) = 0;                                   // 5
    virtual HRESULT GetUserDataAtPosition(aafPosition_t position, aafInt32 buflen,
                                          aafDataBuffer_t buffer) = 0;  // 6
    virtual HRESULT SetUserDataAtPosition(aafPosition_t position, aafInt32 buflen,
                                          aafDataBuffer_t buffer) = 0;       // 7
    virtual HRESULT SetSampleRate(aafRational_t sampleRate) = 0;             // 8
    virtual HRESULT GetSampleRate(aafRational_t* sampleRate) = 0;            // 9
    virtual HRESULT SetSourceType(aafTimecodeSourceType_t sourceType) = 0;   // 10
    virtual HRESULT GetSourceType(aafTimecodeSourceType_t* sourceType) = 0;  // 11
    virtual HRESULT GetSampleSize(aafUInt32* sampleSize) = 0;                // 12
    virtual HRESULT GetSource(aafUInt32 valueSize, aafDataBuffer_t value,
                              aafUInt32* bytesRead) = 0;                        // 13
    virtual HRESULT GetSourceBufLen(aafUInt32* len) = 0;                        // 14
    virtual HRESULT SetSource(aafUInt32 valueSize, aafDataBuffer_t value) = 0;  // 15

protected:
    ~IAAFTimecodeStream() = default;
};

inline constexpr GUID IID_IAAFTimecodeStream = ncfGuid("7B007BF2-2D39-11D2-8043-006008143E6F");
constexpr const GUID& aafIdOf(const IAAFTimecodeStream*) {
    return IID_IAAFTimecodeStream;
}

// Answered by AAFTimecodeStream12M.
struct IAAFTimecodeStream12M : IUnknown {
protected:
    ~IAAFTimecodeStream12M() = default;
};

inline constexpr GUID IID_IAAFTimecodeStream12M = ncfGuid("EBF5EDB2-2D3A-11D2-8043-006008143E6F");
constexpr const GUID& aafIdOf(const IAAFTimecodeStream12M*) {
    return IID_IAAFTimecodeStream12M;
}

// Answered by AAFTransition.
struct IAAFTransition : IUnknown {
    virtual HRESULT Initialize(IAAFDataDef* dataDef, aafLength_t length, aafPosition_t cutPoint,
                               IAAFOperationGroup* op) = 0;                // 3
    virtual HRESULT GetCutPoint(aafPosition_t* cutPoint) = 0;              // 4
    virtual HRESULT GetOperationGroup(IAAFOperationGroup** groupObj) = 0;  // 5
    virtual HRESULT SetCutPoint(aafPosition_t cutPoint) = 0;               // 6
    virtual HRESULT SetOperationGroup(IAAFOperationGroup* opgroup) = 0;    // 7

protected:
    ~IAAFTransition() = default;
};

inline constexpr GUID IID_IAAFTransition = ncfGuid("E3F38312-2D3C-11D2-8043-006008143E6F");
constexpr const GUID& aafIdOf(const IAAFTransition*) {
    return IID_IAAFTransition;
}

// Answered by AAFVaryingValue.
struct IAAFVaryingValue : IUnknown {
    virtual HRESULT Initialize(IAAFParameterDef* parameterDef,
                               IAAFInterpolationDef* interpolation) = 0;                      // 3
    virtual HRESULT AddControlPoint(IAAFControlPoint* controlPoint) = 0;                      // 4
    virtual HRESULT GetControlPoints(IEnumAAFControlPoints** enumerator) = 0;                 // 5
    virtual HRESULT CountControlPoints(aafUInt32* result) = 0;                                // 6
    virtual HRESULT GetControlPointAt(aafUInt32 index, IAAFControlPoint** controlPoint) = 0;  // 7
    virtual HRESULT RemoveControlPointAt(aafUInt32 index) = 0;                                // 8
    virtual HRESULT GetInterpolationDefinition(IAAFInterpolationDef** interpolation) = 0;     // 9
    virtual HRESULT GetValueBufLen(aafInt32* len) = 0;                                        // 10
    virtual HRESULT GetInterpolatedValue(aafRational_t inputValue, aafInt32 valueSize,
                                         aafDataBuffer_t value, aafInt32* bytesRead) = 0;  // 11

protected:
    ~IAAFVaryingValue() = default;
};

inline constexpr GUID IID_IAAFVaryingValue = ncfGuid("91920D60-2A2E-11D2-BFA3-006097116212");
constexpr const GUID& aafIdOf(const IAAFVaryingValue*) {
    return IID_IAAFVaryingValue;
}

// Answered by EnumAAFControlPoints.
struct IEnumAAFControlPoints : IUnknown {
    virtual HRESULT NextOne(IAAFControlPoint** controlPoints) = 0;  // 3
    virtual HRESULT Next(aafUInt32 count, IAAFControlPoint** controlPoints,
                         aafUInt32* numFetched) = 0;                // 4
    virtual HRESULT Skip(aafUInt32 count) = 0;                      // 5
    virtual HRESULT Reset() = 0;                                    // 6
    virtual HRESULT Clone(IEnumAAFControlPoints** enumerator) = 0;  // 7

protected:
    ~IEnumAAFControlPoints() = default;
};

inline constexpr GUID IID_IEnumAAFControlPoints = ncfGuid("B1A2139C-1A7D-11D2-BF78-00104BC9156D");
constexpr const GUID& aafIdOf(const IEnumAAFControlPoints*) {
    return IID_IEnumAAFControlPoints;
}

// Answered by EnumAAFParameters.
struct IEnumAAFParameters : IUnknown {
    virtual HRESULT NextOne(IAAFParameter** parameter) = 0;                                     // 3
    virtual HRESULT Next(aafUInt32 count, IAAFParameter** parameters, aafUInt32* fetched) = 0;  // 4
    virtual HRESULT Skip(aafUInt32 count) = 0;                                                  // 5
    virtual HRESULT Reset() = 0;                                                                // 6
    virtual HRESULT Clone(IEnumAAFParameters** enumerator) = 0;                                 // 7

protected:
    ~IEnumAAFParameters() = default;
};

inline constexpr GUID IID_IEnumAAFParameters = ncfGuid("7227261E-A8C9-11D3-A3ED-0004AC96A937");
constexpr const GUID& aafIdOf(const IEnumAAFParameters*) {
    return IID_IEnumAAFParameters;
}
