// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/framework/Types.h"

// Rescales the colour of a finished frame in place as the user's level mode
// asks, and makes it opaque, which it does in every mode: alpha of a picture
// travels on the alpha track. Frames that are not RGB stay as they are. Of a
// pixel that is cut off at the end, what is there is done.
void RemapPixelLevels(ncfUInt32 pixelFormat, ncfUInt32 componentType, ncfUInt8* buffer,
                      ncfUInt64 sizeInBytes, const ncfUInt32* levelMode);
