// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <utility>

#include "host_interfaces/framework/ComponentFactory.h"

namespace host {

// Holds one reference to an interface or a component. For the host's own code;
// only raw pointers cross to a module.
template <class T>
class Ref {
public:
    Ref() = default;
    Ref(std::nullptr_t) {}
    // Takes a reference of its own.
    explicit Ref(T* object) : object_(object) {
        if (object_ != nullptr) {
            object_->AddRef();
        }
    }
    Ref(const Ref& other) : Ref(other.object_) {}
    Ref(Ref&& other) noexcept : object_(std::exchange(other.object_, nullptr)) {}
    // A component's reference held as one of its interfaces.
    template <class Derived>
    Ref(const Ref<Derived>& other) : Ref(static_cast<T*>(other.get())) {}
    template <class Derived>
    Ref(Ref<Derived>&& other) : object_(other.Detach()) {}
    ~Ref() { Reset(); }

    Ref& operator=(Ref other) noexcept {
        std::swap(object_, other.object_);
        return *this;
    }

    // Takes over a reference that the caller holds.
    static Ref Adopt(T* object) {
        Ref ref;
        ref.object_ = object;
        return ref;
    }

    void Reset() {
        if (T* object = std::exchange(object_, nullptr)) {
            object->Release();
        }
    }
    // Gives the reference to the caller.
    T* Detach() { return std::exchange(object_, nullptr); }
    // Lets go, and gives the place for a callee to put a new reference.
    T** Out() {
        Reset();
        return &object_;
    }

    T* get() const { return object_; }
    T* operator->() const { return object_; }
    T& operator*() const { return *object_; }
    explicit operator bool() const { return object_ != nullptr; }

private:
    T* object_ = nullptr;
};

template <class T, class... Arguments>
Ref<T> MakeRef(Arguments&&... arguments) {
    return Ref<T>::Adopt(new T(std::forward<Arguments>(arguments)...));
}

// Gives back what a failed call left in its output: a component may hand a
// reference out before it fails, and whoever asked owns it all the same.
inline void ReleaseOutput(void*& out) {
    if (void* left = std::exchange(out, nullptr)) {
        static_cast<INCFUnknown*>(left)->Release();
    }
}

// Asks `from`, which is borrowed, for the interface that `out` holds.
template <class Interface>
NCFRESULT Query(INCFUnknown* from, Ref<Interface>& out) {
    out.Reset();
    if (from == nullptr) {
        return NCF_E_POINTER;
    }
    void* found = nullptr;
    const NCFRESULT result =
        from->QueryInterface(ncfIdOf(static_cast<const Interface*>(nullptr)), &found);
    if (result < 0) {
        ReleaseOutput(found);
    }
    out = Ref<Interface>::Adopt(static_cast<Interface*>(found));
    return result;
}

// Creates a component and asks it for the interface that `out` holds.
template <class Interface>
NCFRESULT Create(INCFComponentFactory& factory, const GUID& component, Ref<Interface>& out) {
    out.Reset();
    void* made = nullptr;
    const NCFRESULT result = factory.CreateComponent(
        component, nullptr, ncfIdOf(static_cast<const Interface*>(nullptr)), &made);
    if (result < 0) {
        ReleaseOutput(made);
    }
    out = Ref<Interface>::Adopt(static_cast<Interface*>(made));
    return result;
}

}  // namespace host
