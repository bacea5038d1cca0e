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

    StoredObject Read() {
        ReadTargetPaths();
        return ReadObject(CompoundFileReader::kRootIndex, 0);
    }

private:
    bool Has(const Entry& storage, const std::u16string& name, Kind kind) const {
        const auto found = storage.contained.find(name);
        return found != storage.contained.end() && file_.entry(found->second).kind == kind;
    }

    // The entry of that name in a storage. Each is handed out once, so no two
    // properties can share an object.
    std::uint32_t Take(const Entry& storage, const std::u16string& name, Kind kind) {
        if (!Has(storage, name, kind)) {
            throw StoredError("\"" + ToUtf8(name) + "\" is missing");
        }
        const std::uint32_t index = storage.contained.at(name);
        if (!taken_.insert(index).second) {
            throw StoredError("\"" + ToUtf8(name) + "\" is referred to twice");
        }
        return index;
    }

    Bytes ReadStream(const Entry& storage, const std::u16string& name) {
        return file_.Read(Take(storage, name, Kind::Stream));
    }

    void ReadTargetPaths() {
        const Entry& root = file_.entry(CompoundFileReader::kRootIndex);
        if (root.contained.count(kReferencedPropertiesStream) == 0) {
            return;  // a file without weak references
        }
        const Bytes table = ReadStream(root, kReferencedPropertiesStream);
        ByteReader from(table);
        CheckOrder(from.TakeNumber<std::uint8_t>());
        const auto count = from.TakeNumber<std::uint16_t>();
        const auto values = from.TakeNumber<std::uint32_t>();
        if (from.left() / 2 < values) {
            throw StoredError("the table of weak references ends early");
        }
        std::vector<std::uint16_t> path;
        for (std::uint32_t i = 0; i < values; ++i) {
            const auto pid = from.TakeNumber<std::uint16_t>();
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

    static void CheckOrder(std::uint8_t mark) {
        if (mark != kLittleEndianMark) {
            throw StoredError(mark == kBigEndianMark ? "big-endian files are not supported"
                                                     : "unknown byte order");
        }
    }

    StoredObject ReadObject(std::uint32_t index, int depth) {
        if (depth > kMaximumDepth) {
            throw StoredError("objects are nested too deep");
        }
        const Entry& storage = file_.entry(index);
        StoredObject object;
        object.classId = storage.classId;
        const Bytes table = ReadStream(storage, kPropertiesStream);
        ByteReader entries(table);
        CheckOrder(entries.TakeNumber<std::uint8_t>());
        entries.TakeNumber<std::uint8_t>();  // the version, of which only one was ever in use
        const auto count = entries.TakeNumber<std::uint16_t>();
        ByteReader values = entries;
        values.TakeBytes(std::size_t{count} * 6);
        object.properties.reserve(count);
        std::set<std::uint16_t> pids;
        for (std::uint16_t i = 0; i < count; ++i) {
            StoredProperty property;
            property.pid = entries.TakeNumber<std::uint16_t>();
            property.form = StoredForm(entries.TakeNumber<std::uint16_t>());
            const auto size = entries.TakeNumber<std::uint16_t>();
            try {
                property.bytes = values.TakeBytes(size);
                if (!pids.insert(property.pid).second) {
                    property.problem = "occurs twice";
                } else if (size != 0) {
                    Resolve(storage, property, depth);
                }
                if (size != 0) {
                    object.properties.push_back(std::move(property));
                }
            } catch (const StoredError& problem) {
                throw StoredError(PropertyText(property.pid) + ": " + problem.what());
            }
        }
        return object;
    }

    // Turns the bytes of the entry into what they lead to.
    void Resolve(const Entry& storage, StoredProperty& property, int depth) {
        const Bytes value = std::move(property.bytes);
        property.bytes.clear();
        switch (property.form) {
            case StoredForm::StrongReference: {
                const std::u16string name = StoredName(property, ByteReader(value));
                property.objects.push_back(ReadContained(storage, name, depth));
                return;
            }
            case StoredForm::StrongVector:
            case StoredForm::StrongSet:
                return ReadStrongCollection(storage, property, value, depth);
            case StoredForm::WeakReference:
                property.bytes = value;
                return Tolerate(property, [&] { ReadWeakReference(property, value); });
            case StoredForm::WeakVector:
            case StoredForm::WeakSet:
                if (ReadNamedStream(storage, property, value, ByteReader(value), IndexName)) {
                    Tolerate(property, [&] { ReadWeakIndex(property); });
                }
                return;
            case StoredForm::Stream: {
                // The byte order comes first, of no use for plain bytes.
                const auto itself = [](const std::u16string& name) { return name; };
                ReadNamedStream(storage, property, value,
                                ByteReader(value.data() + 1, value.size() - 1), itself);
                return;
            }
            case StoredForm::Data:
                break;
        }
        property.bytes = value;
    }

    // Keeps the bytes when they make no sense, and drops them when they do.
    template <class Read>
    static void Tolerate(StoredProperty& property, const Read& read) {
        try {
            read();
            property.bytes.clear();
        } catch (const StoredError& problem) {
            property.problem = problem.what();
            property.keys.clear();
            property.keySize = kAuidKeySize;
            property.targetPath.clear();
        }
    }

    // Reads the stream whose name the value tells. False when the value tells
    // none that is there.
    template <class NameOfStream>
    bool ReadNamedStream(const Entry& storage, StoredProperty& property, const Bytes& value,
                         ByteReader from, const NameOfStream& nameOf) {
        property.bytes = value;
        std::u16string name;
        try {
            name = nameOf(StoredName(property, from));
        } catch (const StoredError& problem) {
            property.problem = problem.what();
            return false;
        }
        if (!property.name.empty()) {
            property.bytes.clear();
        }
        if (!Has(storage, name, Kind::Stream)) {
            property.problem = "\"" + ToUtf8(name) + "\" is missing";
            return false;
        }
        property.bytes = ReadStream(storage, name);
        return true;
    }

    static std::u16string StoredName(StoredProperty& property, ByteReader from) {
        std::u16string name = from.TakeText();
        property.name = PropertyPart(name, property.pid);
        return name;
    }

    StoredObject ReadContained(const Entry& storage, const std::u16string& name, int depth) {
        const std::uint32_t index = Take(storage, name, Kind::Storage);
        try {
            return ReadObject(index, depth + 1);
        } catch (const StoredError& problem) {
            throw StoredError(ToUtf8(name) + ": " + problem.what());
        }
    }

    void ReadStrongCollection(const Entry& storage, StoredProperty& property, const Bytes& value,
                              int depth) {
        const bool isSet = property.form == StoredForm::StrongSet;
        const std::u16string name = StoredName(property, ByteReader(value));
        const Bytes index = ReadStream(storage, IndexName(name));
        ByteReader from(index);
        const auto count = from.TakeNumber<std::uint32_t>();
        from.TakeBytes(8);  // which keys are free; only a writer would want to know
        if (isSet) {
            property.keyPid = from.TakeNumber<std::uint16_t>();
            ReadKeySize(property, from);
        }
        CheckCount(count, from.left(), isSet ? std::size_t{8} + property.keySize : 4);
        property.objects.reserve(count);
        for (std::uint32_t i = 0; i < count; ++i) {
            const auto localKey = from.TakeNumber<std::uint32_t>();
            if (isSet) {
                from.TakeNumber<std::uint32_t>();  // the count of references
                property.keys.push_back(from.TakeBytes(property.keySize));
                property.localKeys.push_back(localKey);
            }
            property.objects.push_back(ReadContained(storage, ElementName(name, localKey), depth));
        }
        if (isSet) {
            CheckUnique(property.keys);
        }
    }

    void ReadWeakReference(StoredProperty& property, const Bytes& value) {
        ByteReader from(value);
        ReadTarget(property, from);
        ReadKeySize(property, from);
        property.keys.push_back(from.TakeBytes(property.keySize));
    }

    void ReadWeakIndex(StoredProperty& property) {
        ByteReader from(property.bytes);
        const auto count = from.TakeNumber<std::uint32_t>();
        ReadTarget(property, from);
        ReadKeySize(property, from);
        CheckCount(count, from.left(), property.keySize);
        for (std::uint32_t i = 0; i < count; ++i) {
            property.keys.push_back(from.TakeBytes(property.keySize));
        }
        if (property.form == StoredForm::WeakSet) {
            CheckUnique(property.keys);
        }
    }

    void ReadTarget(StoredProperty& property, ByteReader& from) {
        const auto tag = from.TakeNumber<std::uint16_t>();
        property.keyPid = from.TakeNumber<std::uint16_t>();
        if (tag >= paths_.size()) {
            throw StoredError("a weak reference has tag " + std::to_string(tag) +
                              ", the file has " + std::to_string(paths_.size()) + " paths");
        }
        property.targetPath = paths_[tag];
    }

    static void ReadKeySize(StoredProperty& property, ByteReader& from) {
        property.keySize = from.TakeNumber<std::uint8_t>();
        if (!IsKeySize(property.keySize)) {
            throw StoredError("a key of " + std::to_string(property.keySize) + " bytes");
        }
    }

    static void CheckCount(std::uint32_t count, std::size_t left, std::size_t each) {
        if (count > left / each) {
            throw StoredError("the index counts " + std::to_string(count) + " elements, " +
                              std::to_string(left) + " bytes left");
        }
    }

    static void CheckUnique(const std::vector<Bytes>& keys) {
        if (std::set<Bytes>(keys.begin(), keys.end()).size() != keys.size()) {
            throw StoredError("a set has a key twice");
        }
    }

    CompoundFileReader file_;
    std::vector<std::vector<std::uint16_t>> paths_;
    std::set<std::uint32_t> taken_;
};

}  // namespace

StoredObject ReadTree(const Bytes& file) {
    return TreeReader(file).Read();
}

}  // namespace aaf::stored
