// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/model/GuidHash.h"
#include "aaf_library/stored/MetaRecords.h"

#include <unordered_set>

namespace aaf {
class Model;
}

namespace aaf::stored {

// Gathers the definitions that a file has to carry: what is added and all that
// it is made of, so that no definition refers to one that is missing.
class MetaClosure {
public:
    // LeftOut: a definition that says what the built-in model says is not gathered, nor are
    // those that it needs, which are built in as well.
    enum class BuiltIn { Gathered, LeftOut };

    explicit MetaClosure(Model& model, BuiltIn builtIn = BuiltIn::Gathered)
        : model_(model), builtIn_(builtIn) {}

    // Throw StoredError when the model has no such definition, or lacks one
    // that it needs.
    void AddClass(const GUID& id);
    void AddType(const GUID& id);

    // The classes that the definitions themselves belong to.
    void AddMetaClasses();
    // Whatever was registered beyond the built-in model.
    void AddExtensions();

    const MetaRecords& records() const { return records_; }

private:
    void AddPending();
    void EnterClass(const GUID& id);
    void EnterType(const GUID& id);
    void AddTypesIn(const TypeFacts& type);

    Model& model_;
    const BuiltIn builtIn_;
    MetaRecords records_;
    // What was met: of the built-in tables by place, of others by id.
    std::vector<bool> builtInClasses_;
    std::vector<bool> builtInTypes_;
    std::unordered_set<GUID, GuidHash> classes_;
    std::unordered_set<GUID, GuidHash> types_;
    std::vector<GUID> pendingClasses_;
    std::vector<GUID> pendingTypes_;
};

}  // namespace aaf::stored
