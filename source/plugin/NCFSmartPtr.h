// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <utility>

#include "host_interfaces/framework/ComponentFactory.h"
#include "host_interfaces/framework/ResultCodes.h"

// Holds one reference to a framework interface. An argument that passes an
// interface by value passes one of these, so the callee owns a reference for
// the length of the call.
template <class T>
class NCFSmartPtr {
public:
    NCFSmartPtr() = default;
    NCFSmartPtr(std::nullptr_t) {}
    NCFSmartPtr(T* pointer) : pointer_(pointer) { addRef(); }
    NCFSmartPtr(const NCFSmartPtr& other) : pointer_(other.pointer_) { addRef(); }
    NCFSmartPtr(NCFSmartPtr&& other) noexcept : pointer_(std::exchange(other.pointer_, nullptr)) {}
    ~NCFSmartPtr() { release(); }

    NCFSmartPtr& operator=(const NCFSmartPtr& other) {
        NCFSmartPtr(other).swap(*this);
        return *this;
    }
    NCFSmartPtr& operator=(NCFSmartPtr&& other) noexcept {
        NCFSmartPtr(std::move(other)).swap(*this);
        return *this;
    }
    NCFSmartPtr& operator=(T* pointer) {
        NCFSmartPtr(pointer).swap(*this);
        return *this;
    }

    T* operator->() const {
        if (!pointer_) {
            throw NCF_E_POINTER;
        }
        return pointer_;
    }

    // The pointer, without a new reference.
    T* inArg() const { return pointer_; }

    // The place for a callee to put a new reference; what was held is released.
    T** outArg() {
        release();
        return &pointer_;
    }

    // The same with nothing released: the callee may replace what is held.
    T** inOutArg() { return &pointer_; }

    // Gives the reference up to the caller.
    T* detach() {
        if (!pointer_) {
            throw NCF_E_POINTER;
        }
        return std::exchange(pointer_, nullptr);
    }

    // Takes over a reference that the caller owns.
    void attach(T* pointer) {
        release();
        pointer_ = pointer;
    }

    bool isNull() const { return pointer_ == nullptr; }
    explicit operator bool() const { return pointer_ != nullptr; }

    void swap(NCFSmartPtr& other) noexcept { std::swap(pointer_, other.pointer_); }

private:
    void addRef() const {
        if (pointer_) {
            pointer_->AddRef();
        }
    }
    void release() {
        if (T* held = std::exchange(pointer_, nullptr)) {
            held->Release();
        }
    }

    T* pointer_ = nullptr;
};

template <class T>
bool operator==(const NCFSmartPtr<T>& left, const NCFSmartPtr<T>& right) {
    return left.inArg() == right.inArg();
}
template <class T>
bool operator!=(const NCFSmartPtr<T>& left, const NCFSmartPtr<T>& right) {
    return !(left == right);
}

// Creates a component into `out`, whose former reference is released. The
// factory writes to a plain pointer, never through the smart pointer's own.
template <class T>
NCFRESULT ncfCreate(INCFComponentFactory* factory, const GUID& component, const GUID& iid,
                    NCFSmartPtr<T>& out) {
    if (!factory) {
        return NCF_E_POINTER;
    }
    void* created = nullptr;
    const NCFRESULT result = factory->CreateComponent(component, nullptr, iid, &created);
    out.attach(static_cast<T*>(created));
    return result;
}

// Asks an object for another of its interfaces.
template <class T>
NCFRESULT ncfQuery(INCFUnknown* object, const GUID& iid, NCFSmartPtr<T>& out) {
    if (!object) {
        return NCF_E_POINTER;
    }
    void* found = nullptr;
    const NCFRESULT result = object->QueryInterface(iid, &found);
    out.attach(static_cast<T*>(found));
    return result;
}
template <class T>
NCFRESULT ncfQuery(INCFUnknown* object, NCFSmartPtr<T>& out) {
    return ncfQuery(object, ncfIdOf(static_cast<T*>(nullptr)), out);
}
