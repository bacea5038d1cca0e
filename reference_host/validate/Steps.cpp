// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/validate/Steps.h"

#include <chrono>
#include <exception>
#include <thread>

#include "reference_host/framework/QueryRule.h"
#include "reference_host/system/ProcessFacts.h"

namespace validate {

void OnThreads(unsigned count, const std::function<void(unsigned)>& work) {
    std::vector<std::exception_ptr> thrown(count);
    std::vector<std::thread> threads;
    for (unsigned number = 0; number < count; ++number) {
        threads.emplace_back([&, number] {
            try {
                work(number);
            } catch (...) {
                thrown[number] = std::current_exception();
            }
        });
    }
    for (std::thread& thread : threads) {
        thread.join();
    }
    for (const std::exception_ptr& one : thrown) {
        if (one) {
            std::rethrow_exception(one);
        }
    }
}

std::size_t ThreadsLeft(std::size_t before) {
    constexpr int kTries = 100;
    std::size_t now = host::system::OwnFacts().threads;
    for (int i = 0; i < kTries && now > before; ++i) {
        std::this_thread::sleep_for(std::chrono::milliseconds(10));
        now = host::system::OwnFacts().threads;
    }
    return now;
}

const char* WordOf(Refused refused) {
    return refused == Refused::kCreations ? "creation" : "query";
}

void RefuseEach(host::Host& host, Refused refused, const std::function<void(int)>& prepare,
                const std::function<void()>& round) {
    constexpr int kMostCalls = 5000;
    // Goes back to answering everything, whatever the round does.
    struct Rules {
        host::Host& host;
        ~Rules() { Clear(); }
        void Clear() {
            host.factory().SetRule({});
            host::SetQueryRule({});
        }
    } rules{host};
    for (int number = 1; number <= kMostCalls; ++number) {
        int calls = 0;
        const auto answer = [&calls, number](ncfUInt32 call) {
            calls = static_cast<int>(call);
            return calls == number ? NCF_E_OUTOFMEMORY : NCF_OK;
        };
        prepare(number);
        if (refused == Refused::kCreations) {
            host.factory().SetRule(
                [&](const host::CreationCall& call) { return answer(call.number); });
        } else {
            host::SetQueryRule([&](const GUID&, ncfUInt32 call) { return answer(call); });
        }
        round();
        rules.Clear();
        if (calls < number) {
            return;
        }
    }
}

host::Ref<INCFClassFactory> FactoryOf(Module& module, const host::ComponentFacts& component) {
    void* made = nullptr;
    const NCFRESULT result =
        module.getClassFactory(module.unknown(), component.classId, IID_INCFClassFactory, &made);
    auto factory = host::Ref<INCFClassFactory>::Adopt(static_cast<INCFClassFactory*>(made));
    if (result < 0) {
        factory.Reset();
    }
    return factory;
}

void ForEachObject(Module& module, const std::function<void(Made&)>& visit) {
    Trial& trial = module.trial();
    const std::vector<host::ComponentFacts> components = module.Components();
    bool isAny = false;
    for (std::size_t i = 0; i < components.size(); ++i) {
        Made made;
        made.name = NameOf(components[i], i);
        made.component = components[i];
        trial.Doing("making an object of " + made.name);
        made.factory = FactoryOf(module, components[i]);
        if (!made.factory) {
            continue;
        }
        void* object = nullptr;
        const NCFRESULT result =
            made.factory->CreateInstance(module.unknown(), nullptr, IID_INCFUnknown, &object);
        made.object = host::Ref<INCFUnknown>::Adopt(static_cast<INCFUnknown*>(object));
        const bool isMade = result >= 0 && made.object;
        trial.Expect(isMade || !module.HasMade(i), "an object, as before", trial.Text(result));
        module.NoteMade(i);
        if (!isMade) {
            trial.Skip("no object of " + made.name + " can be made: " + trial.Text(result));
        }
        isAny = true;
        visit(made);
    }
    if (!isAny) {
        trial.Skip("no component has a class factory");
    }
}

void ExpectIdle(Module& module, const std::string& after) {
    const NCFRESULT result = module.canUnloadNow(module.unknown());
    if (result < 0) {
        module.trial().Fail("NCFCanUnloadNow allows unloading " + after,
                            module.trial().Text(result));
    }
}

void* Garbage() {
    static int place = 0;
    return &place;
}

}  // namespace validate
