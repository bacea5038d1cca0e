// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/parameters/model/NMAParametersVisitor.h"

#include "source/plugin/ResultChecks.h"

namespace NMA::XMLUtils {

NMAParametersVisitor::NMAParametersVisitor(INCFComponentFactory* factory) : factory_(factory) {}

NMAParametersVisitor::NMAParametersVisitor(INCFComponentFactory* factory,
                                           INCFParametersXML* handler)
    : factory_(factory) {
    Attach(handler);
}

NMAParametersVisitor::~NMAParametersVisitor() = default;

void NMAParametersVisitor::requireHandler() const {
    if (handler_.isNull()) {
        ThrowIfFailed(NMA_E_NOTINITIALIZED);
    }
}

std::unique_ptr<NMAParameterSuite> NMAParametersVisitor::load(GetText getText) const {
    auto suite = std::make_unique<NMAParameterSuite>(factory_.inArg());
    NCFSmartPtr<INCFString> text;
    ThrowIfFailed(NMAString::CreateString(text.outArg()));
    ThrowIfFailed((handler_.inArg()->*getText)(text.inArg()));
    suite->LoadFromString(NMAString(text.inArg(), kNCFUTF16));
    return suite;
}

NCFRESULT NMAParametersVisitor::Attach(INCFParametersXML* handler) {
    if (!handler) {
        ThrowIfFailed(NCF_E_INVALIDARG);
    }
    readSuite_.reset();
    handler_ = handler;
    readSuite_ = load(&INCFParametersXML::GetParameterDescriptionXML);
    return NCF_OK;
}

NMAParameterSuite* NMAParametersVisitor::GetSuite() const {
    if (!readSuite_) {
        ThrowIfFailed(NMA_E_NOTINITIALIZED);
    }
    return readSuite_.get();
}

NCFRESULT NMAParametersVisitor::BeginUpdate() {
    requireHandler();
    if (!writeSuite_) {
        writeSuite_ = load(&INCFParametersXML::GetParameterValuesXML);
    }
    return NCF_OK;
}

NCFRESULT NMAParametersVisitor::EndUpdate() {
    requireHandler();
    if (!writeSuite_) {
        return NMA_E_NOTINITIALIZED;
    }
    NMAString text;
    writeSuite_->SaveToString(text);
    ThrowIfFailed(handler_->SetParameterValuesXML(text.InArg()));
    writeSuite_.reset();
    return NCF_OK;
}

NCFRESULT NMAParametersVisitor::FindParameter(const GUID& component, ncfUInt32 track,
                                              const GUID& set, const GUID& parameter,
                                              NMAParameter& out) {
    if (!writeSuite_) {
        ThrowIfFailed(NMA_E_NOTINITIALIZED);
    }
    NMAParamComponent itsComponent;
    NMAParamTrack itsTrack;
    NMAParamSet itsSet;
    ThrowIfFailed(writeSuite_->GetComponent(component, itsComponent));
    ThrowIfFailed(itsComponent.GetTrack(track, itsTrack));
    ThrowIfFailed(itsTrack.GetParameterSet(set, itsSet));
    ThrowIfFailed(itsSet.GetParameter(parameter, out));
    return NCF_OK;
}

ncfBool NMAParametersVisitor::HasParameterSet(const GUID& component, ncfUInt32 track,
                                              const GUID& set) {
    BeginUpdate();
    if (!writeSuite_) {
        return 0;
    }
    NMAParamComponent itsComponent;
    NMAParamTrack itsTrack;
    NMAParamSet itsSet;
    const bool found = writeSuite_->GetComponent(component, itsComponent) >= 0 &&
                       itsComponent.GetTrack(track, itsTrack) >= 0 &&
                       itsTrack.GetParameterSet(set, itsSet) >= 0;
    return found ? 1 : 0;
}

NMAParameter NMAParametersVisitor::open(const GUID& component, ncfUInt32 track, const GUID& set,
                                        const GUID& parameter) {
    BeginUpdate();
    NMAParameter found;
    FindParameter(component, track, set, parameter, found);
    return found;
}

}  // namespace NMA::XMLUtils
