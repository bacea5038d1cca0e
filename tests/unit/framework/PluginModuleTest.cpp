// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/framework/PluginModule.h"

#include <gtest/gtest.h>

#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <fstream>

#include "reference_host/framework/Host.h"
#include "tests/support/Environment.h"

namespace {

constexpr GUID kThing = ncfGuid("11111111-0000-4000-8000-000000000001");
constexpr GUID kShy = ncfGuid("11111111-0000-4000-8000-000000000003");

class PluginModuleTest : public testing::Test {
protected:
    void SetUp() override {
        char address[32];
        std::snprintf(address, sizeof(address), "%llx",
                      static_cast<unsigned long long>(reinterpret_cast<std::uintptr_t>(journal_)));
        SetVariable("CLIPHOST_TINY_MODULE_JOURNAL", address);
    }
    void TearDown() override {
        RemoveVariable("CLIPHOST_TINY_MODULE_JOURNAL");
        EXPECT_EQ(0, host_.LiveObjects());
    }

    static std::filesystem::path Module(const std::string& fault) {
        return std::filesystem::path(TINY_MODULES) / ("tiny_module_" + fault + ".nvx");
    }

    // Loads a module that must not load, and gives the reason.
    host::LoadFailure Refused(const std::string& fault) {
        host::LoadFailure failure;
        EXPECT_EQ(nullptr, host_.LoadModule(Module(fault), failure));
        EXPECT_NE(std::string::npos, failure.message.find(Module(fault).u8string()))
            << "the message names the file: " << failure.message;
        EXPECT_FALSE(host_.factory().Knows(kThing));
        return failure;
    }

    static bool Says(const host::LoadFailure& failure, const char* text) {
        return failure.message.find(text) != std::string::npos;
    }

    char journal_[64] = {};
    host::Host host_;
};

}  // namespace

TEST_F(PluginModuleTest, GoesTheWayThatModulesCountOn) {
    host::LoadFailure failure;
    ASSERT_NE(nullptr, host_.LoadModule(Module("right"), failure)) << failure.message;
    EXPECT_STREQ("P01S", journal_);
    EXPECT_EQ(NCF_OK, host_.UnloadModule());
    EXPECT_STREQ("P01SUE", journal_);
}

TEST_F(PluginModuleTest, KeepsWhatTheModuleSaidOfItself) {
    host::LoadFailure failure;
    host::PluginModule* module = host_.LoadModule(Module("right"), failure);
    ASSERT_NE(nullptr, module);
    EXPECT_EQ("Tiny", module->plugin().name);
    EXPECT_EQ("Nobody", module->plugin().vendor);
    EXPECT_EQ(1u, module->plugin().major);
    EXPECT_EQ(3u, module->plugin().minor);
    EXPECT_EQ(2u, module->plugin().componentCount);
    ASSERT_EQ(1u, module->plugin().attributes.size());
    EXPECT_EQ("a tiny module", module->plugin().attributes[0].Text());
    ASSERT_EQ(2u, module->components().size());
    EXPECT_EQ("Thing", module->components()[0].name);
    EXPECT_TRUE(module->components()[0].hasFactory);
    EXPECT_EQ("Shy", module->components()[1].name);
    EXPECT_EQ(1u, module->components()[1].minor);
    EXPECT_FALSE(module->components()[1].hasFactory);
}

TEST_F(PluginModuleTest, ItsComponentsAreMadeThroughTheHostsFactory) {
    host::LoadFailure failure;
    ASSERT_NE(nullptr, host_.LoadModule(Module("right"), failure));
    host::Ref<INCFClassFactory> thing;
    EXPECT_EQ(NCF_OK, host_.Create(kThing, thing));
    EXPECT_TRUE(thing);
    EXPECT_EQ(NCF_CLASS_E_CLASSNOTAVAILABLE, host_.Create(kShy, thing));
    host::Ref<INCFConsole> none;
    EXPECT_EQ(NCF_E_NOINTERFACE, host_.Create(kThing, none));
    void* out = nullptr;
    EXPECT_EQ(NCF_CLASS_E_NOAGGREGATION,
              host_.factory().CreateComponent(kThing, host_.unknown(), IID_INCFUnknown, &out));
}

TEST_F(PluginModuleTest, StaysWhileAnObjectOfItLives) {
    host::LoadFailure failure;
    ASSERT_NE(nullptr, host_.LoadModule(Module("right"), failure));
    host::Ref<INCFClassFactory> thing;
    ASSERT_EQ(NCF_OK, host_.Create(kThing, thing));
    EXPECT_EQ(NCF_E_FAIL, host_.UnloadModule());
    EXPECT_EQ(nullptr, std::strchr(journal_, 'E')) << "a module that refuses is not shut down";
    host::Ref<INCFClassFactory> another;
    EXPECT_EQ(NCF_OK, host_.Create(kThing, another)) << "and goes on as before";
    another.Reset();
    thing.Reset();
    EXPECT_EQ(NCF_OK, host_.UnloadModule());
    EXPECT_EQ(NCF_CLASS_E_CLASSNOTAVAILABLE, host_.Create(kThing, thing));
}

TEST_F(PluginModuleTest, AClassFactoryThatComesWithAFailureDoesNotKeepTheModule) {
    host::LoadFailure failure;
    host::PluginModule* module = host_.LoadModule(Module("hands_out_and_refuses"), failure);
    ASSERT_NE(nullptr, module) << failure.message;
    EXPECT_FALSE(module->components()[0].hasFactory);
    host::Ref<INCFClassFactory> thing;
    EXPECT_EQ(NCF_E_ACCESSDENIED, host_.Create(kThing, thing));
    EXPECT_EQ(NCF_OK, host_.UnloadModule());
}

TEST_F(PluginModuleTest, EndOfTheHostShutsARefusingModuleDown) {
    {
        host::Host brief;
        host::LoadFailure failure;
        ASSERT_NE(nullptr, brief.LoadModule(Module("never_unloads"), failure));
        EXPECT_EQ(NCF_E_FAIL, brief.UnloadModule());
    }
    EXPECT_STREQ("P01SUUE", journal_);
}

TEST_F(PluginModuleTest, LoadsAgainAfterUnloading) {
    host::LoadFailure failure;
    for (int turn = 0; turn < 3; ++turn) {
        ASSERT_NE(nullptr, host_.LoadModule(Module("right"), failure)) << failure.message;
        ASSERT_EQ(NCF_OK, host_.UnloadModule());
    }
}

TEST_F(PluginModuleTest, NamesTheFunctionThatIsMissing) {
    const host::LoadFailure one = Refused("no_class_factory");
    EXPECT_EQ(NCF_E_NOTSUPPORTED, one.code);
    EXPECT_TRUE(Says(one, "NCFGetClassFactory")) << one.message;
    const host::LoadFailure other = Refused("no_shutdown");
    EXPECT_EQ(NCF_E_NOTSUPPORTED, other.code);
    EXPECT_TRUE(Says(other, "NCFShutdown")) << other.message;
    EXPECT_STREQ("", journal_) << "nothing of a broken module is called";
}

TEST_F(PluginModuleTest, HandsOnWhatRegistrationRefused) {
    const host::LoadFailure failure = Refused("plugin_refuses");
    EXPECT_EQ(NCF_E_ACCESSDENIED, failure.code);
    EXPECT_TRUE(Says(failure, "NCFRegisterPlugin failed with 0x80000009")) << failure.message;
    EXPECT_STREQ("P", journal_) << "what was not started is not shut down";
}

TEST_F(PluginModuleTest, RefusesADefinitionThatIsNotThere) {
    EXPECT_EQ(NCF_E_UNEXPECTED, Refused("no_definition").code);
    EXPECT_EQ(NCF_E_UNEXPECTED, Refused("no_component_definition").code);
}

TEST_F(PluginModuleTest, NamesTheComponentThatWasRefused) {
    const host::LoadFailure failure = Refused("component_refuses");
    EXPECT_EQ(NCF_E_INVALIDARG, failure.code);
    EXPECT_TRUE(Says(failure, "component 1 with 0x80000003")) << failure.message;
}

TEST_F(PluginModuleTest, RefusesACountThatNoModuleHas) {
    const host::LoadFailure failure = Refused("too_many_components");
    EXPECT_EQ(NCF_E_UNEXPECTED, failure.code);
    EXPECT_TRUE(Says(failure, "4294967295 components")) << failure.message;
}

TEST_F(PluginModuleTest, TakesAFailedStartBack) {
    const host::LoadFailure failure = Refused("startup_refuses");
    EXPECT_EQ(NCF_E_OUTOFMEMORY, failure.code);
    EXPECT_TRUE(Says(failure, "NCFStartup failed")) << failure.message;
    EXPECT_STREQ("P01SE", journal_);
}

TEST_F(PluginModuleTest, SaysWhatIsWrongWithAFileThatIsNoModule) {
    host::LoadFailure failure;
    EXPECT_EQ(nullptr, host_.LoadModule("/no/such/module.nvx", failure));
    EXPECT_EQ(NCF_E_NOTFOUND, failure.code);
    EXPECT_TRUE(Says(failure, "/no/such/module.nvx")) << failure.message;
    const std::filesystem::path text = std::filesystem::path(TINY_MODULES) / "text.nvx";
    std::ofstream(text) << "this is no library";
    EXPECT_EQ(nullptr, host_.LoadModule(text, failure));
    EXPECT_EQ(NCF_E_NOTFOUND, failure.code);
}
