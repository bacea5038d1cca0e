// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/aaf/VideoDescriptor.h"

#include <vector>

#include "host_interfaces/aaf/AAFClassIds.h"
#include "host_interfaces/aaf/AAFDefinitions.h"
#include "host_interfaces/aaf/AAFPictureDescriptors.h"
#include "source/aaf/AAFDefs.h"
#include "source/aaf/BinColumns.h"
#include "source/aaf/ColorLabels.h"
#include "source/aaf/EditUnits.h"
#include "source/aaf/ExtendedProperties.h"
#include "source/aaf/RunSteps.h"
#include "source/aaf/UniversalLabels.h"
#include "source/clips/SampleProviderPolicy.h"
#include "source/descriptor_data/AAFInfo.h"
#include "source/descriptor_data/QuickTimeToAAFInfoRetriever.h"
#include "source/plugin/ResultChecks.h"

namespace NMA::Impl {

NCFRESULT FixMultiDescSampleRate(IAAFSmartPointer<IAAFMultipleDescriptor> pMultiDesc,
                                 const aafRational_t& sampleRate) {
    NCF_FUNCTION("NMA::Impl::FixMultiDescSampleRate");
    CHK_INARG(pMultiDesc);
    IAAFSmartPointer<IAAFFileDescriptor> pFileDescriptor;
    NCF_RETURN(pMultiDesc->QueryInterface(IID_IAAFFileDescriptor, (void**)&pFileDescriptor));
    aafRational_t currentSampleRate{};
    NCF_RETURN(pFileDescriptor->GetSampleRate(&currentSampleRate));
    if (currentSampleRate.numerator == 0 && currentSampleRate.denominator == 0) {
        NCF_RETURN(pFileDescriptor->SetSampleRate(sampleRate));
    }
    return NCF_OK;
}

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

// A standard-definition raster whose movie does not tell its layout has its
// fields apart.
bool IsInterlacedRaster(ncfUInt32 width, ncfUInt32 height) {
    return width == 720 && (height == 486 || height == 576);
}

// One picture descriptor in the making: the views of the object that its steps
// set values through. The names are those that the log shows. A step gives 0,
// or the result that ends the description.
//
// The retriever's two flags are asked without regard to the road that the clip
// takes. They are those of the last record that was read, so a clip on the
// sample-provider road after an RGBA clip finds no RGBA object and fails; the
// shipped data files have no RGBA record.
struct PictureDescriptor {
    std::tr1::shared_ptr<BaseClip> media;
    NCFSmartPtr<INCFConsole> pConsole;
    IAAFSmartPointer<IAAFMob> pMobMasterMob;
    IAAFSmartPointer<IAAFHeader> pHeader;
    IAAFSmartPointer<IAAFDictionary> pDictionary;
    IAAFSmartPointer<IAAFMultipleDescriptor> pMultiDescriptor;

    AAFInfo aafInfo{};
    bool directAccess = true;  // read from the file, not through the sample provider
    aafRational_t aspectRatio = {4, 3};
    aafUID_t containerFormatUID{};
    ColorDetails colorDetails{};

    IAAFSmartPointer<IAAFMPEGVideoDescriptor> pMPEGDescriptor{};
    IAAFSmartPointer<IAAFRGBADescriptor2> pRGBADescriptor{};
    IAAFSmartPointer<IAAFCDCIDescriptor> pCDCIDescriptor{};
    IAAFSmartPointer<IAAFDigitalImageDescriptor> pDigitalImageDescriptor{};
    IAAFSmartPointer<IAAFDigitalImageDescriptor2> pDigitalImageDescriptor2{};
    IAAFSmartPointer<IAAFFileDescriptor> pFileDescriptor{};

    aafRational_t editRate = {0, 1};

    // In the order in which they run.
    NCFRESULT ChooseRoad();
    NCFRESULT Create();
    NCFRESULT QueryViews();
    NCFRESULT DescribeFromClip();    // sample provider only
    NCFRESULT DescribeFromRecord();  // direct access only
    NCFRESULT SetColorLabels();
    NCFRESULT SetReferenceLevels();
    NCFRESULT SetCoding();
    NCFRESULT SetContainer();
    NCFRESULT SetViews();
    NCFRESULT SetRateAndLength();
    NCFRESULT SetExtendedProperties();
    NCFRESULT Append();

    NCFRESULT CreateMPEG();
    NCFRESULT SetComponents();
    NCFRESULT TakeFrameLayoutFromClip(ncfUInt32 movieWidth, ncfUInt32 movieHeight);
};

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

NCFRESULT PictureDescriptor::Create() {
    if (directAccess && IsMPEG()) {
        const NCFRESULT created = CreateMPEG();
        if (created < 0) {
            return created;
        }
    } else if (directAccess && IsRGBA()) {
        AAFDefs defs(pDictionary);
        NCF_RETURN(defs.cdRGBADescriptor()->CreateInstance(IID_IAAFRGBADescriptor2,
                                                           (IUnknown **)&pRGBADescriptor));
    } else {
        NCF_RETURN(pDictionary->CreateInstance(AUID_AAFCDCIDescriptor, IID_IAAFCDCIDescriptor,
                                               (IUnknown**)&pCDCIDescriptor));
    }
    if (!IsRGBA()) {
        NCF_RETURN(pCDCIDescriptor->Initialize());
    }
    return NCF_OK;
}

NCFRESULT PictureDescriptor::CreateMPEG() {
    AAFDefs defs(pDictionary);
    NCF_RETURN(defs.cdMPEGVideoDescriptor()->CreateInstance(IID_IAAFMPEGVideoDescriptor,
                                                            (IUnknown **)&pMPEGDescriptor));
    NCF_RETURN(pMPEGDescriptor->Initialize());
    NCF_RETURN(pMPEGDescriptor->SetMaxGOP((aafUInt16)aafInfo.maxGOP));
    NCF_RETURN(pMPEGDescriptor->SetBitRate(aafInfo.bitRate));
    NCF_RETURN(pMPEGDescriptor->SetProfileAndLevel(aafInfo.levelAndProfile));
    NCF_RETURN(pMPEGDescriptor->QueryInterface(IID_IAAFCDCIDescriptor, (void**)&pCDCIDescriptor));
    return NCF_OK;
}

NCFRESULT PictureDescriptor::QueryViews() {
    if (IsRGBA()) {
        NCF_RETURN(pRGBADescriptor->QueryInterface(IID_IAAFDigitalImageDescriptor,
                                                   (void **)&pDigitalImageDescriptor));
        NCF_RETURN(
            pRGBADescriptor->QueryInterface(IID_IAAFFileDescriptor, (void **)&pFileDescriptor));
        NCF_RETURN(pRGBADescriptor->QueryInterface(IID_IAAFDigitalImageDescriptor2,
                                                   (void **)&pDigitalImageDescriptor2));
    } else {
        NCF_RETURN(pCDCIDescriptor->QueryInterface(IID_IAAFDigitalImageDescriptor,
                                                   (void **)&pDigitalImageDescriptor));
        NCF_RETURN(
            pCDCIDescriptor->QueryInterface(IID_IAAFFileDescriptor, (void **)&pFileDescriptor));
        NCF_RETURN(pCDCIDescriptor->QueryInterface(IID_IAAFDigitalImageDescriptor2,
                                                   (void **)&pDigitalImageDescriptor2));
    }
    return NCF_OK;
}

NCFRESULT PictureDescriptor::DescribeFromClip() {
    if (directAccess) {
        return NCF_OK;
    }
    NCF_RETURN(AddVideoBinColumnEntry(media, pMobMasterMob, pConsole));
    ncfUInt32 movieWidth = 0;
    ncfUInt32 movieHeight = 0;
    NCF_RETURN(media->GetEncodedWidthAndHeight(&movieWidth, &movieHeight));
    ncfUInt32 pictAspectRatioNumerator = 0;
    ncfUInt32 pictAspectRatioDenominator = 1;
    NCF_RETURN(media->GetImageAspectRatio(&pictAspectRatioNumerator, &pictAspectRatioDenominator));

    aafInfo.storedWidth = movieWidth;
    aafInfo.displayWidth = movieWidth;
    aafInfo.swapAspectRatio = false;
    if (aafInfo.pictureEssenceCoding == aafUID_t{}) {
        aafInfo.pictureEssenceCoding = MakeAAFUIDfromMXFUL(SampleProviderPictureCodingKey);
    }
    AddAspectRatioBinColumnEntry(pMobMasterMob, pConsole, aafInfo, pictAspectRatioNumerator,
                                 pictAspectRatioDenominator, aspectRatio);
    return TakeFrameLayoutFromClip(movieWidth, movieHeight);
}

NCFRESULT PictureDescriptor::TakeFrameLayoutFromClip(ncfUInt32 movieWidth, ncfUInt32 movieHeight) {
    const NCFRESULT told = media->GetNMAFrameLayout(&aafInfo.frameLayout);
    if (told == NCF_E_PARAMETERNOTAVAILABLE) {
        if (IsInterlacedRaster(movieWidth, movieHeight)) {
            aafInfo.frameLayout = kAAFSeparateFields;
        }
    } else if (told != NCF_OK) {
        return told;
    }
    aafInfo.storedHeight =
        aafInfo.frameLayout == kAAFSeparateFields ? movieHeight / 2 : movieHeight;
    aafInfo.displayHeight = aafInfo.storedHeight;
    return NCF_OK;
}

NCFRESULT PictureDescriptor::DescribeFromRecord() {
    if (!directAccess) {
        return NCF_OK;
    }
    NCF_RETURN(pDigitalImageDescriptor2->SetFieldStartOffset( aafInfo.ImageStartOffset ));
    // A copy, since the library's integer is another type on some platforms.
    std::vector<aafInt32> videoLineMap(aafInfo.videoLineMapVect.begin(),
                                       aafInfo.videoLineMapVect.end());
    NCF_RETURN_TEXT(
        "pDigitalImageDescriptor->SetVideoLineMap( (aafUInt32)aafInfo.videoLineMapVect.size(), "
        "(aafInt32*)&aafInfo.videoLineMapVect[0] )",
        pDigitalImageDescriptor->SetVideoLineMap((aafUInt32)videoLineMap.size(),
                                                 videoLineMap.data()));
    aspectRatio = {(aafInt32)aafInfo.aspectNumerator, (aafInt32)aafInfo.aspectDenominator};
    return SetComponents();
}

NCFRESULT PictureDescriptor::SetComponents() {
    if (IsRGBA()) {
        NCF_RETURN_TEXT(
            "pRGBADescriptor->SetPixelLayout((aafUInt32)aafInfo.pixelLayout.size(),"
            "&aafInfo.pixelLayout[0])",
            pRGBADescriptor->SetPixelLayout((aafUInt32)aafInfo.pixelLayout.size(),
                                            aafInfo.pixelLayout.data()));
        return NCF_OK;
    }
    NCF_RETURN(pCDCIDescriptor->SetComponentWidth( aafInfo.componentDepth ));
    NCF_RETURN(pCDCIDescriptor->SetHorizontalSubsampling( aafInfo.horizontalSubsampling ));
    NCF_RETURN(pCDCIDescriptor->SetVerticalSubsampling( aafInfo.verticalSubsampling ));
    NCF_RETURN(pCDCIDescriptor->SetColorSiting( (aafColorSiting_t)aafInfo.colorSiting ));
    NCF_RETURN(pCDCIDescriptor->SetColorRange( aafInfo.colorRange ));
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
        NCF_RETURN(pDictionary->CreateInstance(AUID_AAFContainerDef, IID_IAAFContainerDef,
                                               (IUnknown**)&pContainerDef));
        NCF_RETURN(pContainerDef->Initialize(containerFormatUID, (const aafCharacter*)L"",
                                             (const aafCharacter*)L""));
        NCF_RETURN(pDictionary->RegisterContainerDef(pContainerDef));
    }
    NCF_RETURN(pFileDescriptor->SetContainerFormat(pContainerDef));
    return NCF_OK;
}

NCFRESULT PictureDescriptor::SetViews() {
    NCF_RETURN(pDigitalImageDescriptor->SetFrameLayout(aafInfo.frameLayout));
    NCF_RETURN(pDigitalImageDescriptor->SetStoredView(aafInfo.storedHeight, aafInfo.storedWidth));
    NCF_RETURN(
        pDigitalImageDescriptor->SetSampledView(aafInfo.storedHeight, aafInfo.sampledWidth, 0, 0));
    NCFASSERT(aafInfo.displayHeight && aafInfo.displayWidth);
    NCF_RETURN(pDigitalImageDescriptor->SetDisplayView(aafInfo.displayHeight, aafInfo.displayWidth,
                                                       0, aafInfo.displayYOffset));
    NCF_RETURN(pDigitalImageDescriptor->SetImageAspectRatio( aspectRatio ));
    return NCF_OK;
}

NCFRESULT PictureDescriptor::SetRateAndLength() {
    Rational movieEditRate;
    NCF_RETURN(media->GetEditRate(&movieEditRate));
    editRate = AAFRational(movieEditRate);
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
    NCF_RETURN(FixMultiDescSampleRate(pMultiDescriptor, editRate));
    NCF_RETURN(pMultiDescriptor->AppendFileDescriptor( pFileDescriptor ));
    return NCF_OK;
}

}  // namespace

NCFRESULT AddVideoDescriptor(std::tr1::shared_ptr<BaseClip> media,
                             NCFSmartPtr<INCFConsole> pConsole,
                             IAAFSmartPointer<IAAFMob> pMobMasterMob,
                             IAAFSmartPointer<IAAFHeader> pHeader,
                             IAAFSmartPointer<IAAFDictionary> pDictionary,
                             IAAFSmartPointer<IAAFMultipleDescriptor> pMultiDescriptor) {
    CHK_PTR(media.get());
    CHK_PTR(pConsole);
    CHK_PTR(pMobMasterMob);
    CHK_PTR(pHeader);
    CHK_PTR(pDictionary);
    CHK_PTR(pMultiDescriptor);

    PictureDescriptor picture{media,   pConsole,    pMobMasterMob,
                              pHeader, pDictionary, pMultiDescriptor};
    return RunSteps(picture, &PictureDescriptor::ChooseRoad, &PictureDescriptor::Create,
                    &PictureDescriptor::QueryViews, &PictureDescriptor::DescribeFromClip,
                    &PictureDescriptor::DescribeFromRecord, &PictureDescriptor::SetColorLabels,
                    &PictureDescriptor::SetReferenceLevels, &PictureDescriptor::SetCoding,
                    &PictureDescriptor::SetContainer, &PictureDescriptor::SetViews,
                    &PictureDescriptor::SetRateAndLength, &PictureDescriptor::SetExtendedProperties,
                    &PictureDescriptor::Append);
}

}  // namespace NMA::Impl
