// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/framework/ComponentFactory.h"
#include "host_interfaces/quicktime/QuickTimeProperty.h"
#include "host_interfaces/quicktime/QuickTimeWrapper.h"
#include "source/plugin/NCFSmartPtr.h"

// The host's services for one movie. Each is made when something first needs it and lives
// as long as this object. Log lines name the clip, whose operations these are.
class MovieServices {
public:
    MovieServices(NCFSmartPtr<INCFString> fileName,
                  NCFSmartPtr<INCFComponentFactory> componentFactory)
        : fileName_(fileName), componentFactory_(componentFactory) {}

    // `out` gets a reference of its own.
    NCFRESULT GetQuickTimeInterface(NCFSmartPtr<QTWrapper::IQuickTimeWrapper>& out);
    NCFRESULT GetQuickTimeVideoReader(NCFSmartPtr<QTWrapper::IQTVideoReader>& out);
    NCFRESULT GetQuickTimeAudioReader(NCFSmartPtr<QTWrapper::IQTAudioReader>& out);
    NCFRESULT GetQuickTimePropertyComponent(NCFSmartPtr<QuickTime::IQuickTimeProperty>& out);

    // Null before it is made; there, too, when it could not open the movie.
    const NCFSmartPtr<QTWrapper::IQuickTimeWrapper>& Wrapper() const { return qtWrapper_; }

private:
    NCFSmartPtr<INCFString> fileName_;
    NCFSmartPtr<INCFComponentFactory> componentFactory_;
    NCFSmartPtr<QTWrapper::IQuickTimeWrapper> qtWrapper_;
    NCFSmartPtr<QTWrapper::IQTAudioReader> qtAPIAudioReader_;
    NCFSmartPtr<QTWrapper::IQTVideoReader> qtAPIVideoReader_;
    NCFSmartPtr<QuickTime::IQuickTimeProperty> qtProperty_;
};
