// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/model/ClassDefinition.h"

#include <algorithm>

#include "aaf_library/model/Enumerator.h"
#include "aaf_library/model/Model.h"
#include "aaf_library/model/TypeDefinition.h"
#include "host_interfaces/aaf/AAFClassIds.h"

namespace aaf {

ClassDefinition::~ClassDefinition() {
    for (const RefPtr<PropertyDefinition>& property : properties_) {
        if (property) {
            model()->ForgetProperty(*property);
            property->Free();
        }
    }
}

void ClassDefinition::TakeBuiltIn(const BuiltInClass& entry) {
    SetBuiltInIdentity(entry.id, entry.name);
    concrete_ = entry.concrete;
    builtIn_ = entry.properties;
    properties_.resize(builtIn_.size());
    // Numbers that are the file's own are allotted in the order in which classes come.
    for (std::size_t index = 0; index < builtIn_.size(); ++index) {
        const PropertyId pid = builtIn_[index].key.pid;
        Cover(pid == kNoPropertyId ? PropertyAt(index)->pid() : pid);
    }
}

void ClassDefinition::Cover(PropertyId pid) {
    lowest_ = std::min(lowest_, pid);
    highest_ = std::max(highest_, pid);
}

bool ClassDefinition::IsKindOf(const GUID& classId) const {
    for (const ClassDefinition* at = this; at != nullptr; at = at->parent_) {
        if (at->id() == classId) {
            return true;
        }
    }
    return false;
}

bool ClassDefinition::IsAsBuiltIn() const {
    return !IsExtended() && !IsRenamedAnywhere();
}

bool ClassDefinition::IsRenamedAnywhere() const {
    return IsRenamed() ||
           std::any_of(properties_.begin(), properties_.end(),
                       [](const auto& property) { return property && property->IsRenamed(); });
}

// What a search looks at, of a row of the shared table or of a definition.
struct ClassDefinition::Searched {
    const GUID& id;
    PropertyId pid;
    bool unique;
    bool optional;
};

ClassDefinition::Searched ClassDefinition::SearchedAt(std::size_t index) const {
    if (const RefPtr<PropertyDefinition>& property = properties_[index]) {
        return {property->id(), property->pid(), property->IsUnique(), property->IsOptional()};
    }
    const BuiltInProperty& entry = builtIn_[index];
    return {entry.key.id, entry.key.pid, entry.unique, entry.optional};
}

PropertyDefinition* ClassDefinition::PropertyAt(std::size_t index) {
    RefPtr<PropertyDefinition>& property = properties_[index];
    if (!property) {
        const BuiltInProperty& entry = builtIn_[index];
        property =
            new PropertyDefinition(*this, entry.key.pid, entry.type, entry.optional, entry.unique);
        property->JoinModel(*model());
        property->SetBuiltInIdentity(entry.key.id, entry.name);
        property->SetPid(model()->EnterProperty(*property));
        property->Keep();
    }
    return property.get();
}

template <class Fits>
PropertyDefinition* ClassDefinition::FindWhere(const Fits& fits) {
    for (ClassDefinition* at = this; at != nullptr; at = at->parent_) {
        for (std::size_t index = 0; index < at->properties_.size(); ++index) {
            if (fits(at->SearchedAt(index))) {
                return at->PropertyAt(index);
            }
        }
    }
    return nullptr;
}

const std::vector<RefPtr<PropertyDefinition>>& ClassDefinition::properties() {
    for (std::size_t index = 0; index < builtIn_.size(); ++index) {
        PropertyAt(index);
    }
    return properties_;
}

PropertyDefinition* ClassDefinition::FindProperty(const GUID& id) {
    return FindWhere([&id](const Searched& property) { return property.id == id; });
}

PropertyDefinition* ClassDefinition::FindProperty(PropertyId pid) {
    for (ClassDefinition* at = this; at != nullptr; at = at->parent_) {
        const bool mayHave = pid >= at->lowest_ && pid <= at->highest_;
        for (std::size_t index = 0; mayHave && index < at->properties_.size(); ++index) {
            if (at->SearchedAt(index).pid == pid) {
                return at->PropertyAt(index);
            }
        }
    }
    return nullptr;
}

PropertyDefinition* ClassDefinition::FindUniqueProperty() {
    return FindWhere([](const Searched& property) { return property.unique; });
}

std::vector<PropertyDefinition*> ClassDefinition::RequiredProperties(const GUID& andThis) {
    std::vector<PropertyDefinition*> required;
    for (ClassDefinition* at = this; at != nullptr; at = at->parent_) {
        for (std::size_t index = 0; index < at->properties_.size(); ++index) {
            const Searched property = at->SearchedAt(index);
            if (!property.optional || property.id == andThis) {
                required.push_back(at->PropertyAt(index));
            }
        }
    }
    return required;
}

PropertyDefinition& ClassDefinition::AddProperty(const GUID& id, const std::wstring& name,
                                                 const GUID& typeId, bool optional, bool unique,
                                                 PropertyId pid) {
    model()->TellChange();
    RefPtr<PropertyDefinition> property(
        new PropertyDefinition(*this, pid, typeId, optional, unique));
    property->JoinModel(*model());
    property->SetIdentity(id, name);
    property->SetPid(model()->EnterProperty(*property));
    property->Keep();
    PropertyDefinition& added = *property;
    Cover(added.pid());
    properties_.push_back(std::move(property));
    return added;
}

HRESULT ClassDefinition::Initialize(aafUID_constref classID, IAAFClassDef* parentClass,
                                    aafCharacter_constptr className, aafBoolean_t isConcrete) {
    if (!IsBoolean(isConcrete)) {
        return AAFRESULT_INVALID_ENUM_VALUE;
    }
    auto* parent = ImplementationAs<ClassDefinition>(parentClass);
    if (className == nullptr || parentClass == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    if (parent == nullptr || parent->model() != model()) {
        return AAFRESULT_INVALID_OBJ;
    }
    const HRESULT result = SetIdentity(classID, className);
    if (result >= 0) {
        parent_ = parent;
        concrete_ = isConcrete == kAAFTrue;
    }
    return result;
}

HRESULT ClassDefinition::GetPropertyDefs(IEnumAAFPropertyDefs** enumerator) {
    return MakeEnumerator<IAAFPropertyDef>(
        [self = RefPtr<ClassDefinition>(this)](std::size_t index) {
            return index < self->properties_.size() ? RefPtr<Unknown>(self->PropertyAt(index))
                                                    : nullptr;
        },
        enumerator);
}

HRESULT ClassDefinition::CountPropertyDefs(aafUInt32* count) {
    if (count == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    *count = static_cast<aafUInt32>(properties_.size());
    return AAFRESULT_SUCCESS;
}

bool ClassDefinition::IsClosedToExtension() const {
    // The meta model is fixed, but for the two kinds of type that may gain properties.
    const bool meta = IsKindOf(AUID_AAFMetaDefinition) || IsKindOf(AUID_AAFMetaDictionary);
    return meta && id() != AUID_AAFTypeDefRename && id() != AUID_AAFTypeDefExtEnum;
}

HRESULT ClassDefinition::RegisterProperty(const GUID& id, aafCharacter_constptr name,
                                          IAAFTypeDef* typeDef, bool optional, bool unique,
                                          IAAFPropertyDef** propDef) {
    auto* type = ImplementationAs<TypeDefinition>(typeDef);
    if (IsClosedToExtension()) {
        return AAFRESULT_NOT_EXTENDABLE;
    }
    for (std::size_t index = 0; index < properties_.size(); ++index) {
        if (SearchedAt(index).id == id) {
            return AAFRESULT_INVALID_PARAM;
        }
    }
    if (model()->HasProperty(id)) {
        return AAFRESULT_PROPERTY_DUPLICATE;
    }
    if (type == nullptr || model()->FindType(type->id()) == nullptr) {
        return AAFRESULT_NO_MORE_OBJECTS;
    }
    if (unique && FindUniqueProperty() != nullptr) {
        return AAFRESULT_ALREADY_UNIQUELY_IDENTIFIED;
    }
    if (!model()->HasFreePropertyId()) {
        return AAFRESULT_NOMEMORY;
    }
    PropertyDefinition& added = AddProperty(id, name, type->id(), optional, unique);
    return propDef == nullptr ? AAFRESULT_SUCCESS : GiveOut(&added, propDef);
}

HRESULT ClassDefinition::RegisterNewPropertyDef(aafUID_constref id, aafCharacter_constptr name,
                                                IAAFTypeDef* typeDef, aafBoolean_t isOptional,
                                                aafBoolean_t isUniqueIdentifier,
                                                IAAFPropertyDef** propDef) {
    if (!IsBoolean(isOptional) || !IsBoolean(isUniqueIdentifier)) {
        return AAFRESULT_INVALID_ENUM_VALUE;
    }
    if (propDef != nullptr) {
        *propDef = nullptr;
    }
    if (name == nullptr || typeDef == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    if (!IsInitialized()) {
        return AAFRESULT_NOT_INITIALIZED;
    }
    // Objects of a registered class exist already and would lack the property.
    const bool required = isOptional == kAAFFalse;
    if (registered_ && required && !IsClosedToExtension()) {
        return AAFRESULT_OBJECT_ALREADY_ATTACHED;
    }
    return RegisterProperty(id, name, typeDef, !required, isUniqueIdentifier == kAAFTrue, propDef);
}

HRESULT ClassDefinition::RegisterOptionalPropertyDef(aafUID_constref id, aafCharacter_constptr name,
                                                     IAAFTypeDef* typeDef,
                                                     IAAFPropertyDef** propDef) {
    if (propDef != nullptr) {
        *propDef = nullptr;
    }
    if (name == nullptr || typeDef == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    if (!IsInitialized()) {
        return AAFRESULT_NOT_INITIALIZED;
    }
    return RegisterProperty(id, name, typeDef, true, false, propDef);
}

HRESULT ClassDefinition::LookupPropertyDef(aafUID_constref propID, IAAFPropertyDef** propDef) {
    if (propDef == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    PropertyDefinition* found = FindProperty(propID);
    return found == nullptr ? AAFRESULT_NO_MORE_OBJECTS : GiveOut(found, propDef);
}

HRESULT ClassDefinition::GetName(aafCharacter* name, aafUInt32 bufSize) {
    return MetaDefinition::GetName(name, bufSize);
}

HRESULT ClassDefinition::GetNameBufLen(aafUInt32* bufSize) {
    return MetaDefinition::GetNameBufLen(bufSize);
}

HRESULT ClassDefinition::GetParent(IAAFClassDef** classDef) {
    if (classDef == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    return parent_ == nullptr ? AAFRESULT_IS_ROOT_CLASS : GiveOut(parent_, classDef);
}

HRESULT ClassDefinition::IsConcrete(aafBoolean_t* result) {
    if (result == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    *result = concrete_ ? kAAFTrue : kAAFFalse;
    return AAFRESULT_SUCCESS;
}

HRESULT ClassDefinition::IsRoot(aafBoolean_t* isRoot) {
    if (isRoot == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    *isRoot = parent_ == nullptr ? kAAFTrue : kAAFFalse;
    return AAFRESULT_SUCCESS;
}

HRESULT ClassDefinition::IsUniquelyIdentified(aafBoolean_t* isUniquelyIdentified) {
    if (isUniquelyIdentified == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    *isUniquelyIdentified = FindUniqueProperty() != nullptr ? kAAFTrue : kAAFFalse;
    return AAFRESULT_SUCCESS;
}

HRESULT ClassDefinition::GetUniqueIdentifier(IAAFPropertyDef** uniqueIdentifier) {
    if (uniqueIdentifier == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    PropertyDefinition* found = FindUniqueProperty();
    return found == nullptr ? AAFRESULT_OBJECT_NOT_FOUND : GiveOut(found, uniqueIdentifier);
}

HRESULT ClassDefinition::CreateInstance(REFIID riid, IUnknown** object) {
    if (object == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    return model()->CreateInstance(id(), riid, object);
}

}  // namespace aaf
