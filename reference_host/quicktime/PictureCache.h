// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <map>
#include <memory>

#include "reference_host/quicktime/AvOwners.h"

namespace host {

// Decoded pictures around the one asked for last. Bounded by memory; a picture
// far from the present one goes first.
class PictureCache {
public:
    explicit PictureCache(std::size_t mostBytes) : mostBytes_(mostBytes) {}

    std::shared_ptr<const AVFrame> Find(std::size_t picture) const;
    // Keeps at most `mostPictures`, those nearest to `near`.
    void Keep(std::size_t picture, std::shared_ptr<const AVFrame> frame, std::size_t near,
              std::size_t mostPictures);
    void Clear();
    std::size_t Bytes() const { return bytes_; }
    std::size_t Count() const { return pictures_.size(); }

private:
    void DropFarthest(std::size_t near);

    std::size_t mostBytes_;
    std::size_t bytes_ = 0;
    std::map<std::size_t, std::shared_ptr<const AVFrame>> pictures_;
};

}  // namespace host
