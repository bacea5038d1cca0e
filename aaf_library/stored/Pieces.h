// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/stored/StoredTree.h"

#include <cstddef>
#include <cstdint>
#include <memory>
#include <utility>
#include <vector>

namespace aaf::stored {

// Bytes of a file that is written. Other files may hold the same ones.
struct Piece {
    std::shared_ptr<const Bytes> owner;
    const std::uint8_t* data;
    std::size_t size;

    explicit Piece(Bytes bytes)
        : owner(std::make_shared<const Bytes>(std::move(bytes))),
          data(owner->data()),
          size(owner->size()) {}
    // Some of the owner's.
    Piece(std::shared_ptr<const Bytes> whole, std::size_t from, std::size_t count)
        : owner(std::move(whole)), data(owner->data() + from), size(count) {}
};

// Bytes that grow, with pieces of others in between.
class PiecedBytes {
public:
    std::size_t size() const { return own_.size() + sharedSize_; }
    // Those that are not shared, in order.
    Bytes& own() { return own_; }
    // The place among its own bytes of one that is not shared.
    std::size_t PlaceOf(std::size_t at) const;

    // Appends all but the first of them.
    void Share(const std::shared_ptr<const Bytes>& bytes, std::size_t from);

    // Once.
    void MoveTo(std::vector<Piece>& pieces);

private:
    struct Shared {
        std::size_t ownBefore;
        Piece piece;
    };

    Bytes own_;
    std::vector<Shared> shared_;
    std::size_t sharedSize_ = 0;
};

}  // namespace aaf::stored
