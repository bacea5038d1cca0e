// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/model/Enumerator.h"
#include "aaf_library/objects/FileDescriptor.h"
#include "not_implemented/AAFDescriptors.h"

namespace aaf {

// Essence of several kinds in one file: a descriptor for each, which it owns.
// It takes neither rate nor length from them.
class MultipleDescriptor : public Implements<FileDescriptor, IAAFMultipleDescriptor> {
public:
    HRESULT Initialize() override { return AAFRESULT_SUCCESS; }
    HRESULT CountFileDescriptors(aafUInt32* result) override {
        return ReadCount(prop::MultipleDescriptor_FileDescriptors, result);
    }
    HRESULT AppendFileDescriptor(IAAFFileDescriptor* fileDescriptor) override {
        return AppendObject(prop::MultipleDescriptor_FileDescriptors, fileDescriptor);
    }
    HRESULT PrependFileDescriptor(IAAFFileDescriptor* fileDescriptor) override {
        return PrependObject(prop::MultipleDescriptor_FileDescriptors, fileDescriptor);
    }
    HRESULT InsertFileDescriptorAt(aafUInt32 index, IAAFFileDescriptor* fileDescriptor) override {
        return InsertObjectAt(prop::MultipleDescriptor_FileDescriptors, index, fileDescriptor);
    }
    HRESULT GetFileDescriptorAt(aafUInt32 index, IAAFFileDescriptor** fileDescriptor) override {
        return ReadObjectAt(prop::MultipleDescriptor_FileDescriptors, index, fileDescriptor);
    }
    HRESULT RemoveFileDescriptorAt(aafUInt32 index) override {
        return RemoveObjectAt(prop::MultipleDescriptor_FileDescriptors, index);
    }
    HRESULT GetFileDescriptors(IEnumAAFFileDescriptors** enumerator) override;
};

}  // namespace aaf
