// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/validate/KnownInterfaces.h"

#include "host_interfaces/framework/ComponentFactory.h"
#include "host_interfaces/media/MediaContainer.h"
#include "host_interfaces/media/MediaVolume.h"
#include "host_interfaces/media/SampleMapping.h"
#include "host_interfaces/media/Sequences.h"
#include "host_interfaces/xml/SaxParser.h"

namespace validate {

const std::vector<KnownInterface>& KnownInterfaces() {
    static const std::vector<KnownInterface> known = {
        {"INCFUnknown", IID_INCFUnknown},
        {"INCFClassFactory", IID_INCFClassFactory},
        {"IMediaVolume", NMA::IID_IMediaVolume},
        {"IVolumeInfo", NMA::IID_IVolumeInfo},
        {"IVolumeInfo2", NMA::IID_IVolumeInfo2},
        {"IMediaFormat", NMA::IID_IMediaFormat},
        {"IMediaContainer", NMA::IID_IMediaContainer},
        {"IMediaContainer2", NMA::IID_IMediaContainer2},
        {"IMediaContainer3", NMA::IID_IMediaContainer3},
        {"IAAFClips", NMA::IID_IAAFClips},
        {"ISequences", NMA::IID_ISequences},
        {"IAAFSequences", NMA::IID_IAAFSequences},
        {"ISampleMapping", NMA::IID_ISampleMapping},
        {"ISampleProvider", NMA::IID_ISampleProvider},
        {"INCFSaxDocumentHandler", kIID_SaxDocumentHandler},
        {"INCFSaxErrorHandler", kIID_SaxErrorHandler},
    };
    return known;
}

}  // namespace validate
