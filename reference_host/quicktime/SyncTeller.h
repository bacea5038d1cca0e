// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <memory>

#include "reference_host/quicktime/AvOwners.h"

namespace host {

// Tells by a sample's content whether it stands alone. Movies without a list of sync samples claim
// it of every one, also where their codec makes others.
class SyncTeller {
public:
    // Null where the content doesn't tell.
    static std::unique_ptr<SyncTeller> Of(const AVStream& stream);

    virtual ~SyncTeller() = default;
    virtual bool StandsAlone(const AVPacket& packet) = 0;
};

}  // namespace host
