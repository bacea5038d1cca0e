// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/framework/AVBuffer.h"
#include "reference_host/framework/Buffer.h"
#include "reference_host/framework/Component.h"
#include "reference_host/util/Ref.h"

namespace host {

// A request for samples as a module gets it. The program that makes it keeps it
// for as long as it asks for samples of one kind: its buffer's memory is then
// used again and again.
class SampleRequest final : public Component<INCFAVBuffer> {
public:
    SampleRequest() : buffer_(MakeRef<Buffer>()) {}

    // What the next call of a sample provider is to deliver.
    void Ask(ncfUInt32 track, ncfUInt64 sample, ncfUInt64 count);
    const Buffer& buffer() const { return *buffer_; }

    NCFRESULT GetBuffer(INCFBuffer** buffer) override;
    NCFRESULT GetSampleRange(ncfUInt32* track, ncfUInt64* sample, ncfUInt64* count) override;

private:
    Ref<Buffer> buffer_;
    ncfUInt32 track_ = 0;
    ncfUInt64 sample_ = 0;
    ncfUInt64 count_ = 0;
};

}  // namespace host
