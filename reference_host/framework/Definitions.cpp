// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/framework/Definitions.h"

#include <algorithm>
#include <cstring>

#include "host_interfaces/framework/String.h"
#include "reference_host/framework/Guard.h"

namespace host {

namespace {

// Stores a copy; an id that is set again takes the new value.
NCFRESULT Store(std::vector<DefinitionAttribute>& attributes, const GUID& id, const GUID& valueType,
                const void* value, ncfUInt32 bytes) {
    return Guarded([&] {
        Need(value);
        const auto* start = static_cast<const unsigned char*>(value);
        const std::size_t size = bytes == kNCFZeroTerminated
                                     ? std::strlen(static_cast<const char*>(value))
                                     : std::size_t{bytes};
        DefinitionAttribute made{id, valueType, {start, start + size}};
        const auto former = std::find_if(attributes.begin(), attributes.end(),
                                         [&](const auto& one) { return one.id == id; });
        if (former == attributes.end()) {
            attributes.push_back(std::move(made));
        } else {
            *former = std::move(made);
        }
        return NCF_OK;
    });
}

}  // namespace

ncfUInt32 DefinitionAttribute::Number() const {
    ncfUInt32 number = 0;
    if (value.size() >= sizeof(number)) {
        std::memcpy(&number, value.data(), sizeof(number));
    }
    return number;
}

NCFRESULT PluginDefinition::SetAttribute(const GUID& attribute, const GUID& valueType,
                                         const void* value, ncfUInt32 bytes) {
    return Store(facts_.attributes, attribute, valueType, value, bytes);
}

NCFRESULT PluginDefinition::Define(const GUID& pluginId, ncfUInt32 major, ncfUInt32 minor,
                                   const char* name, const GUID& secondId, const char* vendor,
                                   ncfUInt32 componentCount, ncfUInt32 last) {
    return Guarded([&] {
        Need(name && vendor);
        facts_.name = name;
        facts_.vendor = vendor;
        facts_.id = pluginId;
        facts_.secondId = secondId;
        facts_.major = major;
        facts_.minor = minor;
        facts_.componentCount = componentCount;
        facts_.last = last;
        return NCF_OK;
    });
}

NCFRESULT ComponentDefinition::SetAttribute(const GUID& attribute, const GUID& valueType,
                                            const void* value, ncfUInt32 bytes) {
    return Store(facts_.attributes, attribute, valueType, value, bytes);
}

NCFRESULT ComponentDefinition::Define(const GUID& componentId, const GUID& componentType,
                                      ncfUInt32 major, ncfUInt32 minor, const GUID& classId,
                                      const char* displayName) {
    return Guarded([&] {
        Need(displayName);
        facts_.name = displayName;
        facts_.id = componentId;
        facts_.type = componentType;
        facts_.classId = classId;
        facts_.major = major;
        facts_.minor = minor;
        return NCF_OK;
    });
}

}  // namespace host
