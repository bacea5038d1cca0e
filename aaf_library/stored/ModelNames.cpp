// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/stored/ModelNames.h"

#include "aaf_library/model/Text.h"
#include "aaf_library/model/TypeDefinition.h"
#include "aaf_library/stored/LittleEndian.h"
#include "text/Encodings.h"

namespace aaf::stored {

std::u16string Utf16Of(const std::wstring& text) {
    return encodings::ToUtf16Lossy(encodings::FromWide(text));
}

std::wstring WideOf(const std::u16string& text) {
    ByteWriter stored;
    for (char16_t unit : text) {
        stored.AppendNumber(static_cast<std::uint16_t>(unit));
    }
    return FromUtf16(stored.bytes().data(), stored.bytes().size());
}

std::string ToUtf8(const std::wstring& text) {
    return ToUtf8(Utf16Of(text));
}

StoredForm StoredFormOf(const TypeDefinition& type) {
    switch (type.form()) {
        case ValueForm::Stream:
            return StoredForm::Stream;
        case ValueForm::StrongReference:
            return StoredForm::StrongReference;
        case ValueForm::StrongVector:
            return StoredForm::StrongVector;
        case ValueForm::StrongSet:
            return StoredForm::StrongSet;
        case ValueForm::WeakReference:
            return StoredForm::WeakReference;
        case ValueForm::WeakVector:
            return StoredForm::WeakVector;
        case ValueForm::WeakSet:
            return StoredForm::WeakSet;
        case ValueForm::Data:
            break;
    }
    return StoredForm::Data;
}

const TypeDefinition& ReferenceIn(const TypeDefinition& type) {
    const TypeDefinition& plain = type.Resolved();
    const bool isCollection =
        plain.kind() == TypeKind::VariableArray || plain.kind() == TypeKind::Set;
    return isCollection && plain.element() != nullptr ? plain.element()->Resolved() : plain;
}

}  // namespace aaf::stored
