// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/framework/String.h"
#include "source/plugin/NCFSmartPtr.h"

// Codecs whose names the module knows by itself.
bool IsNativeQuickTimeCodec(ncfUInt32 codecType);
NCFRESULT GetNativeQuickTimeCodecName(ncfUInt32 codecType, NCFSmartPtr<INCFString>& codecName);
