// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/aaf/AAFPlainTypes.h"
#include "host_interfaces/framework/Compiler.h"

// The published AAF interfaces: names, ids, operations and their order are those of
// the published library, because any build of it may stand behind them. What holds
// for all of them, and each header then says for its family:
//
//   Who          The AAF library implements them; module and host call them, the
//                module to describe a clip, the host to read, print and save what
//                the module described. Neither implements one, except the listeners
//                in AAFFile.h. Objects of two libraries never meet in one file.
//   When         From the library's loading to the end of the process. An object is
//                made by a dictionary or a class definition, needs its Initialize
//                where its interface has one, and is then part of one file.
//   Threads      One thread at a time for a file and for all of its objects;
//                different files may be used on different threads. Reference
//                counts are not guarded either.
//   References   A pointer that comes out carries one reference, which the caller
//                releases; pointers that go in are borrowed, and who keeps one takes
//                a reference. Objects held outside stay usable when their file is
//                closed. After a failure an output may be untouched: set it to null
//                before the call.
//   Texts        Zero-terminated characters of 16 bits. Who wants one asks for its
//                length (...BufLen, in bytes with the terminator) and gives a
//                buffer of that size.
//   Results      HRESULT: 0 is success, AAFResultCodes.h lists the failures. An
//                operation that the library lacks gives AAFRESULT_NOT_IMPLEMENTED.
//   Arguments    Have the published names; units are those of the AAF object model:
//                lengths and positions in edit units, rates as fractions a second.
//
// The usual id of the root of them all, which the published library answers on Windows
// only, and the one of all zero bytes that it answers elsewhere.
inline constexpr GUID IID_IUnknown_COM = ncfGuid("00000000-0000-0000-C000-000000000046");
inline constexpr GUID IID_IUnknown_Zero = ncfGuid("00000000-0000-0000-0000-000000000000");

// Windows' own headers have the same interface by the same name. Whichever comes first
// declares it, and the other takes what is there.
#ifndef __IUnknown_INTERFACE_DEFINED__
#ifdef _WIN32
#define __IUnknown_INTERFACE_DEFINED__
using LPUNKNOWN = struct IUnknown*;
inline constexpr GUID IID_IUnknown = IID_IUnknown_COM;
#else
inline constexpr GUID IID_IUnknown = IID_IUnknown_Zero;
#endif

// Root of them all: finds an object's other interfaces and counts who holds it.
struct NCF_UUID("00000000-0000-0000-C000-000000000046") IUnknown {
    virtual HRESULT QueryInterface(REFIID iid, void** out) = 0;
    virtual ULONG AddRef() = 0;
    virtual ULONG Release() = 0;

protected:
    ~IUnknown() = default;
};
#endif

constexpr const GUID& aafIdOf(const IUnknown*) {
#ifdef _WIN32
    return IID_IUnknown_COM;
#else
    return IID_IUnknown_Zero;
#endif
}

// Used by DllGetClassObject only. Windows' headers have it without the ending.
inline constexpr GUID IID_IClassFactory_COM = ncfGuid("00000001-0000-0000-C000-000000000046");
#ifndef _WIN32
inline constexpr GUID IID_IClassFactory = IID_IClassFactory_COM;
#endif
