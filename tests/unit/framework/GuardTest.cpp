// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/framework/Guard.h"

#include <gtest/gtest.h>

#include <stdexcept>

TEST(Guard, EndsABodyWhereSomethingIsMissingOrFailed) {
    const auto ask = [](bool isThere, NCFRESULT step) {
        return host::Guarded([&]() -> NCFRESULT {
            host::Need(isThere, NCF_E_NOTFOUND);
            host::Check(step);
            return 1;
        });
    };
    EXPECT_EQ(ask(true, NCF_OK), 1);
    EXPECT_EQ(ask(false, NCF_E_FAIL), NCF_E_NOTFOUND);
    EXPECT_EQ(ask(true, NCF_E_FAIL), NCF_E_FAIL);
}

TEST(Guard, LetsNoExceptionOut) {
    EXPECT_EQ(host::Guarded([]() -> NCFRESULT { throw std::bad_alloc(); }), NCF_E_OUTOFMEMORY);
    EXPECT_EQ(host::Guarded([]() -> NCFRESULT { throw std::logic_error("x"); }), NCF_E_UNEXPECTED);
}

TEST(Guard, GivesAValueWhereThereIsRoom) {
    ncfBool flag = 7;
    EXPECT_EQ(host::Give(true, &flag), NCF_OK);
    EXPECT_EQ(flag, 1);
    EXPECT_EQ(host::Give(true, static_cast<ncfBool*>(nullptr)), NCF_E_POINTER);
}
