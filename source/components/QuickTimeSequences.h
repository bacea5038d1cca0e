// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/media/Sequences.h"
#include "source/plugin/CNCFUnknown.h"

namespace NMA::Impl {

// Movies have no sequences, and both interfaces say so. The creation function is
// there, but no class id reaches it: neither a host nor the module makes one.
class QuickTimeSequences final : public CNCFComponent<ISequences, IAAFSequences> {
public:
    explicit QuickTimeSequences(INCFUnknown* outer) : CNCFComponent(outer) {}

    NCFRESULT InternalQueryInterface(const GUID& iid, void** out) override;

    NCFRESULT GetSequenceCount() override { return 0; }
    NCFRESULT GetSequence(ncfSInt32, INCFUnknown**) override { return NCF_E_NOTIMPL; }
    NCFRESULT GetAAFSequenceCount() override { return 0; }
    NCFRESULT GetAAFSequence(ncfSInt32, INCFUnknown**) override { return NCF_E_NOTIMPL; }
};

NCFRESULT CreateQuickTimeSequences(INCFUnknown* host, INCFUnknown* outer, const GUID& iid,
                                   void** out);

}  // namespace NMA::Impl
