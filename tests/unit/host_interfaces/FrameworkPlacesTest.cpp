// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// The places of the operations of host_interfaces/framework/ in their tables, written
// down once more and called by number: modules that are built call by place.

#include "host_interfaces/framework/Buffer.h"
#include "host_interfaces/framework/Capability.h"
#include "host_interfaces/framework/ComponentFactory.h"
#include "host_interfaces/framework/Console.h"
#include "host_interfaces/framework/Definitions.h"
#include "host_interfaces/framework/EditorSettings.h"
#include "host_interfaces/framework/HostSettings.h"
#include "host_interfaces/framework/Lock.h"
#include "host_interfaces/framework/String.h"
#include "tests/unit/host_interfaces/CallPlace.h"

// clang-format off
namespace {

struct PlacesINCFBuffer : PlaceFake<INCFBuffer> {
    NCFRESULT Allocate(ncfUInt64, ncfUInt32) override { return Ran<NCFRESULT>("Allocate"); }
    NCFRESULT GetBufferPointer(void**) override { return Ran<NCFRESULT>("GetBufferPointer"); }
    NCFRESULT SetComplete(ncfUInt32, ncfUInt64, NCFRESULT) override { return Ran<NCFRESULT>("SetComplete"); }
};

TEST(Places, OfINCFBuffer) {
    ExpectPlaces<PlacesINCFBuffer>({
        {3, "Allocate"}, {4, "GetBufferPointer"}, {5, "SetComplete"},
    });
}

struct PlacesINCFCapability : PlaceFake<INCFCapability> {
    NCFRESULT GetValue(ncfUInt32*) override { return Ran<NCFRESULT>("GetValue"); }
};

TEST(Places, OfINCFCapability) {
    ExpectPlaces<PlacesINCFCapability>({
        {3, "GetValue"},
    });
}

struct PlacesINCFComponentFactory : PlaceFake<INCFComponentFactory> {
    NCFRESULT CreateComponent(const GUID&, INCFUnknown*, const GUID&, void**) override { return Ran<NCFRESULT>("CreateComponent"); }
};

TEST(Places, OfINCFComponentFactory) {
    ExpectPlaces<PlacesINCFComponentFactory>({
        {3, "CreateComponent"},
    });
}

struct PlacesINCFClassFactory : PlaceFake<INCFClassFactory> {
    NCFRESULT CreateInstance(INCFUnknown*, INCFUnknown*, const GUID&, void**) override { return Ran<NCFRESULT>("CreateInstance"); }
};

TEST(Places, OfINCFClassFactory) {
    ExpectPlaces<PlacesINCFClassFactory>({
        {3, "CreateInstance"},
    });
}

struct PlacesINCFConsole : PlaceFake<INCFConsole> {
    NCFRESULT ReservedConsoleOperationA() override { return Ran<NCFRESULT>("ReservedConsoleOperationA"); }
    NCFRESULT ReservedConsoleOperationB() override { return Ran<NCFRESULT>("ReservedConsoleOperationB"); }
    NCFRESULT Write(ncfUInt32, const char*, ...) override { return Ran<NCFRESULT>("Write"); }
};

TEST(Places, OfINCFConsole) {
    ExpectPlaces<PlacesINCFConsole>({
        {3, "ReservedConsoleOperationA"}, {4, "ReservedConsoleOperationB"}, {5, "Write"},
    });
}

struct PlacesINCFPluginDefinition : PlaceFake<INCFPluginDefinition> {
    NCFRESULT SetAttribute(const GUID&, const GUID&, const void*, ncfUInt32) override { return Ran<NCFRESULT>("SetAttribute"); }
    NCFRESULT ReservedPluginDefinitionA() override { return Ran<NCFRESULT>("ReservedPluginDefinitionA"); }
    NCFRESULT ReservedPluginDefinitionB() override { return Ran<NCFRESULT>("ReservedPluginDefinitionB"); }
    NCFRESULT Define(const GUID&, ncfUInt32, ncfUInt32, const char*, const GUID&, const char*, ncfUInt32, ncfUInt32) override { return Ran<NCFRESULT>("Define"); }
};

TEST(Places, OfINCFPluginDefinition) {
    ExpectPlaces<PlacesINCFPluginDefinition>({
        {3, "SetAttribute"}, {4, "ReservedPluginDefinitionA"}, {5, "ReservedPluginDefinitionB"},
        {6, "Define"},
    });
}

struct PlacesINCFComponentDefinition : PlaceFake<INCFComponentDefinition> {
    NCFRESULT SetAttribute(const GUID&, const GUID&, const void*, ncfUInt32) override { return Ran<NCFRESULT>("SetAttribute"); }
    NCFRESULT ReservedComponentDefinitionA() override { return Ran<NCFRESULT>("ReservedComponentDefinitionA"); }
    NCFRESULT ReservedComponentDefinitionB() override { return Ran<NCFRESULT>("ReservedComponentDefinitionB"); }
    NCFRESULT Define(const GUID&, const GUID&, ncfUInt32, ncfUInt32, const GUID&, const char*) override { return Ran<NCFRESULT>("Define"); }
};

TEST(Places, OfINCFComponentDefinition) {
    ExpectPlaces<PlacesINCFComponentDefinition>({
        {3, "SetAttribute"}, {4, "ReservedComponentDefinitionA"},
        {5, "ReservedComponentDefinitionB"}, {6, "Define"},
    });
}

struct PlacesINCFNMAEditorSettings : PlaceFake<INCFNMAEditorSettings> {
    NCFRESULT GetEditorFrameRate(double*, ncfUInt32*, ncfUInt32*) override { return Ran<NCFRESULT>("GetEditorFrameRate"); }
    NCFRESULT GetSingleFrameDuration(ncfUInt32*) override { return Ran<NCFRESULT>("GetSingleFrameDuration"); }
    NCFRESULT GetForcedFrameRate(ncfUInt32*, double*) override { return Ran<NCFRESULT>("GetForcedFrameRate"); }
    NCFRESULT ReservedEditorSetting() override { return Ran<NCFRESULT>("ReservedEditorSetting"); }
    NCFRESULT GetNamedSetting(const ncfUTF8*, ncfUInt32*, ncfUInt64*, void*) override { return Ran<NCFRESULT>("GetNamedSetting"); }
};

TEST(Places, OfINCFNMAEditorSettings) {
    ExpectPlaces<PlacesINCFNMAEditorSettings>({
        {3, "GetEditorFrameRate"}, {4, "GetSingleFrameDuration"}, {5, "GetForcedFrameRate"},
        {6, "ReservedEditorSetting"}, {7, "GetNamedSetting"},
    });
}

struct PlacesIHostSettings : PlaceFake<NMA::IHostSettings> {
    NCFRESULT GetHostSettingBoolean(const GUID&, ncfUInt32, ncfBool*) override { return Ran<NCFRESULT>("GetHostSettingBoolean"); }
};

TEST(Places, OfIHostSettings) {
    ExpectPlaces<PlacesIHostSettings>({
        {3, "GetHostSettingBoolean"},
    });
}

struct PlacesINCFLock : PlaceFake<INCFLock> {
    NCFRESULT Lock() override { return Ran<NCFRESULT>("Lock"); }
    NCFRESULT Unlock() override { return Ran<NCFRESULT>("Unlock"); }
};

TEST(Places, OfINCFLock) {
    ExpectPlaces<PlacesINCFLock>({
        {3, "Lock"}, {4, "Unlock"},
    });
}

struct PlacesINCFString : PlaceFake<INCFString> {
    ncfUInt32 GetEncoding() override { return Ran<ncfUInt32>("GetEncoding"); }
    ncfUInt32 GetLength() override { return Ran<ncfUInt32>("GetLength"); }
    ncfBool IsEmpty() override { return Ran<ncfBool>("IsEmpty"); }
    NCFRESULT Assign(INCFString*) override { return Ran<NCFRESULT>("Assign"); }
    NCFRESULT AssignUTF8(ncfUInt32, const ncfUTF8*, ncfUInt32) override { return Ran<NCFRESULT>("AssignUTF8"); }
    NCFRESULT AssignUTF16(ncfUInt32, const ncfUTF16*, ncfUInt32) override { return Ran<NCFRESULT>("AssignUTF16"); }
    NCFRESULT AssignWCHAR(ncfUInt32, const ncfWCHAR*, ncfUInt32) override { return Ran<NCFRESULT>("AssignWCHAR"); }
    NCFRESULT ConvertTo(ncfUInt32) override { return Ran<NCFRESULT>("ConvertTo"); }
    NCFRESULT ConvertCopy(ncfUInt32, INCFString**) override { return Ran<NCFRESULT>("ConvertCopy"); }
    NCFRESULT GetRawUTF8(ncfUTF8**) override { return Ran<NCFRESULT>("GetRawUTF8"); }
    NCFRESULT GetRawUTF16(ncfUTF16**) override { return Ran<NCFRESULT>("GetRawUTF16"); }
    NCFRESULT GetRawUTF32(ncfUTF32**) override { return Ran<NCFRESULT>("GetRawUTF32"); }
    NCFRESULT GetRawWCHAR(ncfWCHAR**) override { return Ran<NCFRESULT>("GetRawWCHAR"); }
    NCFRESULT FindCharacter(ncfUTF32, ncfSInt32, ncfBool, ncfSInt32*) override { return Ran<NCFRESULT>("FindCharacter"); }
    NCFRESULT FindWCHAR(const ncfWCHAR*, ncfUInt32, ncfUInt32, ncfSInt32*) override { return Ran<NCFRESULT>("FindWCHAR"); }
};

TEST(Places, OfINCFString) {
    ExpectPlaces<PlacesINCFString>({
        {3, "GetEncoding"}, {4, "GetLength"}, {5, "IsEmpty"}, {6, "Assign"}, {7, "AssignUTF8"},
        {8, "AssignUTF16"}, {9, "AssignWCHAR"}, {10, "ConvertTo"}, {11, "ConvertCopy"},
        {12, "GetRawUTF8"}, {13, "GetRawUTF16"}, {14, "GetRawUTF32"}, {15, "GetRawWCHAR"},
        {16, "FindCharacter"}, {17, "FindWCHAR"},
    });
}

}  // namespace
// clang-format on
