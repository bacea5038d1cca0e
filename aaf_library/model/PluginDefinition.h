// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/model/DefinitionObjects.h"
#include "host_interfaces/aaf/AAFLocators.h"

namespace aaf {

// A program that codes essence or computes effects, as a file tells of it. Nothing is loaded.
class PluginDefinition : public PlainDefinition<IAAFPluginDef> {
public:
    // -- IAAFPluginDef: what it is
    HRESULT GetCategoryClass(aafUID_t* categoryClass) override {
        return ReadStruct(prop::PluginDefinition_PluginCategory, categoryClass);
    }
    HRESULT SetCategoryClass(aafUID_constref categoryClass) override {
        return PutStruct(prop::PluginDefinition_PluginCategory, categoryClass);
    }
    HRESULT GetDefinitionObjectID(aafUID_t* id) override {
        return ReadStruct(prop::PluginDefinition_DefinitionObject, id);
    }
    HRESULT SetDefinitionObjectID(aafUID_t id) override {
        return PutStruct(prop::PluginDefinition_DefinitionObject, id);
    }
    HRESULT GetPluginVersion(aafVersionType_t* version) override {
        return ReadStruct(prop::PluginDefinition_VersionNumber, version);
    }
    HRESULT SetPluginVersion(aafVersionType_t* version) override {
        return version == nullptr ? AAFRESULT_NULL_PARAM
                                  : PutStruct(prop::PluginDefinition_VersionNumber, *version);
    }
    HRESULT SetPluginVersionString(aafCharacter_constptr text) override {
        return PutString(prop::PluginDefinition_VersionString, text);
    }
    HRESULT GetPluginVersionString(aafCharacter* text, aafUInt32 bufSize) override {
        return ReadString(prop::PluginDefinition_VersionString, text, bufSize);
    }
    HRESULT GetPluginVersionStringBufLen(aafUInt32* bufSize) override {
        return ReadStringLength(prop::PluginDefinition_VersionString, bufSize);
    }

    // Who made it
    HRESULT SetPluginManufacturerName(aafCharacter_constptr text) override {
        return PutString(prop::PluginDefinition_Manufacturer, text);
    }
    HRESULT GetPluginManufacturerName(aafCharacter* text, aafUInt32 bufSize) override {
        return ReadString(prop::PluginDefinition_Manufacturer, text, bufSize);
    }
    HRESULT GetPluginManufacturerNameBufLen(aafUInt32* bufSize) override {
        return ReadStringLength(prop::PluginDefinition_Manufacturer, bufSize);
    }
    HRESULT GetManufacturerInfo(IAAFNetworkLocator** locator) override {
        return ReadObject(prop::PluginDefinition_ManufacturerInfo, locator);
    }
    HRESULT SetManufacturerInfo(IAAFNetworkLocator* locator) override {
        return PutObject(prop::PluginDefinition_ManufacturerInfo, locator);
    }
    HRESULT GetManufacturerID(aafUID_t* id) override {
        return ReadStruct(prop::PluginDefinition_ManufacturerID, id);
    }
    HRESULT SetManufacturerID(aafUID_constref id) override {
        return PutStruct(prop::PluginDefinition_ManufacturerID, id);
    }

    // What it runs on
    HRESULT GetHardwarePlatform(aafHardwarePlatform_t* platform) override {
        return ReadStruct(prop::PluginDefinition_Platform, platform);
    }
    HRESULT SetHardwarePlatform(aafHardwarePlatform_constref platform) override {
        return PutStruct(prop::PluginDefinition_Platform, platform);
    }
    HRESULT GetPlatformVersionRange(aafVersionType_t* minVersion,
                                    aafVersionType_t* maxVersion) override {
        return ReadRange(prop::PluginDefinition_MinPlatformVersion,
                         prop::PluginDefinition_MaxPlatformVersion, minVersion, maxVersion);
    }
    HRESULT SetPlatformMinimumVersion(aafVersionType_constref version) override {
        return PutStruct(prop::PluginDefinition_MinPlatformVersion, version);
    }
    HRESULT SetPlatformMaximumVersion(aafVersionType_constref version) override {
        return PutStruct(prop::PluginDefinition_MaxPlatformVersion, version);
    }
    HRESULT GetEngine(aafEngine_t* engine) override {
        return ReadStruct(prop::PluginDefinition_Engine, engine);
    }
    HRESULT SetEngine(aafEngine_constref engine) override {
        return PutStruct(prop::PluginDefinition_Engine, engine);
    }
    HRESULT GetEngineVersionRange(aafVersionType_t* minVersion,
                                  aafVersionType_t* maxVersion) override {
        return ReadRange(prop::PluginDefinition_MinEngineVersion,
                         prop::PluginDefinition_MaxEngineVersion, minVersion, maxVersion);
    }
    HRESULT SetEngineMinimumVersion(aafVersionType_constref version) override {
        return PutStruct(prop::PluginDefinition_MinEngineVersion, version);
    }
    HRESULT SetEngineMaximumVersion(aafVersionType_constref version) override {
        return PutStruct(prop::PluginDefinition_MaxEngineVersion, version);
    }
    HRESULT GetPluginAPI(aafPluginAPI_t* pluginAPI) override {
        return ReadStruct(prop::PluginDefinition_PluginAPI, pluginAPI);
    }
    HRESULT SetPluginAPI(aafPluginAPI_constref pluginAPI) override {
        return PutStruct(prop::PluginDefinition_PluginAPI, pluginAPI);
    }
    HRESULT GetPluginAPIVersionRange(aafVersionType_t* minVersion,
                                     aafVersionType_t* maxVersion) override {
        return ReadRange(prop::PluginDefinition_MinPluginAPI, prop::PluginDefinition_MaxPluginAPI,
                         minVersion, maxVersion);
    }
    HRESULT SetPluginAPIMinimumVersion(aafVersionType_constref version) override {
        return PutStruct(prop::PluginDefinition_MinPluginAPI, version);
    }
    HRESULT SetPluginAPIMaximumVersion(aafVersionType_constref version) override {
        return PutStruct(prop::PluginDefinition_MaxPluginAPI, version);
    }
    HRESULT IsSoftwareOnly(aafBoolean_t* result) override {
        return ReadInteger(prop::PluginDefinition_SoftwareOnly, result);
    }
    HRESULT SetIsSoftwareOnly(aafBoolean_t value) override {
        return PutBoolean(prop::PluginDefinition_SoftwareOnly, value);
    }
    HRESULT IsAccelerated(aafBoolean_t* result) override {
        return ReadInteger(prop::PluginDefinition_Accelerator, result);
    }
    HRESULT SetIsAccelerated(aafBoolean_t value) override {
        return PutBoolean(prop::PluginDefinition_Accelerator, value);
    }
    HRESULT SupportsAuthentication(aafBoolean_t* result) override {
        return ReadInteger(prop::PluginDefinition_Authentication, result);
    }
    HRESULT SetSupportsAuthentication(aafBoolean_t value) override {
        return PutBoolean(prop::PluginDefinition_Authentication, value);
    }

    // Where it may be found
    HRESULT CountLocators(aafUInt32* result) override {
        return ReadCount(prop::PluginDefinition_Locators, result);
    }
    HRESULT AppendLocator(IAAFLocator* locator) override {
        return AppendObject(prop::PluginDefinition_Locators, locator);
    }
    HRESULT PrependLocator(IAAFLocator* locator) override {
        return PrependObject(prop::PluginDefinition_Locators, locator);
    }
    HRESULT InsertLocatorAt(aafUInt32 index, IAAFLocator* locator) override {
        return InsertObjectAt(prop::PluginDefinition_Locators, index, locator);
    }
    HRESULT GetLocatorAt(aafUInt32 index, IAAFLocator** locator) override {
        return ReadObjectAt(prop::PluginDefinition_Locators, index, locator);
    }
    HRESULT RemoveLocatorAt(aafUInt32 index) override {
        return RemoveObjectAt(prop::PluginDefinition_Locators, index);
    }
    HRESULT GetLocators(IEnumAAFPluginLocators** enumerator) override {
        return MakeEnumerator<IAAFLocator>(this, prop::PluginDefinition_Locators, enumerator);
    }

private:
    // Both ends have to be there.
    HRESULT ReadRange(const PropertyKey& minimum, const PropertyKey& maximum,
                      aafVersionType_t* minVersion, aafVersionType_t* maxVersion) const {
        if (minVersion == nullptr || maxVersion == nullptr) {
            return AAFRESULT_NULL_PARAM;
        }
        if (!IsPresent(minimum) || !IsPresent(maximum)) {
            return AAFRESULT_PROP_NOT_PRESENT;
        }
        const HRESULT result = ReadStruct(minimum, minVersion);
        return result < 0 ? result : ReadStruct(maximum, maxVersion);
    }
};

}  // namespace aaf
