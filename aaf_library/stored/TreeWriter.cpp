// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/stored/TreeWriter.h"

#include "aaf_library/stored/CompoundFileWriter.h"
#include "aaf_library/stored/LittleEndian.h"
#include "aaf_library/stored/PropertyFormat.h"
#include "aaf_library/stored/StoredNames.h"

#include <algorithm>
#include <map>
#include <numeric>
#include <set>

// An object becomes a storage with a stream "properties":
//
//   u8 byte order, u8 version, u16 count
//   count times u16 pid, u16 form, u16 size
//   the values in the same order
//
// A contained object is a storage named in the value; a collection has an
// index stream and one storage for each element; a weak reference names its
// target by a key and the set it is in by the place of that set's path in the
// table of the root storage.

namespace aaf::stored {

namespace {

constexpr std::size_t largestValue = 0xFFFF;

// The table of paths to the sets that weak references lead to. A path gets
// its tag when it is used first.
class TargetPaths {
public:
    std::uint16_t tag(const std::vector<std::uint16_t>& path) {
        const bool bad = path.empty() || std::find(path.begin(), path.end(), 0) != path.end();
        if (bad) {
            throw StoredError("a weak reference without a path to its targets");
        }
        const auto known = tags_.find(path);
        if (known != tags_.end()) {
            return known->second;
        }
        const auto tag = static_cast<std::uint16_t>(paths_.size());
        paths_.push_back(path);
        tags_.emplace(path, tag);
        return tag;
    }

    Bytes table() const {
        ByteWriter pids;
        for (const std::vector<std::uint16_t>& path : paths_) {
            for (std::uint16_t pid : path) {
                pids.number(pid);
            }
            pids.number(std::uint16_t{0});
        }
        return ByteWriter()
            .number(littleEndianMark)
            .number(static_cast<std::uint16_t>(paths_.size()))
            .number(static_cast<std::uint32_t>(pids.bytes().size() / 2))
            .append(pids.bytes())
            .bytes();
    }

private:
    std::vector<std::vector<std::uint16_t>> paths_;
    std::map<std::vector<std::uint16_t>, std::uint16_t> tags_;
};

// What an object's storage holds besides its property table. Names cannot
// clash, since each carries the pid of its property.
struct Layout {
    struct Child {
        std::u16string name;
        const StoredObject* object;
    };
    struct Stream {
        std::u16string name;
        Bytes made;             // an index
        const Bytes* borrowed;  // or the content of a stream property
    };

    ByteWriter entries;
    ByteWriter values;
    std::uint32_t count = 0;
    std::vector<Child> children;
    std::vector<Stream> streams;

    void add(const StoredProperty& property, const Bytes& value) {
        if (value.size() > largestValue) {
            throw StoredError(std::to_string(value.size()) + " bytes, a value may take " +
                              std::to_string(largestValue));
        }
        entries.number(property.pid)
            .number(static_cast<std::uint16_t>(property.form))
            .number(static_cast<std::uint16_t>(value.size()));
        values.append(value);
        ++count;
    }
};

Bytes nameValue(const std::u16string& name) {
    return ByteWriter().text(name).bytes();
}

std::uint8_t checkedKeySize(const StoredProperty& property) {
    if (!isKeySize(property.keySize)) {
        throw StoredError("keys of " + std::to_string(property.keySize) + " bytes");
    }
    for (const Bytes& key : property.keys) {
        if (key.size() != property.keySize) {
            throw StoredError("a key of " + std::to_string(key.size()) + " bytes");
        }
    }
    return property.keySize;
}

class TreeWriter {
public:
    explicit TreeWriter(SectorSize sectorSize) : file_(sectorSize) {}

    Bytes write(const StoredObject& root) {
        fill(file_.root(), root, 0);
        // Tags are handed out on the way, so the table comes last. Readers
        // want it, even without a path in it.
        file_.root().stream(referencedPropertiesStream, paths_.table());
        return file_.finish();
    }

private:
    void fill(StorageWriter& storage, const StoredObject& object, int depth) {
        if (depth > maximumDepth) {
            throw StoredError("objects are nested too deep");
        }
        Layout layout;
        std::set<std::uint16_t> pids;
        for (const StoredProperty& property : object.properties) {
            try {
                if (!pids.insert(property.pid).second) {
                    throw StoredError("occurs twice in one object");
                }
                addProperty(layout, property);
            } catch (const StoredError& problem) {
                throw StoredError(propertyText(property.pid) + ": " + problem.what());
            }
        }
        writeLayout(storage, object, layout, depth);
    }

    void writeLayout(StorageWriter& storage, const StoredObject& object, const Layout& layout,
                     int depth) {
        storage.setClass(object.classId);
        storage.stream(propertiesStream, ByteWriter()
                                             .number(littleEndianMark)
                                             .number(propertiesVersion)
                                             .number(static_cast<std::uint16_t>(layout.count))
                                             .append(layout.entries.bytes())
                                             .append(layout.values.bytes())
                                             .bytes());
        for (const Layout::Stream& stream : layout.streams) {
            storage.stream(stream.name, stream.borrowed ? *stream.borrowed : stream.made);
        }
        for (const Layout::Child& child : layout.children) {
            StorageWriter contained = storage.storage(child.name);
            try {
                fill(contained, *child.object, depth + 1);
            } catch (const StoredError& problem) {
                throw StoredError(toUtf8(child.name) + ": " + problem.what());
            }
            contained.close();
        }
    }

    void addProperty(Layout& layout, const StoredProperty& property) {
        switch (property.form) {
            case StoredForm::StrongReference:
                return addStrongReference(layout, property);
            case StoredForm::StrongVector:
                return addStrongVector(layout, property);
            case StoredForm::StrongSet:
                return addStrongSet(layout, property);
            case StoredForm::WeakReference:
                return addWeakReference(layout, property);
            case StoredForm::WeakVector:
            case StoredForm::WeakSet:
                return addWeakCollection(layout, property);
            case StoredForm::Stream:
                return addStream(layout, property);
            case StoredForm::Data:
                break;
        }
        if (!property.bytes.empty()) {
            layout.add(property, property.bytes);
        }
    }

    static void addStrongReference(Layout& layout, const StoredProperty& property) {
        if (property.objects.size() != 1) {
            throw StoredError("a strong reference holds one object, not " +
                              std::to_string(property.objects.size()));
        }
        const std::u16string name = singleName(property.name, property.pid);
        layout.add(property, nameValue(name));
        layout.children.push_back({name, &property.objects.front()});
    }

    static void addStrongVector(Layout& layout, const StoredProperty& property) {
        const std::u16string name = collectionName(property.name, property.pid);
        const auto count = static_cast<std::uint32_t>(property.objects.size());
        ByteWriter index;
        index.number(count).number(count).number(noLastFreeKey);
        for (std::uint32_t i = 0; i < count; ++i) {
            index.number(i);
            layout.children.push_back({elementName(name, i), &property.objects[i]});
        }
        layout.add(property, nameValue(name));
        layout.streams.push_back({indexName(name), index.bytes(), nullptr});
    }

    static void addStrongSet(Layout& layout, const StoredProperty& property) {
        const std::u16string name = collectionName(property.name, property.pid);
        const std::vector<std::size_t> order = keyOrder(property);
        const auto count = static_cast<std::uint32_t>(order.size());
        ByteWriter index;
        index.number(count).number(count).number(noLastFreeKey);
        index.number(property.keyPid).number(checkedKeySize(property));
        for (std::uint32_t i = 0; i < count; ++i) {
            const StoredObject& object = property.objects[order[i]];
            const Bytes& key = property.keys[order[i]];
            const StoredProperty* stored = object.find(property.keyPid);
            if (stored == nullptr || stored->bytes != key) {
                throw StoredError("an element does not store its key");
            }
            index.number(i).number(setReferenceCount).append(key);
            layout.children.push_back({elementName(name, i), &object});
        }
        layout.add(property, nameValue(name));
        layout.streams.push_back({indexName(name), index.bytes(), nullptr});
    }

    // The places of the elements in the order of their keys, which are unique.
    static std::vector<std::size_t> keyOrder(const StoredProperty& property) {
        const std::vector<Bytes>& keys = property.keys;
        if (keys.size() != property.objects.size()) {
            throw StoredError("a set has " + std::to_string(property.objects.size()) +
                              " elements and " + std::to_string(keys.size()) + " keys");
        }
        std::vector<std::size_t> order(keys.size());
        std::iota(order.begin(), order.end(), std::size_t{0});
        std::sort(order.begin(), order.end(),
                  [&](std::size_t a, std::size_t b) { return keys[a] < keys[b]; });
        for (std::size_t i = 1; i < order.size(); ++i) {
            if (keys[order[i - 1]] == keys[order[i]]) {
                throw StoredError("two elements of a set have the same key");
            }
        }
        return order;
    }

    void addWeakReference(Layout& layout, const StoredProperty& property) {
        if (property.keys.size() != 1) {
            throw StoredError("a weak reference has one key, not " +
                              std::to_string(property.keys.size()));
        }
        layout.add(property, ByteWriter()
                                 .number(paths_.tag(property.targetPath))
                                 .number(property.keyPid)
                                 .number(checkedKeySize(property))
                                 .append(property.keys.front())
                                 .bytes());
    }

    void addWeakCollection(Layout& layout, const StoredProperty& property) {
        if (property.keys.empty()) {
            return;
        }
        const std::u16string name = collectionName(property.name, property.pid);
        ByteWriter index;
        index.number(static_cast<std::uint32_t>(property.keys.size()));
        index.number(paths_.tag(property.targetPath)).number(property.keyPid);
        index.number(checkedKeySize(property));
        for (const Bytes& key : inOrder(property)) {
            index.append(key);
        }
        layout.add(property, nameValue(name));
        layout.streams.push_back({indexName(name), index.bytes(), nullptr});
    }

    static std::vector<Bytes> inOrder(const StoredProperty& property) {
        std::vector<Bytes> keys = property.keys;
        if (property.form == StoredForm::WeakSet) {
            std::sort(keys.begin(), keys.end());
            if (std::adjacent_find(keys.begin(), keys.end()) != keys.end()) {
                throw StoredError("a set refers twice to one object");
            }
        }
        return keys;
    }

    static void addStream(Layout& layout, const StoredProperty& property) {
        if (property.bytes.empty()) {
            return;
        }
        const std::u16string name = singleName(property.name, property.pid);
        layout.add(property, ByteWriter().number(streamMark).text(name).bytes());
        layout.streams.push_back({name, {}, &property.bytes});
    }

    CompoundFileWriter file_;
    TargetPaths paths_;
};

}  // namespace

Bytes writeTree(const StoredObject& root, SectorSize sectorSize) {
    return TreeWriter(sectorSize).write(root);
}

}  // namespace aaf::stored
