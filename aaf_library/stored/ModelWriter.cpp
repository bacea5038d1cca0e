// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/stored/ModelWriter.h"

#include "aaf_library/model/ClassDefinition.h"
#include "aaf_library/model/Dictionary.h"
#include "aaf_library/model/Model.h"
#include "aaf_library/model/TypeDefinition.h"
#include "aaf_library/stored/KeptProperty.h"
#include "aaf_library/stored/MetaClosure.h"
#include "aaf_library/stored/MetaPids.h"
#include "aaf_library/stored/ModelNames.h"
#include "aaf_library/stored/ModelTypes.h"
#include "aaf_library/stored/StoredError.h"
#include "aaf_library/stored/StoredFile.h"
#include "aaf_library/stored/StoredNames.h"
#include "host_interfaces/aaf/AAFClassIds.h"

#include <algorithm>
#include <list>
#include <map>
#include <set>
#include <unordered_map>

namespace aaf::stored {

namespace {

using Path = std::vector<std::uint16_t>;
using Targets = std::set<Bytes>;

constexpr std::size_t kIdSize = sizeof(StoredAuid);

// Null when it is not among them.
const BuiltInDefinition* FindIn(Span<BuiltInDefinition> table, const Bytes& id) {
    const GUID wanted = GuidOf(id);
    const auto* const found =
        std::find_if(table.begin(), table.end(),
                     [&](const BuiltInDefinition& definition) { return definition.id == wanted; });
    return found == table.end() ? nullptr : found;
}

bool IsWeak(StoredForm form) {
    return form == StoredForm::WeakReference || form == StoredForm::WeakVector ||
           form == StoredForm::WeakSet;
}

void SortByPid(StoredObject& object) {
    const auto isBefore = [](const StoredProperty& a, const StoredProperty& b) {
        return a.pid < b.pid;
    };
    if (!std::is_sorted(object.properties.begin(), object.properties.end(), isBefore)) {
        std::sort(object.properties.begin(), object.properties.end(), isBefore);
    }
}

class ModelWriter {
public:
    // What is written of definitions that files have in common.
    struct Common {
        StoredObject (*metaDictionary)(const MetaRecords&);
        StoredObject (*dataDefinition)(const BuiltInDefinition&);
        StoredObject (*containerDefinition)(const BuiltInDefinition&);
    };

    // The content, unless null, stands in place of the header's own, which is another file's then.
    ModelWriter(Model& model, Object& header, const Object* content, Common common)
        : model_(model),
          header_(header),
          content_(content),
          replaced_(content == nullptr ? nullptr : header.ObjectAt(prop::Header_Content)),
          numbers_(content == nullptr ? AllottedNumbers() : model.NumbersInACopy()),
          closure_(model, MetaClosure::BuiltIn::Gathered, numbers_),
          common_(common) {}

    StoredObject Write() {
        StoredObject storedHeader = StoredObjectOf(header_, prop::Header_Dictionary.pid);
        storedHeader.properties.push_back(ReferenceTo(prop::Header_Dictionary.pid, u"Dictionary",
                                                      StoredDictionary(model_.dictionary())));
        SortByPid(storedHeader);

        closure_.AddMetaClasses();
        closure_.AddExtensions();
        StoredObject root;
        root.classId = kRootClassId;
        root.properties.push_back(ReferenceTo(meta::kRootMetaDictionary, u"MetaDictionary",
                                              common_.metaDictionary(closure_.records())));
        root.properties.push_back(
            ReferenceTo(meta::kRootHeader, u"Header", std::move(storedHeader)));
        return root;
    }

private:
    // A property as the file has it.
    struct PropertyFacts {
        PropertyId from;  // its number in the model of the objects
        const PropertyDefinition* definition;
        StoredProperty empty;  // of the right form and name, holding nothing yet
        bool carriesType;
        bool isSetOfParameters;
        bool namesParameter;
        Targets* targets = nullptr;  // weak forms: what references to that set lead to
    };
    // What all objects of a class have in common.
    struct ClassFacts {
        ClassDefinition* definition = nullptr;  // as the model that is written has it
        StoredAuid id{};
        std::list<PropertyFacts> properties;  // those that were met
        std::vector<const PropertyDefinition*> required;
    };

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
        ClassFacts& facts = FactsOfClass(from);
        StoredObject out;
        out.classId = facts.id;
        out.properties.reserve(from.values().size() + 2);
        for (const auto& entry : from.values()) {
            if (entry.first != leftOut && entry.first != prop::InterchangeObject_ObjClass.pid) {
                AddProperty(out, facts, from, entry.first, *entry.second);
            }
        }
        AddRequired(facts, out, leftOut);
        SortByPid(out);
        return out;
    }

    ClassFacts& FactsOfClass(const Object& from) {
        const auto [place, isNew] = classes_.try_emplace(&from.classDefinition());
        ClassFacts& facts = place->second;
        if (isNew) {
            facts.definition = from.model() == &model_ ? &from.classDefinition()
                                                       : model_.FindClass(from.classId());
            if (facts.definition == nullptr) {
                throw StoredError("an object of another file is of a class that is unknown here");
            }
            facts.id = AuidOf(from.classId());
            closure_.AddClass(from.classId());
            facts.required = RequiredObjects(*facts.definition);
        }
        return facts;
    }

    const PropertyFacts& FactsOfProperty(ClassFacts& facts, PropertyId pid) {
        for (const PropertyFacts& known : facts.properties) {
            if (known.from == pid) {
                return known;
            }
        }
        const PropertyDefinition& definition = DefinitionOf(facts, pid);
        const TypeKind kind = definition.type()->Resolved().kind();
        PropertyFacts& made = facts.properties.emplace_back(
            PropertyFacts{pid, &definition, EmptyProperty(definition),
                          kind == TypeKind::Indirect || kind == TypeKind::Opaque,
                          definition.id() == prop::OperationGroup_Parameters.id,
                          definition.id() == prop::Parameter_Definition.id});
        if (IsWeak(made.empty.form)) {
            NameTargets(made);
        }
        return made;
    }

    static const PropertyDefinition& DefinitionOf(const ClassFacts& facts, PropertyId pid) {
        const PropertyDefinition* const definition = facts.definition->FindProperty(pid);
        if (definition == nullptr || definition->type() == nullptr) {
            throw StoredError(PropertyText(pid) + " has no definition");
        }
        return *definition;
    }

    void AddProperty(StoredObject& out, ClassFacts& facts, const Object& from, PropertyId pid,
                     const PropertyValue& value) {
        if (from.model() != &model_ && (pid >= kFirstLocalPid || value.asStored())) {
            throw StoredError(PropertyText(pid) + " says what only its own file knows");
        }
        if (value.asStored()) {
            out.properties.push_back(AsItStands(DefinitionOf(facts, pid), value));
        } else {
            AddValue(out, FactsOfProperty(facts, pid), value);
        }
    }

    // What a file held in place of a value, with the numbers that this one has.
    StoredProperty AsItStands(const PropertyDefinition& definition, const PropertyValue& value) {
        const auto& kept = static_cast<const KeptProperty&>(*value.asStored());
        for (const auto& [set, id] : kept.targets) {
            keptTargets_.emplace(set, AuidOf(id));
        }
        StoredProperty out = kept.property;
        out.pid = NumberOf(definition);
        if (!out.name.empty()) {
            out.name = Utf16Of(definition.name());
        } else if (!out.bytes.empty()) {
            out.bytes = value.bytes();
        }
        LeadNowhere(out);
        ForEachObject(out, [&](StoredObject& object) {
            for (StoredProperty& inner : object.properties) {
                LeadNowhere(inner);
            }
            if (const GUID id = GuidOf(object.classId); model_.FindClass(id) != nullptr) {
                closure_.AddClass(id);
            }
            Renumber(object, kept.numbers);
        });
        return out;
    }

    // A reference that made no sense still has the tag of a set, and the next file may have a set
    // of that tag. It gets one that none has.
    static void LeadNowhere(StoredProperty& reference) {
        if (reference.problem.empty() || !IsWeak(reference.form)) {
            return;
        }
        // In an index the tag stands behind the count.
        const bool isIndex = reference.form != StoredForm::WeakReference && !reference.name.empty();
        const std::size_t tag = isIndex ? sizeof(std::uint32_t) : 0;
        Bytes& bytes = reference.bytes;
        if (bytes.size() >= tag + sizeof(std::uint16_t)) {
            std::fill_n(bytes.begin() + static_cast<std::ptrdiff_t>(tag), sizeof(std::uint16_t),
                        std::uint8_t{0xFF});
        }
    }

    void Renumber(StoredObject& object, const std::unordered_map<std::uint16_t, GUID>& numbers) {
        std::vector<StoredProperty> known;
        for (StoredProperty& property : object.properties) {
            if (const auto local = numbers.find(property.pid); local != numbers.end()) {
                const PropertyDefinition* const definition = model_.FindProperty(local->second);
                property.pid = definition == nullptr ? kNoPropertyId : NumberOf(*definition);
            }
            if (property.pid != kNoPropertyId) {
                known.push_back(std::move(property));
            }
        }
        object.properties = std::move(known);
    }

    void AddValue(StoredObject& out, const PropertyFacts& facts, const PropertyValue& value) {
        const TypeDefinition& type = *facts.definition->type();
        if (IsCopy() && value.type().id() != type.id()) {
            throw StoredError(TextOf(*facts.definition) + " holds a value of a type of its own");
        }
        if (&value.type() != &type && StoredFormOf(value.type()) != facts.empty.form) {
            throw StoredError(TextOf(*facts.definition) +
                              " holds a value of another form than its type");
        }
        out.properties.push_back(facts.empty);
        try {
            Fill(out.properties.back(), facts, value);
        } catch (const StoredError& problem) {
            throw StoredError(TextOf(*facts.definition) + ": " + problem.what());
        }
    }

    void Fill(StoredProperty& out, const PropertyFacts& facts, const PropertyValue& value) {
        switch (out.form) {
            case StoredForm::Data:
                NoteCarriedType(facts, value);
                NoteParameter(facts, value);
                out.bytes = value.bytes();
                break;
            case StoredForm::Stream:
                out.bytes = value.bytes();
                break;
            case StoredForm::StrongReference:
            case StoredForm::StrongVector:
            case StoredForm::StrongSet:
                out.objects.reserve(value.objects().size());
                for (const RefPtr<Object>& contained : value.objects()) {
                    const bool isReplaced = IsCopy() && contained.get() == replaced_;
                    const Object& object = isReplaced ? *content_ : *contained;
                    out.objects.push_back(StoredObjectOf(object));
                    if (out.form == StoredForm::StrongSet) {
                        out.keys.push_back(object.UniqueKey());
                    }
                }
                if (facts.isSetOfParameters) {
                    StoreAsSet(out, prop::Parameter_Definition.pid);
                }
                break;
            case StoredForm::WeakReference:
            case StoredForm::WeakVector:
            case StoredForm::WeakSet:
                AddTargets(out, facts, value);
                break;
        }
    }

    // A vector whose elements have different keys becomes a set; others stay what they are.
    static void StoreAsSet(StoredProperty& vector, PropertyId keyPid) {
        std::set<Bytes> keys;
        for (const StoredObject& object : vector.objects) {
            const StoredProperty* const key = object.Find(keyPid);
            if (key == nullptr || key->bytes.size() != kIdSize || !keys.insert(key->bytes).second) {
                return;
            }
        }
        for (const StoredObject& object : vector.objects) {
            vector.keys.push_back(object.Find(keyPid)->bytes);
        }
        vector.form = StoredForm::StrongSet;
        vector.keyPid = keyPid;
    }

    // A property of the right form and name that holds nothing yet.
    StoredProperty EmptyProperty(const PropertyDefinition& definition) {
        StoredProperty out;
        out.pid = NumberOf(definition);
        out.form = StoredFormOf(*definition.type());
        if (out.form != StoredForm::Data && out.form != StoredForm::WeakReference) {
            out.name = Utf16Of(definition.name());
        }
        if (out.form == StoredForm::StrongSet) {
            const TypeFacts target = FactsOf(ReferenceIn(*definition.type()));
            const PropertyDefinition* key = KeyOf(target.target);
            out.keyPid = NumberOf(*key);
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

    void NameTargets(PropertyFacts& facts) {
        const TypeFacts reference = FactsOf(ReferenceIn(*facts.definition->type()));
        for (const TypeMember& step : reference.members) {
            facts.empty.targetPath.push_back(PidOf(step.id));
        }
        try {
            facts.empty.keyPid = NumberOf(*KeyOf(reference.target));
        } catch (const StoredError& problem) {
            throw StoredError(TextOf(*facts.definition) + ": " + problem.what());
        }
        facts.targets = &targets_[facts.empty.targetPath];
    }

    void AddTargets(StoredProperty& out, const PropertyFacts& facts, const PropertyValue& value) {
        const Bytes& ids = value.bytes();
        out.keys.reserve(ids.size() / kIdSize);
        for (std::size_t at = 0; at + kIdSize <= ids.size(); at += kIdSize) {
            const auto from = ids.begin() + static_cast<std::ptrdiff_t>(at);
            out.keys.emplace_back(from, from + kIdSize);
            if (facts.targets->insert(out.keys.back()).second) {
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
            return NumberOf(*known);
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
    void NoteCarriedType(const PropertyFacts& facts, const PropertyValue& value) {
        const Bytes& bytes = value.bytes();
        if (!facts.carriesType || bytes.size() <= kIdSize) {
            return;
        }
        StoredAuid id;
        std::copy_n(bytes.begin() + 1, kIdSize, id.begin());
        if (model_.FindType(GuidOf(id)) != nullptr) {
            closure_.AddType(GuidOf(id));
        }
    }

    // A parameter names its definition by a plain id, so a copy would do without.
    void NoteParameter(const PropertyFacts& facts, const PropertyValue& value) {
        if (facts.namesParameter && IsCopy() && value.bytes().size() == kIdSize) {
            keptTargets_.emplace(prop::Dictionary_ParameterDefinitions.pid,
                                 AuidOf(GuidOf(value.bytes())));
        }
    }

    // Readers want the collections that a class requires, and an (empty) set
    // of essence data; an object that is required and absent stops them.
    void AddRequired(const ClassFacts& facts, StoredObject& out, PropertyId leftOut) {
        for (const PropertyDefinition* definition : facts.required) {
            if (definition->pid() == leftOut || out.Find(NumberOf(*definition)) != nullptr) {
                continue;
            }
            StoredProperty empty = EmptyProperty(*definition);
            if (empty.form == StoredForm::StrongReference) {
                throw StoredError(ToUtf8(facts.definition->name()) + " has no " +
                                  ToUtf8(definition->name()));
            }
            out.properties.push_back(std::move(empty));
        }
    }

    static std::vector<const PropertyDefinition*> RequiredObjects(ClassDefinition& definition) {
        std::vector<const PropertyDefinition*> out;
        for (const PropertyDefinition* property :
             definition.RequiredProperties(prop::ContentStorage_EssenceData.id)) {
            const TypeDefinition* const type = property->type();
            const StoredForm form = type == nullptr ? StoredForm::Data : StoredFormOf(*type);
            if (form == StoredForm::StrongReference || form == StoredForm::StrongVector ||
                form == StoredForm::StrongSet) {
                out.push_back(property);
            }
        }
        return out;
    }

    // Into a copy of the content goes no more than it needs.
    bool IsCopy() const { return content_ != nullptr; }

    // The number that the file gives to a property.
    PropertyId NumberOf(const PropertyDefinition& definition) const {
        const auto number = numbers_.find(definition.pid());
        return number == numbers_.end() ? definition.pid() : number->second;
    }

    // Of the definitions that every model has from the start all of data are
    // stored, of others only those that something refers to. A definition may
    // refer to others, so the sets are gone through until nothing is added.
    StoredObject StoredDictionary(const Dictionary& from) {
        StoredObject out;
        ClassFacts& facts = FactsOfClass(from);
        out.classId = facts.id;
        for (const auto& [pid, value] : from.MadeValues()) {
            if (!IsCopy() && StoredFormOf(value->type()) != StoredForm::StrongSet) {
                AddProperty(out, facts, from, pid, *value);
            }
        }
        std::map<PropertyId, StoredProperty> sets;
        std::set<const Object*> stored;
        std::size_t before = 0;
        do {
            before = stored.size();
            MakeTargets(from);
            for (const auto& [pid, value] : from.MadeValues()) {
                if (StoredFormOf(value->type()) != StoredForm::StrongSet ||
                    (IsCopy() && !Dictionary::IsSetOfDefinitions(pid))) {
                    continue;
                }
                AddDefinitions(SetIn(sets, from, pid), value->objects(), stored);
            }
        } while (stored.size() != before);
        AddBuiltIn(from, sets);
        for (auto& set : sets) {
            if (!set.second.objects.empty()) {
                out.properties.push_back(std::move(set.second));
            }
        }
        CheckTargets(out);
        SortByPid(out);
        return out;
    }

    // A built-in definition may be referred to before anybody has looked it up. It joins the sets
    // of the dictionary, so this is no work for the middle of a walk through them.
    void MakeTargets(const Dictionary& dictionary) {
        for (const auto& [set, key] : keptTargets_) {
            if (dictionary.FindDefinition(set, GuidOf(key)) != nullptr) {
                targets_[{meta::kRootHeader, prop::Header_Dictionary.pid, set}].insert(
                    Bytes(key.begin(), key.end()));
            }
        }
        for (const auto& [path, keys] : targets_) {
            if (!IsCopy() && IsWithinDictionary(path)) {
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
        const Targets* const targets = TargetsIn(set.pid);
        for (const RefPtr<Object>& definition : definitions) {
            const Bytes key = definition->UniqueKey();
            const bool isTarget = targets != nullptr && targets->count(key) != 0;
            if (IsWanted(set.pid, key, isTarget) && stored.insert(definition.get()).second) {
                set.keys.push_back(key);
                set.objects.push_back(StoredObjectOf(*definition));
            }
        }
    }

    // A copy has the built-in definitions as every new file has them, whatever a caller made of
    // those here.
    bool IsWanted(PropertyId set, const Bytes& key, bool isTarget) const {
        const bool isContainer = set == prop::Dictionary_ContainerDefinitions.pid &&
                                 FindIn(BuiltInContainerDefinitions(), key) != nullptr;
        if (!IsCopy()) {
            return isTarget || !isContainer;
        }
        const bool isData = set == prop::Dictionary_DataDefinitions.pid &&
                            FindIn(BuiltInDataDefinitions(), key) != nullptr;
        return isTarget && !isContainer && !isData;
    }

    // Null when there are none.
    const Targets* TargetsIn(PropertyId set) const {
        const auto found = targets_.find({meta::kRootHeader, prop::Header_Dictionary.pid, set});
        return found == targets_.end() ? nullptr : &found->second;
    }

    // Those that are not there yet. Programs that extend a file look for all definitions of data.
    void AddBuiltIn(const Dictionary& from, std::map<PropertyId, StoredProperty>& sets) {
        StoredProperty& data = SetIn(sets, from, prop::Dictionary_DataDefinitions.pid);
        data.keys.reserve(data.keys.size() + BuiltInDataDefinitions().size());
        data.objects.reserve(data.objects.size() + BuiltInDataDefinitions().size());
        closure_.AddClass(AUID_AAFDataDefinition);
        for (const BuiltInDefinition& entry : BuiltInDataDefinitions()) {
            AddBuiltIn(data, entry, common_.dataDefinition);
        }
        const Targets* const containers = TargetsIn(prop::Dictionary_ContainerDefinitions.pid);
        if (containers == nullptr) {
            return;
        }
        for (const Bytes& key : *containers) {
            const BuiltInDefinition* const entry = FindIn(BuiltInContainerDefinitions(), key);
            if (entry != nullptr) {
                closure_.AddClass(AUID_AAFContainerDefinition);
                AddBuiltIn(SetIn(sets, from, prop::Dictionary_ContainerDefinitions.pid), *entry,
                           common_.containerDefinition);
            }
        }
    }

    static void AddBuiltIn(StoredProperty& set, const BuiltInDefinition& entry,
                           StoredObject (*stored)(const BuiltInDefinition&)) {
        const StoredAuid id = AuidOf(entry.id);
        const auto isKey = [&id](const Bytes& key) {
            return std::equal(key.begin(), key.end(), id.begin(), id.end());
        };
        if (std::none_of(set.keys.begin(), set.keys.end(), isKey)) {
            set.keys.emplace_back(id.begin(), id.end());
            set.objects.push_back(stored(entry));
        }
    }

    StoredProperty& SetIn(std::map<PropertyId, StoredProperty>& sets, const Dictionary& from,
                          PropertyId pid) {
        const auto [place, isNew] = sets.try_emplace(pid);
        if (isNew) {
            place->second = EmptyProperty(*from.classDefinition().FindProperty(pid));
        }
        return place->second;
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
    const Object& header_;
    const Object* const content_;
    const Object* const replaced_;
    const AllottedNumbers numbers_;
    MetaClosure closure_;
    const Common common_;
    std::map<Path, Targets> targets_;  // what weak references lead to
    // The same for what is written as it stands. These may lead to nothing.
    std::set<std::pair<PropertyId, StoredAuid>> keptTargets_;
    std::unordered_map<const ClassDefinition*, ClassFacts> classes_;
};

}  // namespace

StoredObject TreeOfModel(Model& model, Object& header) {
    return ModelWriter(model, header, nullptr,
                       {StoredMetaDictionary, StoredDataDefinition, StoredContainerDefinition})
        .Write();
}

StoredObject TreeToWrite(Model& model, Object& header, const Object* content) {
    return ModelWriter(model, header, content,
                       {LaidOutMetaDictionary, LaidOutDataDefinition, LaidOutContainerDefinition})
        .Write();
}

}  // namespace aaf::stored
