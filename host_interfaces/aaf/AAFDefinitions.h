// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/aaf/AAFUnknown.h"

// Definitions that objects refer to: of data (picture, sound, timecode), containers,
// codecs, and of the keys of raw and tagged data. A file's dictionary owns them; one
// definition stands for each id. The module looks them up there, and registers the
// containers that its clips need.

struct IAAFClassDef;
struct IAAFCodecDef;
struct IAAFContainerDef;
struct IAAFDataDef;
struct IAAFDefObject;
struct IAAFKLVDataDefinition;
struct IAAFPropertyDef;
struct IAAFTaggedValueDefinition;
struct IAAFTypeDef;
struct IEnumAAFCodecDefs;
struct IEnumAAFCodecFlavours;
struct IEnumAAFContainerDefs;
struct IEnumAAFDataDefs;
struct IEnumAAFKLVDataDefs;
struct IEnumAAFPropertyDefs;
struct IEnumAAFTaggedValueDefs;

// Answered by AAFDefObject.
struct IAAFDefObject : IUnknown {
    virtual HRESULT SetName(aafCharacter_constptr name) = 0;                           // 3
    virtual HRESULT GetName(aafCharacter* name, aafUInt32 bufSize) = 0;                // 4
    virtual HRESULT GetNameBufLen(aafUInt32* bufSize) = 0;                             // 5
    virtual HRESULT SetDescription(aafCharacter_constptr description) = 0;             // 6
    virtual HRESULT GetDescription(aafCharacter* description, aafUInt32 bufSize) = 0;  // 7
    virtual HRESULT GetDescriptionBufLen(aafUInt32* bufSize) = 0;                      // 8
    virtual HRESULT Initialize(aafUID_constref id, aafCharacter_constptr name) = 0;    // 9
    virtual HRESULT GetAUID(aafUID_t* auid) = 0;                                       // 10

protected:
    ~IAAFDefObject() = default;
};

inline constexpr GUID IID_IAAFDefObject = ncfGuid("DFBD6527-1D81-11D2-BF96-006097116212");
constexpr const GUID& aafIdOf(const IAAFDefObject*) {
    return IID_IAAFDefObject;
}

// Answered by AAFDataDef.
struct IAAFDataDef : IUnknown {
    virtual HRESULT Initialize(aafUID_constref id, aafCharacter_constptr name,
                               aafCharacter_constptr description) = 0;                        // 3
    virtual HRESULT IsPictureKind(aafBoolean_t* bIsPictureKind) = 0;                          // 4
    virtual HRESULT IsMatteKind(aafBoolean_t* bIsMatteKind) = 0;                              // 5
    virtual HRESULT IsPictureWithMatteKind(aafBoolean_t* bIsPictureWithMatteKind) = 0;        // 6
    virtual HRESULT IsSoundKind(aafBoolean_t* bIsSoundKind) = 0;                              // 7
    virtual HRESULT DoesDataDefConvertTo(IAAFDataDef* id, aafBoolean_t* bDoesConvertTo) = 0;  // 8
    virtual HRESULT IsDataDefOf(IAAFDataDef* dataDef, aafBoolean_t* bIsDataDefOf) = 0;        // 9
    virtual HRESULT DoesDataDefConvertFrom(IAAFDataDef* dataDef,
                                           aafBoolean_t* bDoesConvertFrom) = 0;  // 10

protected:
    ~IAAFDataDef() = default;
};

inline constexpr GUID IID_IAAFDataDef = ncfGuid("DFBD6529-1D81-11D2-BF96-006097116212");
constexpr const GUID& aafIdOf(const IAAFDataDef*) {
    return IID_IAAFDataDef;
}

// Answered by AAFDataDef.
struct IAAFDataDef2 : IUnknown {
    virtual HRESULT Initialize(aafUID_constref id, aafCharacter_constptr name,
                               aafCharacter_constptr description) = 0;                        // 3
    virtual HRESULT IsPictureKind(aafBoolean_t* bIsPictureKind) = 0;                          // 4
    virtual HRESULT IsMatteKind(aafBoolean_t* bIsMatteKind) = 0;                              // 5
    virtual HRESULT IsPictureWithMatteKind(aafBoolean_t* bIsPictureWithMatteKind) = 0;        // 6
    virtual HRESULT IsSoundKind(aafBoolean_t* bIsSoundKind) = 0;                              // 7
    virtual HRESULT DoesDataDefConvertTo(IAAFDataDef* id, aafBoolean_t* bDoesConvertTo) = 0;  // 8
    virtual HRESULT IsDataDefOf(IAAFDataDef* dataDef, aafBoolean_t* bIsDataDefOf) = 0;        // 9
    virtual HRESULT DoesDataDefConvertFrom(IAAFDataDef* dataDef,
                                           aafBoolean_t* bDoesConvertFrom) = 0;  // 10
    virtual HRESULT IsEdgecodeKind(aafBoolean_t* bIsEdgecodeKind) = 0;           // 11
    virtual HRESULT IsTimecodeKind(aafBoolean_t* bIsTimecodeKind) = 0;           // 12

protected:
    ~IAAFDataDef2() = default;
};

inline constexpr GUID IID_IAAFDataDef2 = ncfGuid("588951C1-2F10-46DA-A20D-6E8E7AC6963C");
constexpr const GUID& aafIdOf(const IAAFDataDef2*) {
    return IID_IAAFDataDef2;
}

// Answered by AAFDataDef.
struct IAAFDataDef3 : IUnknown {
    virtual HRESULT Initialize(aafUID_constref id, aafCharacter_constptr name,
                               aafCharacter_constptr description) = 0;                        // 3
    virtual HRESULT IsPictureKind(aafBoolean_t* bIsPictureKind) = 0;                          // 4
    virtual HRESULT IsMatteKind(aafBoolean_t* bIsMatteKind) = 0;                              // 5
    virtual HRESULT IsPictureWithMatteKind(aafBoolean_t* bIsPictureWithMatteKind) = 0;        // 6
    virtual HRESULT IsSoundKind(aafBoolean_t* bIsSoundKind) = 0;                              // 7
    virtual HRESULT DoesDataDefConvertTo(IAAFDataDef* id, aafBoolean_t* bDoesConvertTo) = 0;  // 8
    virtual HRESULT IsDataDefOf(IAAFDataDef* dataDef, aafBoolean_t* bIsDataDefOf) = 0;        // 9
    virtual HRESULT DoesDataDefConvertFrom(IAAFDataDef* dataDef,
                                           aafBoolean_t* bDoesConvertFrom) = 0;               // 10
    virtual HRESULT IsEdgecodeKind(aafBoolean_t* bIsEdgecodeKind) = 0;                        // 11
    virtual HRESULT IsTimecodeKind(aafBoolean_t* bIsTimecodeKind) = 0;                        // 12
    virtual HRESULT IsAuxiliaryKind(aafBoolean_t* bIsAuxiliaryKind) = 0;                      // 13
    virtual HRESULT IsDescriptiveMetadataKind(aafBoolean_t* bIsDescriptiveMetadataKind) = 0;  // 14

protected:
    ~IAAFDataDef3() = default;
};

inline constexpr GUID IID_IAAFDataDef3 = ncfGuid("858109C4-CB51-48AD-9086-A3FCFE9739FA");
constexpr const GUID& aafIdOf(const IAAFDataDef3*) {
    return IID_IAAFDataDef3;
}

// Answered by AAFContainerDef.
struct IAAFContainerDef : IUnknown {
    virtual HRESULT Initialize(aafUID_constref id, aafCharacter_constptr name,
                               aafCharacter_constptr description) = 0;             // 3
    virtual HRESULT EssenceIsIdentified(aafBoolean_t* essenceIsIdentified) = 0;    // 4
    virtual HRESULT SetEssenceIsIdentified(aafBoolean_t essenceIsIdentified) = 0;  // 5

protected:
    ~IAAFContainerDef() = default;
};

inline constexpr GUID IID_IAAFContainerDef = ncfGuid("AD1BB858-DBB2-11D2-809C-006008143E6F");
constexpr const GUID& aafIdOf(const IAAFContainerDef*) {
    return IID_IAAFContainerDef;
}

// Answered by EnumAAFDataDefs.
struct IEnumAAFDataDefs : IUnknown {
    virtual HRESULT NextOne(IAAFDataDef** dataDefs) = 0;                                       // 3
    virtual HRESULT Next(aafUInt32 count, IAAFDataDef** dataDefs, aafUInt32* numFetched) = 0;  // 4
    virtual HRESULT Skip(aafUInt32 count) = 0;                                                 // 5
    virtual HRESULT Reset() = 0;                                                               // 6
    virtual HRESULT Clone(IEnumAAFDataDefs** enumerator) = 0;                                  // 7

protected:
    ~IEnumAAFDataDefs() = default;
};

inline constexpr GUID IID_IEnumAAFDataDefs = ncfGuid("D8000382-498E-11D2-841B-00600832ACB8");
constexpr const GUID& aafIdOf(const IEnumAAFDataDefs*) {
    return IID_IEnumAAFDataDefs;
}

// Answered by EnumAAFContainerDefs.
struct IEnumAAFContainerDefs : IUnknown {
    virtual HRESULT NextOne(IAAFContainerDef** containerDefs) = 0;  // 3
    virtual HRESULT Next(aafUInt32 count, IAAFContainerDef** containerDefs,
                         aafUInt32* numFetched) = 0;                // 4
    virtual HRESULT Skip(aafUInt32 count) = 0;                      // 5
    virtual HRESULT Reset() = 0;                                    // 6
    virtual HRESULT Clone(IEnumAAFContainerDefs** enumerator) = 0;  // 7

protected:
    ~IEnumAAFContainerDefs() = default;
};

inline constexpr GUID IID_IEnumAAFContainerDefs = ncfGuid("3B2C9AD2-022A-11D3-80A6-006008143E6F");
constexpr const GUID& aafIdOf(const IEnumAAFContainerDefs*) {
    return IID_IEnumAAFContainerDefs;
}

// Answered by AAFCodecDef.
struct IAAFCodecDef : IUnknown {
    virtual HRESULT Initialize(aafUID_constref id, aafCharacter_constptr name,
                               aafCharacter_constptr description) = 0;  // 3
    virtual HRESULT IsEssenceKindSupported(IAAFDataDef* essenceKind,
                                           aafBoolean_t* isSupported) = 0;      // 4
    virtual HRESULT AddEssenceKind(IAAFDataDef* essenceKind) = 0;               // 5
    virtual HRESULT RemoveEssenceKind(IAAFDataDef* essenceKind) = 0;            // 6
    virtual HRESULT CountEssenceKinds(aafUInt32* result) = 0;                   // 7
    virtual HRESULT GetEssenceKinds(IEnumAAFDataDefs** enumerator) = 0;         // 8
    virtual HRESULT AreThereFlavours(aafBoolean_t* result) = 0;                 // 9
    virtual HRESULT GetFileDescriptorClass(IAAFClassDef** cls) = 0;             // 10
    virtual HRESULT SetFileDescriptorClass(IAAFClassDef* cls) = 0;              // 11
    virtual HRESULT EnumCodecFlavours(IEnumAAFCodecFlavours** enumerator) = 0;  // 12

protected:
    ~IAAFCodecDef() = default;
};

inline constexpr GUID IID_IAAFCodecDef = ncfGuid("AD1BB856-DBB2-11D2-809C-006008143E6F");
constexpr const GUID& aafIdOf(const IAAFCodecDef*) {
    return IID_IAAFCodecDef;
}

// Answered by EnumAAFCodecDefs.
struct IEnumAAFCodecDefs : IUnknown {
    virtual HRESULT NextOne(IAAFCodecDef** codecDefs) = 0;  // 3
    virtual HRESULT Next(aafUInt32 count, IAAFCodecDef** codecDefs,
                         aafUInt32* numFetched) = 0;            // 4
    virtual HRESULT Skip(aafUInt32 count) = 0;                  // 5
    virtual HRESULT Reset() = 0;                                // 6
    virtual HRESULT Clone(IEnumAAFCodecDefs** enumerator) = 0;  // 7

protected:
    ~IEnumAAFCodecDefs() = default;
};

inline constexpr GUID IID_IEnumAAFCodecDefs = ncfGuid("3B2C9AD4-022A-11D3-80A6-006008143E6F");
constexpr const GUID& aafIdOf(const IEnumAAFCodecDefs*) {
    return IID_IEnumAAFCodecDefs;
}

// Answered by AAFKLVDataDefinition.
struct IAAFKLVDataDefinition : IUnknown {
    virtual HRESULT Initialize(aafUID_constref id, aafCharacter_constptr name,
                               aafCharacter_constptr description) = 0;           // 3
    virtual HRESULT AddParentProperty(IAAFPropertyDef* parentProperty) = 0;      // 4
    virtual HRESULT GetParentProperties(IEnumAAFPropertyDefs** enumerator) = 0;  // 5
    virtual HRESULT CountParentProperties(aafUInt32* numProperties) = 0;         // 6
    virtual HRESULT RemoveParentProperty(IAAFPropertyDef* parentProperty) = 0;   // 7
    virtual HRESULT GetKLVDataType(IAAFTypeDef** typeDef) = 0;                   // 8
    virtual HRESULT SetKLVDataType(IAAFTypeDef* typeDef) = 0;                    // 9

protected:
    ~IAAFKLVDataDefinition() = default;
};

inline constexpr GUID IID_IAAFKLVDataDefinition = ncfGuid("F6AF8700-949C-4304-9706-C0576B53F4AA");
constexpr const GUID& aafIdOf(const IAAFKLVDataDefinition*) {
    return IID_IAAFKLVDataDefinition;
}

// Answered by AAFTaggedValueDefinition.
struct IAAFTaggedValueDefinition : IUnknown {
    virtual HRESULT Initialize(aafUID_constref id, aafCharacter_constptr name,
                               aafCharacter_constptr description) = 0;           // 3
    virtual HRESULT AddParentProperty(IAAFPropertyDef* parentProperty) = 0;      // 4
    virtual HRESULT GetParentProperties(IEnumAAFPropertyDefs** enumerator) = 0;  // 5
    virtual HRESULT CountParentProperties(aafUInt32* numProperties) = 0;         // 6
    virtual HRESULT RemoveParentProperty(IAAFPropertyDef* parentProperty) = 0;   // 7

protected:
    ~IAAFTaggedValueDefinition() = default;
};

inline constexpr GUID IID_IAAFTaggedValueDefinition =
    ncfGuid("C358428A-BF73-4558-BFDF-482160719823");
constexpr const GUID& aafIdOf(const IAAFTaggedValueDefinition*) {
    return IID_IAAFTaggedValueDefinition;
}

// Answered by EnumAAFKLVDataDefs.
struct IEnumAAFKLVDataDefs : IUnknown {
    virtual HRESULT NextOne(IAAFKLVDataDefinition** KLVDataDefs) = 0;  // 3
    virtual HRESULT Next(aafUInt32 count, IAAFKLVDataDefinition** KLVDataDefs,
                         aafUInt32* numFetched) = 0;              // 4
    virtual HRESULT Skip(aafUInt32 count) = 0;                    // 5
    virtual HRESULT Reset() = 0;                                  // 6
    virtual HRESULT Clone(IEnumAAFKLVDataDefs** enumerator) = 0;  // 7

protected:
    ~IEnumAAFKLVDataDefs() = default;
};

inline constexpr GUID IID_IEnumAAFKLVDataDefs = ncfGuid("2A368C5C-E5AF-43C8-8E5A-E78BA02F5F3B");
constexpr const GUID& aafIdOf(const IEnumAAFKLVDataDefs*) {
    return IID_IEnumAAFKLVDataDefs;
}

// Answered by EnumAAFTaggedValueDefs.
struct IEnumAAFTaggedValueDefs : IUnknown {
    virtual HRESULT NextOne(IAAFTaggedValueDefinition** taggedValueDefs) = 0;  // 3
    virtual HRESULT Next(aafUInt32 count, IAAFTaggedValueDefinition** taggedValueDefs,
                         aafUInt32* numFetched) = 0;                  // 4
    virtual HRESULT Skip(aafUInt32 count) = 0;                        // 5
    virtual HRESULT Reset() = 0;                                      // 6
    virtual HRESULT Clone(IEnumAAFTaggedValueDefs** enumerator) = 0;  // 7

protected:
    ~IEnumAAFTaggedValueDefs() = default;
};

inline constexpr GUID IID_IEnumAAFTaggedValueDefs = ncfGuid("9D1BD790-16A8-488C-8743-F9A60A1CBA95");
constexpr const GUID& aafIdOf(const IEnumAAFTaggedValueDefs*) {
    return IID_IEnumAAFTaggedValueDefs;
}
