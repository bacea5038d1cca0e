// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/media/SampleMapping.h"
#include "tests/support/fakes/FakeObject.h"

// A sample mapping of one track that answers nothing but what a test overrides.
class StubSampleMapping : public FakeObject<NMA::ISampleMapping> {
public:
    ncfSInt32 GetNumberOfTracks() override { return 1; }
    NCFRESULT GetNumberOfChannels(ncfUInt32, ncfUInt32*) override { return kNo; }
    NCFRESULT GetNumberOfSamples(ncfUInt32, ncfUInt64*) override { return kNo; }
    NCFRESULT GetSampleStride(ncfUInt32, ncfUInt64, ncfUInt64*) override { return kNo; }
    NCFRESULT GetSampleSize(ncfUInt32, ncfUInt64, ncfUInt64*) override { return kNo; }
    NCFRESULT GetSamplePosition(ncfUInt32, ncfUInt64, ncfUInt64*) override { return kNo; }
    NCFRESULT GetSampleTemporalOffset(ncfUInt32, ncfUInt64, ncfSInt64*) override { return kNo; }
    NCFRESULT GetSampleProperties(ncfUInt32, ncfUInt64, ncfUInt64*, ncfUInt32*) override {
        return kNo;
    }
    NCFRESULT GetSampleDependency(ncfUInt32, ncfUInt64, ncfUInt32, ncfSInt64*) override {
        return kNo;
    }
    NCFRESULT GetNumberOfEncodedUnits(ncfUInt32, ncfUInt64*) override { return kNo; }
    NCFRESULT GetEncodedUnitStride(ncfUInt32, ncfUInt64, ncfUInt64*) override { return kNo; }
    NCFRESULT GetEncodedUnitPosition(ncfUInt32, ncfUInt64, ncfUInt64*) override { return kNo; }
    NCFRESULT GetEncodedUnitSize(ncfUInt32, ncfUInt64, ncfUInt64*) override { return kNo; }
    NCFRESULT GetEncodedUnitSizeInSamples(ncfUInt32, ncfUInt64, ncfUInt64*) override { return kNo; }
    NCFRESULT GetEncodedUnitFirstSample(ncfUInt32, ncfUInt64, ncfUInt64*) override { return kNo; }
    NCFRESULT GetEncodedUnitContainingSample(ncfUInt32, ncfUInt64, ncfUInt64*) override {
        return kNo;
    }
    NCFRESULT GetNumberOfContiguousSamples(ncfUInt32, ncfUInt64, ncfSInt64*) override {
        return kNo;
    }
    NCFRESULT GetNumberOfContiguousBytes(ncfUInt32, ncfUInt64, ncfUInt64*) override { return kNo; }
    NCFRESULT GetNumberOfContiguousEncodedUnits(ncfUInt32, ncfUInt64, ncfSInt64*) override {
        return kNo;
    }
    NCFRESULT RegisterSampleRangeHint(ncfUInt32, ncfUInt64, ncfUInt64) override { return kNo; }
    NCFRESULT UnregisterSampleRangeHint(ncfUInt32, ncfUInt64, ncfUInt64) override { return kNo; }
    NCFRESULT SetStorageCallback(INCFUnknown*) override { return kNo; }

private:
    static constexpr NCFRESULT kNo = NCF_E_NOTIMPL;
};
