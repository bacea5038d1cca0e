// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/cliphost/AafValue.h"

#include <fmt/format.h>

#include <algorithm>
#include <vector>

#include "host_interfaces/aaf/AAFDefinitions.h"
#include "host_interfaces/aaf/AAFMetaDefinitions.h"
#include "host_interfaces/aaf/AAFTypeDefinitions.h"
#include "host_interfaces/aaf/AAFTypeDefinitionsOfMany.h"
#include "host_interfaces/aaf/AAFTypeIds.h"
#include "text/Encodings.h"

namespace cliphost {

// What values of one type have in common. The type lives as long.
class ValueType {
public:
    ValueType(ValueReader& reader, host::Ref<IAAFTypeDef> type)
        : reader_(reader), type_(std::move(type)) {}
    virtual ~ValueType() = default;
    ValueType(const ValueType&) = delete;
    ValueType& operator=(const ValueType&) = delete;

    virtual std::string Text(IAAFPropertyValue* value) = 0;
    virtual bool TakeObjects(IAAFPropertyValue*, const std::function<void(IAAFObject*)>&) {
        return false;
    }

protected:
    IAAFTypeDef* type() const { return type_.get(); }
    ValueReader& reader() const { return reader_; }

private:
    ValueReader& reader_;
    host::Ref<IAAFTypeDef> type_;
};

namespace {

constexpr char kUnreadable[] = "?";
constexpr aafUInt32 kMostElements = 64;  // of an array shown on one line

// A type behind one of its own interfaces.
template <class Interface>
class TypeAs : public ValueType {
public:
    TypeAs(ValueReader& reader, host::Ref<IAAFTypeDef> type)
        : ValueType(reader, std::move(type)), as_(As<Interface>(this->type())) {}

    std::string Text(IAAFPropertyValue* value) final {
        return as_ ? TextOfValue(value) : kUnreadable;
    }

protected:
    virtual std::string TextOfValue(IAAFPropertyValue* value) = 0;
    Interface* as() const { return as_.get(); }

private:
    host::Ref<Interface> as_;
};

eAAFTypeCategory_t CategoryOf(IAAFTypeDef* type) {
    eAAFTypeCategory_t category = kAAFTypeCatUnknown;
    if (type) {
        type->GetTypeCategory(&category);
    }
    return category;
}

std::string NamedId(const std::string& name, const aafUID_t& id) {
    return name.empty() ? ToText(id) : name + ' ' + ToText(id);
}

class UnknownType final : public ValueType {
public:
    using ValueType::ValueType;
    std::string Text(IAAFPropertyValue*) override { return kUnreadable; }
};

class IntegerType final : public TypeAs<IAAFTypeDefInt> {
public:
    IntegerType(ValueReader& reader, host::Ref<IAAFTypeDef> type)
        : TypeAs(reader, std::move(type)) {
        isReadable_ = as() && as()->GetSize(&size_) >= 0 && as()->IsSigned(&isSigned_) >= 0 &&
                      size_ <= sizeof(aafInt64);
    }

    std::string TextOfValue(IAAFPropertyValue* value) override {
        unsigned char bytes[8] = {};
        if (!isReadable_ || as()->GetInteger(value, bytes, size_) < 0) {
            return kUnreadable;
        }
        aafUInt64 raw = 0;
        for (aafUInt32 i = size_; i-- > 0;) {
            raw = raw << 8 | bytes[i];
        }
        if (!isSigned_) {
            return std::to_string(raw);
        }
        const unsigned shift = 64 - 8 * size_;
        return std::to_string(static_cast<aafInt64>(raw << shift) >> shift);
    }

private:
    aafUInt32 size_ = 0;
    aafBoolean_t isSigned_ = kAAFFalse;
    bool isReadable_ = false;
};

// --- records ---------------------------------------------------------------------------------

// A record whose structure is published, read whole.
template <class Record>
std::string TextOfRecord(IAAFTypeDefRecord& type, IAAFPropertyValue* value) {
    Record record{};
    return type.GetStruct(value, reinterpret_cast<aafMemPtr_t>(&record), sizeof record) < 0
               ? kUnreadable
               : ToText(record);
}

struct PublishedRecord {
    const aafUID_t& id;
    std::string (*text)(IAAFTypeDefRecord&, IAAFPropertyValue*);
};
const PublishedRecord kPublishedRecords[] = {
    {kAAFTypeID_Rational, TextOfRecord<aafRational_t>},
    {kAAFTypeID_AUID, TextOfRecord<aafUID_t>},
    {kAAFTypeID_MobIDType, TextOfRecord<aafMobID_t>},
    {kAAFTypeID_TimeStamp, TextOfRecord<aafTimeStamp_t>},
    {kAAFTypeID_VersionType, TextOfRecord<aafVersionType_t>},
};

class RecordType final : public TypeAs<IAAFTypeDefRecord> {
public:
    RecordType(ValueReader& reader, host::Ref<IAAFTypeDef> type) : TypeAs(reader, std::move(type)) {
        aafUID_t id{};
        if (const auto meta = As<IAAFMetaDefinition>(this->type())) {
            meta->GetAUID(&id);
        }
        for (const PublishedRecord& record : kPublishedRecords) {
            published_ = record.id == id ? &record : published_;
        }
        aafUInt32 count = 0;
        if (as() && published_ == nullptr) {
            as()->GetCount(&count);
        }
        for (aafUInt32 i = 0; i < count; ++i) {
            members_.push_back(TextOf(as(), &IAAFTypeDefRecord::GetMemberNameBufLen,
                                      &IAAFTypeDefRecord::GetMemberName, i));
        }
    }

    std::string TextOfValue(IAAFPropertyValue* value) override {
        if (published_ != nullptr) {
            return published_->text(*as(), value);
        }
        std::string text;
        for (aafUInt32 i = 0; i < members_.size(); ++i) {
            host::Ref<IAAFPropertyValue> member;
            const bool isRead = as()->GetValue(value, i, member.Out()) >= 0;
            text += (i == 0 ? "" : ", ") + members_[i] + ' ' +
                    (isRead ? reader().Text(member.get()) : kUnreadable);
        }
        return text;
    }

private:
    const PublishedRecord* published_ = nullptr;
    std::vector<std::string> members_;
};

// --- texts and names -------------------------------------------------------------------------

class StringType final : public TypeAs<IAAFTypeDefString> {
public:
    using TypeAs::TypeAs;
    std::string TextOfValue(IAAFPropertyValue* value) override {
        aafUInt32 count = 0;
        if (as()->GetCount(value, &count) < 0 || count > 0x100000) {
            return kUnreadable;
        }
        WideBuffer wide(count);
        if (as()->GetElements(value, reinterpret_cast<aafMemPtr_t>(wide.data()),
                              static_cast<aafUInt32>(count * sizeof(wchar_t))) < 0) {
            return kUnreadable;
        }
        return '"' + Utf8(wide.data()) + '"';
    }
};

class EnumerationType final : public TypeAs<IAAFTypeDefEnum> {
public:
    using TypeAs::TypeAs;
    std::string TextOfValue(IAAFPropertyValue* value) override {
        aafInt64 number = 0;
        if (as()->GetIntegerValue(value, &number) < 0) {
            return kUnreadable;
        }
        const auto [text, isNew] = texts_.try_emplace(number);
        if (isNew) {
            const std::string name = TextOf(as(), &IAAFTypeDefEnum::GetNameBufLenFromInteger,
                                            &IAAFTypeDefEnum::GetNameFromInteger, number);
            text->second =
                name.empty() ? std::to_string(number) : name + " (" + std::to_string(number) + ')';
        }
        return text->second;
    }

private:
    std::unordered_map<aafInt64, std::string> texts_;
};

class ExtendibleEnumerationType final : public TypeAs<IAAFTypeDefExtEnum> {
public:
    using TypeAs::TypeAs;
    std::string TextOfValue(IAAFPropertyValue* value) override {
        aafUID_t id{};
        if (as()->GetAUIDValue(value, &id) < 0) {
            return kUnreadable;
        }
        return NamedId(TextOf<IAAFTypeDefExtEnum, aafUID_constref>(
                           as(), &IAAFTypeDefExtEnum::GetNameBufLenFromAUID,
                           &IAAFTypeDefExtEnum::GetNameFromAUID, id),
                       id);
    }
};

// The name of a definition.
std::string NameOf(IUnknown* target) {
    if (const auto definition = As<IAAFDefObject>(target)) {
        aafUID_t id{};
        definition->GetAUID(&id);
        return NamedId(
            TextOf(definition.get(), &IAAFDefObject::GetNameBufLen, &IAAFDefObject::GetName), id);
    }
    if (const auto meta = As<IAAFMetaDefinition>(target)) {
        return TextOf(meta.get(), &IAAFMetaDefinition::GetNameBufLen, &IAAFMetaDefinition::GetName);
    }
    return kUnreadable;
}

class WeakReferenceType final : public TypeAs<IAAFTypeDefObjectRef> {
public:
    using TypeAs::TypeAs;
    std::string TextOfValue(IAAFPropertyValue* value) override {
        host::Ref<IUnknown> target;
        if (as()->GetObject(value, IID_IUnknown, target.Out()) < 0 || !target) {
            return kUnreadable;
        }
        const auto [named, isNew] = names_.try_emplace(target.get());
        if (isNew) {
            named->second = {target, NameOf(target.get())};
        }
        return named->second.second;
    }

private:
    std::unordered_map<IUnknown*, std::pair<host::Ref<IUnknown>, std::string>> names_;
};

// --- several in one --------------------------------------------------------------------------

std::string ElementsText(aafUInt32 count, const std::vector<std::string>& elements) {
    std::string text = "[";
    for (const std::string& element : elements) {
        text += (text.size() > 1 ? ", " : "") + element;
    }
    return text + (count <= kMostElements ? "]" : fmt::format(", ... {} in all]", count));
}

template <class ArrayInterface>
class ArrayType : public TypeAs<ArrayInterface> {
public:
    using TypeAs<ArrayInterface>::TypeAs;

protected:
    std::string ArrayText(aafUInt32 count, IAAFPropertyValue* value) {
        std::vector<std::string> elements;
        for (aafUInt32 i = 0; i < count && i < kMostElements; ++i) {
            host::Ref<IAAFPropertyValue> element;
            elements.push_back(this->as()->GetElementValue(value, i, element.Out()) >= 0
                                   ? this->reader().Text(element.get())
                                   : kUnreadable);
        }
        return ElementsText(count, elements);
    }
};

class FixedArrayType final : public ArrayType<IAAFTypeDefFixedArray> {
public:
    using ArrayType::ArrayType;
    std::string TextOfValue(IAAFPropertyValue* value) override {
        aafUInt32 count = 0;
        return as()->GetCount(&count) >= 0 ? ArrayText(count, value) : kUnreadable;
    }
};

class VariableArrayType final : public ArrayType<IAAFTypeDefVariableArray> {
public:
    VariableArrayType(ValueReader& reader, host::Ref<IAAFTypeDef> type)
        : ArrayType(reader, std::move(type)) {
        host::Ref<IAAFTypeDef> element;
        ownsObjects_ = as() && as()->GetType(element.Out()) >= 0 &&
                       CategoryOf(element.get()) == kAAFTypeCatStrongObjRef;
    }
    std::string TextOfValue(IAAFPropertyValue* value) override {
        aafUInt32 count = 0;
        return as()->GetCount(value, &count) >= 0 ? ArrayText(count, value) : kUnreadable;
    }
    bool TakeObjects(IAAFPropertyValue* value,
                     const std::function<void(IAAFObject*)>& take) override {
        aafUInt32 count = 0;
        if (ownsObjects_) {
            as()->GetCount(value, &count);
        }
        for (aafUInt32 i = 0; i < count; ++i) {
            host::Ref<IAAFPropertyValue> element;
            if (as()->GetElementValue(value, i, element.Out()) >= 0) {
                reader().TakeObjects(element.get(), take);
            }
        }
        return ownsObjects_;
    }

private:
    bool ownsObjects_ = false;
};

class SetType final : public TypeAs<IAAFTypeDefSet> {
public:
    SetType(ValueReader& reader, host::Ref<IAAFTypeDef> type) : TypeAs(reader, std::move(type)) {
        host::Ref<IAAFTypeDef> element;
        ownsObjects_ = as() && as()->GetElementType(element.Out()) >= 0 &&
                       CategoryOf(element.get()) == kAAFTypeCatStrongObjRef;
    }
    std::string TextOfValue(IAAFPropertyValue* value) override {
        host::Ref<IEnumAAFPropertyValues> enumerator;
        aafUInt32 count = 0;
        if (as()->GetCount(value, &count) < 0 || as()->GetElements(value, enumerator.Out()) < 0) {
            return kUnreadable;
        }
        std::vector<std::string> elements;
        host::Ref<IAAFPropertyValue> element;
        while (elements.size() < kMostElements && enumerator->NextOne(element.Out()) >= 0) {
            elements.push_back(reader().Text(element.get()));
        }
        return ElementsText(count, elements);
    }
    bool TakeObjects(IAAFPropertyValue* value,
                     const std::function<void(IAAFObject*)>& take) override {
        host::Ref<IEnumAAFPropertyValues> elements;
        if (!ownsObjects_ || as()->GetElements(value, elements.Out()) < 0) {
            return false;
        }
        host::Ref<IAAFPropertyValue> element;
        while (elements->NextOne(element.Out()) >= 0) {
            reader().TakeObjects(element.get(), take);
        }
        return true;
    }

private:
    bool ownsObjects_ = false;
};

class StrongReferenceType final : public TypeAs<IAAFTypeDefObjectRef> {
public:
    using TypeAs::TypeAs;
    std::string TextOfValue(IAAFPropertyValue*) override { return kUnreadable; }
    bool TakeObjects(IAAFPropertyValue* value,
                     const std::function<void(IAAFObject*)>& take) override {
        host::Ref<IUnknown> target;
        if (as()) {
            as()->GetObject(value, IID_IUnknown, target.Out());
        }
        if (const auto object = As<IAAFObject>(target.get())) {
            take(object.get());
        }
        return true;
    }
};

// --- values of another type ------------------------------------------------------------------

class IndirectType final : public TypeAs<IAAFTypeDefIndirect> {
public:
    using TypeAs::TypeAs;
    std::string TextOfValue(IAAFPropertyValue* value) override {
        host::Ref<IAAFPropertyValue> actual;
        return as()->GetActualValue(value, actual.Out()) >= 0 ? reader().Text(actual.get())
                                                              : kUnreadable;
    }
};

class RenamedType final : public TypeAs<IAAFTypeDefRename> {
public:
    using TypeAs::TypeAs;
    std::string TextOfValue(IAAFPropertyValue* value) override {
        host::Ref<IAAFPropertyValue> base;
        return as()->GetBaseValue(value, base.Out()) >= 0 ? reader().Text(base.get()) : kUnreadable;
    }
};

template <class Type>
std::unique_ptr<ValueType> MakeType(ValueReader& reader, const host::Ref<IAAFTypeDef>& type) {
    return std::make_unique<Type>(reader, type);
}

struct TypeRow {
    eAAFTypeCategory_t category;
    std::unique_ptr<ValueType> (*make)(ValueReader&, const host::Ref<IAAFTypeDef>&);
};
constexpr TypeRow kTypes[] = {
    {kAAFTypeCatInt, MakeType<IntegerType>},
    {kAAFTypeCatRecord, MakeType<RecordType>},
    {kAAFTypeCatString, MakeType<StringType>},
    {kAAFTypeCatEnum, MakeType<EnumerationType>},
    {kAAFTypeCatExtEnum, MakeType<ExtendibleEnumerationType>},
    {kAAFTypeCatWeakObjRef, MakeType<WeakReferenceType>},
    {kAAFTypeCatStrongObjRef, MakeType<StrongReferenceType>},
    {kAAFTypeCatVariableArray, MakeType<VariableArrayType>},
    {kAAFTypeCatFixedArray, MakeType<FixedArrayType>},
    {kAAFTypeCatSet, MakeType<SetType>},
    {kAAFTypeCatIndirect, MakeType<IndirectType>},
    {kAAFTypeCatRename, MakeType<RenamedType>},
};

std::unique_ptr<ValueType> MakeType(ValueReader& reader, const host::Ref<IAAFTypeDef>& type) {
    const eAAFTypeCategory_t category = CategoryOf(type.get());
    for (const TypeRow& row : kTypes) {
        if (row.category == category) {
            return row.make(reader, type);
        }
    }
    return std::make_unique<UnknownType>(reader, type);
}

}  // namespace

std::string Utf8(std::wstring_view wide) {
    if (std::all_of(wide.begin(), wide.end(), [](wchar_t c) { return (c & ~0x7F) == 0; })) {
        std::string text(wide.size(), '\0');
        std::transform(wide.begin(), wide.end(), text.begin(),
                       [](wchar_t c) { return static_cast<char>(c); });
        return text;
    }
    return encodings::ToUtf8Lossy(encodings::FromWide(wide));
}

namespace {

constexpr char kUpper[] = "0123456789ABCDEF";
constexpr char kLower[] = "0123456789abcdef";

// Two digits for each of the bytes, which are what the numbers end in.
void AppendHex(const char* digits, std::initializer_list<unsigned> bytes, std::string& text) {
    for (const unsigned byte : bytes) {
        text += digits[byte >> 4 & 15];
        text += digits[byte & 15];
    }
}

}  // namespace

std::string ToText(const aafUID_t& id) {
    const unsigned char* const node = id.Data4;
    std::string text = "{";
    AppendHex(kUpper, {id.Data1 >> 24, id.Data1 >> 16, id.Data1 >> 8, id.Data1}, text);
    text += '-';
    AppendHex(kUpper, {unsigned{id.Data2} >> 8, id.Data2}, text);
    text += '-';
    AppendHex(kUpper, {unsigned{id.Data3} >> 8, id.Data3}, text);
    text += '-';
    AppendHex(kUpper, {node[0], node[1]}, text);
    text += '-';
    AppendHex(kUpper, {node[2], node[3], node[4], node[5], node[6], node[7]}, text);
    return text + '}';
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
        if (i > 0 && i % 4 == 0) {
            text += '.';
        }
        AppendHex(kLower, {bytes[i]}, text);
    }
    return text;
}

std::string ToText(const aafTimeStamp_t& time) {
    return fmt::format("{:04}-{:02}-{:02}T{:02}:{:02}:{:02}.{:02}Z", time.date.year,
                       unsigned{time.date.month}, unsigned{time.date.day}, unsigned{time.time.hour},
                       unsigned{time.time.minute}, unsigned{time.time.second},
                       unsigned{time.time.fraction});
}

std::string ToText(const aafRational_t& rational) {
    return std::to_string(rational.numerator) + '/' + std::to_string(rational.denominator);
}

std::string ToText(const aafVersionType_t& version) {
    return fmt::format("{}.{}", static_cast<int>(version.major), static_cast<int>(version.minor));
}

ValueReader::ValueReader() = default;
ValueReader::~ValueReader() = default;

ValueType* ValueReader::TypeOf(IAAFPropertyValue* value) {
    host::Ref<IAAFTypeDef> type;
    if (!value || value->GetType(type.Out()) < 0 || !type) {
        return nullptr;
    }
    std::unique_ptr<ValueType>& known = types_[type.get()];
    if (!known) {
        known = MakeType(*this, type);
    }
    return known.get();
}

namespace {

// A library gives a property that is no value of its type as bytes of no defined type.
bool IsRaw(IAAFPropertyValue* value) {
    aafBoolean_t isDefined = kAAFTrue;
    return value != nullptr && value->IsDefinedType(&isDefined) >= 0 && isDefined == kAAFFalse;
}

std::string RawText(IAAFPropertyValue* value) {
    host::Ref<IAAFTypeDef> type;
    value->GetType(type.Out());
    const auto array = As<IAAFTypeDefVariableArray>(type.get());
    aafUInt32 count = 0;
    if (!array || array->GetCount(value, &count) < 0) {
        return kUnreadable;
    }
    std::vector<aafUInt8> bytes(std::max<aafUInt32>(count, 1));
    if (array->GetCArray(value, bytes.data(), count) < 0) {
        return kUnreadable;
    }
    std::string text = "raw bytes";
    for (aafUInt32 i = 0; i < count && i < kMostElements; ++i) {
        text += ' ';
        AppendHex(kLower, {bytes[i]}, text);
    }
    return count <= kMostElements ? text : text + fmt::format(" ... {} in all", count);
}

}  // namespace

std::string ValueReader::Text(IAAFPropertyValue* value) {
    if (IsRaw(value)) {
        return RawText(value);
    }
    ValueType* const type = TypeOf(value);
    return type == nullptr ? kUnreadable : type->Text(value);
}

bool ValueReader::TakeObjects(IAAFPropertyValue* value,
                              const std::function<void(IAAFObject*)>& take) {
    ValueType* const type = TypeOf(value);
    return type != nullptr && type->TakeObjects(value, take);
}

}  // namespace cliphost
