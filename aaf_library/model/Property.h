// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/model/Object.h"
#include "aaf_library/model/PropertyDefinition.h"
#include "not_implemented/AAFObjects.h"

namespace aaf {

// One property as an enumerator gives it: definition and value side by side.
class Property : public Implements<Unknown, IAAFProperty> {
public:
    explicit Property(Object& object) : object_(&object) {}
    void Set(PropertyDefinition& definition, PropertyValue& value) {
        definition_ = &definition;
        value_ = &value;
    }

    HRESULT GetDefinition(IAAFPropertyDef** propDef) override {
        return propDef == nullptr ? AAFRESULT_NULL_PARAM : GiveOut(definition_.get(), propDef);
    }
    HRESULT GetValue(IAAFPropertyValue** value) override {
        return value == nullptr ? AAFRESULT_NULL_PARAM : GiveOut(value_.get(), value);
    }

private:
    RefPtr<Object> object_;
    RefPtr<PropertyDefinition> definition_;
    RefPtr<PropertyValue> value_;
};

}  // namespace aaf
