// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/stored/MetaRecords.h"

#include "aaf_library/stored/LittleEndian.h"
#include "aaf_library/stored/MetaKinds.h"

#include <algorithm>

namespace aaf::stored {

namespace {

// Classes of the meta model differ in one group of their ids.
GUID metaClass(std::uint16_t number) {
    GUID id = ncfGuid("0D010101-0000-0000-060E-2B3402060101");
    id.Data2 = number;
    return id;
}

constexpr TypeKindClass typeKinds[] = {
    {TypeKind::Integer, 0x0204, 0},
    {TypeKind::StrongReference, 0x0205, meta::strongReferencedType},
    {TypeKind::WeakReference, 0x0206, meta::weakReferencedType},
    {TypeKind::Enumeration, 0x0207, meta::enumerationElementType},
    {TypeKind::FixedArray, 0x0208, meta::fixedArrayElementType},
    {TypeKind::VariableArray, 0x0209, meta::variableArrayElementType},
    {TypeKind::Set, 0x020A, meta::setElementType},
    {TypeKind::String, 0x020B, meta::stringElementType},
    {TypeKind::Stream, 0x020C, 0},
    {TypeKind::Record, 0x020D, 0},
    {TypeKind::Rename, 0x020E, meta::renamedType},
    {TypeKind::ExtendibleEnumeration, 0x0220, 0},
    {TypeKind::Indirect, 0x0221, 0},
    {TypeKind::Opaque, 0x0222, 0},
    {TypeKind::Character, 0x0223, 0},
};

}  // namespace

const GUID classDefinitionClass = metaClass(0x0201);
const GUID propertyDefinitionClass = metaClass(0x0202);
const GUID metaDictionaryClass = metaClass(0x0225);

Span<TypeKindClass> allKindClasses() {
    return typeKinds;
}

const TypeKindClass& kindClass(TypeKind kind) {
    return *std::find_if(std::begin(typeKinds), std::end(typeKinds),
                         [&](const TypeKindClass& entry) { return entry.kind == kind; });
}

const TypeKindClass* findKindClass(const GUID& definitionClass) {
    for (const TypeKindClass& entry : typeKinds) {
        if (metaClass(entry.classNumber) == definitionClass) {
            return &entry;
        }
    }
    return nullptr;
}

GUID typeDefinitionClass(TypeKind kind) {
    return metaClass(kindClass(kind).classNumber);
}

StoredAuid storedAuid(const GUID& id) {
    const Bytes bytes = ByteWriter()
                            .number(static_cast<std::uint32_t>(id.Data1))
                            .number(static_cast<std::uint16_t>(id.Data2))
                            .number(static_cast<std::uint16_t>(id.Data3))
                            .bytes();
    StoredAuid out;
    std::copy(bytes.begin(), bytes.end(), out.begin());
    std::copy(std::begin(id.Data4), std::end(id.Data4), out.begin() + 8);
    return out;
}

GUID guidOf(const StoredAuid& id) {
    ByteReader from(id.data(), id.size());
    GUID out{};
    out.Data1 = from.number<std::uint32_t>();
    out.Data2 = from.number<std::uint16_t>();
    out.Data3 = from.number<std::uint16_t>();
    std::copy(id.begin() + 8, id.end(), std::begin(out.Data4));
    return out;
}

GUID guidOf(const Bytes& bytes) {
    StoredAuid id;
    if (bytes.size() != id.size()) {
        throw StoredError("an id of " + std::to_string(bytes.size()) + " bytes");
    }
    std::copy(bytes.begin(), bytes.end(), id.begin());
    return guidOf(id);
}

}  // namespace aaf::stored
