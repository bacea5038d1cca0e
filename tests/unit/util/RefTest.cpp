// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/util/Ref.h"

#include <gtest/gtest.h>

#include "reference_host/framework/Capability.h"

using host::Capability;
using host::MakeRef;
using host::Ref;

namespace {

ncfUInt32 References(INCFUnknown* object) {
    object->AddRef();
    return object->Release();
}

// Hands out a reference to what it holds, and fails all the same.
class HandsOutAndFails final : public host::Component<INCFComponentFactory> {
public:
    explicit HandsOutAndFails(Capability& held) : held_(held) {}
    NCFRESULT QueryInterface(const GUID&, void** out) override { return HandOut(out); }
    NCFRESULT CreateComponent(const GUID&, INCFUnknown*, const GUID&, void** out) override {
        return HandOut(out);
    }

private:
    NCFRESULT HandOut(void** out) {
        held_.AddRef();
        *out = static_cast<INCFCapability*>(&held_);
        return NCF_E_HANDLE;
    }

    Capability& held_;
};

}  // namespace

TEST(Ref, HoldsOneReferenceAndGivesItBack) {
    const std::int64_t before = host::LiveObjectCount();
    {
        Ref<Capability> one = MakeRef<Capability>();
        EXPECT_EQ(1u, References(one.get()));
        const Ref<Capability> two = one;
        EXPECT_EQ(2u, References(one.get()));
        const Ref<INCFCapability> three = two;
        EXPECT_EQ(3u, References(one.get()));
        one.Reset();
        EXPECT_FALSE(one);
        EXPECT_EQ(2u, References(two.get()));
    }
    EXPECT_EQ(before, host::LiveObjectCount());
}

TEST(Ref, MovesAndDetachesWithoutCounting) {
    Ref<Capability> one = MakeRef<Capability>();
    Ref<Capability> two = std::move(one);
    EXPECT_EQ(1u, References(two.get()));
    Capability* raw = two.Detach();
    EXPECT_FALSE(two);
    two = Ref<Capability>::Adopt(raw);
    EXPECT_EQ(1u, References(raw));
}

TEST(Ref, OutLetsGoFirst) {
    const std::int64_t before = host::LiveObjectCount();
    Ref<Capability> one = MakeRef<Capability>();
    EXPECT_EQ(nullptr, *one.Out());
    EXPECT_EQ(before, host::LiveObjectCount());
}

TEST(Ref, QueryAsksForTheInterfaceHeld) {
    const Ref<Capability> object = MakeRef<Capability>();
    Ref<INCFCapability> found;
    EXPECT_EQ(NCF_OK, host::Query(object.get(), found));
    EXPECT_EQ(2u, References(object.get()));
    Ref<INCFComponentFactory> missing;
    EXPECT_EQ(NCF_E_NOINTERFACE, host::Query(object.get(), missing));
    EXPECT_FALSE(missing);
    EXPECT_EQ(NCF_E_POINTER, host::Query(nullptr, missing));
}

TEST(Ref, AFailedQueryOrCreationLeavesNoReferenceBehind) {
    const Ref<Capability> held = MakeRef<Capability>();
    const Ref<HandsOutAndFails> failing = MakeRef<HandsOutAndFails>(*held);
    Ref<INCFCapability> found;
    EXPECT_EQ(NCF_E_HANDLE, host::Query(failing.get(), found));
    EXPECT_FALSE(found);
    EXPECT_EQ(1u, References(held.get()));
    EXPECT_EQ(NCF_E_HANDLE, host::Create(*failing, CompID_Capability, found));
    EXPECT_FALSE(found);
    EXPECT_EQ(1u, References(held.get()));
}
