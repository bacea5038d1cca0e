// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/cliphost/AafValue.h"

#include <fmt/format.h>

#include <algorithm>
#include <cstdlib>
#include <vector>

#include "host_interfaces/aaf/AAFDefinitions.h"
#include "host_interfaces/aaf/AAFMetaDefinitions.h"
#include "host_interfaces/aaf/AAFTypeDefinitions.h"
#include "host_interfaces/aaf/AAFTypeDefinitionsOfMany.h"
#include "host_interfaces/aaf/AAFTypeIds.h"
#include "reference_host/cliphost/Digest.h"
#include "text/Encodings.h"

namespace cliphost {

namespace {

constexpr aafUInt32 kMostElements = 64;         // of an array shown on one line
constexpr std::size_t kMostOfStream = 0x10000;  // that is read at once
constexpr std::size_t kMostOfRest = 0x10000;    // that is kept before it is digested

// A digest of texts that come one after the other.
class Rest {
public:
    void Add(std::string_view text) {
        bytes_ += text;
        bytes_ += '\0';
        if (bytes_.size() > kMostOfRest) {
            bytes_ = TextOf(DigestOf(bytes_));
        }
    }
    std::string Text() const { return TextOf(DigestOf(bytes_)); }

private:
    std::string bytes_;
};

// A type behind one of its own interfaces. The type lives as long.
template <class Interface>
class TypeAs : public ValueType {
public:
    TypeAs(ValueReader& reader, host::Ref<IAAFTypeDef> type)
        : reader_(reader), type_(std::move(type)), as_(As<Interface>(type_.get())) {}

    std::string Text(IAAFPropertyValue* value) final {
        return as_ ? TextOfValue(value) : kUnreadable;
    }

protected:
    virtual std::string TextOfValue(IAAFPropertyValue* value) = 0;
    Interface* as() const { return as_.get(); }
    IAAFTypeDef* type() const { return type_.get(); }
    std::string TextOfOther(IAAFPropertyValue* value) { return reader_.TypeOf(value).Text(value); }
    ValueReader& reader() const { return reader_; }

private:
    ValueReader& reader_;
    host::Ref<IAAFTypeDef> type_;
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
    UnknownType(ValueReader&, host::Ref<IAAFTypeDef> type) : type_(std::move(type)) {}
    std::string Text(IAAFPropertyValue*) override { return kUnreadable; }

private:
    host::Ref<IAAFTypeDef> type_;
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
                    (isRead ? TextOfOther(member.get()) : kUnreadable);
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
        std::string text = "\"";
        text += Utf8(wide.data());
        text += '"';
        return text;
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

// The elements of a value on one line, as they come.
class ElementsText {
public:
    explicit ElementsText(const ValueReader& reader) : digestsRest_(reader.DigestsLongValues()) {}

    bool TakesMore() const { return count_ < kMostElements || digestsRest_; }
    void Add(const std::string& element) {
        if (count_++ < kMostElements) {
            text_ += (text_.size() > 1 ? ", " : "") + element;
        } else {
            rest_.Add(element);
        }
    }
    std::string Text(aafUInt32 count) const {
        if (count <= kMostElements) {
            return text_ + "]";
        }
        return text_ + fmt::format(", ... {} in all{}]", count,
                                   digestsRest_ ? ", the rest has digest " + rest_.Text() : "");
    }

private:
    bool digestsRest_;
    aafUInt32 count_ = 0;
    std::string text_ = "[";
    Rest rest_;
};

template <class ArrayInterface>
class ArrayType : public TypeAs<ArrayInterface> {
public:
    using TypeAs<ArrayInterface>::TypeAs;

protected:
    std::string ArrayText(aafUInt32 count, IAAFPropertyValue* value) {
        ElementsText elements(this->reader());
        for (aafUInt32 i = 0; i < count && elements.TakesMore(); ++i) {
            host::Ref<IAAFPropertyValue> element;
            elements.Add(this->as()->GetElementValue(value, i, element.Out()) >= 0
                             ? this->TextOfOther(element.get())
                             : kUnreadable);
        }
        return elements.Text(count);
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
                reader().TypeOf(element.get()).TakeObjects(element.get(), take);
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
        ElementsText elements(reader());
        host::Ref<IAAFPropertyValue> element;
        while (elements.TakesMore() && enumerator->NextOne(element.Out()) >= 0) {
            elements.Add(TextOfOther(element.get()));
        }
        return elements.Text(count);
    }
    bool TakeObjects(IAAFPropertyValue* value,
                     const std::function<void(IAAFObject*)>& take) override {
        host::Ref<IEnumAAFPropertyValues> elements;
        if (!ownsObjects_ || as()->GetElements(value, elements.Out()) < 0) {
            return false;
        }
        host::Ref<IAAFPropertyValue> element;
        while (elements->NextOne(element.Out()) >= 0) {
            reader().TypeOf(element.get()).TakeObjects(element.get(), take);
        }
        return true;
    }

    bool IsSet() const override { return true; }

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
        return as()->GetActualValue(value, actual.Out()) >= 0 ? TextOfOther(actual.get())
                                                              : kUnreadable;
    }
};

class RenamedType final : public TypeAs<IAAFTypeDefRename> {
public:
    using TypeAs::TypeAs;
    std::string TextOfValue(IAAFPropertyValue* value) override {
        host::Ref<IAAFPropertyValue> base;
        return as()->GetBaseValue(value, base.Out()) >= 0 ? TextOfOther(base.get()) : kUnreadable;
    }
};

// --- bytes of any length ---------------------------------------------------------------------

class StreamType final : public TypeAs<IAAFTypeDefStream> {
public:
    using TypeAs::TypeAs;
    std::string TextOfValue(IAAFPropertyValue* value) override {
        aafInt64 size = 0;
        if (as()->GetSize(value, &size) < 0) {
            return kUnreadable;
        }
        const std::string text = fmt::format("{} bytes", size);
        return reader().DigestsLongValues() ? WithDigest(value, size, text) : text;
    }

private:
    std::string WithDigest(IAAFPropertyValue* value, aafInt64 left, const std::string& text) {
        std::vector<aafUInt8> bytes(kMostOfStream);
        Rest rest;
        as()->SetPosition(value, 0);
        while (left > 0) {
            aafUInt32 read = 0;
            if (as()->Read(value, kMostOfStream, bytes.data(), &read) < 0 || read == 0 ||
                read > kMostOfStream) {
                return kUnreadable;
            }
            rest.Add({reinterpret_cast<const char*>(bytes.data()), read});
            left -= read;
        }
        return text + ", digest " + rest.Text();
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
    {kAAFTypeCatStream, MakeType<StreamType>},
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
    std::string text(wide.size(), '\0');
    bool isAscii = true;
    for (std::size_t i = 0; i < wide.size(); ++i) {
        text[i] = static_cast<char>(wide[i]);
        isAscii = isAscii && (wide[i] & ~0x7F) == 0;
    }
    if (!isAscii) {
        return encodings::ToUtf8Lossy(encodings::FromWide(wide));
    }
    return text;
}

namespace {

constexpr char kUpper[] = "0123456789ABCDEF";
constexpr char kLower[] = "0123456789abcdef";

// Two digits for each of the bytes, which are what the numbers end in.
char* PutHex(const char* digits, std::initializer_list<unsigned> bytes, char* to) {
    for (const unsigned byte : bytes) {
        *to++ = digits[byte >> 4 & 15];
        *to++ = digits[byte & 15];
    }
    return to;
}

// So many characters at least, of which a sign is the first.
void AppendDecimal(int number, std::size_t characters, std::string& text) {
    const std::string digits = std::to_string(std::abs(number));
    const std::size_t used = digits.size() + (number < 0);
    text.append(number < 0, '-');
    text.append(characters - std::min(characters, used), '0');
    text += digits;
}

}  // namespace

std::string ToText(const aafUID_t& id) {
    const unsigned char* const node = id.Data4;
    std::string text = "{00000000-0000-0000-0000-000000000000}";
    PutHex(kUpper, {id.Data1 >> 24, id.Data1 >> 16, id.Data1 >> 8, id.Data1}, &text[1]);
    PutHex(kUpper, {unsigned{id.Data2} >> 8, id.Data2}, &text[10]);
    PutHex(kUpper, {unsigned{id.Data3} >> 8, id.Data3}, &text[15]);
    PutHex(kUpper, {node[0], node[1]}, &text[20]);
    PutHex(kUpper, {node[2], node[3], node[4], node[5], node[6], node[7]}, &text[25]);
    return text;
}

// SMPTE ST 330: 32 bytes in groups of four.
std::string ToText(const aafMobID_t& id) {
    const unsigned char* const label = id.SMPTELabel;
    const aafUID_t& m = id.material;
    const unsigned char* const node = m.Data4;
    const unsigned groups[8][4] = {
        {label[0], label[1], label[2], label[3]},
        {label[4], label[5], label[6], label[7]},
        {label[8], label[9], label[10], label[11]},
        {id.length, id.instanceHigh, id.instanceMid, id.instanceLow},
        {m.Data1 >> 24, m.Data1 >> 16, m.Data1 >> 8, m.Data1},
        {unsigned{m.Data2} >> 8, m.Data2, unsigned{m.Data3} >> 8, m.Data3},
        {node[0], node[1], node[2], node[3]},
        {node[4], node[5], node[6], node[7]},
    };
    constexpr std::string_view kStart = "urn:smpte:umid:";
    std::string text(kStart.size() + 8 * 9 - 1, '.');
    char* to = &text[kStart.copy(&text[0], kStart.size())];
    for (const auto& group : groups) {
        to = PutHex(kLower, {group[0], group[1], group[2], group[3]}, to) + 1;
    }
    return text;
}

std::string ToText(const aafTimeStamp_t& time) {
    struct Part {
        int number;
        std::size_t characters;
        char after;
    };
    std::string text;
    for (const Part& part :
         {Part{time.date.year, 4, '-'}, Part{time.date.month, 2, '-'}, Part{time.date.day, 2, 'T'},
          Part{time.time.hour, 2, ':'}, Part{time.time.minute, 2, ':'},
          Part{time.time.second, 2, '.'}, Part{time.time.fraction, 2, 'Z'}}) {
        AppendDecimal(part.number, part.characters, text);
        text += part.after;
    }
    return text;
}

std::string ToText(const aafRational_t& rational) {
    return std::to_string(rational.numerator) + '/' + std::to_string(rational.denominator);
}

std::string ToText(const aafVersionType_t& version) {
    return std::to_string(version.major) + '.' + std::to_string(version.minor);
}

namespace {

// A library gives what is no value of its property as bytes of no defined type.
bool IsRaw(IAAFPropertyValue* value) {
    aafBoolean_t isDefined = kAAFTrue;
    return value != nullptr && value->IsDefinedType(&isDefined) >= 0 && isDefined == kAAFFalse;
}

class RawType final : public ValueType {
public:
    explicit RawType(const ValueReader& reader) : digestsRest_(reader.DigestsLongValues()) {}

    std::string Text(IAAFPropertyValue* value) override {
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
            text += fmt::format(" {:02x}", bytes[i]);
        }
        if (count <= kMostElements) {
            return text;
        }
        text += fmt::format(" ... {} in all", count);
        return digestsRest_ ? text + ", digest " + DigestText(bytes) : text;
    }

private:
    static std::string DigestText(const std::vector<aafUInt8>& bytes) {
        return TextOf(DigestOf({reinterpret_cast<const char*>(bytes.data()), bytes.size()}));
    }

    bool digestsRest_;
};

}  // namespace

ValueReader::ValueReader(LongValues longValues) : longValues_(longValues) {}
ValueReader::~ValueReader() = default;

ValueType& ValueReader::TypeOf(IAAFPropertyValue* value) {
    if (IsRaw(value)) {
        if (!raw_) {
            raw_ = std::make_unique<RawType>(*this);
        }
        return *raw_;
    }
    host::Ref<IAAFTypeDef> type;
    if (!value || value->GetType(type.Out()) < 0) {
        type.Reset();
    }
    std::unique_ptr<ValueType>& known = types_[type.get()];
    if (!known) {
        known = MakeType(*this, type);
    }
    return *known;
}

}  // namespace cliphost
