// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <type_traits>
#include <utility>

#include "host_interfaces/aaf/AAFUnknown.h"

// The family of counted pointers that holds every interface of the AAF
// library: one reference each, released at the end of scope. They pass between
// functions by value, so that each callee owns a reference of its own.

// One counted reference to any object of the library.
class AAFCountedReference {
public:
    AAFCountedReference() = default;
    explicit AAFCountedReference(IUnknown* object) : rep_(object) { Acquire(); }
    AAFCountedReference(const AAFCountedReference& other) : rep_(other.rep_) { Acquire(); }
    AAFCountedReference(AAFCountedReference&& other) noexcept
        : rep_(std::exchange(other.rep_, nullptr)) {}
    AAFCountedReference& operator=(AAFCountedReference other) noexcept {
        std::swap(rep_, other.rep_);
        return *this;
    }
    ~AAFCountedReference() { Attach(nullptr); }

    IUnknown* Unknown() const { return rep_; }

    // Takes over a reference that the caller owns; what was held is released.
    void Attach(IUnknown* object) {
        if (IUnknown* const held = std::exchange(rep_, object)) {
            held->Release();
        }
    }

private:
    void Acquire() const {
        if (rep_) {
            rep_->AddRef();
        }
    }

    IUnknown* rep_ = nullptr;
};

// The same for one interface. Published interfaces have one base each, so the
// way back from the root is a plain cast.
template <class T>
class AAFRefCountedCOMReference : public AAFCountedReference {
public:
    using AAFCountedReference::AAFCountedReference;
    T* Get() const { return static_cast<T*>(Unknown()); }
};

// The place where a call puts a new reference, for the length of the call. The
// library writes it as a pointer to the interface, to the root or to void; each
// form has a slot of its own, so that nothing is written through a pointer of
// another type.
template <class T, class Reference>
class AAFOutArgument {
public:
    explicit AAFOutArgument(Reference& target) : target_(target) { target_.Attach(nullptr); }
    AAFOutArgument(const AAFOutArgument&) = delete;
    AAFOutArgument& operator=(const AAFOutArgument&) = delete;
    ~AAFOutArgument() {
        if (!interface_) {
            interface_ = static_cast<T*>(root_ ? root_ : static_cast<T*>(any_));
        }
        target_.Attach(interface_);
    }

    template <class Form>
    operator Form**() {
        if constexpr (std::is_same_v<Form, T>) {
            return &interface_;
        } else if constexpr (std::is_same_v<Form, IUnknown>) {
            return &root_;
        } else {
            static_assert(std::is_void_v<Form>, "an output of another interface");
            return &any_;
        }
    }

private:
    Reference& target_;
    T* interface_ = nullptr;
    IUnknown* root_ = nullptr;
    void* any_ = nullptr;
};

// Use as a pointer. An access through an empty one throws the text "_rep",
// which ends the description as an unexpected failure.
template <class T, class Reference>
class AAFSmartPointerBase {
public:
    AAFSmartPointerBase() = default;
    AAFSmartPointerBase(T* object) : reference_(object) {}

    T* operator->() const {
        T* const object = reference_.Get();
        if (!object) {
            throw "_rep";
        }
        return object;
    }
    operator T*() const { return reference_.Get(); }
    AAFOutArgument<T, Reference> operator&() { return AAFOutArgument<T, Reference>(reference_); }

private:
    Reference reference_;
};

template <class T>
class IAAFSmartPointer : public AAFSmartPointerBase<T, AAFRefCountedCOMReference<T>> {
public:
    using AAFSmartPointerBase<T, AAFRefCountedCOMReference<T>>::AAFSmartPointerBase;
};
