// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "source/plugin/Rational.h"

// What the retriever asks of a picture, in the order in which it asks. Clips answer
// through ClipPicture.
class DescribedPicture {
public:
    virtual NCFRESULT GetDataFormat(ncfUInt32* dataFormat) const = 0;
    virtual NCFRESULT GetVendor(ncfUInt32* vendor) const = 0;
    virtual NCFRESULT GetEncodedWidthAndHeight(ncfUInt32* width, ncfUInt32* height) const = 0;
    // NCF_E_PARAMETERNOTAVAILABLE when the movie does not say.
    virtual NCFRESULT GetNMAFrameLayout(ncfUInt32* frameLayout) const = 0;
    virtual NCFRESULT GetEditRate(Rational* editRate) const = 0;
    // The id itself, of movies that carry one. Asked where no code led to an id.
    virtual NCFRESULT GetNivoResolution(ncfUInt32* vcID) const = 0;

protected:
    ~DescribedPicture() = default;
};
