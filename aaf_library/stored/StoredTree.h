// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <array>
#include <cstdint>
#include <memory>
#include <string>
#include <vector>

// The neutral form between a compound file and the object model: a tree of
// objects whose properties are bytes, contained objects or references by key.
// Nothing here knows an AAF class; the reader makes such a tree of any
// well-formed file and the writer lays any such tree out.

namespace aaf::stored {

using Bytes = std::vector<std::uint8_t>;

// Sixteen bytes as they stand in the file: the first three fields of the text
// form little-endian, the other eight in order.
using StoredAuid = std::array<std::uint8_t, 16>;

enum class SectorSize : std::uint32_t { Bytes512 = 512, Bytes4096 = 4096 };

enum class StoredForm : std::uint16_t {
    WeakReference = 0x02,
    WeakVector = 0x12,
    WeakSet = 0x1A,
    StrongReference = 0x22,
    StrongVector = 0x32,
    StrongSet = 0x3A,
    Stream = 0x42,
    Data = 0x82,
};

struct LaidOut;
struct StoredProperty;

// One object: a storage of the file. Every pid occurs once among the
// properties, whose order is the order in the file; of those read from a file
// the first with a pid counts, others have a problem.
struct StoredObject {
    StoredAuid classId{};
    std::vector<StoredProperty> properties;

    // What is written for the object where it was laid out before (LayOut in
    // TreeWriter.h); then nobody looks at the properties.
    std::shared_ptr<const LaidOut> laidOut;

    const StoredProperty* Find(std::uint16_t pid) const;
};

// One property. Which fields count is told by the form.
struct StoredProperty {
    std::uint16_t pid = 0;
    StoredForm form = StoredForm::Data;

    // Name of the property, of which the names of storages and streams are
    // made (strong forms, weak collections, streams; unused otherwise). After
    // reading it is the part of the stored name before the pid, which may be
    // a squeezed form of the property's name.
    std::u16string name;

    // Data: the value, 1 to 65535 bytes (an empty value is written as an
    // absent property). Stream: the content. Of a form that is not listed
    // above: the value as it stands.
    Bytes bytes;

    // Strong forms: the contained objects in order; exactly one for a strong
    // reference.
    std::vector<StoredObject> objects;

    // Strong set: the key of each object, beside `objects` (the object also
    // stores it as its own property `keyPid`). Weak forms: the keys of the
    // targets; exactly one for a weak reference. All keys have the same size,
    // 16 (ids) or 32 bytes (mob ids).
    std::vector<Bytes> keys;
    std::uint16_t keyPid = 0;
    std::uint8_t keySize = 16;

    // Strong set: the number in the name of each object's storage, no two alike.
    // Unless there are as many as objects, they are numbered in the order of
    // their keys. Two trees that differ in these are equal.
    std::vector<std::uint32_t> localKeys;

    // Weak forms: the pids from the root object down to the strong set that
    // holds the targets.
    std::vector<std::uint16_t> targetPath;

    // What kept a reader from making sense of the property; empty for most.
    // Then `bytes` is the value as it stands, or, when there is a name, the
    // stream beside it: what could be read of it. Objects are written whatever
    // keys they have.
    std::string problem;
};

bool operator==(const StoredObject& left, const StoredObject& right);
bool operator==(const StoredProperty& left, const StoredProperty& right);
inline bool operator!=(const StoredObject& left, const StoredObject& right) {
    return !(left == right);
}
inline bool operator!=(const StoredProperty& left, const StoredProperty& right) {
    return !(left == right);
}

}  // namespace aaf::stored
