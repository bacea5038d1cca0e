// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "source/clips/BaseClip.h"
#include "source/descriptor_data/DescribedPicture.h"

// The picture of a clip, for the retriever. Lives on the stack of one call.
class ClipPicture final : public DescribedPicture {
public:
    explicit ClipPicture(BaseClip& clip) : clip_(clip) {}

    NCFRESULT GetDataFormat(ncfUInt32* dataFormat) const override {
        return clip_.GetDataFormat(dataFormat);
    }
    NCFRESULT GetVendor(ncfUInt32* vendor) const override { return clip_.GetVendor(vendor); }
    NCFRESULT GetEncodedWidthAndHeight(ncfUInt32* width, ncfUInt32* height) const override {
        return clip_.GetEncodedWidthAndHeight(width, height);
    }
    NCFRESULT GetNMAFrameLayout(ncfUInt32* frameLayout) const override {
        return clip_.GetNMAFrameLayout(frameLayout);
    }
    NCFRESULT GetEditRate(Rational* editRate) const override { return clip_.GetEditRate(editRate); }
    NCFRESULT GetNivoResolution(ncfUInt32* vcID) const override {
        return clip_.GetNivoResolution(vcID);
    }

private:
    BaseClip& clip_;
};
