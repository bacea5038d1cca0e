// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <gtest/gtest.h>

#include <cstring>

#include "host_interfaces/aaf/AAFResultCodes.h"

// What an operation with a single output gives; it must succeed. An output that
// is left alone has a value that nobody expects.
template <class Object, class Interface, class Value>
Value Get(const Object& object, HRESULT (Interface::*operation)(Value*)) {
    Value value;
    std::memset(&value, 0x99, sizeof value);
    EXPECT_EQ(AAFRESULT_SUCCESS, ((*object).*operation)(&value));
    return value;
}
