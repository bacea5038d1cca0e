// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/framework/QueryRule.h"

#include <atomic>
#include <mutex>
#include <utility>

namespace host {
namespace {

// Queries are many and rules rare: without a rule only a flag is read.
std::atomic<bool> isSet{false};
std::mutex mutex;
QueryRule current;
ncfUInt32 asked = 0;

}  // namespace

void SetQueryRule(QueryRule rule) {
    const std::lock_guard<std::mutex> guard(mutex);
    current = std::move(rule);
    asked = 0;
    isSet = static_cast<bool>(current);
}

NCFRESULT AskQueryRule(const GUID& iid) {
    if (!isSet.load(std::memory_order_relaxed)) {
        return NCF_OK;
    }
    const std::lock_guard<std::mutex> guard(mutex);
    return current ? current(iid, ++asked) : NCF_OK;
}

}  // namespace host
