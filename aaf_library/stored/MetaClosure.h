// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/model/BuiltIn.h"
#include "aaf_library/model/GuidHash.h"
#include "aaf_library/model/PropertyKey.h"
#include "aaf_library/stored/MetaRecords.h"

#include <cstdint>
#include <unordered_set>
#include <vector>

namespace aaf {
class ClassDefinition;
class Model;
class TypeDefinition;
}  // namespace aaf

namespace aaf::stored {

// Rows of the tables of the built-in model.
class BuiltInRows {
public:
    BuiltInRows();
    // Whether it was not among them before.
    bool Add(const BuiltInClass& entry) { return AddTo(classes_, PlaceOf(entry)); }
    bool Add(const BuiltInType& entry) { return AddTo(types_, PlaceOf(entry)); }
    bool Has(const BuiltInClass& entry) const { return IsIn(classes_, PlaceOf(entry)); }
    bool Has(const BuiltInType& entry) const { return IsIn(types_, PlaceOf(entry)); }
    friend bool operator==(const BuiltInRows& left, const BuiltInRows& right) {
        return left.classes_ == right.classes_ && left.types_ == right.types_;
    }

private:
    using Words = std::vector<std::uint64_t>;
    static constexpr std::size_t kBits = 64;

    static std::size_t PlaceOf(const BuiltInClass& entry);
    static std::size_t PlaceOf(const BuiltInType& entry);
    static bool AddTo(Words& words, std::size_t place) {
        const bool isNew = !IsIn(words, place);
        words[place / kBits] |= std::uint64_t{1} << place % kBits;
        return isNew;
    }
    static bool IsIn(const Words& words, std::size_t place) {
        return (words[place / kBits] >> place % kBits & 1) != 0;
    }

    Words classes_;
    Words types_;
};

// Gathers the definitions that a file has to carry: what is added and all that
// it is made of, so that no definition refers to one that is missing.
class MetaClosure {
public:
    // LeftOut: a definition that says what the built-in model says is not gathered, nor are
    // those that it needs, which are built in as well.
    enum class BuiltIn { Gathered, LeftOut };

    // Properties have the numbers that stand for theirs, if any do.
    explicit MetaClosure(Model& model, BuiltIn builtIn = BuiltIn::Gathered,
                         AllottedNumbers numbers = {})
        : model_(model), builtIn_(builtIn), numbers_(std::move(numbers)) {}

    // Throw StoredError when the model has no such definition, or lacks one
    // that it needs.
    void AddClass(const GUID& id);
    void AddType(const GUID& id);

    // The classes that the definitions themselves belong to.
    void AddMetaClasses();
    // Whatever was registered beyond the built-in model.
    void AddExtensions();

    // Throws StoredError as well.
    const MetaRecords& records();

private:
    void AddPending();
    void EnterClass(const GUID& id);
    void EnterType(const GUID& id);
    void Record(ClassDefinition& definition);
    void Record(const TypeDefinition& type);
    template <class Definition, class Entry>
    bool RecordChanged(Span<Entry> table, const BuiltInRows& changed, const BuiltInRows& needed,
                       Definition* (Model::*find)(const GUID&));

    Model& model_;
    const BuiltIn builtIn_;
    const AllottedNumbers numbers_;
    MetaRecords records_;
    BuiltInRows wanted_;    // what was added, and what the records need
    BuiltInRows recorded_;  // those that say something else than the built-in model
    std::unordered_set<GUID, GuidHash> classes_;  // others that were met
    std::unordered_set<GUID, GuidHash> types_;
    std::vector<GUID> pendingClasses_;
    std::vector<GUID> pendingTypes_;
};

}  // namespace aaf::stored
