// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <map>
#include <memory>
#include <string>
#include <vector>

#include "host_interfaces/aaf/AAF.h"
#include "host_interfaces/aaf/AAFResultCodes.h"
#include "source/aaf/AAFRunTimeLibrary.h"
#include "tests/support/fakes/Journal.h"

class FakeAAFObject;

// An AAF library that writes every call into a journal, "SourceMob1.SetName
// clip", and refuses those that a test names. Objects are named after their
// class and numbered. It keeps just the state that a description reads back;
// each object answers every interface. What the calls come to is told by the
// tests over the real library.
//
// While it lives the module finds it in place of the real one. A test that
// leaves a reference fails.
class FakeAAF {
public:
    FakeAAF();
    ~FakeAAF();
    FakeAAF(const FakeAAF&) = delete;
    FakeAAF& operator=(const FakeAAF&) = delete;

    const Journal& journal() const { return journal_; }
    // Lines of one object, or of all objects whose name starts so.
    std::vector<std::string> linesOf(const std::string& object) const;
    // Whether this line stands in the journal.
    bool has(const std::string& line) const { return journal_.count(line) > 0; }
    // Place of the first line that starts so; -1 when there is none.
    int place(const std::string& start) const;
    int callCount() const { return calls_; }
    void clearJournal() { journal_.clear(); }

    // The n-th call from now, from 1, answers `result` and does nothing.
    void refuseCall(int nth, HRESULT result = AAFRESULT_INTERNAL_ERROR);
    // The n-th call whose line starts so.
    void refuse(const std::string& start, HRESULT result = AAFRESULT_INTERNAL_ERROR, int nth = 1);
    void clearRefusals();
    bool hasRefused() const { return refused_ > 0; }

    // A new file, or the dictionary and a fresh object of a class, each with a
    // reference for the caller; these are no calls of the module.
    IAAFFile* newFile();
    template <class Interface>
    Interface* make(const std::string& className) {
        return static_cast<Interface*>(makeFace(className, aafIdOf((const Interface*)nullptr)));
    }
    template <class Interface>
    Interface* dictionary() {
        return static_cast<Interface*>(dictionaryFace(aafIdOf((const Interface*)nullptr)));
    }

    // As the library does; a test may look past it.
    bool refusesNegativeLengths = true;
    // Refusals come as exceptions that carry the code.
    bool throwsRefusals = false;

    int liveObjects() const { return live_; }
    // What the module told the library when it opened the last file.
    const std::string& lastIdentification() const { return identification_; }

private:
    friend class FakeAAFObject;
    struct Refusal {
        std::string start;  // empty: any call
        HRESULT result;
        int left;
    };

    HRESULT note(const std::string& line);
    std::string nextName(const std::string& className);
    void* makeFace(const std::string& className, const GUID& iid);
    void* dictionaryFace(const GUID& iid);
    static HRESULT OpenTransient(aafProductIdentification_t* ident, IAAFFile** file);
    static void* Load(const char* name);
    static void* Find(void* library, const char* symbol);

    Journal journal_;
    int calls_ = 0;
    int live_ = 0;
    int refused_ = 0;
    std::vector<Refusal> refusals_;
    std::map<std::string, int> numbers_;
    std::string identification_;
    FakeAAFObject* dictionary_ = nullptr;
    NMA::Impl::LibraryAccess before_;
};
