// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/objects/FileDescriptor.h"

namespace aaf {

void FileDescriptor::SetDefaults() {
    EssenceDescriptor::SetDefaults();
    PutStruct(prop::FileDescriptor_SampleRate, aafRational_t{0, 0});
    PutInteger(prop::FileDescriptor_Length, 0);
}

HRESULT FileDescriptor::GetLinkedSlotID(aafUInt32* linkedSlotID) {
    return ReadInteger(prop::FileDescriptor_LinkedSlotID, linkedSlotID);
}

}  // namespace aaf
