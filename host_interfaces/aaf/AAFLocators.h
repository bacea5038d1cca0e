// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/aaf/AAFUnknown.h"

// Locators: where essence is, as a URL or as text for people. A descriptor owns them.
// The module gives the descriptors of the file and the source mob a network locator
// with the movie's file URL; the host prints it.

struct IAAFLocator;
struct IEnumAAFLocators;

// Answered by AAFLocator.
struct IAAFLocator : IUnknown {
    virtual HRESULT SetPath(aafCharacter_constptr path) = 0;             // 3
    virtual HRESULT GetPath(aafCharacter* path, aafUInt32 bufSize) = 0;  // 4
    virtual HRESULT GetPathBufLen(aafUInt32* bufSize) = 0;               // 5

protected:
    ~IAAFLocator() = default;
};

inline constexpr GUID IID_IAAFLocator = ncfGuid("D4F89061-69D6-11D2-841B-00600832ACB8");
constexpr const GUID& aafIdOf(const IAAFLocator*) {
    return IID_IAAFLocator;
}

// Answered by AAFNetworkLocator.
struct IAAFNetworkLocator : IUnknown {
    virtual HRESULT Initialize() = 0;  // 3

protected:
    ~IAAFNetworkLocator() = default;
};

inline constexpr GUID IID_IAAFNetworkLocator = ncfGuid("2C1097B2-69D6-11D2-841B-00600832ACB8");
constexpr const GUID& aafIdOf(const IAAFNetworkLocator*) {
    return IID_IAAFNetworkLocator;
}

// Answered by AAFTextLocator.
struct IAAFTextLocator : IUnknown {
    virtual HRESULT Initialize() = 0;                                    // 3
    virtual HRESULT SetName(aafCharacter_constptr name) = 0;             // 4
    virtual HRESULT GetName(aafCharacter* name, aafUInt32 bufSize) = 0;  // 5
    virtual HRESULT GetNameBufLen(aafUInt32* bufSize) = 0;               // 6

protected:
    ~IAAFTextLocator() = default;
};

inline constexpr GUID IID_IAAFTextLocator = ncfGuid("E684D768-B935-11D2-BF9D-00104BC9156D");
constexpr const GUID& aafIdOf(const IAAFTextLocator*) {
    return IID_IAAFTextLocator;
}

// Answered by EnumAAFLocators.
struct IEnumAAFLocators : IUnknown {
    virtual HRESULT NextOne(IAAFLocator** locator) = 0;                                     // 3
    virtual HRESULT Next(aafUInt32 count, IAAFLocator** locators, aafUInt32* fetched) = 0;  // 4
    virtual HRESULT Skip(aafUInt32 count) = 0;                                              // 5
    virtual HRESULT Reset() = 0;                                                            // 6
    virtual HRESULT Clone(IEnumAAFLocators** enumerator) = 0;                               // 7

protected:
    ~IEnumAAFLocators() = default;
};

inline constexpr GUID IID_IEnumAAFLocators = ncfGuid("B1A2139E-1A7D-11D2-BF78-00104BC9156D");
constexpr const GUID& aafIdOf(const IEnumAAFLocators*) {
    return IID_IEnumAAFLocators;
}
