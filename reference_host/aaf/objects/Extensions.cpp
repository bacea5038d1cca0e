// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/aaf/objects/Extensions.h"

#include "host_interfaces/aaf/AAFResultCodes.h"
#include "reference_host/aaf/objects/Listeners.h"
#include "reference_host/aaf/stored/MetaClosure.h"
#include "reference_host/aaf/stored/MetaRegistration.h"
#include "reference_host/aaf/stored/StoredError.h"

namespace aaf {

// The way that extensions take into a file and out of it again, without the
// file between.
HRESULT CopyExtensions(Model& source, Model& target) {
    try {
        stored::MetaClosure closure(source);
        closure.addExtensions();
        const stored::MetaRegistration registration(closure.records(), target);
        return AAFRESULT_SUCCESS;
    } catch (const stored::StoredError& problem) {
        TellDiagnostic(problem.what());
        return AAFRESULT_INVALID_OBJ;
    }
}

}  // namespace aaf
