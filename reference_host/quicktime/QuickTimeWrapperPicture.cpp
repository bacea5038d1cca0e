// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include <numeric>
#include <optional>
#include <string_view>

#include "reference_host/framework/Guard.h"
#include "reference_host/header_parser/ImageAspect.h"
#include "reference_host/quicktime/CodecPixels.h"
#include "reference_host/quicktime/OpenInput.h"
#include "reference_host/quicktime/QuickTimeWrapper.h"

namespace host {
namespace {

constexpr ncfUInt32 kTopFieldFirst = 1;
constexpr ncfUInt32 kFieldsApart = 8;
// Depth by which sample descriptions say that there is alpha.
constexpr int kDepthWithAlpha = 32;

bool IsTopFirst(AVFieldOrder order) {
    return order == AV_FIELD_TT || order == AV_FIELD_TB;
}

}  // namespace

const AVStream& QuickTimeWrapper::DetailedFirstVideo() const {
    const ncfUInt32 track = Movie().FirstVideo();
    Need(track != 0, NCF_E_NOTFOUND);
    return *movie_->FindDetailedTrack(track);
}

NCFRESULT QuickTimeWrapper::QueryVideoDescBufferDetails(ncfUInt32* interlaced, ncfUInt32* bits) {
    return Guarded([&] {
        Need(movie_, NMA_E_NOTINITIALIZED);
        Need(interlaced && bits);
        const AVCodecParameters& form = *DetailedFirstVideo().codecpar;
        const AVFieldOrder told = movie_->ContainerFieldOrder(movie_->FirstVideo());
        const bool isTold = told != AV_FIELD_UNKNOWN;
        const AVFieldOrder order = isTold ? told : form.field_order;
        Need(order != AV_FIELD_UNKNOWN, NMA_E_FIELDS);
        *interlaced = order != AV_FIELD_PROGRESSIVE;
        *bits = 0;
        if (order != AV_FIELD_PROGRESSIVE) {
            // Only movie files can say that a sample holds field after field.
            const bool isApart = isTold && IsMovieFamily(movie_->Input()) &&
                                 (order == AV_FIELD_TT || order == AV_FIELD_BB);
            *bits = (IsTopFirst(order) ? kTopFieldFirst : 0) | (isApart ? kFieldsApart : 0);
        }
        return NCF_OK;
    });
}

ncfBool QuickTimeWrapper::GetFieldLayoutForTrack(ncfUInt32 track, ncfUInt32* fieldCount) {
    if (!movie_ || !fieldCount || !movie_->IsVideo(track)) {
        return 0;
    }
    AVFieldOrder order = movie_->ContainerFieldOrder(track);
    if (order == AV_FIELD_UNKNOWN) {
        order = movie_->FindDetailedTrack(track)->codecpar->field_order;
    }
    if (order == AV_FIELD_UNKNOWN) {
        return 0;
    }
    *fieldCount = order == AV_FIELD_PROGRESSIVE ? 1 : 2;
    return 1;
}

NCFRESULT QuickTimeWrapper::GetCodecColorSpaceInfo(ncfBool* found709, ncfBool* found601) {
    return Guarded([&] {
        Need(movie_, NMA_E_NOTINITIALIZED);
        Need(found709 && found601);
        const AVCodecParameters& form = *DetailedFirstVideo().codecpar;
        const AVColorSpace space = form.color_space;
        *found709 = space == AVCOL_SPC_BT709 || space == AVCOL_SPC_SMPTE240M;
        *found601 = space == AVCOL_SPC_BT470BG || space == AVCOL_SPC_SMPTE170M;
        return NCF_OK;
    });
}

ncfBool QuickTimeWrapper::MovieHasOneFrame() {
    ncfBool hasOne = 0;
    Guarded([&] {
        hasOne = movie_ && movie_->CountPictures(2) == 1;
        return NCF_OK;
    });
    return hasOne;
}

NCFRESULT QuickTimeWrapper::MovieContainsAlpha(ncfUInt32 kind, ncfBool* alpha) {
    return Guarded([&] {
        Need(movie_, NMA_E_NOTINITIALIZED);
        Need(alpha);
        Need(kind == QTWrapper::kAlphaCheckForImport || kind == QTWrapper::kAlphaCheckForQTNMA,
             NCF_E_INVALIDARG);
        const AVCodecParameters& form = *DetailedFirstVideo().codecpar;
        bool found = form.codec_id == AV_CODEC_ID_GIF;
        if (kind == QTWrapper::kAlphaCheckForImport) {
            found =
                found || HasAlphaComponent(static_cast<AVPixelFormat>(form.format)) ||
                (IsMovieFamily(movie_->Input()) && form.bits_per_coded_sample == kDepthWithAlpha);
        } else if (!found) {
            const int index = movie_->StreamOf(movie_->FirstVideo());
            const InputOwner input = OpenForStream(movie_->Path(), InputView::AsPresented, index);
            const FrameOwner frame = input ? DecodeFirstPicture(*input, index) : nullptr;
            found = frame && ShowsAlpha(*frame);
        }
        *alpha = found;
        return NCF_OK;
    });
}

NCFRESULT QuickTimeWrapper::GetMovieBox(ncfUInt32* width, ncfUInt32* height, ncfUInt32* aspectNum,
                                        ncfUInt32* aspectDen) {
    return Guarded([&] {
        Need(movie_, NMA_E_NOTINITIALIZED);
        Need(width && height);
        const MovieFile::Raster raster = movie_->RasterOf(movie_->FirstVideo());
        Need(raster.width > 0 && raster.height > 0, NCF_E_NOTFOUND);
        *width = static_cast<ncfUInt32>(raster.width);
        *height = static_cast<ncfUInt32>(raster.height);
        const AVRational told = raster.pixelAspect;
        std::optional<header_parser::Ratio> pixel;
        if (told.num > 0 && told.den > 0) {
            pixel = header_parser::Ratio{static_cast<ncfUInt32>(told.num),
                                         static_cast<ncfUInt32>(told.den)};
        }
        const header_parser::Ratio aspect =
            header_parser::ImageAspect(*width, *height, std::nullopt, pixel);
        Give(aspect.numerator, aspectNum);
        Give(aspect.denominator, aspectDen);
        return NCF_OK;
    });
}

// Frames come out at their stored size always, whatever the box. Its 16 bits hold
// 0 for a side of 65536.
NCFRESULT QuickTimeWrapper::QTWSetMovieBox(ncfSInt16, ncfSInt16, ncfSInt16, ncfSInt16) {
    return movie_ ? NCF_OK : NMA_E_NOTINITIALIZED;
}

}  // namespace host
