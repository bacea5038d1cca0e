// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/framework/ResultCodes.h"

namespace header_parser {

// Outcome of reading a part of the header: fine, or why the file is given up.
// The reason is a constant text for people.
struct [[nodiscard]] Verdict {
    NCFRESULT code = NCF_OK;
    const char* reason = "";

    bool Refused() const { return code != NCF_OK; }
};

inline Verdict Fine() {
    return {};
}
// The bytes contradict themselves or each other.
inline Verdict Broken(const char* reason) {
    return {NCF_E_FAIL, reason};
}
// A sound file of a kind that this parser leaves to others.
inline Verdict NotSupported(const char* reason) {
    return {NCF_E_NOTSUPPORTED, reason};
}
// The file ends where the header should go on.
inline Verdict NoData(const char* reason) {
    return {NMA_E_NODATA, reason};
}
// One of ParserLimits, or the memory itself.
inline Verdict TooMuch(const char* reason) {
    return {NCF_E_OUTOFMEMORY, reason};
}

}  // namespace header_parser
