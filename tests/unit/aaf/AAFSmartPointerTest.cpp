// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/aaf/AAFSmartPointer.h"

#include <gtest/gtest.h>

#include <cstring>

namespace {

struct ILeaf : IUnknown {
    virtual HRESULT Ping() = 0;

protected:
    ~ILeaf() = default;
};

struct Leaf final : ILeaf {
    HRESULT QueryInterface(REFIID, void** out) override {
        *out = static_cast<ILeaf*>(this);
        AddRef();
        return 0;
    }
    ULONG AddRef() override { return ++references; }
    ULONG Release() override { return --references; }
    HRESULT Ping() override { return 17; }

    // Puts itself out in the three ways of the library.
    void PutTyped(ILeaf** out) {
        AddRef();
        *out = this;
    }
    void PutRoot(IUnknown** out) {
        AddRef();
        *out = this;
    }

    ULONG references = 0;
};

using LeafPointer = IAAFSmartPointer<ILeaf>;

TEST(AAFSmartPointer, AccessThroughAnEmptyOneThrowsTheTextRep) {
    LeafPointer empty;
    try {
        empty->Ping();
        FAIL() << "nothing was thrown";
    } catch (const char* text) {
        EXPECT_STREQ(text, "_rep");
    }
}

TEST(AAFSmartPointer, HoldsOneReferenceForEachCopy) {
    Leaf leaf;
    {
        LeafPointer first(&leaf);
        LeafPointer second(first);
        LeafPointer third;
        third = second;
        EXPECT_EQ(leaf.references, 3u);
        EXPECT_EQ(third->Ping(), 17);
        third = LeafPointer();
        EXPECT_EQ(leaf.references, 2u);
    }
    EXPECT_EQ(leaf.references, 0u);
}

TEST(AAFSmartPointer, SurvivesAssignmentToItself) {
    Leaf leaf;
    LeafPointer pointer(&leaf);
    LeafPointer& same = pointer;
    pointer = same;
    EXPECT_EQ(leaf.references, 1u);
    EXPECT_EQ(pointer->Ping(), 17);
}

TEST(AAFSmartPointer, TakesAnOutputOfItsOwnInterface) {
    Leaf leaf;
    LeafPointer pointer;
    leaf.PutTyped(&pointer);
    EXPECT_EQ(leaf.references, 1u);
    EXPECT_EQ(static_cast<ILeaf*>(pointer), &leaf);
}

TEST(AAFSmartPointer, TakesAnOutputAsRoot) {
    Leaf leaf;
    LeafPointer pointer;
    leaf.PutRoot((IUnknown**)&pointer);
    EXPECT_EQ(static_cast<ILeaf*>(pointer), &leaf);
}

TEST(AAFSmartPointer, TakesAnOutputAsVoid) {
    Leaf leaf;
    LeafPointer pointer;
    leaf.QueryInterface({}, (void**)&pointer);
    EXPECT_EQ(leaf.references, 1u);
    EXPECT_EQ(static_cast<ILeaf*>(pointer), &leaf);
}

TEST(AAFSmartPointer, TakesTheRootItself) {
    Leaf leaf;
    IAAFSmartPointer<IUnknown> pointer;
    leaf.PutRoot(&pointer);
    EXPECT_EQ(leaf.references, 1u);
    EXPECT_EQ(static_cast<IUnknown*>(pointer), &leaf);
}

TEST(AAFSmartPointer, ReleasesWhatItHeldBeforeAnOutput) {
    Leaf former;
    Leaf next;
    LeafPointer pointer(&former);
    next.PutTyped(&pointer);
    EXPECT_EQ(former.references, 0u);
    EXPECT_EQ(next.references, 1u);
}

TEST(AAFSmartPointer, IsEmptyAfterACallThatPutNothingOut) {
    Leaf leaf;
    LeafPointer pointer(&leaf);
    [](ILeaf**) {}(&pointer);
    EXPECT_EQ(static_cast<ILeaf*>(pointer), nullptr);
    EXPECT_EQ(leaf.references, 0u);
}

}  // namespace
