// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/stored/LittleEndian.h"
#include "aaf_library/stored/MetaKinds.h"
#include "aaf_library/stored/ModelNames.h"
#include "aaf_library/stored/StoredNames.h"
#include "host_interfaces/aaf/AAFClassIds.h"

namespace aaf::stored {

namespace {

const StoredProperty* find(const StoredObject& object, std::uint16_t pid, StoredForm form) {
    const StoredProperty* property = object.find(pid);
    return property != nullptr && property->form == form ? property : nullptr;
}

const Bytes& requiredData(const StoredObject& object, std::uint16_t pid) {
    const StoredProperty* property = find(object, pid, StoredForm::Data);
    if (property == nullptr) {
        throw StoredError(propertyText(pid) + " is missing");
    }
    return property->bytes;
}

const StoredProperty& requiredSet(const StoredObject& object, std::uint16_t pid) {
    const StoredProperty* property = find(object, pid, StoredForm::StrongSet);
    if (property == nullptr) {
        throw StoredError(propertyText(pid) + " is missing");
    }
    return *property;
}

template <typename Number>
Number requiredNumber(const StoredObject& object, std::uint16_t pid) {
    return ByteReader(requiredData(object, pid)).number<Number>();
}

bool flag(const StoredObject& object, std::uint16_t pid, bool absent) {
    const StoredProperty* property = find(object, pid, StoredForm::Data);
    return property == nullptr ? absent : property->bytes.front() != 0;
}

std::wstring nameOf(const StoredObject& object) {
    return wideOf(ByteReader(requiredData(object, meta::name)).text());
}

GUID requiredTarget(const StoredObject& object, std::uint16_t pid) {
    const StoredProperty* property = find(object, pid, StoredForm::WeakReference);
    if (property == nullptr) {
        throw StoredError(propertyText(pid) + " is missing");
    }
    return guidOf(property->keys.front());
}

// Names one after the other, each with its terminator. Absent: none.
std::vector<std::wstring> names(const StoredObject& object, std::uint16_t pid) {
    std::vector<std::wstring> out;
    const StoredProperty* property = find(object, pid, StoredForm::Data);
    if (property == nullptr) {
        return out;
    }
    ByteReader from(property->bytes);
    std::u16string name;
    while (from.left() != 0) {
        const auto unit = static_cast<char16_t>(from.number<std::uint16_t>());
        if (unit != 0) {
            name += unit;
            continue;
        }
        out.push_back(wideOf(name));
        name.clear();
    }
    if (!name.empty()) {
        throw StoredError(propertyText(pid) + " ends within a name");
    }
    return out;
}

std::vector<GUID> ids(const StoredObject& object, std::uint16_t pid) {
    std::vector<GUID> out;
    const StoredProperty* property = find(object, pid, StoredForm::Data);
    if (property == nullptr) {
        return out;
    }
    ByteReader from(property->bytes);
    while (from.left() != 0) {
        out.push_back(guidOf(from.bytes(sizeof(StoredAuid))));
    }
    return out;
}

std::vector<TypeMember> named(std::vector<std::wstring> memberNames, std::size_t values) {
    if (memberNames.size() != values) {
        throw StoredError(std::to_string(memberNames.size()) + " names for " +
                          std::to_string(values) + " members");
    }
    std::vector<TypeMember> members(values);
    for (std::size_t i = 0; i < values; ++i) {
        members[i].name = std::move(memberNames[i]);
    }
    return members;
}

std::vector<TypeMember> withIds(std::vector<std::wstring> memberNames,
                                const std::vector<GUID>& values) {
    std::vector<TypeMember> members = named(std::move(memberNames), values.size());
    for (std::size_t i = 0; i < values.size(); ++i) {
        members[i].id = values[i];
    }
    return members;
}

std::vector<TypeMember> enumerationMembers(const StoredObject& object) {
    std::vector<std::wstring> memberNames = names(object, meta::enumerationNames);
    std::vector<std::int64_t> values;
    if (const StoredProperty* stored = find(object, meta::enumerationValues, StoredForm::Data)) {
        ByteReader from(stored->bytes);
        while (from.left() != 0) {
            values.push_back(from.number<std::int64_t>());
        }
    }
    std::vector<TypeMember> members = named(std::move(memberNames), values.size());
    for (std::size_t i = 0; i < values.size(); ++i) {
        members[i].value = values[i];
    }
    return members;
}

std::vector<TypeMember> recordMembers(const StoredObject& object) {
    std::vector<GUID> types;
    if (const StoredProperty* stored =
            find(object, meta::recordMemberTypes, StoredForm::WeakVector)) {
        for (const Bytes& key : stored->keys) {
            types.push_back(guidOf(key));
        }
    }
    return withIds(names(object, meta::recordMemberNames), types);
}

void readMembers(const StoredObject& object, TypeFacts& record) {
    switch (record.kind) {
        case TypeKind::Integer:
            record.size = requiredNumber<std::uint8_t>(object, meta::integerSize);
            record.isSigned = flag(object, meta::integerIsSigned, false);
            break;
        case TypeKind::WeakReference: {
            const std::vector<GUID> path = ids(object, meta::weakTargetSet);
            record.members = withIds(std::vector<std::wstring>(path.size()), path);
            break;
        }
        case TypeKind::Enumeration:
            record.members = enumerationMembers(object);
            break;
        case TypeKind::FixedArray:
            record.size = requiredNumber<std::uint32_t>(object, meta::fixedArrayCount);
            break;
        case TypeKind::Record:
            record.members = recordMembers(object);
            break;
        case TypeKind::ExtendibleEnumeration:
            record.members =
                withIds(names(object, meta::extendibleNames), ids(object, meta::extendibleValues));
            break;
        default:
            break;
    }
}

MetaProperty readProperty(const StoredObject& object) {
    MetaProperty record;
    record.id = guidOf(requiredData(object, meta::identification));
    record.name = nameOf(object);
    record.type = guidOf(requiredData(object, meta::propertyType));
    record.optional = flag(object, meta::isOptional, true);
    record.pid = requiredNumber<std::uint16_t>(object, meta::localIdentification);
    record.unique = flag(object, meta::isUniqueIdentifier, false);
    return record;
}

MetaClass readClass(const StoredObject& object) {
    MetaClass record;
    record.id = guidOf(requiredData(object, meta::identification));
    record.name = nameOf(object);
    record.parent = requiredTarget(object, meta::parentClass);
    record.concrete = flag(object, meta::isConcrete, true);
    if (const StoredProperty* set = find(object, meta::properties, StoredForm::StrongSet)) {
        for (const StoredObject& property : set->objects) {
            record.properties.push_back(readProperty(property));
        }
    }
    return record;
}

TypeFacts readType(const StoredObject& object, TypeKind kind) {
    TypeFacts record;
    record.id = guidOf(requiredData(object, meta::identification));
    record.name = nameOf(object);
    record.kind = kind;
    if (const std::uint16_t pid = targetPidOf(kind); pid != 0) {
        record.target = requiredTarget(object, pid);
    }
    readMembers(object, record);
    return record;
}

}  // namespace

MetaRecords readMetaDictionary(const StoredObject& metaDictionary) {
    MetaRecords records;
    try {
        for (const StoredObject& object :
             requiredSet(metaDictionary, meta::classDefinitions).objects) {
            if (guidOf(object.classId) == AUID_AAFClassDef) {
                records.classes.push_back(readClass(object));
            }
        }
        for (const StoredObject& object :
             requiredSet(metaDictionary, meta::typeDefinitions).objects) {
            if (TypeKind kind{}; IsClassOfTypes(guidOf(object.classId), &kind)) {
                records.types.push_back(readType(object, kind));
            }
        }
    } catch (const StoredError& problem) {
        throw StoredError(std::string("meta-dictionary: ") + problem.what());
    }
    return records;
}

}  // namespace aaf::stored
