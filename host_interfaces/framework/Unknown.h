// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/framework/Guid.h"
#include "host_interfaces/framework/ResultCodes.h"

// Rules of the border. They hold for every interface of the framework; where an
// interface differs, its comment says so.
//
//   References   An interface pointer that comes out carries one reference, which
//                the caller releases; on failure it is null. An interface that
//                goes in is borrowed for the call: who keeps it takes a reference.
//   Data         Text, numbers and memory that go in are read or copied during
//                the call. Outputs are not null unless the operation says so.
//   Threads      Calls come on any thread, but an object serves one at a time.
//                The three operations below may be called on several at once.
//   Time         Objects of a module are made and used between its NCFStartup and
//                its NCFShutdown (PluginEntry.h); objects of the host outlive that.
//   Places       A number at an operation is its place in the table, from 0. A
//                Reserved operation keeps a place: nobody calls it, and the
//                interface itself answers NCF_E_NOTIMPL.
//   Arguments    `reserved` arguments are passed as 0 or null and ignored.
//   Exceptions   None leaves an operation, except the two that say so: in IMediaContainer
//                and in UTIL::INCFSaxDocumentHandler.

// Root of every interface: finds the object's other interfaces, and counts who
// holds it. Implemented by every object of host and module; called by both.
struct INCFUnknown {
    // 0. Gives the interface `iid` of the object, with a new reference.
    // NCF_E_NOINTERFACE and null when it has none. IID_INCFUnknown gives the same
    // pointer on every road to the object.
    virtual NCFRESULT QueryInterface(const GUID& iid, void** out) = 0;
    // 1, 2. Take and give back one reference; both answer the new count. The object
    // ends with the last.
    virtual ncfUInt32 AddRef() = 0;
    virtual ncfUInt32 Release() = 0;

protected:
    ~INCFUnknown() = default;  // no place in the table: objects end by Release
};

inline constexpr GUID IID_INCFUnknown = ncfGuid("00000000-0000-0000-C000-000000000046");
constexpr const GUID& ncfIdOf(const INCFUnknown*) {
    return IID_INCFUnknown;
}
