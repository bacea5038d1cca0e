// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/parameters/ParameterSuite.h"
#include "reference_host/framework/Component.h"
#include "reference_host/parameters/ParameterDocument.h"

namespace host {

// The suite component: gathers a document of one track from calls and writes it.
class ParameterSuite final : public Component<IParameterSuite> {
public:
    NCFRESULT SetComponentId(const GUID& component) override;
    NCFRESULT Prepare(ncfUInt32 track) override;
    NCFRESULT WriteXML(INCFString* out) override;
    NCFRESULT BeginDescription(float version) override;
    NCFRESULT AddGroup(const GUID& group, const char* name, ncfUInt32 zero,
                       ncfUInt32 isShown) override;
    NCFRESULT AddParameter(const GUID& parameter, const char* internalName, const char* label,
                           ncfUInt32 zero, const GUID& type) override;
    NCFRESULT EndDescription() override;
    NCFRESULT AddValueChoice(const char* text, ncfUInt32 value, ncfBool isDefault) override;
    NCFRESULT AddDependency(ncfUInt32 kind, const GUID& parameter, IParameterValue* value,
                            ncfUInt32 one) override;
    NCFRESULT AddParamSet(const GUID& set, const char* name, ncfUInt32 zero, float version,
                          ncfBool isDefault) override;
    NCFRESULT AddParamValue(const GUID& parameter, IParameterValue* value) override;

private:
    enum class Stage { kEmpty, kPrepared, kDescribing, kDescribed };

    // A dependency waits for the end of the description: it may name a
    // parameter that is added after it.
    struct Dependency {
        GUID parameter;
        ParameterRule rule;
    };

    ParameterInfo* FindParameter(const GUID& id);  // or null
    ParameterInfo* LastParameter();                // of the description; or null

    ParameterComponent component_;  // its one track, once it is prepared
    bool isNamed_ = false;
    Stage stage_ = Stage::kEmpty;
    std::vector<Dependency> dependencies_;
};

}  // namespace host
