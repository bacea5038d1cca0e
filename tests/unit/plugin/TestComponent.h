// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "source/plugin/CNCFUnknown.h"
#include "tests/support/fakes/Journal.h"

// Two interfaces of their own for a component to answer.
struct IFirst : INCFUnknown {
    virtual ncfUInt32 First() = 0;

protected:
    ~IFirst() = default;
};
struct ISecond : INCFUnknown {
    virtual ncfUInt32 Second() = 0;

protected:
    ~ISecond() = default;
};
inline constexpr GUID IID_First = ncfGuid("11111111-0000-0000-0000-000000000001");
inline constexpr GUID IID_Second = ncfGuid("22222222-0000-0000-0000-000000000002");
constexpr const GUID& ncfIdOf(const IFirst*) {
    return IID_First;
}
constexpr const GUID& ncfIdOf(const ISecond*) {
    return IID_Second;
}

// A component that writes its life into a journal.
class TestComponent final : public CNCFComponent<IFirst, ISecond> {
public:
    explicit TestComponent(INCFUnknown* outer) : CNCFComponent(outer) { note("made"); }
    ~TestComponent() override { note("destroyed"); }

    NCFRESULT InitializeInstance(INCFUnknown*) override {
        note("initialized");
        return initializeResult;
    }
    void FinalRelease() override { note("final release"); }
    NCFRESULT InternalQueryInterface(const GUID& iid, void** out) override {
        return QueryListedInterfaces<IFirst, ISecond>(this, iid, out);
    }
    ncfUInt32 First() override { return 1; }
    ncfUInt32 Second() override { return 2; }

    // Lets an allocation fail on demand.
    static void* operator new(std::size_t size, const std::nothrow_t&) noexcept {
        return refuseMemory ? nullptr : ::operator new(size, std::nothrow);
    }
    static void operator delete(void* memory) { ::operator delete(memory); }
    static void operator delete(void* memory, const std::nothrow_t&) { ::operator delete(memory); }

    static inline Journal* journal = nullptr;
    static inline NCFRESULT initializeResult = NCF_OK;
    static inline bool refuseMemory = false;

private:
    static void note(const char* line) {
        if (journal) {
            journal->add(line);
        }
    }
};
