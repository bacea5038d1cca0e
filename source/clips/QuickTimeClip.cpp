// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Loading, and the questions about the whole movie and its tracks.

#include "source/clips/QuickTimeClip.h"

#include "source/clips/NativeCodecs.h"
#include "source/plugin/PluginLogSink.h"
#include "source/plugin/ResultChecks.h"

namespace {

// The host family's own codecs have codes of the form "NV..".
constexpr ncfUInt32 kNivoPrefix = 0x4E56;

// Whether a number, rounded by adding a half and cutting, comes out as `whole`.
bool RoundsTo(double value, int whole) {
    const double raised = value + 0.5;
    return whole == 0 ? raised > -1.0 && raised < 1.0 : raised >= whole && raised < whole + 1.0;
}

}  // namespace

QuickTimeClip::QuickTimeClip(NCFSmartPtr<INCFString> fileName, NCFSmartPtr<INCFConsole> console,
                             NCFSmartPtr<INCFComponentFactory> componentFactory)
    : BaseClip(fileName, console, componentFactory) {
    LoadClipImpl();
}

QuickTimeClip::~QuickTimeClip() = default;

NCFRESULT QuickTimeClip::LoadClipImpl() {
    NCF_FUNCTION("QuickTimeClip::LoadClipImpl");
    CHK_PTR(console_);
    CHK_PTR(componentFactory_);
    CHK_PTR(fileName_.inArg());
    if (loaded_ == 1) {
        return NCF_OK;
    }
    NCF_RETURN_TEXT(
        "componentFactory_->CreateComponent(NCFCompID_QTParser, NULL, IID_IQTParser, (void "
        "**)&qtParser_)",
        ncfCreate(componentFactory_.inArg(), NCFCompID_QTParser, IID_IQTParser, qtParser_));
    NCF_RETURN(ParseMediaHeaders());

    ncfUInt32 videoTrackCount = 0;
    NCF_RETURN(GetVideoTrackCount(&videoTrackCount));
    if (videoTrackCount == 0) {
        ncfUInt32 audioTrackCount = 0;
        NCF_RETURN(GetAudioTrackCount(&audioTrackCount));
        if (audioTrackCount != 0) {
            loaded_ = 1;  // nothing of the picture is ever asked
            return NCF_OK;
        }
        slog::Warning(ncfFunction) << "Initialization failed: No one audio/video tracks";
        console_->Write(1, "Movie doesn't contain any video/audio tracks!\n");
        return NMA_E_NODATA;
    }

    NCFSmartPtr<IVideoTrackInfo> vti = GetFirstVideoTrackInfo();
    CHK_PTR(vti.inArg());
    NCFSmartPtr<IVideoSampleDescription> vdscr;
    NCF_RETURN(vti->GetVideoSampleDescription(0, vdscr.outArg()));
    NCF_RETURN_TEXT("vdscr->HasAlpha(&hasAlpha_)", vdscr->HasAlpha(&picture_.hasAlpha));
    const NCFRESULT confirmed = ConfirmNivoAlpha(vdscr.inArg());
    if (confirmed < 0) {
        return confirmed;
    }
    if (picture_.hasAlpha) {
        slog::Progress(ncfFunction) << "Movie has alpha!";
    }
    FindRotation(vti.inArg());
    NCF_RETURN(BaseClip::LoadClipBase());
    return NCF_OK;
}

// Depth alone says little about the host family's own codecs: only a coding
// that the description lists proves their alpha.
NCFRESULT QuickTimeClip::ConfirmNivoAlpha(IVideoSampleDescription* vdscr) {
    NCF_FUNCTION("QuickTimeClip::LoadClipImpl");
    ncfUInt32 dataFormatOut = 0;
    NCF_RETURN(vdscr->GetDataFormat(&dataFormatOut));
    if (dataFormatOut >> 16 != kNivoPrefix) {
        return NCF_OK;
    }
    ncfUInt32 count = 0;
    ncfUInt32 alphaCoding = 0;
    if (vdscr->GetNivoAlphaCodingCount(&count) < 0) {
        count = 0;
    }
    for (ncfUInt32 i = 0; i < count && alphaCoding == 0; ++i) {
        NCF_RETURN(vdscr->GetNivoAlphaCoding(i, &alphaCoding));
    }
    if (alphaCoding == 0) {
        picture_.hasAlpha = 0;
    }
    return NCF_OK;
}

void QuickTimeClip::FindRotation(IVideoTrackInfo* vti) {
    float matrix[9] = {};
    vti->GetTrackMatrix(matrix);
    if (RoundsTo(matrix[0], 0) && RoundsTo(matrix[1], 1)) {
        picture_.isRotated = 1;
    }
}

// --- the movie ---------------------------------------------------------------------

NCFRESULT QuickTimeClip::GetCreationTime(ncfUInt64* creationTime) {
    NCF_FUNCTION("QuickTimeClip::GetCreationTime");
    CHK_PTR(creationTime);
    NCF_RETURN(qtParser_->GetCreationTime(creationTime));
    return NCF_OK;
}

NCFRESULT QuickTimeClip::IsSelfContained() {
    NCF_FUNCTION("QuickTimeClip::IsSelfContained");
    ncfBool selfContained = 0;
    NCF_RETURN(qtParser_->IsMovieSelfContained(&selfContained));
    return selfContained;
}

NCFRESULT QuickTimeClip::HasOneFrame(ncfBool* isOneFrame) {
    NCF_FUNCTION("QuickTimeClip::HasOneFrame");
    CHK_PTR(isOneFrame);
    NCFSmartPtr<IVideoTrackInfo> vti = GetFirstVideoTrackInfo();
    CHK_PTR(vti.inArg());
    NCFSmartPtr<IQTSampleTable> stbl;
    ncfUInt64 numSamples = 0;
    NCF_RETURN(vti->GetSampleTable(stbl.outArg()));
    NCF_RETURN(stbl->GetNumSamples(&numSamples));
    *isOneFrame = numSamples <= 1;
    return NCF_OK;
}

NCFRESULT QuickTimeClip::IsMultiFormatMovie(ncfBool* isMultiformat) {
    NCF_FUNCTION("QuickTimeClip::IsMultiFormatMovie");
    CHK_PTR(isMultiformat);
    NCFSmartPtr<IVideoTrackInfo> vti = GetFirstVideoTrackInfo();
    CHK_PTR(vti.inArg());
    ncfUInt32 count = 0;
    NCF_RETURN(vti->GetSampleDescriptionCount(&count));
    if (count == 0) {
        return NCF_E_NOTFOUND;
    }
    *isMultiformat = count >= 2;
    return NCF_OK;
}

NCFRESULT QuickTimeClip::GetCodecName(ncfUInt32 codecType, NCFSmartPtr<INCFString>& codecName) {
    NCF_FUNCTION("QuickTimeClip::GetCodecName");
    NCF_RETURN_TEXT(
        "(componentFactory_.inArg())->CreateComponent(NCFCompID_NCFString, 0, "
        "IID_PPV_ARG(INCFString, &codecName))",
        ncfCreate(componentFactory_.inArg(), NCFCompID_NCFString, IID_INCFString, codecName));
    if (IsNativeQuickTimeCodec(codecType)) {
        NCF_RETURN(GetNativeQuickTimeCodecName(codecType, codecName));
        return NCF_OK;
    }
    NCFSmartPtr<QuickTime::IQuickTimeProperty> quickTimeProperty;
    NCF_RETURN(GetQuickTimePropertyComponent(quickTimeProperty));
    NCF_RETURN_TEXT("quickTimeProperty->GetCodecName(codecType, codecName)",
                    quickTimeProperty->GetCodecName(codecType, codecName.inArg()));
    return NCF_OK;
}

// --- numbers of tracks -----------------------------------------------------------------

NCFRESULT QuickTimeClip::GetTrackCount(ncfUInt32* trackCount) {
    NCF_FUNCTION("QuickTimeClip::GetTrackCount");
    if (tracks_.empty()) {
        return NCF_E_NOTFOUND;
    }
    CHK_PTR(trackCount);
    *trackCount = static_cast<ncfUInt32>(tracks_.size());
    return NCF_OK;
}

NCFRESULT QuickTimeClip::GetTimeCodeTrackCountImpl(ncfUInt32* trackCount) {
    NCF_FUNCTION("QuickTimeClip::GetTimeCodeTrackCountImpl");
    CHK_PTR(trackCount);
    return qtParser_->GetTimeCodeTrackCount(trackCount);
}

NCFRESULT QuickTimeClip::GetVideoTrackCountImpl(ncfUInt32* trackCount) {
    NCF_FUNCTION("QuickTimeClip::GetVideoTrackCountImpl");
    CHK_PTR(trackCount);
    return qtParser_->GetVideoTrackCount(trackCount);
}

NCFRESULT QuickTimeClip::GetAudioTrackCountImpl(ncfUInt32* trackCount) {
    NCF_FUNCTION("QuickTimeClip::GetAudioTrackCountImpl");
    CHK_PTR(trackCount);
    return qtParser_->GetAudioTrackCount(trackCount);
}
