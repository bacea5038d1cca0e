// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/framework/SampleRequest.h"

#include <gtest/gtest.h>

using host::MakeRef;
using host::Ref;
using host::SampleRequest;

TEST(SampleRequest, TellsTheRangeThatWasAskedForLast) {
    const auto request = MakeRef<SampleRequest>();
    request->Ask(1, 2, 3);
    request->Ask(4, 0x100000005, 0x200000006);
    ncfUInt32 track = 0;
    ncfUInt64 sample = 0, count = 0;
    ASSERT_EQ(NCF_OK, request->GetSampleRange(&track, &sample, &count));
    EXPECT_EQ(4u, track);
    EXPECT_EQ(0x100000005u, sample);
    EXPECT_EQ(0x200000006u, count);
}

TEST(SampleRequest, HandsOutTheSameBufferWithANewReferenceEachTime) {
    const auto request = MakeRef<SampleRequest>();
    Ref<INCFBuffer> first, second;
    ASSERT_EQ(NCF_OK, request->GetBuffer(first.Out()));
    ASSERT_EQ(NCF_OK, request->GetBuffer(second.Out()));
    EXPECT_EQ(first.get(), second.get());
    ASSERT_EQ(NCF_OK, first->Allocate(10, 1));
    EXPECT_EQ(10u, request->buffer().size());
    // Three owners: the request and the two above.
    EXPECT_EQ(4u, first->AddRef());
    EXPECT_EQ(3u, first->Release());
}

TEST(SampleRequest, RefusesToWriteNowhere) {
    const auto request = MakeRef<SampleRequest>();
    ncfUInt32 track = 7;
    ncfUInt64 number = 7;
    EXPECT_EQ(NCF_E_POINTER, request->GetBuffer(nullptr));
    EXPECT_EQ(NCF_E_POINTER, request->GetSampleRange(nullptr, &number, &number));
    EXPECT_EQ(NCF_E_POINTER, request->GetSampleRange(&track, nullptr, &number));
    EXPECT_EQ(NCF_E_POINTER, request->GetSampleRange(&track, &number, nullptr));
    EXPECT_EQ(7u, track);
    EXPECT_EQ(7u, number);
}
