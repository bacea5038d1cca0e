// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <gtest/gtest.h>

#include <algorithm>
#include <filesystem>
#include <fstream>
#include <memory>
#include <string>
#include <vector>

#include "host_interfaces/framework/HostSettings.h"
#include "host_interfaces/util/NMAUtil.h"
#include "source/clips/QuickTimeClip.h"
#include "source/plugin/Tr1Memory.h"
#include "tests/support/TestFolder.h"
#include "tests/support/fakes/FakeHost.h"
#include "tests/support/fakes/RecordingLogger.h"
#include "tests/support/fakes/parser/FakeParser.h"

// A file with given bytes that lives as long as the object.
class TempFile {
public:
    explicit TempFile(const std::vector<ncfUInt8>& bytes, const std::string& name = "clip.mov")
        : path_((folder_ / name).u8string()) {
        std::ofstream file(std::filesystem::u8path(path_), std::ios::binary);
        file.write(reinterpret_cast<const char*>(bytes.data()),
                   static_cast<std::streamsize>(bytes.size()));
    }

    const std::string& path() const { return path_; }

private:
    TestFolder folder_;
    std::string path_;
};

// The path of a movie that is not there.
inline std::string NoSuchMovie() {
    static const TestFolder folder;
    return (folder / "no_such_movie.mov").u8string();
}

// Bytes that tell their own place: 0, 1, ... 250, 0, 1, ...
inline std::vector<ncfUInt8> CountingBytes(std::size_t size) {
    std::vector<ncfUInt8> bytes(size);
    for (std::size_t i = 0; i < size; ++i) {
        bytes[i] = static_cast<ncfUInt8>(i % 251);
    }
    return bytes;
}

inline NCFSmartPtr<INCFString> HostText(const std::string& text) {
    NCFSmartPtr<INCFString> string;
    string.attach(MakeHostString(text));
    return string;
}

// Answers one flag, or nothing.
class FakeHostSettings : public FakeObject<NMA::IHostSettings> {
public:
    FakeHostSettings(Journal* journal, NCFRESULT result, ncfBool value)
        : journal_(journal), result_(result), value_(value) {}
    NCFRESULT GetHostSettingBoolean(const GUID& setting, ncfUInt32 scope, ncfBool* out) override {
        const bool asked = setting == NMA::NMAHostSetting_IgnoreAlpha;
        journal_->add(std::string("settings ") + (asked ? "ignore alpha" : "other") + " " +
                      std::to_string(scope));
        if (result_ >= 0) {
            *out = value_;
        }
        return result_;
    }

private:
    Journal* journal_;
    NCFRESULT result_;
    ncfBool value_;
};

// A clip over a fake parser and a small real file. The parser is set up first,
// then `Load` makes the clip. At the end every fake must be gone.
class ClipTest : public testing::Test {
protected:
    ClipTest() : ClipTest(CountingBytes(9000)) {}
    explicit ClipTest(const std::vector<ncfUInt8>& bytes) : file(bytes) {
        host = std::make_unique<FakeHost>(&journal);
        host->name(NCFCompID_QTParser, "parser");
        host->name(NMA::Impl::CompID_HostSettings, "settings");
        host->name(NCFCompID_NCFString, "string");
        host->name(QTWrapper::CompID_QuickTimeWrapper, "wrapper");
        host->name(QuickTime::CompID_QuickTimeProperty, "property");
        NMAInitialize(host->factory());
        log = std::make_unique<RecordingLog>(*host);
        parser = new FakeParser(&journal);
        host->maker(NCFCompID_QTParser, GiveParser(parser));
        journal.clear();
    }
    ~ClipTest() override {
        clip.reset();
        parser->Release();
        log.reset();
        NMATerminate();
        host.reset();
        EXPECT_EQ(LiveFakes(), 0) << "a reference is lost";
    }

    QuickTimeClip& Load() {
        NCFSmartPtr<INCFConsole> console(&host->console());
        NCFSmartPtr<INCFComponentFactory> factory(host->factory());
        clip.reset(new QuickTimeClip(HostText(file.path()), console, factory));
        return *clip;
    }
    // The usual movie: one picture track, id 1.
    QuickTimeClip& LoadVideo() {
        if (parser->videoTracks.empty()) {
            parser->AddVideoTrack(1);
        }
        return Load();
    }
    FakeVideoTrack& Video() { return *parser->videoTracks.at(0); }
    FakeVideoDescription& Picture() { return *Video().description; }

    void GiveSettings(NCFRESULT result, ncfBool value) {
        host->maker(NMA::Impl::CompID_HostSettings,
                    [this, result, value](const GUID& iid, void** out) {
                        auto* const settings = new FakeHostSettings(&journal, result, value);
                        const NCFRESULT answered = settings->QueryInterface(iid, out);
                        settings->Release();
                        return answered;
                    });
    }
    int Console(ncfUInt32 level, const std::string& text) {
        return host->console().count(level, text);
    }

    Journal journal;
    std::unique_ptr<FakeHost> host;
    std::unique_ptr<RecordingLog> log;
    TempFile file;
    FakeParser* parser = nullptr;
    std::tr1::shared_ptr<QuickTimeClip> clip;
};
