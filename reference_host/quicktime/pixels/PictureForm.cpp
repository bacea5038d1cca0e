// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/quicktime/pixels/PictureForm.h"

#include <cstdint>

namespace host {
namespace {

// False for matrices that nobody named or that are not of this kind.
bool WeightsOf(AVColorSpace space, LumaWeights& weights) {
    switch (space) {
        case AVCOL_SPC_BT709:
            weights = kRec709;
            return true;
        case AVCOL_SPC_BT470BG:
        case AVCOL_SPC_SMPTE170M:
            weights = kRec601;
            return true;
        case AVCOL_SPC_FCC:
            weights = {0.30, 0.11};
            return true;
        case AVCOL_SPC_SMPTE240M:
            weights = {0.212, 0.087};
            return true;
        case AVCOL_SPC_BT2020_NCL:
        case AVCOL_SPC_BT2020_CL:
            weights = {0.2627, 0.0593};
            return true;
        default:
            return false;
    }
}

double CentreOf(int shift) {
    return ((1 << shift) - 1) / 2.0;
}

}  // namespace

LumaWeights WeightsForSize(int width, int height) {
    return width < 960 || height < 720 ? kRec601 : kRec709;
}

bool IsFullRangeByName(AVPixelFormat format) {
    return format == AV_PIX_FMT_YUVJ420P || format == AV_PIX_FMT_YUVJ422P ||
           format == AV_PIX_FMT_YUVJ444P || format == AV_PIX_FMT_YUVJ440P ||
           format == AV_PIX_FMT_YUVJ411P;
}

bool NamesMatrix(AVColorSpace space) {
    LumaWeights ignored{};
    return WeightsOf(space, ignored);
}

PictureForm::PictureForm(const AVFrame& frame)
    : description(av_pix_fmt_desc_get(static_cast<AVPixelFormat>(frame.format))),
      width(frame.width),
      height(frame.height),
      depth(description->comp[0].depth),
      isRgb((description->flags & AV_PIX_FMT_FLAG_RGB) != 0),
      isGrey(description->nb_components <= 2),
      isPalette((description->flags & AV_PIX_FMT_FLAG_PAL) != 0),
      isFloat((description->flags & AV_PIX_FMT_FLAG_FLOAT) != 0),
      hasAlpha((description->flags & AV_PIX_FMT_FLAG_ALPHA) != 0),
      isInterlaced(frame.interlaced_frame != 0),
      chromaShiftX(description->log2_chroma_w),
      chromaShiftY(description->log2_chroma_h),
      chromaSiteX(0.0),
      chromaSiteY(CentreOf(chromaShiftY)) {
    if (isFloat) {
        depth = 16;
    }
    if (isPalette) {
        depth = 8;
        isGrey = false;
    }
    isRgb = isRgb || isGrey || isPalette;
    isFullRange = isRgb ? !(isGrey && frame.color_range == AVCOL_RANGE_MPEG)
                        : frame.color_range == AVCOL_RANGE_JPEG ||
                              IsFullRangeByName(static_cast<AVPixelFormat>(frame.format));
    switch (frame.chroma_location) {
        case AVCHROMA_LOC_CENTER:
            chromaSiteX = CentreOf(chromaShiftX);
            break;
        case AVCHROMA_LOC_TOPLEFT:
            chromaSiteY = 0.0;
            break;
        case AVCHROMA_LOC_TOP:
            chromaSiteX = CentreOf(chromaShiftX);
            chromaSiteY = 0.0;
            break;
        default:
            break;
    }
    weights = WeightsForSize(width, height);
    isStandardMatrix =
        !WeightsOf(frame.colorspace, weights) || weights == kRec601 || weights == kRec709;
}

bool PictureForm::CanRead(AVPixelFormat format) {
    const AVPixFmtDescriptor* const found = av_pix_fmt_desc_get(format);
    constexpr std::uint64_t kForeign =
        AV_PIX_FMT_FLAG_BITSTREAM | AV_PIX_FMT_FLAG_HWACCEL | AV_PIX_FMT_FLAG_BAYER;
    // Of UYYVYY411 a description of steps can't tell where its luma stands.
    const bool isOdd = format == AV_PIX_FMT_XYZ12LE || format == AV_PIX_FMT_XYZ12BE ||
                       format == AV_PIX_FMT_UYYVYY411;
    if (!found || (found->flags & kForeign) != 0 || isOdd) {
        return false;
    }
    return (found->flags & AV_PIX_FMT_FLAG_FLOAT) == 0
               ? found->comp[0].depth <= 16
               : found->comp[0].depth == 32 && (found->flags & AV_PIX_FMT_FLAG_BE) == 0;
}

}  // namespace host
