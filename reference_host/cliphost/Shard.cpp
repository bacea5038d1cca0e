// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/Shard.h"

#include "reference_host/cliphost/Digest.h"
#include "reference_host/cliphost/Failure.h"
#include "reference_host/system/Paths.h"
#include "reference_host/util/text/Number.h"

namespace cliphost {
namespace {

constexpr std::uint64_t kMostShares = 1'000'000;

}  // namespace

Shard::Shard(const std::string& text) {
    const std::size_t slash = text.find('/');
    const std::string_view all = text;
    std::uint64_t number = 0;
    const bool isShard = slash != std::string::npos &&
                         host::text::ReadNumber(all.substr(0, slash), number) &&
                         host::text::ReadNumber(all.substr(slash + 1), count_) && number >= 1 &&
                         number <= count_ && count_ <= kMostShares;
    if (!isShard) {
        throw Failure(kExitCaller, host::system::PathOfText("--shard " + text),
                      "is not I/N with I from 1 to N",
                      "write --shard 1/4 on the first of four machines, --shard 4/4 on the last");
    }
    place_ = number - 1;
}

bool Shard::Holds(const std::string& path) const {
    if (IsWhole()) {
        return true;
    }
    return FirstBitsOf(DigestOf(path)) % count_ == place_;
}

}  // namespace cliphost
