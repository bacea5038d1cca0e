// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// What the host's reader tells of a document of values. Values are taken inside
// this module's component and a set in use, and nowhere else.

#include "host_interfaces/media/PluginComponents.h"
#include "source/parameters/QTParameters.h"
#include "source/plugin/ResultChecks.h"
#include "source/plugin/ResultOf.h"

namespace NMA::Impl {
namespace {

// State of a set as the reader tells it. Any state but the first makes the set
// the current one; only one lets values through.
constexpr ncfUInt32 kSetNotInUse = 0;
constexpr ncfUInt32 kSetWithValues = 1;

struct Target {
    GUID parameter;
    ncfUInt32 ClipParams::*field;
};

constexpr Target kTargets[] = {
    {kParamFieldOrdering, &ClipParams::fieldOrderInFile},
    {kParamLevelRemapping, &ClipParams::levelRemap},
    {kParamFieldLayout, &ClipParams::fieldLayout},
};

}  // namespace

NCFRESULT QTParameters::BeginDocument() {
    inComponent_ = false;
    return NCF_OK;
}

NCFRESULT QTParameters::BeginComponent(const GUID& component) {
    inComponent_ = component == CompID_QuickTimeSampleMapping;
    inSet_ = false;
    return NCF_OK;
}

NCFRESULT QTParameters::EndComponent(ncfUInt32 isWhole) {
    if (isWhole) {
        inComponent_ = false;
        inSet_ = false;
    }
    return NCF_OK;
}

NCFRESULT QTParameters::BeginParamSet(const GUID& set, INCFString* name, float, ncfUInt32 state) {
    return ResultOf([&] {
        inSet_ = state == kSetWithValues;
        if (state == kSetNotInUse) {
            return NCF_OK;
        }
        setId_ = set;
        // The text is copied: the reader's string may change under this object,
        // and a reset would write into it.
        ThrowIfFailed(name ? setName_->Assign(name)
                           : setName_->AssignUTF8(kNCFUTF8, "", kNCFZeroTerminated));
        return NCF_OK;
    });
}

NCFRESULT QTParameters::ParamValue(const GUID& parameter, IParameterValue* value) {
    return ResultOf([&]() -> NCFRESULT {
        if (!inComponent_ || !inSet_ || !clipParams_) {
            return NCF_OK;
        }
        for (const Target& target : kTargets) {
            if (target.parameter == parameter) {
                if (!value) {
                    return NCF_E_POINTER;
                }
                // The number is taken as it comes, a choice or not.
                ncfUInt32 number = 0;
                ThrowIfFailed(value->GetData(&number, sizeof number));
                clipParams_->*target.field = number;
                return NCF_OK;
            }
        }
        return NCF_OK;
    });
}

NCFRESULT QTParameters::EndDocument() {
    inComponent_ = false;
    inSet_ = false;
    return NCF_OK;
}

}  // namespace NMA::Impl
