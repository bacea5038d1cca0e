// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <string>
#include <utility>

#include "host_interfaces/aaf/AAFUnknown.h"

namespace cliphost {

// Holds one reference to an AAF interface.
template <class T>
class AafRef {
public:
    AafRef() = default;
    AafRef(const AafRef& other) : object_(other.object_) {
        if (object_) {
            object_->AddRef();
        }
    }
    AafRef(AafRef&& other) noexcept : object_(std::exchange(other.object_, nullptr)) {}
    ~AafRef() { Reset(); }
    AafRef& operator=(AafRef other) noexcept {
        std::swap(object_, other.object_);
        return *this;
    }

    void Reset() {
        if (T* object = std::exchange(object_, nullptr)) {
            object->Release();
        }
    }
    // Lets go, and gives the place for a callee to put a new reference.
    T** Out() {
        Reset();
        return &object_;
    }
    T* get() const { return object_; }
    T* operator->() const { return object_; }
    explicit operator bool() const { return object_ != nullptr; }

private:
    T* object_ = nullptr;
};

// Another interface of an object; empty when it has none.
template <class T>
AafRef<T> As(IUnknown* object) {
    AafRef<T> found;
    if (object) {
        void* raw = nullptr;
        const HRESULT result = object->QueryInterface(aafIdOf(static_cast<T*>(nullptr)), &raw);
        *found.Out() = static_cast<T*>(raw);
        if (result < 0) {
            found.Reset();  // what a failed query leaves is the asker's all the same
        }
    }
    return found;
}

std::string Utf8(const std::wstring& wide);
std::wstring Wide(const std::string& utf8);

// A text that an object gives in two steps, its size in bytes and then itself.
// Empty when it has none.
template <class Object>
std::string TextOf(Object* object, HRESULT (Object::*length)(aafUInt32*),
                   HRESULT (Object::*text)(aafCharacter*, aafUInt32)) {
    aafUInt32 bytes = 0;
    if (!object || (object->*length)(&bytes) < 0 || bytes == 0) {
        return {};
    }
    std::wstring wide(bytes / sizeof(aafCharacter) + 1, L'\0');
    if ((object->*text)(wide.data(), bytes) < 0) {
        return {};
    }
    return Utf8(wide.c_str());
}

}  // namespace cliphost
