// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/objects/Extensions.h"

#include "aaf_library/model/ClassDefinition.h"
#include "aaf_library/model/Model.h"
#include "aaf_library/model/TypeDefinition.h"
#include "aaf_library/model/TypeFacts.h"
#include "aaf_library/model/ValueWidth.h"
#include "aaf_library/objects/Listeners.h"
#include "aaf_library/stored/MetaClosure.h"
#include "aaf_library/stored/MetaRegistration.h"
#include "aaf_library/stored/ModelTypes.h"
#include "aaf_library/stored/StoredError.h"
#include "host_interfaces/aaf/AAFResultCodes.h"

#include <algorithm>

namespace aaf {

// The way that extensions take into a file and out of it again, without the
// file between.
HRESULT CopyExtensions(Model& source, Model& target) {
    target.TellChange();
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

bool AreExtensionsCopiedAlike(Model& model) {
    const auto& classes = model.madeClasses();
    const auto& types = model.madeTypes();
    return !HasRedefinedTypes(model) &&
           std::none_of(classes.begin(), classes.end(),
                        [](const auto& definition) {
                            return definition->IsBuiltIn() && definition->IsRenamedAnywhere();
                        }) &&
           std::all_of(types.begin(), types.end(), [&model](const auto& type) {
               return type->IsBuiltIn() ? !type->IsRenamed()
                                        : stored::IsStorable(FactsOf(*type), model);
           });
}

}  // namespace aaf
