// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/framework/ComponentFactory.h"
#include "host_interfaces/util/NMALogger.h"
#include "host_interfaces/util/NMAString.h"

// Functions of the utility library, which is linked to the module and loaded with
// it. The module calls them between NCFStartup and NCFShutdown, on any thread; they
// keep nothing that they are given but the factory. A string that comes out belongs
// to the caller.

// Start and stop of the library: from the one to the other it keeps a reference to
// the host's factory, by which it makes strings. The module's NCFStartup and
// NCFShutdown call them. Not counted: each may come twice or alone.
NMAUTIL_API NCFRESULT NMAInitialize(INCFComponentFactory* factory);
NMAUTIL_API NCFRESULT NMATerminate();

// Writes the name of a module and where it was loaded from, level 8.
NMAUTIL_API void LogVersionInfo(NMALogger* logger, const char* name, const NMAString& modulePath);

// The last component of a path without its last extension, at either slash.
NMAUTIL_API NCFRESULT NMASplitPath(INCFString* path, INCFString** name);

// A file URL by RFC 8089 over the UTF-8 bytes of an absolute path; all but
// unreserved characters (RFC 3986 section 2.3) and "/" is escaped. Relative
// paths are taken from the working folder.
NMAUTIL_API NCFRESULT MakeURLPathFromFilePath(INCFString* path, INCFString** url);

// A digest of sixteen bytes; the same bytes give the same digest on every
// machine. Finish frees the state on every road and sets it to null; after a
// failed AddData it is still to be called.
NMAUTIL_API NCFRESULT GenerateUMIDFromData_Begin(void** state);
NMAUTIL_API NCFRESULT GenerateUMIDFromData_AddData(void** state, ncfUInt32 size,
                                                   const unsigned char* data);
NMAUTIL_API NCFRESULT GenerateUMIDFromData_Finish(void** state, GUID* uid);

// Frame count of a timecode address (SMPTE ST 12-1). Drop frame counts only at
// 30, 60 and 120 frames per second and is ignored elsewhere. NCF_E_INVALIDARG
// for 0 frames per second or a null output, which stays untouched.
NMAUTIL_API NCFRESULT ConvertTCToFrames(ncfUInt32 hours, ncfUInt32 minutes, ncfUInt32 seconds,
                                        ncfUInt32 frames, ncfUInt32 fps, bool dropFrame,
                                        ncfUInt32* out);
// Frames in 24 hours of timecode at that rate.
NMAUTIL_API ncfUInt32 GetMaxDuration(ncfUInt32 fps, bool dropFrame);
