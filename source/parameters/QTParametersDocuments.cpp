// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// What the host's suite is told, in the order in which documents show it.

#include "host_interfaces/media/PluginComponents.h"
#include "source/parameters/QTParameterNames.h"
#include "source/parameters/QTParameters.h"
#include "source/plugin/ResultChecks.h"

namespace NMA::Impl {
namespace {

// Rows of one length, so that a text is found by its index alone.
constexpr std::size_t kTextLength = 256;
using TextRow = char[kTextLength];

constexpr TextRow kInternalNames[] = {"Field Ordering In File", "Field Layout", "Level Remapping"};
enum InternalName : std::size_t { kFieldOrderingName, kFieldLayoutName, kLevelRemappingName };

constexpr TextRow kFieldOrderingTexts[] = {"Progressive",
                                           "Interlaced - Odd (upper field first) ordered",
                                           "Interlaced - Even (lower field first) ordered"};
constexpr ncfUInt32 kFieldOrderingValues[] = {kProgressive, kTopFieldFirst, kBottomFieldFirst};

constexpr TextRow kFieldLayoutTexts[] = {"Merged", "Split"};
constexpr ncfUInt32 kFieldLayoutValues[] = {2, 3};

constexpr TextRow kLevelRemappingTexts[] = {"Do not modify levels",
                                            "Expand video levels to graphic levels",
                                            "Compress graphic levels to video levels"};
constexpr ncfUInt32 kLevelRemappingValues[] = {Default_Levels, Expand_Levels, Compress_Levels};

// Whether a choice of layout makes sense beside an order of the fields: kind 1
// lets it, kind 2 does not.
struct Dependency {
    ncfUInt32 fieldOrder;
    ncfUInt32 kind;
};
constexpr Dependency kLayoutDependencies[] = {
    {kTopFieldFirst, 1},
    {kBottomFieldFirst, 1},
    {kProgressive, 2},
    {kFieldOrderUndetermined, 1},
};

template <std::size_t Count>
void AddChoices(IParameterSuite* suite, const TextRow (&texts)[Count],
                const ncfUInt32 (&values)[Count], ncfUInt32 defaultValue) {
    for (std::size_t i = 0; i < Count; ++i) {
        ThrowIfFailed(suite->AddValueChoice(texts[i], values[i], values[i] == defaultValue));
    }
}

void PutNumber(IParameterValue* value, ncfUInt32 number) {
    ThrowIfFailed(value->Clear());
    ThrowIfFailed(value->SetData(kValueTypeUInt32, &number, sizeof number, 0));
}

}  // namespace

NCFSmartPtr<IParameterSuite> QTParameters::NewSuite() {
    NCFSmartPtr<IParameterSuite> suite;
    ThrowIfFailed(
        ncfCreate(componentFactory_.inArg(), CompID_ParameterSuite, IID_ParameterSuite, suite));
    ThrowIfFailed(suite->SetComponentId(CompID_QuickTimeSampleMapping));
    ThrowIfFailed(suite->Prepare(0));
    return suite;
}

NCFSmartPtr<IParameterValue> QTParameters::NewValue() {
    NCFSmartPtr<IValueFactory> factory;
    ThrowIfFailed(
        ncfCreate(componentFactory_.inArg(), kValueTypeUInt32, IID_ValueFactory, factory));
    NCFSmartPtr<IParameterValue> value;
    ThrowIfFailed(factory->CreateValue(value.outArg()));
    return value;
}

void QTParameters::WriteCurrentSet(IParameterSuite* suite) {
    // The name in the encoding that suites take, whatever the reader's was.
    NCFSmartPtr<INCFString> copy;
    ncfUTF8* name = nullptr;
    if (!setName_->IsEmpty()) {
        ThrowIfFailed(setName_->ConvertCopy(kNCFUTF8, copy.outArg()));
        ThrowIfFailed(copy->GetRawUTF8(&name));
    }
    WriteParamSet(suite, setId_, name, *clipParams_);
}

void QTParameters::WriteParamSet(IParameterSuite* suite, const GUID& setId, const char* name,
                                 const ClipParams& values) {
    const bool isDefault = setId == kParamSetDefault;
    if (isDefault) {
        name = kDefaultSetName;
    } else if (!name) {
        name = kCustomSetName;
    }
    ThrowIfFailed(suite->AddParamSet(setId, name, 0, 1.0f, isDefault));

    const NCFSmartPtr<IParameterValue> value = NewValue();
    const std::pair<GUID, ncfUInt32> numbers[] = {
        {kParamFieldOrdering, values.fieldOrderInFile},
        {kParamFieldLayout, values.fieldLayout},
        {kParamLevelRemapping, values.levelRemap},
    };
    for (const auto& [parameter, number] : numbers) {
        PutNumber(value.inArg(), number);
        ThrowIfFailed(suite->AddParamValue(parameter, value.inArg()));
    }
}

void QTParameters::WriteParameterDescription(IParameterSuite* suite) {
    ThrowIfFailed(suite->BeginDescription(1.0f));
    ThrowIfFailed(suite->AddGroup(kParamGroup, "", 0, 1));

    ThrowIfFailed(suite->AddParameter(kParamFieldOrdering, kInternalNames[kFieldOrderingName],
                                      "Field Ordering", 0, kParamTypeChoice));
    AddChoices(suite, kFieldOrderingTexts, kFieldOrderingValues, clipParams_->detectedFieldOrder);
    const NCFSmartPtr<IParameterValue> value = NewValue();
    for (const Dependency& dependency : kLayoutDependencies) {
        PutNumber(value.inArg(), dependency.fieldOrder);
        ThrowIfFailed(suite->AddDependency(dependency.kind, kParamFieldLayout, value.inArg(), 1));
    }

    // Merged is shown as the default, although a clip starts with no wish at all.
    ThrowIfFailed(suite->AddParameter(kParamFieldLayout, kInternalNames[kFieldLayoutName],
                                      "Field Layout", 0, kParamTypeChoice));
    AddChoices(suite, kFieldLayoutTexts, kFieldLayoutValues, kFieldLayoutValues[0]);

    ThrowIfFailed(suite->AddParameter(kParamLevelRemapping, kInternalNames[kLevelRemappingName],
                                      "GFX-Video Level", 0, kParamTypeChoice));
    AddChoices(suite, kLevelRemappingTexts, kLevelRemappingValues, defaultParams_.levelRemap);
    ThrowIfFailed(suite->EndDescription());
}

}  // namespace NMA::Impl
