// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/objects/FileDescriptor.h"
#include "not_implemented/AAFDescriptors.h"

namespace aaf {

// Essence of several kinds in one file: a descriptor for each, which it owns.
// It takes neither rate nor length from them.
class MultipleDescriptor : public Implements<FileDescriptor, IAAFMultipleDescriptor> {
public:
    HRESULT Initialize() override { return AAFRESULT_SUCCESS; }
    HRESULT CountFileDescriptors(aafUInt32* result) override;
    HRESULT AppendFileDescriptor(IAAFFileDescriptor* fileDescriptor) override;
    HRESULT PrependFileDescriptor(IAAFFileDescriptor* fileDescriptor) override;
    HRESULT InsertFileDescriptorAt(aafUInt32 index, IAAFFileDescriptor* fileDescriptor) override;
    HRESULT GetFileDescriptorAt(aafUInt32 index, IAAFFileDescriptor** fileDescriptor) override;
    HRESULT RemoveFileDescriptorAt(aafUInt32 index) override;
    HRESULT GetFileDescriptors(IEnumAAFFileDescriptors** enumerator) override;
};

}  // namespace aaf
