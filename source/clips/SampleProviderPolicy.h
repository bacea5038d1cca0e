// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "source/clips/BaseClip.h"
#include "source/plugin/Tr1Memory.h"

// Which way the host is to read a clip's essence: 1 directly from the file, 0
// through the module's sample provider, negative failure. A 0 is told to the
// user.

NCFRESULT MovieRequiresSampleProviderForVideo(NCFSmartPtr<INCFConsole> console,
                                              std::tr1::shared_ptr<BaseClip> media,
                                              AAFInfo* aafInfo);

NCFRESULT MovieRequiresSampleProviderForAudio(NCFSmartPtr<INCFConsole> console,
                                              std::tr1::shared_ptr<BaseClip> media,
                                              ncfUInt32 qtTrack, ncfUInt64* numAudioSamples);
