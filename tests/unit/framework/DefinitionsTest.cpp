// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/framework/Definitions.h"

#include <gtest/gtest.h>

#include "host_interfaces/framework/String.h"
#include "reference_host/util/Ref.h"

using host::MakeRef;

namespace {

constexpr GUID kOne = ncfGuid("33333333-0000-4000-8000-000000000001");
constexpr GUID kTwo = ncfGuid("33333333-0000-4000-8000-000000000002");

}  // namespace

TEST(Definitions, KeepWhatThePluginSaid) {
    const auto definition = MakeRef<host::PluginDefinition>();
    EXPECT_EQ(NCF_OK, definition->Define(kOne, 1, 3, "Name", kTwo, "Vendor", 9, 1));
    const host::PluginFacts& facts = definition->facts();
    EXPECT_EQ(kOne, facts.id);
    EXPECT_EQ(kTwo, facts.secondId);
    EXPECT_EQ(1u, facts.major);
    EXPECT_EQ(3u, facts.minor);
    EXPECT_EQ("Name", facts.name);
    EXPECT_EQ("Vendor", facts.vendor);
    EXPECT_EQ(9u, facts.componentCount);
    EXPECT_EQ(1u, facts.last);
}

TEST(Definitions, KeepWhatTheComponentSaid) {
    const auto definition = MakeRef<host::ComponentDefinition>();
    EXPECT_EQ(NCF_OK, definition->Define(kOne, kTwo, 1, 1, kOne, "Thing"));
    const host::ComponentFacts& facts = definition->facts();
    EXPECT_EQ(kOne, facts.id);
    EXPECT_EQ(kTwo, facts.type);
    EXPECT_EQ(kOne, facts.classId);
    EXPECT_EQ(1u, facts.major);
    EXPECT_EQ(1u, facts.minor);
    EXPECT_EQ("Thing", facts.name);
}

TEST(Definitions, KeepAttributesInTheOrderOfTheirSetting) {
    const auto definition = MakeRef<host::ComponentDefinition>();
    const ncfUInt32 number = 6720;
    EXPECT_EQ(NCF_OK, definition->SetAttribute(kTwo, kNCFValueTypeUInt32, &number, 4));
    EXPECT_EQ(NCF_OK,
              definition->SetAttribute(kOne, kNCFValueTypeText, "whole text", kNCFZeroTerminated));
    const auto& attributes = definition->facts().attributes;
    ASSERT_EQ(2u, attributes.size());
    EXPECT_EQ(kTwo, attributes[0].id);
    EXPECT_EQ(kNCFValueTypeUInt32, attributes[0].valueType);
    EXPECT_EQ(6720u, attributes[0].Number());
    EXPECT_EQ("whole text", attributes[1].Text());
}

TEST(Definitions, AnAttributeSetAgainTakesTheNewValue) {
    const auto definition = MakeRef<host::PluginDefinition>();
    definition->SetAttribute(kOne, kNCFValueTypeText, "old", 3);
    definition->SetAttribute(kOne, kNCFValueTypeText, "newer", 3);
    ASSERT_EQ(1u, definition->facts().attributes.size());
    EXPECT_EQ("new", definition->facts().attributes[0].Text());
    EXPECT_EQ(0u, definition->facts().attributes[0].Number()) << "three bytes are no number";
}

TEST(Definitions, RefuseNulls) {
    const auto plugin = MakeRef<host::PluginDefinition>();
    const auto component = MakeRef<host::ComponentDefinition>();
    EXPECT_EQ(NCF_E_POINTER, plugin->SetAttribute(kOne, kNCFValueTypeText, nullptr, 3));
    EXPECT_EQ(NCF_E_POINTER, plugin->Define(kOne, 1, 3, nullptr, kTwo, "Vendor", 9, 1));
    EXPECT_EQ(NCF_E_POINTER, plugin->Define(kOne, 1, 3, "Name", kTwo, nullptr, 9, 1));
    EXPECT_EQ(NCF_E_POINTER, component->Define(kOne, kTwo, 1, 1, kOne, nullptr));
    EXPECT_EQ(NCF_E_NOTIMPL, plugin->ReservedPluginDefinitionA());
    EXPECT_EQ(NCF_E_NOTIMPL, component->ReservedComponentDefinitionB());
}
