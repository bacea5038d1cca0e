// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/aaf/AAFUnknown.h"

// Definitions of the library's own plug-ins, and the manager that looks after them.
// They have nothing to do with the modules of this project's framework. Neither module
// nor host uses them.

struct IAAFDefObject;
struct IAAFDictionary;
struct IAAFLocator;
struct IAAFNetworkLocator;
struct IAAFPluginDef;
struct IEnumAAFCodecFlavours;
struct IEnumAAFLoadedPlugins;
struct IEnumAAFPluginDefs;
struct IEnumAAFPluginLocators;

// Answered by AAFPluginDef.
struct IAAFPluginDef : IUnknown {
    virtual HRESULT Initialize(aafUID_constref id, aafCharacter_constptr name,
                               aafCharacter_constptr description) = 0;                      // 3
    virtual HRESULT GetCategoryClass(aafUID_t* categoryClass) = 0;                          // 4
    virtual HRESULT SetCategoryClass(aafUID_constref categoryClass) = 0;                    // 5
    virtual HRESULT GetPluginVersion(aafVersionType_t* version) = 0;                        // 6
    virtual HRESULT SetPluginVersion(aafVersionType_t* version) = 0;                        // 7
    virtual HRESULT SetPluginVersionString(aafCharacter_constptr pluginVersionString) = 0;  // 8
    virtual HRESULT GetPluginVersionString(aafCharacter* pluginVersionString,
                                           aafUInt32 bufSize) = 0;         // 9
    virtual HRESULT GetPluginVersionStringBufLen(aafUInt32* bufSize) = 0;  // 10
    virtual HRESULT SetPluginManufacturerName(
        aafCharacter_constptr pluginManufacturerName) = 0;  // 11
    virtual HRESULT GetPluginManufacturerName(aafCharacter* pluginManufacturerName,
                                              aafUInt32 bufSize) = 0;                        // 12
    virtual HRESULT GetPluginManufacturerNameBufLen(aafUInt32* bufSize) = 0;                 // 13
    virtual HRESULT GetManufacturerInfo(IAAFNetworkLocator** result) = 0;                    // 14
    virtual HRESULT SetManufacturerInfo(IAAFNetworkLocator* manufacturerInfo) = 0;           // 15
    virtual HRESULT GetManufacturerID(aafUID_t* manufacturerID) = 0;                         // 16
    virtual HRESULT SetManufacturerID(aafUID_constref manufacturerID) = 0;                   // 17
    virtual HRESULT GetHardwarePlatform(aafHardwarePlatform_t* hardwarePlatform) = 0;        // 18
    virtual HRESULT SetHardwarePlatform(aafHardwarePlatform_constref hardwarePlatform) = 0;  // 19
    virtual HRESULT GetPlatformVersionRange(aafVersionType_t* minVersion,
                                            aafVersionType_t* maxVersion) = 0;          // 20
    virtual HRESULT SetPlatformMinimumVersion(aafVersionType_constref minVersion) = 0;  // 21
    virtual HRESULT SetPlatformMaximumVersion(aafVersionType_constref maxVersion) = 0;  // 22
    virtual HRESULT GetEngine(aafEngine_t* engine) = 0;                                 // 23
    virtual HRESULT SetEngine(aafEngine_constref engine) = 0;                           // 24
    virtual HRESULT GetEngineVersionRange(aafVersionType_t* minVersion,
                                          aafVersionType_t* maxVersion) = 0;          // 25
    virtual HRESULT SetEngineMinimumVersion(aafVersionType_constref minVersion) = 0;  // 26
    virtual HRESULT SetEngineMaximumVersion(aafVersionType_constref maxVersion) = 0;  // 27
    virtual HRESULT GetPluginAPI(aafPluginAPI_t* pluginAPI) = 0;                      // 28
    virtual HRESULT SetPluginAPI(aafPluginAPI_constref pluginAPI) = 0;                // 29
    virtual HRESULT GetPluginAPIVersionRange(aafVersionType_t* minVersion,
                                             aafVersionType_t* maxVersion) = 0;          // 30
    virtual HRESULT SetPluginAPIMinimumVersion(aafVersionType_constref minVersion) = 0;  // 31
    virtual HRESULT SetPluginAPIMaximumVersion(aafVersionType_constref maxVersion) = 0;  // 32
    virtual HRESULT IsSoftwareOnly(aafBoolean_t* isSoftwareOnly) = 0;                    // 33
    virtual HRESULT SetIsSoftwareOnly(aafBoolean_t isSoftwareOnly) = 0;                  // 34
    virtual HRESULT IsAccelerated(aafBoolean_t* isAccelerated) = 0;                      // 35
    virtual HRESULT SetIsAccelerated(aafBoolean_t isAccelerated) = 0;                    // 36
    virtual HRESULT SupportsAuthentication(aafBoolean_t* supportsAuthentication) = 0;    // 37
    virtual HRESULT SetSupportsAuthentication(aafBoolean_t supportsAuthentication) = 0;  // 38
    virtual HRESULT CountLocators(aafUInt32* result) = 0;                                // 39
    virtual HRESULT AppendLocator(IAAFLocator* locator) = 0;                             // 40
    virtual HRESULT PrependLocator(IAAFLocator* locator) = 0;                            // 41
    virtual HRESULT InsertLocatorAt(aafUInt32 index, IAAFLocator* locator) = 0;          // 42
    virtual HRESULT GetLocatorAt(aafUInt32 index, IAAFLocator** locator) = 0;            // 43
    virtual HRESULT RemoveLocatorAt(aafUInt32 index) = 0;                                // 44
    virtual HRESULT GetLocators(IEnumAAFPluginLocators** enumerator) = 0;                // 45
    virtual HRESULT SetDefinitionObjectID(aafUID_t def) = 0;                             // 46
    virtual HRESULT GetDefinitionObjectID(aafUID_t* def) = 0;                            // 47

protected:
    ~IAAFPluginDef() = default;
};

inline constexpr GUID IID_IAAFPluginDef = ncfGuid("AD1BB854-DBB2-11D2-809C-006008143E6F");
constexpr const GUID& aafIdOf(const IAAFPluginDef*) {
    return IID_IAAFPluginDef;
}

// Answered by AAFPluginManager.
struct IAAFPluginManager : IUnknown {
    virtual HRESULT RegisterSharedPlugins() = 0;                                       // 3
    virtual HRESULT RegisterPluginDirectory(aafCharacter_constptr directoryName) = 0;  // 4
    virtual HRESULT RegisterPluginFile(aafCharacter_constptr fileName) = 0;            // 5
    virtual HRESULT EnumLoadedPlugins(aafUID_constref categoryID,
                                      IEnumAAFLoadedPlugins** enumerator) = 0;  // 6
    virtual HRESULT CreatePluginDefinition(aafUID_constref pluginDefID, IAAFDictionary* dictionary,
                                           IAAFDefObject** pluginDef) = 0;  // 7
    virtual HRESULT CreateInstance(REFCLSID rclsid, IUnknown* unkOuter, REFIID riid,
                                   void** plugin) = 0;  // 8

protected:
    ~IAAFPluginManager() = default;
};

inline constexpr GUID IID_IAAFPluginManager = ncfGuid("AD1BB85C-DBB2-11D2-809C-006008143E6F");
constexpr const GUID& aafIdOf(const IAAFPluginManager*) {
    return IID_IAAFPluginManager;
}

// Answered by EnumAAFCodecFlavours.
struct IEnumAAFCodecFlavours : IUnknown {
    virtual HRESULT NextOne(aafUID_t* AAFCodecFlavour) = 0;                                     // 3
    virtual HRESULT Next(aafUInt32 count, aafUID_t* AAFCodecFlavours, aafUInt32* fetched) = 0;  // 4
    virtual HRESULT Skip(aafUInt32 count) = 0;                                                  // 5
    virtual HRESULT Reset() = 0;                                                                // 6
    virtual HRESULT Clone(IEnumAAFCodecFlavours** enumerator) = 0;                              // 7

protected:
    ~IEnumAAFCodecFlavours() = default;
};

inline constexpr GUID IID_IEnumAAFCodecFlavours = ncfGuid("AB4D9F12-DD69-11D2-809C-006008143E6F");
constexpr const GUID& aafIdOf(const IEnumAAFCodecFlavours*) {
    return IID_IEnumAAFCodecFlavours;
}

// Answered by EnumAAFLoadedPlugins.
struct IEnumAAFLoadedPlugins : IUnknown {
    virtual HRESULT NextOne(aafUID_t* AAFPluginID) = 0;                                     // 3
    virtual HRESULT Next(aafUInt32 count, aafUID_t* AAFPluginIDs, aafUInt32* fetched) = 0;  // 4
    virtual HRESULT Skip(aafUInt32 count) = 0;                                              // 5
    virtual HRESULT Reset() = 0;                                                            // 6
    virtual HRESULT Clone(IEnumAAFLoadedPlugins** enumerator) = 0;                          // 7

protected:
    ~IEnumAAFLoadedPlugins() = default;
};

inline constexpr GUID IID_IEnumAAFLoadedPlugins = ncfGuid("AB4D9F14-DD69-11D2-809C-006008143E6F");
constexpr const GUID& aafIdOf(const IEnumAAFLoadedPlugins*) {
    return IID_IEnumAAFLoadedPlugins;
}

// Answered by EnumAAFPluginDefs.
struct IEnumAAFPluginDefs : IUnknown {
    virtual HRESULT NextOne(IAAFPluginDef** pluginDefs) = 0;  // 3
    virtual HRESULT Next(aafUInt32 count, IAAFPluginDef** pluginDefs,
                         aafUInt32* numFetched) = 0;             // 4
    virtual HRESULT Skip(aafUInt32 count) = 0;                   // 5
    virtual HRESULT Reset() = 0;                                 // 6
    virtual HRESULT Clone(IEnumAAFPluginDefs** enumerator) = 0;  // 7

protected:
    ~IEnumAAFPluginDefs() = default;
};

inline constexpr GUID IID_IEnumAAFPluginDefs = ncfGuid("AD1BB85F-DBB2-11D2-809C-006008143E6F");
constexpr const GUID& aafIdOf(const IEnumAAFPluginDefs*) {
    return IID_IEnumAAFPluginDefs;
}

// Answered by EnumAAFPluginLocators.
struct IEnumAAFPluginLocators : IUnknown {
    virtual HRESULT NextOne(IAAFLocator** AAFLocator) = 0;                                     // 3
    virtual HRESULT Next(aafUInt32 count, IAAFLocator** AAFLocators, aafUInt32* fetched) = 0;  // 4
    virtual HRESULT Skip(aafUInt32 count) = 0;                                                 // 5
    virtual HRESULT Reset() = 0;                                                               // 6
    virtual HRESULT Clone(IEnumAAFPluginLocators** enumerator) = 0;                            // 7

protected:
    ~IEnumAAFPluginLocators() = default;
};

inline constexpr GUID IID_IEnumAAFPluginLocators = ncfGuid("AD1BB861-DBB2-11D2-809C-006008143E6F");
constexpr const GUID& aafIdOf(const IEnumAAFPluginLocators*) {
    return IID_IEnumAAFPluginLocators;
}
