// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <iterator>
#include <type_traits>

#include "host_interfaces/media/PluginComponents.h"
#include "source/components/QuickTimeContainer.h"
#include "source/components/QuickTimeMasterClips.h"
#include "source/components/QuickTimeMediaFormat.h"
#include "source/components/QuickTimeMediaVolume.h"
#include "source/components/QuickTimeVolumeInfo.h"
#include "source/descriptor_data/GenericDocHandler.h"
#include "source/essence/QuickTimeSampleMapping.h"
#include "source/parameters/QTParameters.h"
#include "source/plugin/CNCFUnknown.h"

// A component that the module registers.
struct ComponentRow {
    const char* displayName;
    GUID componentId;
    GUID classId;
    ncfUInt32 major;
    ncfUInt32 minor;
    ncfUInt32 lookUp;  // place in the order in which class ids are compared
    CreationFunction creator;
};

// The row of a class; of void, it is registered, but no class factory serves it.
template <class Component>
struct Row : ComponentRow {
    constexpr Row(const char* name, const GUID& component, const GUID& itsClass, ncfUInt32 version,
                  ncfUInt32 revision, ncfUInt32 order)
        : ComponentRow{name, component, itsClass, version, revision, order, nullptr} {
        if constexpr (!std::is_void_v<Component>) {
            creator = &CreateInstanceOf<Component>;
        }
    }
};

// The index of a row is the argument of NCFRegisterComponent. A further component is
// one row and its class.
inline constexpr ComponentRow kComponents[] = {
    Row<NMA::Impl::QuickTimeMediaVolume>{"QuickTimeMediaVolume", NMA::CompID_QuickTimeMediaVolume,
                                         ncfGuid("2C839849-53E5-428A-8669-ED79FE70299B"), 1, 3, 3},
    Row<NMA::Impl::QuickTimeMediaFormat>{"QuickTimeMediaFormat", NMA::CompID_QuickTimeMediaFormat,
                                         ncfGuid("BF41FAED-6DE6-440C-80CA-2FAF8AA5BD5C"), 1, 3, 4},
    Row<NMA::Impl::QuickTimeMasterClips>{"QuickTimeMasterClips", NMA::CompID_QuickTimeMasterClips,
                                         ncfGuid("E08DA5CC-5C36-45D6-86F2-F0379C56C755"), 1, 3, 5},
    Row<NMA::Impl::QuickTimeVolumeInfo>{"QuickTimeVolumeInfo", NMA::CompID_QuickTimeVolumeInfo,
                                        ncfGuid("B7D3689E-DC96-41F2-AC77-DCC8990AA9D5"), 1, 1, 6},
    Row<NMA::Impl::QuickTimeContainer>{"QuickTimeMediaContainer", NMA::CompID_QuickTimeContainer,
                                       ncfGuid("058B2AEF-CC2F-4652-B8A0-28D773A8DFB1"), 1, 3, 1},
    Row<NMA::Impl::QuickTimeSampleMapping>{
        "QuickTimeSampleMapping", NMA::CompID_QuickTimeSampleMapping,
        ncfGuid("109B6222-FDAE-42AB-9E1C-A547123901A0"), 1, 3, 2},
    Row<void>{"QuickTimeClips", NMA::CompID_QuickTimeClips,
              ncfGuid("C5D1D369-62EF-46F8-84B8-1700F1153100"), 1, 3, 0},
    Row<NMA::Impl::GenericDocHandler>{"GenericDocumentHandler", kCLSID_GenericDocHandler,
                                      ncfGuid("A235C6D4-35F8-4A18-8CD1-7E96A8EBF842"), 1, 3, 7},
    Row<NMA::Impl::QTParameters>{"QTParameters", NMA::CompID_QTParameters,
                                 ncfGuid("5ECB2244-6B8F-41FD-9E36-71EAE5501230"), 1, 3, 8},
};
inline constexpr ncfUInt32 kComponentCount = std::size(kComponents);

// The creation function for a class id, null when no factory serves it.
inline CreationFunction FindCreator(const GUID& classId) {
    const ComponentRow* found = nullptr;
    for (const ComponentRow& row : kComponents) {
        if (row.creator && row.classId == classId && (!found || row.lookUp < found->lookUp)) {
            found = &row;
        }
    }
    return found ? found->creator : nullptr;
}
