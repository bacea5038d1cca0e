// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <memory>
#include <string>
#include <unordered_map>
#include <vector>

#include "aaf_library/model/BuiltIn.h"
#include "aaf_library/model/ClassRegistry.h"
#include "aaf_library/model/Object.h"

namespace aaf {

class ClassDefinition;
class Dictionary;
class MetaDefinition;
class PropertyDefinition;
class TypeDefinition;

// The world of one file: its class, property and type definitions, and its
// dictionary. Built-in definitions come into being when they are first looked up.
//
// Held by RefPtr; lives while anyone holds it or pins it through one of its
// objects (see Unknown).
class Model {
public:
    // With the built-in data and container definitions.
    static RefPtr<Model> Create(const ClassRegistry& classes);

    Model(const Model&) = delete;
    Model& operator=(const Model&) = delete;
    void AddRef() { ++pins_; }
    void Release();

    Dictionary& dictionary() const { return *dictionary_; }

    // -- Making objects. Free, with no reference but the returned one.
    RefPtr<Object> CreateObject(ClassDefinition& definition, bool withDefaults = true);
    template <class T>
    RefPtr<T> NewObject(const GUID& classId) {
        ClassDefinition* definition = FindClass(classId);
        RefPtr<Object> object = definition == nullptr ? nullptr : CreateObject(*definition);
        return RefPtr<T>(dynamic_cast<T*>(object.get()));
    }
    // A value of this type, empty or with these bytes.
    RefPtr<PropertyValue> NewValue(TypeDefinition& type);
    RefPtr<PropertyValue> NewValue(TypeDefinition& type, Bytes bytes);
    // What IAAFDictionary::CreateInstance and IAAFClassDef::CreateInstance do.
    HRESULT CreateInstance(const GUID& classId, const GUID& iid, IUnknown** out);
    HRESULT CreateMetaInstance(const GUID& classId, const GUID& iid, IUnknown** out);
    // A deep copy of an object of any model, free, with the definitions that it needs. Definitions
    // of properties and types which this model lacks are registered here.
    RefPtr<Object> CopyObject(const Object& source);

    // -- For those who will copy what the objects hold now, as late as they can.
    class Copier {
    public:
        // Once, before a value changes.
        virtual void CopyNow() = 0;

    protected:
        ~Copier() = default;
    };
    void LetWait(Copier& copier) { waiting_.push_back(&copier); }
    void LetGo(const Copier& copier);
    // By whoever is about to change a value of an object, or a definition.
    void TellChange() {
        if (!waiting_.empty()) {
            CallWaiting();
        }
    }

    // -- Meta-dictionary. Null when unknown.
    ClassDefinition* FindClass(const GUID& id);
    TypeDefinition* FindType(const GUID& id);
    // The definitions listed so far: those that a new file lists, then the others in the order in
    // which they came into being.
    const std::vector<RefPtr<ClassDefinition>>& classes();
    const std::vector<RefPtr<TypeDefinition>>& types();
    // Those that came into being so far; all that are not built in are among them.
    const std::vector<RefPtr<ClassDefinition>>& madeClasses() const { return classes_; }
    const std::vector<RefPtr<TypeDefinition>>& madeTypes() const { return types_; }
    // Whether its definition says nothing else than the built-in model, or would when it came into
    // being.
    bool HasAsBuiltIn(const BuiltInClass& entry) const;
    bool HasAsBuiltIn(const BuiltInType& entry) const;
    // Adds a definition that a caller made; one whose id exists stays outside, silently for types.
    HRESULT RegisterClass(ClassDefinition& definition);
    HRESULT RegisterType(TypeDefinition& type);
    bool Holds(const TypeDefinition& type) const;
    // Keeps a type that values refer to although it is not registered.
    void KeepType(TypeDefinition& type);
    // Any registered property, by its id.
    PropertyDefinition* FindProperty(const GUID& id) const;
    // Whether any class has a property with that id, looked up yet or not.
    bool HasProperty(const GUID& id) const;
    // The numbers that a copy of this model would allot, by those that are allotted here: first to
    // what callers registered, then to what the built-in model leaves to each file.
    AllottedNumbers NumbersInACopy() const;
    // False once all numbers are allotted.
    bool HasFreePropertyId() const { return nextPropertyId_ >= kLastAllottedPid; }
    // By PropertyDefinitions as they come into being: their number, allotted when it is 0.
    PropertyId EnterProperty(PropertyDefinition& property);
    void ForgetProperty(PropertyDefinition& property);
    // When reading a file whose numbers are its own: look up by id, never by number.

    // -- Weak references: the target of class `classId` with that id, or null.
    Unknown* FindTarget(const GUID& classId, const GUID& id);

private:
    explicit Model(const ClassRegistry& classes);
    ~Model();
    void ListStart();
    ClassDefinition* AddBuiltInClass(const BuiltInClass& entry);
    ClassDefinition& Enter(RefPtr<ClassDefinition> definition);
    TypeDefinition& Enter(RefPtr<TypeDefinition> type);
    // Into the set of that class or property, unless it has the id.
    template <class Set>
    void CopyDefinition(const Object* definition, const Set& set, const GUID& id);
    // The counterparts in this model of what another model has; they are registered where they are
    // lacking. Null for a property that can't be had here.
    ClassDefinition* ClassLike(const ClassDefinition& source);
    TypeDefinition* TypeLike(const TypeDefinition& source);
    PropertyDefinition* PropertyLike(ClassDefinition& owner, const PropertyDefinition& source);
    // Registers the definitions that a value of another model refers to.
    void CopyReferredTo(const PropertyValue& value);
    // A parameter names its definition by a plain id.
    void CopyParameterNamedBy(const PropertyValue& value);
    void CallWaiting();
    HRESULT CopyValue(const PropertyValue& source, Object& target, PropertyDefinition& property);

    const ClassRegistry& registry_;
    std::size_t pins_ = 0;
    bool dying_ = false;
    bool hasListedStart_ = false;
    std::vector<RefPtr<ClassDefinition>> classes_;
    std::vector<RefPtr<TypeDefinition>> types_;
    std::vector<RefPtr<TypeDefinition>> keptTypes_;
    std::unordered_map<GUID, ClassDefinition*, GuidHash> classById_;
    std::unordered_map<GUID, TypeDefinition*, GuidHash> typeById_;
    std::unordered_map<GUID, PropertyDefinition*, GuidHash> propertyById_;  // not built in
    PropertyId nextPropertyId_ = kFirstAllottedPid;
    RefPtr<Dictionary> dictionary_;
    std::vector<Copier*> waiting_;
    std::vector<const Object*> copying_;  // definitions of others on their way into this model
};

}  // namespace aaf
