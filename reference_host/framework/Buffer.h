// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/framework/Buffer.h"
#include "reference_host/framework/Component.h"

namespace host {

// A block of memory that a module fills for the host, and what it said when it
// was done. Its memory is kept from one Allocate to the next, so a buffer that
// is used for frame after frame asks the system for memory once.
class Buffer final : public Component<INCFBuffer> {
public:
    ~Buffer() override;

    // `alignment` is 0 or a power of two. A second call throws the former
    // content and what was said of it away.
    NCFRESULT Allocate(ncfUInt64 size, ncfUInt32 alignment) override;
    NCFRESULT GetBufferPointer(void** start) override;
    // More valid bytes than there are: NCF_E_INVALIDARG, nothing recorded.
    NCFRESULT SetComplete(ncfUInt32 state, ncfUInt64 validBytes, NCFRESULT result) override;

    const unsigned char* bytes() const { return block_; }
    // What the buffer could hold without asking the system again.
    ncfUInt64 capacity() const { return capacity_; }
    ncfUInt64 size() const { return size_; }
    bool isComplete() const { return state_ == kNCFBuffer_Complete; }
    ncfUInt32 state() const { return state_; }
    ncfUInt64 validBytes() const { return validBytes_; }
    NCFRESULT result() const { return result_; }

private:
    void Free();
    void Begin(ncfUInt64 size);

    unsigned char* block_ = nullptr;
    ncfUInt64 size_ = 0;
    ncfUInt64 capacity_ = 0;
    ncfUInt32 alignment_ = 0;
    ncfUInt32 state_ = 0;
    ncfUInt64 validBytes_ = 0;
    NCFRESULT result_ = NCF_OK;
};

}  // namespace host
