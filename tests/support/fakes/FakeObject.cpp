// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "tests/support/fakes/FakeObject.h"

namespace {
std::atomic<int> live{0};
}

int LiveFakes() {
    return live;
}

void fake_detail::CountFake(int step) {
    live += step;
}
