// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/objects/FileDescriptor.h"

#include "aaf_library/objects/Definitions.h"
#include "host_interfaces/aaf/AAFClassIds.h"
#include "host_interfaces/aaf/AAFDefinitions.h"

namespace aaf {

void FileDescriptor::SetDefaults() {
    EssenceDescriptor::SetDefaults();
    PutStruct(prop::FileDescriptor_SampleRate, aafRational_t{0, 0});
    PutInteger(prop::FileDescriptor_Length, 0);
}

HRESULT FileDescriptor::SetLength(aafLength_t length) {
    return PutInteger(prop::FileDescriptor_Length, length);
}

HRESULT FileDescriptor::GetLength(aafLength_t* length) {
    return ReadInteger(prop::FileDescriptor_Length, length);
}

HRESULT FileDescriptor::SetCodecDef(IAAFCodecDef* codecDef) {
    return PutDefinition(*this, prop::FileDescriptor_CodecDefinition, AUID_AAFCodecDef, codecDef,
                         AAFRESULT_INVALID_OBJ);
}

HRESULT FileDescriptor::GetCodecDef(IAAFCodecDef** codecDef) {
    return ReadWeak(prop::FileDescriptor_CodecDefinition, codecDef);
}

HRESULT FileDescriptor::SetSampleRate(aafRational_constref rate) {
    return PutStruct(prop::FileDescriptor_SampleRate, rate);
}

HRESULT FileDescriptor::GetSampleRate(aafRational_t* rate) {
    return ReadStruct(prop::FileDescriptor_SampleRate, rate);
}

HRESULT FileDescriptor::SetContainerFormat(IAAFContainerDef* format) {
    return PutDefinition(*this, prop::FileDescriptor_ContainerFormat, AUID_AAFContainerDef, format,
                         AAFRESULT_INVALID_OBJ);
}

HRESULT FileDescriptor::GetContainerFormat(IAAFContainerDef** format) {
    return ReadWeak(prop::FileDescriptor_ContainerFormat, format);
}

HRESULT FileDescriptor::SetLinkedSlotID(aafUInt32 linkedSlotID) {
    return PutInteger(prop::FileDescriptor_LinkedSlotID, linkedSlotID);
}

HRESULT FileDescriptor::GetLinkedSlotID(aafUInt32* linkedSlotID) {
    return ReadInteger(prop::FileDescriptor_LinkedSlotID, linkedSlotID);
}

}  // namespace aaf
