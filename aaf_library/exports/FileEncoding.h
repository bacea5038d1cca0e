// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/model/Unknown.h"
#include "host_interfaces/aaf/AAFFile.h"
#include "not_implemented/AAFFile.h"

namespace aaf {

// A kind of file that this library can write.
struct EncodingInfo {
    aafUID_t kind;
    const wchar_t* name;
    const wchar_t* description;
};

class FileEncoding : public Implements<Unknown, IAAFFileEncoding> {
public:
    explicit FileEncoding(const EncodingInfo& info) : info_(info) {}

    HRESULT GetName(aafCharacter* name, aafUInt32 bufSize) override;
    HRESULT GetNameBufLen(aafUInt32* bufSize) override;
    HRESULT GetDescription(aafCharacter* description, aafUInt32 bufSize) override;
    HRESULT GetDescriptionBufLen(aafUInt32* bufSize) override;
    HRESULT GetFileKind(aafUID_t* fileKind) override;

private:
    const EncodingInfo& info_;
};

// An enumerator over all of them.
HRESULT EnumerateFileEncodings(IEnumAAFFileEncodings** fileEncodings);

}  // namespace aaf
