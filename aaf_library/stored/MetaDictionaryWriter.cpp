// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/stored/LittleEndian.h"
#include "aaf_library/stored/MetaKinds.h"
#include "aaf_library/stored/ModelNames.h"
#include "host_interfaces/aaf/AAFClassIds.h"

namespace aaf::stored {

namespace {

const std::vector<std::uint16_t> classPath = {meta::rootMetaDictionary, meta::classDefinitions};
const std::vector<std::uint16_t> typePath = {meta::rootMetaDictionary, meta::typeDefinitions};

Bytes idBytes(const GUID& id) {
    const StoredAuid stored = storedAuid(id);
    return Bytes(stored.begin(), stored.end());
}

class Definition {
public:
    Definition(const GUID& definitionClass, const GUID& id, const std::wstring& name) {
        object_.classId = storedAuid(definitionClass);
        data(meta::identification, idBytes(id));
        data(meta::name, ByteWriter().text(utf16Of(name)).bytes());
    }

    void data(std::uint16_t pid, Bytes value) {
        StoredProperty property;
        property.pid = pid;
        property.bytes = std::move(value);
        object_.properties.push_back(std::move(property));
    }
    template <typename Number>
    void number(std::uint16_t pid, Number value) {
        data(pid, ByteWriter().number(value).bytes());
    }
    void flag(std::uint16_t pid, bool value) { number(pid, std::uint8_t{value}); }

    void weak(std::uint16_t pid, StoredForm form, const std::u16string& name,
              std::vector<Bytes> keys, const std::vector<std::uint16_t>& path) {
        StoredProperty property;
        property.pid = pid;
        property.form = form;
        property.name = name;
        property.keys = std::move(keys);
        property.keyPid = meta::identification;
        property.targetPath = path;
        object_.properties.push_back(std::move(property));
    }
    void weak(std::uint16_t pid, const GUID& target, const std::vector<std::uint16_t>& path) {
        weak(pid, StoredForm::WeakReference, {}, {idBytes(target)}, path);
    }

    void set(StoredProperty property) { object_.properties.push_back(std::move(property)); }

    StoredObject take() { return std::move(object_); }

private:
    StoredObject object_;
};

StoredProperty definitionSet(std::uint16_t pid, const std::u16string& name) {
    StoredProperty set;
    set.pid = pid;
    set.form = StoredForm::StrongSet;
    set.name = name;
    set.keyPid = meta::identification;
    return set;
}

void addTo(StoredProperty& set, const GUID& id, StoredObject definition) {
    set.keys.push_back(idBytes(id));
    set.objects.push_back(std::move(definition));
}

StoredObject storedProperty(const MetaProperty& record) {
    Definition definition(AUID_AAFPropertyDef, record.id, record.name);
    definition.data(meta::propertyType, idBytes(record.type));  // an id, no weak reference
    definition.flag(meta::isOptional, record.optional);
    definition.number(meta::localIdentification, record.pid);
    if (record.unique) {
        definition.flag(meta::isUniqueIdentifier, true);
    }
    return definition.take();
}

StoredObject storedClass(const MetaClass& record) {
    Definition definition(AUID_AAFClassDef, record.id, record.name);
    definition.weak(meta::parentClass, record.parent, classPath);
    if (!record.properties.empty()) {
        StoredProperty properties = definitionSet(meta::properties, u"Properties");
        for (const MetaProperty& property : record.properties) {
            addTo(properties, property.id, storedProperty(property));
        }
        definition.set(std::move(properties));
    }
    definition.flag(meta::isConcrete, record.concrete);
    return definition.take();
}

Bytes memberNames(const TypeFacts& record) {
    ByteWriter names;
    for (const TypeMember& member : record.members) {
        names.text(utf16Of(member.name));
    }
    return names.bytes();
}

Bytes memberIds(const TypeFacts& record) {
    ByteWriter ids;
    for (const TypeMember& member : record.members) {
        ids.append(storedAuid(member.id));
    }
    return ids.bytes();
}

Bytes memberValues(const TypeFacts& record) {
    ByteWriter values;
    for (const TypeMember& member : record.members) {
        values.number(member.value);
    }
    return values.bytes();
}

void addRecordMembers(Definition& definition, const TypeFacts& record) {
    std::vector<Bytes> types;
    for (const TypeMember& member : record.members) {
        types.push_back(idBytes(member.id));
    }
    definition.weak(meta::recordMemberTypes, StoredForm::WeakVector, u"MemberTypes",
                    std::move(types), typePath);
    definition.data(meta::recordMemberNames, memberNames(record));
}

StoredObject storedType(const TypeFacts& record) {
    Definition definition(ClassOfTypes(record.kind), record.id, record.name);
    if (const std::uint16_t pid = targetPidOf(record.kind); pid != 0) {
        definition.weak(pid, record.target, RefersToClass(record.kind) ? classPath : typePath);
    }
    switch (record.kind) {
        case TypeKind::Integer:
            definition.number(meta::integerSize, static_cast<std::uint8_t>(record.size));
            definition.flag(meta::integerIsSigned, record.isSigned);
            break;
        case TypeKind::WeakReference:
            definition.data(meta::weakTargetSet, memberIds(record));
            break;
        case TypeKind::Enumeration:
            definition.data(meta::enumerationNames, memberNames(record));
            definition.data(meta::enumerationValues, memberValues(record));
            break;
        case TypeKind::FixedArray:
            definition.number(meta::fixedArrayCount, record.size);
            break;
        case TypeKind::Record:
            addRecordMembers(definition, record);
            break;
        case TypeKind::ExtendibleEnumeration:
            definition.data(meta::extendibleNames, memberNames(record));
            definition.data(meta::extendibleValues, memberIds(record));
            break;
        default:
            break;  // the others are told by their target alone
    }
    return definition.take();
}

}  // namespace

StoredObject storedMetaDictionary(const MetaRecords& records) {
    StoredProperty classes = definitionSet(meta::classDefinitions, u"ClassDefinitions");
    for (const MetaClass& record : records.classes) {
        addTo(classes, record.id, storedClass(record));
    }
    StoredProperty types = definitionSet(meta::typeDefinitions, u"TypeDefinitions");
    for (const TypeFacts& record : records.types) {
        addTo(types, record.id, storedType(record));
    }
    StoredObject dictionary;
    dictionary.classId = storedAuid(AUID_AAFMetaDictionary);
    dictionary.properties.push_back(std::move(classes));
    dictionary.properties.push_back(std::move(types));
    return dictionary;
}

}  // namespace aaf::stored
