// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <unordered_map>

#include "aaf_library/model/GuidHash.h"

namespace aaf {

class Object;

// Makes an empty object; the model gives it its class and defaults.
using ObjectCreator = Object* (*)();

template <class T>
Object* CreateAs() {
    return new T;
}

struct ClassEntry {
    GUID classId;
    ObjectCreator create;
};

// Which C++ class stands for which class of the object model. Filled once from
// the rooms' constant tables, then shared by all models.
class ClassRegistry {
public:
    // Starts with the classes of this room: dictionary and definitions.
    ClassRegistry();

    template <std::size_t Count>
    void Add(const ClassEntry (&entries)[Count]) {
        for (const ClassEntry& entry : entries) {
            creators_[entry.classId] = entry.create;
        }
    }

    // Null when the class has no entry of its own.
    ObjectCreator Find(const GUID& classId) const;

private:
    std::unordered_map<GUID, ObjectCreator, GuidHash> creators_;
};

}  // namespace aaf
