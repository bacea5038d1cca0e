// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/stored/LittleEndian.h"
#include "aaf_library/stored/MetaKinds.h"
#include "aaf_library/stored/ModelNames.h"
#include "aaf_library/stored/StoredNames.h"
#include "host_interfaces/aaf/AAFClassIds.h"

namespace aaf::stored {

namespace {

const StoredProperty* FindIn(const StoredObject& object, std::uint16_t pid, StoredForm form) {
    const StoredProperty* property = object.Find(pid);
    const bool fits = property != nullptr && property->form == form && property->problem.empty();
    return fits ? property : nullptr;
}

const Bytes& RequiredData(const StoredObject& object, std::uint16_t pid) {
    const StoredProperty* property = FindIn(object, pid, StoredForm::Data);
    if (property == nullptr) {
        throw StoredError(PropertyText(pid) + " is missing");
    }
    return property->bytes;
}

const StoredProperty& RequiredSet(const StoredObject& object, std::uint16_t pid) {
    const StoredProperty* property = FindIn(object, pid, StoredForm::StrongSet);
    if (property == nullptr) {
        throw StoredError(PropertyText(pid) + " is missing");
    }
    return *property;
}

template <typename Number>
Number RequiredNumber(const StoredObject& object, std::uint16_t pid) {
    return ByteReader(RequiredData(object, pid)).TakeNumber<Number>();
}

bool FlagOf(const StoredObject& object, std::uint16_t pid, bool absent) {
    const StoredProperty* property = FindIn(object, pid, StoredForm::Data);
    return property == nullptr ? absent : property->bytes.front() != 0;
}

std::wstring NameOf(const StoredObject& object) {
    return WideOf(ByteReader(RequiredData(object, meta::kName)).TakeText());
}

GUID RequiredTarget(const StoredObject& object, std::uint16_t pid) {
    const StoredProperty* property = FindIn(object, pid, StoredForm::WeakReference);
    if (property == nullptr) {
        throw StoredError(PropertyText(pid) + " is missing");
    }
    return GuidOf(property->keys.front());
}

// Names one after the other, each with its terminator. Absent: none.
std::vector<std::wstring> NamesIn(const StoredObject& object, std::uint16_t pid) {
    std::vector<std::wstring> out;
    const StoredProperty* property = FindIn(object, pid, StoredForm::Data);
    if (property == nullptr) {
        return out;
    }
    ByteReader from(property->bytes);
    std::u16string name;
    while (from.left() != 0) {
        const auto unit = static_cast<char16_t>(from.TakeNumber<std::uint16_t>());
        if (unit != 0) {
            name += unit;
            continue;
        }
        out.push_back(WideOf(name));
        name.clear();
    }
    if (!name.empty()) {
        throw StoredError(PropertyText(pid) + " ends within a name");
    }
    return out;
}

std::vector<GUID> IdsIn(const StoredObject& object, std::uint16_t pid) {
    std::vector<GUID> out;
    const StoredProperty* property = FindIn(object, pid, StoredForm::Data);
    if (property == nullptr) {
        return out;
    }
    ByteReader from(property->bytes);
    while (from.left() != 0) {
        out.push_back(GuidOf(from.TakeBytes(sizeof(StoredAuid))));
    }
    return out;
}

std::vector<TypeMember> Named(std::vector<std::wstring> memberNames, std::size_t values) {
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

std::vector<TypeMember> WithIds(std::vector<std::wstring> memberNames,
                                const std::vector<GUID>& values) {
    std::vector<TypeMember> members = Named(std::move(memberNames), values.size());
    for (std::size_t i = 0; i < values.size(); ++i) {
        members[i].id = values[i];
    }
    return members;
}

std::vector<TypeMember> EnumerationMembers(const StoredObject& object) {
    std::vector<std::wstring> memberNames = NamesIn(object, meta::kEnumerationNames);
    std::vector<std::int64_t> values;
    if (const StoredProperty* stored = FindIn(object, meta::kEnumerationValues, StoredForm::Data)) {
        ByteReader from(stored->bytes);
        while (from.left() != 0) {
            values.push_back(from.TakeNumber<std::int64_t>());
        }
    }
    std::vector<TypeMember> members = Named(std::move(memberNames), values.size());
    for (std::size_t i = 0; i < values.size(); ++i) {
        members[i].value = values[i];
    }
    return members;
}

std::vector<TypeMember> RecordMembers(const StoredObject& object) {
    std::vector<GUID> types;
    if (const StoredProperty* stored =
            FindIn(object, meta::kRecordMemberTypes, StoredForm::WeakVector)) {
        for (const Bytes& key : stored->keys) {
            types.push_back(GuidOf(key));
        }
    }
    return WithIds(NamesIn(object, meta::kRecordMemberNames), types);
}

void ReadMembers(const StoredObject& object, TypeFacts& record) {
    switch (record.kind) {
        case TypeKind::Integer:
            record.size = RequiredNumber<std::uint8_t>(object, meta::kIntegerSize);
            record.isSigned = FlagOf(object, meta::kIntegerIsSigned, false);
            break;
        case TypeKind::WeakReference: {
            const std::vector<GUID> path = IdsIn(object, meta::kWeakTargetSet);
            record.members = WithIds(std::vector<std::wstring>(path.size()), path);
            break;
        }
        case TypeKind::Enumeration:
            record.members = EnumerationMembers(object);
            break;
        case TypeKind::FixedArray:
            record.size = RequiredNumber<std::uint32_t>(object, meta::kFixedArrayCount);
            break;
        case TypeKind::Record:
            record.members = RecordMembers(object);
            break;
        case TypeKind::ExtendibleEnumeration:
            record.members = WithIds(NamesIn(object, meta::kExtendibleNames),
                                     IdsIn(object, meta::kExtendibleValues));
            break;
        default:
            break;
    }
}

MetaProperty ReadProperty(const StoredObject& object) {
    MetaProperty record;
    record.id = GuidOf(RequiredData(object, meta::kIdentification));
    record.name = NameOf(object);
    record.type = GuidOf(RequiredData(object, meta::kPropertyType));
    record.optional = FlagOf(object, meta::kIsOptional, true);
    record.pid = RequiredNumber<std::uint16_t>(object, meta::kLocalIdentification);
    record.unique = FlagOf(object, meta::kIsUniqueIdentifier, false);
    return record;
}

// What an object says, added to a list; or a note that it says nothing.
template <class Record, class Read>
void ReadInto(std::vector<Record>& records, std::vector<std::string>& notes, const char* what,
              const Read& read) {
    try {
        records.push_back(read());
    } catch (const StoredError& problem) {
        notes.push_back(std::string("meta-dictionary: ") + what +
                        " is left out: " + problem.what());
    }
}

MetaClass ReadClass(const StoredObject& object, std::vector<std::string>& notes) {
    MetaClass record;
    record.id = GuidOf(RequiredData(object, meta::kIdentification));
    record.name = NameOf(object);
    record.parent = RequiredTarget(object, meta::kParentClass);
    record.concrete = FlagOf(object, meta::kIsConcrete, true);
    if (const StoredProperty* set = FindIn(object, meta::kProperties, StoredForm::StrongSet)) {
        const std::string what = "a property of " + ToUtf8(record.name);
        for (const StoredObject& property : set->objects) {
            ReadInto(record.properties, notes, what.c_str(),
                     [&] { return ReadProperty(property); });
        }
    }
    return record;
}

TypeFacts ReadType(const StoredObject& object, TypeKind kind) {
    TypeFacts record;
    record.id = GuidOf(RequiredData(object, meta::kIdentification));
    record.name = NameOf(object);
    record.kind = kind;
    if (const std::uint16_t pid = TargetPidOf(kind); pid != 0) {
        record.target = RequiredTarget(object, pid);
    }
    ReadMembers(object, record);
    return record;
}

}  // namespace

MetaRecords ReadMetaDictionary(const StoredObject& metaDictionary) {
    MetaRecords records;
    try {
        for (const StoredObject& object :
             RequiredSet(metaDictionary, meta::kClassDefinitions).objects) {
            if (GuidOf(object.classId) == AUID_AAFClassDef) {
                ReadInto(records.classes, records.notes, "a class",
                         [&] { return ReadClass(object, records.notes); });
            }
        }
        for (const StoredObject& object :
             RequiredSet(metaDictionary, meta::kTypeDefinitions).objects) {
            if (TypeKind kind{}; IsClassOfTypes(GuidOf(object.classId), &kind)) {
                const TypeKind known = kind;
                ReadInto(records.types, records.notes, "a type",
                         [&] { return ReadType(object, known); });
            }
        }
    } catch (const StoredError& problem) {
        throw StoredError(std::string("meta-dictionary: ") + problem.what());
    }
    return records;
}

}  // namespace aaf::stored
