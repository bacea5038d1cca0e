// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include <algorithm>

#include "reference_host/system/ProcessFacts.h"
#include "reference_host/validate/Steps.h"

namespace validate {
namespace {

void AskedBeforeStart(Trial& trial) {
    Module module(trial);
    trial.Doing("calling NCFCanUnloadNow before anything else");
    trial.ExpectSuccess(module.canUnloadNow(module.unknown()), "unloading is allowed");
}

void ShutDownBeforeStart(Trial& trial) {
    Module module(trial);
    trial.Doing("calling NCFShutdown without NCFStartup before it");
    trial.ExpectSuccess(module.shutdown(module.unknown()));
    trial.Doing("calling NCFStartup after that");
    trial.ExpectSuccess(module.startup(module.unknown()));
    trial.Doing("calling NCFShutdown");
    trial.ExpectSuccess(module.shutdown(module.unknown()));
}

void StartedBeforeRegistration(Trial& trial) {
    Module module(trial);
    module.Start();
    trial.Doing("calling NCFRegisterPlugin after NCFStartup");
    host::Ref<INCFPluginDefinition> handed;
    trial.ExpectSuccess(module.registerPlugin(module.unknown(), handed.Out()));
    const ncfUInt32 count = module.ComponentCount();
    for (ncfUInt32 index = 0; index < count; ++index) {
        trial.Doing("calling NCFRegisterComponent after NCFStartup, for component " +
                    std::to_string(index));
        host::Ref<INCFComponentDefinition> component;
        trial.ExpectSuccess(module.registerComponent(module.unknown(), index, component.Out()));
    }
}

void StartedWithoutRegistration(Trial& trial) {
    std::vector<host::ComponentFacts> remembered;
    {
        Module former(trial);
        remembered = former.Components();
        former.Unmap();
    }
    Module module(trial);
    bool isAny = false;
    trial.Doing("calling NCFStartup without registration, as a host does that remembers it");
    module.Start();
    for (std::size_t i = 0; i < remembered.size(); ++i) {
        trial.Doing("calling NCFGetClassFactory without registration, for " +
                    NameOf(remembered[i], i));
        void* made = nullptr;
        const NCFRESULT result = module.getClassFactory(module.unknown(), remembered[i].classId,
                                                        IID_INCFClassFactory, &made);
        const auto factory =
            host::Ref<INCFClassFactory>::Adopt(static_cast<INCFClassFactory*>(made));
        trial.Expect(result >= 0 || result == NCF_CLASS_E_CLASSNOTAVAILABLE,
                     "a class factory, or NCF_CLASS_E_CLASSNOTAVAILABLE", trial.Text(result));
        isAny = isAny || factory;
    }
    trial.Expect(isAny, "a class factory for one component at least", "there is none");
}

void ExpectFactoriesOrNothing(Module& module, const std::vector<host::ComponentFacts>& components,
                              const std::string& when) {
    Trial& trial = module.trial();
    for (std::size_t i = 0; i < components.size(); ++i) {
        trial.Doing("calling NCFGetClassFactory " + when + ", for " + NameOf(components[i], i));
        void* made = nullptr;
        const NCFRESULT result = module.getClassFactory(module.unknown(), components[i].classId,
                                                        IID_INCFClassFactory, &made);
        const auto factory =
            host::Ref<INCFClassFactory>::Adopt(static_cast<INCFClassFactory*>(made));
        trial.Expect((result >= 0) == static_cast<bool>(factory),
                     "a class factory with success, or null with a failure",
                     trial.Text(result) + (factory ? ", and an object" : ", and null"));
    }
}

void AskedForFactoriesWhileNotStarted(Trial& trial) {
    Module module(trial);
    const auto components = module.Components();
    ExpectFactoriesOrNothing(module, components, "before NCFStartup");
    module.Start();
    module.Shutdown();
    ExpectFactoriesOrNothing(module, components, "after NCFShutdown");
}

void MakeObjects(Module& module) {
    ForEachObject(module, [](const Made&) {});
}

void StartedTwice(Trial& trial) {
    Module module(trial);
    module.Start();
    trial.Doing("calling NCFStartup a second time");
    trial.ExpectSuccess(module.startup(module.unknown()));
    MakeObjects(module);
    trial.Doing("calling NCFShutdown once after two starts");
    module.Shutdown();
    ExpectIdle(module, "after the shut-down");
}

void ShutDownTwice(Trial& trial) {
    Module module(trial);
    module.Start();
    MakeObjects(module);
    module.Shutdown();
    trial.Doing("calling NCFShutdown a second time");
    trial.ExpectSuccess(module.shutdown(module.unknown()));
}

void StartedAgain(Trial& trial) {
    Module module(trial);
    for (int round = 1; round <= 3; ++round) {
        trial.Doing("calling NCFStartup, time " + std::to_string(round) + " after a shut-down");
        const NCFRESULT result = module.startup(module.unknown());
        if (round == 1 && result < 0) {
            trial.Skip("NCFStartup fails: " + trial.Text(result));
        }
        trial.ExpectSuccess(result);
        MakeObjects(module);
        trial.Doing("calling NCFShutdown, time " + std::to_string(round));
        trial.ExpectSuccess(module.shutdown(module.unknown()));
    }
}

void ShutDownWithObjects(Trial& trial) {
    Module module(trial);
    module.Start();
    std::vector<Made> objects;
    ForEachObject(module, [&](Made& made) { objects.push_back(made); });
    trial.Doing("calling NCFShutdown while objects are alive");
    module.Shutdown();
    for (Made& made : objects) {
        trial.Doing("releasing an object of " + made.name + " after NCFShutdown");
        made.object.Reset();
        made.factory.Reset();
    }
    trial.Doing("calling NCFCanUnloadNow when the last is gone");
    ExpectIdle(module, "once the objects are gone");
}

void UsedOnAnotherThread(Trial& trial) {
    Module module(trial);
    module.Start();
    ForEachObject(module, [&](Made& made) {
        trial.Doing("making an object of " + made.name +
                    " on another thread than that of NCFStartup");
        host::Ref<INCFUnknown> object;
        OnThreads(1, [&](unsigned) {
            void* out = nullptr;
            const NCFRESULT result =
                made.factory->CreateInstance(module.unknown(), nullptr, IID_INCFUnknown, &out);
            object = host::Ref<INCFUnknown>::Adopt(static_cast<INCFUnknown*>(out));
            trial.Expect(result >= 0 && object, "an object, as on the first thread",
                         trial.Text(result));
        });
        trial.Doing("releasing an object of " + made.name + " on another thread than its own");
        object.Reset();
    });
    ExpectIdle(module, "when all objects are released");
}

void RegisteredOnTwoThreads(Trial& trial) {
    Module module(trial);
    const auto components = module.Components();
    trial.Doing("registering on two threads at once, 50 times");
    OnThreads(2, [&](unsigned) {
        for (int round = 0; round < 50; ++round) {
            for (ncfUInt32 index = 0; index < components.size(); ++index) {
                host::Ref<INCFComponentDefinition> handed;
                trial.ExpectSuccess(
                    module.registerComponent(module.unknown(), index, handed.Out()));
                trial.Expect(FactsOf(trial, handed.get()).classId == components[index].classId,
                             "the same answer on each thread",
                             "another one for component " + std::to_string(index));
            }
        }
    });
}

void PluginRegisteredOnTwoThreads(Trial& trial) {
    Module module(trial);
    const host::PluginFacts facts = module.Plugin();
    trial.Doing("calling NCFRegisterPlugin on two threads at once, 200 times");
    OnThreads(2, [&](unsigned) {
        for (int round = 0; round < 200; ++round) {
            host::Ref<INCFPluginDefinition> handed;
            trial.ExpectSuccess(module.registerPlugin(module.unknown(), handed.Out()));
            const host::PluginFacts again = FactsOf(trial, handed.get());
            trial.Expect(again.id == facts.id && again.componentCount == facts.componentCount,
                         "the same answer on each thread",
                         "another id or another number of components");
        }
    });
}

void AskedToUnloadOnTwoThreads(Trial& trial) {
    constexpr int kQuestions = 1000;
    Module module(trial);
    module.Start();
    trial.Doing("calling NCFCanUnloadNow on two threads at once while nothing is alive");
    OnThreads(2, [&](unsigned) {
        for (int question = 0; question < kQuestions; ++question) {
            ExpectIdle(module, "on each thread while nothing is alive");
        }
    });
    ForEachObject(module, [&](Made& made) {
        trial.Doing("calling NCFCanUnloadNow on two threads at once while an object of " +
                    made.name + " lives");
        OnThreads(2, [&](unsigned) {
            for (int question = 0; question < kQuestions; ++question) {
                trial.ExpectRefusal(module.canUnloadNow(module.unknown()),
                                    "a refusal on each thread");
            }
        });
    });
}

void CreatedBeforeStart(Trial& trial) {
    Module module(trial);
    const auto components = module.Components();
    for (std::size_t i = 0; i < components.size(); ++i) {
        trial.Doing("making an object of " + NameOf(components[i], i) + " before NCFStartup");
        const auto factory = FactoryOf(module, components[i]);
        if (!factory) {
            continue;
        }
        void* out = nullptr;
        const NCFRESULT result =
            factory->CreateInstance(module.unknown(), nullptr, IID_INCFUnknown, &out);
        const auto object = host::Ref<INCFUnknown>::Adopt(static_cast<INCFUnknown*>(out));
        trial.Expect((result >= 0) == static_cast<bool>(object),
                     "an object with success, or null with a failure",
                     trial.Text(result) + (object ? ", and an object" : ", and null"));
    }
    trial.Doing("calling NCFCanUnloadNow before NCFStartup, when the objects are released");
    ExpectIdle(module, "when all objects are released");
}

void CreatedOnThreads(Trial& trial) {
    Module module(trial);
    module.Start();
    std::vector<Made> kinds;
    ForEachObject(module, [&](Made& made) {
        made.object.Reset();
        kinds.push_back(made);
    });
    trial.Doing("making and releasing objects on four threads at once, 200 times");
    OnThreads(4, [&](unsigned) {
        for (int round = 0; round < 200; ++round) {
            for (const Made& kind : kinds) {
                void* object = nullptr;
                const auto factory = FactoryOf(module, kind.component);
                const NCFRESULT result = factory
                                             ? factory->CreateInstance(module.unknown(), nullptr,
                                                                       IID_INCFUnknown, &object)
                                             : NCF_E_FAIL;
                const auto made = host::Ref<INCFUnknown>::Adopt(static_cast<INCFUnknown*>(object));
                trial.Expect(result >= 0 && made, "an object each time",
                             kind.name + ": " + trial.Text(result));
            }
        }
    });
    kinds.clear();
    trial.Doing("calling NCFCanUnloadNow when all threads have released their objects");
    ExpectIdle(module, "when all threads have released their objects");
}

void NoThreadOfItsOwn(Trial& trial) {
    Module module(trial);
    const std::size_t before = host::system::OwnFacts().threads;
    std::size_t most = before;
    module.Start();
    ForEachObject(module, [&](Made&) { most = std::max(most, host::system::OwnFacts().threads); });
    trial.Doing("counting threads after NCFShutdown");
    module.Shutdown();
    const std::size_t after = ThreadsLeft(before);
    trial.Expect(after <= before, "no thread of the module is left, since its code may go",
                 std::to_string(after - before) + " more than before NCFStartup");
    if (most > before) {
        trial.Warn("the module starts no thread",
                   std::to_string(most - before) + " more while it ran");
    }
}

}  // namespace

std::vector<Check> OrderChecks() {
    return {
        {"order-unload-question-first",
         "NCFCanUnloadNow may be asked at any time; of a module that made nothing, it allows "
         "unloading.",
         "it reads something that NCFStartup makes", AskedBeforeStart},
        {"order-shutdown-without-start",
         "NCFShutdown takes back what there is, and nothing where nothing was started.",
         "it releases something without asking whether it is there", ShutDownBeforeStart},
        {"order-registration-after-start",
         "The registering functions use nothing but their arguments, so they work after NCFStartup "
         "too.",
         "registering writes or reads global state", StartedBeforeRegistration},
        {"order-start-without-registration",
         "A host that remembers what a module registered may skip registration the next time.",
         "a table that NCFGetClassFactory reads is filled in by registration",
         StartedWithoutRegistration},
        {"order-factory-not-started",
         "NCFGetClassFactory before NCFStartup and after NCFShutdown gives a class factory or "
         "refuses.",
         "it uses something that NCFStartup makes", AskedForFactoriesWhileNotStarted},
        {"order-creation-not-started",
         "An object that is made before NCFStartup is whole, or is refused.",
         "a constructor uses something that NCFStartup makes", CreatedBeforeStart},
        {"order-start-twice", "NCFStartup may come twice and needs one NCFShutdown.",
         "starts are counted, or a second one is refused", StartedTwice},
        {"order-shutdown-twice", "NCFShutdown may come twice.",
         "what was released is released again", ShutDownTwice},
        {"order-start-again", "After NCFShutdown the module may be started again, and works.",
         "something is made once and not again after NCFShutdown took it", StartedAgain},
        {"order-shutdown-with-objects",
         "A host that has to end shuts the module down while objects are alive, and releases them "
         "later.",
         "an object's destructor uses what NCFShutdown took away", ShutDownWithObjects},
        {"order-other-thread",
         "Calls come on any thread: objects may be made on another one than that of NCFStartup.",
         "something belongs to the thread that started the module", UsedOnAnotherThread},
        {"order-registration-on-two-threads",
         "Registration may run on two threads at once, with the same answers.",
         "a definition is kept in a global variable while it is filled in", RegisteredOnTwoThreads},
        {"order-plugin-registration-on-two-threads",
         "NCFRegisterPlugin may run on two threads at once, with the same answers.",
         "the definition is kept in a global variable while it is filled in",
         PluginRegisteredOnTwoThreads},
        {"order-unload-question-on-two-threads",
         "NCFCanUnloadNow may be asked on two threads at once, with the same answer.",
         "the question changes something, or belongs to the thread that started the module",
         AskedToUnloadOnTwoThreads},
        {"order-creation-on-threads",
         "Objects may be made and released on several threads at once.",
         "the counter of objects is not atomic, or creation shares a variable", CreatedOnThreads},
        {"order-no-thread",
         "A module starts no thread of its own; after NCFShutdown none may be left.",
         "NCFStartup or a constructor starts a thread", NoThreadOfItsOwn},
    };
}

}  // namespace validate
