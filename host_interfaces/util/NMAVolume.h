// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/framework/String.h"
#include "host_interfaces/util/NMAUtilExport.h"

// One folder of a file system, for scans and for the identity of its volume.
// A folder that can't be read has no files. The module makes one for each question
// about a folder. One object belongs to one thread at a time.
class NMAUTIL_API NMAVolume {
public:
    explicit NMAVolume(INCFString* folder);  // borrowed; null: the empty path
    ~NMAVolume();                            // ends the search
    NMAVolume(const NMAVolume&) = delete;
    NMAVolume& operator=(const NMAVolume&) = delete;

    // The first, then each next name that matches `pattern` ("*.mov"): bare names
    // of files and of links to files, in the order of the file system. The caller
    // owns the string; null at the end. Case follows the file system. `handle`
    // keeps the place between the calls: the first sets it.
    INCFString* GetFirstFile(const char* pattern, void*& handle);
    INCFString* GetNextFile(void*& handle);

    // Low 32 bits of the identifier that the file system reports, 0 when none.
    ncfUInt32 GetVolumeSerialNumber();
    // Name of the volume, never null; the caller owns the reference. Off
    // Windows the last component of the mount point.
    INCFString* GetVolumeLabel();
    // 0 unknown, 2 removable, 3 fixed, 4 network.
    ncfUInt32 GetVolumeType();
    // Last write of the named file in the folder, seconds from 1970-01-01 UTC;
    // 0 when it can't be read.
    ncfUInt64 GetModificationDate(INCFString* name);

private:
    struct State;
    State* state_;
};
