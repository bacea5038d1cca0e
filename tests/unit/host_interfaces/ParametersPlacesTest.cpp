// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// The places of the operations of host_interfaces/parameters/ in their tables,
// written down once more and called by number: modules that are built call by
// place.

#include "host_interfaces/parameters/ParameterSuite.h"
#include "host_interfaces/parameters/ParameterValue.h"
#include "host_interfaces/parameters/ParametersReader.h"
#include "host_interfaces/parameters/ParametersXML.h"
#include "tests/unit/host_interfaces/CallPlace.h"

// clang-format off
namespace {

struct PlacesIParameterSuite : PlaceFake<IParameterSuite> {
    NCFRESULT SetComponentId(const GUID&) override { return Ran<NCFRESULT>("SetComponentId"); }
    NCFRESULT Prepare(ncfUInt32) override { return Ran<NCFRESULT>("Prepare"); }
    NCFRESULT WriteXML(INCFString*) override { return Ran<NCFRESULT>("WriteXML"); }
    NCFRESULT BeginDescription(float) override { return Ran<NCFRESULT>("BeginDescription"); }
    NCFRESULT AddGroup(const GUID&, const char*, ncfUInt32, ncfUInt32) override { return Ran<NCFRESULT>("AddGroup"); }
    NCFRESULT AddParameter(const GUID&, const char*, const char*, ncfUInt32, const GUID&) override { return Ran<NCFRESULT>("AddParameter"); }
    NCFRESULT EndDescription() override { return Ran<NCFRESULT>("EndDescription"); }
    NCFRESULT AddValueChoice(const char*, ncfUInt32, ncfBool) override { return Ran<NCFRESULT>("AddValueChoice"); }
    NCFRESULT AddDependency(ncfUInt32, const GUID&, IParameterValue*, ncfUInt32) override { return Ran<NCFRESULT>("AddDependency"); }
    NCFRESULT AddParamSet(const GUID&, const char*, ncfUInt32, float, ncfBool) override { return Ran<NCFRESULT>("AddParamSet"); }
    NCFRESULT AddParamValue(const GUID&, IParameterValue*) override { return Ran<NCFRESULT>("AddParamValue"); }
};

TEST(Places, OfIParameterSuite) {
    ExpectPlaces<PlacesIParameterSuite>({
        {3, "SetComponentId"}, {4, "Prepare"}, {5, "WriteXML"}, {6, "BeginDescription"},
        {7, "AddGroup"}, {8, "AddParameter"}, {9, "EndDescription"}, {10, "AddValueChoice"},
        {11, "AddDependency"}, {12, "AddParamSet"}, {13, "AddParamValue"},
    });
}

struct PlacesIParametersReader : PlaceFake<IParametersReader> {
    NCFRESULT SetHandler(NMA::IParametersHandler*) override { return Ran<NCFRESULT>("SetHandler"); }
    NCFRESULT Parse(INCFString*) override { return Ran<NCFRESULT>("Parse"); }
};

TEST(Places, OfIParametersReader) {
    ExpectPlaces<PlacesIParametersReader>({
        {3, "SetHandler"}, {4, "Parse"},
    });
}

struct PlacesIParametersHandler : PlaceFake<NMA::IParametersHandler> {
    NCFRESULT BeginDocument() override { return Ran<NCFRESULT>("BeginDocument"); }
    NCFRESULT BeginComponent(const GUID&) override { return Ran<NCFRESULT>("BeginComponent"); }
    NCFRESULT EndComponent(ncfUInt32) override { return Ran<NCFRESULT>("EndComponent"); }
    NCFRESULT BeginParamSet(const GUID&, INCFString*, float, ncfUInt32) override { return Ran<NCFRESULT>("BeginParamSet"); }
    NCFRESULT ParamValue(const GUID&, IParameterValue*) override { return Ran<NCFRESULT>("ParamValue"); }
    NCFRESULT EndDocument() override { return Ran<NCFRESULT>("EndDocument"); }
};

TEST(Places, OfIParametersHandler) {
    ExpectPlaces<PlacesIParametersHandler>({
        {3, "BeginDocument"}, {4, "BeginComponent"}, {5, "EndComponent"},
        {6, "BeginParamSet"}, {7, "ParamValue"}, {8, "EndDocument"},
    });
}

struct PlacesIValueFactory : PlaceFake<IValueFactory> {
    NCFRESULT CreateValue(IParameterValue**) override { return Ran<NCFRESULT>("CreateValue"); }
};

TEST(Places, OfIValueFactory) {
    ExpectPlaces<PlacesIValueFactory>({
        {3, "CreateValue"},
    });
}

struct PlacesIParameterValue : PlaceFake<IParameterValue> {
    NCFRESULT Clear() override { return Ran<NCFRESULT>("Clear"); }
    NCFRESULT SetData(const GUID&, const void*, ncfUInt32, ncfUInt32) override { return Ran<NCFRESULT>("SetData"); }
    NCFRESULT GetData(void*, ncfUInt32) override { return Ran<NCFRESULT>("GetData"); }
};

TEST(Places, OfIParameterValue) {
    ExpectPlaces<PlacesIParameterValue>({
        {3, "Clear"}, {4, "SetData"}, {5, "GetData"},
    });
}

struct PlacesINCFParametersXML : PlaceFake<INCFParametersXML> {
    NCFRESULT GetParameterValuesXML(INCFString*) override { return Ran<NCFRESULT>("GetParameterValuesXML"); }
    NCFRESULT GetParameterDescriptionXML(INCFString*) override { return Ran<NCFRESULT>("GetParameterDescriptionXML"); }
    NCFRESULT GetDefaultValuesXML(INCFString*) override { return Ran<NCFRESULT>("GetDefaultValuesXML"); }
    NCFRESULT SetParameterValuesXML(INCFString*) override { return Ran<NCFRESULT>("SetParameterValuesXML"); }
    NCFRESULT ParametersUnsupportedOperation(void*) override { return Ran<NCFRESULT>("ParametersUnsupportedOperation"); }
    NCFRESULT ResetParameters() override { return Ran<NCFRESULT>("ResetParameters"); }
};

TEST(Places, OfINCFParametersXML) {
    ExpectPlaces<PlacesINCFParametersXML>({
        {3, "GetParameterValuesXML"}, {4, "GetParameterDescriptionXML"},
        {5, "GetDefaultValuesXML"}, {6, "SetParameterValuesXML"},
        {7, "ParametersUnsupportedOperation"}, {8, "ResetParameters"},
    });
}

}  // namespace
// clang-format on
