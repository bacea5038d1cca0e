// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <gtest/gtest.h>

#include <cstdint>
#include <string>
#include <vector>

#include "host_interfaces/framework/Unknown.h"

// Name of the operation that ran last.
inline std::string& LastRun() {
    static std::string name;
    return name;
}

// Base of a fake whose operations do nothing but tell which of them ran.
template <class Interface>
struct PlaceFake : Interface {
    virtual ~PlaceFake() = default;

    NCFRESULT QueryInterface(const GUID&, void**) override {
        return Ran<NCFRESULT>("QueryInterface");
    }
    ncfUInt32 AddRef() override { return Ran<ncfUInt32>("AddRef"); }
    ncfUInt32 Release() override { return Ran<ncfUInt32>("Release"); }

    template <class Result>
    static Result Ran(const char* name) {
        LastRun() = name;
        return Result();
    }
};

struct PlaceRow {
    std::size_t place;
    const char* operation;
};

// Calls what stands at a place of an object's table, as a caller does that knows
// the number alone. No operation of a fake looks at its arguments.
inline void CallPlace(void* object, std::size_t place) {
    using Operation = std::uintptr_t (*)(void*, std::uintptr_t, std::uintptr_t, std::uintptr_t,
                                         std::uintptr_t, std::uintptr_t);
    const auto* const table = *static_cast<void* const* const*>(object);
    reinterpret_cast<Operation>(table[place])(object, 0, 0, 0, 0, 0);
}

// Every operation stands at its place, behind the three of the root.
template <class Fake>
void ExpectPlaces(const std::vector<PlaceRow>& rows) {
    Fake fake;
    std::vector<PlaceRow> all = {{0, "QueryInterface"}, {1, "AddRef"}, {2, "Release"}};
    all.insert(all.end(), rows.begin(), rows.end());
    for (const PlaceRow& row : all) {
        LastRun().clear();
        CallPlace(&fake, row.place);
        EXPECT_EQ(LastRun(), row.operation) << "at place " << row.place;
    }
}
