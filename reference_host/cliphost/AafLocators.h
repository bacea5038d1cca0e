// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <functional>

#include "host_interfaces/aaf/AAFDescriptors.h"
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
// Calls for the descriptor of a source mob, and for those inside it.
void ForEachDescriptorOf(IAAFMob& mob,
                         const std::function<void(IAAFEssenceDescriptor& descriptor)>& take);

// The URL or path that a locator holds; empty where it holds none.
std::string PathOf(IAAFLocator& locator);
// Throw a Failure when the library refuses.
void AppendLocator(IAAFFile* file, IAAFEssenceDescriptor& descriptor, const std::string& url);
void SetPath(IAAFLocator& locator, const std::string& url);

// Writes locators as the other machine sees the media.
void MapLocators(IAAFFile* file, PathMaps& maps);

}  // namespace cliphost
