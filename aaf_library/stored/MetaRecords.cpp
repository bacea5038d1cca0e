// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/stored/MetaRecords.h"

#include "aaf_library/stored/LittleEndian.h"
#include "aaf_library/stored/MetaKinds.h"

#include <algorithm>

namespace aaf::stored {

std::uint16_t TargetPidOf(TypeKind kind) {
    switch (kind) {
        case TypeKind::StrongReference:
            return meta::kStrongReferencedType;
        case TypeKind::WeakReference:
            return meta::kWeakReferencedType;
        case TypeKind::Enumeration:
            return meta::kEnumerationElementType;
        case TypeKind::FixedArray:
            return meta::kFixedArrayElementType;
        case TypeKind::VariableArray:
            return meta::kVariableArrayElementType;
        case TypeKind::Set:
            return meta::kSetElementType;
        case TypeKind::String:
            return meta::kStringElementType;
        case TypeKind::Rename:
            return meta::kRenamedType;
        default:
            return 0;
    }
}

static bool operator==(const MetaProperty& left, const MetaProperty& right) {
    return left.id == right.id && left.name == right.name && left.pid == right.pid &&
           left.type == right.type && left.optional == right.optional &&
           left.unique == right.unique;
}

static bool operator==(const MetaClass& left, const MetaClass& right) {
    return left.id == right.id && left.name == right.name && left.parent == right.parent &&
           left.concrete == right.concrete && left.properties == right.properties;
}

bool operator==(const MetaRecords& left, const MetaRecords& right) {
    return left.classes == right.classes && left.types == right.types &&
           left.builtInClasses == right.builtInClasses && left.builtInTypes == right.builtInTypes;
}

StoredAuid AuidOf(const GUID& id) {
    StoredAuid out;
    PutNumber(out.data(), static_cast<std::uint32_t>(id.Data1));
    PutNumber(out.data() + 4, static_cast<std::uint16_t>(id.Data2));
    PutNumber(out.data() + 6, static_cast<std::uint16_t>(id.Data3));
    std::copy(std::begin(id.Data4), std::end(id.Data4), out.begin() + 8);
    return out;
}

GUID GuidOf(const StoredAuid& id) {
    ByteReader from(id.data(), id.size());
    GUID out{};
    out.Data1 = from.TakeNumber<std::uint32_t>();
    out.Data2 = from.TakeNumber<std::uint16_t>();
    out.Data3 = from.TakeNumber<std::uint16_t>();
    std::copy(id.begin() + 8, id.end(), std::begin(out.Data4));
    return out;
}

GUID GuidOf(const Bytes& bytes) {
    StoredAuid id;
    if (bytes.size() != id.size()) {
        throw StoredError("an id of " + std::to_string(bytes.size()) + " bytes");
    }
    std::copy(bytes.begin(), bytes.end(), id.begin());
    return GuidOf(id);
}

}  // namespace aaf::stored
