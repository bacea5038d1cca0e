// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "tests/unit/aaf_library/stored/SampleTree.h"

#include "aaf_library/stored/LittleEndian.h"
#include "aaf_library/stored/StoredFile.h"

#include <utility>

namespace aaf::stored::sample {

namespace {

constexpr std::uint16_t kEyPid = 0x0005;

StoredProperty weak(std::uint16_t pid, StoredForm form, const std::u16string& name,
                    std::vector<Bytes> keys, std::vector<std::uint16_t> path) {
    StoredProperty property;
    property.pid = pid;
    property.form = form;
    property.name = name;
    property.keys = std::move(keys);
    property.keyPid = kEyPid;
    property.targetPath = std::move(path);
    return property;
}

Bytes pattern(std::size_t size) {
    Bytes content(size);
    for (std::size_t i = 0; i < size; ++i) {
        content[i] = static_cast<std::uint8_t>(i * 7 + i / 256);
    }
    return content;
}

}  // namespace

StoredAuid auid(std::uint8_t first) {
    return {first, 1, 1, 0x0D, 1, 1, 0, 0x2F, 6, 0x0E, 0x2B, 0x34, 2, 6, 1, 1};
}

Bytes bytes(const StoredAuid& id) {
    return Bytes(id.begin(), id.end());
}

StoredProperty data(std::uint16_t pid, Bytes value) {
    StoredProperty property;
    property.pid = pid;
    property.bytes = std::move(value);
    return property;
}

StoredProperty text(std::uint16_t pid, const std::u16string& value) {
    return data(pid, ByteWriter().AppendText(value).bytes());
}

StoredProperty reference(std::uint16_t pid, const std::u16string& name, StoredObject object) {
    StoredProperty property;
    property.pid = pid;
    property.form = StoredForm::StrongReference;
    property.name = name;
    property.objects.push_back(std::move(object));
    return property;
}

StoredProperty vector(std::uint16_t pid, const std::u16string& name,
                      std::vector<StoredObject> objects) {
    StoredProperty property;
    property.pid = pid;
    property.form = StoredForm::StrongVector;
    property.name = name;
    property.objects = std::move(objects);
    return property;
}

StoredProperty stream(std::uint16_t pid, const std::u16string& name, Bytes content) {
    StoredProperty property;
    property.pid = pid;
    property.form = StoredForm::Stream;
    property.name = name;
    property.bytes = std::move(content);
    return property;
}

StoredObject keyed(std::uint8_t id) {
    StoredObject object;
    object.classId = auid(0x70);
    object.properties.push_back(data(kEyPid, bytes(auid(id))));
    return object;
}

StoredProperty set(std::uint16_t pid, const std::u16string& name,
                   std::vector<StoredObject> objects) {
    StoredProperty property;
    property.pid = pid;
    property.form = StoredForm::StrongSet;
    property.name = name;
    property.keyPid = kEyPid;
    for (const StoredObject& object : objects) {
        property.keys.push_back(object.Find(kEyPid)->bytes);
    }
    property.objects = std::move(objects);
    return property;
}

StoredObject EveryForm() {
    StoredObject leaf;
    leaf.classId = auid(9);
    leaf.properties = {text(0x5001, u""), text(0x5002, u"a \xD83C\xDFAC clip"),
                       data(0xFFFE, {1, 2, 3})};

    StoredObject bare;  // an object without any property
    bare.classId = auid(8);

    StoredObject holder;
    holder.classId = auid(2);
    holder.properties = {
        vector(0x4403, u"Slots", {leaf, bare, leaf}),
        vector(0x4406, u"UserComments", {}),
        set(0x3B06, u"IdentificationList", {keyed(1), keyed(2), keyed(0xF0)}),
        set(0x1902, u"EssenceData", {}),
        reference(0x4803, u"Segment", leaf),
        stream(0x2702, u"Data", pattern(9000)),
        stream(0x2B01, u"SampleIndex", pattern(70)),
        weak(0x0201, StoredForm::WeakReference, {}, {bytes(auid(2))}, {0x0002, 0x3B06}),
        weak(0x2302, StoredForm::WeakVector, u"DataDefinitions",
             {bytes(auid(0xF0)), bytes(auid(1)), bytes(auid(1))}, {0x0002, 0x3B06}),
        weak(0x1E09, StoredForm::WeakSet, u"ParametersDefined",
             {bytes(auid(0x11)), bytes(auid(0x12))}, {0x0001}),
    };

    StoredObject root;
    root.classId = kRootClassId;
    root.properties = {set(0x0001, u"MetaDictionary", {keyed(0x11), keyed(0x12)}),
                       reference(0x0002, u"Header", holder)};
    return root;
}

StoredObject RootWith(StoredProperty property) {
    StoredObject root;
    root.classId = kRootClassId;
    root.properties.push_back(std::move(property));
    return root;
}

}  // namespace aaf::stored::sample
