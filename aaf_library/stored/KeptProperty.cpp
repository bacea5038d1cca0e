// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/stored/KeptProperty.h"

#include "aaf_library/model/PropertyKeys.h"
#include "aaf_library/stored/LittleEndian.h"
#include "aaf_library/stored/MetaPids.h"
#include "aaf_library/stored/MetaRecords.h"
#include "aaf_library/stored/ModelTypes.h"
#include "aaf_library/stored/StoredNames.h"

namespace aaf::stored {

namespace {

// The definitions of the file's dictionary that a property refers to.
void AddTargets(const StoredProperty& property, KeptProperty& kept) {
    const std::vector<std::uint16_t>& path = property.targetPath;
    if (path.size() != 3 || path[0] != meta::kRootHeader ||
        path[1] != prop::Header_Dictionary.pid) {
        return;
    }
    for (const Bytes& key : property.keys) {
        if (key.size() == sizeof(StoredAuid)) {
            kept.targets.emplace_back(path[2], GuidOf(key));
        }
    }
}

}  // namespace

std::shared_ptr<const KeptProperty> Keep(const StoredProperty& property,
                                         const IdOfProperty& idOfProperty) {
    const auto kept = std::make_shared<KeptProperty>();
    kept->property = property;
    if (!property.objects.empty()) {
        kept->property.problem = "kept as it stands";  // its keys may not be those of its objects
    }
    AddTargets(property, *kept);
    ForEachObject(kept->property, [&](const StoredObject& object) {
        for (const StoredProperty& inner : object.properties) {
            AddTargets(inner, *kept);
            if (inner.pid >= kFirstLocalPid) {
                kept->numbers.emplace(inner.pid, idOfProperty(object, inner.pid));
            }
        }
    });
    return kept;
}

Bytes BytesToShow(const StoredProperty& property) {
    if (!property.bytes.empty()) {
        return property.bytes;
    }
    if (!property.name.empty()) {
        return ByteWriter().AppendText(SingleName(property.name, property.pid)).bytes();
    }
    Bytes keys;
    for (const Bytes& key : property.keys) {
        keys.insert(keys.end(), key.begin(), key.end());
    }
    return keys;
}

void ForEachObject(StoredProperty& property, const std::function<void(StoredObject&)>& call) {
    for (StoredObject& object : property.objects) {
        call(object);
        for (StoredProperty& inner : object.properties) {
            ForEachObject(inner, call);
        }
    }
}

}  // namespace aaf::stored
