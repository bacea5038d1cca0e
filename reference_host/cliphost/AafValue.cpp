// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/cliphost/AafValue.h"

#include <fmt/format.h>

#include <vector>

#include "host_interfaces/aaf/AAFDefinitions.h"
#include "host_interfaces/aaf/AAFMetaDefinitions.h"
#include "host_interfaces/aaf/AAFTypeDefinitions.h"
#include "host_interfaces/aaf/AAFTypeDefinitionsOfMany.h"
#include "host_interfaces/aaf/AAFTypeIds.h"
#include "text/Encodings.h"

namespace cliphost {
namespace {

constexpr char kUnreadable[] = "?";
constexpr aafUInt32 kMostElements = 64;  // of an array shown on one line

aafUID_t TypeId(IAAFTypeDef* type) {
    aafUID_t id{};
    if (const auto meta = As<IAAFMetaDefinition>(type)) {
        meta->GetAUID(&id);
    }
    return id;
}

std::string NamedId(const std::string& name, const aafUID_t& id) {
    return name.empty() ? ToText(id) : fmt::format("{} {}", name, ToText(id));
}

std::string IntegerText(IAAFTypeDef* type, IAAFPropertyValue* value) {
    const auto integer = As<IAAFTypeDefInt>(type);
    aafUInt32 size = 0;
    aafBoolean_t isSigned = kAAFFalse;
    aafInt64 number = 0;
    if (!integer || integer->GetSize(&size) < 0 || integer->IsSigned(&isSigned) < 0 ||
        size > sizeof number) {
        return kUnreadable;
    }
    unsigned char bytes[8] = {};
    if (integer->GetInteger(value, bytes, size) < 0) {
        return kUnreadable;
    }
    aafUInt64 raw = 0;
    for (aafUInt32 i = size; i-- > 0;) {
        raw = raw << 8 | bytes[i];
    }
    if (!isSigned) {
        return fmt::format("{}", raw);
    }
    const unsigned shift = 64 - 8 * size;
    number = static_cast<aafInt64>(raw << shift) >> shift;
    return fmt::format("{}", number);
}

// A record whose structure is published, read whole.
template <class Record>
bool ReadRecord(IAAFTypeDefRecord& type, IAAFPropertyValue* value, Record& out) {
    return type.GetStruct(value, reinterpret_cast<aafMemPtr_t>(&out), sizeof out) >= 0;
}

std::string MembersText(IAAFTypeDefRecord& record, IAAFPropertyValue* value) {
    aafUInt32 count = 0;
    record.GetCount(&count);
    std::string text;
    for (aafUInt32 i = 0; i < count; ++i) {
        host::Ref<IAAFPropertyValue> member;
        const std::string name = TextOf(&record, &IAAFTypeDefRecord::GetMemberNameBufLen,
                                        &IAAFTypeDefRecord::GetMemberName, i);
        const bool read = record.GetValue(value, i, member.Out()) >= 0;
        text += fmt::format("{}{} {}", i == 0 ? "" : ", ", name,
                            read ? ValueText(member.get()) : kUnreadable);
    }
    return text;
}

std::string RecordText(IAAFTypeDef* type, IAAFPropertyValue* value) {
    const auto record = As<IAAFTypeDefRecord>(type);
    if (!record) {
        return kUnreadable;
    }
    const aafUID_t id = TypeId(type);
    if (id == kAAFTypeID_Rational) {
        aafRational_t rational{};
        return ReadRecord(*record.get(), value, rational)
                   ? fmt::format("{}/{}", rational.numerator, rational.denominator)
                   : kUnreadable;
    }
    if (id == kAAFTypeID_AUID) {
        aafUID_t auid{};
        return ReadRecord(*record.get(), value, auid) ? ToText(auid) : kUnreadable;
    }
    if (id == kAAFTypeID_MobIDType) {
        aafMobID_t mobId{};
        return ReadRecord(*record.get(), value, mobId) ? ToText(mobId) : kUnreadable;
    }
    if (id == kAAFTypeID_TimeStamp) {
        aafTimeStamp_t time{};
        return ReadRecord(*record.get(), value, time) ? ToText(time) : kUnreadable;
    }
    if (id == kAAFTypeID_VersionType) {
        aafVersionType_t version{};
        return ReadRecord(*record.get(), value, version)
                   ? fmt::format("{}.{}", static_cast<int>(version.major),
                                 static_cast<int>(version.minor))
                   : kUnreadable;
    }
    return MembersText(*record.get(), value);
}

std::string StringText(IAAFTypeDef* type, IAAFPropertyValue* value) {
    const auto string = As<IAAFTypeDefString>(type);
    aafUInt32 count = 0;
    if (!string || string->GetCount(value, &count) < 0 || count > 0x100000) {
        return kUnreadable;
    }
    std::wstring wide(count + 1, L'\0');
    if (string->GetElements(value, reinterpret_cast<aafMemPtr_t>(wide.data()),
                            static_cast<aafUInt32>(count * sizeof(wchar_t))) < 0) {
        return kUnreadable;
    }
    return fmt::format("\"{}\"", Utf8(wide.c_str()));
}

std::string EnumText(IAAFTypeDef* type, IAAFPropertyValue* value) {
    const auto enumeration = As<IAAFTypeDefEnum>(type);
    aafInt64 number = 0;
    if (!enumeration || enumeration->GetIntegerValue(value, &number) < 0) {
        return kUnreadable;
    }
    const std::string name = TextOf(enumeration.get(), &IAAFTypeDefEnum::GetNameBufLenFromInteger,
                                    &IAAFTypeDefEnum::GetNameFromInteger, number);
    return name.empty() ? fmt::format("{}", number) : fmt::format("{} ({})", name, number);
}

std::string ExtendibleEnumText(IAAFTypeDef* type, IAAFPropertyValue* value) {
    const auto enumeration = As<IAAFTypeDefExtEnum>(type);
    aafUID_t id{};
    if (!enumeration || enumeration->GetAUIDValue(value, &id) < 0) {
        return kUnreadable;
    }
    const std::string name = TextOf<IAAFTypeDefExtEnum, aafUID_constref>(
        enumeration.get(), &IAAFTypeDefExtEnum::GetNameBufLenFromAUID,
        &IAAFTypeDefExtEnum::GetNameFromAUID, id);
    return NamedId(name, id);
}

// A reference to a definition, by its name.
std::string ReferenceText(IAAFTypeDef* type, IAAFPropertyValue* value) {
    const auto reference = As<IAAFTypeDefObjectRef>(type);
    IUnknown* raw = nullptr;
    if (!reference || reference->GetObject(value, IID_IUnknown, &raw) < 0 || !raw) {
        return kUnreadable;
    }
    host::Ref<IUnknown> target;
    *target.Out() = raw;
    if (const auto definition = As<IAAFDefObject>(target.get())) {
        aafUID_t id{};
        definition->GetAUID(&id);
        const std::string name =
            TextOf(definition.get(), &IAAFDefObject::GetNameBufLen, &IAAFDefObject::GetName);
        return NamedId(name, id);
    }
    if (const auto meta = As<IAAFMetaDefinition>(target.get())) {
        return TextOf(meta.get(), &IAAFMetaDefinition::GetNameBufLen, &IAAFMetaDefinition::GetName);
    }
    return kUnreadable;
}

std::string ElementsText(aafUInt32 count, bool complete, const std::vector<std::string>& elements) {
    std::string text = "[";
    for (const std::string& element : elements) {
        text += (text.size() > 1 ? ", " : "") + element;
    }
    return text + (complete ? "]" : fmt::format(", ... {} in all]", count));
}

template <class ArrayType>
std::string ArrayText(ArrayType& array, aafUInt32 count, IAAFPropertyValue* value) {
    std::vector<std::string> elements;
    for (aafUInt32 i = 0; i < count && i < kMostElements; ++i) {
        host::Ref<IAAFPropertyValue> element;
        elements.push_back(array.GetElementValue(value, i, element.Out()) >= 0
                               ? ValueText(element.get())
                               : kUnreadable);
    }
    return ElementsText(count, count <= kMostElements, elements);
}

std::string VariableArrayText(IAAFTypeDef* type, IAAFPropertyValue* value) {
    const auto array = As<IAAFTypeDefVariableArray>(type);
    aafUInt32 count = 0;
    return array && array->GetCount(value, &count) >= 0 ? ArrayText(*array.get(), count, value)
                                                        : kUnreadable;
}

std::string FixedArrayText(IAAFTypeDef* type, IAAFPropertyValue* value) {
    const auto array = As<IAAFTypeDefFixedArray>(type);
    aafUInt32 count = 0;
    return array && array->GetCount(&count) >= 0 ? ArrayText(*array.get(), count, value)
                                                 : kUnreadable;
}

std::string SetText(IAAFTypeDef* type, IAAFPropertyValue* value) {
    const auto set = As<IAAFTypeDefSet>(type);
    host::Ref<IEnumAAFPropertyValues> enumerator;
    aafUInt32 count = 0;
    if (!set || set->GetCount(value, &count) < 0 || set->GetElements(value, enumerator.Out()) < 0) {
        return kUnreadable;
    }
    std::vector<std::string> elements;
    host::Ref<IAAFPropertyValue> element;
    while (elements.size() < kMostElements && enumerator->NextOne(element.Out()) >= 0) {
        elements.push_back(ValueText(element.get()));
    }
    return ElementsText(count, count <= kMostElements, elements);
}

std::string IndirectText(IAAFTypeDef* type, IAAFPropertyValue* value) {
    const auto indirect = As<IAAFTypeDefIndirect>(type);
    host::Ref<IAAFPropertyValue> actual;
    return indirect && indirect->GetActualValue(value, actual.Out()) >= 0 ? ValueText(actual.get())
                                                                          : kUnreadable;
}

std::string RenamedText(IAAFTypeDef* type, IAAFPropertyValue* value) {
    const auto rename = As<IAAFTypeDefRename>(type);
    host::Ref<IAAFPropertyValue> base;
    return rename && rename->GetBaseValue(value, base.Out()) >= 0 ? ValueText(base.get())
                                                                  : kUnreadable;
}

}  // namespace

std::string Utf8(std::wstring_view wide) {
    return encodings::ToUtf8Lossy(encodings::FromWide(wide));
}

std::string ToText(const aafUID_t& id) {
    return fmt::format("{{{:08X}-{:04X}-{:04X}-{:02X}{:02X}-{:02X}{:02X}{:02X}{:02X}{:02X}{:02X}}}",
                       id.Data1, id.Data2, id.Data3, id.Data4[0], id.Data4[1], id.Data4[2],
                       id.Data4[3], id.Data4[4], id.Data4[5], id.Data4[6], id.Data4[7]);
}

// SMPTE ST 330: 32 bytes in groups of four.
std::string ToText(const aafMobID_t& id) {
    std::vector<unsigned char> bytes(id.SMPTELabel, id.SMPTELabel + 12);
    bytes.insert(bytes.end(), {id.length, id.instanceHigh, id.instanceMid, id.instanceLow});
    const aafUID_t& m = id.material;
    for (const int shift : {24, 16, 8, 0}) {
        bytes.push_back(static_cast<unsigned char>(m.Data1 >> shift));
    }
    for (const unsigned part : {unsigned{m.Data2}, unsigned{m.Data3}}) {
        bytes.push_back(static_cast<unsigned char>(part >> 8));
        bytes.push_back(static_cast<unsigned char>(part));
    }
    bytes.insert(bytes.end(), m.Data4, m.Data4 + 8);
    std::string text = "urn:smpte:umid:";
    for (std::size_t i = 0; i < bytes.size(); ++i) {
        text += fmt::format("{}{:02x}", i > 0 && i % 4 == 0 ? "." : "", bytes[i]);
    }
    return text;
}

std::string ToText(const aafTimeStamp_t& time) {
    return fmt::format("{:04}-{:02}-{:02}T{:02}:{:02}:{:02}.{:02}Z", time.date.year,
                       unsigned{time.date.month}, unsigned{time.date.day}, unsigned{time.time.hour},
                       unsigned{time.time.minute}, unsigned{time.time.second},
                       unsigned{time.time.fraction});
}

std::string ValueText(IAAFPropertyValue* value) {
    using Reader = std::string (*)(IAAFTypeDef*, IAAFPropertyValue*);
    struct Row {
        eAAFTypeCategory_t category;
        Reader read;
    };
    static constexpr Row kReaders[] = {
        {kAAFTypeCatInt, IntegerText},
        {kAAFTypeCatRecord, RecordText},
        {kAAFTypeCatString, StringText},
        {kAAFTypeCatEnum, EnumText},
        {kAAFTypeCatExtEnum, ExtendibleEnumText},
        {kAAFTypeCatWeakObjRef, ReferenceText},
        {kAAFTypeCatVariableArray, VariableArrayText},
        {kAAFTypeCatFixedArray, FixedArrayText},
        {kAAFTypeCatSet, SetText},
        {kAAFTypeCatIndirect, IndirectText},
        {kAAFTypeCatRename, RenamedText},
    };
    host::Ref<IAAFTypeDef> type;
    eAAFTypeCategory_t category = kAAFTypeCatUnknown;
    if (!value || value->GetType(type.Out()) < 0 || type->GetTypeCategory(&category) < 0) {
        return kUnreadable;
    }
    for (const Row& row : kReaders) {
        if (row.category == category) {
            return row.read(type.get(), value);
        }
    }
    return kUnreadable;
}

}  // namespace cliphost
