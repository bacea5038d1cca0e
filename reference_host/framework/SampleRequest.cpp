// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/framework/SampleRequest.h"

namespace host {

void SampleRequest::Ask(ncfUInt32 track, ncfUInt64 sample, ncfUInt64 count) {
    track_ = track;
    sample_ = sample;
    count_ = count;
}

NCFRESULT SampleRequest::GetBuffer(INCFBuffer** buffer) {
    if (buffer == nullptr) {
        return NCF_E_POINTER;
    }
    *buffer = Ref<INCFBuffer>(buffer_).Detach();
    return NCF_OK;
}

NCFRESULT SampleRequest::GetSampleRange(ncfUInt32* track, ncfUInt64* sample, ncfUInt64* count) {
    if (track == nullptr || sample == nullptr || count == nullptr) {
        return NCF_E_POINTER;
    }
    *track = track_;
    *sample = sample_;
    *count = count_;
    return NCF_OK;
}

}  // namespace host
