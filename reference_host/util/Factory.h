// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/framework/ComponentFactory.h"
#include "host_interfaces/framework/String.h"
#include "reference_host/util/Ref.h"

// The component factory that NMAInitialize was given, the library's only way
// to the host.
namespace host::util {

// Keeps a reference to `factory` in place of the one before; null lets go.
void KeepFactory(INCFComponentFactory* factory);

// A new string of the host; NMA_E_NOTINITIALIZED without a factory.
NCFRESULT CreateHostString(Ref<INCFString>& out);

}  // namespace host::util
