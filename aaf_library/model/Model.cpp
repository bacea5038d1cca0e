// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/model/Model.h"

#include <algorithm>

#include "aaf_library/model/ClassDefinition.h"
#include "aaf_library/model/Dictionary.h"
#include "aaf_library/model/Text.h"
#include "aaf_library/model/TypeFacts.h"
#include "host_interfaces/aaf/AAFClassIds.h"

namespace aaf {

namespace {

// Classes of the meta model that a caller may make, by the kind of type.
// A file has exactly one of each, which comes with it.
const GUID* const kMadeWithTheFile[] = {&AUID_AAFHeader, &AUID_AAFDictionary,
                                        &AUID_AAFContentStorage};

}  // namespace

RefPtr<Model> Model::Create(const ClassRegistry& classes) {
    RefPtr<Model> model(new Model(classes));
    model->dictionary_ = model->NewObject<Dictionary>(AUID_AAFDictionary);
    model->dictionary_->Keep();
    model->dictionary_->OfferBuiltIn();
    return model;
}

Model::Model(const ClassRegistry& classes) : registry_(classes) {}

Model::~Model() {
    // Nobody outside holds any of these now. Objects first, then what describes them.
    if (dictionary_) {
        dictionary_->Free();
        dictionary_ = nullptr;
    }
    for (const RefPtr<ClassDefinition>& definition : classes_) {
        definition->Free();
    }
    classes_.clear();
    for (std::vector<RefPtr<TypeDefinition>>* list : {&types_, &keptTypes_}) {
        for (const RefPtr<TypeDefinition>& type : *list) {
            type->Free();
        }
        list->clear();
    }
}

void Model::LetGo(const Copier& copier) {
    waiting_.erase(std::remove(waiting_.begin(), waiting_.end(), &copier), waiting_.end());
}

void Model::CallWaiting() {
    while (!waiting_.empty()) {
        Copier* const copier = waiting_.back();
        waiting_.pop_back();
        copier->CopyNow();
    }
}

void Model::Release() {
    if (--pins_ == 0 && !dying_) {
        dying_ = true;
        delete this;
    }
}

// A new file lists some of the built-in definitions. They are made when the lists are first looked
// at: most files are described without.
void Model::ListStart() {
    if (hasListedStart_) {
        return;
    }
    hasListedStart_ = true;
    std::unordered_map<GUID, std::size_t, GuidHash> places;
    for (const BuiltInClass& entry : BuiltInClasses()) {
        if (entry.listedAtStart) {
            FindClass(entry.id);
            places.emplace(entry.id, places.size());
        }
    }
    for (const BuiltInType& entry : BuiltInTypes()) {
        if (entry.listedAtStart) {
            FindType(entry.id);
            places.emplace(entry.id, places.size());
        }
    }
    const auto isBefore = [&places](const auto& left, const auto& right) {
        const auto placeOf = [&places](const auto& definition) {
            const auto found = places.find(definition->id());
            return found == places.end() ? places.size() : found->second;
        };
        return placeOf(left) < placeOf(right);
    };
    std::stable_sort(classes_.begin(), classes_.end(), isBefore);
    std::stable_sort(types_.begin(), types_.end(), isBefore);
}

const std::vector<RefPtr<ClassDefinition>>& Model::classes() {
    ListStart();
    return classes_;
}

const std::vector<RefPtr<TypeDefinition>>& Model::types() {
    ListStart();
    return types_;
}

RefPtr<Object> Model::CreateObject(ClassDefinition& definition, bool withDefaults) {
    ObjectCreator create = nullptr;
    for (const ClassDefinition* at = &definition; at != nullptr && create == nullptr;
         at = at->parent()) {
        create = registry_.Find(at->id());
    }
    if (create == nullptr) {
        return nullptr;
    }
    RefPtr<Object> object(create());
    object->JoinModel(*this);
    object->SetClass(definition);
    if (withDefaults) {
        object->SetDefaults();
    }
    return object;
}

RefPtr<PropertyValue> Model::NewValue(TypeDefinition& type) {
    return NewValue(type, type.EmptyBytes());
}

RefPtr<PropertyValue> Model::NewValue(TypeDefinition& type, Bytes bytes) {
    KeepType(type);
    RefPtr<PropertyValue> value(new PropertyValue(type, std::move(bytes)));
    value->JoinModel(*this);
    return value;
}

HRESULT Model::CreateInstance(const GUID& classId, const GUID& iid, IUnknown** out) {
    ClassDefinition* definition = FindClass(classId);
    if (definition == nullptr) {
        return AAFRESULT_NO_MORE_OBJECTS;
    }
    if (!definition->concrete()) {
        return AAFRESULT_ABSTRACT_CLASS;
    }
    for (const GUID* single : kMadeWithTheFile) {
        if (classId == *single) {
            return AAFRESULT_INVALID_CLASS_ID;
        }
    }
    const RefPtr<Object> object = CreateObject(*definition);
    return object ? object->QueryInterface(iid, reinterpret_cast<void**>(out))
                  : AAFRESULT_INVALID_CLASS_ID;
}

HRESULT Model::CreateMetaInstance(const GUID& classId, const GUID& iid, IUnknown** out) {
    const ClassDefinition* definition = FindClass(classId);
    if (definition == nullptr) {
        return AAFRESULT_NO_MORE_OBJECTS;
    }
    if (classId == AUID_AAFClassDef) {
        RefPtr<ClassDefinition> made(new ClassDefinition);
        made->JoinModel(*this);
        return made->QueryInterface(iid, reinterpret_cast<void**>(out));
    }
    if (TypeKind kind{}; IsClassOfTypes(classId, &kind)) {
        return MakeType(*this, kind)->QueryInterface(iid, reinterpret_cast<void**>(out));
    }
    const bool meta = definition->IsKindOf(AUID_AAFMetaDefinition);
    return meta && !definition->concrete() ? AAFRESULT_ABSTRACT_CLASS : AAFRESULT_INVALID_CLASS_ID;
}

ClassDefinition& Model::Enter(RefPtr<ClassDefinition> definition) {
    ClassDefinition& entered = *definition;
    entered.MarkRegistered();
    classById_[entered.id()] = &entered;
    classes_.push_back(std::move(definition));
    entered.Keep();
    return entered;
}

TypeDefinition& Model::Enter(RefPtr<TypeDefinition> type) {
    TypeDefinition& entered = *type;
    typeById_[entered.id()] = &entered;
    types_.push_back(std::move(type));
    entered.Keep();
    return entered;
}

ClassDefinition* Model::AddBuiltInClass(const BuiltInClass& entry) {
    RefPtr<ClassDefinition> definition(new ClassDefinition);
    definition->JoinModel(*this);
    if (entry.parent != entry.id) {
        definition->SetParent(FindClass(entry.parent));
    }
    definition->TakeBuiltIn(entry);
    return &Enter(std::move(definition));
}

ClassDefinition* Model::FindClass(const GUID& id) {
    const auto found = classById_.find(id);
    if (found != classById_.end()) {
        return found->second;
    }
    const BuiltInClass* entry = FindBuiltInClass(id);
    return entry == nullptr ? nullptr : AddBuiltInClass(*entry);
}

TypeDefinition* Model::FindType(const GUID& id) {
    const auto found = typeById_.find(id);
    if (found != typeById_.end()) {
        return found->second;
    }
    const BuiltInType* entry = FindBuiltInType(id);
    return entry == nullptr ? nullptr : &Enter(MakeBuiltInType(*this, *entry));
}

bool Model::HasAsBuiltIn(const BuiltInClass& entry) const {
    // Numbers of the file's own are not in the built-in model.
    for (const BuiltInProperty& property : entry.properties) {
        if (property.key.pid == kNoPropertyId) {
            return false;
        }
    }
    const auto found = classById_.find(entry.id);
    return found == classById_.end() || found->second->IsAsBuiltIn();
}

bool Model::HasAsBuiltIn(const BuiltInType& entry) const {
    const auto found = typeById_.find(entry.id);
    if (found == typeById_.end()) {
        return true;
    }
    const TypeDefinition& type = *found->second;
    return type.IsBuiltIn() && !type.IsRenamed() &&
           (type.element() == nullptr || type.element()->id() == entry.target) &&
           MembersOf(type) == FactsOf(entry).members;
}

HRESULT Model::RegisterClass(ClassDefinition& definition) {
    if (!definition.IsInitialized()) {
        return AAFRESULT_NOT_INITIALIZED;
    }
    if (definition.IsRegistered() || FindClass(definition.id()) != nullptr) {
        return AAFRESULT_SUCCESS;
    }
    TellChange();
    Enter(RefPtr<ClassDefinition>(&definition));
    return AAFRESULT_SUCCESS;
}

HRESULT Model::RegisterType(TypeDefinition& type) {
    if (!type.IsInitialized()) {
        return AAFRESULT_NOT_INITIALIZED;
    }
    if (FindType(type.id()) != nullptr) {
        return AAFRESULT_SUCCESS;
    }
    TellChange();
    Enter(RefPtr<TypeDefinition>(&type));
    // One reference of the model's is enough, a second would look like a caller's.
    const auto kept =
        std::find_if(keptTypes_.begin(), keptTypes_.end(),
                     [&](const RefPtr<TypeDefinition>& at) { return at.get() == &type; });
    if (kept != keptTypes_.end()) {
        keptTypes_.erase(kept);
    }
    return AAFRESULT_SUCCESS;
}

bool Model::Holds(const TypeDefinition& type) const {
    const auto found = typeById_.find(type.id());
    return found != typeById_.end() && found->second == &type;
}

void Model::KeepType(TypeDefinition& type) {
    if (!type.IsKept()) {
        keptTypes_.emplace_back(&type);
        type.Keep();
    }
}

PropertyDefinition* Model::FindProperty(const GUID& id) const {
    const auto found = propertyById_.find(id);
    if (found != propertyById_.end()) {
        return found->second;
    }
    // One of a class that is there, but which nobody has looked at yet.
    const BuiltInClass* const entry = FindClassOfBuiltInProperty(id);
    const auto owner = entry == nullptr ? classById_.end() : classById_.find(entry->id);
    return owner == classById_.end() ? nullptr : owner->second->FindProperty(id);
}

bool Model::HasProperty(const GUID& id) const {
    return FindProperty(id) != nullptr || FindBuiltInProperty(id) != nullptr;
}

AllottedNumbers Model::NumbersInACopy() const {
    // What is built in comes behind, and the larger number first.
    std::vector<std::pair<bool, int>> numbers;
    for (const RefPtr<ClassDefinition>& definition : classes_) {
        definition->ForEachAllotted([&](const PropertyDefinition& property) {
            numbers.emplace_back(property.IsBuiltIn(), -int{property.pid()});
        });
    }
    std::sort(numbers.begin(), numbers.end());
    AllottedNumbers copied;
    PropertyId next = kFirstAllottedPid;
    for (const auto& number : numbers) {
        copied.emplace(static_cast<PropertyId>(-number.second), next--);
    }
    return copied;
}

PropertyId Model::EnterProperty(PropertyDefinition& property) {
    // FindProperty looks for built-in ones in their class.
    if (!property.IsBuiltIn()) {
        propertyById_[property.id()] = &property;
    }
    return property.pid() != kNoPropertyId ? property.pid() : nextPropertyId_--;
}

void Model::ForgetProperty(PropertyDefinition& property) {
    if (dying_) {
        return;
    }
    const auto found = propertyById_.find(property.id());
    if (found != propertyById_.end() && found->second == &property) {
        propertyById_.erase(found);
    }
}

Unknown* Model::FindTarget(const GUID& classId, const GUID& id) {
    if (classId == AUID_AAFClassDef) {
        return FindClass(id);
    }
    if (classId == AUID_AAFTypeDef) {
        return FindType(id);
    }
    if (classId == AUID_AAFPropertyDef) {
        return FindProperty(id);
    }
    return dictionary_->FindDefinition(classId, id);
}

}  // namespace aaf
