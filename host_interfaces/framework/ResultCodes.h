// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/framework/Types.h"

namespace ncf_detail {
constexpr NCFRESULT Code(ncfUInt32 bits) {
    return static_cast<NCFRESULT>(bits);
}
}  // namespace ncf_detail

// Every result code that the module returns or tests. They are typed, so that
// a thrown code is always caught as an NCFRESULT.
inline constexpr NCFRESULT NCF_OK = 0;

// General failures.
inline constexpr NCFRESULT NCF_E_NOTIMPL = ncf_detail::Code(0x80000001);
inline constexpr NCFRESULT NCF_E_OUTOFMEMORY = ncf_detail::Code(0x80000002);
inline constexpr NCFRESULT NCF_E_INVALIDARG = ncf_detail::Code(0x80000003);
inline constexpr NCFRESULT NCF_E_NOINTERFACE = ncf_detail::Code(0x80000004);
inline constexpr NCFRESULT NCF_E_POINTER = ncf_detail::Code(0x80000005);
inline constexpr NCFRESULT NCF_E_HANDLE = ncf_detail::Code(0x80000006);
inline constexpr NCFRESULT NCF_E_ABORT = ncf_detail::Code(0x80000007);
inline constexpr NCFRESULT NCF_E_FAIL = ncf_detail::Code(0x80000008);
inline constexpr NCFRESULT NCF_E_ACCESSDENIED = ncf_detail::Code(0x80000009);
inline constexpr NCFRESULT NCF_E_NOTFOUND = ncf_detail::Code(0x8000000C);
inline constexpr NCFRESULT NCF_E_NOTSUPPORTED = ncf_detail::Code(0x8000000D);
inline constexpr NCFRESULT NCF_E_UNEXPECTED = ncf_detail::Code(0x8000FFFF);

// The header parser wants more bytes: no failure of the movie.
inline constexpr NCFRESULT QT_E_MOREDATA = ncf_detail::Code(0x80028016);

// Class factories.
inline constexpr NCFRESULT NCF_CLASS_E_NOAGGREGATION = ncf_detail::Code(0x80040110);
inline constexpr NCFRESULT NCF_CLASS_E_CLASSNOTAVAILABLE = ncf_detail::Code(0x80040111);

// Timecode slots of a description; each names the step that failed.
inline constexpr NCFRESULT NMA_E_AAF_ADD = ncf_detail::Code(0x8AEA0005);
inline constexpr NCFRESULT NMA_E_AAF_QUERY = ncf_detail::Code(0x8AEA0006);
inline constexpr NCFRESULT NMA_E_AAF_CREATE = ncf_detail::Code(0x8AEA000A);

// Media access.
inline constexpr NCFRESULT NMA_E_NOTSET = ncf_detail::Code(0xA000000A);
inline constexpr NCFRESULT NMA_E_ALREADYSET = ncf_detail::Code(0xA0000066);
inline constexpr NCFRESULT NMA_E_NOTINITIALIZED = ncf_detail::Code(0xA0000068);
inline constexpr NCFRESULT NMA_E_FIELDS = ncf_detail::Code(0xA0000069);
inline constexpr NCFRESULT NCF_E_PARAMETERNOTAVAILABLE = ncf_detail::Code(0xA000006A);
inline constexpr NCFRESULT NMA_E_ROOTEXISTS = ncf_detail::Code(0xA000006C);
inline constexpr NCFRESULT NMA_E_NODATA = ncf_detail::Code(0xA000006F);

// The AAF library's "property not present", tested by the attribute reader.
inline constexpr NCFRESULT NMA_AAF_PROP_NOT_PRESENT = ncf_detail::Code(0x801200CF);
