// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/stored/ModelWriter.h"

#include "aaf_library/model/ClassDefinition.h"
#include "aaf_library/model/Dictionary.h"
#include "aaf_library/model/Model.h"
#include "aaf_library/model/TypeDefinition.h"
#include "aaf_library/stored/MetaClosure.h"
#include "aaf_library/stored/MetaPids.h"
#include "aaf_library/stored/ModelNames.h"
#include "aaf_library/stored/ModelTypes.h"
#include "aaf_library/stored/StoredError.h"
#include "aaf_library/stored/StoredFile.h"
#include "aaf_library/stored/StoredNames.h"
#include "host_interfaces/aaf/AAFClassIds.h"

#include <algorithm>
#include <map>
#include <set>

namespace aaf::stored {

namespace {

using Path = std::vector<std::uint16_t>;

constexpr std::size_t kIdSize = sizeof(StoredAuid);

bool IsBuiltInDefinition(const Bytes& id) {
    const GUID wanted = GuidOf(id);
    for (Span<BuiltInDefinition> table :
         {BuiltInDataDefinitions(), BuiltInContainerDefinitions()}) {
        for (const BuiltInDefinition& definition : table) {
            if (definition.id == wanted) {
                return true;
            }
        }
    }
    return false;
}

void SortByPid(StoredObject& object) {
    std::sort(object.properties.begin(), object.properties.end(),
              [](const StoredProperty& a, const StoredProperty& b) { return a.pid < b.pid; });
}

class ModelWriter {
public:
    using MetaDictionary = StoredObject (*)(const MetaRecords&);

    ModelWriter(Model& model, MetaDictionary metaDictionary)
        : model_(model), closure_(model), metaDictionary_(metaDictionary) {}

    StoredObject Write(Object& header) {
        StoredObject storedHeader = StoredObjectOf(header, prop::Header_Dictionary.pid);
        storedHeader.properties.push_back(ReferenceTo(prop::Header_Dictionary.pid, u"Dictionary",
                                                      StoredDictionary(model_.dictionary())));
        SortByPid(storedHeader);

        closure_.AddMetaClasses();
        closure_.AddExtensions();
        StoredObject root;
        root.classId = kRootClassId;
        root.properties.push_back(ReferenceTo(meta::kRootMetaDictionary, u"MetaDictionary",
                                              metaDictionary_(closure_.records())));
        root.properties.push_back(
            ReferenceTo(meta::kRootHeader, u"Header", std::move(storedHeader)));
        return root;
    }

private:
    static StoredProperty ReferenceTo(std::uint16_t pid, const std::u16string& name,
                                      StoredObject object) {
        StoredProperty property;
        property.pid = pid;
        property.form = StoredForm::StrongReference;
        property.name = name;
        property.objects.push_back(std::move(object));
        return property;
    }

    // All properties of the object but the one that is left out.
    StoredObject StoredObjectOf(const Object& from, PropertyId leftOut = kNoPropertyId) {
        StoredObject out;
        out.classId = AuidOf(from.classId());
        closure_.AddClass(from.classId());
        out.properties.reserve(from.values().size() + 2);
        for (const auto& entry : from.values()) {
            if (entry.first != leftOut && entry.first != prop::InterchangeObject_ObjClass.pid) {
                out.properties.push_back(StoredPropertyOf(from, entry.first, *entry.second));
            }
        }
        AddRequired(from, out, leftOut);
        SortByPid(out);
        return out;
    }

    StoredProperty StoredPropertyOf(const Object& from, PropertyId pid,
                                    const PropertyValue& value) {
        const PropertyDefinition* definition = from.classDefinition().FindProperty(pid);
        if (definition == nullptr || definition->type() == nullptr) {
            throw StoredError(PropertyText(pid) + " has no definition");
        }
        StoredProperty out = EmptyProperty(*definition);
        if (StoredFormOf(value.type()) != out.form) {
            throw StoredError(TextOf(*definition) + " holds a value of another form than its type");
        }
        try {
            Fill(out, *definition, value);
        } catch (const StoredError& problem) {
            throw StoredError(TextOf(*definition) + ": " + problem.what());
        }
        return out;
    }

    void Fill(StoredProperty& out, const PropertyDefinition& definition,
              const PropertyValue& value) {
        switch (out.form) {
            case StoredForm::Data:
                NoteCarriedType(value);
                out.bytes = value.bytes();
                break;
            case StoredForm::Stream:
                out.bytes = value.bytes();
                break;
            case StoredForm::StrongReference:
            case StoredForm::StrongVector:
            case StoredForm::StrongSet:
                for (const RefPtr<Object>& contained : value.objects()) {
                    out.objects.push_back(StoredObjectOf(*contained));
                    if (out.form == StoredForm::StrongSet) {
                        out.keys.push_back(contained->UniqueKey());
                    }
                }
                break;
            case StoredForm::WeakReference:
            case StoredForm::WeakVector:
            case StoredForm::WeakSet:
                AddTargets(out, *definition.type(), value.bytes());
                break;
        }
    }

    // A property of the right form and name that holds nothing yet.
    StoredProperty EmptyProperty(const PropertyDefinition& definition) {
        StoredProperty out;
        out.pid = definition.pid();
        out.form = StoredFormOf(*definition.type());
        if (out.form != StoredForm::Data && out.form != StoredForm::WeakReference) {
            out.name = Utf16Of(definition.name());
        }
        if (out.form == StoredForm::StrongSet) {
            const TypeFacts target = FactsOf(ReferenceIn(*definition.type()));
            const PropertyDefinition* key = KeyOf(target.target);
            out.keyPid = key->pid();
            out.keySize = static_cast<std::uint8_t>(key->type()->StoredSize());
        }
        return out;
    }

    const PropertyDefinition* KeyOf(const GUID& classId) {
        ClassDefinition* definition = model_.FindClass(classId);
        const PropertyDefinition* key =
            definition == nullptr ? nullptr : definition->FindUniqueProperty();
        if (key == nullptr || key->type() == nullptr) {
            throw StoredError("a set of objects that have no key");
        }
        return key;
    }

    void AddTargets(StoredProperty& out, const TypeDefinition& type, const Bytes& ids) {
        const TypeFacts reference = FactsOf(ReferenceIn(type));
        for (const TypeMember& step : reference.members) {
            out.targetPath.push_back(PidOf(step.id));
        }
        out.keyPid = KeyOf(reference.target)->pid();
        for (std::size_t at = 0; at + kIdSize <= ids.size(); at += kIdSize) {
            const auto from = ids.begin() + static_cast<std::ptrdiff_t>(at);
            out.keys.emplace_back(from, from + kIdSize);
            if (targets_[out.targetPath].insert(out.keys.back()).second) {
                NoteMetaTarget(out.targetPath, GuidOf(out.keys.back()));
            }
        }
    }

    PropertyId PidOf(const GUID& property) {
        if (property == kRootMetaDictionaryId) {
            return meta::kRootMetaDictionary;
        }
        if (property == kRootHeaderId) {
            return meta::kRootHeader;
        }
        if (const PropertyDefinition* known = model_.FindProperty(property)) {
            return known->pid();
        }
        const BuiltInProperty* builtIn = FindBuiltInProperty(property);
        return builtIn == nullptr ? kNoPropertyId : builtIn->key.pid;
    }

    // References may also lead into the meta-dictionary.
    void NoteMetaTarget(const Path& path, const GUID& id) {
        if (path == Path{meta::kRootMetaDictionary, meta::kClassDefinitions}) {
            closure_.AddClass(id);
        } else if (path == Path{meta::kRootMetaDictionary, meta::kTypeDefinitions}) {
            closure_.AddType(id);
        }
    }

    // The type that an indirect value names has to be in the file.
    void NoteCarriedType(const PropertyValue& value) {
        const TypeKind kind = value.type().Resolved().kind();
        const Bytes& bytes = value.bytes();
        if ((kind == TypeKind::Indirect || kind == TypeKind::Opaque) && bytes.size() > kIdSize) {
            const GUID id = GuidOf(Bytes(bytes.begin() + 1, bytes.begin() + 1 + kIdSize));
            if (model_.FindType(id) != nullptr) {
                closure_.AddType(id);
            }
        }
    }

    // Readers want the collections that a class requires, and an (empty) set
    // of essence data; an object that is required and absent stops them.
    void AddRequired(const Object& from, StoredObject& out, PropertyId leftOut) {
        for (const PropertyDefinition* definition : RequiredObjects(from.classDefinition())) {
            if (definition->pid() == leftOut || out.Find(definition->pid()) != nullptr) {
                continue;
            }
            StoredProperty empty = EmptyProperty(*definition);
            if (empty.form == StoredForm::StrongReference) {
                throw StoredError(ToUtf8(from.classDefinition().name()) + " has no " +
                                  ToUtf8(definition->name()));
            }
            out.properties.push_back(std::move(empty));
        }
    }

    const std::vector<const PropertyDefinition*>& RequiredObjects(ClassDefinition& definition) {
        const auto known = required_.find(&definition);
        if (known != required_.end()) {
            return known->second;
        }
        std::vector<const PropertyDefinition*>& out = required_[&definition];
        for (ClassDefinition* at = &definition; at != nullptr; at = at->parent()) {
            for (const RefPtr<PropertyDefinition>& property : at->properties()) {
                const bool wanted = !property->IsOptional() ||
                                    property->id() == prop::ContentStorage_EssenceData.id;
                if (!wanted || property->type() == nullptr) {
                    continue;
                }
                const StoredForm form = StoredFormOf(*property->type());
                if (form == StoredForm::StrongReference || form == StoredForm::StrongVector ||
                    form == StoredForm::StrongSet) {
                    out.push_back(property.get());
                }
            }
        }
        return out;
    }

    // Of the definitions that every model has from the start only those are
    // stored that something refers to. A definition may refer to others, so
    // the sets are gone through until nothing is added.
    StoredObject StoredDictionary(const Dictionary& from) {
        StoredObject out;
        out.classId = AuidOf(from.classId());
        closure_.AddClass(from.classId());
        for (const auto& [pid, value] : from.MadeValues()) {
            if (StoredFormOf(value->type()) != StoredForm::StrongSet) {
                out.properties.push_back(StoredPropertyOf(from, pid, *value));
            }
        }
        std::map<PropertyId, StoredProperty> sets;
        std::set<const Object*> stored;
        std::size_t before = 0;
        do {
            before = stored.size();
            MakeTargets(from);
            for (const auto& [pid, value] : from.MadeValues()) {
                if (StoredFormOf(value->type()) != StoredForm::StrongSet) {
                    continue;
                }
                const auto [set, isNew] = sets.try_emplace(pid);
                if (isNew) {
                    set->second = EmptyProperty(*from.classDefinition().FindProperty(pid));
                }
                AddDefinitions(set->second, value->objects(), stored);
            }
        } while (stored.size() != before);
        for (auto& set : sets) {
            if (!set.second.objects.empty()) {
                out.properties.push_back(std::move(set.second));
            }
        }
        CheckTargets(out);
        SortByPid(out);
        return out;
    }

    // A built-in definition may be referred to before anybody has looked it up.
    void MakeTargets(const Dictionary& dictionary) {
        for (const auto& [path, keys] : targets_) {
            if (IsWithinDictionary(path)) {
                for (const Bytes& key : keys) {
                    dictionary.FindDefinition(path[2], GuidOf(key));
                }
            }
        }
    }

    static bool IsWithinDictionary(const Path& path) {
        return path.size() == 3 && path[1] == prop::Header_Dictionary.pid;
    }

    void AddDefinitions(StoredProperty& set, const std::vector<RefPtr<Object>>& definitions,
                        std::set<const Object*>& stored) {
        const Path path = {meta::kRootHeader, prop::Header_Dictionary.pid, set.pid};
        for (const RefPtr<Object>& definition : definitions) {
            const Bytes key = definition->UniqueKey();
            const bool wanted = !IsBuiltInDefinition(key) || targets_[path].count(key) != 0;
            if (wanted && stored.insert(definition.get()).second) {
                set.keys.push_back(key);
                set.objects.push_back(StoredObjectOf(*definition));
            }
        }
    }

    // Readers fail when a target is not where the reference says it is.
    void CheckTargets(const StoredObject& dictionary) {
        for (const auto& entry : targets_) {
            const Path& path = entry.first;
            if (!IsWithinDictionary(path)) {
                continue;
            }
            const StoredProperty* set = dictionary.Find(path[2]);
            for (const Bytes& key : entry.second) {
                if (set == nullptr ||
                    std::find(set->keys.begin(), set->keys.end(), key) == set->keys.end()) {
                    throw StoredError(
                        "a definition that is referred to is not in the dictionary (" +
                        PropertyText(path[2]) + ")");
                }
            }
        }
    }

    static std::string TextOf(const PropertyDefinition& definition) {
        return ToUtf8(definition.name());
    }

    Model& model_;
    MetaClosure closure_;
    const MetaDictionary metaDictionary_;
    std::map<Path, std::set<Bytes>> targets_;  // what weak references lead to
    std::map<const ClassDefinition*, std::vector<const PropertyDefinition*>> required_;
};

}  // namespace

StoredObject TreeOfModel(Model& model, Object& header) {
    return ModelWriter(model, StoredMetaDictionary).Write(header);
}

StoredObject TreeToWrite(Model& model, Object& header) {
    return ModelWriter(model, LaidOutMetaDictionary).Write(header);
}

}  // namespace aaf::stored
