// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/quicktime/QuickTimeProperty.h"

#include "reference_host/quicktime/CodecNames.h"

namespace host {

NCFRESULT QuickTimeProperty::CreateMovie(INCFString*) {
    return NCF_E_NOTIMPL;
}

NCFRESULT QuickTimeProperty::GetCodecPixelFormats(INCFBuffer** codes, ncfUInt32*) {
    if (codes) {
        *codes = nullptr;
    }
    return NMA_E_NOTINITIALIZED;
}

NCFRESULT QuickTimeProperty::GetCodecName(ncfUInt32 codecType, INCFString* name) {
    if (!name) {
        return NCF_E_POINTER;
    }
    std::string text;
    const NCFRESULT result = CodecName(codecType, text);
    if (result < 0) {
        return result;
    }
    return name->AssignUTF8(kNCFUTF8, text.c_str(), static_cast<ncfUInt32>(text.size()));
}

NCFRESULT QuickTimeProperty::GetCodecStorageType(ncfUInt32*) {
    return NMA_E_NOTINITIALIZED;
}

NCFRESULT QuickTimeProperty::DoesCodecSupportRGB_CCIR(ncfUInt32*) {
    return NMA_E_NOTINITIALIZED;
}

}  // namespace host
