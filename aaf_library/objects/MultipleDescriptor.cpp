// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/objects/MultipleDescriptor.h"

#include "aaf_library/model/Enumerator.h"

namespace aaf {

HRESULT MultipleDescriptor::CountFileDescriptors(aafUInt32* result) {
    return ReadCount(prop::MultipleDescriptor_FileDescriptors, result);
}

HRESULT MultipleDescriptor::AppendFileDescriptor(IAAFFileDescriptor* fileDescriptor) {
    return AppendObject(prop::MultipleDescriptor_FileDescriptors, fileDescriptor);
}

HRESULT MultipleDescriptor::PrependFileDescriptor(IAAFFileDescriptor* fileDescriptor) {
    return PrependObject(prop::MultipleDescriptor_FileDescriptors, fileDescriptor);
}

HRESULT MultipleDescriptor::InsertFileDescriptorAt(aafUInt32 index,
                                                   IAAFFileDescriptor* fileDescriptor) {
    return InsertObjectAt(prop::MultipleDescriptor_FileDescriptors, index, fileDescriptor);
}

HRESULT MultipleDescriptor::GetFileDescriptorAt(aafUInt32 index,
                                                IAAFFileDescriptor** fileDescriptor) {
    return ReadObjectAt(prop::MultipleDescriptor_FileDescriptors, index, fileDescriptor);
}

HRESULT MultipleDescriptor::RemoveFileDescriptorAt(aafUInt32 index) {
    return RemoveObjectAt(prop::MultipleDescriptor_FileDescriptors, index);
}

HRESULT MultipleDescriptor::GetFileDescriptors(IEnumAAFFileDescriptors** enumerator) {
    return MakeEnumerator<IAAFFileDescriptor>(this, prop::MultipleDescriptor_FileDescriptors,
                                              enumerator);
}

}  // namespace aaf
