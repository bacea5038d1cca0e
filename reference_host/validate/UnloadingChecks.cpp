// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/validate/Steps.h"

namespace validate {
namespace {

void RefusesNullHost(Trial& trial) {
    Module module(trial);
    trial.Doing("calling NCFCanUnloadNow with null for the host");
    trial.ExpectResult(NCF_E_INVALIDARG, module.canUnloadNow(nullptr), "NCF_E_INVALIDARG");
}

void ObjectRefusesUnloading(Trial& trial) {
    Module module(trial);
    module.Start();
    ForEachObject(module, [&](Made& made) {
        made.factory.Reset();
        trial.Doing("calling NCFCanUnloadNow while an object of " + made.name + " lives");
        trial.ExpectRefusal(module.canUnloadNow(module.unknown()), "unloading is refused");
    });
}

void AllowsUnloadingAtTheEnd(Trial& trial) {
    Module module(trial);
    module.Start();
    trial.Doing("calling NCFCanUnloadNow before anything was made");
    ExpectIdle(module, "before anything was made");
    ForEachObject(module, [&](Made& made) {
        trial.Doing("calling NCFCanUnloadNow after the end of an object of " + made.name);
        made.object.Reset();
        made.factory.Reset();
        ExpectIdle(module, "when the object is gone");
    });
}

void GoesOnAfterRefusal(Trial& trial) {
    Module module(trial);
    module.Start();
    ForEachObject(module, [&](Made& made) {
        trial.Doing("making an object of " + made.name + " after unloading was refused");
        module.canUnloadNow(module.unknown());
        void* out = nullptr;
        const NCFRESULT result =
            made.factory->CreateInstance(module.unknown(), nullptr, IID_INCFUnknown, &out);
        const auto object = host::Ref<INCFUnknown>::Adopt(static_cast<INCFUnknown*>(out));
        trial.ExpectSuccess(result, "the module goes on as before");
        trial.Expect(static_cast<bool>(object), "an object", "null");
    });
}

void AskingChangesNothing(Trial& trial) {
    Module module(trial);
    module.Start();
    ForEachObject(module, [](const Made&) {});
    trial.Doing("calling NCFCanUnloadNow 100 times, and going on");
    for (int round = 0; round < 100; ++round) {
        ExpectIdle(module, "while nothing lives");
    }
    ForEachObject(module, [](const Made&) {});  // as before
}

void ShutdownSucceeds(Trial& trial) {
    Module module(trial);
    module.Start();
    ForEachObject(module, [](const Made&) {});
    trial.Doing("calling NCFShutdown");
    trial.ExpectSuccess(module.shutdown(module.unknown()), "NCFShutdown always succeeds");
}

void ShutdownGivesEverythingBack(Trial& trial) {
    Module module(trial);
    const std::int64_t before = module.host().LiveObjects();
    const ncfUInt32 references = module.unknown()->AddRef();
    module.unknown()->Release();
    module.Start();
    ForEachObject(module, [](const Made&) {});
    trial.Doing("calling NCFShutdown");
    module.Shutdown();
    const std::int64_t kept = module.host().LiveObjects() - before;
    trial.Expect(kept <= 0, "after NCFShutdown the module holds nothing of the host",
                 std::to_string(kept) + " of the host's objects are still held");
    const ncfUInt32 now = module.unknown()->AddRef();
    module.unknown()->Release();
    trial.Expect(now <= references, "after NCFShutdown the module holds no reference to the host",
                 std::to_string(now - references) + " more than before NCFStartup");
}

void LoadsAndUnloads(Trial& trial) {
    for (int round = 1; round <= 3; ++round) {
        const auto host = trial.NewHost();
        trial.Doing("loading and starting the module, time " + std::to_string(round));
        host::LoadFailure failure;
        if (host->LoadModule(trial.options().module, failure) == nullptr) {
            if (round == 1) {
                trial.Skip(failure.message);
            }
            trial.Fail("it loads as it did the first time", failure.message);
        }
        trial.Doing("unloading the module, time " + std::to_string(round));
        trial.ExpectSuccess(host->UnloadModule(), "unloading is allowed");
    }
}

}  // namespace

std::vector<Check> UnloadingChecks() {
    static constexpr char kCounter[] =
        "the counter of objects is not raised by each constructor and lowered by each destructor";
    return {
        {"unload-null-host", "NCFCanUnloadNow refuses a null host with NCF_E_INVALIDARG.",
         "the host is not looked at", RefusesNullHost},
        {"unload-refused", "While one object lives, NCFCanUnloadNow refuses.", kCounter,
         ObjectRefusesUnloading},
        {"unload-allowed", "When no object and no class factory lives, NCFCanUnloadNow allows.",
         kCounter, AllowsUnloadingAtTheEnd},
        {"unload-refused-goes-on", "After a refusal the module goes on as before.",
         "the question itself takes something down", GoesOnAfterRefusal},
        {"unload-question-only", "NCFCanUnloadNow only asks: the host may go on after a yes.",
         "the question itself takes something down", AskingChangesNothing},
        {"shutdown-succeeds", "NCFShutdown always succeeds.",
         "it hands on the result of something that it releases", ShutdownSucceeds},
        {"shutdown-gives-back", "After NCFShutdown the module holds nothing of the host.",
         "what NCFStartup took is not released, or is kept in a global variable",
         ShutdownGivesEverythingBack},
        {"unload-and-load-again",
         "A host may load, start, stop and unload the module again and again.",
         "a global variable keeps something of the host that is gone", LoadsAndUnloads},
    };
}

}  // namespace validate
