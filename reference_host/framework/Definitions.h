// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <string>
#include <vector>

#include "host_interfaces/framework/Definitions.h"
#include "reference_host/framework/Component.h"

namespace host {

// What a module said of itself, for reading.
struct DefinitionAttribute {
    GUID id;
    GUID valueType;
    std::vector<unsigned char> value;  // text without its terminator

    std::string Text() const { return {value.begin(), value.end()}; }
    // The first four bytes as a number in machine order; 0 when there are fewer.
    ncfUInt32 Number() const;
};

struct PluginFacts {
    GUID id{};
    GUID secondId{};
    ncfUInt32 major = 0;
    ncfUInt32 minor = 0;
    std::string name;
    std::string vendor;
    ncfUInt32 componentCount = 0;
    ncfUInt32 last = 0;
    std::vector<DefinitionAttribute> attributes;  // in the order of their setting
};

struct ComponentFacts {
    GUID id{};
    GUID type{};
    GUID classId{};
    ncfUInt32 major = 0;
    ncfUInt32 minor = 0;
    std::string name;
    std::vector<DefinitionAttribute> attributes;
    bool hasFactory = false;  // known once the module has started
};

// The definition objects that a module creates, fills in and hands back.
class PluginDefinition final : public Component<INCFPluginDefinition> {
public:
    NCFRESULT SetAttribute(const GUID& attribute, const GUID& valueType, const void* value,
                           ncfUInt32 bytes) override;
    NCFRESULT Define(const GUID& pluginId, ncfUInt32 major, ncfUInt32 minor, const char* name,
                     const GUID& secondId, const char* vendor, ncfUInt32 componentCount,
                     ncfUInt32 last) override;

    const PluginFacts& facts() const { return facts_; }

private:
    PluginFacts facts_;
};

class ComponentDefinition final : public Component<INCFComponentDefinition> {
public:
    NCFRESULT SetAttribute(const GUID& attribute, const GUID& valueType, const void* value,
                           ncfUInt32 bytes) override;
    NCFRESULT Define(const GUID& componentId, const GUID& componentType, ncfUInt32 major,
                     ncfUInt32 minor, const GUID& classId, const char* displayName) override;

    const ComponentFacts& facts() const { return facts_; }

private:
    ComponentFacts facts_;
};

}  // namespace host
