// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/model/Object.h"

namespace aaf {

// Makes a weak reference to the definition that this object's own dictionary
// holds under the id of the one given, which may be another object, of another
// file even. `unknown` is the answer when the dictionary has none.
HRESULT PutDefinition(Object& object, const PropertyKey& key, const GUID& definitionClass,
                      IUnknown* definition, HRESULT unknown);

// The id of a definition object of this library; false for anything else.
bool ReadDefinitionId(IUnknown* definition, aafUID_t& id);

}  // namespace aaf
