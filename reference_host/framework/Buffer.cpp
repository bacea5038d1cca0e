// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/framework/Buffer.h"

#include <cstring>
#include <limits>
#include <new>

namespace host {

Buffer::~Buffer() {
    Free();
}

NCFRESULT Buffer::Allocate(ncfUInt64 size, ncfUInt32 alignment) {
    const ncfUInt32 wanted = alignment == 0 ? alignof(std::max_align_t) : alignment;
    if ((wanted & (wanted - 1)) != 0) {
        return NCF_E_INVALIDARG;
    }
    if (size > static_cast<ncfUInt64>(std::numeric_limits<std::ptrdiff_t>::max())) {
        return NCF_E_OUTOFMEMORY;
    }
    if (block_ != nullptr && size <= capacity_ && alignment_ >= wanted) {
        Begin(size);
        return NCF_OK;
    }
    // Even an empty block has an address.
    const std::size_t bytes = size == 0 ? 1 : static_cast<std::size_t>(size);
    void* block = ::operator new (bytes, std::align_val_t{wanted}, std::nothrow);
    if (block == nullptr) {
        return NCF_E_OUTOFMEMORY;
    }
    Free();
    block_ = static_cast<unsigned char*>(block);
    capacity_ = bytes;
    alignment_ = wanted;
    Begin(size);
    return NCF_OK;
}

// A module may leave parts of a block as they were, so it starts cleared.
void Buffer::Begin(ncfUInt64 size) {
    size_ = size;
    state_ = 0;
    validBytes_ = 0;
    result_ = NCF_OK;
    std::memset(block_, 0, static_cast<std::size_t>(size));
}

NCFRESULT Buffer::GetBufferPointer(void** start) {
    if (start == nullptr) {
        return NCF_E_POINTER;
    }
    *start = block_;
    return block_ == nullptr ? NMA_E_NOTINITIALIZED : NCF_OK;
}

NCFRESULT Buffer::SetComplete(ncfUInt32 state, ncfUInt64 validBytes, NCFRESULT result) {
    if (validBytes > size_) {
        return NCF_E_INVALIDARG;
    }
    state_ = state;
    validBytes_ = validBytes;
    result_ = result;
    return NCF_OK;
}

void Buffer::Free() {
    if (block_ != nullptr) {
        ::operator delete (block_, std::align_val_t{alignment_});
    }
    block_ = nullptr;
    size_ = 0;
    capacity_ = 0;
}

}  // namespace host
