// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/objects/EssenceDescriptor.h"

namespace aaf {

HRESULT EssenceDescriptor::GetLocators(IEnumAAFLocators** enumerator) {
    return MakeEnumerator<IAAFLocator>(this, prop::EssenceDescriptor_Locator, enumerator);
}

}  // namespace aaf
