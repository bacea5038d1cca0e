// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

// Include AAF.h and the system's headers first, in any order: whoever has declared
// IUnknown, AAF interfaces are implemented, asked for and handed on alike.

class Progress final : public IAAFProgress {
public:
    HRESULT QueryInterface(REFIID iid, void** out) override {
        const bool isKnown =
            iid == aafIdOf(static_cast<IUnknown*>(nullptr)) || iid == IID_IAAFProgress;
        *out = isKnown ? this : nullptr;
        return isKnown ? 0 : -1;
    }
    ULONG AddRef() override { return 1; }
    ULONG Release() override { return 1; }
    HRESULT ProgressCallback() override { return 0; }
};
static_assert(sizeof(Progress) == sizeof(void*), "one table and nothing else");
static_assert(aafIdOf(static_cast<IUnknown*>(nullptr)).Data4[0] == 0xC0);

inline LPUNKNOWN MakeProgress() {
    static Progress progress;
    return &progress;
}
