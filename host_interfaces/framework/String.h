// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/framework/Unknown.h"

// Encodings of a host string.
enum NCFStringEncoding : ncfUInt32 {
    kNCFASCII = 0,
    kNCFUTF8 = 1,
    kNCFUTF16 = 2,
    kNCFUTF32 = 3,
    kNCFWCHAR = 4,
};

// Length of a zero-terminated text whose units are not counted by the caller.
inline constexpr ncfUInt32 kNCFZeroTerminated = 0xFFFFFFFFu;

// Mutable text, held in one encoding at a time: every text that crosses the border
// as an object. A new string is empty and in UTF-16.
//
// Implemented by the host as a component; module, utility library and host create
// and call it. One string belongs to one thread at a time. Raw pointers that it
// gives out belong to it.
//
// A path that goes to the module has backslashes between its parts, on every
// system. Bytes of a file name that are no UTF-8 are carried as lone surrogates,
// U+DC00 plus the byte.
struct INCFString : INCFUnknown {
    // 3. The encoding held, one of NCFStringEncoding: the value, no result.
    virtual ncfUInt32 GetEncoding() = 0;
    // 4. Length in code units of the encoding held, terminator not counted.
    virtual ncfUInt32 GetLength() = 0;
    // 5. Non-zero when the length is 0.
    virtual ncfBool IsEmpty() = 0;
    // 6. Takes text and encoding of `source`.
    virtual NCFRESULT Assign(INCFString* source) = 0;
    // 7 to 9. Copy `units` code units of `text`, or all up to the terminator
    // with kNCFZeroTerminated, and hold them in the encoding `keepAs`.
    virtual NCFRESULT AssignUTF8(ncfUInt32 keepAs, const ncfUTF8* text, ncfUInt32 units) = 0;
    virtual NCFRESULT AssignUTF16(ncfUInt32 keepAs, const ncfUTF16* text, ncfUInt32 units) = 0;
    virtual NCFRESULT AssignWCHAR(ncfUInt32 keepAs, const ncfWCHAR* text, ncfUInt32 units) = 0;
    // 10. Changes the encoding held. NCF_E_FAIL when a character has no place
    // in the new one; the string is then unchanged.
    virtual NCFRESULT ConvertTo(ncfUInt32 encoding) = 0;
    // 11. As ConvertTo, into a new string that the caller owns.
    virtual NCFRESULT ConvertCopy(ncfUInt32 encoding, INCFString** out) = 0;
    // 12 to 15. The live, writable, zero-terminated buffer, valid until the
    // next change of the string. When another encoding is held: NCF_E_FAIL and
    // null. GetRawUTF8 serves ASCII too.
    virtual NCFRESULT GetRawUTF8(ncfUTF8** out) = 0;
    virtual NCFRESULT GetRawUTF16(ncfUTF16** out) = 0;
    virtual NCFRESULT GetRawUTF32(ncfUTF32** out) = 0;
    virtual NCFRESULT GetRawWCHAR(ncfWCHAR** out) = 0;
    // 16. Finds a character, in code units of the encoding held, from element
    // `from` (included) to the end, or to the beginning when `forward` is 0. Not
    // found is NCF_OK with -1 in `at`.
    virtual NCFRESULT FindCharacter(ncfUTF32 character, ncfSInt32 from, ncfBool forward,
                                    ncfSInt32* at) = 0;
    // 17. Finds `units` units of `text` from element `from`; the string must
    // hold wide characters. Not found is NCF_OK with -1 in `at`.
    virtual NCFRESULT FindWCHAR(const ncfWCHAR* text, ncfUInt32 units, ncfUInt32 from,
                                ncfSInt32* at) = 0;

protected:
    ~INCFString() = default;
};

inline constexpr GUID IID_INCFString = ncfGuid("3D11F1B5-C5D5-4A0D-8347-57BD8525B6DE");
inline constexpr GUID NCFCompID_NCFString = ncfGuid("6920B1B9-0A9F-40DB-8DEA-6BD845CF8AD2");
constexpr const GUID& ncfIdOf(const INCFString*) {
    return IID_INCFString;
}
