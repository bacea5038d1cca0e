// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/util/NMAString.h"

// Helpers over texts and paths, for the module. A path may hold slashes of either
// kind. No state: any thread, at any time. Arguments are only read.
class NMAUTIL_API NMAStringUtils {
public:
    // A text of `length` wide characters, or of all up to the terminator with -1.
    static NMAString CreateWCharNMAString(const wchar_t* text, ncfSInt32 length);
    // The path up to and including its last separator; empty without one.
    static NMAString GetParentFolder(const NMAString& path);
    // Folder and name joined with a backslash unless the folder ends in a
    // separator already. An empty folder gives the name.
    static NMAString CombinePath(const NMAString& folder, const NMAString& name);
    // Whether the text begins with `start`, UTF-8, by its bytes.
    static bool IsStartWith(const NMAString& text, const char* start);
};
