// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/validate/KnownInterfaces.h"
#include "reference_host/validate/Outer.h"
#include "reference_host/validate/Steps.h"

namespace validate {
namespace {

constexpr GUID kUnknownClass = ncfGuid("5A0E1C7B-93D2-4B61-8F0A-C2D417E6B8F1");
constexpr GUID kUnknownInterface = ncfGuid("C41B7E90-2D58-4A3F-B7C6-09E85F1A6D23");

// Each component that has a class factory, with the factory.
void ForEachFactory(Module& module, const std::function<void(Made&)>& visit) {
    ForEachObject(module, [&](Made& made) {
        made.object.Reset();
        visit(made);
    });
}

void OffersAFactory(Trial& trial) {
    Module module(trial);
    module.Start();
    const auto components = module.Components();
    bool isAny = false;
    for (std::size_t i = 0; i < components.size(); ++i) {
        trial.Doing("calling NCFGetClassFactory for " + NameOf(components[i], i));
        void* out = nullptr;
        const NCFRESULT result = module.getClassFactory(module.unknown(), components[i].classId,
                                                        IID_INCFClassFactory, &out);
        const auto factory =
            host::Ref<INCFClassFactory>::Adopt(static_cast<INCFClassFactory*>(out));
        trial.Expect(result >= 0 ? static_cast<bool>(factory)
                                 : result == NCF_CLASS_E_CLASSNOTAVAILABLE && !factory,
                     "a class factory, or NCF_CLASS_E_CLASSNOTAVAILABLE and null",
                     trial.Text(result) + (factory ? ", and an object" : ", and null"));
        isAny = isAny || factory;
    }
    trial.Expect(isAny, "a class factory for one component at least", "there is none");
}

void RefusesUnknownClass(Trial& trial) {
    Module module(trial);
    module.Start();
    trial.Doing("calling NCFGetClassFactory with a class id that nobody has");
    void* out = Garbage();
    const NCFRESULT result =
        module.getClassFactory(module.unknown(), kUnknownClass, IID_INCFClassFactory, &out);
    trial.ExpectResult(NCF_CLASS_E_CLASSNOTAVAILABLE, result, "NCF_CLASS_E_CLASSNOTAVAILABLE");
    trial.Expect(out == nullptr, "the output is set to null", "it is left as it was");
}

void RefusesNullArguments(Trial& trial) {
    Module module(trial);
    module.Start();
    const auto components = module.Components();
    trial.Expect(!components.empty(), "there is a component", "there is none");
    trial.Doing("calling NCFGetClassFactory with null for the host");
    host::Ref<INCFUnknown> out;
    trial.ExpectResult(NCF_E_INVALIDARG,
                       module.getClassFactory(nullptr, components[0].classId, IID_INCFClassFactory,
                                              reinterpret_cast<void**>(out.Out())),
                       "NCF_E_INVALIDARG");
    trial.Doing("calling NCFGetClassFactory with null for the output");
    trial.ExpectResult(NCF_E_INVALIDARG,
                       module.getClassFactory(module.unknown(), components[0].classId,
                                              IID_INCFClassFactory, nullptr),
                       "NCF_E_INVALIDARG");
}

void FactoryRefusesUnknownInterface(Trial& trial) {
    Module module(trial);
    module.Start();
    ForEachFactory(module, [&](Made& made) {
        made.factory.Reset();
        trial.Doing("calling NCFGetClassFactory of " + made.name +
                    " for an interface that nobody has");
        void* out = Garbage();
        const NCFRESULT result = module.getClassFactory(module.unknown(), made.component.classId,
                                                        kUnknownInterface, &out);
        trial.ExpectResult(NCF_E_NOINTERFACE, result, "NCF_E_NOINTERFACE");
        trial.Expect(out == nullptr, "the output is set to null", "it is left as it was");
        ExpectIdle(module, "after a class factory without the interface");
    });
}

void FactoryIsKept(Trial& trial) {
    Module module(trial);
    module.Start();
    ForEachFactory(module, [&](Made& made) {
        std::vector<host::Ref<INCFUnknown>> objects;
        for (int number = 1; number <= 3; ++number) {
            trial.Doing("making object " + std::to_string(number) + " of " + made.name +
                        " with one class factory");
            void* out = nullptr;
            const NCFRESULT result =
                made.factory->CreateInstance(module.unknown(), nullptr, IID_INCFUnknown, &out);
            objects.push_back(host::Ref<INCFUnknown>::Adopt(static_cast<INCFUnknown*>(out)));
            trial.Expect(result >= 0 && objects.back(), "an object each time", trial.Text(result));
            if (number > 1 && objects.back().get() == objects.front().get()) {
                trial.Warn("a new object each time", "the one that was made before");
            }
        }
    });
}

void FactoryRefusesUnloading(Trial& trial) {
    Module module(trial);
    module.Start();
    ForEachFactory(module, [&](Made& made) {
        trial.Doing("calling NCFCanUnloadNow while the class factory of " + made.name + " lives");
        trial.ExpectRefusal(module.canUnloadNow(module.unknown()), "unloading is refused");
        made.factory.Reset();
        ExpectIdle(module, "once the class factory of " + made.name + " is released");
    });
}

void EachFactoryCounts(Trial& trial) {
    constexpr int kFactories = 3;
    Module module(trial);
    module.Start();
    ForEachFactory(module, [&](Made& made) {
        made.factory.Reset();
        std::vector<host::Ref<INCFClassFactory>> factories;
        for (int number = 1; number <= kFactories; ++number) {
            trial.Doing("getting class factory " + std::to_string(number) + " of " + made.name);
            factories.push_back(FactoryOf(module, made.component));
            trial.Expect(static_cast<bool>(factories.back()), "a class factory each time", "none");
        }
        for (int left = kFactories; left > 0; --left) {
            trial.Doing("calling NCFCanUnloadNow while " + std::to_string(left) +
                        " class factories of " + made.name + " live");
            trial.ExpectRefusal(module.canUnloadNow(module.unknown()), "unloading is refused");
            factories.pop_back();
        }
        ExpectIdle(module, "once the last class factory of " + made.name + " is released");
    });
}

void ObjectOutlivesFactory(Trial& trial) {
    Module module(trial);
    module.Start();
    ForEachObject(module, [&](Made& made) {
        trial.Doing("using an object of " + made.name + " after its class factory's release");
        made.factory.Reset();
        host::Ref<INCFUnknown> root;
        trial.ExpectSuccess(host::Query(made.object.get(), root), "the object answers");
    });
}

void FactoryAnswersItsInterfaces(Trial& trial) {
    Module module(trial);
    module.Start();
    ForEachFactory(module, [&](Made& made) {
        trial.Doing("querying the class factory of " + made.name);
        host::Ref<INCFUnknown> root;
        trial.ExpectSuccess(host::Query(made.factory.get(), root), "success for IID_INCFUnknown");
        host::Ref<INCFClassFactory> factory;
        trial.ExpectSuccess(host::Query(root.get(), factory), "success for IID_INCFClassFactory");
        void* out = Garbage();
        trial.ExpectResult(NCF_E_NOINTERFACE, made.factory->QueryInterface(kUnknownInterface, &out),
                           "NCF_E_NOINTERFACE for an interface that nobody has");
        trial.Expect(out == nullptr, "the output is set to null", "it is left as it was");
    });
}

void CreationRefusesNullOutput(Trial& trial) {
    Module module(trial);
    module.Start();
    ForEachFactory(module, [&](Made& made) {
        trial.Doing("calling CreateInstance of " + made.name + " with null for the output");
        trial.ExpectRefusal(
            made.factory->CreateInstance(module.unknown(), nullptr, IID_INCFUnknown, nullptr));
        made.factory.Reset();
        ExpectIdle(module, "after a creation without an output");
    });
}

void CreationRefusesUnknownInterface(Trial& trial) {
    Module module(trial);
    module.Start();
    ForEachFactory(module, [&](Made& made) {
        trial.Doing("calling CreateInstance of " + made.name + " for an interface that nobody has");
        void* out = Garbage();
        const NCFRESULT result =
            made.factory->CreateInstance(module.unknown(), nullptr, kUnknownInterface, &out);
        trial.ExpectResult(NCF_E_NOINTERFACE, result, "NCF_E_NOINTERFACE");
        trial.Expect(out == nullptr, "the output is set to null", "it is left as it was");
        made.factory.Reset();
        ExpectIdle(module, "after a creation for an interface that the object lacks");
    });
}

void AggregationNeedsTheRoot(Trial& trial) {
    Module module(trial);
    module.Start();
    ForEachFactory(module, [&](Made& made) {
        trial.Doing("calling CreateInstance of " + made.name +
                    " with an outer object, for another interface than IID_INCFUnknown");
        Outer outer;
        void* out = Garbage();
        const NCFRESULT result =
            made.factory->CreateInstance(module.unknown(), &outer, IID_INCFClassFactory, &out);
        trial.ExpectResult(NCF_CLASS_E_NOAGGREGATION, result, "NCF_CLASS_E_NOAGGREGATION");
        trial.Expect(out == nullptr, "the output is set to null", "it is left as it was");
        made.factory.Reset();
        ExpectIdle(module, "after an aggregation that was refused");
    });
}

// An object inside another: it is reached by its own root, and everything else of it goes to the
// outer one. `visit` gets its root; the check is skipped where no class can be aggregated.
void ForEachInner(Trial& trial,
                  const std::function<void(Module&, const Made&, INCFUnknown*, Outer&)>& visit) {
    Module module(trial);
    module.Start();
    bool isAny = false;
    ForEachFactory(module, [&](Made& made) {
        Outer outer;
        trial.Doing("making an object of " + made.name + " inside an outer one");
        void* out = nullptr;
        const NCFRESULT result =
            made.factory->CreateInstance(module.unknown(), &outer, IID_INCFUnknown, &out);
        auto root = host::Ref<INCFUnknown>::Adopt(static_cast<INCFUnknown*>(out));
        trial.Expect((result >= 0) == static_cast<bool>(root),
                     "an object with success, or NCF_CLASS_E_NOAGGREGATION and null",
                     trial.Text(result) + (root ? ", and an object" : ", and null"));
        if (root) {
            isAny = true;
            visit(module, made, root.get(), outer);
        }
    });
    if (!isAny) {
        trial.Skip("no component can be aggregated");
    }
}

void InnerDoesNotCountOuter(Trial& trial) {
    ForEachInner(trial, [&](Module& module, const Made& made, INCFUnknown* root, Outer& outer) {
        trial.Expect(outer.References() == 1, "the inner object holds no reference to the outer",
                     made.name + " holds " + std::to_string(outer.References() - 1));
        trial.Doing("querying the root of an object of " + made.name + " inside an outer one");
        host::Ref<INCFUnknown> again;
        trial.ExpectSuccess(host::Query(root, again), "success for IID_INCFUnknown");
        trial.Expect(again.get() == root, "its own root", "another object");
        trial.ExpectRefusal(module.canUnloadNow(module.unknown()), "an inner object counts");
    });
}

void InnerDelegates(Trial& trial) {
    ForEachInner(trial, [&](Module&, const Made& made, INCFUnknown* root, Outer& outer) {
        for (const KnownInterface& known : KnownInterfaces()) {
            if (known.id == IID_INCFUnknown) {
                continue;
            }
            void* out = nullptr;
            const int before = outer.References();
            if (root->QueryInterface(known.id, &out) < 0 || out == nullptr) {
                continue;
            }
            trial.Doing("using " + std::string(known.name) + " of an object of " + made.name +
                        " inside an outer one");
            auto* const inner = static_cast<INCFUnknown*>(out);
            trial.Expect(outer.References() == before + 1, "the outer object is counted",
                         "it is not");
            void* identity = nullptr;
            inner->QueryInterface(IID_INCFUnknown, &identity);
            trial.Expect(identity == &outer, "the root of its interfaces is the outer object",
                         "another object");
            outer.Release();
            inner->Release();
            trial.Expect(outer.References() == before, "Release goes to the outer object",
                         "it does not");
        }
    });
}

void CreatesWithoutHost(Trial& trial) {
    Module module(trial);
    module.Start();
    ForEachObject(module, [&](Made& made) {
        trial.Doing("calling CreateInstance with null for the host, for " + made.name);
        void* out = nullptr;
        const NCFRESULT result =
            made.factory->CreateInstance(nullptr, nullptr, IID_INCFUnknown, &out);
        const auto object = host::Ref<INCFUnknown>::Adopt(static_cast<INCFUnknown*>(out));
        trial.Expect((result >= 0) == static_cast<bool>(object),
                     "an object with success, or null with a failure",
                     trial.Text(result) + (object ? ", and an object" : ", and null"));
    });
}

}  // namespace

std::vector<Check> FactoryChecks() {
    static constexpr char kOutput[] =
        "the output is not set to null at the beginning, or the object is not released";
    return {
        {"factory-offered",
         "NCFGetClassFactory gives a class factory, or NCF_CLASS_E_CLASSNOTAVAILABLE and null; it "
         "gives one for one component at least.",
         "the class ids of registration are not those that NCFGetClassFactory compares",
         OffersAFactory},
        {"factory-unknown-class",
         "For a class id that the module does not have, NCFGetClassFactory answers "
         "NCF_CLASS_E_CLASSNOTAVAILABLE and sets its output to null.",
         kOutput, RefusesUnknownClass},
        {"factory-null-arguments",
         "NCFGetClassFactory refuses a null argument with NCF_E_INVALIDARG.",
         "the arguments are used before they are looked at", RefusesNullArguments},
        {"factory-unknown-interface",
         "A class factory that lacks the wanted interface is gone after the refusal.", kOutput,
         FactoryRefusesUnknownInterface},
        {"factory-interfaces",
         "A class factory answers IID_INCFUnknown and IID_INCFClassFactory, and refuses others "
         "with NCF_E_NOINTERFACE.",
         "its QueryInterface compares the wrong ids", FactoryAnswersItsInterfaces},
        {"factory-kept", "A class factory may be kept, and makes a new object each time.",
         "it makes one object and is used up", FactoryIsKept},
        {"factory-refuses-unloading",
         "A class factory counts as alive: while the host keeps one, the module can't be "
         "unloaded.",
         "the counter of objects leaves class factories out", FactoryRefusesUnloading},
        {"factory-counted-each",
         "Class factories keep the module each by itself: of several, the last one that is "
         "released allows unloading.",
         "a flag stands in place of a counter, or all share one reference", EachFactoryCounts},
        {"factory-released-first", "An object goes on when its class factory is released.",
         "the object belongs to its class factory", ObjectOutlivesFactory},
        {"create-null-host", "CreateInstance with null for the host makes an object or refuses.",
         "the host is used before it is looked at", CreatesWithoutHost},
        {"create-null-output", "CreateInstance refuses null for its output.",
         "the output is used before it is looked at", CreationRefusesNullOutput},
        {"create-unknown-interface",
         "An object that lacks the wanted interface is gone after the refusal.", kOutput,
         CreationRefusesUnknownInterface},
        {"create-aggregated-interface",
         "With an outer object, CreateInstance gives IID_INCFUnknown alone; any other interface "
         "gets NCF_CLASS_E_NOAGGREGATION.",
         "the outer object is passed on without a look at the interface", AggregationNeedsTheRoot},
        {"create-aggregated-root",
         "An object inside another one has a root of its own and does not count the outer object.",
         "the outer object's reference is taken, so both keep each other for ever",
         InnerDoesNotCountOuter},
        {"create-aggregated-interfaces",
         "All interfaces of an object inside another one send their root operations to the outer "
         "object.",
         "QueryInterface, AddRef or Release of an interface is the object's own", InnerDelegates},
    };
}

}  // namespace validate
