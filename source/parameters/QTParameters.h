// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/parameters/ParameterIds.h"
#include "host_interfaces/parameters/ParameterSuite.h"
#include "host_interfaces/parameters/ParametersReader.h"
#include "host_interfaces/parameters/ParametersXML.h"
#include "source/essence/MappingAttachment.h"
#include "source/essence/QuickTimeSampleMapping.h"

namespace NMA::Impl {

// Lets the user correct what a movie says of its fields, and choose whether its
// levels are expanded or compressed. The sample mapping makes one for each query and attaches it;
// the host owns it, and it keeps the mapping, and so the clip, alive.
//
// New values go straight into the clip's record. Documents are written and read
// by components of the host: this class fills a suite and hears events, and
// never sees XML itself.
//
// Sources by concern: the object and the interface (.cpp), ...Documents for what
// the suite is told, ...Events for what the reader tells.
class QTParameters final : public CNCFComponent<INCFParametersXML, IParametersHandler>,
                           public MappingAttachment {
public:
    explicit QTParameters(INCFUnknown* outer) : CNCFComponent(outer) {}

    NCFRESULT InitializeInstance(INCFUnknown* host) override;
    NCFRESULT InternalQueryInterface(const GUID& iid, void** ppvObj) override;

    // Takes the parameters of the mapping's clip, and what its file says as
    // their defaults. Until then all XML work is refused.
    NCFRESULT AttachToQTSampleProvider(QuickTimeSampleMapping& sampleProvider) override;

    // --- INCFParametersXML -------------------------------------------------------

    NCFRESULT GetParameterValuesXML(INCFString* xml) override;
    NCFRESULT GetParameterDescriptionXML(INCFString* xml) override;
    NCFRESULT GetDefaultValuesXML(INCFString* xml) override;
    NCFRESULT SetParameterValuesXML(INCFString* xml) override;
    NCFRESULT ParametersUnsupportedOperation(void*) override;
    NCFRESULT ResetParameters() override;

    // --- IParametersHandler ------------------------------------------------------

    NCFRESULT BeginDocument() override;
    NCFRESULT BeginComponent(const GUID& component) override;
    NCFRESULT EndComponent(ncfUInt32 isWhole) override;
    NCFRESULT BeginParamSet(const GUID& set, INCFString* name, float version,
                            ncfUInt32 state) override;
    NCFRESULT ParamValue(const GUID& parameter, IParameterValue* value) override;
    NCFRESULT EndDocument() override;

private:
    // What follows throws its failures; they end at the interface.

    void RequireClip(INCFString* xml) const;
    NCFSmartPtr<IParameterSuite> NewSuite();
    NCFSmartPtr<IParameterValue> NewValue();
    void WriteCurrentSet(IParameterSuite* suite);
    void WriteParamSet(IParameterSuite* suite, const GUID& setId, const char* name,
                       const ClipParams& values);
    void WriteParameterDescription(IParameterSuite* suite);

    NCFSmartPtr<INCFString> setName_;  // of the current set; a text of its own
    NCFSmartPtr<QuickTimeSampleMapping> sampleMapping_;
    NCFSmartPtr<INCFComponentFactory> componentFactory_;
    ClipParams* clipParams_ = nullptr;  // the clip's record, null before attaching
    // What "Default Settings" means for this clip.
    ClipParams defaultParams_ = {kProgressive, 16, 2, kFieldOrderUndetermined};
    GUID setId_{};
    bool inComponent_ = false;  // inside this module's part of a document
    bool inSet_ = false;        // inside a set whose values are for taking
};

}  // namespace NMA::Impl
