// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include <cstdio>
#include <set>

#include "reference_host/validate/Definitions.h"
#include "reference_host/validate/Module.h"
#include "text/Encodings.h"

namespace validate {
namespace {

constexpr GUID kNoId{};

bool IsUtf8(const std::string& text) {
    return !encodings::HoldsSurrogate(encodings::FromUtf8(text));
}

std::string IdText(const GUID& id) {
    char text[40];
    std::snprintf(text, sizeof text, "%08X-%04X-%04X-%02X%02X-%02X%02X%02X%02X%02X%02X",
                  static_cast<unsigned>(id.Data1), id.Data2, id.Data3, id.Data4[0], id.Data4[1],
                  id.Data4[2], id.Data4[3], id.Data4[4], id.Data4[5], id.Data4[6], id.Data4[7]);
    return text;
}

void PluginDefinitionIsTheHosts(Trial& trial) {
    Module module(trial);
    trial.Doing("calling NCFRegisterPlugin");
    host::Ref<INCFPluginDefinition> handed;
    trial.ExpectSuccess(module.registerPlugin(module.unknown(), handed.Out()));
    FactsOf(trial, handed.get());
}

void ExpectText(Trial& trial, const std::string& what, const std::string& text) {
    trial.Expect(!text.empty(), "a text that is not empty", what + " is empty");
    trial.Expect(IsUtf8(text), "UTF-8", what + " is none");
}

void PluginHasNames(Trial& trial) {
    Module module(trial);
    trial.Doing("reading the name and the vendor from the plug-in's definition");
    const host::PluginFacts plugin = module.Plugin();
    ExpectText(trial, "the name", plugin.name);
    ExpectText(trial, "the vendor", plugin.vendor);
}

void PluginHasAnId(Trial& trial) {
    Module module(trial);
    trial.Doing("reading the id from the plug-in's definition");
    trial.Expect(module.Plugin().id != kNoId, "an id of the module's own", "an id of zeros");
}

void ExpectVersion(Trial& trial, const std::string& what, ncfUInt32 major, ncfUInt32 minor) {
    if (major == 0 && minor == 0) {
        trial.Warn("a version above 0.0, which later ones can exceed", what + " has 0.0");
    }
}

void VersionsAreTold(Trial& trial) {
    Module module(trial);
    trial.Doing("reading the versions from the definitions");
    const host::PluginFacts plugin = module.Plugin();
    ExpectVersion(trial, "the plug-in", plugin.major, plugin.minor);
    const auto components = module.Components();
    for (std::size_t i = 0; i < components.size(); ++i) {
        ExpectVersion(trial, NameOf(components[i], i), components[i].major, components[i].minor);
    }
}

void CountsComponents(Trial& trial) {
    constexpr ncfUInt32 kMost = 4096;
    Module module(trial);
    trial.Doing("reading the number of components from the plug-in's definition");
    const ncfUInt32 count = module.Plugin().componentCount;
    trial.Expect(count >= 1 && count <= kMost, "from 1 to 4096 components", std::to_string(count));
}

void DefinesEachComponent(Trial& trial) {
    Module module(trial);
    const ncfUInt32 count = module.Plugin().componentCount;
    for (ncfUInt32 index = 0; index < count; ++index) {
        trial.Doing("calling NCFRegisterComponent with index " + std::to_string(index) + " of " +
                    std::to_string(count));
        host::Ref<INCFComponentDefinition> handed;
        trial.ExpectSuccess(module.registerComponent(module.unknown(), index, handed.Out()));
        FactsOf(trial, handed.get());
    }
}

void RefusesIndexesBeyond(Trial& trial) {
    Module module(trial);
    const ncfUInt32 count = module.Plugin().componentCount;
    for (const ncfUInt32 index : {count, count + 1, 0x7FFFFFFFu, 0xFFFFFFFFu}) {
        trial.Doing("calling NCFRegisterComponent with index " + std::to_string(index) + " of " +
                    std::to_string(count));
        host::Ref<INCFComponentDefinition> handed;
        const NCFRESULT result = module.registerComponent(module.unknown(), index, handed.Out());
        trial.ExpectResult(NCF_E_INVALIDARG, result, "NCF_E_INVALIDARG");
        trial.Expect(!handed, "no definition comes out", "an object");
    }
}

void ExpectOwnIds(Trial& trial, const char* what, GUID host::ComponentFacts::*id) {
    Module module(trial);
    const auto components = module.Components();
    trial.Doing(std::string("comparing the ") + what + " ids of the components");
    std::set<std::string> known;
    for (std::size_t i = 0; i < components.size(); ++i) {
        const GUID& own = components[i].*id;
        trial.Expect(own != kNoId, "an id of its own", NameOf(components[i], i) + " has zeros");
        trial.Expect(known.insert(IdText(own)).second, "each component has an id of its own",
                     NameOf(components[i], i) + " has that of another one, " + IdText(own));
    }
}

void ComponentIdsDiffer(Trial& trial) {
    ExpectOwnIds(trial, "component", &host::ComponentFacts::id);
}

void ClassIdsDiffer(Trial& trial) {
    ExpectOwnIds(trial, "class", &host::ComponentFacts::classId);
}

void TypesAreEqual(Trial& trial) {
    Module module(trial);
    const auto components = module.Components();
    trial.Doing("comparing the types of the components");
    for (std::size_t i = 0; i < components.size(); ++i) {
        trial.Expect(components[i].type == components[0].type,
                     "all components of a module have the same type",
                     NameOf(components[i], i) + " has " + IdText(components[i].type) +
                         ", the first one " + IdText(components[0].type));
    }
}

void ComponentsHaveNames(Trial& trial) {
    Module module(trial);
    const auto components = module.Components();
    trial.Doing("reading the names of the components");
    for (std::size_t i = 0; i < components.size(); ++i) {
        ExpectText(trial, "the name of component " + std::to_string(i), components[i].name);
    }
}

void ExpectValues(Trial& trial, const std::string& what,
                  const std::vector<host::DefinitionAttribute>& attributes) {
    for (const host::DefinitionAttribute& attribute : attributes) {
        const std::string name = "attribute " + IdText(attribute.id) + " of " + what;
        if (attribute.valueType == kNCFValueTypeText) {
            trial.Expect(IsUtf8(attribute.Text()), "a text in UTF-8", name);
        } else if (attribute.valueType == kNCFValueTypeUInt32 ||
                   attribute.valueType == kNCFValueTypeFourBytes) {
            trial.Expect(attribute.value.size() == sizeof(ncfUInt32), "four bytes",
                         name + " has " + std::to_string(attribute.value.size()));
        } else {
            trial.Fail("one of the three value types of the framework",
                       name + " has " + IdText(attribute.valueType));
        }
    }
}

void AttributesHaveTheirTypes(Trial& trial) {
    Module module(trial);
    trial.Doing("reading the attributes of the definitions");
    ExpectValues(trial, "the plug-in", module.Plugin().attributes);
    const auto components = module.Components();
    for (std::size_t i = 0; i < components.size(); ++i) {
        ExpectValues(trial, NameOf(components[i], i), components[i].attributes);
    }
}

void DefinesOnce(Trial& trial) {
    Module module(trial);
    const ncfUInt32 count = module.Plugin().componentCount;
    DefinitionCalls calls;
    RegisterCountingDefinitions(module.host(), calls);
    trial.Doing("calling NCFRegisterPlugin with a definition object that counts");
    host::Ref<INCFPluginDefinition> plugin;
    trial.ExpectSuccess(module.registerPlugin(module.unknown(), plugin.Out()));
    const auto expectOnce = [&] {
        constexpr char kOnce[] = "Define is called once for each definition";
        trial.Expect(calls.defines > 0, kOnce, "it is not called");
        if (calls.defines > 1) {
            trial.Warn(kOnce, std::to_string(calls.defines) + " times");
        }
        calls.defines = 0;
    };
    expectOnce();
    for (ncfUInt32 index = 0; index < count; ++index) {
        trial.Doing("calling NCFRegisterComponent for component " + std::to_string(index) +
                    " with a definition object that counts");
        host::Ref<INCFComponentDefinition> component;
        trial.ExpectSuccess(module.registerComponent(module.unknown(), index, component.Out()));
        expectOnce();
    }
}

bool AreEqual(const host::ComponentFacts& one, const host::ComponentFacts& other) {
    return one.id == other.id && one.type == other.type && one.classId == other.classId &&
           one.major == other.major && one.minor == other.minor && one.name == other.name;
}

void RegistersAlikeTwice(Trial& trial) {
    Module module(trial);
    trial.Doing("registering a first time");
    const host::PluginFacts plugin = module.Plugin();
    const auto components = module.Components();
    trial.Doing("registering a second time");
    const host::PluginFacts again = module.Plugin();
    trial.Expect(again.id == plugin.id && again.name == plugin.name &&
                     again.major == plugin.major && again.minor == plugin.minor &&
                     again.componentCount == plugin.componentCount,
                 "the same plug-in as the first time", "another id, name, version or count");
    const auto componentsAgain = module.Components();
    for (std::size_t i = 0; i < components.size(); ++i) {
        trial.Expect(AreEqual(components[i], componentsAgain[i]),
                     "the same component as the first time", NameOf(componentsAgain[i], i));
    }
}

void RegisterPluginWithNull(Trial& trial) {
    Module module(trial);
    trial.Doing("calling NCFRegisterPlugin with null for the host");
    host::Ref<INCFPluginDefinition> handed;
    trial.ExpectResult(NCF_E_POINTER, module.registerPlugin(nullptr, handed.Out()),
                       "NCF_E_POINTER");
    trial.Doing("calling NCFRegisterPlugin with null for the output");
    trial.ExpectResult(NCF_E_POINTER, module.registerPlugin(module.unknown(), nullptr),
                       "NCF_E_POINTER");
}

void RegisterComponentWithNull(Trial& trial) {
    Module module(trial);
    trial.Doing("calling NCFRegisterComponent with null for the host");
    host::Ref<INCFComponentDefinition> handed;
    trial.ExpectResult(NCF_E_POINTER, module.registerComponent(nullptr, 0, handed.Out()),
                       "NCF_E_POINTER");
    trial.Doing("calling NCFRegisterComponent with null for the output");
    trial.ExpectResult(NCF_E_POINTER, module.registerComponent(module.unknown(), 0, nullptr),
                       "NCF_E_POINTER");
}

void RegistrationKeepsNothing(Trial& trial) {
    Module module(trial);
    const std::int64_t before = module.host().LiveObjects();
    const ncfUInt32 references = module.unknown()->AddRef();
    module.unknown()->Release();
    trial.Doing("registering, and releasing the definitions");
    module.Components();
    const std::int64_t kept = module.host().LiveObjects() - before;
    trial.Expect(kept <= 0, "the host's objects are gone once the host has released them",
                 std::to_string(kept) + " are still there");
    const ncfUInt32 now = module.unknown()->AddRef();
    module.unknown()->Release();
    trial.Expect(now == references, "no reference to the host is kept",
                 std::to_string(static_cast<std::int64_t>(now) - references) + " more than before");
}

}  // namespace

std::vector<Check> RegistrationChecks() {
    return {
        {"plugin-definition",
         "NCFRegisterPlugin hands out the definition object that it had the host's component "
         "factory make.",
         "the module brings a definition class of its own, or forgets to set its output",
         PluginDefinitionIsTheHosts},
        {"plugin-names", "The plug-in has a name and a vendor, in UTF-8.",
         "Define got an empty text or one in another encoding", PluginHasNames},
        {"plugin-id", "The plug-in has an id, by which a host tells modules apart.",
         "Define got an id that was never set", PluginHasAnId},
        {"plugin-versions",
         "Plug-in and components have versions, by which a host chooses the newer of two modules.",
         "Define got 0 for both numbers", VersionsAreTold},
        {"plugin-component-count", "The plug-in has at least one component, and not absurdly many.",
         "Define got its arguments in another order", CountsComponents},
        {"component-definitions",
         "Each index below the plug-in's count gives a definition object of the host's.",
         "the count that Define got is greater than the table of components", DefinesEachComponent},
        {"component-index-beyond",
         "NCFRegisterComponent refuses any other index with NCF_E_INVALIDARG.",
         "the index is not compared, or one too late", RefusesIndexesBeyond},
        {"component-ids",
         "Each component has a component id of its own, by which callers create it.",
         "a row of the table was copied and its id not changed", ComponentIdsDiffer},
        {"component-class-ids",
         "Each component has a class id of its own, which reaches NCFGetClassFactory.",
         "a row of the table was copied and its id not changed", ClassIdsDiffer},
        {"component-types", "All components of a module have the same type.",
         "Define got the component's id or class id for the type", TypesAreEqual},
        {"component-names", "Each component has a display name, in UTF-8.",
         "Define got an empty text or one in another encoding", ComponentsHaveNames},
        {"definition-attributes",
         "Attributes have one of the framework's value types, and a value that fits it.",
         "SetAttribute got a wrong number of bytes, or another id for the value type",
         AttributesHaveTheirTypes},
        {"definition-once", "Each definition object is defined once.",
         "Define is called again after an attribute, or not at all", DefinesOnce},
        {"registration-twice", "Registration may come twice, and says the same.",
         "ids are made up at run time, or state of the first registration is used up",
         RegistersAlikeTwice},
        {"register-plugin-null", "NCFRegisterPlugin refuses a null argument with NCF_E_POINTER.",
         "the arguments are used before they are looked at", RegisterPluginWithNull},
        {"register-component-null",
         "NCFRegisterComponent refuses a null argument with NCF_E_POINTER.",
         "the arguments are used before they are looked at", RegisterComponentWithNull},
        {"registration-keeps-nothing",
         "Registration keeps no reference to a definition or to the host.",
         "the component factory or a definition is not released", RegistrationKeepsNothing},
    };
}

}  // namespace validate
