// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "source/clips/BaseClip.h"
#include "source/plugin/Tr1Memory.h"

// The door of the clips: from a path to a loaded clip.

// Opens the movie at `filePath` into `media`, by its headers or else through
// the movie wrapper. NMA_E_NOTINITIALIZED when both fail; `media` then holds
// the clip that failed last. A file that can't be opened throws NCF_E_HANDLE.
NCFRESULT LoadMedia(NCFSmartPtr<INCFString> filePath, NCFSmartPtr<INCFConsole> console,
                    NCFSmartPtr<INCFComponentFactory> componentFactory,
                    std::tr1::shared_ptr<BaseClip>& media);

// Whether the file starts with a file-type atom: a quick look that leaves
// classic movies without one undecided.
NCFRESULT IsQuickTimeContainer(NCFSmartPtr<INCFString> filePath, NCFSmartPtr<INCFConsole> console_,
                               ncfBool* isQTContainer);

// Turns every forward slash of a path into a backslash, in the string object
// itself, which keeps its encoding.
NCFRESULT ConvertSlashesInPlace(NCFSmartPtr<INCFString> filePath);
