// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/model/TypeOfElements.h"

#include "aaf_library/model/Enumerator.h"
#include "aaf_library/model/Model.h"
#include "aaf_library/model/StoredNumbers.h"
#include "aaf_library/model/Text.h"

namespace aaf {

HRESULT TypeOfElements::SetupElement(const GUID& id, const std::wstring& name,
                                     TypeDefinition& element) {
    const HRESULT result = SetIdentity(id, name);
    if (result >= 0) {
        element_ = &element;
        model()->KeepType(element);
    }
    return result;
}

HRESULT TypeOfElements::CheckElement(IAAFTypeDef* typeDef, aafCharacter_constptr typeName,
                                     TypeDefinition** element) const {
    if (typeDef == nullptr || typeName == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    *element = TypeOf(typeDef, model());
    if (*element == nullptr || *element == this || !(*element)->IsInitialized()) {
        return AAFRESULT_BAD_TYPE;
    }
    const ValueForm form = (*element)->form();
    const bool single = form == ValueForm::StrongReference || form == ValueForm::WeakReference ||
                        (form == ValueForm::Data && (*element)->StoredSize() > 0);
    return single ? AAFRESULT_SUCCESS : AAFRESULT_BAD_TYPE;
}

bool TypeOfElements::HasObjects() const {
    return element_ != nullptr && element_->form() == ValueForm::StrongReference;
}

std::size_t TypeOfElements::ElementSize() const {
    if (element_ == nullptr) {
        return 0;
    }
    return element_->form() == ValueForm::WeakReference ? kGuidSize : element_->StoredSize();
}

HRESULT TypeOfElements::Encode(const void* native, std::size_t bytes, Bytes& out) const {
    const std::size_t size = element_ == nullptr ? 0 : element_->NativeSize();
    if (size == 0 || bytes % size != 0) {
        return AAFRESULT_BAD_SIZE;
    }
    const auto* at = static_cast<const std::uint8_t*>(native);
    if (element_->Resolved().kind() == TypeKind::Character) {
        std::wstring text(bytes / size, L'\0');
        std::memcpy(&text[0], native, bytes);
        AppendUtf16(text.data(), text.size(), out);
        return AAFRESULT_SUCCESS;
    }
    for (std::size_t done = 0; done < bytes; done += size) {
        element_->AppendStored(at + done, out);
    }
    return AAFRESULT_SUCCESS;
}

std::size_t TypeOfElements::DecodedSize(const std::uint8_t* stored, std::size_t size) const {
    if (ElementSize() == 0 || element_->form() != ValueForm::Data) {
        return 0;
    }
    if (element_->Resolved().kind() == TypeKind::Character) {
        return FromUtf16(stored, size).size() * sizeof(aafCharacter);
    }
    return size / ElementSize() * element_->NativeSize();
}

HRESULT TypeOfElements::Decode(const std::uint8_t* stored, std::size_t size, void* native,
                               std::size_t bytes) const {
    const std::size_t needed = DecodedSize(stored, size);
    if (bytes < needed || element_ == nullptr || element_->form() != ValueForm::Data) {
        return AAFRESULT_BAD_SIZE;
    }
    if (element_->Resolved().kind() == TypeKind::Character) {
        const std::wstring text = FromUtf16(stored, size);
        std::memcpy(native, text.data(), needed);
        return AAFRESULT_SUCCESS;
    }
    if (element_->NativeSize() == 0 && size != 0) {
        return AAFRESULT_BAD_SIZE;  // the elements have no layout
    }
    auto* at = static_cast<std::uint8_t*>(native);
    for (std::size_t i = 0; i < size / ElementSize(); ++i) {
        element_->CopyNative(stored + i * ElementSize(), at + i * element_->NativeSize());
    }
    return AAFRESULT_SUCCESS;
}

std::size_t TypeOfElements::CountOf(const PropertyValue& value) const {
    if (HasObjects()) {
        return value.objects().size();
    }
    return ElementSize() == 0 ? 0 : value.bytes().size() / ElementSize();
}

HRESULT TypeOfElements::GiveElement(const PropertyValue& value, std::size_t index,
                                    IAAFPropertyValue** out) const {
    if (index >= CountOf(value)) {
        return AAFRESULT_BADINDEX;
    }
    if (HasObjects()) {
        RefPtr<PropertyValue> element = element_->NewValue();
        element->InsertObject(0, value.objects()[index].get());
        return GiveOut(element.get(), out);
    }
    const auto size = static_cast<std::ptrdiff_t>(ElementSize());
    const auto first = value.bytes().begin() + static_cast<std::ptrdiff_t>(index) * size;
    return GiveValue(*element_, Bytes(first, first + size), out);
}

HRESULT TypeOfElements::GiveElements(PropertyValue& value, IEnumAAFPropertyValues** enumerator) {
    return MakeEnumerator<IAAFPropertyValue>(
        [list = RefPtr<PropertyValue>(&value),
         type = RefPtr<TypeOfElements>(this)](std::size_t index) -> RefPtr<Unknown> {
            IAAFPropertyValue* element = nullptr;
            if (type->GiveElement(*list, index, &element) < 0) {
                return nullptr;
            }
            const auto held = RefPtr<IAAFPropertyValue>::Adopt(element);
            return RefPtr<Unknown>(ImplementationOf(element));
        },
        enumerator);
}

HRESULT TypeOfElements::TakeElement(IAAFPropertyValue* argument, PropertyValue** element) const {
    if (argument == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    if (!IsInitialized()) {
        return AAFRESULT_NOT_INITIALIZED;
    }
    *element = ImplementationAs<PropertyValue>(argument);
    if (*element == nullptr || (*element)->model() != model() ||
        (*element)->type().form() != element_->form()) {
        return AAFRESULT_BAD_TYPE;
    }
    const bool complete =
        HasObjects() ? !(*element)->objects().empty() : (*element)->bytes().size() == ElementSize();
    return complete ? AAFRESULT_SUCCESS : AAFRESULT_BAD_TYPE;
}

HRESULT TypeOfElements::InsertElementAt(PropertyValue& value, std::size_t index,
                                        const PropertyValue& element) {
    if (index > CountOf(value)) {
        return AAFRESULT_BADINDEX;
    }
    if (HasObjects()) {
        return value.InsertObject(index, element.objects().front().get());
    }
    const Bytes added = element.bytes();
    value.BytesToChange().insert(
        value.bytes().begin() + static_cast<std::ptrdiff_t>(index * ElementSize()), added.begin(),
        added.end());
    return AAFRESULT_SUCCESS;
}

HRESULT TypeOfElements::EraseElement(PropertyValue& value, std::size_t index) {
    if (index >= CountOf(value)) {
        return AAFRESULT_BADINDEX;
    }
    if (HasObjects()) {
        value.RemoveObjectAt(index);
        return AAFRESULT_SUCCESS;
    }
    const auto first = value.bytes().begin() + static_cast<std::ptrdiff_t>(index * ElementSize());
    value.BytesToChange().erase(first, first + static_cast<std::ptrdiff_t>(ElementSize()));
    return AAFRESULT_SUCCESS;
}

HRESULT TypeOfElements::ReplaceElement(PropertyValue& value, std::size_t index,
                                       const PropertyValue& element) {
    if (index >= CountOf(value)) {
        return AAFRESULT_BADINDEX;
    }
    // The new one first, so that a refusal leaves the list as it was.
    const HRESULT result = InsertElementAt(value, index, element);
    return result < 0 ? result : EraseElement(value, index + 1);
}

HRESULT TypeOfElements::FillFromValues(PropertyValue& value, IAAFPropertyValue** elements,
                                       aafUInt32 count) {
    for (aafUInt32 i = 0; i < count; ++i) {
        PropertyValue* element = nullptr;
        HRESULT result = TakeElement(elements[i], &element);
        if (result >= 0) {
            result = InsertElementAt(value, i, *element);
        }
        if (result < 0) {
            return result;
        }
    }
    return AAFRESULT_SUCCESS;
}

HRESULT TypeOfElements::TakeBoth(IAAFPropertyValue* list, IAAFPropertyValue* member,
                                 PropertyValue** value, PropertyValue** element) const {
    if (member == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    const HRESULT result = Take(list, value);
    return result < 0 ? result : TakeElement(member, element);
}

HRESULT TypeOfElements::GiveElementType(IAAFTypeDef** typeDef) const {
    if (typeDef == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    return element_ == nullptr ? AAFRESULT_NOT_INITIALIZED : GiveOut(element_, typeDef);
}

HRESULT TypeOfElements::ElementsOf(IAAFPropertyValue* list, IEnumAAFPropertyValues** enumerator) {
    PropertyValue* value = nullptr;
    if (enumerator == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    const HRESULT result = Take(list, &value);
    return result < 0 ? result : GiveElements(*value, enumerator);
}

HRESULT TypeOfElements::ElementOf(IAAFPropertyValue* list, aafUInt32 index,
                                  IAAFPropertyValue** out) const {
    PropertyValue* value = nullptr;
    if (out == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    const HRESULT result = Take(list, &value);
    return result < 0 ? result : GiveElement(*value, index, out);
}

HRESULT TypeOfElements::SetElement(IAAFPropertyValue* list, aafUInt32 index,
                                   IAAFPropertyValue* member) {
    PropertyValue* value = nullptr;
    PropertyValue* element = nullptr;
    const HRESULT result = TakeBoth(list, member, &value, &element);
    return result < 0 ? result : ReplaceElement(*value, index, *element);
}

HRESULT TypeOfElements::ValueFromValues(IAAFPropertyValue** elements, aafUInt32 count,
                                        IAAFPropertyValue** out) {
    if (elements == nullptr || out == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    if (!IsInitialized()) {
        return AAFRESULT_NOT_INITIALIZED;
    }
    if (!MayHold(count)) {
        return AAFRESULT_ILLEGAL_VALUE;
    }
    RefPtr<PropertyValue> value = NewValue();
    value->BytesToChange().clear();
    const HRESULT result = FillFromValues(*value, elements, count);
    return result < 0 ? result : GiveOut(value.get(), out);
}

HRESULT TypeOfElements::ValueFromArray(aafMemPtr_t data, aafUInt32 bytes, IAAFPropertyValue** out) {
    if (data == nullptr || out == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    if (!IsInitialized()) {
        return AAFRESULT_NOT_INITIALIZED;
    }
    if (form() != ValueForm::Data) {
        return AAFRESULT_BAD_TYPE;
    }
    Bytes stored;
    const HRESULT result = Encode(data, bytes, stored);
    return result < 0 ? result : GiveValue(*this, std::move(stored), out);
}

HRESULT TypeOfElements::TakePlain(IAAFPropertyValue* list, const void* data,
                                  PropertyValue** value) const {
    if (data == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    const HRESULT result = Take(list, value);
    return result >= 0 && form() != ValueForm::Data ? AAFRESULT_BAD_TYPE : result;
}

HRESULT TypeOfElements::ArrayOf(IAAFPropertyValue* list, aafMemPtr_t data, aafUInt32 bytes) const {
    PropertyValue* value = nullptr;
    const HRESULT result = TakePlain(list, data, &value);
    return result < 0 ? result : Decode(value->bytes().data(), value->bytes().size(), data, bytes);
}

HRESULT TypeOfElements::SetArray(IAAFPropertyValue* list, aafMemPtr_t data, aafUInt32 bytes) {
    PropertyValue* value = nullptr;
    HRESULT result = TakePlain(list, data, &value);
    Bytes stored;
    if (result >= 0) {
        result = Encode(data, bytes, stored);
    }
    if (result >= 0) {
        value->BytesToChange() = std::move(stored);
    }
    return result;
}

}  // namespace aaf
