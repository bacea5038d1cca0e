// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// The six functions of a module that is wrong in one thing, and its plain objects.

#include <csignal>
#include <cstdio>
#include <cstdlib>
#include <iterator>
#include <new>
#include <set>
#include <sstream>
#include <string>
#include <thread>
#include <vector>

#include "host_interfaces/framework/Lock.h"
#include "host_interfaces/framework/PluginEntry.h"
#include "host_interfaces/framework/String.h"
#include "tests/system/validate/FaultyObject.h"

namespace faulty {

bool Is(std::string_view fault) {
    static const std::set<std::string, std::less<>> chosen = [] {
        const char* const named = std::getenv("CLIPHOST_FAULT");
        std::istringstream words(named == nullptr ? "" : named);
        return std::set<std::string, std::less<>>(std::istream_iterator<std::string>(words), {});
    }();
    return chosen.count(fault) != 0;
}

void Crash() {
    std::signal(SIGSEGV, SIG_DFL);  // a sanitizer has its own
    std::raise(SIGSEGV);
    std::abort();
}

void Leak() {
    TheState().forgotten = new char[64];
}

bool IsFirstThread() {
    static const std::thread::id first = std::this_thread::get_id();
    return std::this_thread::get_id() == first;
}

State& TheState() {
    static State state;
    return state;
}

Object::Object(INCFUnknown* outer, bool isCounted)
    : root_(*this), controller_(outer != nullptr ? outer : &root_), isCounted_(isCounted) {
    TheState().liveObjects += isCounted_ ? 1 : 0;
    if (outer != nullptr && Is("create-aggregated-root")) {
        outer->AddRef();
    }
}

Object::~Object() {
    TheState().liveObjects -= isCounted_ ? 1 : 0;
    if (Is("order-shutdown-with-objects") && TheState().wasShutDown) {
        Crash();
    }
}

NCFRESULT Object::OwnQuery(const GUID& iid, void** out) {
    INCFUnknown* const found = iid == IID_INCFUnknown ? &root_ : Find(iid);
    const bool isTired = Is("query-stable") && ++queries_ > 100 && iid != IID_INCFUnknown;
    const bool isOrphan = Is("factory-released-first") && TheState().isFactoryGone;
    if (found == nullptr || isTired || isOrphan) {
        if (!Is("query-unknown-interface") && !Is("factory-interfaces")) {
            *out = nullptr;
        }
        return NCF_E_NOINTERFACE;
    }
    found->AddRef();
    if (Is("counts-end")) {
        found->AddRef();
    }
    *out = found;
    return NCF_OK;
}

ncfUInt32 Object::OwnAddRef() {
    const ncfUInt32 now = ++references_;
    return Is("counts-right") ? now - 1 : now;
}

ncfUInt32 Object::OwnRelease() {
    if (Is("counts-on-threads") && !IsFirstThread()) {
        return references_;
    }
    const ncfUInt32 left = --references_;
    if (left == 0) {
        delete this;
    }
    return left;
}

namespace {

constexpr GUID kPluginId = ncfGuid("22222222-0000-4000-8000-000000000001");
constexpr GUID kType = ncfGuid("22222222-0000-4000-8000-000000000002");
constexpr GUID kAttribute = ncfGuid("22222222-0000-4000-8000-000000000005");
constexpr GUID kThingComponent = ncfGuid("22222222-0000-4000-8000-000000000006");
constexpr GUID kThingClass = ncfGuid("22222222-0000-4000-8000-000000000016");
constexpr GUID kVolumeComponent = ncfGuid("22222222-0000-4000-8000-000000000007");
constexpr GUID kVolumeClass = ncfGuid("22222222-0000-4000-8000-000000000017");
constexpr GUID kTextVolumeComponent = ncfGuid("22222222-0000-4000-8000-000000000020");
constexpr GUID kTextVolumeClass = ncfGuid("22222222-0000-4000-8000-000000000030");
constexpr GUID kTextContainerComponent = ncfGuid("22222222-0000-4000-8000-000000000021");
constexpr GUID kTextContainerClass = ncfGuid("22222222-0000-4000-8000-000000000031");
constexpr GUID kLastVolumeComponent = ncfGuid("22222222-0000-4000-8000-000000000022");
constexpr GUID kLastVolumeClass = ncfGuid("22222222-0000-4000-8000-000000000032");
constexpr GUID kLastContainerComponent = ncfGuid("22222222-0000-4000-8000-000000000023");
constexpr GUID kLastContainerClass = ncfGuid("22222222-0000-4000-8000-000000000033");
constexpr GUID kShyComponent = ncfGuid("22222222-0000-4000-8000-000000000008");
constexpr GUID kShyClass = ncfGuid("22222222-0000-4000-8000-000000000018");

// What belongs to the module while it runs.
INCFString* keptString = nullptr;
INCFLock* keptLock = nullptr;

// Wrong before anybody calls anything, or at the very end.
struct AtTheEdges {
    AtTheEdges() {
        if (Is("file-starts-nothing")) {
            TheState().forgotten = std::fopen("/dev/null", "r");
        }
    }
    ~AtTheEdges() {
        if (Is("file-loads-again") || Is("end-crashes")) {
            Crash();
        }
        if (Is("end-has-status")) {
            std::_Exit(3);
        }
    }
} edges;

// Queries the host once, then twice, and so on; whether it answered all.
bool AskMoreEachTime(INCFUnknown* host) {
    static int times = 0;
    ++times;
    for (int i = 0; i < times; ++i) {
        void* factory = nullptr;
        if (host->QueryInterface(IID_INCFComponentFactory, &factory) < 0) {
            return false;
        }
        static_cast<INCFUnknown*>(factory)->Release();
    }
    return true;
}

class Thing final : public Object {
public:
    static NCFRESULT Make(INCFUnknown* host, INCFUnknown* outer, Object** made) {
        if (Is("create-by-class-id")) {
            return NCF_E_NOTIMPL;
        }
        if (Is("objects-many") && TheState().liveThings > 500) {
            return NCF_E_OUTOFMEMORY;
        }
        auto* const thing = new Thing(outer);
        thing->lock_ = Service<INCFLock>(host, CompID_LockComponent);
        if (thing->lock_ == nullptr) {
            if (Is("refusal-query")) {
                Crash();
            }
            if (!Is("refusal-creation")) {
                thing->OwnRelease();
            }
            return NCF_E_OUTOFMEMORY;
        }
        if (Is("leaks-objects")) {
            Leak();
        }
        if (Is("order-creation-not-started") && !TheState().isStarted) {
            Crash();
        }
        if (Is("queries-without-end") && !AskMoreEachTime(host)) {
            thing->OwnRelease();
            return NCF_E_OUTOFMEMORY;
        }
        thing->lock_->Lock();
        if (!Is("objects-locks")) {
            thing->lock_->Unlock();
        }
        *made = thing;
        return NCF_OK;
    }

private:
    explicit Thing(INCFUnknown* outer) : Object(outer) {
        if (++TheState().liveThings > 8 && Is("fuzz-calls")) {
            Crash();
        }
    }
    ~Thing() override {
        --TheState().liveThings;
        if (lock_ != nullptr) {
            lock_->Release();
        }
    }
    INCFUnknown* Find(const GUID&) override { return nullptr; }

    INCFLock* lock_ = nullptr;
};

class ClassFactory final : public Face<INCFClassFactory>, public Object {
public:
    explicit ClassFactory(Maker maker)
        : Object(nullptr, !Is("factory-refuses-unloading")), maker_(maker) {}

    NCFRESULT CreateInstance(INCFUnknown* host, INCFUnknown* outer, const GUID& iid,
                             void** out) override;

private:
    ~ClassFactory() override {
        TheState().isFactoryGone = true;
        if (Is("factory-counted-each")) {
            TheState().liveObjects = 1;  // the base takes that off
        }
    }
    Object& self() override { return *this; }
    INCFUnknown* Find(const GUID& iid) override {
        return iid == IID_INCFClassFactory ? this : nullptr;
    }

    Maker maker_;
    int made_ = 0;
};

// Whether the module's state forbids to make anything, as it should not.
bool IsOutOfOrder() {
    const State& state = TheState();
    return (Is("order-other-thread") && !IsFirstThread()) ||
           (Is("order-creation-on-threads") && !IsFirstThread()) ||
           (Is("unload-refused-goes-on") && state.wasRefused) ||
           (Is("unload-question-only") && state.questions > 50);
}

NCFRESULT ClassFactory::CreateInstance(INCFUnknown* host, INCFUnknown* outer, const GUID& iid,
                                       void** out) {
    if (out == nullptr) {
        return Is("create-null-output") ? NCF_OK : NCF_E_INVALIDARG;
    }
    *out = nullptr;
    if (host == nullptr) {
        if (Is("create-null-host")) {
            Crash();
        }
        return NCF_E_INVALIDARG;
    }
    if (outer != nullptr && iid != IID_INCFUnknown && !Is("create-aggregated-interface")) {
        return NCF_CLASS_E_NOAGGREGATION;
    }
    if (IsOutOfOrder() || (Is("factory-kept") && ++made_ > 1)) {
        return NCF_E_UNEXPECTED;
    }
    Object* made = nullptr;
    const NCFRESULT result = maker_(host, outer, &made);
    if (made == nullptr) {
        return result;
    }
    const NCFRESULT answered = made->OwnQuery(iid, out);
    if (answered < 0 && Is("leaks-refused-creation")) {
        Leak();
    }
    if (answered < 0 && Is("create-unknown-interface")) {
        return answered;
    }
    made->OwnRelease();
    return answered;
}

struct Row {
    GUID component;
    GUID classId;
    const char* name;
    Maker maker;
};

constexpr Row kRows[] = {
    {kThingComponent, kThingClass, "Thing", Thing::Make},
    {kTextVolumeComponent, kTextVolumeClass, "Text volume", MakeTextVolume},
    {kTextContainerComponent, kTextContainerClass, "Text container", MakeTextContainer},
    {kVolumeComponent, kVolumeClass, "Volume", MakeVolume},
    {kContainerComponent, kContainerClass, "Container", MakeContainer},
    {kLastVolumeComponent, kLastVolumeClass, "Last volume", MakeLastVolume},
    {kLastContainerComponent, kLastContainerClass, "Last container", MakeLastContainer},
    {kShyComponent, kShyClass, "Shy", nullptr}};
constexpr ncfUInt32 kCount = std::size(kRows);

// A definition object of the module's own.
class OwnDefinition final : public INCFPluginDefinition {
public:
    NCFRESULT QueryInterface(const GUID&, void** out) override {
        *out = nullptr;
        return NCF_E_NOINTERFACE;
    }
    ncfUInt32 AddRef() override { return 1; }
    ncfUInt32 Release() override { return 1; }
    NCFRESULT SetAttribute(const GUID&, const GUID&, const void*, ncfUInt32) override {
        return NCF_OK;
    }
    NCFRESULT Define(const GUID&, ncfUInt32, ncfUInt32, const char*, const GUID&, const char*,
                     ncfUInt32, ncfUInt32) override {
        return NCF_OK;
    }
};

GUID IdOfPlugin() {
    GUID id = Is("plugin-id") ? GUID{} : kPluginId;
    if (Is("registration-twice")) {
        static std::uint32_t times = 0;
        id.Data1 += ++times;
    }
    return id;
}

template <class Definition>
NCFRESULT Attribute(Definition* definition) {
    constexpr ncfUInt32 kValue = 1;
    const ncfUInt32 bytes = Is("definition-attributes") ? 3 : 4;
    const NCFRESULT result =
        definition->SetAttribute(kAttribute, kNCFValueTypeUInt32, &kValue, bytes);
    if (Is("attributes-without-end")) {
        static int times = 0;  // one more each time
        ++times;
        for (int i = 0; i < times; ++i) {
            if (definition->SetAttribute(kAttribute, kNCFValueTypeUInt32, &kValue, bytes) < 0) {
                return NCF_E_OUTOFMEMORY;
            }
        }
    }
    return Is("refusal-definition-calls") ? NCF_OK : result;
}

NCFRESULT Define(INCFPluginDefinition* definition) {
    return definition->Define(IdOfPlugin(), Is("plugin-versions") ? 0 : 1, 0,
                              Is("plugin-names") ? "" : "Faulty", kPluginId, "Nobody",
                              Is("plugin-component-count") ? 0xFFFFFFFF : kCount, 1);
}

NCFRESULT Define(INCFComponentDefinition* definition, ncfUInt32 index) {
    const Row& row = kRows[index];
    return definition->Define(Is("component-ids") ? kThingComponent : row.component,
                              Is("component-types") ? row.component : kType, 1, index,
                              Is("component-class-ids") ? kThingClass : row.classId,
                              Is("component-names") ? "\xFFThing" : row.name);
}

// Hands a definition out, or releases it where a step of filling it in has failed.
template <class Definition>
NCFRESULT HandOut(NCFRESULT result, Definition* definition, Definition** out) {
    if (result < 0) {
        definition->Release();
        return result;
    }
    *out = definition;
    return NCF_OK;
}

template <class Definition>
Definition* NewDefinition(INCFUnknown* host, const GUID& component, std::string_view leak) {
    auto* const definition = Service<Definition>(host, component);
    if (definition == nullptr && Is(leak)) {
        Service<INCFString>(host, NCFCompID_NCFString);  // never released
    }
    return definition;
}

void Wait() {
    for (;;) {
        std::this_thread::sleep_for(std::chrono::hours(1));
    }
}

// Takes what the module needs from the host.
NCFRESULT Take(INCFUnknown* host) {
    if (keptString == nullptr) {
        keptString = Service<INCFString>(host, NCFCompID_NCFString);
    }
    if (keptLock == nullptr) {
        keptLock = Service<INCFLock>(host, CompID_LockComponent);
    }
    if (keptLock == nullptr && Is("refusal-start")) {
        keptString = nullptr;
    }
    return keptString != nullptr && keptLock != nullptr ? NCF_OK : NCF_E_OUTOFMEMORY;
}

}  // namespace
}  // namespace faulty

using namespace faulty;

NCF_PLUGIN_EXPORT NCFRESULT NCFRegisterPlugin(INCFUnknown* host, INCFPluginDefinition** out) {
    if (host == nullptr || out == nullptr) {
        return Is("register-plugin-null") ? NCF_E_INVALIDARG : NCF_E_POINTER;
    }
    *out = nullptr;
    TheState().isRegistered = true;
    if (Is("order-plugin-registration-on-two-threads") && !IsFirstThread()) {
        return NCF_E_UNEXPECTED;
    }
    if (Is("plugin-definition")) {
        static OwnDefinition own;
        *out = &own;
        return NCF_OK;
    }
    if (Is("registration-keeps-nothing")) {
        host->AddRef();
    }
    if (Is("leaks-registration")) {
        Leak();
    }
    auto* const definition = NewDefinition<INCFPluginDefinition>(host, CompID_PluginDefinition,
                                                                 "refusal-plugin-registration");
    if (definition == nullptr) {
        return NCF_E_OUTOFMEMORY;
    }
    NCFRESULT result = Define(definition);
    if (Is("definition-once") || Is("refusal-definition-calls")) {
        result = Is("definition-once") ? Define(definition) : NCF_OK;
    }
    return HandOut(result < 0 ? result : Attribute(definition), definition, out);
}

NCF_PLUGIN_EXPORT NCFRESULT NCFRegisterComponent(INCFUnknown* host, ncfUInt32 index,
                                                 INCFComponentDefinition** out) {
    if (host == nullptr || out == nullptr) {
        return Is("register-component-null") ? NCF_E_INVALIDARG : NCF_E_POINTER;
    }
    *out = nullptr;
    if (index >= kCount && !Is("component-index-beyond")) {
        return NCF_E_INVALIDARG;
    }
    if ((Is("component-definitions") && index == 1) ||
        (Is("order-registration-after-start") && TheState().isStarted) ||
        (Is("order-registration-on-two-threads") && !IsFirstThread())) {
        return NCF_E_UNEXPECTED;
    }
    auto* const definition = NewDefinition<INCFComponentDefinition>(
        host, CompID_ComponentDefinition, index == 1 ? "refusal-component-registration" : "");
    if (definition == nullptr) {
        return NCF_E_OUTOFMEMORY;
    }
    NCFRESULT result = Define(definition, index % kCount);
    if (Is("second-component-goes-on") && index == 1) {
        result = NCF_OK;
    }
    return HandOut(result < 0 ? result : Attribute(definition), definition, out);
}

NCF_PLUGIN_EXPORT NCFRESULT NCFGetClassFactory(INCFUnknown* host, const GUID& classId,
                                               const GUID& interfaceId, void** out) {
    if (host == nullptr || out == nullptr) {
        return Is("factory-null-arguments") ? NCF_E_POINTER : NCF_E_INVALIDARG;
    }
    if (Is("order-factory-not-started") && TheState().wasShutDown) {
        Crash();
    }
    if (!Is("factory-unknown-class")) {
        *out = nullptr;
    }
    const bool isUnready = Is("order-start-without-registration") && !TheState().isRegistered;
    static int asked = 0;
    if (Is("factory-offered") || isUnready || (Is("create-by-component-id") && ++asked > 4)) {
        return NCF_CLASS_E_CLASSNOTAVAILABLE;
    }
    for (const Row& row : kRows) {
        if (row.maker == nullptr || row.classId != classId) {
            continue;
        }
        auto* const factory = new ClassFactory(row.maker);
        const NCFRESULT result = factory->OwnQuery(interfaceId, out);
        if (result >= 0 || !Is("factory-unknown-interface")) {
            factory->OwnRelease();
        }
        return result;
    }
    return NCF_CLASS_E_CLASSNOTAVAILABLE;
}

NCF_PLUGIN_EXPORT NCFRESULT NCFCanUnloadNow(INCFUnknown* host) {
    State& state = TheState();
    if (host == nullptr) {
        return Is("unload-null-host") ? NCF_OK : NCF_E_INVALIDARG;
    }
    ++state.questions;
    const bool isAlone =
        state.liveObjects == 0 && !(Is("order-unload-question-on-two-threads") && !IsFirstThread());
    const bool isAllowed =
        Is("unload-refused") || (isAlone && !Is("unload-allowed") &&
                                 !(Is("order-unload-question-first") && !state.isStarted));
    state.wasRefused = state.wasRefused || !isAllowed;
    return isAllowed ? NCF_OK : NCF_E_FAIL;
}

NCF_PLUGIN_EXPORT NCFRESULT NCFStartup(INCFUnknown* host) {
    State& state = TheState();
    IsFirstThread();
    if ((Is("order-start-twice") && state.isStarted) ||
        (Is("order-start-again") && state.wasShutDown)) {
        return NCF_E_UNEXPECTED;
    }
    if (Is("unload-and-load-again") && std::getenv("CLIPHOST_FAULTY_BEFORE") != nullptr) {
        return NCF_E_UNEXPECTED;
    }
    setenv("CLIPHOST_FAULTY_BEFORE", "1", 1);
    if (Is("order-no-thread") && !state.isStarted) {
        std::thread(Wait).detach();
    }
    if (Is("leaks-start")) {
        Leak();
    }
    if (Is("takes-memory")) {
        static const std::vector<char> taken(std::size_t{100} << 20, 1);
    }
    const NCFRESULT result = Take(host);
    state.isStarted = state.isStarted || result >= 0;
    state.wasShutDown = false;
    return result;
}

NCF_PLUGIN_EXPORT NCFRESULT NCFShutdown(INCFUnknown*) {
    State& state = TheState();
    if (Is("order-shutdown-twice") && state.wasShutDown) {
        Crash();
    }
    const bool isNeeded = state.isStarted || keptString != nullptr || keptLock != nullptr;
    if (Is("order-shutdown-without-start") && !isNeeded && !state.wasShutDown) {
        return NCF_E_UNEXPECTED;
    }
    if (keptLock != nullptr) {
        keptLock->Release();
        keptLock = nullptr;
    }
    if (keptString != nullptr && !Is("shutdown-gives-back")) {
        keptString->Release();
        keptString = nullptr;
    }
    state.isStarted = false;
    state.wasShutDown = true;
    return Is("shutdown-succeeds") ? NCF_E_FAIL : NCF_OK;
}
