// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <algorithm>
#include <memory>
#include <vector>

#include "aaf_library/model/BuiltIn.h"
#include "aaf_library/model/MetaDefinition.h"
#include "aaf_library/model/PropertyValue.h"
#include "not_implemented/AAFTypeDefinitions.h"

namespace aaf {

class ClassDefinition;

// What a value of a type holds; see PropertyValue.
enum class ValueForm {
    Data,
    Stream,
    StrongReference,
    StrongVector,
    StrongSet,
    WeakReference,
    WeakVector,
    WeakSet,
};

// A named part of a type.
struct TypeMember {
    std::wstring name;
    GUID id{};  // record: type of the member; extendible enumeration: value; weak reference:
                // property on the path from the root to the set of targets
    aafInt64 value = 0;  // enumeration: value

    bool operator==(const TypeMember& other) const {
        return name == other.name && id == other.id && value == other.value;
    }
};

// The parts of a type in order. Copies share them until one is added to: those of a built-in type
// are the same in all models.
class TypeMembers {
public:
    TypeMembers() = default;
    TypeMembers(std::vector<TypeMember> members)
        : members_(std::make_shared<std::vector<TypeMember>>(std::move(members))) {}

    bool empty() const { return size() == 0; }
    std::size_t size() const { return members_ ? members_->size() : 0; }
    const TypeMember& operator[](std::size_t index) const { return (*members_)[index]; }
    const TypeMember* begin() const { return members_ ? members_->data() : nullptr; }
    const TypeMember* end() const { return begin() + size(); }
    void push_back(TypeMember member) {
        std::vector<TypeMember> longer(begin(), end());
        longer.push_back(std::move(member));
        *this = std::move(longer);
    }
    bool operator==(const TypeMembers& other) const {
        return members_ == other.members_ || std::equal(begin(), end(), other.begin(), other.end());
    }

private:
    std::shared_ptr<const std::vector<TypeMember>> members_;
};

// A type of values. It knows two layouts of each value: the native one of the C
// structures and wide characters that callers pass, and the stored one, packed
// and little-endian, that property values keep.
class TypeDefinition : public Implements<MetaDefinition, IAAFTypeDef> {
public:
    explicit TypeDefinition(TypeKind kind) : kind_(kind) {}

    TypeKind kind() const { return kind_; }
    virtual ValueForm form() const { return ValueForm::Data; }
    // Element, renamed or character type; null for the other kinds.
    virtual TypeDefinition* element() const { return nullptr; }
    // This type, or what it renames.
    const TypeDefinition& Resolved() const;

    // Sizes of one value; 0 when they vary.
    virtual std::size_t StoredSize() const { return 0; }
    virtual std::size_t NativeSize() const { return 0; }
    // Whether both layouts are the same bytes, whatever a caller registers.
    virtual bool IsStoredAsNative() const { return false; }
    // One value of a fixed size.
    virtual void AppendStored(const std::uint8_t* native, Bytes& out) const;
    virtual void CopyNative(const std::uint8_t* stored, std::uint8_t* native) const;

    // A whole value of any size. Bytes that do not fit the type: AAFRESULT_BAD_SIZE.
    virtual HRESULT Encode(const void* native, std::size_t bytes, Bytes& out) const;
    virtual std::size_t DecodedSize(const std::uint8_t* stored, std::size_t size) const;
    virtual HRESULT Decode(const std::uint8_t* stored, std::size_t size, void* native,
                           std::size_t bytes) const;

    // What a value starts with: zeros of the stored size, or nothing.
    Bytes EmptyBytes() const;
    // A free value of this type.
    RefPtr<PropertyValue> NewValue();

    // -- IAAFTypeDef
    HRESULT GetTypeCategory(eAAFTypeCategory_t* tid) override;
    HRESULT RawAccessType(IAAFTypeDef** rawTypeDef) override;

protected:
    // The value behind an argument of one of this type's operations. Null argument: NULL_PARAM;
    // not initialised: NOT_INITIALIZED; a value of another kind or library: BAD_TYPE.
    HRESULT Take(IAAFPropertyValue* argument, PropertyValue** value) const;
    // Gives a new value with that stored content.
    HRESULT GiveValue(TypeDefinition& type, Bytes stored, IAAFPropertyValue** out) const;

private:
    TypeKind kind_;
};

// The type behind an argument, when it is of this model; else null.
TypeDefinition* TypeOf(IAAFTypeDef* argument, const Model* model);

}  // namespace aaf
