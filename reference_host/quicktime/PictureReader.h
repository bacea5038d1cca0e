// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <filesystem>
#include <memory>
#include <optional>

#include "host_interfaces/framework/ResultCodes.h"
#include "reference_host/quicktime/PictureCache.h"
#include "reference_host/quicktime/PictureOrder.h"
#include "reference_host/quicktime/SyncClaims.h"

namespace host {

// Decodes presented pictures by their number in display order. One after
// another costs decoding alone; a jump decodes from the nearest sync sample;
// steps back within a group of pictures come from the cache that the first of
// them filled.
class PictureReader {
public:
    // Null where the stream has no decoder, or can't hold pictures as large as told.
    static std::unique_ptr<PictureReader> Open(const std::filesystem::path& path, int stream,
                                               bool indexIsWhole);

    std::size_t Count() const { return order_.PictureCount(); }
    const AVCodecParameters& Form() const { return *input_->streams[stream_]->codecpar; }

    // NMA_E_NODATA past the last; NCF_E_FAIL for a picture that does not
    // decode, after which all others still work.
    NCFRESULT Read(std::size_t picture, std::shared_ptr<const AVFrame>& frame);

    // Gives the decoder and the pictures that were kept back; the next read makes
    // a decoder anew. What is known of the stream's packets stays.
    void Release();
    bool HoldsDecoder() const { return codec_ != nullptr; }

    // How many packets were decoded so far.
    ncfUInt64 DecodedPackets() const { return decodedPackets_; }
    // How many were read on the way to where decoding could begin.
    ncfUInt64 PacketsPassed() const { return packetsPassed_; }
    // How many were read to find out where that is.
    ncfUInt64 PacketsLookedAt() const { return syncClaims_ ? syncClaims_->PacketsRead() : 0; }

private:
    PictureReader(std::filesystem::path path, InputOwner input, CodecOwner codec, int stream,
                  PictureOrder order);

    bool MayContinueTo(std::size_t picture) const;
    NCFRESULT StartAt(std::size_t packet);
    bool LandsBefore(std::size_t packet);
    NCFRESULT DecodeUpTo(std::size_t picture, std::shared_ptr<const AVFrame>& frame);
    bool Feed();
    bool IsPassedOver(std::size_t packet) const;
    std::optional<std::size_t> PictureOf(const AVFrame& frame);

    std::filesystem::path path_;
    InputOwner input_;
    CodecOwner codec_;
    int stream_;
    PictureOrder order_;
    std::unique_ptr<SyncClaims> syncClaims_;  // null: all are true
    bool isSeekable_;
    bool marksCutPackets_;  // a packet marked as corrupt is one that the file's end cut
    PictureCache cache_;
    PacketOwner packet_;

    bool isRunning_ = false;
    bool isPending_ = false;      // packet_ was read and not decoded yet
    std::size_t runStart_ = 0;    // packet where decoding began
    std::size_t nextPacket_ = 0;  // about to be read
    std::size_t delivered_ = 0;   // pictures that this run gave
    std::size_t lastOut_ = 0;     // the last of them, when there is one
    std::size_t lastAsked_ = 0;
    std::size_t mostKept_ = 0;
    ncfUInt64 decodedPackets_ = 0;
    ncfUInt64 packetsPassed_ = 0;
};

}  // namespace host
