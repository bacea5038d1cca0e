// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/clips/MovieServices.h"

#include "source/plugin/ResultChecks.h"

// A wrapper whose movie failed to open is kept: the movie is not tried again,
// and the wrapper answers every question with a failure.
NCFRESULT MovieServices::GetQuickTimeInterface(NCFSmartPtr<QTWrapper::IQuickTimeWrapper>& out) {
    NCF_FUNCTION("BaseClip::GetQuickTimeInterface");
    if (qtWrapper_.isNull()) {
        NCF_RETURN_TEXT(
            "componentFactory_->CreateComponent(QTWrapper::CompID_QuickTimeWrapper, NULL, "
            "QTWrapper::IID_IQuickTimeWrapper, (void **)&qtWrapper_)",
            ncfCreate(componentFactory_.inArg(), QTWrapper::CompID_QuickTimeWrapper,
                      QTWrapper::IID_IQuickTimeWrapper, qtWrapper_));
        NCF_RETURN_TEXT("qtWrapper_->NewMovieFromFilePath(fileName_)",
                        qtWrapper_->NewMovieFromFilePath(fileName_.inArg()));
    }
    out = qtWrapper_;
    return NCF_OK;
}

NCFRESULT MovieServices::GetQuickTimeVideoReader(NCFSmartPtr<QTWrapper::IQTVideoReader>& out) {
    NCF_FUNCTION("BaseClip::GetQuickTimeVideoReader");
    NCFSmartPtr<QTWrapper::IQuickTimeWrapper> qtWrapper;
    NCF_RETURN(GetQuickTimeInterface(qtWrapper));
    if (qtAPIVideoReader_.isNull()) {
        NCF_RETURN_TEXT("qtWrapper->GetQTVideoReader(qtAPIVideoReader_)",
                        qtWrapper->GetQTVideoReader(qtAPIVideoReader_.outArg()));
    }
    out = qtAPIVideoReader_;
    return NCF_OK;
}

NCFRESULT MovieServices::GetQuickTimeAudioReader(NCFSmartPtr<QTWrapper::IQTAudioReader>& out) {
    NCF_FUNCTION("BaseClip::GetQuickTimeAudioReader");
    NCFSmartPtr<QTWrapper::IQuickTimeWrapper> qtWrapper;
    NCF_RETURN(GetQuickTimeInterface(qtWrapper));
    if (qtAPIAudioReader_.isNull()) {
        NCF_RETURN_TEXT("qtWrapper->GetQTAudioReader(qtAPIAudioReader_)",
                        qtWrapper->GetQTAudioReader(qtAPIAudioReader_.outArg()));
    }
    out = qtAPIAudioReader_;
    return NCF_OK;
}

NCFRESULT MovieServices::GetQuickTimePropertyComponent(
    NCFSmartPtr<QuickTime::IQuickTimeProperty>& out) {
    NCF_FUNCTION("BaseClip::GetQuickTimePropertyComponent");
    if (qtProperty_.isNull()) {
        NCF_RETURN_TEXT(
            "(componentFactory_.inArg())->CreateComponent(QuickTime::CompID_QuickTimeProperty, "
            "NULL, QuickTime::IID_IQuickTimeProperty, (void**)&qtProperty_)",
            ncfCreate(componentFactory_.inArg(), QuickTime::CompID_QuickTimeProperty,
                      QuickTime::IID_IQuickTimeProperty, qtProperty_));
    }
    out = qtProperty_;
    return NCF_OK;
}
