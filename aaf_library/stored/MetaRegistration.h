// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/model/GuidHash.h"
#include "aaf_library/model/RefPtr.h"
#include "aaf_library/stored/MetaRecords.h"

#include <unordered_map>
#include <unordered_set>

namespace aaf {
class ClassDefinition;
class Model;
class PropertyDefinition;
class TypeDefinition;
}  // namespace aaf

namespace aaf::stored {

// Registers with a model what a file's meta-dictionary defines beyond it, and
// tells afterwards which property a number of that file means. What the file
// says of a built-in type (its name, the members of an enumeration, the type
// that is renamed) counts for that model. The records must outlive it.
class MetaRegistration {
public:
    // Whose definitions of types that the model has already: those of the file that the model is
    // read from, which count, or of another one, which only adds to them.
    enum class Words { OfTheFile, OfAnother };

    // Throws StoredError.
    MetaRegistration(const MetaRecords& records, Model& model, Words words = Words::OfTheFile);

    // The model's definition of what the file calls `pid` in objects of that
    // class; null when neither file nor model defines it.
    PropertyDefinition* property(ClassDefinition& definition, std::uint16_t pid) const;

    // A sentence for each definition that the model can't take as the file has it.
    const std::vector<std::string>& notes() const { return notes_; }

private:
    ClassDefinition* EnterClass(const GUID& id, int depth);
    TypeDefinition* EnterType(const GUID& id, int depth);
    TypeDefinition* MakeType(const TypeFacts& record, int depth);
    void EnterProperties();

    Model& model_;
    Words words_;
    std::unordered_map<GUID, const MetaClass*, GuidHash> classes_;
    std::unordered_map<GUID, const TypeFacts*, GuidHash> types_;
    std::unordered_set<GUID, GuidHash> begun_;
    std::vector<std::string> notes_;
    // For each class of the file its own numbers.
    std::unordered_map<GUID, std::unordered_map<std::uint16_t, GUID>, GuidHash> pids_;
};

}  // namespace aaf::stored
