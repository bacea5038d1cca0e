// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/essence/ColorSpace.h"

#include "source/plugin/ResultChecks.h"

NCFRESULT InferColorSpaceFromStandard(const std::tr1::shared_ptr<BaseClip>& media,
                                      ncfUInt32* colorSpace) {
    NCF_FUNCTION("InferColorSpaceFromStandard");
    CHK_INARG(colorSpace);
    ncfUInt32 width = 0;
    ncfUInt32 height = 0;
    NCF_RETURN(media->GetEncodedWidthAndHeight(&width, &height));
    *colorSpace = IsHighDefinition(width, height) ? CS_YCbCr_709 : CS_YCbCr_601;
    return NCF_OK;
}
