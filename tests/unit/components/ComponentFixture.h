// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <gtest/gtest.h>

#include <filesystem>
#include <fstream>
#include <string>

#include "host_interfaces/framework/Capability.h"
#include "host_interfaces/header_parser/QTParser.h"
#include "host_interfaces/media/MediaContainer.h"
#include "host_interfaces/media/MediaVolume.h"
#include "host_interfaces/media/PluginComponents.h"
#include "host_interfaces/util/NMAUtil.h"
#include "source/components/QuickTimeMasterClips.h"
#include "source/components/QuickTimeMediaFormat.h"
#include "source/components/QuickTimeVolumeInfo.h"
#include "source/plugin/CNCFUnknown.h"
#include "source/plugin/NCFSmartPtr.h"
#include "tests/support/TestFolder.h"
#include "tests/support/fakes/RecordingLogger.h"

// A folder of its own and a fake host that can make the components of the
// module that make each other.
class ComponentFixture : public ::testing::Test {
protected:
    ComponentFixture() {
        NMAInitialize(host.factory());
        serve(NMA::CompID_QuickTimeVolumeInfo, CreateInstanceOf<NMA::Impl::QuickTimeVolumeInfo>);
        serve(NMA::CompID_QuickTimeMediaFormat, CreateInstanceOf<NMA::Impl::QuickTimeMediaFormat>);
        serve(NMA::CompID_QuickTimeMasterClips, CreateInstanceOf<NMA::Impl::QuickTimeMasterClips>);
    }
    ~ComponentFixture() override {
        NMATerminate();
        EXPECT_EQ(GetObjectCount(), 0u) << "a component is left";
    }

    void serve(const GUID& component, CreationFunction creator) {
        host.maker(component, [this, creator](const GUID& iid, void** out) {
            return creator(host.unknown(), nullptr, iid, out);
        });
    }

    template <class Interface>
    NCFSmartPtr<Interface> make(CreationFunction creator) {
        NCFSmartPtr<Interface> object;
        void* made = nullptr;
        EXPECT_EQ(
            creator(host.unknown(), nullptr, ncfIdOf(static_cast<Interface*>(nullptr)), &made),
            NCF_OK);
        object.attach(static_cast<Interface*>(made));
        return object;
    }

    std::filesystem::path write(const std::string& name, const std::string& bytes = "bytes") {
        std::ofstream(folder / name, std::ios::binary) << bytes;
        return folder / name;
    }

    // A path as hosts pass it: backslashes.
    static NCFSmartPtr<INCFString> path(const std::filesystem::path& path) {
        std::string text = path.u8string();
        for (char& c : text) {
            c = c == '/' ? '\\' : c;
        }
        NCFSmartPtr<INCFString> string;
        string.attach(MakeHostString(text));
        return string;
    }
    static NCFSmartPtr<INCFString> text(const std::string& utf8) {
        NCFSmartPtr<INCFString> string;
        string.attach(MakeHostString(utf8));
        return string;
    }

    const TestFolder testFolder;
    const std::filesystem::path folder = testFolder.path();
    FakeHost host;
};
