// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <string>
#include <vector>

#include "aaf_library/model/PropertyKeys.h"
#include "aaf_library/model/PropertyValue.h"
#include "aaf_library/model/Unknown.h"
#include "aaf_library/model/ValueList.h"
#include "host_interfaces/aaf/AAFObjects.h"
#include "not_implemented/AAFObjects.h"

namespace aaf {

class ClassDefinition;
class PropertyDefinition;

// How a class of the object model is written
// ------------------------------------------
// An object is its class definition and its property values; a domain class adds
// operations that read and write those values, and no data of its own unless it
// is not stored:
//
//     class Filler : public Implements<Segment, IAAFFiller> {
//     public:
//         HRESULT Initialize(IAAFDataDef* dataDef, aafLength_t length) override {
//             if (length < 0) return AAFRESULT_BAD_LENGTH;
//             if (HRESULT result = PutWeak(prop::Component_DataDefinition, dataDef); result < 0) {
//                 return result;
//             }
//             return PutInteger(prop::Component_Length, length);
//         }
//     };
//
// - Implements<Base, Interfaces...> gives QueryInterface, AddRef and Release, and a body that
//   answers not implemented for each operation that the class leaves out. One override serves all
//   interfaces of that class which have an operation of that name and arguments. An interface added
//   by a subclass has slots of its own: where it repeats an operation of the base class, override
//   it there again and forward (Base::Operation(...)).
// - The constructor takes nothing. SetDefaults gives a new object its first values; call the base's
//   first. It does not run for objects read from a file.
// - Add { AUID_AAFFiller, &CreateAs<Filler> } to the room's table for ClassRegistry. A class
// without
//   a C++ class of its own is made with that of its nearest ancestor.
// - The Put and Read operations check their pointers (AAFRESULT_NULL_PARAM) and answer
//   AAFRESULT_PROP_NOT_PRESENT for absent values, so most operations are one line. Sizes and
//   encodings come from the property's type: PutInteger serves integers, enumerations and booleans
//   of every size; PutNative takes C structures and arrays in their published layout.
// - Make other objects with model()->NewObject<Class>(classId); it comes back in a RefPtr. Find the
//   object behind an argument with ImplementationAs<Class>(pointer), null if foreign or other.
// - Contained objects: PutObject, AppendObject and the rest attach them, and refuse an object that
//   has an owner (AAFRESULT_OBJECT_ALREADY_ATTACHED); taking them out frees them.
// - MakeEnumerator in Enumerator.h gives enumerators over a property's live list.
class Object : public Implements<Unknown, IAAFObject> {
public:
    Object() = default;

    // -- What the object is and where it stands.
    ClassDefinition& classDefinition() const { return *class_; }
    const GUID& classId() const;
    bool IsKindOf(const GUID& classId) const;
    Object* AsObject() override { return this; }
    Object* owner() const { return owner_; }
    // The nearest owner that is a T, or null: FindOwner<ContentStorage>().
    template <class T>
    T* FindOwner() const {
        for (Object* at = owner_; at != nullptr; at = at->owner_) {
            if (T* found = dynamic_cast<T*>(at)) {
                return found;
            }
        }
        return nullptr;
    }
    // By the model, once.
    void SetClass(ClassDefinition& definition) { class_ = &definition; }
    virtual void SetDefaults() {}
    // True for the one object that the model itself keeps, whoever contains it.
    virtual bool BelongsToModel() const { return false; }

    // -- Values as they stand, ordered by number.
    const ValueList& values() const {
        Complete();
        return values_;
    }
    // The same, without those that come into being when they are wanted.
    const ValueList& MadeValues() const { return values_; }
    PropertyValue* FindValue(const PropertyKey& key) const;
    bool IsPresent(const PropertyKey& key) const { return FindValue(key) != nullptr; }
    // Drops a value; absent: AAFRESULT_PROP_NOT_PRESENT.
    HRESULT RemoveValue(const PropertyKey& key);
    // The value, made empty when absent. Null when the class has no such property.
    PropertyValue* RequireValue(const PropertyKey& key);
    // The value with these bytes; null as above.
    PropertyValue* PutBytes(const PropertyKey& key, Bytes bytes);
    // Sets or replaces a value object; the owner of what it contains becomes this object.
    HRESULT PutValue(PropertyId pid, PropertyValue* value);
    // Told when a value of this object comes, goes or is about to change. An object that joins a
    // list at its end is not told.
    virtual void OnValueChange(const PropertyValue&) {}

    // -- Plain values.
    HRESULT PutInteger(const PropertyKey& key, aafInt64 value);
    HRESULT PutBoolean(const PropertyKey& key, aafBoolean_t value) {
        return IsBoolean(value) ? PutInteger(key, value) : AAFRESULT_INVALID_ENUM_VALUE;
    }
    template <class Integer>
    HRESULT ReadInteger(const PropertyKey& key, Integer* out) const;
    // The value, or `absent` when it is not there.
    aafInt64 IntegerOr(const PropertyKey& key, aafInt64 absent) const;
    HRESULT PutString(const PropertyKey& key, aafCharacter_constptr text);
    HRESULT ReadString(const PropertyKey& key, aafCharacter* buffer, aafUInt32 bufferBytes) const;
    HRESULT ReadStringLength(const PropertyKey& key, aafUInt32* bytes) const;
    std::wstring StringOr(const PropertyKey& key, const wchar_t* absent) const;
    // Structures (rationals, ids, time stamps ...), fixed and variable arrays of plain values.
    HRESULT PutNative(const PropertyKey& key, const void* data, std::size_t bytes);
    HRESULT ReadNative(const PropertyKey& key, void* data, std::size_t bytes) const;
    HRESULT ReadNativeSize(const PropertyKey& key, aafUInt32* bytes) const;
    template <class Struct>
    HRESULT PutStruct(const PropertyKey& key, const Struct& value) {
        return PutNative(key, &value, sizeof value);
    }
    template <class Struct>
    HRESULT ReadStruct(const PropertyKey& key, Struct* out) const {
        return ReadNative(key, out, sizeof *out);
    }
    // Values that carry their type: tagged values and parameters.
    HRESULT PutIndirect(const PropertyKey& key, IAAFTypeDef* type, const void* data,
                        std::size_t bytes);
    // Another value of the type that is there.
    HRESULT ReplaceIndirect(const PropertyKey& key, const void* data, std::size_t bytes);
    HRESULT ReadIndirect(const PropertyKey& key, void* data, std::size_t bytes) const;
    HRESULT ReadIndirectSize(const PropertyKey& key, aafUInt32* bytes) const;
    HRESULT ReadIndirectType(const PropertyKey& key, IAAFTypeDef** type) const;

    // -- One contained object.
    HRESULT PutObject(const PropertyKey& key, IUnknown* object);
    Object* ObjectAt(const PropertyKey& key) const;
    template <class I>
    HRESULT ReadObject(const PropertyKey& key, I** out) const {
        if (out == nullptr) {
            return AAFRESULT_NULL_PARAM;
        }
        Object* object = ObjectAt(key);
        return object == nullptr ? AAFRESULT_PROP_NOT_PRESENT : GiveOut(object, out);
    }

    // -- Vectors of contained objects.
    aafUInt32 CountObjects(const PropertyKey& key) const;
    Object* ObjectAt(const PropertyKey& key, std::size_t index) const;
    HRESULT ReadCount(const PropertyKey& key, aafUInt32* count) const;
    template <class I>
    HRESULT ReadObjectAt(const PropertyKey& key, std::size_t index, I** out) const {
        if (out == nullptr) {
            return AAFRESULT_NULL_PARAM;
        }
        Object* object = ObjectAt(key, index);
        return object == nullptr ? AAFRESULT_BADINDEX : GiveOut(object, out);
    }
    HRESULT AppendObject(const PropertyKey& key, IUnknown* object);
    HRESULT PrependObject(const PropertyKey& key, IUnknown* object);
    HRESULT InsertObjectAt(const PropertyKey& key, std::size_t index, IUnknown* object);
    HRESULT RemoveObjectAt(const PropertyKey& key, std::size_t index);
    // AAFRESULT_OBJECT_NOT_FOUND when it is not in the list.
    HRESULT RemoveObject(const PropertyKey& key, IUnknown* object);

    // -- Sets of contained objects, ordered by the bytes of their key (mob id, definition id).
    // A key that is there already: AAFRESULT_OBJECT_ALREADY_ATTACHED.
    HRESULT AddToSet(const PropertyKey& key, IUnknown* object);
    Object* FindInSet(const PropertyKey& key, const void* keyBytes, std::size_t size) const;
    // Call after the key of an element has changed.
    void SortSet(const PropertyKey& key);
    // The bytes of this object's own key property; empty when it has none.
    Bytes UniqueKey() const;

    // -- Weak references to definitions: kept as the target's id, resolved by the model.
    // Not in a dictionary: AAFRESULT_OBJECT_NOT_ATTACHED; id not in this model:
    // AAFRESULT_INVALID_OBJ.
    HRESULT PutWeak(const PropertyKey& key, IUnknown* target);
    Unknown* WeakTarget(const PropertyKey& key) const { return WeakTargetAt(key, 0); }
    template <class I>
    HRESULT ReadWeak(const PropertyKey& key, I** out) const {
        if (out == nullptr) {
            return AAFRESULT_NULL_PARAM;
        }
        if (!IsPresent(key)) {
            return AAFRESULT_PROP_NOT_PRESENT;
        }
        Unknown* target = WeakTarget(key);
        return target == nullptr ? AAFRESULT_OBJECT_NOT_FOUND : GiveOut(target, out);
    }
    HRESULT AppendWeak(const PropertyKey& key, IUnknown* target);
    // That of a reference in a list; null behind the last, and where the model doesn't have it.
    Unknown* WeakTargetAt(const PropertyKey& key, std::size_t index) const;

    // -- IAAFObject
    HRESULT GetGeneration(IAAFIdentification** generation) override;
    HRESULT GetGenerationAUID(aafUID_t* result) override;
    HRESULT GetDefinition(IAAFClassDef** classDef) override;
    HRESULT GetProperties(IEnumAAFProperties** enumerator) override;
    HRESULT CountProperties(aafUInt32* count) override;
    HRESULT GetPropertyValue(IAAFPropertyDef* propDef, IAAFPropertyValue** propVal) override;
    HRESULT SetPropertyValue(IAAFPropertyDef* propDef, IAAFPropertyValue* propVal) override;
    HRESULT IsPropertyPresent(IAAFPropertyDef* propDef, aafBoolean_t* result) override;
    HRESULT RemoveOptionalProperty(IAAFPropertyDef* propDef) override;
    HRESULT CreateOptionalPropertyValue(IAAFPropertyDef* propDef,
                                        IAAFPropertyValue** propVal) override;
    HRESULT GetDictionary(IAAFDictionary** dictionary) override;
    HRESULT EnableGenerationTracking() override;
    HRESULT DisableGenerationTracking() override;
    HRESULT IsGenerationTracked(aafBoolean_t* result) override;

protected:
    ~Object() override;

    // Called before values are looked at: an object whose values come into being when they are
    // wanted makes them here.
    virtual void Complete() const {}

private:
    friend class PropertyValue;

    PropertyId NumberOf(const PropertyKey& key) const;
    PropertyDefinition* DefinitionOf(const PropertyKey& key) const;
    PropertyValue* EnterNew(const PropertyDefinition& property, RefPtr<PropertyValue> value);
    // The definition, when it belongs to this object's class or a parent; else null.
    PropertyDefinition* OwnProperty(IAAFPropertyDef* propDef) const;
    HRESULT ReadInteger64(const PropertyKey& key, aafInt64* out) const;
    TypeDefinition* IndirectType(const PropertyValue* value) const;
    // The id by which a weak reference in this property names its target.
    HRESULT WeakKey(const PropertyKey& key, IUnknown* argument, Bytes* bytes) const;

    ClassDefinition* class_ = nullptr;
    Object* owner_ = nullptr;
    ValueList values_;
    bool generationTracked_ = false;
};

template <class Integer>
HRESULT Object::ReadInteger(const PropertyKey& key, Integer* out) const {
    aafInt64 value = 0;
    if (out == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    HRESULT result = ReadInteger64(key, &value);
    if (result >= 0) {
        *out = static_cast<Integer>(value);
    }
    return result;
}

}  // namespace aaf
