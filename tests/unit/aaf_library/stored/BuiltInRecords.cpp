// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "tests/unit/aaf_library/stored/BuiltInRecords.h"

#include <string>

#include "aaf_library/stored/MetaClosure.h"
#include "aaf_library/stored/MetaPids.h"
#include "aaf_library/stored/TreeWriter.h"

namespace aaf::stored::sample {

namespace {

std::wstring wide(const char* ascii) {
    const std::string text(ascii);
    return std::wstring(text.begin(), text.end());
}

}  // namespace

MetaRecords BuiltInRecords() {
    MetaRecords records;
    std::uint16_t localPid = 0xFFFF;
    for (const BuiltInClass& entry : BuiltInClasses()) {
        MetaClass record{entry.id, wide(entry.name), entry.parent, entry.concrete, {}};
        for (const BuiltInProperty& property : entry.properties) {
            const std::uint16_t pid =
                property.key.pid != kNoPropertyId ? property.key.pid : localPid--;
            record.properties.push_back({property.key.id, wide(property.name), pid, property.type,
                                         property.optional, property.unique});
        }
        records.classes.push_back(record);
    }
    for (const BuiltInType& entry : BuiltInTypes()) {
        TypeFacts record;
        record.id = entry.id;
        record.name = wide(entry.symbol);
        record.kind = entry.kind;
        record.target = entry.target;
        record.size = entry.size;
        record.isSigned = entry.isSigned;
        for (const BuiltInMember& member : entry.members) {
            const bool named = entry.kind != TypeKind::WeakReference;
            record.members.push_back({named ? wide(member.name) : L"", member.id, member.value});
        }
        records.types.push_back(record);
    }
    return records;
}

Bytes FileOfDefinitions(Model& model, StoredObject (*dictionaryOf)(const MetaRecords&)) {
    MetaClosure closure(model);
    for (const BuiltInClass& entry : BuiltInClasses()) {
        closure.AddClass(entry.id);
    }
    for (const BuiltInType& entry : BuiltInTypes()) {
        closure.AddType(entry.id);
    }
    StoredProperty property;
    property.pid = meta::kRootMetaDictionary;
    property.form = StoredForm::StrongReference;
    property.name = u"MetaDictionary";
    property.objects = {dictionaryOf(closure.records())};
    StoredObject root;
    root.properties = {property};
    return WriteTree(root, SectorSize::Bytes512);
}

}  // namespace aaf::stored::sample
