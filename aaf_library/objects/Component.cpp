// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/objects/Component.h"

#include "aaf_library/objects/Annotations.h"
#include "host_interfaces/aaf/AAFDefinitions.h"

namespace aaf {

HRESULT Component::SetLength(aafLength_constref length) {
    if (length < 0) {
        return AAFRESULT_BAD_LENGTH;
    }
    return PutInteger(prop::Component_Length, length);
}

HRESULT Component::GetLength(aafLength_t* length) {
    return ReadInteger(prop::Component_Length, length);
}

HRESULT Component::SetDataDef(IAAFDataDef* dataDef) {
    return PutWeak(prop::Component_DataDefinition, dataDef);
}

HRESULT Component::GetDataDef(IAAFDataDef** dataDef) {
    const HRESULT result = ReadWeak(prop::Component_DataDefinition, dataDef);
    return result == AAFRESULT_PROP_NOT_PRESENT ? AAFRESULT_OBJECT_NOT_FOUND : result;
}

HRESULT Component::AppendKLVData(IAAFKLVData* data) {
    return AppendObject(prop::Component_KLVData, data);
}

HRESULT Component::CountKLVData(aafUInt32* numData) {
    return ReadCount(prop::Component_KLVData, numData);
}

HRESULT Component::GetKLVData(IEnumAAFKLVData** enumerator) {
    return EnumerateList<IAAFKLVData>(this, prop::Component_KLVData, enumerator);
}

HRESULT Component::RemoveKLVData(IAAFKLVData* data) {
    return RemoveFromList(*this, prop::Component_KLVData, data);
}

HRESULT Component::AppendComment(aafCharacter_constptr name, aafCharacter_constptr value) {
    return AppendTaggedText(*this, prop::Component_UserComments, name, value);
}

HRESULT Component::CountComments(aafUInt32* numComments) {
    return ReadCount(prop::Component_UserComments, numComments);
}

HRESULT Component::GetComments(IEnumAAFTaggedValues** enumerator) {
    return EnumerateList<IAAFTaggedValue>(this, prop::Component_UserComments, enumerator);
}

HRESULT Component::RemoveComment(IAAFTaggedValue* comment) {
    return RemoveFromList(*this, prop::Component_UserComments, comment);
}

HRESULT Component::AppendAttribute(aafCharacter_constptr name, aafCharacter_constptr value) {
    return AppendTaggedText(*this, prop::Component_Attributes, name, value);
}

HRESULT Component::CountAttributes(aafUInt32* numAttributes) {
    return ReadCount(prop::Component_Attributes, numAttributes);
}

HRESULT Component::GetAttributes(IEnumAAFTaggedValues** enumerator) {
    return EnumerateList<IAAFTaggedValue>(this, prop::Component_Attributes, enumerator);
}

HRESULT Component::RemoveAttribute(IAAFTaggedValue* attribute) {
    return RemoveFromList(*this, prop::Component_Attributes, attribute);
}

HRESULT Filler::Initialize(IAAFDataDef* dataDef, aafLength_t length) {
    if (dataDef == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    if (length < 0) {
        return AAFRESULT_BAD_LENGTH;
    }
    const HRESULT result = SetDataDef(dataDef);
    return result < 0 ? result : SetLength(length);
}

}  // namespace aaf
