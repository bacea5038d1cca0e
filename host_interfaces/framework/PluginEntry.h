// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/framework/Compiler.h"
#include "host_interfaces/framework/ComponentFactory.h"
#include "host_interfaces/framework/Definitions.h"

// The life of a module
// --------------------
// A module is a shared library with the six functions below, with C linkage. The
// host calls them, and the order is the host's promise:
//
//   load        the system maps the file; the host finds all six functions
//   register    NCFRegisterPlugin once, NCFRegisterComponent for each component
//   start       NCFStartup
//   create      NCFGetClassFactory, INCFClassFactory::CreateInstance    ┐ any number,
//   use         calls to the objects                                    ┘ any order
//   unload?     NCFCanUnloadNow, until it gives NCF_OK
//   shut down   NCFShutdown
//   unmap       the host gives the library back to the system
//
// Load. A file that lacks one of the six is no module, and nothing of it has been
// called yet. The module does no work while it is mapped: there is no host yet
// whose services it could use.
//
// Register. The module creates a definition object through the host's component
// factory, fills it in and hands it over; the host owns it. The plug-in's definition
// comes first, because it tells how many components there are: `index` is below that
// number, and any other gives NCF_E_INVALIDARG. Both functions use nothing but their
// arguments, so they work before NCFStartup: a host may remember what they gave and
// skip them the next time, and a module that it does not want is never started.
//
// Start. NCFStartup takes the component factory from the host, starts the utility
// library with it, finds the folder of the module's own file, where the data files
// are, and starts the log. It comes before the first object, because every object
// makes strings and writes logs. When it fails it leaves what it has done;
// NCFShutdown takes that back, so a host calls it after a failed start too.
//
// Create. Only now does the host offer the components to others: an entry in its
// table that leads to the class factory. NCFGetClassFactory makes a new factory for
// each call, and the caller owns it. CreateInstance makes the object, gives it the
// host, from which it takes its services, and asks it for the wanted interface; when
// any of this fails, the object is gone and the output is null. A class without a
// factory gives NCF_CLASS_E_CLASSNOTAVAILABLE, although its component is registered.
//
// Use. Objects are independent: each is one thread's at a time (Unknown.h), and the
// module starts no thread.
//
// Unload? NCFCanUnloadNow answers NCF_OK when no object and no class factory of the
// module is alive, else NCF_E_FAIL. It only asks: a host may ask at any time, and go
// on as before after a refusal. It comes before NCFShutdown, because objects that
// are alive still use what that takes away. After NCF_OK the host takes the
// components out of its table, so that nobody makes an object meanwhile.
//
// Shut down. NCFShutdown forgets the folder and the data files, writes a last line
// and stops the log; the utility library comes last, because everything before it
// may use it. It always gives NCF_OK. The module then holds nothing of the host, and
// may be started again. A host that has to end while objects are alive shuts down too, but
// does not unmap: the objects' code must stay.
//
// Unmap. NCFStartup has added a reference to the library, so a module that was
// started stays mapped until the process ends, and its globals with it. No host may
// count on the file being free.
//
// Threads. None of the six takes a lock. While one thread is in NCFStartup or
// NCFShutdown no other may be in any of the six or in an object of the module. The
// rest may be called on several threads at once. No exception leaves a function.
//
// A null `host` or output gives NCF_E_POINTER in the first two functions and
// NCF_E_INVALIDARG in the next two. NCFStartup and NCFShutdown are not counted: each
// may come twice.
#define NCF_PLUGIN_EXPORT extern "C" NCF_EXPORT

// The types of the six functions. `host` is the host unknown, borrowed for the call.
using NCFRegisterPluginFunction = NCFRESULT (*)(INCFUnknown* host,
                                                INCFPluginDefinition** outDefinition);
using NCFRegisterComponentFunction = NCFRESULT (*)(INCFUnknown* host, ncfUInt32 index,
                                                   INCFComponentDefinition** outDefinition);
using NCFGetClassFactoryFunction = NCFRESULT (*)(INCFUnknown* host, const GUID& classId,
                                                 const GUID& interfaceId, void** outFactory);
using NCFCanUnloadNowFunction = NCFRESULT (*)(INCFUnknown* host);
using NCFStartupFunction = NCFRESULT (*)(INCFUnknown* host);
using NCFShutdownFunction = NCFRESULT (*)(INCFUnknown* host);
