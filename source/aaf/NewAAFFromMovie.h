// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/aaf/AAFFile.h"
#include "source/clips/BaseClip.h"
#include "source/plugin/Tr1Memory.h"

namespace NMA::Impl {

// Describes an opened clip as a transient AAF file: a master mob that refers
// to a file mob that refers to a source mob. The host reads everything that it
// knows about the clip from there.
//
// Asks the host's editor settings, fixes the clip's rate and length with them,
// makes mob ids of the clip's content, then slots, descriptors and columns.
// On success `*pOutAAFFile` is the file with one reference for the caller; on
// failure it stays as it was and nothing is left behind.
NCFRESULT NewAAFFromMovie(std::tr1::shared_ptr<BaseClip> media, NCFSmartPtr<INCFConsole> pConsole,
                          IAAFFile** pOutAAFFile, INCFComponentFactory* pComponentFactory);

}  // namespace NMA::Impl
