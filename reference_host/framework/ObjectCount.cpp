// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/framework/ObjectCount.h"

#include <atomic>

namespace host {

namespace {

std::atomic<std::int64_t> liveObjects{0};

}  // namespace

std::int64_t LiveObjectCount() {
    return liveObjects.load(std::memory_order_relaxed);
}

CountedObject::CountedObject() {
    liveObjects.fetch_add(1, std::memory_order_relaxed);
}

CountedObject::~CountedObject() {
    liveObjects.fetch_sub(1, std::memory_order_relaxed);
}

}  // namespace host
