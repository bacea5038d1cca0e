// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/framework/Unknown.h"

namespace NMA {

// Lists of sequences; this family of media has none, so both interfaces are empty
// for every host. Implemented by the module (QuickTimeSequences), which registers no
// component for it: today nobody makes or calls one.

// The sequences of a folder.
struct ISequences : INCFUnknown {
    virtual NCFRESULT GetSequenceCount() = 0;                               // 3: the value, 0
    virtual NCFRESULT GetSequence(ncfSInt32 index, INCFUnknown** out) = 0;  // 4. NCF_E_NOTIMPL

protected:
    ~ISequences() = default;
};

// The same, each described as an in-memory AAF file.
struct IAAFSequences : INCFUnknown {
    virtual NCFRESULT GetAAFSequenceCount() = 0;                               // 3: the value, 0
    virtual NCFRESULT GetAAFSequence(ncfSInt32 index, INCFUnknown** out) = 0;  // 4. NCF_E_NOTIMPL

protected:
    ~IAAFSequences() = default;
};

inline constexpr GUID IID_ISequences = ncfGuid("0D6E5A31-7C42-4B8E-9A57-4F83B1C0E206");
inline constexpr GUID IID_IAAFSequences = ncfGuid("84C2F1B7-5E0D-4A36-B1F8-6D20A79C3E07");
constexpr const GUID& ncfIdOf(const ISequences*) {
    return IID_ISequences;
}
constexpr const GUID& ncfIdOf(const IAAFSequences*) {
    return IID_IAAFSequences;
}

}  // namespace NMA
