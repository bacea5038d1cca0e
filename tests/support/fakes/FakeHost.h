// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstdarg>
#include <functional>
#include <map>
#include <string>
#include <vector>

#include "host_interfaces/framework/ComponentFactory.h"
#include "host_interfaces/framework/Console.h"
#include "host_interfaces/framework/String.h"
#include "tests/support/fakes/FakeObject.h"
#include "tests/support/fakes/Journal.h"

// Console that keeps what is written: "console 4: text", in the journal too
// when it has one.
class FakeConsole : public FakeObject<INCFConsole> {
public:
    explicit FakeConsole(Journal* journal = nullptr) : journal_(journal) {}

    NCFRESULT Write(ncfUInt32 level, const char* format, ...) override NCF_PRINTF(3, 4);

    struct Line {
        ncfUInt32 level;
        std::string text;
    };
    const std::vector<Line>& lines() const { return lines_; }
    int count(ncfUInt32 level, const std::string& text) const;
    void clear() { lines_.clear(); }

private:
    Journal* journal_;
    std::vector<Line> lines_;
};

// Host unknown and component factory in one: makes components from a table,
// refuses on demand, and writes every request into the journal.
//
// Strings are the reference host's own. Everything else is registered by the
// test: `host.maker(NCFCompID_QTParser, [&](const GUID& iid, void** out) {…})`.
// The object lives on the stack of a test; references are counted and must be
// back at zero when it dies.
class FakeHost {
public:
    // Puts an object with a reference into `*out`; gets the interface asked.
    using Maker = std::function<NCFRESULT(const GUID& iid, void** out)>;

    explicit FakeHost(Journal* journal = nullptr);
    ~FakeHost();  // fails the test when references are left
    FakeHost(const FakeHost&) = delete;
    FakeHost& operator=(const FakeHost&) = delete;

    INCFUnknown* unknown();
    INCFComponentFactory* factory();
    FakeConsole& console() { return *console_; }

    void maker(const GUID& component, Maker maker);
    // Name of a component or interface in the journal instead of its id.
    void name(const GUID& id, const std::string& name);

    // Refuses the n-th request (from 1) for a component, or for one interface
    // of it, with `result`; 0 means every request.
    void refuseCreation(const GUID& component, NCFRESULT result, int nth = 0);
    void refuseCreation(const GUID& component, const GUID& iid, NCFRESULT result, int nth = 0);
    // Refuses the host unknown's query for an interface.
    void refuseQuery(const GUID& iid, NCFRESULT result);
    void clearRefusals();

    // Requests for a component so far.
    int creations(const GUID& component) const;
    ncfUInt32 references() const;

private:
    class Unknown;
    friend class Unknown;
    struct Refusal {
        GUID component;
        GUID iid;
        bool anyInterface;
        NCFRESULT result;
        int nth;
        int seen;
    };

    NCFRESULT query(const GUID& iid, void** out);
    NCFRESULT create(const GUID& component, const GUID& iid, void** out);
    std::string nameOf(const GUID& id) const;

    Journal* journal_;
    FakeConsole* console_;
    Unknown* unknown_;
    std::vector<std::pair<GUID, Maker>> makers_;
    std::vector<std::pair<GUID, std::string>> names_;
    std::vector<std::pair<GUID, int>> created_;
    std::vector<Refusal> refusals_;
    std::vector<std::pair<GUID, NCFRESULT>> refusedQueries_;
};

// A host string with a text, one reference for the caller.
INCFString* MakeHostString(const std::string& utf8);
// Text of a host string, whatever its encoding; the string stays as it is.
std::string TextOf(INCFString* string);
