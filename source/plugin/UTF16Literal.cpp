// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/plugin/UTF16Literal.h"

#include <cwchar>

ncfUTF16LiteralToUTF16::ncfUTF16LiteralToUTF16(ncfStringLiteralRef rhs) : mStrngRef(rhs) {
    if (!mStrngRef) {
        throw "ncfUTF16LiteralToUTF16::ncfUTF16LiteralToUTF16(ncfStringLiteralRef rhs) failed with "
              "rhs == 0!";
    }
    ConvertStringRefToUTF16();
}

const ncfUTF16* ncfUTF16LiteralToUTF16::GetUTF16() const {
    if (!mUTF16) {
        throw "ncfUTF16LiteralToUTF16: mUTF16 was NULL!";
    }
    return mUTF16;
}

void ncfUTF16LiteralToUTF16::ConvertStringRefToUTF16() {
    if (!mStrngRef) {
        throw "ncfUTF16LiteralToUTF16::ConvertStringRefToUTF16 failed with mStrngRef == 0!";
    }
    if constexpr (sizeof(wchar_t) == sizeof(ncfUTF16)) {
        mUTF16 = reinterpret_cast<const ncfUTF16*>(mStrngRef);
    } else {
        const std::size_t length = std::wcslen(mStrngRef);
        converted_ = std::make_unique<ncfUTF16[]>(2 * length + 1);
        std::size_t units = 0;
        for (std::size_t i = 0; i < length; ++i) {
            const auto c = static_cast<ncfUTF32>(mStrngRef[i]);
            if (c < 0x10000) {
                converted_[units++] = static_cast<ncfUTF16>(c);
            } else {
                converted_[units++] = static_cast<ncfUTF16>(0xD800 + ((c - 0x10000) >> 10));
                converted_[units++] = static_cast<ncfUTF16>(0xDC00 + ((c - 0x10000) & 0x3FF));
            }
        }
        mUTF16 = converted_.get();
    }
}
