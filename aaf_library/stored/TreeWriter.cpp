// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/stored/TreeWriter.h"

#include "aaf_library/stored/LittleEndian.h"
#include "aaf_library/stored/PropertyFormat.h"
#include "aaf_library/stored/StoredNames.h"

#include <algorithm>
#include <array>
#include <deque>
#include <map>
#include <numeric>
#include <optional>

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

constexpr std::size_t kLargestValue = 0xFFFF;
constexpr std::size_t kEntrySize = 6;

// The table of paths to the sets that weak references lead to. A path gets
// its tag when it is used first.
class TargetPaths {
public:
    std::uint16_t tag(const TargetPath& path) {
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

    void BeginWith(const std::vector<TargetPath>& paths) {
        const bool isBegun =
            paths.size() <= paths_.size() && std::equal(paths.begin(), paths.end(), paths_.begin());
        for (std::size_t i = 0; !isBegun && i < paths.size(); ++i) {
            if (tag(paths[i]) != i) {
                throw StoredError("an object was laid out for another table of targets");
            }
        }
    }

    Bytes Table() const {
        ByteWriter pids;
        for (const TargetPath& path : paths_) {
            for (std::uint16_t pid : path) {
                pids.AppendNumber(pid);
            }
            pids.AppendNumber(std::uint16_t{0});
        }
        return ByteWriter()
            .AppendNumber(kLittleEndianMark)
            .AppendNumber(static_cast<std::uint16_t>(paths_.size()))
            .AppendNumber(static_cast<std::uint32_t>(pids.bytes().size() / 2))
            .Append(pids.bytes())
            .bytes();
    }

private:
    std::vector<TargetPath> paths_;
    std::map<TargetPath, std::uint16_t> tags_;
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

    // The value is what `append` writes.
    template <class Append>
    void Add(const StoredProperty& property, const Append& append) {
        const std::size_t before = values.bytes().size();
        append(values);
        const std::size_t size = values.bytes().size() - before;
        if (size > kLargestValue) {
            throw StoredError(std::to_string(size) + " bytes, a value may take " +
                              std::to_string(kLargestValue));
        }
        std::array<std::uint8_t, kEntrySize> entry;
        PutNumber(entry.data(), property.pid);
        PutNumber(entry.data() + 2, static_cast<std::uint16_t>(property.form));
        PutNumber(entry.data() + 4, static_cast<std::uint16_t>(size));
        entries.Append(entry);
        ++count;
    }
    void AddName(const StoredProperty& property, const std::u16string& name) {
        Add(property, [&](ByteWriter& value) { value.AppendText(name); });
    }

    // Keeps its room.
    void Clear() {
        entries.Clear();
        values.Clear();
        count = 0;
        children.clear();
        streams.clear();
    }
};

std::uint8_t CheckedKeySize(const StoredProperty& property) {
    if (!IsKeySize(property.keySize)) {
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

    CompoundFileWriter& Write(const StoredObject& root) {
        Fill(CompoundFileWriter::kRoot, root, 0);
        // Tags are handed out on the way, so the table comes last. Readers
        // want it, even without a path in it.
        file_.AddStream(CompoundFileWriter::kRoot, kReferencedPropertiesStream, paths_.Table());
        return file_;
    }

    std::shared_ptr<const LaidOut> LayOut(const StoredObject& object,
                                          const std::vector<TargetPath>& paths,
                                          CompoundPlace place) {
        paths_.BeginWith(paths);
        Fill(CompoundFileWriter::kRoot, object, 0);
        std::optional<CompoundPart> part = file_.FinishPart(place);
        return part ? std::make_shared<const LaidOut>(LaidOut{std::move(*part), paths}) : nullptr;
    }

private:
    using Storage = CompoundFileWriter::Storage;

    void Fill(Storage storage, const StoredObject& object, int depth) {
        if (depth > kMaximumDepth) {
            throw StoredError("objects are nested too deep");
        }
        Layout& layout = LayoutFor(depth);
        const std::optional<std::uint16_t> twice = PidThatOccursTwice(object);
        for (const StoredProperty& property : object.properties) {
            try {
                if (property.pid == twice) {
                    throw StoredError("occurs twice in one object");
                }
                AddProperty(layout, property);
            } catch (const StoredError& problem) {
                throw StoredError(PropertyText(property.pid) + ": " + problem.what());
            }
        }
        WriteLayout(storage, object, layout, depth);
    }

    // One for each depth: those of the holders are still being gone through.
    Layout& LayoutFor(int depth) {
        const auto at = static_cast<std::size_t>(depth);
        while (layouts_.size() <= at) {
            layouts_.emplace_back();
        }
        layouts_[at].Clear();
        return layouts_[at];
    }

    std::optional<std::uint16_t> PidThatOccursTwice(const StoredObject& object) {
        pids_.clear();
        for (const StoredProperty& property : object.properties) {
            pids_.push_back(property.pid);
        }
        std::sort(pids_.begin(), pids_.end());
        const auto twice = std::adjacent_find(pids_.begin(), pids_.end());
        return twice == pids_.end() ? std::nullopt : std::make_optional(*twice);
    }

    void WriteLayout(Storage storage, const StoredObject& object, const Layout& layout, int depth) {
        file_.SetClass(storage, object.classId);
        properties_.Clear();
        properties_.AppendNumber(kLittleEndianMark)
            .AppendNumber(kPropertiesVersion)
            .AppendNumber(static_cast<std::uint16_t>(layout.count))
            .Append(layout.entries.bytes())
            .Append(layout.values.bytes());
        file_.AddStream(storage, propertiesName_, properties_.bytes());
        for (const Layout::Stream& stream : layout.streams) {
            file_.AddStream(storage, stream.name, stream.borrowed ? *stream.borrowed : stream.made);
        }
        for (const Layout::Child& child : layout.children) {
            if (const LaidOut* const known = child.object->laidOut.get()) {
                paths_.BeginWith(known->paths);
                file_.AddPart(storage, child.name, known->part);
                continue;
            }
            const Storage contained = file_.AddStorage(storage, child.name);
            try {
                Fill(contained, *child.object, depth + 1);
            } catch (const TooLargeError&) {
                throw;  // the file's fault, not the object's
            } catch (const StoredError& problem) {
                throw StoredError(ToUtf8(child.name) + ": " + problem.what());
            }
        }
    }

    void AddProperty(Layout& layout, const StoredProperty& property) {
        switch (property.form) {
            case StoredForm::StrongReference:
                return AddStrongReference(layout, property);
            case StoredForm::StrongVector:
                return AddStrongVector(layout, property);
            case StoredForm::StrongSet:
                return AddStrongSet(layout, property);
            default:
                break;
        }
        if (!property.problem.empty()) {
            return AddAsItStands(layout, property);
        }
        switch (property.form) {
            case StoredForm::WeakReference:
                return AddWeakReference(layout, property);
            case StoredForm::WeakVector:
            case StoredForm::WeakSet:
                return AddWeakCollection(layout, property);
            case StoredForm::Stream:
                return AddStream(layout, property);
            default:
                return AddData(layout, property);
        }
    }

    static void AddData(Layout& layout, const StoredProperty& property) {
        if (!property.bytes.empty()) {
            layout.Add(property, [&](ByteWriter& value) { value.Append(property.bytes); });
        }
    }

    // Something that a reader made no sense of; so will others.
    static void AddAsItStands(Layout& layout, const StoredProperty& property) {
        const bool isStream = property.form == StoredForm::Stream;
        if (property.name.empty()) {
            return AddData(layout, property);
        }
        const std::u16string name = isStream ? SingleName(property.name, property.pid)
                                             : CollectionName(property.name, property.pid);
        layout.Add(property, [&](ByteWriter& value) {
            if (isStream) {
                value.AppendNumber(kStreamMark);
            }
            value.AppendText(name);
        });
        if (!property.bytes.empty()) {
            layout.streams.push_back({isStream ? name : IndexName(name), {}, &property.bytes});
        }
    }

    static void AddStrongReference(Layout& layout, const StoredProperty& property) {
        if (property.objects.size() != 1) {
            throw StoredError("a strong reference holds one object, not " +
                              std::to_string(property.objects.size()));
        }
        const std::u16string name = SingleName(property.name, property.pid);
        layout.AddName(property, name);
        layout.children.push_back({name, &property.objects.front()});
    }

    static void AddStrongVector(Layout& layout, const StoredProperty& property) {
        const std::u16string name = CollectionName(property.name, property.pid);
        const auto count = static_cast<std::uint32_t>(property.objects.size());
        ByteWriter index;
        index.AppendNumber(count).AppendNumber(count).AppendNumber(kNoLastFreeKey);
        for (std::uint32_t i = 0; i < count; ++i) {
            index.AppendNumber(i);
            layout.children.push_back({ElementName(name, i), &property.objects[i]});
        }
        layout.AddName(property, name);
        layout.streams.push_back({IndexName(name), index.Take(), nullptr});
    }

    static void AddStrongSet(Layout& layout, const StoredProperty& property) {
        const std::u16string name = CollectionName(property.name, property.pid);
        const std::vector<std::size_t> order = KeyOrder(property);
        const auto count = static_cast<std::uint32_t>(order.size());
        const bool isNumbered = property.localKeys.size() == order.size() && count != 0;
        const std::uint32_t firstFree =
            isNumbered ? *std::max_element(property.localKeys.begin(), property.localKeys.end()) + 1
                       : count;
        ByteWriter index;
        index.AppendNumber(count).AppendNumber(firstFree).AppendNumber(kNoLastFreeKey);
        index.AppendNumber(property.keyPid).AppendNumber(CheckedKeySize(property));
        for (std::uint32_t i = 0; i < count; ++i) {
            const StoredObject& object = property.objects[order[i]];
            const Bytes& key = property.keys[order[i]];
            const StoredProperty* stored = object.Find(property.keyPid);
            const bool hasKey =
                object.laidOut != nullptr || (stored != nullptr && stored->bytes == key);
            if (!hasKey && property.problem.empty()) {
                throw StoredError("an element does not store its key");
            }
            const std::uint32_t localKey = isNumbered ? property.localKeys[order[i]] : i;
            index.AppendNumber(localKey).AppendNumber(kSetReferenceCount).Append(key);
            layout.children.push_back({ElementName(name, localKey), &object});
        }
        layout.AddName(property, name);
        layout.streams.push_back({IndexName(name), index.Take(), nullptr});
    }

    // The places of the elements in the order of their keys, which are unique.
    static std::vector<std::size_t> KeyOrder(const StoredProperty& property) {
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

    void AddWeakReference(Layout& layout, const StoredProperty& property) {
        if (property.keys.size() != 1) {
            throw StoredError("a weak reference has one key, not " +
                              std::to_string(property.keys.size()));
        }
        const std::uint16_t tag = paths_.tag(property.targetPath);
        const std::uint8_t keySize = CheckedKeySize(property);
        layout.Add(property, [&](ByteWriter& value) {
            value.AppendNumber(tag).AppendNumber(property.keyPid).AppendNumber(keySize);
            value.Append(property.keys.front());
        });
    }

    void AddWeakCollection(Layout& layout, const StoredProperty& property) {
        if (property.keys.empty()) {
            return;
        }
        const std::u16string name = CollectionName(property.name, property.pid);
        ByteWriter index;
        index.AppendNumber(static_cast<std::uint32_t>(property.keys.size()));
        index.AppendNumber(paths_.tag(property.targetPath)).AppendNumber(property.keyPid);
        index.AppendNumber(CheckedKeySize(property));
        for (const Bytes& key : InOrder(property)) {
            index.Append(key);
        }
        layout.AddName(property, name);
        layout.streams.push_back({IndexName(name), index.Take(), nullptr});
    }

    static std::vector<Bytes> InOrder(const StoredProperty& property) {
        std::vector<Bytes> keys = property.keys;
        if (property.form == StoredForm::WeakSet) {
            std::sort(keys.begin(), keys.end());
            if (std::adjacent_find(keys.begin(), keys.end()) != keys.end()) {
                throw StoredError("a set refers twice to one object");
            }
        }
        return keys;
    }

    static void AddStream(Layout& layout, const StoredProperty& property) {
        if (property.bytes.empty()) {
            return;
        }
        const std::u16string name = SingleName(property.name, property.pid);
        layout.Add(property,
                   [&](ByteWriter& value) { value.AppendNumber(kStreamMark).AppendText(name); });
        layout.streams.push_back({name, {}, &property.bytes});
    }

    CompoundFileWriter file_;
    TargetPaths paths_;
    // Kept for their room.
    std::deque<Layout> layouts_;
    std::vector<std::uint16_t> pids_;
    ByteWriter properties_;
    const std::u16string propertiesName_ = kPropertiesStream;
};

}  // namespace

Bytes WriteTree(const StoredObject& root, SectorSize sectorSize) {
    return TreeWriter(sectorSize).Write(root).Finish();
}

std::vector<Piece> WriteTreeInPieces(const StoredObject& root, SectorSize sectorSize) {
    return TreeWriter(sectorSize).Write(root).FinishPieces();
}

std::shared_ptr<const LaidOut> LayOut(const StoredObject& object,
                                      const std::vector<TargetPath>& paths, CompoundPlace place) {
    try {
        return TreeWriter(SectorSize::Bytes512).LayOut(object, paths, place);
    } catch (const TooLargeError&) {
        return nullptr;  // the file that it goes into tells
    }
}

}  // namespace aaf::stored
