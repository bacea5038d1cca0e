// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "source/clips/OtherClip.h"
#include "tests/unit/clips/ClipFixture.h"
#include "tests/unit/clips/FakeWrapper.h"

// A clip over a fake wrapper and a small real file. The wrapper is set up
// first, then `LoadOther` makes the clip.
class OtherClipTest : public ClipTest {
protected:
    OtherClipTest() : OtherClipTest(CountingBytes(9000)) {}
    explicit OtherClipTest(const std::vector<ncfUInt8>& bytes) : ClipTest(bytes) {
        wrapper = new FakeWrapper(&journal);
        host->maker(QTWrapper::CompID_QuickTimeWrapper, [this](const GUID& iid, void** out) {
            return wrapper->QueryInterface(iid, out);
        });
    }
    ~OtherClipTest() override {
        other.reset();
        wrapper->Release();
    }

    OtherClip& LoadOther() {
        NCFSmartPtr<INCFConsole> console(&host->console());
        NCFSmartPtr<INCFComponentFactory> factory(host->factory());
        other.reset(new OtherClip(HostText(file.path()), console, factory));
        return *other;
    }
    // The usual movie: one picture track, number 1, and one of sound, number 2.
    OtherClip& LoadUsual() {
        wrapper->AddPicture(1);
        wrapper->AddSound(2);
        LoadOther();
        Forget();
        return *other;
    }
    // A clip whose wrapper can't be made.
    OtherClip& LoadWithoutWrapper() {
        host->refuseCreation(QTWrapper::CompID_QuickTimeWrapper, NCF_E_OUTOFMEMORY);
        LoadOther();
        Forget();
        return *other;
    }
    void Forget() {
        journal.clear();
        log->clear();
        host->console().clear();
    }
    const std::string& LastRecord() { return log->records().back().text; }

    FakeWrapper* wrapper;
    std::tr1::shared_ptr<OtherClip> other;
};
