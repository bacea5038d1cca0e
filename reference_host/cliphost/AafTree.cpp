// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/cliphost/AafTree.h"

#include <algorithm>
#include <functional>
#include <map>
#include <string_view>
#include <unordered_map>
#include <utility>

#include "host_interfaces/aaf/AAFMetaDefinitions.h"
#include "host_interfaces/aaf/AAFMobs.h"
#include "host_interfaces/aaf/AAFObjects.h"
#include "reference_host/cliphost/AafValue.h"

namespace cliphost {
namespace {

constexpr int kDeepest = 32;  // objects inside objects
constexpr std::string_view kClassOfObject = "ObjClass";

}  // namespace

// The names of definitions, each asked for once.
template <class Definition>
class NamesOfDefinitions {
public:
    const std::string& Of(const host::Ref<Definition>& definition) {
        Named& named = names_[definition.get()];
        if (!named.definition) {
            named = {definition,
                     TextOf(definition.get(), &Definition::GetNameBufLen, &Definition::GetName)};
        }
        return named.name;
    }

private:
    struct Named {
        host::Ref<Definition> definition;  // so that no other comes to its place
        std::string name;
    };
    // A movie's description has some sixty definitions.
    std::unordered_map<Definition*, Named> names_{64};
};

class ObjectReader::TreeReader {
public:
    explicit TreeReader(LongValues longValues) : values_(longValues) {}

    void Read(IAAFObject* object, int depth, TreeNode& node);

private:
    struct Property {
        const std::string* name;
        host::Ref<IAAFPropertyValue> value;
    };
    // The order of properties is the library's affair; ours is by name. They come behind the open
    // ones.
    void OpenProperties(IAAFObject* object);
    void ReadProperty(const Property& property, int depth, TreeNode& node);

    ValueReader values_;
    NamesOfDefinitions<IAAFClassDef> classes_;
    NamesOfDefinitions<IAAFPropertyDef> properties_;
    // Of the object that is being read, behind those of the objects that it is part of.
    std::vector<Property> open_;
};

void ObjectReader::TreeReader::OpenProperties(IAAFObject* object) {
    host::Ref<IEnumAAFProperties> properties;
    if (object->GetProperties(properties.Out()) < 0) {
        return;
    }
    const auto first = static_cast<std::ptrdiff_t>(open_.size());
    host::Ref<IAAFProperty> property;
    host::Ref<IAAFPropertyDef> definition;
    host::Ref<IAAFPropertyValue> value;
    while (properties->NextOne(property.Out()) >= 0) {
        if (property->GetDefinition(definition.Out()) < 0 || property->GetValue(value.Out()) < 0) {
            continue;
        }
        const std::string& name = properties_.Of(definition);
        const auto place =
            std::upper_bound(open_.begin() + first, open_.end(), name,
                             [](const std::string& a, const Property& b) { return a < *b.name; });
        open_.insert(place, {&name, std::move(value)});
    }
}

void ObjectReader::TreeReader::Read(IAAFObject* object, int depth, TreeNode& node) {
    host::Ref<IAAFClassDef> definition;
    if (object->GetDefinition(definition.Out()) >= 0) {
        node.title = classes_.Of(definition);
    }
    if (depth > kDeepest) {
        node.isCut = true;
        return;
    }
    const std::size_t first = open_.size();
    OpenProperties(object);
    const std::size_t end = open_.size();
    node.facts.reserve(end - first);
    for (std::size_t i = first; i < end; ++i) {
        ReadProperty(std::exchange(open_[i], {}), depth, node);
    }
    open_.resize(first);
}

void ObjectReader::TreeReader::ReadProperty(const Property& property, int depth, TreeNode& node) {
    const bool isClass = *property.name == kClassOfObject;  // the title says it
    if (isClass && depth > 0) {
        return;
    }
    ValueType& type = values_.TypeOf(property.value.get());
    std::vector<TreeNode> parts;
    const auto read = [&](IAAFObject* part) { Read(part, depth + 1, parts.emplace_back()); };
    if (type.TakeObjects(property.value.get(), std::ref(read))) {
        node.branches.push_back({*property.name, std::move(parts), type.IsSet()});
    } else if (!isClass) {
        node.facts.push_back({*property.name, type.Text(property.value.get())});
    }
}

ObjectReader::ObjectReader(LongValues longValues)
    : reader_(std::make_unique<TreeReader>(longValues)) {}
ObjectReader::~ObjectReader() = default;

TreeNode ObjectReader::Read(IAAFObject* object) {
    TreeNode node;
    reader_->Read(object, 0, node);
    return node;
}

TreeNode ObjectReader::ReadAlone(IAAFObject* object) {
    TreeNode node;
    reader_->Read(object, kDeepest, node);
    node.branches.clear();
    return node;
}

namespace {

// Master, file, source: told by the byte in which their ids differ.
int PlaceOf(IAAFMob* mob) {
    aafMobID_t id{};
    mob->GetMobID(&id);
    return id.instanceHigh == 0x00 ? 0 : id.instanceHigh == 0xB1 ? 1 : 2;
}

}  // namespace

std::vector<host::Ref<IAAFMob>> MobsOf(IAAFFile* file) {
    std::vector<host::Ref<IAAFMob>> mobs;
    host::Ref<IAAFHeader> header;
    host::Ref<IEnumAAFMobs> enumerator;
    if (!file || file->GetHeader(header.Out()) < 0 ||
        header->GetMobs(nullptr, enumerator.Out()) < 0) {
        return mobs;
    }
    host::Ref<IAAFMob> mob;
    while (enumerator->NextOne(mob.Out()) >= 0) {
        mobs.push_back(mob);
    }
    std::stable_sort(mobs.begin(), mobs.end(), [](const auto& a, const auto& b) {
        return PlaceOf(a.get()) < PlaceOf(b.get());
    });
    return mobs;
}

TreeNode ReadTree(IAAFFile* file) {
    TreeNode root;
    root.title = "AAF file";
    TreeNode::Branch branch{"Mobs", {}};
    ObjectReader reader;
    for (const auto& each : MobsOf(file)) {
        if (const auto object = As<IAAFObject>(each.get())) {
            branch.nodes.push_back(reader.Read(object.get()));
        }
    }
    root.branches.push_back(std::move(branch));
    return root;
}

namespace {

// The name of a data definition without the prefix and id that all have.
std::string ShortDefinition(const std::string& value) {
    static const std::string kPrefix = "DataDef_";
    const std::size_t start = value.compare(0, kPrefix.size(), kPrefix) == 0 ? kPrefix.size() : 0;
    return value.substr(start, value.find(" {") - start);
}

void ReplaceIds(TreeNode& node, const std::map<std::string, std::string>& numbers) {
    for (TreeNode::Fact& fact : node.facts) {
        if (fact.name == "DataDefinition") {
            fact.value = ShortDefinition(fact.value);
        }
        const auto found = fact.name == "SourceID" ? numbers.find(fact.value) : numbers.end();
        if (found != numbers.end()) {
            fact.value = found->second;
        }
    }
    for (TreeNode::Branch& branch : node.branches) {
        for (TreeNode& child : branch.nodes) {
            ReplaceIds(child, numbers);
        }
    }
}

}  // namespace

std::string ToReadableText(TreeNode tree, int indent) {
    std::map<std::string, std::string> numbers = {{ToText(aafMobID_t{}), "nil"}};
    std::string text;
    for (TreeNode::Branch& branch : tree.branches) {
        for (std::size_t i = 0; i < branch.nodes.size(); ++i) {
            const std::string number = "mob " + std::to_string(i + 1);
            for (const TreeNode::Fact& fact : branch.nodes[i].facts) {
                if (fact.name == "MobID") {
                    numbers[fact.value] = number;
                }
            }
            branch.nodes[i].title = number + ": " + branch.nodes[i].title;
        }
        for (TreeNode& mob : branch.nodes) {
            ReplaceIds(mob, numbers);
            AppendText(mob, indent, text);
        }
    }
    return text;
}

}  // namespace cliphost
