// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#pragma once

#include <string>
#include <vector>

#include "tests/support/fakes/StubClip.h"

// A clip that says of its picture what a test wants, and fails where it wants.
class FakeClip final : public StubClip {
public:
    // What the clip says.
    ncfUInt32 code = 0;
    ncfUInt32 vendor = 0;
    ncfUInt32 width = 0;
    ncfUInt32 height = 0;
    ncfUInt32 layout = 0;
    Rational rate{25, 1};
    ncfUInt32 resolution = 0;
    // Results of the questions.
    NCFRESULT codeResult = NCF_OK;
    NCFRESULT vendorResult = NCF_OK;
    NCFRESULT sizeResult = NCF_OK;
    NCFRESULT layoutResult = NCF_OK;
    NCFRESULT rateResult = NCF_OK;
    NCFRESULT resolutionResult = NCF_E_PARAMETERNOTAVAILABLE;
    // The questions in order.
    mutable std::vector<std::string> asked;

    NCFRESULT GetNMAFrameLayout(ncfUInt32* frameLayout) const override {
        return Answer("GetNMAFrameLayout", layoutResult, frameLayout, layout);
    }
    NCFRESULT GetDataFormat(ncfUInt32* dataFormat) const override {
        return Answer("GetDataFormat", codeResult, dataFormat, code);
    }
    NCFRESULT GetVendor(ncfUInt32* out) const override {
        return Answer("GetVendor", vendorResult, out, vendor);
    }
    NCFRESULT GetNivoResolution(ncfUInt32* vcID) const override {
        return Answer("GetNivoResolution", resolutionResult, vcID, resolution);
    }
    NCFRESULT GetEditRate(Rational* editRate) const override {
        return Answer("GetEditRate", rateResult, editRate, rate);
    }
    NCFRESULT GetEncodedWidthAndHeight(ncfUInt32* outWidth, ncfUInt32* outHeight) override {
        Answer("GetEncodedWidthAndHeight", sizeResult, outWidth, width);
        if (sizeResult >= 0) {
            *outHeight = height;
        }
        return sizeResult;
    }

private:
    template <class T>
    NCFRESULT Answer(const char* name, NCFRESULT result, T* out, const T& value) const {
        asked.push_back(name);
        if (result >= 0) {
            *out = value;
        }
        return result;
    }
};
