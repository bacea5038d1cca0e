// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/validate/Definitions.h"
#include "reference_host/validate/Steps.h"

namespace validate {
namespace {

// What a call that was refused something by the host may leave: success, where it can do
// without, or a failure and nothing else.
template <class Interface>
void ExpectWholeOrNothing(Trial& trial, NCFRESULT result, const host::Ref<Interface>& out) {
    trial.Expect((result >= 0) == static_cast<bool>(out),
                 "an object with success, or null with a failure",
                 trial.Text(result) + (out ? ", and an object" : ", and null"));
}

void ExpectNoMore(Trial& trial, host::Host& host, std::int64_t before) {
    const std::int64_t left = host.LiveObjects() - before;
    trial.Expect(left <= 0, "nothing of the host is held after a refusal",
                 std::to_string(left) + " of the host's objects are still held");
}

template <class Definition, class Register>
void RefuseRegistration(Trial& trial, const char* function, const Register& call) {
    Module module(trial);
    const std::int64_t before = module.host().LiveObjects();
    for (const Refused refused : {Refused::kCreations, Refused::kQueries}) {
        RefuseEach(
            module.host(), refused,
            [&](int number) {
                trial.Doing(std::string("calling ") + function + " while the host refuses " +
                            WordOf(refused) + " " + std::to_string(number));
            },
            [&] {
                host::Ref<Definition> handed;
                const NCFRESULT result = call(module, handed.Out());
                ExpectWholeOrNothing(trial, result, handed);
                handed.Reset();
                ExpectNoMore(trial, module.host(), before);
            });
    }
    trial.Doing(std::string("calling ") + function + " after the host has refused something");
    host::Ref<Definition> handed;
    trial.ExpectSuccess(call(module, handed.Out()), "success, as before the refusals");
}

NCFRESULT FirstComponent(Module& module, INCFComponentDefinition** out) {
    return module.registerComponent(module.unknown(), 0, out);
}

NCFRESULT ThePlugin(Module& module, INCFPluginDefinition** out) {
    return module.registerPlugin(module.unknown(), out);
}

void PluginRegistrationRefused(Trial& trial) {
    RefuseRegistration<INCFPluginDefinition>(trial, "NCFRegisterPlugin", ThePlugin);
}

void ComponentRegistrationRefused(Trial& trial) {
    RefuseRegistration<INCFComponentDefinition>(trial, "NCFRegisterComponent", FirstComponent);
}

template <class Definition, class Register>
void RefuseDefinitionCalls(Trial& trial, const char* function, const Register& call) {
    constexpr int kMostCalls = 1000;
    Module module(trial);
    DefinitionCalls calls;
    RegisterCountingDefinitions(module.host(), calls);
    const std::int64_t before = module.host().LiveObjects();
    for (int number = 1; number <= kMostCalls; ++number) {
        trial.Doing(std::string("calling ") + function + " with a definition that refuses call " +
                    std::to_string(number));
        calls = {};
        calls.refused = number;
        host::Ref<Definition> handed;
        const NCFRESULT result = call(module, handed.Out());
        if (calls.all < number) {
            return;  // there are no more to refuse
        }
        constexpr char kAnswer[] = "a refusal becomes the module's answer";
        if (calls.wasDefineRefused) {
            trial.ExpectRefusal(result, kAnswer);
        } else if (result >= 0) {
            trial.Warn(kAnswer, "success, though SetAttribute was refused");
        }
        ExpectWholeOrNothing(trial, result, handed);
        handed.Reset();
        ExpectNoMore(trial, module.host(), before);
    }
}

void DefinitionsRefuse(Trial& trial) {
    RefuseDefinitionCalls<INCFPluginDefinition>(trial, "NCFRegisterPlugin", ThePlugin);
    RefuseDefinitionCalls<INCFComponentDefinition>(trial, "NCFRegisterComponent", FirstComponent);
}

void StartRefused(Trial& trial) {
    Module module(trial);
    const std::int64_t before = module.host().LiveObjects();
    for (const Refused refused : {Refused::kCreations, Refused::kQueries}) {
        RefuseEach(
            module.host(), refused,
            [&](int number) {
                trial.Doing(std::string("calling NCFStartup while the host refuses ") +
                            WordOf(refused) + " " + std::to_string(number));
            },
            [&] {
                module.startup(module.unknown());
                module.shutdown(module.unknown());
                ExpectNoMore(trial, module.host(), before);
            });
    }
    trial.Doing("calling NCFStartup after starts that the host refused something");
    trial.ExpectSuccess(module.startup(module.unknown()), "success, as before the refusals");
    trial.ExpectSuccess(module.shutdown(module.unknown()));
}

void CreationRefused(Trial& trial, Refused refused) {
    Module module(trial);
    module.Start();
    ForEachObject(module, [&](Made& made) {
        made.object.Reset();
        const std::int64_t before = module.host().LiveObjects();
        RefuseEach(
            module.host(), refused,
            [&](int number) {
                trial.Doing("making an object of " + made.name + " while the host refuses " +
                            WordOf(refused) + " " + std::to_string(number));
            },
            [&] {
                void* out = nullptr;
                const NCFRESULT result =
                    made.factory->CreateInstance(module.unknown(), nullptr, IID_INCFUnknown, &out);
                auto object = host::Ref<INCFUnknown>::Adopt(static_cast<INCFUnknown*>(out));
                ExpectWholeOrNothing(trial, result, object);
                object.Reset();
                ExpectNoMore(trial, module.host(), before);
            });
        made.factory.Reset();
        ExpectIdle(module, "after creations that the host refused something");
    });
}

void CreationsRefusedInCreation(Trial& trial) {
    CreationRefused(trial, Refused::kCreations);
}

void QueriesRefusedInCreation(Trial& trial) {
    CreationRefused(trial, Refused::kQueries);
}

}  // namespace

std::vector<Check> RefusalChecks() {
    static constexpr char kLeft[] =
        "a result is not looked at, or what was taken before the refusal is not given back";
    return {
        {"refusal-plugin-registration",
         "When the host refuses the n-th thing that NCFRegisterPlugin asks for, for every n, it "
         "fails and leaves nothing behind.",
         kLeft, PluginRegistrationRefused},
        {"refusal-component-registration",
         "When the host refuses the n-th thing that NCFRegisterComponent asks for, for every n, "
         "it fails and leaves nothing behind.",
         kLeft, ComponentRegistrationRefused},
        {"refusal-definition-calls",
         "When a definition object refuses its n-th call, for every n, registration answers with a "
         "failure and releases the object.",
         "the result of SetAttribute or Define is not looked at", DefinitionsRefuse},
        {"refusal-start",
         "When the host refuses the n-th thing that NCFStartup asks for, for every n, NCFShutdown "
         "takes back what was done.",
         kLeft, StartRefused},
        {"refusal-creation",
         "When the host refuses to make the n-th component that a new object asks for, for every "
         "n, the object is made whole or not at all.",
         kLeft, CreationsRefusedInCreation},
        {"refusal-query",
         "When the host refuses the n-th interface that a new object asks for, for every n, the "
         "object is made whole or not at all.",
         kLeft, QueriesRefusedInCreation},
    };
}

}  // namespace validate
