// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <memory>

#include "host_interfaces/framework/Types.h"

using ncfStringLiteralRef = const wchar_t*;

// A wide constant of the module and its UTF-16 form, converted at once. Where
// wide characters are 16 bits the form is the literal itself, elsewhere a copy.
// Failures are thrown as text, since they are mistakes of the program.
class ncfUTF16LiteralToUTF16 {
public:
    explicit ncfUTF16LiteralToUTF16(ncfStringLiteralRef rhs);

    // Zero-terminated, valid as long as this object.
    const ncfUTF16* GetUTF16() const;
    ncfStringLiteralRef GetLiteral() const { return mStrngRef; }

    // For tests: an object whose text was never converted.
    struct Unconverted {};
    ncfUTF16LiteralToUTF16(ncfStringLiteralRef rhs, Unconverted) : mStrngRef(rhs) {}
    void ConvertStringRefToUTF16();

private:
    ncfStringLiteralRef mStrngRef;
    const ncfUTF16* mUTF16 = nullptr;
    std::unique_ptr<ncfUTF16[]> converted_;
};
