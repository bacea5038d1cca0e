// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/plugin/entry/ComponentTable.h"

#include "host_interfaces/media/PluginComponents.h"
#include "source/plugin/CreationFunctions.h"

using namespace NMA;

namespace {

enum Row : ncfUInt32 {
    kMediaVolume,
    kMediaFormat,
    kMasterClips,
    kVolumeInfo,
    kMediaContainer,
    kSampleMapping,
    kClips,
    kDocumentHandler,
    kParameters,
};

// Order in which class ids are compared.
constexpr Row kLookUpOrder[] = {
    kMediaContainer, kSampleMapping, kMediaVolume,     kMediaFormat,
    kMasterClips,    kVolumeInfo,    kDocumentHandler, kParameters,
};

}  // namespace

// clang-format off
const ComponentRow kComponents[kComponentCount] = {
    {"QuickTimeMediaVolume", CompID_QuickTimeMediaVolume,
     ncfGuid("2C839849-53E5-428A-8669-ED79FE70299B"), 1, 3, &Impl::CreateQuickTimeMediaVolume},
    {"QuickTimeMediaFormat", CompID_QuickTimeMediaFormat,
     ncfGuid("BF41FAED-6DE6-440C-80CA-2FAF8AA5BD5C"), 1, 3, &Impl::CreateQuickTimeMediaFormat},
    {"QuickTimeMasterClips", CompID_QuickTimeMasterClips,
     ncfGuid("E08DA5CC-5C36-45D6-86F2-F0379C56C755"), 1, 3, &Impl::CreateQuickTimeMasterClips},
    {"QuickTimeVolumeInfo", CompID_QuickTimeVolumeInfo,
     ncfGuid("B7D3689E-DC96-41F2-AC77-DCC8990AA9D5"), 1, 1, &Impl::CreateQuickTimeVolumeInfo},
    {"QuickTimeMediaContainer", CompID_QuickTimeContainer,
     ncfGuid("058B2AEF-CC2F-4652-B8A0-28D773A8DFB1"), 1, 3, &Impl::CreateQuickTimeContainer},
    {"QuickTimeSampleMapping", CompID_QuickTimeSampleMapping,
     ncfGuid("109B6222-FDAE-42AB-9E1C-A547123901A0"), 1, 3, &Impl::CreateQuickTimeSampleMapping},
    {"QuickTimeClips", CompID_QuickTimeClips,
     ncfGuid("C5D1D369-62EF-46F8-84B8-1700F1153100"), 1, 3, nullptr},
    {"GenericDocumentHandler", kCLSID_GenericDocHandler,
     ncfGuid("A235C6D4-35F8-4A18-8CD1-7E96A8EBF842"), 1, 3, &Impl::CreateGenericDocHandler},
    {"QTParameters", CompID_QTParameters,
     ncfGuid("5ECB2244-6B8F-41FD-9E36-71EAE5501230"), 1, 3, &Impl::CreateQTParameters},
};
// clang-format on

CreationFunction FindCreator(const GUID& classId) {
    for (const Row row : kLookUpOrder) {
        if (kComponents[row].classId == classId) {
            return kComponents[row].creator;
        }
    }
    return nullptr;
}
