// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/aaf/AAFUnknown.h"

// Definitions of effects: operations, their parameters, and how values between two
// points are found. A dictionary owns them. Neither module nor host uses effects; the
// library has them for files of others.

struct IAAFDataDef;
struct IAAFInterpolationDef;
struct IAAFOperationDef;
struct IAAFParameterDef;
struct IAAFTypeDef;
struct IEnumAAFInterpolationDefs;
struct IEnumAAFOperationDefs;
struct IEnumAAFParameterDefs;

// Answered by AAFInterpolationDef.
struct IAAFInterpolationDef : IUnknown {
    virtual HRESULT Initialize(aafUID_constref id, aafCharacter_constptr name,
                               aafCharacter_constptr description) = 0;  // 3

protected:
    ~IAAFInterpolationDef() = default;
};

inline constexpr GUID IID_IAAFInterpolationDef = ncfGuid("293600A3-0D37-11D3-80A9-006008143E6F");
constexpr const GUID& aafIdOf(const IAAFInterpolationDef*) {
    return IID_IAAFInterpolationDef;
}

// Answered by AAFOperationDef.
struct IAAFOperationDef : IUnknown {
    virtual HRESULT Initialize(aafUID_constref id, aafCharacter_constptr name,
                               aafCharacter_constptr description) = 0;              // 3
    virtual HRESULT GetDataDef(IAAFDataDef** dataDef) = 0;                          // 4
    virtual HRESULT SetDataDef(IAAFDataDef* dataDef) = 0;                           // 5
    virtual HRESULT IsTimeWarp(aafBoolean_t* bIsTimeWarp) = 0;                      // 6
    virtual HRESULT SetIsTimeWarp(aafBoolean_t isTimeWarp) = 0;                     // 7
    virtual HRESULT PrependDegradeToOperation(IAAFOperationDef* operationDef) = 0;  // 8
    virtual HRESULT AppendDegradeToOperation(IAAFOperationDef* operationDef) = 0;   // 9
    virtual HRESULT InsertDegradeToOperationAt(aafUInt32 index,
                                               IAAFOperationDef* operationDef) = 0;  // 10
    virtual HRESULT RemoveDegradeToOperationAt(aafUInt32 index) = 0;                 // 11
    virtual HRESULT GetDegradeToOperations(IEnumAAFOperationDefs** enumerator) = 0;  // 12
    virtual HRESULT CountDegradeToOperations(aafUInt32* result) = 0;                 // 13
    virtual HRESULT GetCategory(aafUID_t* value) = 0;                                // 14
    virtual HRESULT SetCategory(aafUID_constref value) = 0;                          // 15
    virtual HRESULT GetNumberInputs(aafInt32* numberInputs) = 0;                     // 16
    virtual HRESULT SetNumberInputs(aafInt32 numberInputs) = 0;                      // 17
    virtual HRESULT GetBypass(aafUInt32* bypass) = 0;                                // 18
    virtual HRESULT SetBypass(aafUInt32 bypass) = 0;                                 // 19
    virtual HRESULT AddParameterDef(IAAFParameterDef* parameterDef) = 0;             // 20
    virtual HRESULT GetParameterDefs(IEnumAAFParameterDefs** enumerator) = 0;        // 21
    virtual HRESULT CountParameterDefs(aafUInt32* result) = 0;                       // 22
    virtual HRESULT LookupParameterDef(aafUID_constref parameterDefId,
                                       IAAFParameterDef** parameterDef) = 0;  // 23

protected:
    ~IAAFOperationDef() = default;
};

inline constexpr GUID IID_IAAFOperationDef = ncfGuid("14035D91-1FF5-11D2-BF97-006097116212");
constexpr const GUID& aafIdOf(const IAAFOperationDef*) {
    return IID_IAAFOperationDef;
}

// Answered by AAFParameterDef.
struct IAAFParameterDef : IUnknown {
    virtual HRESULT Initialize(aafUID_constref id, aafCharacter_constptr name,
                               aafCharacter_constptr description, IAAFTypeDef* type) = 0;  // 3
    virtual HRESULT GetTypeDefinition(IAAFTypeDef** typeDef) = 0;                          // 4
    virtual HRESULT SetDisplayUnits(aafCharacter_constptr displayUnits) = 0;               // 5
    virtual HRESULT GetDisplayUnits(aafCharacter* displayUnits, aafUInt32 bufSize) = 0;    // 6
    virtual HRESULT GetDisplayUnitsBufLen(aafUInt32* bufSize) = 0;                         // 7

protected:
    ~IAAFParameterDef() = default;
};

inline constexpr GUID IID_IAAFParameterDef = ncfGuid("20045FA1-1D87-11D2-BF96-006097116212");
constexpr const GUID& aafIdOf(const IAAFParameterDef*) {
    return IID_IAAFParameterDef;
}

// Answered by EnumAAFInterpolationDefs.
struct IEnumAAFInterpolationDefs : IUnknown {
    virtual HRESULT NextOne(IAAFInterpolationDef** interpolationDefs) = 0;  // 3
    virtual HRESULT Next(aafUInt32 count, IAAFInterpolationDef** interpolationDefs,
                         aafUInt32* numFetched) = 0;                    // 4
    virtual HRESULT Skip(aafUInt32 count) = 0;                          // 5
    virtual HRESULT Reset() = 0;                                        // 6
    virtual HRESULT Clone(IEnumAAFInterpolationDefs** enumerator) = 0;  // 7

protected:
    ~IEnumAAFInterpolationDefs() = default;
};

inline constexpr GUID IID_IEnumAAFInterpolationDefs =
    ncfGuid("293600A5-0D37-11D3-80A9-006008143E6F");
constexpr const GUID& aafIdOf(const IEnumAAFInterpolationDefs*) {
    return IID_IEnumAAFInterpolationDefs;
}

// Answered by EnumAAFOperationDefs.
struct IEnumAAFOperationDefs : IUnknown {
    virtual HRESULT NextOne(IAAFOperationDef** operationDefs) = 0;  // 3
    virtual HRESULT Next(aafUInt32 count, IAAFOperationDef** operationDefs,
                         aafUInt32* numFetched) = 0;                // 4
    virtual HRESULT Skip(aafUInt32 count) = 0;                      // 5
    virtual HRESULT Reset() = 0;                                    // 6
    virtual HRESULT Clone(IEnumAAFOperationDefs** enumerator) = 0;  // 7

protected:
    ~IEnumAAFOperationDefs() = default;
};

inline constexpr GUID IID_IEnumAAFOperationDefs = ncfGuid("92B88021-2B2B-11D2-BF7E-00104BC9156D");
constexpr const GUID& aafIdOf(const IEnumAAFOperationDefs*) {
    return IID_IEnumAAFOperationDefs;
}

// Answered by EnumAAFParameterDefs.
struct IEnumAAFParameterDefs : IUnknown {
    virtual HRESULT NextOne(IAAFParameterDef** parameterDef) = 0;  // 3
    virtual HRESULT Next(aafUInt32 count, IAAFParameterDef** parameterDefs,
                         aafUInt32* fetched) = 0;                   // 4
    virtual HRESULT Skip(aafUInt32 count) = 0;                      // 5
    virtual HRESULT Reset() = 0;                                    // 6
    virtual HRESULT Clone(IEnumAAFParameterDefs** enumerator) = 0;  // 7

protected:
    ~IEnumAAFParameterDefs() = default;
};

inline constexpr GUID IID_IEnumAAFParameterDefs = ncfGuid("B1A213A4-1A7D-11D2-BF78-00104BC9156D");
constexpr const GUID& aafIdOf(const IEnumAAFParameterDefs*) {
    return IID_IEnumAAFParameterDefs;
}
