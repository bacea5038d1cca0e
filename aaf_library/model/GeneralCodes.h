// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/aaf/AAFPlainTypes.h"

namespace aaf {

// The platform's own general codes, which the published library gives beside
// those of its own facility. They differ between Windows and all others.
#ifdef _WIN32
inline constexpr HRESULT AAF_E_NOINTERFACE = static_cast<HRESULT>(0x80004002u);
inline constexpr HRESULT AAF_E_INVALIDARG = static_cast<HRESULT>(0x80070057u);
inline constexpr HRESULT AAF_E_FAIL = static_cast<HRESULT>(0x80004005u);
#else
inline constexpr HRESULT AAF_E_NOINTERFACE = static_cast<HRESULT>(0x80000004u);
inline constexpr HRESULT AAF_E_INVALIDARG = static_cast<HRESULT>(0x80000003u);
inline constexpr HRESULT AAF_E_FAIL = static_cast<HRESULT>(0x80000008u);
#endif

}  // namespace aaf
