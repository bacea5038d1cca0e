// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/cliphost/AafQuery.h"

#include <gtest/gtest.h>

namespace {

// Answers every query with itself and a result.
class Answering final : public IUnknown {
public:
    HRESULT result = 0;
    ULONG references = 1;

    HRESULT QueryInterface(REFIID, void** out) override {
        AddRef();
        *out = static_cast<IUnknown*>(this);
        return result;
    }
    ULONG AddRef() override { return ++references; }
    ULONG Release() override { return --references; }
};

TEST(AafQuery, HoldsWhatAQueryGave) {
    Answering object;
    {
        const auto found = cliphost::As<IUnknown>(&object);
        EXPECT_EQ(found.get(), &object);
        EXPECT_EQ(object.references, 2u);
    }
    EXPECT_EQ(object.references, 1u);
}

TEST(AafQuery, ReleasesWhatAFailedQueryLeft) {
    Answering object;
    object.result = -1;
    EXPECT_FALSE(cliphost::As<IUnknown>(&object));
    EXPECT_EQ(object.references, 1u);
    EXPECT_FALSE(cliphost::As<IUnknown>(nullptr));
}

}  // namespace
