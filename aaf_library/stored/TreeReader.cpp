// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/stored/TreeReader.h"

#include "aaf_library/stored/CompoundFileReader.h"
#include "aaf_library/stored/LittleEndian.h"
#include "aaf_library/stored/PropertyFormat.h"
#include "aaf_library/stored/StoredNames.h"

#include <set>

namespace aaf::stored {

namespace {

using Entry = CompoundFileReader::Entry;
using Kind = CompoundFileReader::Kind;

class TreeReader {
public:
    explicit TreeReader(const Bytes& file) : file_(file) {}

    StoredObject read() {
        readTargetPaths();
        return object(CompoundFileReader::rootIndex, 0);
    }

private:
    // The entry of that name in a storage. Each is handed out once, so no two
    // properties can share an object.
    std::uint32_t take(const Entry& storage, const std::u16string& name, Kind kind) {
        const auto found = storage.contained.find(name);
        if (found == storage.contained.end() || file_.entry(found->second).kind != kind) {
            throw StoredError("\"" + toUtf8(name) + "\" is missing");
        }
        if (!taken_.insert(found->second).second) {
            throw StoredError("\"" + toUtf8(name) + "\" is referred to twice");
        }
        return found->second;
    }

    Bytes stream(const Entry& storage, const std::u16string& name) {
        return file_.read(take(storage, name, Kind::Stream));
    }

    void readTargetPaths() {
        const Entry& root = file_.entry(CompoundFileReader::rootIndex);
        if (root.contained.count(referencedPropertiesStream) == 0) {
            return;  // a file without weak references
        }
        const Bytes table = stream(root, referencedPropertiesStream);
        ByteReader from(table);
        checkOrder(from.number<std::uint8_t>());
        const auto count = from.number<std::uint16_t>();
        const auto values = from.number<std::uint32_t>();
        if (from.left() / 2 < values) {
            throw StoredError("the table of weak references ends early");
        }
        std::vector<std::uint16_t> path;
        for (std::uint32_t i = 0; i < values; ++i) {
            const auto pid = from.number<std::uint16_t>();
            if (pid != 0) {
                path.push_back(pid);
                continue;
            }
            paths_.push_back(path);
            path.clear();
        }
        if (paths_.size() != count) {
            throw StoredError("the table of weak references has " + std::to_string(paths_.size()) +
                              " paths and counts " + std::to_string(count));
        }
    }

    static void checkOrder(std::uint8_t mark) {
        if (mark != littleEndianMark) {
            throw StoredError(mark == bigEndianMark ? "big-endian files are not supported"
                                                    : "unknown byte order");
        }
    }

    StoredObject object(std::uint32_t index, int depth) {
        if (depth > maximumDepth) {
            throw StoredError("objects are nested too deep");
        }
        const Entry& storage = file_.entry(index);
        StoredObject object;
        object.classId = storage.classId;
        const Bytes table = stream(storage, propertiesStream);
        ByteReader entries(table);
        checkOrder(entries.number<std::uint8_t>());
        entries.number<std::uint8_t>();  // the version, of which only one was ever in use
        const auto count = entries.number<std::uint16_t>();
        ByteReader values = entries;
        values.bytes(std::size_t{count} * 6);
        object.properties.reserve(count);
        std::set<std::uint16_t> pids;
        for (std::uint16_t i = 0; i < count; ++i) {
            StoredProperty property;
            property.pid = entries.number<std::uint16_t>();
            property.form = StoredForm(entries.number<std::uint16_t>());
            const auto size = entries.number<std::uint16_t>();
            try {
                property.bytes = values.bytes(size);
                if (!pids.insert(property.pid).second) {
                    throw StoredError("occurs twice");
                }
                if (size != 0) {
                    resolve(storage, property, depth);
                    object.properties.push_back(std::move(property));
                }
            } catch (const StoredError& problem) {
                throw StoredError(propertyText(property.pid) + ": " + problem.what());
            }
        }
        return object;
    }

    // Turns the bytes of the entry into what they lead to.
    void resolve(const Entry& storage, StoredProperty& property, int depth) {
        const Bytes value = std::move(property.bytes);
        property.bytes.clear();
        switch (property.form) {
            case StoredForm::StrongReference: {
                const std::u16string name = storedName(property, ByteReader(value));
                property.objects.push_back(contained(storage, name, depth));
                return;
            }
            case StoredForm::StrongVector:
            case StoredForm::StrongSet:
                return readStrongCollection(storage, property, value, depth);
            case StoredForm::WeakReference:
                return readWeakReference(property, value);
            case StoredForm::WeakVector:
            case StoredForm::WeakSet:
                return readWeakCollection(storage, property, value);
            case StoredForm::Stream: {
                ByteReader from(value);
                from.number<std::uint8_t>();  // the byte order, of no use for plain bytes
                property.bytes = stream(storage, storedName(property, from));
                return;
            }
            case StoredForm::Data:
                break;
        }
        property.bytes = value;
    }

    static std::u16string storedName(StoredProperty& property, ByteReader from) {
        std::u16string name = from.text();
        property.name = propertyPart(name, property.pid);
        return name;
    }

    StoredObject contained(const Entry& storage, const std::u16string& name, int depth) {
        const std::uint32_t index = take(storage, name, Kind::Storage);
        try {
            return object(index, depth + 1);
        } catch (const StoredError& problem) {
            throw StoredError(toUtf8(name) + ": " + problem.what());
        }
    }

    void readStrongCollection(const Entry& storage, StoredProperty& property, const Bytes& value,
                              int depth) {
        const bool isSet = property.form == StoredForm::StrongSet;
        const std::u16string name = storedName(property, ByteReader(value));
        const Bytes index = stream(storage, indexName(name));
        ByteReader from(index);
        const auto count = from.number<std::uint32_t>();
        from.bytes(8);  // which keys are free; only a writer would want to know
        if (isSet) {
            property.keyPid = from.number<std::uint16_t>();
            readKeySize(property, from);
        }
        checkCount(count, from.left(), isSet ? std::size_t{8} + property.keySize : 4);
        property.objects.reserve(count);
        for (std::uint32_t i = 0; i < count; ++i) {
            const auto localKey = from.number<std::uint32_t>();
            if (isSet) {
                from.number<std::uint32_t>();  // the count of references
                property.keys.push_back(from.bytes(property.keySize));
            }
            property.objects.push_back(contained(storage, elementName(name, localKey), depth));
        }
        if (isSet) {
            checkUnique(property.keys);
        }
    }

    void readWeakReference(StoredProperty& property, const Bytes& value) {
        ByteReader from(value);
        readTarget(property, from);
        readKeySize(property, from);
        property.keys.push_back(from.bytes(property.keySize));
    }

    void readWeakCollection(const Entry& storage, StoredProperty& property, const Bytes& value) {
        const Bytes index = stream(storage, indexName(storedName(property, ByteReader(value))));
        ByteReader from(index);
        const auto count = from.number<std::uint32_t>();
        readTarget(property, from);
        readKeySize(property, from);
        checkCount(count, from.left(), property.keySize);
        for (std::uint32_t i = 0; i < count; ++i) {
            property.keys.push_back(from.bytes(property.keySize));
        }
        if (property.form == StoredForm::WeakSet) {
            checkUnique(property.keys);
        }
    }

    void readTarget(StoredProperty& property, ByteReader& from) {
        const auto tag = from.number<std::uint16_t>();
        property.keyPid = from.number<std::uint16_t>();
        if (tag >= paths_.size()) {
            throw StoredError("a weak reference has tag " + std::to_string(tag) +
                              ", the file has " + std::to_string(paths_.size()) + " paths");
        }
        property.targetPath = paths_[tag];
    }

    static void readKeySize(StoredProperty& property, ByteReader& from) {
        property.keySize = from.number<std::uint8_t>();
        if (!isKeySize(property.keySize)) {
            throw StoredError("a key of " + std::to_string(property.keySize) + " bytes");
        }
    }

    static void checkCount(std::uint32_t count, std::size_t left, std::size_t each) {
        if (count > left / each) {
            throw StoredError("the index counts " + std::to_string(count) + " elements, " +
                              std::to_string(left) + " bytes left");
        }
    }

    static void checkUnique(const std::vector<Bytes>& keys) {
        if (std::set<Bytes>(keys.begin(), keys.end()).size() != keys.size()) {
            throw StoredError("a set has a key twice");
        }
    }

    CompoundFileReader file_;
    std::vector<std::vector<std::uint16_t>> paths_;
    std::set<std::uint32_t> taken_;
};

}  // namespace

StoredObject readTree(const Bytes& file) {
    return TreeReader(file).read();
}

}  // namespace aaf::stored
