// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// The object: creation, the clip it belongs to, and the interface that the host
// calls.

#include "source/parameters/QTParameters.h"

#include "host_interfaces/media/PluginComponents.h"
#include "source/parameters/QTParameterNames.h"
#include "source/plugin/ResultChecks.h"
#include "source/plugin/ResultOf.h"

namespace NMA::Impl {

NCFRESULT QTParameters::InitializeInstance(INCFUnknown* host) {
    return ResultOf([&] {
        if (!host) {
            ThrowIfFailed(NCF_E_POINTER);
        }
        ThrowIfFailed(ncfQuery(host, IID_INCFComponentFactory, componentFactory_));
        ThrowIfFailed(
            ncfCreate(componentFactory_.inArg(), NCFCompID_NCFString, IID_INCFString, setName_));
        return NCF_OK;
    });
}

NCFRESULT QTParameters::InternalQueryInterface(const GUID& iid, void** ppvObj) {
    return QueryListedInterfaces<INCFParametersXML, IParametersHandler>(this, iid, ppvObj);
}

NCFRESULT QTParameters::AttachToQTSampleProvider(QuickTimeSampleMapping& sampleProvider) {
    NCF_FUNCTION("NMA::Impl::QTParameters::AttachToQTSampleProvider");
    // The record of a former clip may go with its mapping.
    clipParams_ = nullptr;
    sampleMapping_ = &sampleProvider;
    NCFASSERT(sampleProvider.GetMediaClip());
    clipParams_ = sampleProvider.GetMediaClip()->GetClipParams();
    setId_ = kParamSetDefault;
    defaultParams_.levelRemap = Default_Levels;
    defaultParams_.fieldOrderInFile = clipParams_->detectedFieldOrder;
    defaultParams_.fieldLayout = 1;
    return NCF_OK;
}

// --- documents for the host ------------------------------------------------------------

void QTParameters::RequireClip(INCFString* xml) const {
    if (!xml) {
        ThrowIfFailed(NCF_E_INVALIDARG);
    }
    if (!clipParams_) {
        ThrowIfFailed(NMA_E_NOTINITIALIZED);
    }
}

NCFRESULT QTParameters::GetParameterValuesXML(INCFString* xml) {
    return ResultOf([&] {
        RequireClip(xml);
        if (setId_ == GUID{}) {
            ThrowIfFailed(NMA_E_NOTINITIALIZED);
        }
        const NCFSmartPtr<IParameterSuite> suite = NewSuite();
        WriteCurrentSet(suite.inArg());
        ThrowIfFailed(suite->WriteXML(xml));
        return NCF_OK;
    });
}

NCFRESULT QTParameters::GetParameterDescriptionXML(INCFString* xml) {
    return ResultOf([&] {
        RequireClip(xml);
        const NCFSmartPtr<IParameterSuite> suite = NewSuite();
        WriteParameterDescription(suite.inArg());
        WriteCurrentSet(suite.inArg());
        ThrowIfFailed(suite->WriteXML(xml));
        return NCF_OK;
    });
}

NCFRESULT QTParameters::GetDefaultValuesXML(INCFString* xml) {
    return ResultOf([&] {
        RequireClip(xml);
        const NCFSmartPtr<IParameterSuite> suite = NewSuite();
        WriteParamSet(suite.inArg(), kParamSetDefault, kDefaultSetName, defaultParams_);
        ThrowIfFailed(suite->WriteXML(xml));
        return NCF_OK;
    });
}

// --- changes by the user ---------------------------------------------------------------

NCFRESULT QTParameters::SetParameterValuesXML(INCFString* xml) {
    return ResultOf([&] {
        RequireClip(xml);
        NCFSmartPtr<IParametersReader> reader;
        ThrowIfFailed(ncfCreate(componentFactory_.inArg(), CompID_ParametersReader,
                                IID_ParametersReader, reader));
        void* handler = nullptr;
        ThrowIfFailed(InternalQueryInterface(IID_IParametersHandler, &handler));
        NCFSmartPtr<IParametersHandler> events;
        events.attach(static_cast<IParametersHandler*>(handler));
        ThrowIfFailed(reader->SetHandler(events.inArg()));
        // The events below come during this call.
        ThrowIfFailed(reader->Parse(xml));
        // The values are taken whether or not formats could be found for them.
        (void)sampleMapping_->RefreshBasedOnUIParams();
        return NCF_OK;
    });
}

NCFRESULT QTParameters::ParametersUnsupportedOperation(void*) {
    return NCF_E_NOTIMPL;
}

// The whole record is copied, so the clip forgets which order was detected until
// its fields are worked out again. Neither the set's identifier nor the mapping
// is touched: hosts hand values over next, and the mapping follows those.
NCFRESULT QTParameters::ResetParameters() {
    return ResultOf([&] {
        if (!clipParams_) {
            ThrowIfFailed(NMA_E_NOTINITIALIZED);
        }
        *clipParams_ = defaultParams_;
        ThrowIfFailed(setName_->AssignUTF8(kNCFUTF8, kDefaultSetName, kNCFZeroTerminated));
        return NCF_OK;
    });
}

}  // namespace NMA::Impl
