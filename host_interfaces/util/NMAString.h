// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/framework/String.h"
#include "host_interfaces/util/NMAUtilExport.h"

// Value class over texts of the host. It keeps its own text and makes a host
// string only where one is handed out, so it works before NMAInitialize and
// after NMATerminate too, but for CreateString. Nothing here throws; memory
// that runs out leaves the text empty. The module uses it for paths and texts of its
// own. One object belongs to one thread at a time.
class NMAUTIL_API NMAString {
public:
    NMAString();
    NMAString(const NMAString& other);
    explicit NMAString(const char* utf8);  // null: empty
    // Copies the text of `source`, which is borrowed and may be null. The
    // host string that InArg shows is held in `encoding`.
    NMAString(INCFString* source, ncfUInt32 encoding);
    ~NMAString();

    NMAString& operator=(const NMAString& other);
    bool operator==(const NMAString& other) const;
    bool operator!=(const NMAString& other) const { return !(*this == other); }
    NMAString& operator+=(const NMAString& tail);

    bool IsEmpty() const;

    // A new, empty host string owned by the caller. NMA_E_NOTINITIALIZED
    // without a component factory.
    static NCFRESULT CreateString(INCFString** out);

    // The text as a host string, borrowed, never null while NMAInitialize is
    // in force.
    INCFString* InArg() const;
    // Empties the text and gives the place for a callee to put a host string
    // with one reference; its text is taken over at the next use.
    INCFString** OutArg();

    // The text in three encodings, zero-terminated, valid to the next change
    // of this object. None of them converts what InArg shows.
    const char* GetUTF8String() const;
    const ncfUTF16* GetUTF16String() const;
    const wchar_t* GetWCHARString() const;

private:
    friend class NMAStringUtils;  // builds texts from their characters
    struct State;
    State* state_;
};
