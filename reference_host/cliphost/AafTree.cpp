// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/cliphost/AafTree.h"

#include <algorithm>
#include <map>

#include "host_interfaces/aaf/AAFDefinitions.h"
#include "host_interfaces/aaf/AAFDictionary.h"
#include "host_interfaces/aaf/AAFEffectDefinitions.h"
#include "host_interfaces/aaf/AAFMetaDefinitions.h"
#include "host_interfaces/aaf/AAFMobs.h"
#include "host_interfaces/aaf/AAFObjects.h"
#include "host_interfaces/aaf/AAFPluginDefinitions.h"
#include "host_interfaces/aaf/AAFTypeDefinitions.h"
#include "host_interfaces/aaf/AAFTypeDefinitionsOfMany.h"
#include "reference_host/cliphost/AafValue.h"

namespace cliphost {
namespace {

constexpr int kDeepest = 32;  // objects inside objects

TreeNode ReadObject(IAAFObject* object, int depth);

eAAFTypeCategory_t CategoryOf(IAAFTypeDef* type) {
    eAAFTypeCategory_t category = kAAFTypeCatUnknown;
    if (type) {
        type->GetTypeCategory(&category);
    }
    return category;
}

host::Ref<IAAFTypeDef> TypeOf(IAAFPropertyValue* value) {
    host::Ref<IAAFTypeDef> type;
    value->GetType(type.Out());
    return type;
}

// The object behind a strong reference.
host::Ref<IAAFObject> ObjectBehind(IAAFPropertyValue* value) {
    const auto type = TypeOf(value);
    const auto reference = As<IAAFTypeDefObjectRef>(type.get());
    host::Ref<IUnknown> target;
    if (reference) {
        reference->GetObject(value, IID_IUnknown, target.Out());
    }
    return As<IAAFObject>(target.get());
}

// Adds the objects that a property owns; false when it owns none.
bool ReadParts(IAAFPropertyValue* value, int depth, std::vector<TreeNode>& parts) {
    const auto type = TypeOf(value);
    const eAAFTypeCategory_t category = CategoryOf(type.get());
    if (category == kAAFTypeCatStrongObjRef) {
        if (const auto object = ObjectBehind(value)) {
            parts.push_back(ReadObject(object.get(), depth + 1));
        }
        return true;
    }
    host::Ref<IAAFTypeDef> elementType;
    host::Ref<IEnumAAFPropertyValues> elements;
    if (category == kAAFTypeCatVariableArray) {
        const auto array = As<IAAFTypeDefVariableArray>(type.get());
        if (array->GetType(elementType.Out()) < 0 ||
            CategoryOf(elementType.get()) != kAAFTypeCatStrongObjRef) {
            return false;
        }
        aafUInt32 count = 0;
        array->GetCount(value, &count);
        for (aafUInt32 i = 0; i < count; ++i) {
            host::Ref<IAAFPropertyValue> element;
            if (array->GetElementValue(value, i, element.Out()) >= 0) {
                ReadParts(element.get(), depth, parts);
            }
        }
        return true;
    }
    if (category == kAAFTypeCatSet) {
        const auto set = As<IAAFTypeDefSet>(type.get());
        if (set->GetElementType(elementType.Out()) < 0 ||
            CategoryOf(elementType.get()) != kAAFTypeCatStrongObjRef ||
            set->GetElements(value, elements.Out()) < 0) {
            return false;
        }
        host::Ref<IAAFPropertyValue> element;
        while (elements->NextOne(element.Out()) >= 0) {
            ReadParts(element.get(), depth, parts);
        }
        return true;
    }
    return false;
}

TreeNode ReadObject(IAAFObject* object, int depth) {
    TreeNode node;
    host::Ref<IAAFClassDef> definition;
    if (object->GetDefinition(definition.Out()) >= 0) {
        node.title = TextOf(definition.get(), &IAAFClassDef::GetNameBufLen, &IAAFClassDef::GetName);
    }
    host::Ref<IEnumAAFProperties> properties;
    if (depth > kDeepest || object->GetProperties(properties.Out()) < 0) {
        return node;
    }
    host::Ref<IAAFProperty> property;
    while (properties->NextOne(property.Out()) >= 0) {
        host::Ref<IAAFPropertyDef> propertyDefinition;
        host::Ref<IAAFPropertyValue> value;
        if (property->GetDefinition(propertyDefinition.Out()) < 0 ||
            property->GetValue(value.Out()) < 0) {
            continue;
        }
        const std::string name = TextOf(propertyDefinition.get(), &IAAFPropertyDef::GetNameBufLen,
                                        &IAAFPropertyDef::GetName);
        if (depth > 0 && name == "ObjClass") {
            continue;  // the title says it
        }
        std::vector<TreeNode> parts;
        if (ReadParts(value.get(), depth, parts)) {
            node.branches.push_back({name, std::move(parts)});
        } else if (name != "ObjClass") {
            node.facts.push_back({name, ValueText(value.get())});
        }
    }
    // The order of properties is the library's affair; ours is by name.
    std::stable_sort(node.facts.begin(), node.facts.end(),
                     [](const auto& a, const auto& b) { return a.name < b.name; });
    std::stable_sort(node.branches.begin(), node.branches.end(),
                     [](const auto& a, const auto& b) { return a.name < b.name; });
    return node;
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
    for (const auto& each : mobs) {
        if (const auto object = As<IAAFObject>(each.get())) {
            branch.nodes.push_back(ReadObject(object.get(), 0));
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

std::string ToReadableText(const TreeNode& tree, int indent) {
    std::map<std::string, std::string> numbers = {{ToText(aafMobID_t{}), "nil"}};
    TreeNode copy = tree;
    std::string text;
    for (TreeNode::Branch& branch : copy.branches) {
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
            text += ToText(mob, indent);
        }
    }
    return text;
}

}  // namespace cliphost
