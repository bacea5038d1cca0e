// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/objects/EssenceDescriptor.h"

#include "aaf_library/model/Enumerator.h"
#include "host_interfaces/aaf/AAFLocators.h"
#include "not_implemented/AAFLocators.h"

namespace aaf {

HRESULT EssenceDescriptor::CountLocators(aafUInt32* result) {
    return ReadCount(prop::EssenceDescriptor_Locator, result);
}

HRESULT EssenceDescriptor::AppendLocator(IAAFLocator* locator) {
    return AppendObject(prop::EssenceDescriptor_Locator, locator);
}

HRESULT EssenceDescriptor::PrependLocator(IAAFLocator* locator) {
    return PrependObject(prop::EssenceDescriptor_Locator, locator);
}

HRESULT EssenceDescriptor::InsertLocatorAt(aafUInt32 index, IAAFLocator* locator) {
    return InsertObjectAt(prop::EssenceDescriptor_Locator, index, locator);
}

HRESULT EssenceDescriptor::GetLocatorAt(aafUInt32 index, IAAFLocator** locator) {
    return ReadObjectAt(prop::EssenceDescriptor_Locator, index, locator);
}

HRESULT EssenceDescriptor::RemoveLocatorAt(aafUInt32 index) {
    return RemoveObjectAt(prop::EssenceDescriptor_Locator, index);
}

HRESULT EssenceDescriptor::GetLocators(IEnumAAFLocators** enumerator) {
    return MakeEnumerator<IAAFLocator>(this, prop::EssenceDescriptor_Locator, enumerator);
}

}  // namespace aaf
