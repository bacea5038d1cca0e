// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <memory>

#include "host_interfaces/header_parser/SampleTable.h"
#include "reference_host/framework/Component.h"
#include "reference_host/header_parser/SampleTable.h"

namespace header_parser {

// The interface's side of a sample table: samples count from one, and numbers
// that the table lacks are refused.
class SampleTableObject final : public host::Component<IQTSampleTable> {
public:
    explicit SampleTableObject(std::shared_ptr<const SampleTable> table)
        : table_(std::move(table)) {}

    NCFRESULT GetNumSamples(ncfUInt64* numSamples) override;
    NCFRESULT GetDataOffset(ncfUInt64 sample, ncfUInt64* position) override;
    NCFRESULT GetSampleFlags(ncfUInt64 sample, ncfUInt32* flags) override;
    NCFRESULT GetNextDiscontiguousDataAttributeChange(ncfUInt64 sample, ncfUInt64* next) override;
    NCFRESULT GetDataSizePerSample(ncfUInt64 sample, ncfUInt32* bytes) override;
    NCFRESULT GetDisplayOffset(ncfUInt64 sample, ncfSInt64* offset) override;
    NCFRESULT GetDecodeDuration(ncfUInt64 sample, ncfSInt64* duration) override;
    NCFRESULT GetMaxDataSizeInBytes(ncfUInt32* bytes) override;
    NCFRESULT GetHasOutOfOrderFrameDependencies(ncfBool* outOfOrder) override;
    NCFRESULT GetChunkFromTheMiddle(ncfUInt64* position, ncfUInt64* size) override;
    NCFRESULT DisplayTimeToFrameNum(ncfUInt64 displayTime, ncfUInt64* sample) override;

private:
    // Calls read(number from zero) for a sample that there is.
    template <typename Value, typename Read>
    NCFRESULT ForSample(ncfUInt64 sample, Value* out, Read read) const;

    std::shared_ptr<const SampleTable> table_;
};

}  // namespace header_parser
