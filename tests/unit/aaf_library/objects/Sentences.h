// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <string>
#include <vector>

#include "tests/unit/aaf_library/objects/TransientFile.h"

namespace aaf_test {

// Sentences that the library tells while this lives.
class Sentences final : public IAAFDiagnosticOutput {
public:
    Sentences() { AAFSetDiagnosticOutput(this); }
    ~Sentences() { AAFSetDiagnosticOutput(nullptr); }
    Sentences(const Sentences&) = delete;
    Sentences& operator=(const Sentences&) = delete;
    HRESULT QueryInterface(REFIID, void**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    ULONG AddRef() override { return 1; }
    ULONG Release() override { return 1; }
    HRESULT PutString(aafCharacter_constptr sentence) override {
        all.emplace_back(sentence);
        return AAFRESULT_SUCCESS;
    }

    std::vector<std::wstring> all;
};

}  // namespace aaf_test
