// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// The places of the operations of host_interfaces/parameters/ in their tables.

#include "host_interfaces/parameters/ParameterSuite.h"
#include "host_interfaces/parameters/ParameterValue.h"
#include "host_interfaces/parameters/ParametersReader.h"
#include "host_interfaces/parameters/ParametersXML.h"
#include "tests/support/Slots.h"

namespace {

// clang-format off
const SlotRow kParametersSlots[] = {
    {"IParameterSuite::SetComponentId", 3, SlotOf(&IParameterSuite::SetComponentId)},
    {"IParameterSuite::Prepare", 4, SlotOf(&IParameterSuite::Prepare)},
    {"IParameterSuite::WriteXML", 5, SlotOf(&IParameterSuite::WriteXML)},
    {"IParameterSuite::BeginDescription", 6, SlotOf(&IParameterSuite::BeginDescription)},
    {"IParameterSuite::AddGroup", 7, SlotOf(&IParameterSuite::AddGroup)},
    {"IParameterSuite::AddParameter", 8, SlotOf(&IParameterSuite::AddParameter)},
    {"IParameterSuite::EndDescription", 9, SlotOf(&IParameterSuite::EndDescription)},
    {"IParameterSuite::AddValueChoice", 10, SlotOf(&IParameterSuite::AddValueChoice)},
    {"IParameterSuite::AddDependency", 11, SlotOf(&IParameterSuite::AddDependency)},
    {"IParameterSuite::AddParamSet", 12, SlotOf(&IParameterSuite::AddParamSet)},
    {"IParameterSuite::AddParamValue", 13, SlotOf(&IParameterSuite::AddParamValue)},
    {"IParametersReader::SetHandler", 3, SlotOf(&IParametersReader::SetHandler)},
    {"IParametersReader::Parse", 4, SlotOf(&IParametersReader::Parse)},
    {"IParametersHandler::BeginDocument", 3, SlotOf(&NMA::IParametersHandler::BeginDocument)},
    {"IParametersHandler::BeginComponent", 4, SlotOf(&NMA::IParametersHandler::BeginComponent)},
    {"IParametersHandler::EndComponent", 5, SlotOf(&NMA::IParametersHandler::EndComponent)},
    {"IParametersHandler::BeginParamSet", 6, SlotOf(&NMA::IParametersHandler::BeginParamSet)},
    {"IParametersHandler::ParamValue", 7, SlotOf(&NMA::IParametersHandler::ParamValue)},
    {"IParametersHandler::EndDocument", 8, SlotOf(&NMA::IParametersHandler::EndDocument)},
    {"IValueFactory::CreateValue", 3, SlotOf(&IValueFactory::CreateValue)},
    {"IParameterValue::Clear", 3, SlotOf(&IParameterValue::Clear)},
    {"IParameterValue::SetData", 4, SlotOf(&IParameterValue::SetData)},
    {"IParameterValue::GetData", 5, SlotOf(&IParameterValue::GetData)},
    {"INCFParametersXML::GetParameterValuesXML", 3, SlotOf(&INCFParametersXML::GetParameterValuesXML)},
    {"INCFParametersXML::GetParameterDescriptionXML", 4, SlotOf(&INCFParametersXML::GetParameterDescriptionXML)},
    {"INCFParametersXML::GetDefaultValuesXML", 5, SlotOf(&INCFParametersXML::GetDefaultValuesXML)},
    {"INCFParametersXML::SetParameterValuesXML", 6, SlotOf(&INCFParametersXML::SetParameterValuesXML)},
    {"INCFParametersXML::ParametersUnsupportedOperation", 7, SlotOf(&INCFParametersXML::ParametersUnsupportedOperation)},
    {"INCFParametersXML::ResetParameters", 8, SlotOf(&INCFParametersXML::ResetParameters)},
};
// clang-format on

TEST(ParametersInterfaces, HaveTheirOperationsInTheirPlaces) {
    ExpectPublishedPlaces(kParametersSlots);
}

}  // namespace
