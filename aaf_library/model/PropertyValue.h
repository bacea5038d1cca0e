// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <algorithm>
#include <cstdint>
#include <memory>
#include <utility>
#include <vector>

#include "aaf_library/model/PropertyKey.h"
#include "aaf_library/model/Unknown.h"
#include "host_interfaces/aaf/AAFObjects.h"
#include "not_implemented/AAFObjects.h"

namespace aaf {

class Object;
class TypeDefinition;

using Bytes = std::vector<std::uint8_t>;

// What a file holds in place of a value: kept for the next file that is written. Those who read
// and write files know more of it.
struct AsStored {
    virtual ~AsStored() = default;

    // The definitions that it refers to, by the dictionary's property and their id.
    std::vector<std::pair<PropertyId, GUID>> targets;
};

// A value of some type. What it holds follows from the form of its type:
//   data           bytes, in stored form (little-endian, packed, UTF-16 text)
//   stream         bytes, the content of the stream
//   weak reference bytes, the id of the target; weak vector and set: ids one after the other
//   strong reference, vector, set: objects
//
// The value that stands in an object is the very one that was set on it, so a
// caller who holds it sees and makes changes of the object. The objects that it
// contains then belong to that object.
class PropertyValue final : public Implements<Unknown, IAAFPropertyValue> {
public:
    PropertyValue(TypeDefinition& type, Bytes bytes);

    TypeDefinition& type() const { return *type_; }
    bool HoldsObjects() const;

    const Bytes& bytes() const { return bytes_; }
    // Tells the object that this value stands in: only for those who change it.
    Bytes& BytesToChange() {
        TellHolder();
        return bytes_;
    }

    // Contained objects. They are attached to the object that this value stands in.
    const std::vector<RefPtr<Object>>& objects() const { return objects_; }
    HRESULT InsertObject(std::size_t index, Object* object);
    // Takes the object out and frees it.
    void RemoveObjectAt(std::size_t index);
    void ClearObjects();
    // Sets are kept in the order of their elements' keys.
    void SortByKey();

    // The object that this value stands in, or null.
    Object* holder() const { return holder_; }
    // Called by Object only. Fails, changing nothing, when a contained object has an owner already.
    HRESULT EnterObject(Object& holder);
    void LeaveObject();

    // Set when a file held something that is no value of its property. Then the bytes are what can
    // be shown of it, and the property counts as absent but for those who ask for its value.
    const std::shared_ptr<const AsStored>& asStored() const { return asStored_; }
    void KeepAsStored(std::shared_ptr<const AsStored> asStored) { asStored_ = std::move(asStored); }

    // Read and write position of a stream value. One that has become shorter has it at its end.
    std::uint64_t position() const { return std::min<std::uint64_t>(position_, bytes_.size()); }
    void SetPosition(std::uint64_t position) { position_ = position; }
    // Byte order mark of a stream: 0x55 unspecified, 0x4C little, 0x42 big.
    std::uint8_t streamByteOrder() const { return streamByteOrder_; }
    void SetStreamByteOrder(std::uint8_t order);

    // -- IAAFPropertyValue
    HRESULT GetType(IAAFTypeDef** typeDef) override;
    // No for a value that is kept as stored; its type then is one of bytes.
    HRESULT IsDefinedType(aafBoolean_t* isDefined) override;

private:
    ~PropertyValue() override;
    static void Attach(Object& object, Object& owner);
    static void Detach(Object& object);
    void TellHolder();

    TypeDefinition* type_;
    Bytes bytes_;
    std::vector<RefPtr<Object>> objects_;
    Object* holder_ = nullptr;
    std::shared_ptr<const AsStored> asStored_;
    std::uint64_t position_ = 0;
    std::uint8_t streamByteOrder_ = 0x55;
};

}  // namespace aaf
