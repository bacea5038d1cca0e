// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/stored/StoredTree.h"

namespace aaf::stored {

const StoredProperty* StoredObject::Find(std::uint16_t pid) const {
    for (const StoredProperty& property : properties) {
        if (property.pid == pid) {
            return &property;
        }
    }
    return nullptr;
}

bool operator==(const StoredObject& left, const StoredObject& right) {
    return left.classId == right.classId && left.properties == right.properties &&
           left.laidOut == right.laidOut;
}

bool operator==(const StoredProperty& left, const StoredProperty& right) {
    return left.pid == right.pid && left.form == right.form && left.name == right.name &&
           left.bytes == right.bytes && left.objects == right.objects && left.keys == right.keys &&
           left.keyPid == right.keyPid && left.keySize == right.keySize &&
           left.targetPath == right.targetPath && left.problem == right.problem;
}

}  // namespace aaf::stored
