// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/objects/CDCIDescriptor.h"

namespace aaf {

void CDCIDescriptor::SetDefaults() {
    DigitalImageDescriptor::SetDefaults();
    PutInteger(prop::CDCIDescriptor_ComponentWidth, 8);
    PutInteger(prop::CDCIDescriptor_HorizontalSubsampling, 1);
}

HRESULT CDCIDescriptor::SetComponentWidth(aafInt32 componentWidth) {
    if (componentWidth < 0) {
        return AAFRESULT_BAD_PROP;
    }
    return PutInteger(prop::CDCIDescriptor_ComponentWidth, componentWidth);
}

HRESULT CDCIDescriptor::SetHorizontalSubsampling(aafUInt32 subsampling) {
    if (subsampling != 1 && subsampling != 2 && subsampling != 4) {
        return AAFRESULT_BAD_PROP;
    }
    return PutInteger(prop::CDCIDescriptor_HorizontalSubsampling, subsampling);
}

HRESULT CDCIDescriptor::SetVerticalSubsampling(aafUInt32 subsampling) {
    if (subsampling != 1 && subsampling != 2) {
        return AAFRESULT_BAD_PROP;
    }
    return PutInteger(prop::CDCIDescriptor_VerticalSubsampling, subsampling);
}

}  // namespace aaf
