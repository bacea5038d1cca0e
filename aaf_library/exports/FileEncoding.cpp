// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/exports/FileEncoding.h"

#include "aaf_library/model/Enumerator.h"
#include "aaf_library/model/Text.h"
#include "host_interfaces/aaf/AAFExports.h"

namespace aaf {

namespace {

const EncodingInfo kEncodings[] = {
    {kAAFFileKind_Aaf512Binary, L"AAF-512", L"Structured storage with sectors of 512 bytes"},
    {kAAFFileKind_Aaf4KBinary, L"AAF-4K", L"Structured storage with sectors of 4096 bytes"},
};

}  // namespace

HRESULT FileEncoding::GetName(aafCharacter* name, aafUInt32 bufSize) {
    return CopyText(info_.name, name, bufSize);
}

HRESULT FileEncoding::GetNameBufLen(aafUInt32* bufSize) {
    return TextSize(info_.name, bufSize);
}

HRESULT FileEncoding::GetDescription(aafCharacter* description, aafUInt32 bufSize) {
    return CopyText(info_.description, description, bufSize);
}

HRESULT FileEncoding::GetDescriptionBufLen(aafUInt32* bufSize) {
    return TextSize(info_.description, bufSize);
}

HRESULT FileEncoding::GetFileKind(aafUID_t* fileKind) {
    if (fileKind == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    *fileKind = info_.kind;
    return AAFRESULT_SUCCESS;
}

HRESULT EnumerateFileEncodings(IEnumAAFFileEncodings** fileEncodings) {
    return MakeEnumerator<IAAFFileEncoding>(
        [](std::size_t index) {
            return index < std::size(kEncodings)
                       ? RefPtr<Unknown>(new FileEncoding(kEncodings[index]))
                       : RefPtr<Unknown>();
        },
        fileEncodings);
}

}  // namespace aaf
