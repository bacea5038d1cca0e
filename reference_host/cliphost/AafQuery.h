// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <algorithm>
#include <iterator>
#include <string>
#include <string_view>

#include "host_interfaces/aaf/AAFUnknown.h"
#include "reference_host/util/Ref.h"

namespace cliphost {

// Another interface of an object; empty when it has none.
template <class T>
host::Ref<T> As(IUnknown* object) {
    host::Ref<T> found;
    if (object) {
        void* raw = nullptr;
        const HRESULT result = object->QueryInterface(aafIdOf(static_cast<T*>(nullptr)), &raw);
        found = host::Ref<T>::Adopt(static_cast<T*>(raw));
        if (result < 0) {
            found.Reset();  // what a failed query leaves is the asker's all the same
        }
    }
    return found;
}

std::string Utf8(std::wstring_view wide);

// Room for a text of so many characters and a terminator, zero at first.
class WideBuffer {
public:
    explicit WideBuffer(std::size_t characters) {
        if (characters < std::size(few_)) {
            std::fill_n(few_, characters + 1, L'\0');
        } else {
            many_.resize(characters + 1);
        }
    }
    WideBuffer(const WideBuffer&) = delete;
    WideBuffer& operator=(const WideBuffer&) = delete;
    wchar_t* data() { return many_.empty() ? few_ : many_.data(); }

private:
    wchar_t few_[64];
    std::wstring many_;
};

// A text that is given in two steps, its size in bytes and then itself. Empty
// when there is none.
template <class Length, class Text>
std::string TextInTwoSteps(const Length& length, const Text& text) {
    aafUInt32 bytes = 0;
    if (length(&bytes) < 0 || bytes == 0) {
        return {};
    }
    WideBuffer wide(bytes / sizeof(aafCharacter));
    return text(wide.data(), bytes) < 0 ? std::string() : Utf8(wide.data());
}

// The same of an object, by two of its operations.
template <class Object>
std::string TextOf(Object* object, HRESULT (Object::*length)(aafUInt32*),
                   HRESULT (Object::*text)(aafCharacter*, aafUInt32)) {
    return object == nullptr
               ? std::string()
               : TextInTwoSteps(
                     [&](aafUInt32* bytes) { return (object->*length)(bytes); },
                     [&](aafCharacter* to, aafUInt32 bytes) { return (object->*text)(to, bytes); });
}

// And for one of several: of a member, of a value.
template <class Object, class Key>
std::string TextOf(Object* object, HRESULT (Object::*length)(Key, aafUInt32*),
                   HRESULT (Object::*text)(Key, aafCharacter*, aafUInt32), Key key) {
    return TextInTwoSteps(
        [&](aafUInt32* bytes) { return (object->*length)(key, bytes); },
        [&](aafCharacter* to, aafUInt32 bytes) { return (object->*text)(key, to, bytes); });
}

}  // namespace cliphost
