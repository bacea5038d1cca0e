// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Loading, and the questions about the whole movie.

#include "source/clips/OtherClip.h"

#include "host_interfaces/util/NMAString.h"
#include "source/clips/NativeCodecs.h"
#include "source/plugin/PluginLogSink.h"
#include "source/plugin/ResultChecks.h"

OtherClip::OtherClip(NCFSmartPtr<INCFString> fileName, NCFSmartPtr<INCFConsole> console,
                     NCFSmartPtr<INCFComponentFactory> componentFactory)
    : BaseClip(fileName, console, componentFactory) {
    LoadClipImpl();
}

OtherClip::~OtherClip() = default;

NCFRESULT OtherClip::LoadClipImpl() {
    NCF_FUNCTION("OtherClip::LoadClipImpl");
    CHK_PTR(console_);
    CHK_PTR(fileName_);
    NCFSmartPtr<QTWrapper::IQuickTimeWrapper> qtWrapper;
    NCF_RETURN(GetQuickTimeInterface(qtWrapper));
    NCF_RETURN(qtWrapper->GetSampleTable(sampleTable_.outArg()));

    ncfUInt32 track = 0;
    if (!qtWrapper->GetFirstVideoTrack(&track)) {
        if (qtWrapper->MovieHasAudio()) {
            loaded_ = 1;  // nothing of the picture is ever asked
            return NCF_OK;
        }
        console_->Write(1, "Movie doesn't contain any video/audio tracks!\n");
        return NMA_E_NODATA;
    }

    // Some containers don't tell of an alpha channel that the codec delivers.
    ncfBool has_alpha_import = 0;
    ncfBool has_alpha_nma = 0;
    NCF_RETURN(qtWrapper->MovieContainsAlpha(QTWrapper::kAlphaCheckForImport, &has_alpha_import));
    NCF_RETURN(qtWrapper->MovieContainsAlpha(QTWrapper::kAlphaCheckForQTNMA, &has_alpha_nma));
    picture_.hasAlpha = has_alpha_import || has_alpha_nma;
    if (picture_.hasAlpha) {
        slog::Progress(ncfFunction) << "Movie has alpha!";
    }
    NCF_RETURN(BaseClip::LoadClipBase());
    return NCF_OK;
}

// --- the movie ---------------------------------------------------------------------

NCFRESULT OtherClip::GetCreationTime(ncfUInt64* creationTime) {
    NCF_FUNCTION("OtherClip::GetCreationTime");
    CHK_PTR(creationTime);
    CHK_PTR(qtWrapper_);
    *creationTime = qtWrapper_->GetMovieCreationTime();
    return NCF_OK;
}

NCFRESULT OtherClip::IsSelfContained() {
    NCF_FUNCTION("OtherClip::IsSelfContained");
    CHK_PTR(qtWrapper_);
    return (qtWrapper_->MovieIsSelfContained(0, 0, 0) & 0xFF) != 0;
}

NCFRESULT OtherClip::HasOneFrame(ncfBool* isOneFrame) {
    NCF_FUNCTION("OtherClip::HasOneFrame");
    CHK_PTR(isOneFrame);
    CHK_PTR(qtWrapper_);
    *isOneFrame = qtWrapper_->MovieHasOneFrame();
    return NCF_OK;
}

NCFRESULT OtherClip::IsMultiFormatMovie(ncfBool* isMultiformat) {
    NCF_FUNCTION("OtherClip::IsMultiFormatMovie");
    CHK_PTR(isMultiformat);
    ncfUInt32 qtTrack = 0;
    NCF_RETURN(GetVideoTrackQTId(0, qtTrack));
    *isMultiformat = qtWrapper_->GetImageDescriptionCount(qtTrack) >= 2;
    return NCF_OK;
}

NCFRESULT OtherClip::GetCodecName(ncfUInt32 codecType, NCFSmartPtr<INCFString>& codecName) {
    NCF_FUNCTION("OtherClip::GetCodecName");
    ncfUInt32 track = 0;
    NCF_RETURN(GetFirstVideoTrack(track));
    NCF_RETURN_TEXT(
        "(componentFactory_.inArg())->CreateComponent(NCFCompID_NCFString, 0, "
        "IID_PPV_ARG(INCFString, &codecName))",
        ncfCreate(componentFactory_.inArg(), NCFCompID_NCFString, IID_INCFString, codecName));
    if (IsNativeQuickTimeCodec(codecType)) {
        NCF_RETURN(GetNativeQuickTimeCodecName(codecType, codecName));
        return NCF_OK;
    }
    NCF_RETURN_TEXT("qtWrapper_->GetCodecTypeName( track, codecName)",
                    qtWrapper_->GetCodecTypeName(track, codecName.inArg()));
    if (codecName->IsEmpty()) {
        return NMA_E_NOTINITIALIZED;
    }
    const NMAString name(codecName.inArg(), kNCFUTF8);
    slog::Progress(ncfFunction) << "codecTypeName: " << name.GetUTF8String();
    return NCF_OK;
}
