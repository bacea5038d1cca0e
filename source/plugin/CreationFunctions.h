// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/framework/Unknown.h"

// Creation functions of the components that class factories serve. Each is
// defined beside its class.
namespace NMA::Impl {

NCFRESULT CreateQuickTimeContainer(INCFUnknown* host, INCFUnknown* outer, const GUID& iid,
                                   void** out);
NCFRESULT CreateQuickTimeMediaVolume(INCFUnknown* host, INCFUnknown* outer, const GUID& iid,
                                     void** out);
NCFRESULT CreateQuickTimeMediaFormat(INCFUnknown* host, INCFUnknown* outer, const GUID& iid,
                                     void** out);
NCFRESULT CreateQuickTimeMasterClips(INCFUnknown* host, INCFUnknown* outer, const GUID& iid,
                                     void** out);
NCFRESULT CreateQuickTimeVolumeInfo(INCFUnknown* host, INCFUnknown* outer, const GUID& iid,
                                    void** out);
NCFRESULT CreateQuickTimeSampleMapping(INCFUnknown* host, INCFUnknown* outer, const GUID& iid,
                                       void** out);
NCFRESULT CreateGenericDocHandler(INCFUnknown* host, INCFUnknown* outer, const GUID& iid,
                                  void** out);
NCFRESULT CreateQTParameters(INCFUnknown* host, INCFUnknown* outer, const GUID& iid, void** out);

}  // namespace NMA::Impl
