// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/model/Object.h"
#include "host_interfaces/aaf/AAFDescriptors.h"
#include "not_implemented/AAFDescriptors.h"

namespace aaf {

// What a source mob says of its essence, and where that essence may lie. Owned
// by the source mob, or by the multiple descriptor that it is a part of.
class EssenceDescriptor : public Implements<Object, IAAFEssenceDescriptor> {
public:
    // What kind a source mob with this descriptor counts as; the kinds without
    // a number of their own are physical.
    virtual aafMobKind_t MobKind() const { return kAAFPhysicalMob; }

    HRESULT CountLocators(aafUInt32* result) override;
    HRESULT AppendLocator(IAAFLocator* locator) override;
    HRESULT PrependLocator(IAAFLocator* locator) override;
    HRESULT InsertLocatorAt(aafUInt32 index, IAAFLocator* locator) override;
    HRESULT GetLocatorAt(aafUInt32 index, IAAFLocator** locator) override;
    HRESULT RemoveLocatorAt(aafUInt32 index) override;
    HRESULT GetLocators(IEnumAAFLocators** enumerator) override;
};

}  // namespace aaf
