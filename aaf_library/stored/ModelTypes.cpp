// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/stored/ModelTypes.h"

#include "aaf_library/model/Model.h"

namespace aaf::stored {

namespace {

// A property value has a size field of 16 bits.
constexpr std::uint64_t kLargestValue = 0xFFFF;

}  // namespace

bool IsStorable(const TypeFacts& record, Model& model) {
    const TypeDefinition* target = model.FindType(record.target);
    switch (record.kind) {
        case TypeKind::Integer:
            return record.size == 1 || record.size == 2 || record.size == 4 || record.size == 8;
        case TypeKind::Enumeration:
            return target != nullptr && target->Resolved().kind() == TypeKind::Integer;
        case TypeKind::FixedArray: {
            const std::uint64_t size =
                target == nullptr ? 0 : std::uint64_t{record.size} * target->StoredSize();
            return size != 0 && size <= kLargestValue;
        }
        case TypeKind::Record: {
            std::uint64_t size = 0;
            for (const TypeMember& entry : record.members) {
                const TypeDefinition* member = model.FindType(entry.id);
                if (member == nullptr || member->StoredSize() == 0) {
                    return false;
                }
                size += member->StoredSize();
            }
            return size != 0 && size <= kLargestValue;
        }
        default:
            return true;
    }
}

RefPtr<TypeDefinition> StorableType(const TypeFacts& record, Model& model) {
    return IsStorable(record, model) ? MakeType(model, record) : nullptr;
}

}  // namespace aaf::stored
