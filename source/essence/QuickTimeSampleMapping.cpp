// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// The object: creation, the queries with what each prepares, and the
// operations that start and stop the picture reader.

#include "source/essence/QuickTimeSampleMapping.h"

#include "host_interfaces/media/PluginComponents.h"
#include "host_interfaces/parameters/ParametersXML.h"
#include "source/clips/LoadMedia.h"
#include "source/essence/MappingAttachment.h"
#include "source/essence/ProviderLock.h"
#include "source/plugin/ResultChecks.h"
#include "source/plugin/ResultOf.h"

namespace NMA::Impl {

NCFRESULT QuickTimeSampleMapping::InitializeInstance(INCFUnknown* host) {
    return ResultOf([&] {
        if (!host) {
            ThrowIfFailed(NCF_E_POINTER);
        }
        ThrowIfFailed(ncfQuery(host, IID_INCFComponentFactory, _pComponentFactory));
        ThrowIfFailed(ncfCreate(_pComponentFactory.inArg(), CompID_LockComponent, IID_LockComponent,
                                providerLock_));
        ThrowIfFailed(ncfQuery(host, IID_INCFConsole, _pConsole));
        return NCF_OK;
    });
}

// --- queries -----------------------------------------------------------------------

// For both providers the reference is handed out before the preparation: when
// that fails, the caller gets the failure and owns a reference all the same.
NCFRESULT QuickTimeSampleMapping::InternalQueryInterface(const GUID& iid, void** ppvObj) {
    NCF_FUNCTION("NMA::Impl::QuickTimeSampleMapping::InternalQueryInterface");
    if (!ppvObj) {
        return NCF_E_INVALIDARG;
    }
    return ResultOf([&]() -> NCFRESULT {
        if (ncf_detail::AnswerInterface<ISampleMapping>(this, iid, ppvObj) ||
            ncf_detail::AnswerInterface<ISampleProvider>(this, iid, ppvObj)) {
            return NCF_OK;
        }
        if (ncf_detail::AnswerInterface<IUncompressedImageProvider>(this, iid, ppvObj)) {
            return PrepareImageProvider();
        }
        if (ncf_detail::AnswerInterface<IUncompressedAudioProvider>(this, iid, ppvObj)) {
            return PrepareAudioProvider();
        }
        if (iid == IID_INCFParametersXML) {
            return QueryParametersXML(ppvObj);
        }
        return CNCFUnknown::InternalQueryInterface(iid, ppvObj);
    });
}

NCFRESULT QuickTimeSampleMapping::PrepareImageProvider() {
    NCF_FUNCTION("NMA::Impl::QuickTimeSampleMapping::InternalQueryInterface");
    if (imageFormatsReady_) {
        return NCF_OK;
    }
    const ProviderLock lock(providerLock_);
    if (!media_) {
        NCF_RETURN(LoadMedia(_filePath, _pConsole, _pComponentFactory, media_));
    }
    NCF_RETURN(AddSupportedImageFormatsBasedOnCodec());
    return NCF_OK;
}

NCFRESULT QuickTimeSampleMapping::PrepareAudioProvider() {
    NCF_FUNCTION("NMA::Impl::QuickTimeSampleMapping::InternalQueryInterface");
    if (_audioReaderHolder) {
        return NCF_OK;
    }
    if (!media_) {
        NCF_RETURN(LoadMedia(_filePath, _pConsole, _pComponentFactory, media_));
    }
    NCF_RETURN(media_->GetQuickTimeAudioReader(_audioReaderHolder));
    return NCF_OK;
}

// The answer is another object each time: new parameters that belong to this
// mapping and keep it alive. Nothing is handed out on failure.
NCFRESULT QuickTimeSampleMapping::QueryParametersXML(void** ppvObj) {
    NCF_FUNCTION("NMA::Impl::QuickTimeSampleMapping::InternalQueryInterface");
    *ppvObj = nullptr;
    if (!media_) {
        NCF_RETURN(LoadMedia(_filePath, _pConsole, _pComponentFactory, media_));
    }
    NCFSmartPtr<INCFParametersXML> created;
    NCF_RETURN_TEXT(
        "_pComponentFactory->CreateComponent(CompID_QTParameters, NULL, IID_INCFParametersXML, "
        "ppvObj)",
        ncfCreate(_pComponentFactory.inArg(), CompID_QTParameters, IID_INCFParametersXML, created));
    // Only the module's own parameters can be attached.
    auto* const pParams = dynamic_cast<MappingAttachment*>(created.inArg());
    if (!pParams) {
        return NCF_E_UNEXPECTED;
    }
    NCF_RETURN(pParams->AttachToQTSampleProvider(*this));
    *ppvObj = created.detach();
    return NCF_OK;
}

// --- what the container and the parameters call ---------------------------------------

NCFRESULT QuickTimeSampleMapping::SetFilePath(NCFSmartPtr<INCFString> path) {
    NCF_FUNCTION("NMA::Impl::QuickTimeSampleMapping::SetFilePath");
    _filePath = path;
    NCF_RETURN(_filePath->ConvertTo(kNCFUTF16));
    return NCF_OK;
}

NCFRESULT QuickTimeSampleMapping::SetMediaContainer(std::tr1::shared_ptr<BaseClip> media) {
    NCF_FUNCTION("NMA::Impl::QuickTimeSampleMapping::SetMediaContainer");
    CHK_INARG(media);
    media_ = media;
    (void)InitializeMediaTracks(media);
    return NCF_OK;
}

NCFRESULT QuickTimeSampleMapping::RefreshBasedOnUIParams() {
    NCF_FUNCTION("NMA::Impl::QuickTimeSampleMapping::RefreshBasedOnUIParams");
    const ProviderLock lock(providerLock_);
    if (!media_) {
        return NMA_E_NOTINITIALIZED;
    }
    // The fields matter even where no format came of the change.
    if (imageFormatsReady_) {
        (void)AddDecompressorPixelFormats(FirstTrackOf(MediaTrack::kVideo), FirstAlphaTrackShown());
    } else {
        (void)AddSupportedImageFormatsBasedOnCodec();
    }
    NCF_RETURN(media_->SetFieldLayoutDetails());
    return NCF_OK;
}

// --- starting and stopping --------------------------------------------------------------

NCFRESULT QuickTimeSampleMapping::SetupOrCleanup(ncfUInt32 trackNMA, bool setup) {
    NCF_FUNCTION("NMA::Impl::QuickTimeSampleMapping::SetupOrCleanup");
    std::tr1::shared_ptr<MediaTrack> track;
    NCF_RETURN(GetMediaTrack(trackNMA, track));
    if (!IsPictureTrack(*track) || !_videoReaderHolder) {
        return NCF_OK;
    }
    if (setup) {
        if (!media_) {
            NCF_RETURN(LoadMedia(_filePath, _pConsole, _pComponentFactory, media_));
        }
        NCF_RETURN(_videoReaderHolder->InitQT(QTWrapper::kUseDecompressionSession));
    } else {
        NCF_RETURN(_videoReaderHolder->ReleaseQT());
    }
    return NCF_OK;
}

NCFRESULT QuickTimeSampleMapping::Setup(ncfUInt32 trackNMA) {
    return ResultOf([&] { return SetupOrCleanup(trackNMA, true); });
}

NCFRESULT QuickTimeSampleMapping::Cleanup(ncfUInt32 trackNMA) {
    return ResultOf([&] { return SetupOrCleanup(trackNMA, false); });
}

}  // namespace NMA::Impl
