// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/cliphost/AafTree.h"

#include <algorithm>
#include <map>
#include <unordered_map>

#include "host_interfaces/aaf/AAFMetaDefinitions.h"
#include "host_interfaces/aaf/AAFMobs.h"
#include "host_interfaces/aaf/AAFObjects.h"
#include "reference_host/cliphost/AafValue.h"

namespace cliphost {
namespace {

constexpr int kDeepest = 32;  // objects inside objects
constexpr std::size_t kUsualFacts = 12;

// The names of definitions, each asked for once.
template <class Definition>
class Names {
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
    std::unordered_map<Definition*, Named> names_;
};

// The order of properties is the library's affair; ours is by name.
template <class Item>
void InsertByName(Item item, std::vector<Item>& items) {
    const auto place =
        std::upper_bound(items.begin(), items.end(), item,
                         [](const Item& a, const Item& b) { return a.name < b.name; });
    items.insert(place, std::move(item));
}

class TreeReader {
public:
    TreeNode Read(IAAFObject* object, int depth);

private:
    void ReadProperty(IAAFProperty& property, int depth, TreeNode& node);

    ValueReader values_;
    Names<IAAFClassDef> classes_;
    Names<IAAFPropertyDef> properties_;
};

TreeNode TreeReader::Read(IAAFObject* object, int depth) {
    TreeNode node;
    host::Ref<IAAFClassDef> definition;
    if (object->GetDefinition(definition.Out()) >= 0) {
        node.title = classes_.Of(definition);
    }
    host::Ref<IEnumAAFProperties> properties;
    if (depth > kDeepest || object->GetProperties(properties.Out()) < 0) {
        return node;
    }
    node.facts.reserve(kUsualFacts);
    host::Ref<IAAFProperty> property;
    while (properties->NextOne(property.Out()) >= 0) {
        ReadProperty(*property, depth, node);
    }
    return node;
}

void TreeReader::ReadProperty(IAAFProperty& property, int depth, TreeNode& node) {
    host::Ref<IAAFPropertyDef> definition;
    host::Ref<IAAFPropertyValue> value;
    if (property.GetDefinition(definition.Out()) < 0 || property.GetValue(value.Out()) < 0) {
        return;
    }
    const std::string& name = properties_.Of(definition);
    if (depth > 0 && name == "ObjClass") {
        return;  // the title says it
    }
    std::vector<TreeNode> parts;
    if (values_.TakeObjects(
            value.get(), [&](IAAFObject* object) { parts.push_back(Read(object, depth + 1)); })) {
        InsertByName(TreeNode::Branch{name, std::move(parts)}, node.branches);
    } else if (name != "ObjClass") {
        InsertByName(TreeNode::Fact{name, values_.Text(value.get())}, node.facts);
    }
}

// Master, file, source: told by the byte in which their ids differ.
int PlaceOf(IAAFMob* mob) {
    aafMobID_t id{};
    mob->GetMobID(&id);
    return id.instanceHigh == 0x00 ? 0 : id.instanceHigh == 0xB1 ? 1 : 2;
}

}  // namespace

TreeNode ReadTree(IAAFFile* file) {
    TreeNode root;
    root.title = "AAF file";
    host::Ref<IAAFHeader> header;
    host::Ref<IEnumAAFMobs> enumerator;
    if (!file || file->GetHeader(header.Out()) < 0 ||
        header->GetMobs(nullptr, enumerator.Out()) < 0) {
        return root;
    }
    std::vector<host::Ref<IAAFMob>> mobs;
    host::Ref<IAAFMob> mob;
    while (enumerator->NextOne(mob.Out()) >= 0) {
        mobs.push_back(mob);
    }
    std::stable_sort(mobs.begin(), mobs.end(), [](const auto& a, const auto& b) {
        return PlaceOf(a.get()) < PlaceOf(b.get());
    });
    TreeNode::Branch branch{"Mobs", {}};
    TreeReader reader;
    for (const auto& each : mobs) {
        if (const auto object = As<IAAFObject>(each.get())) {
            branch.nodes.push_back(reader.Read(object.get(), 0));
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
