// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// The picture as its first sample description tells it: identity, size, fields
// and colour. What a movie leaves out has a default.

#include <string>

#include "host_interfaces/util/NMAString.h"
#include "source/clips/QuickTimeClip.h"
#include "source/descriptor_data/QTAttributesXMLParser.h"
#include "source/plugin/FourCharText.h"
#include "source/plugin/PluginLogSink.h"
#include "source/plugin/ResultChecks.h"

namespace {

constexpr char kColorSpaceTag[] = "<ColorSpaceDescriptor>";

// The transfer characteristic of movies that the parser marks as graphics.
constexpr GUID kMarkedTransferCharacteristic = ncfGuid("0E170000-0001-0101-060E-2B340401010C");

// Codes of the colour atom.
constexpr ncfUInt32 kUnspecified = 2;
constexpr ncfUInt32 kPrimaries709 = 1;
constexpr ncfUInt32 kTransfer240M = 7;
constexpr ncfUInt32 kMatrix709 = 1;
constexpr ncfUInt32 kMatrix240M = 7;
constexpr ncfUInt32 kMatrix601 = 6;

}  // namespace

// --- identity ------------------------------------------------------------------------

NCFRESULT QuickTimeClip::GetDataFormat(ncfUInt32* dataFormat) const {
    NCF_FUNCTION("QuickTimeClip::GetDataFormat");
    CHK_PTR(dataFormat);
    return AskFirstPicture(ncfFunction, [&](const FirstPicture& vdscr) -> NCFRESULT {
        NCF_RETURN(vdscr->GetDataFormat(dataFormat));
        return NCF_OK;
    });
}

NCFRESULT QuickTimeClip::GetVendor(ncfUInt32* vendor) const {
    NCF_FUNCTION("QuickTimeClip::GetVendor");
    CHK_PTR(vendor);
    return AskFirstPicture(ncfFunction, [&](const FirstPicture& vdscr) -> NCFRESULT {
        NCF_RETURN(vdscr->GetVendor(vendor));
        slog::Progress(ncfFunction) << "vendor: " << FourCharText(*vendor).c_str();
        return NCF_OK;
    });
}

NCFRESULT QuickTimeClip::GetNivoResolution(ncfUInt32* vcID) const {
    NCF_FUNCTION("QuickTimeClip::GetNivoResolution");
    CHK_PTR(vcID);
    return AskFirstPicture(ncfFunction, [&](const FirstPicture& vdscr) -> NCFRESULT {
        QTNivoResolution resolutionExt{};
        NCF_RETURN(vdscr->GetNivoResolution(&resolutionExt));
        *vcID = resolutionExt.id;
        return NCF_OK;
    });
}

// --- size and ratio ----------------------------------------------------------------------

// The description counts in 16 bits: only the low halves of the fields are
// written.
NCFRESULT QuickTimeClip::GetEncodedWidthAndHeightImpl(ncfUInt32*, ncfUInt32*) {
    NCF_FUNCTION("QuickTimeClip::GetEncodedWidthAndHeightImpl");
    return AskFirstPicture(ncfFunction, [&](const FirstPicture& vdscr) -> NCFRESULT {
        auto width = static_cast<ncfUInt16>(picture_.width);
        auto height = static_cast<ncfUInt16>(picture_.height);
        NCF_RETURN_TEXT(
            "vdscr->GetEncodedWidthAndHeight((ncfUInt16*)&width_, (ncfUInt16*)&height_)",
            vdscr->GetEncodedWidthAndHeight(&width, &height));
        picture_.width = (picture_.width & 0xFFFF0000u) | width;
        picture_.height = (picture_.height & 0xFFFF0000u) | height;
        return NCF_OK;
    });
}

NCFRESULT QuickTimeClip::GetImageAspectRatioImpl(ncfUInt32*, ncfUInt32*) {
    NCF_FUNCTION("QuickTimeClip::GetImageAspectRatioImpl");
    return AskFirstPicture(
        ncfFunction,
        [&](const FirstPicture& vdscr) -> NCFRESULT {
            NCF_RETURN_TEXT(
                "vdscr->GetImageAspectRatio(&imageAspectRatioNumerator_, "
                "&imageAspectRatioDenominator_)",
                vdscr->GetImageAspectRatio(&picture_.aspectNumerator, &picture_.aspectDenominator));
            NCFASSERT_TEXT("imageAspectRatioNumerator_ && imageAspectRatioDenominator_",
                           picture_.aspectNumerator && picture_.aspectDenominator);
            return NCF_OK;
        },
        "vti");
}

// --- fields --------------------------------------------------------------------------------

NCFRESULT QuickTimeClip::SetFieldLayoutDetails() {
    NCF_FUNCTION("QuickTimeClip::SetFieldLayoutDetails");
    CHK_PTR(console_);
    CHK_PTR(qtParser_);
    return AskFirstPicture(ncfFunction, [&](const FirstPicture& vdscr) -> NCFRESULT {
        ncfUInt32 fieldCount = 1;
        ncfUInt32 topFieldFirst = 0;
        ncfUInt32 split = 0;
        const NCFRESULT r = vdscr->GetFieldInfo(&fieldCount, &topFieldFirst, &split);
        if (r == NCF_E_PARAMETERNOTAVAILABLE) {
            ncfUInt16 width = 0;
            ncfUInt16 height = 0;
            NCF_RETURN(vdscr->GetEncodedWidthAndHeight(&width, &height));
            // Replaced below by the values of a progressive picture: the size
            // alone decides nothing here.
            picture_.fields.ApplySize(width, height);
        } else if (r != NCF_OK) {
            console_->Write(
                4, "SetFieldLayoutDetails failed, default to full progressive and merged \n");
            return r;
        }
        picture_.fields.Apply(fieldCount != 1, topFieldFirst != 0, split != 0, clipParams_,
                              console_);
        return NCF_OK;
    });
}

NCFRESULT QuickTimeClip::GetNMAFrameLayout(ncfUInt32* frameLayout) const {
    NCF_FUNCTION("QuickTimeClip::GetNMAFrameLayout");
    return AskFirstPicture(ncfFunction, [&](const FirstPicture& vdscr) -> NCFRESULT {
        ncfUInt32 fieldCount = 1;
        const NCFRESULT r = vdscr->GetFieldInfo(&fieldCount, nullptr, nullptr);
        const ncfUInt32 layout = r == NCF_OK && fieldCount == 2 ? 1 : 0;
        if (frameLayout) {
            *frameLayout = layout;
        }
        return r;
    });
}

// --- colour ----------------------------------------------------------------------------------

NCFRESULT QuickTimeClip::SetColorSpaceImpl() {
    NCF_FUNCTION("QuickTimeClip::SetColorSpaceImpl");
    return AskFirstPicture(ncfFunction, [&](const FirstPicture& vdscr) -> NCFRESULT {
        if (SetColorSpaceImplFromSpecificMedia() == NCF_OK) {
            return NCF_OK;
        }
        NCFSmartPtr<IQTParserColor> parserColor;
        if (ncfQuery(qtParser_.inArg(), parserColor) >= 0) {
            const ncfUInt32 flagB = parserColor->ColorFlagB();
            const ncfUInt32 flagA = parserColor->ColorFlagA();
            if (flagA == 0 || flagB == 0) {
                picture_.colorSpace = CS_RGB;
                picture_.color.hasVendorMetadata = true;
                picture_.color.transferCharacteristicUID = kMarkedTransferCharacteristic;
                picture_.color.refBlack = -1;
                picture_.color.refWhite = -1;
                return NCF_OK;
            }
        }
        ncfUInt32 codes[3] = {kUnspecified, kUnspecified, kUnspecified};
        const NCFRESULT r = vdscr->GetVideoColorSpaceDetails(codes);
        picture_.colorSpace = CS_RGB;
        picture_.color.colorPrimaries = codes[0];
        picture_.color.transferFunction = codes[1];
        picture_.color.matrix = codes[2];
        picture_.color.hasVendorMetadata = false;
        picture_.color.refBlack = -1;
        picture_.color.refWhite = -1;
        if (r == NCF_E_PARAMETERNOTAVAILABLE) {
            console_->Write(4, "GetVideoColorSpaceDetails defaulting to RGB.\n");
        } else if (codes[0] == kPrimaries709 || codes[2] == kMatrix709 || codes[2] == kMatrix240M ||
                   codes[1] == kTransfer240M) {
            console_->Write(4, "GetVideoColorSpaceDetails detected 709.\n");
            picture_.colorSpace = CS_YCbCr_709;
        } else if (codes[2] == kMatrix601) {
            console_->Write(4, "GetVideoColorSpaceDetails detected 601.\n");
            picture_.colorSpace = CS_YCbCr_601;
        }
        return NCF_OK;
    });
}

// The text of a movie may lack what it must have; reading it then throws, and
// the other sources are asked.
NCFRESULT QuickTimeClip::SetColorSpaceImplFromSpecificMedia() {
    try {
        return ReadColorSpaceDescriptor();
    } catch (NCFRESULT result) {
        return result;
    } catch (...) {
        return NCF_E_UNEXPECTED;
    }
}

NCFRESULT QuickTimeClip::ReadColorSpaceDescriptor() {
    NCF_FUNCTION("QuickTimeClip::SetColorSpaceImplFromSpecificMedia");
    return AskFirstPicture(ncfFunction, [&](const FirstPicture& vdscr) -> NCFRESULT {
        NCFSmartPtr<INCFString> pCMString;
        NCF_RETURN(vdscr->GetCMAttributes(pCMString.outArg()));
        CHK_PTR(pCMString.inArg());
        const NMAString attributes(pCMString.inArg(), kNCFUTF8);
        const std::string text = attributes.GetUTF8String();
        const std::size_t start = text.find(kColorSpaceTag);
        if (start == std::string::npos) {
            return NCF_E_INVALIDARG;  // most movies have no such text
        }
        NCFRESULT op_res = NCF_OK;
        ParseHelperFunctions::QTAttributesXMLParser xmlParser(
            componentFactory_, NMAString(text.c_str() + start), op_res);
        NCF_RETURN(op_res);
        ColorSpaceDescriptor colorSpaceDescriptor;
        NCF_RETURN(xmlParser.GetColorSpaceDescriptor(&colorSpaceDescriptor));
        picture_.color.refBlack = colorSpaceDescriptor.minReference;
        picture_.color.refWhite = colorSpaceDescriptor.maxReference;
        picture_.color.name = colorSpaceDescriptor.name;
        picture_.color.transferCharacteristicName = colorSpaceDescriptor.transferCharacteristicName;
        picture_.color.transferCharacteristicUID = colorSpaceDescriptor.transferCharacteristicUID;
        picture_.colorSpace = CS_RGB;
        picture_.color.hasVendorMetadata = true;
        return NCF_OK;
    });
}
