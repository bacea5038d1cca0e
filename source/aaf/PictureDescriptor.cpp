// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// The steps that both roads share: making the object and its common values.

#include "source/aaf/PictureDescriptor.h"

#include "host_interfaces/aaf/AAFClassIds.h"
#include "host_interfaces/aaf/AAFDefinitions.h"
#include "source/aaf/AAFDefs.h"
#include "source/aaf/BinColumns.h"
#include "source/aaf/ColorLabels.h"
#include "source/aaf/EditUnits.h"
#include "source/aaf/ExtendedProperties.h"
#include "source/aaf/VideoDescriptor.h"
#include "source/clips/SampleProviderPolicy.h"
#include "source/descriptor_data/QuickTimeToAAFInfoRetriever.h"
#include "source/plugin/ResultChecks.h"

namespace NMA::Impl {
namespace {

NCF_FUNCTION("NMA::Impl::AddVideoDescriptor");

bool IsMPEG() {
    return QuickTimeToAAFInfoRetriever::GetInstance()->IsMPEGDescriptor();
}

bool IsRGBA() {
    return QuickTimeToAAFInfoRetriever::GetInstance()->IsRGBADescriptor();
}

bool IsGiven(ncfSInt32 level) {
    return level != -1;
}

}  // namespace

NCFRESULT PictureDescriptor::ChooseRoad() {
    const NCFRESULT native = MovieRequiresSampleProviderForVideo(pConsole, media, &aafInfo);
    if (native != 0 && native != 1) {
        return native;
    }
    directAccess = native == 1;
    // Without a record the label has its default, which is then registered.
    containerFormatUID = aafInfo.essenceContainerLabel;
    return NCF_OK;
}

// These texts are part of the log's format; where the code differs, _TEXT carries them.
// clang-format off

NCFRESULT PictureDescriptor::Create() {
    if (directAccess && IsMPEG()) {
        const NCFRESULT created = CreateMPEG();
        if (created < 0) {
            return created;
        }
    } else if (directAccess && IsRGBA()) {
        AAFDefs defs(pDictionary);
        NCF_RETURN(defs.cdRGBADescriptor()->CreateInstance(IID_IAAFRGBADescriptor2, (IUnknown **)&pRGBADescriptor));
    } else {
        NCF_RETURN(pDictionary->CreateInstance(AUID_AAFCDCIDescriptor, IID_IAAFCDCIDescriptor, (IUnknown**)&pCDCIDescriptor));
    }
    if (!IsRGBA()) {
        NCF_RETURN(pCDCIDescriptor->Initialize());
    }
    return NCF_OK;
}

NCFRESULT PictureDescriptor::CreateMPEG() {
    AAFDefs defs(pDictionary);
    NCF_RETURN(defs.cdMPEGVideoDescriptor()->CreateInstance(IID_IAAFMPEGVideoDescriptor, (IUnknown **)&pMPEGDescriptor));
    NCF_RETURN(pMPEGDescriptor->Initialize());
    NCF_RETURN(pMPEGDescriptor->SetMaxGOP((aafUInt16)aafInfo.maxGOP));
    NCF_RETURN(pMPEGDescriptor->SetBitRate(aafInfo.bitRate));
    NCF_RETURN(pMPEGDescriptor->SetProfileAndLevel(aafInfo.levelAndProfile));
    NCF_RETURN(pMPEGDescriptor->QueryInterface(IID_IAAFCDCIDescriptor, (void**)&pCDCIDescriptor));
    return NCF_OK;
}

NCFRESULT PictureDescriptor::QueryViews() {
    if (IsRGBA()) {
        NCF_RETURN(pRGBADescriptor->QueryInterface(IID_IAAFDigitalImageDescriptor, (void **)&pDigitalImageDescriptor));
        NCF_RETURN(pRGBADescriptor->QueryInterface(IID_IAAFFileDescriptor, (void **)&pFileDescriptor));
        NCF_RETURN(pRGBADescriptor->QueryInterface(IID_IAAFDigitalImageDescriptor2, (void **)&pDigitalImageDescriptor2));
    } else {
        NCF_RETURN(pCDCIDescriptor->QueryInterface(IID_IAAFDigitalImageDescriptor, (void **)&pDigitalImageDescriptor));
        NCF_RETURN(pCDCIDescriptor->QueryInterface(IID_IAAFFileDescriptor, (void **)&pFileDescriptor));
        NCF_RETURN(pCDCIDescriptor->QueryInterface(IID_IAAFDigitalImageDescriptor2, (void **)&pDigitalImageDescriptor2));
    }
    return NCF_OK;
}

NCFRESULT PictureDescriptor::SetColorLabels() {
    NCF_RETURN(media->GetColorDetails(&colorDetails));
    if (colorDetails.hasVendorMetadata) {
        pConsole->Write(4, "Supported vendor found. Filling vendor-specific metadata into AAF\n");
        SetVendorColorLabel(colorDetails, pDigitalImageDescriptor2, pConsole);
    } else {
        SetCodedColorLabels(colorDetails, pDigitalImageDescriptor2, pConsole);
    }
    return NCF_OK;
}

// The clip's own levels win when it gives both.
NCFRESULT PictureDescriptor::SetReferenceLevels() {
    const bool fromClip = IsGiven(colorDetails.refBlack) && IsGiven(colorDetails.refWhite);
    if (IsRGBA()) {
        if (fromClip) {
            NCF_RETURN(pRGBADescriptor->SetComponentMinRef( colorDetails.refBlack ));
            NCF_RETURN(pRGBADescriptor->SetComponentMaxRef( colorDetails.refWhite ));
        } else {
            NCF_RETURN(pRGBADescriptor->SetComponentMinRef( aafInfo.blackRefLevel ));
            NCF_RETURN(pRGBADescriptor->SetComponentMaxRef( aafInfo.whiteRefLevel ));
        }
    } else if (fromClip) {
        NCF_RETURN(pCDCIDescriptor->SetBlackReferenceLevel( colorDetails.refBlack ));
        NCF_RETURN(pCDCIDescriptor->SetWhiteReferenceLevel( colorDetails.refWhite ));
    } else {
        NCF_RETURN(pCDCIDescriptor->SetBlackReferenceLevel( aafInfo.blackRefLevel ));
        NCF_RETURN(pCDCIDescriptor->SetWhiteReferenceLevel( aafInfo.whiteRefLevel ));
    }
    return NCF_OK;
}

NCFRESULT PictureDescriptor::SetCoding() {
    const aafCharacter vff[] = L"Video File Format";
    const aafCharacter QTVff[] = L"MOV";
    NCF_RETURN(AddBinColumnEntry(pMobMasterMob, pConsole, &vff[0], &QTVff[0]));
    NCF_RETURN(pDigitalImageDescriptor->SetCompression(aafInfo.pictureEssenceCoding));
    return NCF_OK;
}

// A container label that the dictionary does not know gets a definition
// without name.
NCFRESULT PictureDescriptor::SetContainer() {
    IAAFSmartPointer<IAAFContainerDef> pContainerDef;
    if (pDictionary->LookupContainerDef(containerFormatUID, &pContainerDef) != 0) {
        NCF_RETURN(pDictionary->CreateInstance(AUID_AAFContainerDef, IID_IAAFContainerDef, (IUnknown**)&pContainerDef));
        NCF_RETURN(pContainerDef->Initialize(containerFormatUID, (const aafCharacter*)L"", (const aafCharacter*)L""));
        NCF_RETURN(pDictionary->RegisterContainerDef(pContainerDef));
    }
    NCF_RETURN(pFileDescriptor->SetContainerFormat(pContainerDef));
    return NCF_OK;
}

NCFRESULT PictureDescriptor::SetViews() {
    NCF_RETURN(pDigitalImageDescriptor->SetFrameLayout(aafInfo.frameLayout));
    NCF_RETURN(pDigitalImageDescriptor->SetStoredView(aafInfo.storedHeight, aafInfo.storedWidth));
    NCF_RETURN(pDigitalImageDescriptor->SetSampledView(aafInfo.storedHeight, aafInfo.sampledWidth, 0, 0));
    NCFASSERT(aafInfo.displayHeight && aafInfo.displayWidth);
    NCF_RETURN(pDigitalImageDescriptor->SetDisplayView(aafInfo.displayHeight, aafInfo.displayWidth, 0, aafInfo.displayYOffset));
    NCF_RETURN(pDigitalImageDescriptor->SetImageAspectRatio( aspectRatio ));
    return NCF_OK;
}

NCFRESULT PictureDescriptor::SetRateAndLength() {
    Rational movieEditRate;
    NCF_RETURN(media->GetEditRate(&movieEditRate));
    const aafRational_t editRate = AAFRational(movieEditRate);
    editRate_ = editRate;
    NCF_RETURN(pFileDescriptor->SetSampleRate(editRate));
    ncfUInt64 movieLength = 0;
    NCF_RETURN(media->GetMovieLength(&movieLength));
    NCF_RETURN(pFileDescriptor->SetLength(movieLength));
    return NCF_OK;
}

NCFRESULT PictureDescriptor::SetExtendedProperties() {
    if (directAccess && aafInfo.sliceCounter != 0) {
        NCF_RETURN(SetAVCISliceCount(pHeader, pDictionary, pCDCIDescriptor, aafInfo.sliceCounter));
    }
    GeometryDetails geometryDetails;
    NCF_RETURN(media->GetGeometryDetails(&geometryDetails));
    NCF_RETURN(PutBoxesToAAF(pDictionary, pDigitalImageDescriptor, geometryDetails));
    return NCF_OK;
}

NCFRESULT PictureDescriptor::Append() {
    const aafRational_t& editRate = editRate_;
    NCF_RETURN(FixMultiDescSampleRate(pMultiDescriptor, editRate));
    NCF_RETURN(pMultiDescriptor->AppendFileDescriptor( pFileDescriptor ));
    return NCF_OK;
}

// clang-format on

}  // namespace NMA::Impl
