// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/model/PropertyValue.h"

#include <algorithm>

#include "aaf_library/model/Model.h"
#include "aaf_library/model/Object.h"
#include "aaf_library/model/TypeDefinition.h"

namespace aaf {

namespace {

// An object must not come to contain itself.
bool IsWithin(const Object* candidate, const Object* holder) {
    while (holder != nullptr && holder != candidate) {
        holder = holder->owner();
    }
    return holder != nullptr;
}

}  // namespace

PropertyValue::PropertyValue(TypeDefinition& type, Bytes bytes)
    : type_(&type), bytes_(std::move(bytes)) {}

// The holder takes its values out before it lets them go, so none is left here.
PropertyValue::~PropertyValue() = default;

bool PropertyValue::HoldsObjects() const {
    const ValueForm form = type_->form();
    return form == ValueForm::StrongReference || form == ValueForm::StrongVector ||
           form == ValueForm::StrongSet;
}

void PropertyValue::Attach(Object& object, Object& owner) {
    object.owner_ = &owner;
    object.Keep();
}

void PropertyValue::Detach(Object& object) {
    object.owner_ = nullptr;
    if (!object.BelongsToModel()) {
        object.Free();
    }
}

void PropertyValue::TellHolder() {
    if (holder_ != nullptr) {
        model()->TellChange();
        holder_->OnValueChange(*this);
    }
}

void PropertyValue::SetStreamByteOrder(std::uint8_t order) {
    if (holder_ != nullptr) {
        model()->TellChange();
    }
    streamByteOrder_ = order;
}

HRESULT PropertyValue::InsertObject(std::size_t index, Object* object) {
    if (object == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    if (object->model() != model()) {
        return AAFRESULT_OBJECT_ALREADY_ATTACHED;
    }
    // What stands in a held list already has the holder for its owner. A free list has to be
    // searched: twice in it would leave the object with two owners as soon as the list is set on
    // an object.
    const bool taken =
        holder_ != nullptr
            ? object->owner() != nullptr || IsWithin(object, holder_)
            : type_->form() != ValueForm::StrongReference &&
                  std::any_of(objects_.begin(), objects_.end(),
                              [&](const RefPtr<Object>& at) { return at.get() == object; });
    if (taken) {
        return AAFRESULT_OBJECT_ALREADY_ATTACHED;
    }
    if (index < objects_.size()) {
        TellHolder();
    } else if (holder_ != nullptr) {
        model()->TellChange();
    }
    index = std::min(index, objects_.size());
    objects_.insert(objects_.begin() + static_cast<std::ptrdiff_t>(index), RefPtr<Object>(object));
    if (holder_ != nullptr) {
        Attach(*object, *holder_);
    }
    return AAFRESULT_SUCCESS;
}

void PropertyValue::RemoveObjectAt(std::size_t index) {
    const RefPtr<Object> object = objects_[index];
    TellHolder();
    if (holder_ != nullptr) {
        Detach(*object);
    }
    objects_.erase(objects_.begin() + static_cast<std::ptrdiff_t>(index));
}

void PropertyValue::ClearObjects() {
    while (!objects_.empty()) {
        RemoveObjectAt(objects_.size() - 1);
    }
}

void PropertyValue::SortByKey() {
    TellHolder();
    std::stable_sort(objects_.begin(), objects_.end(),
                     [](const RefPtr<Object>& left, const RefPtr<Object>& right) {
                         return left->UniqueKey() < right->UniqueKey();
                     });
}

HRESULT PropertyValue::EnterObject(Object& holder) {
    for (const RefPtr<Object>& object : objects_) {
        if (object->owner() != nullptr || IsWithin(object.get(), &holder)) {
            return AAFRESULT_OBJECT_ALREADY_ATTACHED;
        }
    }
    holder_ = &holder;
    Keep();
    for (const RefPtr<Object>& object : objects_) {
        Attach(*object, holder);
    }
    TellHolder();
    return AAFRESULT_SUCCESS;
}

void PropertyValue::LeaveObject() {
    if (holder_ == nullptr) {
        return;
    }
    TellHolder();
    holder_ = nullptr;
    for (const RefPtr<Object>& object : objects_) {
        Detach(*object);
    }
    Free();
}

HRESULT PropertyValue::GetType(IAAFTypeDef** typeDef) {
    return typeDef == nullptr ? AAFRESULT_NULL_PARAM : GiveOut(type_, typeDef);
}

HRESULT PropertyValue::IsDefinedType(aafBoolean_t* isDefined) {
    if (isDefined == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    *isDefined = asStored_ == nullptr ? kAAFTrue : kAAFFalse;
    return AAFRESULT_SUCCESS;
}

}  // namespace aaf
