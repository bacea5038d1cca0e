// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/validate/KnownInterfaces.h"
#include "reference_host/validate/Locks.h"
#include "reference_host/validate/Steps.h"

namespace validate {
namespace {

constexpr GUID kForeignInterface = ncfGuid("0F7D62A4-58C9-4E1B-A36D-7B2C91E4F058");
constexpr GUID kUnknownComponent = ncfGuid("E83B5C17-6A04-4D92-9F2E-15A8D7C0B364");

host::Ref<INCFUnknown> Ask(INCFUnknown* object, const GUID& id) {
    void* out = nullptr;
    const NCFRESULT result = object->QueryInterface(id, &out);
    auto found = host::Ref<INCFUnknown>::Adopt(static_cast<INCFUnknown*>(out));
    if (result < 0) {
        found.Reset();
    }
    return found;
}

// An interface of an object, under its name.
struct Answered {
    const KnownInterface* known;
    host::Ref<INCFUnknown> pointer;
};

std::vector<Answered> InterfacesOf(INCFUnknown* object) {
    std::vector<Answered> all;
    for (const KnownInterface& known : KnownInterfaces()) {
        if (host::Ref<INCFUnknown> pointer = Ask(object, known.id)) {
            all.push_back({&known, std::move(pointer)});
        }
    }
    return all;
}

// Each object with its interfaces.
void ForEachInterface(Trial& trial,
                      const std::function<void(const Made&, std::vector<Answered>&)>& visit) {
    Module module(trial);
    module.Start();
    ForEachObject(module, [&](Made& made) {
        trial.Doing("querying an object of " + made.name + " for each known interface");
        std::vector<Answered> all = InterfacesOf(made.object.get());
        visit(made, all);
    });
}

void CreatedByClassId(Trial& trial) {
    Module module(trial);
    module.Start();
    const auto components = module.Components();
    bool isAny = false;
    for (std::size_t i = 0; i < components.size(); ++i) {
        const auto factory = FactoryOf(module, components[i]);
        if (!factory) {
            continue;
        }
        isAny = true;
        trial.Doing("making an object of " + NameOf(components[i], i) + " by its class factory");
        void* out = nullptr;
        const NCFRESULT result =
            factory->CreateInstance(module.unknown(), nullptr, IID_INCFUnknown, &out);
        const auto object = host::Ref<INCFUnknown>::Adopt(static_cast<INCFUnknown*>(out));
        trial.ExpectSuccess(result);
        trial.Expect(static_cast<bool>(object), "an object", "null");
    }
    if (!isAny) {
        trial.Skip("no component has a class factory");
    }
}

void CreatedByComponentId(Trial& trial) {
    const auto host = trial.NewHost();
    trial.Doing("loading the module as a host does, and starting it");
    host::LoadFailure failure;
    host::PluginModule* const module = host->LoadModule(trial.options().module, failure);
    if (module == nullptr) {
        trial.Skip(failure.message);
    }
    const auto components = module->components();
    for (std::size_t i = 0; i < components.size(); ++i) {
        trial.Doing("creating " + NameOf(components[i], i) +
                    " through the host's component factory");
        host::Ref<INCFUnknown> object;
        const NCFRESULT result = host->Create(components[i].id, object);
        trial.Expect(components[i].hasFactory ? result >= 0 && object : result < 0 && !object,
                     components[i].hasFactory ? "an object" : "a refusal, as by its class id",
                     trial.Text(result));
    }
    trial.Doing("creating a component that nobody has");
    host::Ref<INCFUnknown> none;
    trial.ExpectResult(NCF_CLASS_E_CLASSNOTAVAILABLE, host->Create(kUnknownComponent, none),
                       "NCF_CLASS_E_CLASSNOTAVAILABLE");
    trial.Doing("unloading the module as a host does");
    trial.ExpectSuccess(host->UnloadModule(), "the module allows it");
}

void RootIsTheSame(Trial& trial) {
    ForEachInterface(trial, [&](const Made& made, const std::vector<Answered>& all) {
        for (const Answered& one : all) {
            trial.Doing("querying " + std::string(one.known->name) + " of " + made.name +
                        " for IID_INCFUnknown");
            const auto root = Ask(one.pointer.get(), IID_INCFUnknown);
            trial.Expect(root.get() == made.object.get(), "the same pointer on every road",
                         root ? "another one" : "none");
        }
    });
}

void RefusesUnknownInterface(Trial& trial) {
    ForEachInterface(trial, [&](const Made& made, const std::vector<Answered>& all) {
        for (const Answered& one : all) {
            trial.Doing("querying " + std::string(one.known->name) + " of " + made.name +
                        " for an interface that nobody has");
            void* out = Garbage();
            trial.ExpectResult(NCF_E_NOINTERFACE,
                               one.pointer->QueryInterface(kForeignInterface, &out),
                               "NCF_E_NOINTERFACE");
            trial.Expect(out == nullptr, "the output is set to null", "it is left as it was");
        }
    });
}

void QueriesAreReflexive(Trial& trial) {
    ForEachInterface(trial, [&](const Made& made, const std::vector<Answered>& all) {
        for (const Answered& one : all) {
            trial.Doing("querying " + std::string(one.known->name) + " of " + made.name +
                        " for itself");
            trial.Expect(static_cast<bool>(Ask(one.pointer.get(), one.known->id)),
                         "an interface gives itself", "it refuses");
        }
    });
}

void QueriesAreSymmetric(Trial& trial) {
    ForEachInterface(trial, [&](const Made& made, const std::vector<Answered>& all) {
        for (const Answered& one : all) {
            for (const Answered& other : InterfacesOf(one.pointer.get())) {
                trial.Doing("querying " + made.name + " from " + one.known->name + " to " +
                            other.known->name + " and back");
                trial.Expect(static_cast<bool>(Ask(other.pointer.get(), one.known->id)),
                             "the way back leads to the first one", "it is refused");
            }
        }
    });
}

void QueriesAreTransitive(Trial& trial) {
    ForEachInterface(trial, [&](const Made& made, const std::vector<Answered>& all) {
        for (const Answered& one : all) {
            for (const Answered& other : all) {
                trial.Doing("querying " + made.name + " from " + one.known->name + " to " +
                            other.known->name);
                trial.Expect(static_cast<bool>(Ask(one.pointer.get(), other.known->id)),
                             "what the object's root gives, each of its interfaces gives",
                             "it is refused");
            }
        }
    });
}

void QueriesAreStable(Trial& trial) {
    constexpr int kRounds = 20;
    ForEachInterface(trial, [&](const Made& made, const std::vector<Answered>& all) {
        for (int round = 2; round <= kRounds; ++round) {
            trial.Doing("querying an object of " + made.name + " for each known interface, time " +
                        std::to_string(round));
            const std::size_t now = InterfacesOf(made.object.get()).size();
            trial.Expect(now == all.size(), "an object has the same interfaces as long as it lives",
                         std::to_string(now) + " instead of " + std::to_string(all.size()));
        }
    });
}

void CountsAreRight(Trial& trial) {
    ForEachInterface(trial, [&](const Made& made, std::vector<Answered>& all) {
        for (const Answered& one : all) {
            trial.Doing("calling AddRef and Release of " + std::string(one.known->name) + " of " +
                        made.name);
            const ncfUInt32 first = one.pointer->AddRef();
            const ncfUInt32 second = one.pointer->AddRef();
            const ncfUInt32 back = one.pointer->Release();
            const ncfUInt32 start = one.pointer->Release();
            trial.Expect(second == first + 1, "AddRef answers the new count, one higher",
                         std::to_string(first) + ", then " + std::to_string(second));
            trial.Expect(back == first && start + 1 == first,
                         "Release answers the new count, one lower",
                         std::to_string(back) + ", then " + std::to_string(start));
        }
    });
}

void EndsWithTheLastReference(Trial& trial) {
    Module module(trial);
    module.Start();
    ForEachObject(module, [&](Made& made) {
        std::vector<Answered> all = InterfacesOf(made.object.get());
        made.factory.Reset();
        all.clear();
        trial.Doing("releasing the last reference to an object of " + made.name);
        const ncfUInt32 left = made.object.Detach()->Release();
        trial.Expect(left == 0, "the last Release answers 0", std::to_string(left));
        ExpectIdle(module, "when an object's interfaces were queried and released");
    });
}

void CountsOnThreads(Trial& trial) {
    constexpr int kRounds = 20000;
    Module module(trial);
    module.Start();
    ForEachObject(module, [&](Made& made) {
        const ncfUInt32 before = made.object->AddRef();
        trial.Doing("calling AddRef and Release of " + made.name + " on four threads at once");
        OnThreads(4, [&](unsigned) {
            for (int round = 0; round < kRounds; ++round) {
                made.object->AddRef();
            }
            for (int round = 0; round < kRounds; ++round) {
                made.object->Release();
            }
        });
        const ncfUInt32 after = made.object->AddRef();
        made.object->Release();
        made.object->Release();
        trial.Expect(after == before + 1, "the count is the same afterwards",
                     std::to_string(after) + " instead of " + std::to_string(before + 1));
    });
}

void ManyAtOnce(Trial& trial) {
    constexpr int kObjects = 1000;
    Module module(trial);
    module.Start();
    ForEachObject(module, [&](Made& made) {
        trial.Doing("making 1000 objects of " + made.name);
        std::vector<host::Ref<INCFUnknown>> objects;
        for (int number = 0; number < kObjects; ++number) {
            void* out = nullptr;
            const NCFRESULT result =
                made.factory->CreateInstance(module.unknown(), nullptr, IID_INCFUnknown, &out);
            objects.push_back(host::Ref<INCFUnknown>::Adopt(static_cast<INCFUnknown*>(out)));
            trial.Expect(result >= 0 && objects.back(), "an object each time",
                         trial.Text(result) + " for number " + std::to_string(number));
        }
        trial.Doing("releasing 1000 objects of " + made.name + ", the first ones first");
        for (host::Ref<INCFUnknown>& object : objects) {
            object.Reset();
        }
        made.object.Reset();
        made.factory.Reset();
        ExpectIdle(module, "when all of them are released");
    });
}

void LocksAreGivenBack(Trial& trial) {
    LockCalls calls;  // outlives the module's host
    Module module(trial);
    RegisterCountingLocks(module.host(), calls);
    module.Start();
    ForEachObject(module, [&](Made& made) {
        InterfacesOf(made.object.get());
        trial.Doing("counting the locks that making an object of " + made.name + " took");
        ExpectGivenBack(trial, calls);
        trial.Doing("counting the locks that releasing an object of " + made.name + " took");
        made.object.Reset();
        ExpectGivenBack(trial, calls);
    });
    trial.Doing("counting the locks that were taken when NCFShutdown is done");
    module.Shutdown();
    ExpectGivenBack(trial, calls);
}

}  // namespace

std::vector<Check> ObjectChecks() {
    static constexpr char kLocks[] = "a way out of a function passes over the Unlock";
    return {
        {"create-by-class-id", "Every class that has a class factory can be made by it.",
         "the constructor or the second step of construction needs more than the host",
         CreatedByClassId},
        {"create-by-component-id",
         "A host that loads the module and asks its own component factory for a component id gets "
         "an object; one without a class factory is refused.",
         "registration and NCFGetClassFactory do not go by the same ids", CreatedByComponentId},
        {"query-root", "IID_INCFUnknown gives the same pointer on every road to an object.",
         "the root is that of the interface at hand, or a new object", RootIsTheSame},
        {"query-unknown-interface",
         "For an interface that it lacks, an object answers NCF_E_NOINTERFACE and sets the output "
         "to null.",
         "the output is set on success alone", RefusesUnknownInterface},
        {"query-reflexive", "A query of an interface for itself succeeds.",
         "QueryInterface of one base leaves out its own id", QueriesAreReflexive},
        {"query-symmetric", "Where a query leads from one interface to another, one leads back.",
         "each base has a QueryInterface of its own, and they know different ids",
         QueriesAreSymmetric},
        {"query-transitive",
         "An interface that can be reached from the object's root can be reached from each of its "
         "interfaces.",
         "each base has a QueryInterface of its own, and they know different ids",
         QueriesAreTransitive},
        {"query-stable", "An object has the same interfaces as long as it lives.",
         "an answer depends on state that changes", QueriesAreStable},
        {"counts-right", "AddRef and Release answer the new count, one higher and one lower.",
         "an interface counts for itself, or AddRef answers the count before", CountsAreRight},
        {"counts-end", "An object ends with its last reference.",
         "a query or the creation keeps a reference", EndsWithTheLastReference},
        {"counts-on-threads", "AddRef and Release may be called on several threads at once.",
         "the count is no atomic number", CountsOnThreads},
        {"objects-many", "A thousand objects of a class may live at once, and end in any order.",
         "objects are kept in a table of a fixed size, or share a buffer", ManyAtOnce},
        {"objects-locks", "An object gives each lock of the host's back that it takes.", kLocks,
         LocksAreGivenBack},
    };
}

}  // namespace validate
