// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// The picture as the wrapper tells of it: identity, size, fields and colour.

#include "source/clips/OtherClip.h"
#include "source/plugin/FourCharText.h"
#include "source/plugin/PluginLogSink.h"
#include "source/plugin/ResultChecks.h"

namespace {

// Bits beside the interlaced flag.
constexpr ncfUInt32 kTopFieldFirstBit = 1;
constexpr ncfUInt32 kFieldsApartBit = 8;

// What the two colour flags of the wrapper make of a picture. The three codes
// are those that a movie's colour atom would hold.
struct ColorAnswer {
    const char* line;
    ncfUInt32 colorSpace;
    ncfUInt32 colorPrimaries;
    ncfUInt32 transferFunction;
    ncfUInt32 matrix;
};

// Indexed by 2 for the 709 flag plus 1 for the 601 flag.
constexpr ColorAnswer kColorAnswers[] = {
    {"GetVideoColorSpaceDetails defaulting to RGB.\n", CS_RGB, 2, 2, 2},
    {"GetVideoColorSpaceDetails detected 601.\n", CS_YCbCr_601, 6, 1, 6},
    {"GetVideoColorSpaceDetails detected 709.\n", CS_YCbCr_709, 1, 1, 1},
    {"GetVideoColorSpaceDetails Undefined behavior: both 601 and 709 were detected! Just pick "
     "709.\n",
     CS_YCbCr_709, 1, 1, 1},
};

// Four bytes in text order as a number, the first one on top.
ncfUInt32 CodeOf(const ncfUInt8 (&bytes)[4]) {
    return ncfUInt32{bytes[0]} << 24 | ncfUInt32{bytes[1]} << 16 | ncfUInt32{bytes[2]} << 8 |
           bytes[3];
}

}  // namespace

// --- identity ------------------------------------------------------------------------

NCFRESULT OtherClip::GetDataFormat(ncfUInt32* dataFormat) const {
    NCF_FUNCTION("OtherClip::GetDataFormat");
    CHK_PTR(dataFormat);
    ncfUInt32 track = 0;
    NCF_RETURN(GetFirstVideoTrack(track));
    ncfUInt8 fourcc_[4] = {};
    NCF_RETURN_TEXT("qtWrapper_->GetFourCCFromImageDescrptor(track, (ncfUInt8*)fourcc_)",
                    qtWrapper_->GetFourCCFromImageDescrptor(track, fourcc_));
    *dataFormat = CodeOf(fourcc_);
    return NCF_OK;
}

NCFRESULT OtherClip::GetVendor(ncfUInt32* vendor) const {
    NCF_FUNCTION("OtherClip::GetVendor");
    CHK_PTR(vendor);
    ncfUInt32 track = 0;
    NCF_RETURN(GetFirstVideoTrack(track));
    NCF_RETURN(qtWrapper_->GetVendor(track, vendor));
    slog::Progress(ncfFunction) << "vendor: " << FourCharText(*vendor).c_str();
    return NCF_OK;
}

NCFRESULT OtherClip::GetNivoResolution(ncfUInt32* vcID) const {
    NCF_FUNCTION("OtherClip::GetNivoResolution");
    CHK_PTR(vcID);
    ncfUInt32 track = 0;
    NCF_RETURN(GetFirstVideoTrack(track));
    *vcID = qtWrapper_->GetResolutionId(track);
    return NCF_OK;
}

// --- size and ratio ----------------------------------------------------------------------

NCFRESULT OtherClip::ReadMovieBox(const char* ncfFunction, bool& hasPicture) {
    ncfUInt32 trackCount = 0;
    NCF_RETURN(GetVideoTrackCountImpl(&trackCount));
    hasPicture = trackCount != 0;
    if (hasPicture) {
        NCF_RETURN_TEXT(
            "qtWrapper_->GetMovieBox(&width_, &height_, &imageAspectRatioNumerator_, "
            "&imageAspectRatioDenominator_)",
            qtWrapper_->GetMovieBox(&picture_.width, &picture_.height, &picture_.aspectNumerator,
                                    &picture_.aspectDenominator));
    }
    return NCF_OK;
}

// The movie is set back to its own size, so that pictures come out whole.
NCFRESULT OtherClip::GetEncodedWidthAndHeightImpl(ncfUInt32*, ncfUInt32*) {
    NCF_FUNCTION("OtherClip::GetEncodedWidthAndHeightImpl");
    bool hasPicture = false;
    const NCFRESULT result = ReadMovieBox(ncfFunction, hasPicture);
    if (result < 0) {
        return result;
    }
    if (hasPicture) {
        NCF_RETURN_TEXT("qtWrapper_->QTWSetMovieBox(0, 0, (ncfSInt16)height_, (ncfSInt16)width_)",
                        qtWrapper_->QTWSetMovieBox(0, 0, static_cast<ncfSInt16>(picture_.height),
                                                   static_cast<ncfSInt16>(picture_.width)));
    }
    return NCF_OK;
}

NCFRESULT OtherClip::GetImageAspectRatioImpl(ncfUInt32*, ncfUInt32*) {
    NCF_FUNCTION("OtherClip::GetImageAspectRatioImpl");
    bool hasPicture = false;
    return ReadMovieBox(ncfFunction, hasPicture);
}

// The wrapper knows of no rectangles but the whole picture.
NCFRESULT OtherClip::SetGeometryImpl() {
    picture_.SetDefaultGeometry();
    return NCF_OK;
}

// --- fields --------------------------------------------------------------------------------

NCFRESULT OtherClip::SetFieldLayoutDetails() {
    NCF_FUNCTION("OtherClip::SetFieldLayoutDetails");
    CHK_PTR(console_);
    CHK_PTR(qtWrapper_);
    ncfUInt32 flag = 0;
    ncfUInt32 bits = 0;
    const NCFRESULT result = qtWrapper_->QueryVideoDescBufferDetails(&flag, &bits);
    if (result == NMA_E_FIELDS) {
        ncfUInt32 width = 0;
        ncfUInt32 height = 0;
        NCF_RETURN_TEXT("qtWrapper_->GetMovieBox(&width, &height, NULL, NULL)",
                        qtWrapper_->GetMovieBox(&width, &height, nullptr, nullptr));
        picture_.fields.ApplySize(width, height);
        // What the size says is taken for the movie's own word.
        flag = picture_.fields.order == kProgressive ? 0 : 1;
        bits = 0;
    } else if (result < 0) {
        console_->Write(
            4, "QueryVideoDescBufferDetails failed, default to full progressive and merged \n");
        return result;
    }
    picture_.fields.Apply(flag != 0, (bits & kTopFieldFirstBit) != 0, (bits & kFieldsApartBit) != 0,
                          clipParams_, console_);
    return NCF_OK;
}

NCFRESULT OtherClip::GetNMAFrameLayout(ncfUInt32* frameLayout) const {
    NCF_FUNCTION("OtherClip::GetNMAFrameLayout");
    ncfUInt32 track = 0;
    NCF_RETURN(GetFirstVideoTrack(track));
    ncfUInt32 count = 0;
    const bool known = qtWrapper_->GetFieldLayoutForTrack(track, &count) != 0;
    if (frameLayout) {
        *frameLayout = known && count == 2 ? 1 : 0;
    }
    return NCF_OK;
}

// --- colour ----------------------------------------------------------------------------------

NCFRESULT OtherClip::SetColorSpaceImpl() {
    NCF_FUNCTION("OtherClip::SetColorSpaceImpl");
    CHK_PTR(qtWrapper_);
    picture_.colorSpace = CS_RGB;
    picture_.color.hasVendorMetadata = false;
    picture_.color.refBlack = -1;
    picture_.color.refWhite = -1;
    ncfBool bYCbCr_709Found = 0;
    ncfBool bYCbCr_601Found = 0;
    NCF_RETURN(qtWrapper_->GetCodecColorSpaceInfo( &bYCbCr_709Found, &bYCbCr_601Found));
    const ColorAnswer& answer =
        kColorAnswers[(bYCbCr_709Found ? 2 : 0) + (bYCbCr_601Found ? 1 : 0)];
    console_->Write(4, "%s", answer.line);
    picture_.colorSpace = answer.colorSpace;
    picture_.color.colorPrimaries = answer.colorPrimaries;
    picture_.color.transferFunction = answer.transferFunction;
    picture_.color.matrix = answer.matrix;
    return NCF_OK;
}
