// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/framework/String.h"

#include "tests/support/fakes/FakeHost.h"

INCFString* MakeHostString(const std::string& utf8) {
    INCFString* string = nullptr;
    host::GiveString(std::string_view(utf8), &string);
    return string;
}

std::string TextOf(INCFString* string) {
    if (!string) {
        return {};
    }
    INCFString* copy = nullptr;
    if (string->ConvertCopy(kNCFUTF8, &copy) < 0) {
        return {};
    }
    char* raw = nullptr;
    copy->GetRawUTF8(&raw);
    const std::string text = raw ? raw : "";
    copy->Release();
    return text;
}
