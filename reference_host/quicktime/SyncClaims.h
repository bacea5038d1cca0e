// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <filesystem>
#include <memory>
#include <vector>

#include "reference_host/quicktime/PictureOrder.h"
#include "reference_host/quicktime/SyncTeller.h"

namespace host {

// Looks whether the samples where decoding would begin are sync samples, in a movie that claims it
// of all of them, and takes back what isn't true. Reads few samples: those before the one that is
// wanted, back to the first that stands alone.
class SyncClaims {
public:
    // Null where nothing is in doubt.
    static std::unique_ptr<SyncClaims> Doubted(const std::filesystem::path& path,
                                               const AVStream& stream, const PictureOrder& order);

    // Behind it, StartFor(picture) is true.
    void Check(PictureOrder& order, std::size_t picture);

    // How many samples were read for it so far.
    ncfUInt64 PacketsRead() const { return packetsRead_; }

private:
    SyncClaims(std::filesystem::path path, int stream, std::unique_ptr<SyncTeller> teller,
               std::size_t packets);
    bool StandsAlone(const PacketEntry& entry);

    std::filesystem::path path_;
    int stream_;
    std::unique_ptr<SyncTeller> teller_;
    InputOwner input_;  // opened when something is first looked at
    PacketOwner packet_;
    std::vector<bool> isTrue_;  // for each packet
    ncfUInt64 packetsRead_ = 0;
};

}  // namespace host
