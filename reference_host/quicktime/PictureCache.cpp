// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/quicktime/PictureCache.h"

#include <iterator>

namespace host {
namespace {

std::size_t BytesOf(const AVFrame& frame) {
    std::size_t bytes = 0;
    for (const AVBufferRef* const buffer : frame.buf) {
        bytes += buffer ? static_cast<std::size_t>(buffer->size) : 0;
    }
    return bytes;
}

}  // namespace

std::shared_ptr<const AVFrame> PictureCache::Find(std::size_t picture) const {
    const auto found = pictures_.find(picture);
    return found == pictures_.end() ? nullptr : found->second;
}

void PictureCache::Keep(std::size_t picture, std::shared_ptr<const AVFrame> frame, std::size_t near,
                        std::size_t mostPictures) {
    const std::size_t bytes = BytesOf(*frame);
    std::shared_ptr<const AVFrame>& place = pictures_[picture];
    if (place) {
        bytes_ -= BytesOf(*place);
    }
    place = std::move(frame);
    bytes_ += bytes;
    while (pictures_.size() > 1 && (pictures_.size() > mostPictures || bytes_ > mostBytes_)) {
        DropFarthest(near);
    }
}

void PictureCache::Clear() {
    pictures_.clear();
    bytes_ = 0;
}

void PictureCache::DropFarthest(std::size_t near) {
    const auto first = pictures_.begin();
    const auto last = std::prev(pictures_.end());
    const std::size_t before = near > first->first ? near - first->first : 0;
    const std::size_t behind = last->first > near ? last->first - near : 0;
    const auto farthest = behind > before ? last : first;
    bytes_ -= BytesOf(*farthest->second);
    pictures_.erase(farthest);
}

}  // namespace host
