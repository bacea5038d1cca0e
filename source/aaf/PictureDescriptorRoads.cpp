// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// What the two roads of a picture descriptor set each in its own way.

#include <vector>

#include "source/aaf/BinColumns.h"
#include "source/aaf/PictureDescriptor.h"
#include "source/aaf/UniversalLabels.h"
#include "source/descriptor_data/QuickTimeToAAFInfoRetriever.h"
#include "source/plugin/ResultChecks.h"

namespace NMA::Impl {
namespace {

NCF_FUNCTION("NMA::Impl::AddVideoDescriptor");

// A standard-definition raster whose movie does not tell its layout has its
// fields apart.
bool IsInterlacedRaster(ncfUInt32 width, ncfUInt32 height) {
    return width == 720 && (height == 486 || height == 576);
}

}  // namespace

// These texts are part of the log's format; where the code differs, _TEXT carries them.
// clang-format off

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
    aafInfo.storedHeight = aafInfo.frameLayout == kAAFSeparateFields ? movieHeight / 2 : movieHeight;
    aafInfo.displayHeight = aafInfo.storedHeight;
    return NCF_OK;
}

NCFRESULT PictureDescriptor::DescribeFromRecord() {
    if (!directAccess) {
        return NCF_OK;
    }
    NCF_RETURN(pDigitalImageDescriptor2->SetFieldStartOffset( aafInfo.ImageStartOffset ));
    // A copy, since the library's integer is another type on some platforms.
    std::vector<aafInt32> videoLineMap(aafInfo.videoLineMapVect.begin(), aafInfo.videoLineMapVect.end());
    NCF_RETURN_TEXT(
        "pDigitalImageDescriptor->SetVideoLineMap( (aafUInt32)aafInfo.videoLineMapVect.size(), "
        "(aafInt32*)&aafInfo.videoLineMapVect[0] )",
        pDigitalImageDescriptor->SetVideoLineMap((aafUInt32)videoLineMap.size(), videoLineMap.data()));
    aspectRatio = {(aafInt32)aafInfo.aspectNumerator, (aafInt32)aafInfo.aspectDenominator};
    return SetComponents();
}

NCFRESULT PictureDescriptor::SetComponents() {
    if (QuickTimeToAAFInfoRetriever::GetInstance()->IsRGBADescriptor()) {
        NCF_RETURN_TEXT(
            "pRGBADescriptor->SetPixelLayout((aafUInt32)aafInfo.pixelLayout.size(),"
            "&aafInfo.pixelLayout[0])",
            pRGBADescriptor->SetPixelLayout((aafUInt32)aafInfo.pixelLayout.size(), aafInfo.pixelLayout.data()));
        return NCF_OK;
    }
    NCF_RETURN(pCDCIDescriptor->SetComponentWidth( aafInfo.componentDepth ));
    NCF_RETURN(pCDCIDescriptor->SetHorizontalSubsampling( aafInfo.horizontalSubsampling ));
    NCF_RETURN(pCDCIDescriptor->SetVerticalSubsampling( aafInfo.verticalSubsampling ));
    NCF_RETURN(pCDCIDescriptor->SetColorSiting( (aafColorSiting_t)aafInfo.colorSiting ));
    NCF_RETURN(pCDCIDescriptor->SetColorRange( aafInfo.colorRange ));
    return NCF_OK;
}

// clang-format on

}  // namespace NMA::Impl
