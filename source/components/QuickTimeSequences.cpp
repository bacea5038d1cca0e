// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/components/QuickTimeSequences.h"

namespace NMA::Impl {

NCFRESULT CreateQuickTimeSequences(INCFUnknown* host, INCFUnknown* outer, const GUID& iid,
                                   void** out) {
    return CreateInstanceOf<QuickTimeSequences>(host, outer, iid, out);
}

NCFRESULT QuickTimeSequences::InternalQueryInterface(const GUID& iid, void** out) {
    return QueryListedInterfaces<ISequences, IAAFSequences>(this, iid, out);
}

}  // namespace NMA::Impl
