// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <gtest/gtest.h>

#include <cstddef>
#include <cstring>

// Place of an operation in its interface's table, counted from 0, as the compiler
// that made this program calls it: both platforms keep it, plus one and in bytes,
// in the pointer to the operation.
template <class Operation>
std::size_t SlotOf(Operation operation) {
    std::size_t words[2] = {};
    static_assert(sizeof operation == sizeof words, "a pointer to a virtual operation");
    std::memcpy(words, &operation, sizeof operation);
    return (words[0] - 1) / sizeof(void*);
}

// An operation and its place, written down once more: modules that are built call
// by place.
struct SlotRow {
    const char* operation;
    std::size_t published;
    std::size_t declared;
};

template <std::size_t count>
void ExpectPublishedPlaces(const SlotRow (&rows)[count]) {
    for (const SlotRow& row : rows) {
        EXPECT_EQ(row.declared, row.published) << row.operation;
    }
}
