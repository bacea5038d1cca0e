// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#pragma once

#include <gtest/gtest.h>

#include <filesystem>
#include <fstream>

#include "host_interfaces/util/NMAUtil.h"
#include "reference_host/util/Ref.h"
#include "reference_host/xml/SaxParser.h"
#include "source/descriptor_data/GenericDocHandler.h"
#include "source/descriptor_data/IGenericDocHandler.h"
#include "source/plugin/CNCFUnknown.h"
#include "source/plugin/PluginFolder.h"
#include "tests/support/TestFolder.h"
#include "tests/support/fakes/RecordingLogger.h"
#include "tests/unit/descriptor_data/FakeSaxParser.h"

// A host in which data files can be read: strings, the module's own document
// handler, and either a scripted parser or the reference host's.
class DataHost : public ::testing::Test {
protected:
    DataHost() {
        EXPECT_GE(NMAInitialize(host.factory()), 0);
        host.name(kCLSID_SaxParser, "parser");
        host.name(kCLSID_GenericDocHandler, "handler");
        host.name(NCFCompID_NCFString, "string");
        host.maker(kCLSID_GenericDocHandler, [this](const GUID& iid, void** out) {
            return CreateInstanceOf<NMA::Impl::GenericDocHandler>(host.unknown(), nullptr, iid,
                                                                  out);
        });
        UseHostParser();
    }
    ~DataHost() override {
        SetPluginFolder(nullptr);
        NMATerminate();
        EXPECT_EQ(GetObjectCount(), 0u) << "components of the module are left";
    }

    void UseHostParser() {
        host.maker(kCLSID_SaxParser, [](const GUID& iid, void** out) {
            return host::MakeRef<host::SaxParser>()->QueryInterface(iid, out);
        });
    }
    void UseScript() {
        host.maker(kCLSID_SaxParser, [this](const GUID& iid, void** out) {
            auto* const parser = new FakeSaxParser(script, &journal);
            const NCFRESULT result = parser->QueryInterface(iid, out);
            parser->Release();
            return result;
        });
    }

    // A file in the test's own folder; gives its path.
    std::string Write(const std::string& name, const std::string& text) {
        return folder_.Write(name, text).u8string();
    }
    std::string Folder() const { return folder_.path().u8string() + "/"; }
    // Makes the test's own folder the module's.
    void MakeItTheModulesFolder() { SetModulesFolder(Folder()); }
    static void SetModulesFolder(const std::string& folder) {
        INCFString* const text = MakeHostString(folder);
        SetPluginFolder(text);
        text->Release();
    }

    Journal journal;
    FakeHost host{&journal};
    RecordingLog log{host};
    FakeSaxParser::Script script;

private:
    const TestFolder folder_;
};
