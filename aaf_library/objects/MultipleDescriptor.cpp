// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/objects/MultipleDescriptor.h"

namespace aaf {

HRESULT MultipleDescriptor::GetFileDescriptors(IEnumAAFFileDescriptors** enumerator) {
    return MakeEnumerator<IAAFFileDescriptor>(this, prop::MultipleDescriptor_FileDescriptors,
                                              enumerator);
}

}  // namespace aaf
