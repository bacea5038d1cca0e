// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <gtest/gtest.h>

#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <functional>
#include <string>
#include <vector>

#include "host_interfaces/xml/SaxParser.h"
#include "reference_host/framework/Component.h"
#include "reference_host/framework/HostPath.h"
#include "reference_host/framework/String.h"
#include "reference_host/util/text/HostText.h"
#include "tests/support/TestFolder.h"

// A folder for a test's files, and a look at the end whether any object was
// kept.
class XmlTest : public testing::Test {
protected:
    XmlTest() : before_(host::LiveObjectCount()) {}
    ~XmlTest() override { EXPECT_EQ(before_, host::LiveObjectCount()) << "objects were kept"; }

    // Writes a file and gives its path as the module would.
    host::Ref<host::String> File(const std::string& content, const char* name = "file.xml") const {
        return host::ModulePath(folder_.Write(name, content));
    }

    static std::string Nested(int levels) {
        std::string text;
        for (int i = 0; i < levels; ++i) {
            text += "<a>";
        }
        for (int i = 0; i < levels; ++i) {
            text += "</a>";
        }
        return text;
    }

    static std::string Taken(INCFString* string) {
        if (string == nullptr) {
            return "(null)";
        }
        const std::string text = host::text::ReadUtf8(string);
        string->Release();
        return text;
    }

    const TestFolder folder_;

private:
    std::int64_t before_;
};

// Writes every event down, and may answer one of them with a result of its own.
class RecordingHandler final
    : public host::Component<UTIL::INCFSaxDocumentHandler, UTIL::INCFSaxErrorHandler> {
public:
    using Answer = std::function<NCFRESULT(const std::string& event)>;

    NCFRESULT Start() override { return Note("start"); }
    NCFRESULT End() override { return Note("end"); }
    NCFRESULT Element(INCFString* tag) override { return Note("<" + host::text::ReadUtf8(tag)); }
    NCFRESULT Attribute(INCFString* name, INCFString* value) override {
        return Note("@" + host::text::ReadUtf8(name) + "=" + host::text::ReadUtf8(value));
    }
    NCFRESULT Text(INCFString* text) override {
        return Note("'" + host::text::ReadUtf8(text) + "'");
    }
    NCFRESULT Warning(INCFString* message) override { return Message("warning", message); }
    NCFRESULT Error(INCFString* message) override { return Message("error", message); }
    NCFRESULT FatalError(INCFString* message) override { return Message("fatal", message); }

    std::vector<std::string> events;
    std::vector<std::string> messages;
    Answer answer;

private:
    NCFRESULT Note(const std::string& event) {
        events.push_back(event);
        return answer ? answer(event) : NCF_OK;
    }
    NCFRESULT Message(const std::string& kind, INCFString* message) {
        messages.push_back(kind + " " + host::text::ReadUtf8(message));
        message->Release();
        return NCF_OK;
    }
};
