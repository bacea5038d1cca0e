// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/framework/ComponentFactory.h"
#include "host_interfaces/framework/Definitions.h"

// The six functions that a module file exports, with C linkage. The host calls
// NCFRegisterPlugin once and NCFRegisterComponent for every component, then
// NCFStartup, then NCFGetClassFactory as it likes; NCFCanUnloadNow until it
// succeeds; and NCFShutdown.
#ifdef _WIN32
#define NCF_PLUGIN_EXPORT extern "C" __declspec(dllexport)
#else
#define NCF_PLUGIN_EXPORT extern "C" __attribute__((visibility("default")))
#endif

using NCFRegisterPluginFunction = NCFRESULT (*)(INCFUnknown* host,
                                                INCFPluginDefinition** outDefinition);
using NCFRegisterComponentFunction = NCFRESULT (*)(INCFUnknown* host, ncfUInt32 index,
                                                   INCFComponentDefinition** outDefinition);
using NCFGetClassFactoryFunction = NCFRESULT (*)(INCFUnknown* host, const GUID& classId,
                                                 const GUID& interfaceId, void** outFactory);
using NCFCanUnloadNowFunction = NCFRESULT (*)(INCFUnknown* host);
using NCFStartupFunction = NCFRESULT (*)(INCFUnknown* host);
using NCFShutdownFunction = NCFRESULT (*)(INCFUnknown* host);
