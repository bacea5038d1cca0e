// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <functional>

#include "host_interfaces/aaf/AAFFile.h"
#include "host_interfaces/aaf/AAFLocators.h"
#include "host_interfaces/aaf/AAFMobs.h"
#include "reference_host/cliphost/PathMaps.h"
#include "reference_host/util/Ref.h"

namespace cliphost {

// Calls for each locator of a file's source mobs, those of descriptors inside descriptors too.
using TakeLocator = std::function<void(IAAFMob& mob, IAAFLocator& locator)>;
void ForEachLocator(IAAFFile* file, const TakeLocator& take);
void ForEachLocatorOf(IAAFMob& mob, const TakeLocator& take);

// The URL or path that a locator holds; empty where it holds none.
std::string PathOf(IAAFLocator& locator);
// Throws a Failure when the library refuses.
void SetPath(IAAFLocator& locator, const std::string& url);

// Writes locators as the other machine sees the media.
void MapLocators(IAAFFile* file, PathMaps& maps);

}  // namespace cliphost
