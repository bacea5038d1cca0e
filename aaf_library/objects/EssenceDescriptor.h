// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/model/Enumerator.h"
#include "aaf_library/model/Object.h"
#include "host_interfaces/aaf/AAFDescriptors.h"
#include "host_interfaces/aaf/AAFLocators.h"
#include "not_implemented/AAFDescriptors.h"
#include "not_implemented/AAFLocators.h"

namespace aaf {

// What a source mob says of its essence, and where that essence may lie. Owned
// by the source mob, or by the multiple descriptor that it is a part of.
class EssenceDescriptor : public Implements<Object, IAAFEssenceDescriptor> {
public:
    // What kind a source mob with this descriptor counts as; the kinds without
    // a number of their own are physical.
    virtual aafMobKind_t MobKind() const { return kAAFPhysicalMob; }

    HRESULT CountLocators(aafUInt32* result) override {
        return ReadCount(prop::EssenceDescriptor_Locator, result);
    }
    HRESULT AppendLocator(IAAFLocator* locator) override {
        return AppendObject(prop::EssenceDescriptor_Locator, locator);
    }
    HRESULT PrependLocator(IAAFLocator* locator) override {
        return PrependObject(prop::EssenceDescriptor_Locator, locator);
    }
    HRESULT InsertLocatorAt(aafUInt32 index, IAAFLocator* locator) override {
        return InsertObjectAt(prop::EssenceDescriptor_Locator, index, locator);
    }
    HRESULT GetLocatorAt(aafUInt32 index, IAAFLocator** locator) override {
        return ReadObjectAt(prop::EssenceDescriptor_Locator, index, locator);
    }
    HRESULT RemoveLocatorAt(aafUInt32 index) override {
        return RemoveObjectAt(prop::EssenceDescriptor_Locator, index);
    }
    HRESULT GetLocators(IEnumAAFLocators** enumerator) override;
};

}  // namespace aaf
