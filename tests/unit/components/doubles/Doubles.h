// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <functional>
#include <map>
#include <string>
#include <vector>

#include "source/clips/BaseClip.h"
#include "source/plugin/NCFSmartPtr.h"
#include "source/plugin/Tr1Memory.h"

struct IAAFFile;

// What this program's NMAVolume answers in place of the utility library's.
struct VolumeDouble {
    std::vector<std::string> names;
    std::map<std::string, ncfUInt64> dates;
    bool throws = false;
    std::function<void(INCFString&)> change;  // of a name before it is handed out
    std::vector<std::string> paths;           // of the volumes so far
    std::vector<std::string> patterns;        // of the searches so far
    std::vector<NCFSmartPtr<INCFString>> handedOut;
};
extern VolumeDouble volumeDouble;

// What this program's NewAAFFromMovie does in place of the module's.
struct DescriptionDouble {
    // Puts a file with a reference into `*out`, gives a result, or throws.
    std::function<NCFRESULT(IAAFFile** out)> describe;
    INCFComponentFactory* factory = nullptr;
    INCFConsole* console = nullptr;
    std::vector<std::tr1::weak_ptr<BaseClip>> clips;  // one for each call
};
extern DescriptionDouble descriptionDouble;
