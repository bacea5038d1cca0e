// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/clips/NativeCodecs.h"

#include <cstring>

#include "source/plugin/ResultChecks.h"

namespace {

constexpr ncfUInt32 kCodecWindowsRaw = 0x57524157;  // 'WRAW'
constexpr ncfUInt32 kCodecAppleRaw = 0x72617720;    // 'raw '

}  // namespace

bool IsNativeQuickTimeCodec(ncfUInt32 codecType) {
    return codecType == kCodecWindowsRaw || codecType == kCodecAppleRaw;
}

NCFRESULT GetNativeQuickTimeCodecName(ncfUInt32 codecType, NCFSmartPtr<INCFString>& codecName) {
    NCF_FUNCTION("BaseClip::GetNativeQuickTimeCodecName");
    const char* codecTypeStr = codecType == kCodecWindowsRaw ? "Windows RAW Codec"
                               : codecType == kCodecAppleRaw ? "Apple RAW Codec"
                                                             : "Unknown Codec";
    NCF_RETURN_TEXT(
        "codecName->AssignUTF8(kNCFUTF8, (ncfUTF8*)codecTypeStr, (ncfUInt32)strlen(codecTypeStr))",
        codecName->AssignUTF8(kNCFUTF8, codecTypeStr,
                              static_cast<ncfUInt32>(std::strlen(codecTypeStr))));
    return NCF_OK;
}
