// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/framework/Buffer.h"

#include <gtest/gtest.h>

#include <algorithm>

#include "reference_host/util/Ref.h"

using host::Buffer;
using host::MakeRef;

TEST(Buffer, GivesZeroedMemoryAtTheAlignmentAskedFor) {
    const auto buffer = MakeRef<Buffer>();
    for (const ncfUInt32 alignment : {0u, 1u, 16u, 512u, 4096u}) {
        ASSERT_EQ(NCF_OK, buffer->Allocate(1000, alignment));
        void* start = nullptr;
        ASSERT_EQ(NCF_OK, buffer->GetBufferPointer(&start));
        if (alignment != 0) {
            EXPECT_EQ(0u, reinterpret_cast<std::uintptr_t>(start) % alignment);
        }
        auto* bytes = static_cast<unsigned char*>(start);
        EXPECT_TRUE(std::all_of(bytes, bytes + 1000, [](unsigned char b) { return b == 0; }));
        std::fill(bytes, bytes + 1000, 0xAA);
    }
}

TEST(Buffer, RecordsWhatItWasFilledWith) {
    const auto buffer = MakeRef<Buffer>();
    ASSERT_EQ(NCF_OK, buffer->Allocate(100, 0));
    EXPECT_FALSE(buffer->isComplete());
    EXPECT_EQ(NCF_OK, buffer->SetComplete(kNCFBuffer_Complete, 60, NCF_E_FAIL));
    EXPECT_TRUE(buffer->isComplete());
    EXPECT_EQ(60u, buffer->validBytes());
    EXPECT_EQ(NCF_E_FAIL, buffer->result());
    EXPECT_EQ(100u, buffer->size());
}

TEST(Buffer, RefusesMoreValidBytesThanThereAre) {
    const auto buffer = MakeRef<Buffer>();
    ASSERT_EQ(NCF_OK, buffer->Allocate(100, 0));
    EXPECT_EQ(NCF_E_INVALIDARG, buffer->SetComplete(kNCFBuffer_Complete, 101, NCF_OK));
    EXPECT_FALSE(buffer->isComplete());
}

TEST(Buffer, HasNoPointerBeforeAllocation) {
    const auto buffer = MakeRef<Buffer>();
    void* start = buffer.get();
    EXPECT_EQ(NMA_E_NOTINITIALIZED, buffer->GetBufferPointer(&start));
    EXPECT_EQ(nullptr, start);
    EXPECT_EQ(NCF_E_POINTER, buffer->GetBufferPointer(nullptr));
}

TEST(Buffer, RefusesAnAlignmentThatIsNoPowerOfTwoAndASizeBeyondMemory) {
    const auto buffer = MakeRef<Buffer>();
    EXPECT_EQ(NCF_E_INVALIDARG, buffer->Allocate(100, 24));
    EXPECT_EQ(NCF_E_OUTOFMEMORY, buffer->Allocate(~ncfUInt64{0}, 16));
    EXPECT_EQ(nullptr, buffer->bytes());
}

TEST(Buffer, AnEmptyBlockHasAnAddress) {
    const auto buffer = MakeRef<Buffer>();
    void* start = nullptr;
    EXPECT_EQ(NCF_OK, buffer->Allocate(0, 0));
    EXPECT_EQ(NCF_OK, buffer->GetBufferPointer(&start));
    EXPECT_NE(nullptr, start);
    EXPECT_EQ(0u, buffer->size());
}

TEST(Buffer, KeepsItsMemoryForTheNextBlockThatFitsAndClearsIt) {
    const auto buffer = MakeRef<Buffer>();
    ASSERT_EQ(NCF_OK, buffer->Allocate(1000, 16));
    void* first = nullptr;
    ASSERT_EQ(NCF_OK, buffer->GetBufferPointer(&first));
    std::fill_n(static_cast<unsigned char*>(first), 1000, static_cast<unsigned char>(0xAA));
    ASSERT_EQ(NCF_OK, buffer->SetComplete(kNCFBuffer_Complete, 1000, NCF_E_FAIL));

    ASSERT_EQ(NCF_OK, buffer->Allocate(600, 1));
    EXPECT_EQ(first, buffer->bytes());
    EXPECT_EQ(600u, buffer->size());
    EXPECT_FALSE(buffer->isComplete());
    EXPECT_EQ(0u, buffer->validBytes());
    EXPECT_EQ(NCF_OK, buffer->result());
    EXPECT_TRUE(std::all_of(buffer->bytes(), buffer->bytes() + 600,
                            [](unsigned char b) { return b == 0; }));
    // Back at the full size the memory is still the same, and clear to its end.
    ASSERT_EQ(NCF_OK, buffer->Allocate(1000, 16));
    EXPECT_EQ(first, buffer->bytes());
    EXPECT_TRUE(std::all_of(buffer->bytes(), buffer->bytes() + 1000,
                            [](unsigned char b) { return b == 0; }));
}

TEST(Buffer, TakesNewMemoryForALargerBlockOrAStricterAlignment) {
    const auto buffer = MakeRef<Buffer>();
    ASSERT_EQ(NCF_OK, buffer->Allocate(100, 1));
    ASSERT_EQ(NCF_OK, buffer->Allocate(200, 1));
    EXPECT_EQ(200u, buffer->capacity());
    ASSERT_EQ(NCF_OK, buffer->Allocate(100, 4096));
    EXPECT_EQ(0u, reinterpret_cast<std::uintptr_t>(buffer->bytes()) % 4096);
    EXPECT_EQ(100u, buffer->capacity());
}
