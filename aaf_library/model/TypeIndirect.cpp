// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/model/TypeIndirect.h"

#include <algorithm>

#include "aaf_library/model/Model.h"
#include "aaf_library/model/StoredNumbers.h"

namespace aaf {

bool ReadIndirectHead(const Bytes& bytes, GUID* typeId) {
    if (bytes.size() < kIndirectHead) {
        return false;
    }
    *typeId = GuidAt(bytes.data() + 1);
    return true;
}

HRESULT TypeIndirect::Wrap(const TypeDefinition& actual, const void* native, std::size_t bytes,
                           Bytes& out) {
    if (actual.form() != ValueForm::Data) {
        return AAFRESULT_BAD_TYPE;
    }
    out.assign(1, kLittleEndianMark);
    AppendGuid(actual.id(), out);
    return actual.Encode(native, bytes, out) < 0 ? AAFRESULT_ILLEGAL_VALUE : AAFRESULT_SUCCESS;
}

HRESULT TypeIndirect::Open(IAAFPropertyValue* argument, PropertyValue** value,
                           TypeDefinition** actual) const {
    GUID id{};
    if (const HRESULT result = Take(argument, value); result < 0) {
        return result;
    }
    if (!ReadIndirectHead((*value)->bytes(), &id)) {
        return AAFRESULT_ILLEGAL_VALUE;
    }
    *actual = model()->FindType(id);
    return *actual == nullptr ? AAFRESULT_TYPE_NOT_FOUND : AAFRESULT_SUCCESS;
}

HRESULT TypeIndirect::CreateValueFromActualValue(IAAFPropertyValue* actualValue,
                                                 IAAFPropertyValue** indirectPropertyValue) {
    if (actualValue == nullptr || indirectPropertyValue == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    auto* actual = ImplementationAs<PropertyValue>(actualValue);
    if (actual == nullptr || actual->type().form() != ValueForm::Data) {
        return AAFRESULT_BAD_TYPE;
    }
    Bytes stored(1, kLittleEndianMark);
    AppendGuid(actual->type().id(), stored);
    stored.insert(stored.end(), actual->bytes().begin(), actual->bytes().end());
    return GiveValue(*this, std::move(stored), indirectPropertyValue);
}

HRESULT TypeIndirect::CreateValueFromActualData(IAAFTypeDef* actualType, aafMemPtr_t initData,
                                                aafUInt32 initDataSize,
                                                IAAFPropertyValue** indirectPropertyValue) {
    if (actualType == nullptr || initData == nullptr || indirectPropertyValue == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    TypeDefinition* actual = TypeOf(actualType, model());
    if (actual == nullptr) {
        return AAFRESULT_BAD_TYPE;
    }
    Bytes stored;
    const HRESULT result = Wrap(*actual, initData, initDataSize, stored);
    return result < 0 ? result : GiveValue(*this, std::move(stored), indirectPropertyValue);
}

HRESULT TypeIndirect::GetActualValue(IAAFPropertyValue* indirectPropertyValue,
                                     IAAFPropertyValue** actualPropertyValue) {
    PropertyValue* value = nullptr;
    TypeDefinition* actual = nullptr;
    if (actualPropertyValue == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    if (const HRESULT result = Open(indirectPropertyValue, &value, &actual); result < 0) {
        return result;
    }
    return GiveValue(*actual, Bytes(value->bytes().begin() + kIndirectHead, value->bytes().end()),
                     actualPropertyValue);
}

HRESULT TypeIndirect::GetActualSize(IAAFPropertyValue* indirectPropertyValue,
                                    aafUInt32* actualSize) {
    PropertyValue* value = nullptr;
    TypeDefinition* actual = nullptr;
    if (actualSize == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    const HRESULT result = Open(indirectPropertyValue, &value, &actual);
    if (result >= 0) {
        *actualSize = static_cast<aafUInt32>(actual->DecodedSize(
            value->bytes().data() + kIndirectHead, value->bytes().size() - kIndirectHead));
    }
    return result;
}

HRESULT TypeIndirect::GetActualType(IAAFPropertyValue* indirectPropertyValue,
                                    IAAFTypeDef** actualType) {
    PropertyValue* value = nullptr;
    TypeDefinition* actual = nullptr;
    if (actualType == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    const HRESULT result = Open(indirectPropertyValue, &value, &actual);
    return result < 0 ? result : GiveOut(actual, actualType);
}

HRESULT TypeIndirect::GetActualData(IAAFPropertyValue* propVal, aafMemPtr_t data,
                                    aafUInt32 dataSize) {
    PropertyValue* value = nullptr;
    TypeDefinition* actual = nullptr;
    if (data == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    if (const HRESULT result = Open(propVal, &value, &actual); result < 0) {
        return result;
    }
    return actual->Decode(value->bytes().data() + kIndirectHead,
                          value->bytes().size() - kIndirectHead, data, dataSize);
}

HRESULT TypeOpaque::GetActualTypeID(IAAFPropertyValue* opaquePropertyValue,
                                    aafUID_t* actualTypeID) {
    PropertyValue* value = nullptr;
    if (actualTypeID == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    if (const HRESULT result = Take(opaquePropertyValue, &value); result < 0) {
        return result;
    }
    return ReadIndirectHead(value->bytes(), actualTypeID) ? AAFRESULT_SUCCESS
                                                          : AAFRESULT_ILLEGAL_VALUE;
}

HRESULT TypeOpaque::GetHandle(IAAFPropertyValue* propVal, aafUInt32 handleSize,
                              aafDataBuffer_t handle, aafUInt32* bytesRead) {
    PropertyValue* value = nullptr;
    if (handle == nullptr || bytesRead == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    if (const HRESULT result = Take(propVal, &value); result < 0) {
        return result;
    }
    if (handleSize < value->bytes().size()) {
        return AAFRESULT_SMALLBUF;
    }
    std::copy(value->bytes().begin(), value->bytes().end(), handle);
    *bytesRead = static_cast<aafUInt32>(value->bytes().size());
    return AAFRESULT_SUCCESS;
}

HRESULT TypeOpaque::GetHandleBufLen(IAAFPropertyValue* propVal, aafUInt32* len) {
    PropertyValue* value = nullptr;
    if (len == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    const HRESULT result = Take(propVal, &value);
    if (result >= 0) {
        *len = static_cast<aafUInt32>(value->bytes().size());
    }
    return result;
}

HRESULT TypeOpaque::SetHandle(IAAFPropertyValue* propVal, aafUInt32 handleSize,
                              aafDataBuffer_t handle) {
    PropertyValue* value = nullptr;
    if (handle == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    if (const HRESULT result = Take(propVal, &value); result < 0) {
        return result;
    }
    if (handleSize < kIndirectHead) {
        return AAFRESULT_ILLEGAL_VALUE;
    }
    value->BytesToChange().assign(handle, handle + handleSize);
    return AAFRESULT_SUCCESS;
}

HRESULT TypeOpaque::CreateValueFromHandle(aafMemPtr_t initData, aafUInt32 initDataSize,
                                          IAAFPropertyValue** opaquePropertyValue) {
    if (initData == nullptr || opaquePropertyValue == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    if (initDataSize < kIndirectHead) {
        return AAFRESULT_ILLEGAL_VALUE;
    }
    return GiveValue(*this, Bytes(initData, initData + initDataSize), opaquePropertyValue);
}

}  // namespace aaf
