// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/aaf/AAFMetaDefinitions.h"
#include "host_interfaces/aaf/AAFTypeDefinitions.h"
#include "source/aaf/AAFSmartPointer.h"
#include "source/plugin/ResultChecks.h"

namespace NMA::Impl {

// The definition of an optional property, registered on the class if it is not
// there yet: a dictionary refuses the same property a second time. Throws the
// library's failure.
inline IAAFSmartPointer<IAAFPropertyDef> RequireOptionalProperty(
    const IAAFSmartPointer<IAAFClassDef>& classDef, const aafUID_t& id, const aafCharacter* name,
    const IAAFSmartPointer<IAAFTypeDef>& type) {
    IAAFSmartPointer<IAAFPropertyDef> property;
    if (classDef->LookupPropertyDef(id, &property) < 0) {
        ThrowIfFailed(classDef->RegisterOptionalPropertyDef(id, name, type, &property));
    }
    return property;
}

}  // namespace NMA::Impl
