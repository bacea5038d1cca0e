// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <utility>

namespace aaf {

// Holds one reference to an object or interface.
template <class T>
class RefPtr {
public:
    RefPtr() = default;
    RefPtr(std::nullptr_t) {}
    RefPtr(T* object) : object_(object) {
        if (object_ != nullptr) {
            object_->AddRef();
        }
    }
    RefPtr(const RefPtr& other) : RefPtr(other.object_) {}
    RefPtr(RefPtr&& other) noexcept : object_(other.Detach()) {}
    template <class U>
    RefPtr(const RefPtr<U>& other) : RefPtr(static_cast<T*>(other.get())) {}
    template <class U>
    RefPtr(RefPtr<U>&& other) : object_(static_cast<T*>(other.Detach())) {}
    ~RefPtr() {
        if (object_ != nullptr) {
            object_->Release();
        }
    }
    RefPtr& operator=(RefPtr other) noexcept {
        std::swap(object_, other.object_);
        return *this;
    }

    // Takes over a reference that the caller owns.
    static RefPtr Adopt(T* object) {
        RefPtr result;
        result.object_ = object;
        return result;
    }

    T* get() const { return object_; }
    T* operator->() const { return object_; }
    T& operator*() const { return *object_; }
    explicit operator bool() const { return object_ != nullptr; }

    // Hands the reference over to the caller.
    T* Detach() { return std::exchange(object_, nullptr); }

private:
    T* object_ = nullptr;
};

}  // namespace aaf
