// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/framework/ResultCodes.h"

// The checking macros. Each logs the source text of its argument together with
// the name that NCF_FUNCTION gave the enclosing function, and leaves the
// function with a code. None throws.
//
// The text is part of the log's format, spaces included: clang-format leaves the
// argument as it is written. A line break is logged as one space, so break a long
// argument only where a space stands.
//
// Where the text that is logged is not the statement that compiles, the _TEXT
// form takes the text beside the expression.

// First line of a function that uses the macros: its qualified name.
#define NCF_FUNCTION(name) [[maybe_unused]] static constexpr const char ncfFunction[] = name

#define CHK_PTR(x) CHK_PTR_TEXT(#x, x)
#define CHK_PTR_TEXT(text, x)                              \
    do {                                                   \
        if (!(x)) {                                        \
            ncf_detail::RecordCheckPtr(text, ncfFunction); \
            return NCF_E_POINTER;                          \
        }                                                  \
    } while (false)

#define CHK_INARG(x) CHK_INARG_TEXT(#x, x)
#define CHK_INARG_TEXT(text, x)                              \
    do {                                                     \
        if (!(x)) {                                          \
            ncf_detail::RecordCheckInArg(text, ncfFunction); \
            return NCF_E_INVALIDARG;                         \
        }                                                    \
    } while (false)

#define NCFASSERT(x) NCFASSERT_TEXT(#x, x)
#define NCFASSERT_TEXT(text, x)                          \
    do {                                                 \
        if (!(x)) {                                      \
            ncf_detail::RecordAssert(text, ncfFunction); \
            return NCF_E_FAIL;                           \
        }                                                \
    } while (false)

#define NCF_RETURN(...) NCF_RETURN_TEXT(#__VA_ARGS__, __VA_ARGS__)
#define NCF_RETURN_TEXT(text, ...)                                                 \
    do {                                                                           \
        if (const NCFRESULT ncfResult = (__VA_ARGS__); ncfResult < 0) {            \
            ncf_detail::RecordResult("NCF_RETURN(", text, ncfResult, ncfFunction); \
            return ncfResult;                                                      \
        }                                                                          \
    } while (false)

#define NCF_SKIP(...) NCF_SKIP_TEXT(#__VA_ARGS__, __VA_ARGS__)
#define NCF_SKIP_TEXT(text, ...)                                                 \
    do {                                                                         \
        if (const NCFRESULT ncfResult = (__VA_ARGS__); ncfResult < 0) {          \
            ncf_detail::RecordResult("NCF_SKIP(", text, ncfResult, ncfFunction); \
        }                                                                        \
    } while (false)

// Throws a failure as an NCFRESULT: used inside the try block of an interface
// entry. The only place that turns a result into an exception.
inline void ThrowIfFailed(NCFRESULT result) {
    if (result < 0) {
        throw result;
    }
}

namespace ncf_detail {
void RecordCheckPtr(const char* text, const char* function);
void RecordCheckInArg(const char* text, const char* function);
void RecordAssert(const char* text, const char* function);
void RecordResult(const char* macro, const char* text, NCFRESULT result, const char* function);
}  // namespace ncf_detail
