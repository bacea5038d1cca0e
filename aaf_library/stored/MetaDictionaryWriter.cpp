// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/model/BuiltIn.h"
#include "aaf_library/model/PropertyKeys.h"
#include "aaf_library/model/Text.h"
#include "aaf_library/stored/CreationOrder.h"
#include "aaf_library/stored/LittleEndian.h"
#include "aaf_library/stored/MetaKinds.h"
#include "aaf_library/stored/ModelNames.h"
#include "aaf_library/stored/TreeWriter.h"
#include "host_interfaces/aaf/AAFClassIds.h"

#include <algorithm>
#include <deque>
#include <memory>
#include <mutex>
#include <optional>

namespace aaf::stored {

namespace {

const std::vector<std::uint16_t> kClassPath = {meta::kRootMetaDictionary, meta::kClassDefinitions};
const std::vector<std::uint16_t> kTypePath = {meta::kRootMetaDictionary, meta::kTypeDefinitions};

Bytes IdBytes(const GUID& id) {
    const StoredAuid stored = AuidOf(id);
    return Bytes(stored.begin(), stored.end());
}

class Definition {
public:
    Definition(const GUID& definitionClass, const GUID& id, const std::wstring& name) {
        object_.classId = AuidOf(definitionClass);
        AddData(meta::kIdentification, IdBytes(id));
        AddData(meta::kName, ByteWriter().AppendText(Utf16Of(name)).bytes());
    }

    void AddData(std::uint16_t pid, Bytes value) {
        StoredProperty property;
        property.pid = pid;
        property.bytes = std::move(value);
        object_.properties.push_back(std::move(property));
    }
    template <typename Number>
    void AddNumber(std::uint16_t pid, Number value) {
        AddData(pid, ByteWriter().AppendNumber(value).bytes());
    }
    void AddFlag(std::uint16_t pid, bool value) { AddNumber(pid, std::uint8_t{value}); }

    void AddWeak(std::uint16_t pid, StoredForm form, const std::u16string& name,
                 std::vector<Bytes> keys, const std::vector<std::uint16_t>& path) {
        StoredProperty property;
        property.pid = pid;
        property.form = form;
        property.name = name;
        property.keys = std::move(keys);
        property.keyPid = meta::kIdentification;
        property.targetPath = path;
        object_.properties.push_back(std::move(property));
    }
    void AddWeak(std::uint16_t pid, const GUID& target, const std::vector<std::uint16_t>& path) {
        AddWeak(pid, StoredForm::WeakReference, {}, {IdBytes(target)}, path);
    }

    void AddSet(StoredProperty property) { object_.properties.push_back(std::move(property)); }

    StoredObject Take() { return std::move(object_); }

private:
    StoredObject object_;
};

StoredProperty DefinitionSet(std::uint16_t pid, const std::u16string& name) {
    StoredProperty set;
    set.pid = pid;
    set.form = StoredForm::StrongSet;
    set.name = name;
    set.keyPid = meta::kIdentification;
    return set;
}

void AddTo(StoredProperty& set, const GUID& id, StoredObject definition) {
    set.keys.push_back(IdBytes(id));
    set.objects.push_back(std::move(definition));
}

StoredObject StoredPropertyDefinition(const MetaProperty& record) {
    Definition definition(AUID_AAFPropertyDef, record.id, record.name);
    definition.AddData(meta::kPropertyType, IdBytes(record.type));  // an id, no weak reference
    definition.AddFlag(meta::kIsOptional, record.optional);
    definition.AddNumber(meta::kLocalIdentification, record.pid);
    if (record.unique) {
        definition.AddFlag(meta::kIsUniqueIdentifier, true);
    }
    return definition.Take();
}

StoredObject StoredClass(const MetaClass& record) {
    Definition definition(AUID_AAFClassDef, record.id, record.name);
    definition.AddWeak(meta::kParentClass, record.parent, kClassPath);
    if (!record.properties.empty()) {
        StoredProperty properties = DefinitionSet(meta::kProperties, u"Properties");
        for (const MetaProperty& property : record.properties) {
            AddTo(properties, property.id, StoredPropertyDefinition(property));
        }
        NumberProperties(properties, record);
        definition.AddSet(std::move(properties));
    }
    definition.AddFlag(meta::kIsConcrete, record.concrete);
    return definition.Take();
}

Bytes MemberNames(const TypeFacts& record) {
    ByteWriter names;
    for (const TypeMember& member : record.members) {
        names.AppendText(Utf16Of(member.name));
    }
    return names.bytes();
}

Bytes MemberIds(const TypeFacts& record) {
    ByteWriter ids;
    for (const TypeMember& member : record.members) {
        ids.Append(AuidOf(member.id));
    }
    return ids.bytes();
}

Bytes MemberValues(const TypeFacts& record) {
    ByteWriter values;
    for (const TypeMember& member : record.members) {
        values.AppendNumber(member.value);
    }
    return values.bytes();
}

void AddRecordMembers(Definition& definition, const TypeFacts& record) {
    std::vector<Bytes> types;
    for (const TypeMember& member : record.members) {
        types.push_back(IdBytes(member.id));
    }
    definition.AddWeak(meta::kRecordMemberTypes, StoredForm::WeakVector, u"MemberTypes",
                       std::move(types), kTypePath);
    definition.AddData(meta::kRecordMemberNames, MemberNames(record));
}

StoredObject StoredType(const TypeFacts& record) {
    Definition definition(ClassOfTypes(record.kind), record.id, record.name);
    if (const std::uint16_t pid = TargetPidOf(record.kind); pid != 0) {
        definition.AddWeak(pid, record.target, RefersToClass(record.kind) ? kClassPath : kTypePath);
    }
    switch (record.kind) {
        case TypeKind::Integer:
            definition.AddNumber(meta::kIntegerSize, static_cast<std::uint8_t>(record.size));
            definition.AddFlag(meta::kIntegerIsSigned, record.isSigned);
            break;
        case TypeKind::WeakReference:
            definition.AddData(meta::kWeakTargetSet, MemberIds(record));
            break;
        case TypeKind::Enumeration:
            definition.AddData(meta::kEnumerationNames, MemberNames(record));
            definition.AddData(meta::kEnumerationValues, MemberValues(record));
            break;
        case TypeKind::FixedArray:
            definition.AddNumber(meta::kFixedArrayCount, record.size);
            break;
        case TypeKind::Record:
            AddRecordMembers(definition, record);
            break;
        case TypeKind::ExtendibleEnumeration:
            definition.AddData(meta::kExtendibleNames, MemberNames(record));
            definition.AddData(meta::kExtendibleValues, MemberIds(record));
            break;
        default:
            break;  // the others are told by their target alone
    }
    return definition.Take();
}

StoredObject StoredBuiltInClass(const BuiltInClass& entry) {
    MetaClass record{entry.id, Widen(entry.name), entry.parent, entry.concrete, {}};
    for (const BuiltInProperty& property : entry.properties) {
        record.properties.push_back({property.key.id, Widen(property.name), property.key.pid,
                                     property.type, property.optional, property.unique});
    }
    return StoredClass(record);
}

StoredObject StoredBuiltInType(const BuiltInType& entry) {
    return StoredType(FactsOf(entry));
}

// The definitions of a built-in table, each laid out when a file first needs it.
template <class Entry>
class LaidOutTable {
public:
    LaidOutTable(Span<Entry> table, StoredObject (*makeWhole)(const Entry&))
        : table_(table), makeWhole_(makeWhole), places_(new Place[table.size()]) {}

    const StoredObject& Definition(const Entry& entry) {
        Place& place = places_[static_cast<std::size_t>(&entry - table_.begin())];
        std::call_once(place.once, [&] {
            place.object = makeWhole_(entry);
            if (auto laidOut = LayOut(place.object, {kClassPath, kTypePath})) {
                place.object.properties.clear();
                place.object.laidOut = std::move(laidOut);
            }
        });
        return place.object;
    }

private:
    struct Place {
        std::once_flag once;
        StoredObject object;
    };

    const Span<Entry> table_;
    StoredObject (*const makeWhole_)(const Entry&);
    const std::unique_ptr<Place[]> places_;
};

StoredObject LaidOutClass(const BuiltInClass& entry) {
    static LaidOutTable<BuiltInClass> table(BuiltInClasses(), StoredBuiltInClass);
    return table.Definition(entry);
}

StoredObject LaidOutType(const BuiltInType& entry) {
    static LaidOutTable<BuiltInType> table(BuiltInTypes(), StoredBuiltInType);
    return table.Definition(entry);
}

StoredObject MetaDictionaryOf(const MetaRecords& records,
                              StoredObject (*builtInClass)(const BuiltInClass&),
                              StoredObject (*builtInType)(const BuiltInType&)) {
    StoredProperty classes = DefinitionSet(meta::kClassDefinitions, u"ClassDefinitions");
    for (const MetaClass& record : records.classes) {
        AddTo(classes, record.id, StoredClass(record));
    }
    for (const BuiltInClass* entry : records.builtInClasses) {
        AddTo(classes, entry->id, builtInClass(*entry));
    }
    StoredProperty types = DefinitionSet(meta::kTypeDefinitions, u"TypeDefinitions");
    for (const TypeFacts& record : records.types) {
        AddTo(types, record.id, StoredType(record));
    }
    for (const BuiltInType* entry : records.builtInTypes) {
        AddTo(types, entry->id, builtInType(*entry));
    }
    NumberClasses(classes);
    NumberTypes(types);
    StoredObject dictionary;
    dictionary.classId = AuidOf(AUID_AAFMetaDictionary);
    dictionary.properties.push_back(std::move(classes));
    dictionary.properties.push_back(std::move(types));
    return dictionary;
}

// Where it stands in a file: behind the root, the root's values and its own entry.
constexpr CompoundPlace kPlaceOfMetaDictionary = {2, 2};

// Movies of one kind need the same definitions, so the dictionaries that were used last
// are kept as a whole.
class KeptDictionaries {
public:
    std::optional<StoredObject> Find(const MetaRecords& records) {
        const std::lock_guard<std::mutex> lock(mutex_);
        const auto known = std::find_if(kept_.begin(), kept_.end(),
                                        [&](const Kept& one) { return one.records == records; });
        if (known == kept_.end()) {
            return std::nullopt;
        }
        std::rotate(kept_.begin(), known, known + 1);
        return kept_.front().dictionary;
    }

    void Keep(const MetaRecords& records, const StoredObject& dictionary) {
        const std::lock_guard<std::mutex> lock(mutex_);
        kept_.push_front({records, dictionary});
        kept_.resize(std::min(kept_.size(), kMost));
    }

private:
    struct Kept {
        MetaRecords records;
        StoredObject dictionary;
    };

    static constexpr std::size_t kMost = 8;
    std::mutex mutex_;
    std::deque<Kept> kept_;
};

}  // namespace

StoredObject StoredMetaDictionary(const MetaRecords& records) {
    return MetaDictionaryOf(records, StoredBuiltInClass, StoredBuiltInType);
}

namespace {

StoredObject StoredDefinition(const GUID& classId, const BuiltInDefinition& entry) {
    StoredObject object;
    object.classId = AuidOf(classId);
    const auto add = [&](const PropertyKey& key, Bytes value) {
        StoredProperty property;
        property.pid = key.pid;
        property.bytes = std::move(value);
        object.properties.push_back(std::move(property));
    };
    const auto text = [](const char* ascii) {
        return ByteWriter().AppendText(Utf16Of(Widen(ascii))).bytes();
    };
    add(prop::DefinitionObject_Identification, IdBytes(entry.id));
    add(prop::DefinitionObject_Name, text(entry.name));
    add(prop::DefinitionObject_Description, text(entry.description));
    return object;
}

}  // namespace

StoredObject StoredDataDefinition(const BuiltInDefinition& entry) {
    return StoredDefinition(AUID_AAFDataDefinition, entry);
}

StoredObject StoredContainerDefinition(const BuiltInDefinition& entry) {
    return StoredDefinition(AUID_AAFContainerDefinition, entry);
}

StoredObject LaidOutDataDefinition(const BuiltInDefinition& entry) {
    static LaidOutTable<BuiltInDefinition> table(BuiltInDataDefinitions(), StoredDataDefinition);
    return table.Definition(entry);
}

StoredObject LaidOutContainerDefinition(const BuiltInDefinition& entry) {
    static LaidOutTable<BuiltInDefinition> table(BuiltInContainerDefinitions(),
                                                 StoredContainerDefinition);
    return table.Definition(entry);
}

StoredObject LaidOutMetaDictionary(const MetaRecords& records) {
    static KeptDictionaries kept;
    if (std::optional<StoredObject> known = kept.Find(records)) {
        return *std::move(known);
    }
    StoredObject dictionary = MetaDictionaryOf(records, LaidOutClass, LaidOutType);
    try {
        if (auto laidOut = LayOut(dictionary, {kClassPath, kTypePath}, kPlaceOfMetaDictionary)) {
            dictionary.properties.clear();
            dictionary.laidOut = std::move(laidOut);
            kept.Keep(records, dictionary);
        }
    } catch (const StoredError&) {
        // The writer of the whole file will find the same, and tells where it is.
    }
    return dictionary;
}

}  // namespace aaf::stored
