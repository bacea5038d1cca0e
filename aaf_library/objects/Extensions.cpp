// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/objects/Extensions.h"

#include "aaf_library/objects/Listeners.h"
#include "aaf_library/stored/MetaClosure.h"
#include "aaf_library/stored/MetaRegistration.h"
#include "aaf_library/stored/StoredError.h"
#include "host_interfaces/aaf/AAFResultCodes.h"

namespace aaf {

// The way that extensions take into a file and out of it again, without the
// file between.
HRESULT CopyExtensions(Model& source, Model& target) {
    try {
        stored::MetaClosure closure(source, stored::MetaClosure::BuiltIn::LeftOut);
        closure.AddExtensions();
        const stored::MetaRegistration registration(closure.records(), target,
                                                    stored::MetaRegistration::Words::OfAnother);
        return AAFRESULT_SUCCESS;
    } catch (const stored::StoredError& problem) {
        TellDiagnostic(problem.what());
        return AAFRESULT_INVALID_OBJ;
    }
}

}  // namespace aaf
