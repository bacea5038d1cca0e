// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <atomic>
#include <string_view>

#include "host_interfaces/framework/ComponentFactory.h"

// Objects of a module that is right in everything but what the environment names. The names are
// those of the checks that have to find it, and a few of how the process ends.
namespace faulty {

// Whether the module is to be wrong in this.
bool Is(std::string_view fault);

// Ends the process as a bad pointer would.
[[noreturn]] void Crash();

// Leaves 64 bytes behind.
void Leak();

// Whether this is the thread of the first call.
bool IsFirstThread();

// What the module counts and keeps.
struct State {
    std::atomic<int> liveObjects{0};
    std::atomic<int> liveThings{0};
    std::atomic<bool> isFactoryGone{false};
    std::atomic<bool> isRegistered{false};
    bool isStarted = false;
    bool wasShutDown = false;
    std::atomic<bool> wasRefused{false};  // by NCFCanUnloadNow
    std::atomic<int> questions{0};
    std::atomic<void*> forgotten{nullptr};  // the last thing that nobody gives back
};
State& TheState();

// The part of an object that counts and answers for itself; its interfaces ask the controlling
// object, which is an outer one where there is one.
class Object {
public:
    Object(const Object&) = delete;
    Object& operator=(const Object&) = delete;

    NCFRESULT OwnQuery(const GUID& iid, void** out);
    ncfUInt32 OwnAddRef();
    ncfUInt32 OwnRelease();

    INCFUnknown* controller() const { return controller_; }
    INCFUnknown* root() { return &root_; }

protected:
    explicit Object(INCFUnknown* outer, bool isCounted = true);
    virtual ~Object();
    // An interface of the object, without a reference; null where it has none.
    virtual INCFUnknown* Find(const GUID& iid) = 0;

private:
    struct Root final : INCFUnknown {
        explicit Root(Object& object) : owner(object) {}
        NCFRESULT QueryInterface(const GUID& iid, void** out) override {
            return owner.OwnQuery(iid, out);
        }
        ncfUInt32 AddRef() override { return owner.OwnAddRef(); }
        ncfUInt32 Release() override { return owner.OwnRelease(); }
        Object& owner;
    };

    Root root_;
    INCFUnknown* controller_;
    bool isCounted_;
    int queries_ = 0;
    std::atomic<ncfUInt32> references_{1};
};

// An interface whose root operations go to the object's controlling one.
template <class Interface>
class Face : public Interface {
public:
    NCFRESULT QueryInterface(const GUID& iid, void** out) override { return Ask(iid, out); }
    ncfUInt32 AddRef() override {
        return Is("create-aggregated-interfaces") ? self().OwnAddRef()
                                                  : self().controller()->AddRef();
    }
    ncfUInt32 Release() override {
        return Is("create-aggregated-interfaces") ? self().OwnRelease()
                                                  : self().controller()->Release();
    }

protected:
    ~Face() = default;
    virtual Object& self() = 0;
    virtual NCFRESULT Ask(const GUID& iid, void** out) {
        return self().controller()->QueryInterface(iid, out);
    }
};

// Makes an object of one class, with one reference; null where it can't be made.
using Maker = NCFRESULT (*)(INCFUnknown* host, INCFUnknown* outer, Object** made);

// A service of the host; null where it is refused.
template <class Interface>
Interface* Service(INCFUnknown* host, const GUID& component) {
    void* factory = nullptr;
    if (host->QueryInterface(IID_INCFComponentFactory, &factory) < 0) {
        return nullptr;
    }
    void* made = nullptr;
    auto* const creator = static_cast<INCFComponentFactory*>(factory);
    creator->CreateComponent(component, nullptr, ncfIdOf(static_cast<const Interface*>(nullptr)),
                             &made);
    creator->Release();
    return static_cast<Interface*>(made);
}

// The media components: for movies; for texts; and for texts, but when they are to be wrong, the
// container claims movies and describes none, the volume claims their folder and lists none.
NCFRESULT MakeVolume(INCFUnknown* host, INCFUnknown* outer, Object** made);
NCFRESULT MakeContainer(INCFUnknown* host, INCFUnknown* outer, Object** made);
NCFRESULT MakeTextVolume(INCFUnknown* host, INCFUnknown* outer, Object** made);
NCFRESULT MakeTextContainer(INCFUnknown* host, INCFUnknown* outer, Object** made);
NCFRESULT MakeLastVolume(INCFUnknown* host, INCFUnknown* outer, Object** made);
NCFRESULT MakeLastContainer(INCFUnknown* host, INCFUnknown* outer, Object** made);

inline constexpr GUID kContainerComponent = ncfGuid("22222222-0000-4000-8000-000000000003");
inline constexpr GUID kContainerClass = ncfGuid("22222222-0000-4000-8000-000000000013");

}  // namespace faulty
