// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// The four rectangles of the picture: from the movie's raster text, or else
// those of any picture of its size and ratio.

#include <string>

#include "host_interfaces/util/NMAString.h"
#include "source/clips/QuickTimeClip.h"
#include "source/descriptor_data/QTAttributesXMLParser.h"
#include "source/plugin/ResultChecks.h"

namespace {

constexpr char kBoundsTag[] = "<Bounds>";

}  // namespace

NCFRESULT QuickTimeClip::SetGeometryImpl() {
    if (SetGeometryImplFromSpecificMedia() != NCF_OK) {
        picture_.SetDefaultGeometry();
    }
    return NCF_OK;
}

NCFRESULT QuickTimeClip::SetGeometryImplFromSpecificMedia() {
    try {
        return ReadBounds();
    } catch (NCFRESULT result) {
        return result;
    } catch (...) {
        return NCF_E_UNEXPECTED;
    }
}

NCFRESULT QuickTimeClip::ReadBounds() {
    NCF_FUNCTION("QuickTimeClip::SetGeometryImplFromSpecificMedia");
    NCFSmartPtr<IVideoTrackInfo> pVT;
    NCFSmartPtr<IVideoSampleDescription> pSD;
    NCFSmartPtr<INCFString> pRIString;
    NCF_RETURN(qtParser_->GetVideoTrackInfo(0, pVT.outArg()));
    NCF_RETURN(pVT->GetVideoSampleDescription(0, pSD.outArg()));
    NCF_RETURN(pSD->GetRIAttributes(pRIString.outArg()));
    CHK_PTR(pRIString.inArg());
    const NMAString attributes(pRIString.inArg(), kNCFUTF8);
    const std::string text = attributes.GetUTF8String();
    const std::size_t start = text.find(kBoundsTag);
    if (start == std::string::npos) {
        return NCF_E_INVALIDARG;
    }
    NCFRESULT op_res = NCF_OK;
    ParseHelperFunctions::QTAttributesXMLParser xmlParser(componentFactory_,
                                                          NMAString(text.c_str() + start), op_res);
    NCF_RETURN(op_res);

    struct {
        QTBoxKind kind;
        BoundsBox* box;
    } const boxes[] = {
        {kBoxFraming, &picture_.geometry.framing},
        {kBoxEssence, &picture_.geometry.essence},
        {kBoxSource, &picture_.geometry.source},
        {kBoxValid, &picture_.geometry.valid},
    };
    for (const auto& entry : boxes) {
        const NCFRESULT result = xmlParser.GetBox(entry.kind, entry.box);
        if (result != NCF_OK && result != NMA_E_NODATA) {
            return result;
        }
    }
    return NCF_OK;
}
