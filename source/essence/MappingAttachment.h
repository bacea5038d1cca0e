// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/framework/Types.h"

namespace NMA::Impl {

class QuickTimeSampleMapping;

// What a sample mapping makes through the host and ties to itself: the parameters of
// its clip. An object of another module does not have this base.
class MappingAttachment {
public:
    virtual NCFRESULT AttachToQTSampleProvider(QuickTimeSampleMapping& sampleProvider) = 0;

protected:
    ~MappingAttachment() = default;
};

}  // namespace NMA::Impl
