// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/stored/Pieces.h"

namespace aaf::stored {

std::size_t PiecedBytes::PlaceOf(std::size_t at) const {
    std::size_t sharedBefore = 0;
    for (const Shared& shared : shared_) {
        if (shared.ownBefore + sharedBefore > at) {
            break;
        }
        sharedBefore += shared.piece.size;
    }
    return at - sharedBefore;
}

void PiecedBytes::Share(const std::shared_ptr<const Bytes>& bytes, std::size_t from) {
    shared_.push_back({own_.size(), Piece(bytes, from, bytes->size() - from)});
    sharedSize_ += shared_.back().piece.size;
    // Room for what follows the large part of a file.
    own_.reserve(own_.size() + bytes->size() / 4);
}

void PiecedBytes::MoveTo(std::vector<Piece>& pieces) {
    const auto own = std::make_shared<const Bytes>(std::move(own_));
    std::size_t done = 0;
    for (Shared& shared : shared_) {
        pieces.emplace_back(own, done, shared.ownBefore - done);
        pieces.push_back(std::move(shared.piece));
        done = shared.ownBefore;
    }
    pieces.emplace_back(own, done, own->size() - done);
}

}  // namespace aaf::stored
