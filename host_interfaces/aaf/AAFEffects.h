// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/aaf/AAFUnknown.h"

// Effects as segments: operations, transitions and the values of their parameters.
// Neither module nor host makes them; the library has them for files of others.

struct IAAFControlPoint;
struct IAAFDataDef;
struct IAAFInterpolationDef;
struct IAAFOperationDef;
struct IAAFOperationGroup;
struct IAAFParameter;
struct IAAFParameterDef;
struct IAAFSegment;
struct IAAFSourceReference;
struct IAAFTypeDef;
struct IAAFVaryingValue;
struct IEnumAAFControlPoints;
struct IEnumAAFParameters;

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
