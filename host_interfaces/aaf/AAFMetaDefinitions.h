// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/aaf/AAFUnknown.h"

// Classes and properties: the model that every file carries, so that a reader can
// read what it does not know. The dictionary owns them. The module makes objects by
// their class and registers properties of its own; the host asks them for names when
// it prints a description. A definition is made by CreateMetaInstance only.

struct IAAFClassDef;
struct IAAFPropertyDef;
struct IAAFTypeDef;
struct IEnumAAFClassDefs;
struct IEnumAAFPropertyDefs;

// Answered by AAFClassDef.
struct IAAFClassDef : IUnknown {
    virtual HRESULT Initialize(aafUID_constref classID, IAAFClassDef* parentClass,
                               aafCharacter_constptr className,
                               aafBoolean_t isConcrete) = 0;                 // 3
    virtual HRESULT GetPropertyDefs(IEnumAAFPropertyDefs** enumerator) = 0;  // 4
    virtual HRESULT CountPropertyDefs(aafUInt32* count) = 0;                 // 5
    virtual HRESULT RegisterNewPropertyDef(aafUID_constref id, aafCharacter_constptr name,
                                           IAAFTypeDef* typeDef, aafBoolean_t isOptional,
                                           aafBoolean_t isUniqueIdentifier,
                                           IAAFPropertyDef** propDef) = 0;  // 6
    virtual HRESULT RegisterOptionalPropertyDef(aafUID_constref id, aafCharacter_constptr name,
                                                IAAFTypeDef* typeDef,
                                                IAAFPropertyDef** propDef) = 0;                // 7
    virtual HRESULT LookupPropertyDef(aafUID_constref propID, IAAFPropertyDef** propDef) = 0;  // 8
    virtual HRESULT GetName(aafCharacter* name, aafUInt32 bufSize) = 0;                        // 9
    virtual HRESULT GetNameBufLen(aafUInt32* bufSize) = 0;                                     // 10
    virtual HRESULT GetParent(IAAFClassDef** classDef) = 0;                                    // 11
    virtual HRESULT IsConcrete(aafBoolean_t* result) = 0;                                      // 12
    virtual HRESULT IsRoot(aafBoolean_t* isRoot) = 0;                                          // 13
    virtual HRESULT IsUniquelyIdentified(aafBoolean_t* isUniquelyIdentified) = 0;              // 14
    virtual HRESULT GetUniqueIdentifier(IAAFPropertyDef** uniqueIdentifier) = 0;               // 15
    virtual HRESULT CreateInstance(REFIID riid, IUnknown** object) = 0;                        // 16

protected:
    ~IAAFClassDef() = default;
};

inline constexpr GUID IID_IAAFClassDef = ncfGuid("DFBD6525-1D81-11D2-BF96-006097116212");
constexpr const GUID& aafIdOf(const IAAFClassDef*) {
    return IID_IAAFClassDef;
}

// Answered by AAFMetaDefinition.
struct IAAFMetaDefinition : IUnknown {
    virtual HRESULT Initialize(aafUID_constref id, aafCharacter_constptr name,
                               aafCharacter_constptr description) = 0;                 // 3
    virtual HRESULT GetAUID(aafUID_t* auid) = 0;                                       // 4
    virtual HRESULT SetName(aafCharacter_constptr name) = 0;                           // 5
    virtual HRESULT GetName(aafCharacter* name, aafUInt32 bufSize) = 0;                // 6
    virtual HRESULT GetNameBufLen(aafUInt32* bufSize) = 0;                             // 7
    virtual HRESULT SetDescription(aafCharacter_constptr description) = 0;             // 8
    virtual HRESULT GetDescription(aafCharacter* description, aafUInt32 bufSize) = 0;  // 9
    virtual HRESULT GetDescriptionBufLen(aafUInt32* bufSize) = 0;                      // 10

protected:
    ~IAAFMetaDefinition() = default;
};

inline constexpr GUID IID_IAAFMetaDefinition = ncfGuid("CEE32174-0C10-11D4-8014-00104BC9156D");
constexpr const GUID& aafIdOf(const IAAFMetaDefinition*) {
    return IID_IAAFMetaDefinition;
}

// Answered by AAFPropertyDef.
struct IAAFPropertyDef : IUnknown {
    virtual HRESULT GetTypeDef(IAAFTypeDef** typeDef) = 0;                             // 3
    virtual HRESULT GetName(aafCharacter* name, aafUInt32 bufSize) = 0;                // 4
    virtual HRESULT GetNameBufLen(aafUInt32* bufSize) = 0;                             // 5
    virtual HRESULT GetIsOptional(aafBoolean_t* isOptional) = 0;                       // 6
    virtual HRESULT GetIsUniqueIdentifier(aafBoolean_t* isUniqueIdentifier) = 0;       // 7
    virtual HRESULT SetDescription(aafCharacter_constptr description) = 0;             // 8
    virtual HRESULT GetDescription(aafCharacter* description, aafUInt32 bufSize) = 0;  // 9
    virtual HRESULT GetDescriptionBufLen(aafUInt32* bufSize) = 0;                      // 10

protected:
    ~IAAFPropertyDef() = default;
};

inline constexpr GUID IID_IAAFPropertyDef = ncfGuid("DFBD6521-1D81-11D2-BF96-006097116212");
constexpr const GUID& aafIdOf(const IAAFPropertyDef*) {
    return IID_IAAFPropertyDef;
}

// Answered by EnumAAFPropertyDefs.
struct IEnumAAFPropertyDefs : IUnknown {
    virtual HRESULT NextOne(IAAFPropertyDef** propertyDefs) = 0;  // 3
    virtual HRESULT Next(aafUInt32 count, IAAFPropertyDef** propertyDefs,
                         aafUInt32* numFetched) = 0;               // 4
    virtual HRESULT Skip(aafUInt32 count) = 0;                     // 5
    virtual HRESULT Reset() = 0;                                   // 6
    virtual HRESULT Clone(IEnumAAFPropertyDefs** enumerator) = 0;  // 7

protected:
    ~IEnumAAFPropertyDefs() = default;
};

inline constexpr GUID IID_IEnumAAFPropertyDefs = ncfGuid("245343C1-2D59-11D2-BF80-00104BC9156D");
constexpr const GUID& aafIdOf(const IEnumAAFPropertyDefs*) {
    return IID_IEnumAAFPropertyDefs;
}

// Answered by EnumAAFClassDefs.
struct IEnumAAFClassDefs : IUnknown {
    virtual HRESULT NextOne(IAAFClassDef** classDefs) = 0;  // 3
    virtual HRESULT Next(aafUInt32 count, IAAFClassDef** classDefs,
                         aafUInt32* numFetched) = 0;            // 4
    virtual HRESULT Skip(aafUInt32 count) = 0;                  // 5
    virtual HRESULT Reset() = 0;                                // 6
    virtual HRESULT Clone(IEnumAAFClassDefs** enumerator) = 0;  // 7

protected:
    ~IEnumAAFClassDefs() = default;
};

inline constexpr GUID IID_IEnumAAFClassDefs = ncfGuid("B1A2138E-1A7D-11D2-BF78-00104BC9156D");
constexpr const GUID& aafIdOf(const IEnumAAFClassDefs*) {
    return IID_IEnumAAFClassDefs;
}
