// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <mutex>
#include <optional>
#include <string>

#include "host_interfaces/util/NMAString.h"
#include "reference_host/util/Ref.h"
#include "reference_host/util/text/HostText.h"

namespace host::util {

// Runs `body` and turns what it throws, memory that ran out, into `otherwise`.
template <class Result, class Body>
Result Quietly(Result otherwise, Body body) noexcept {
    try {
        return body();
    } catch (...) {
        return otherwise;
    }
}

// The same for a body without a result; whether it came to its end.
template <class Body>
bool Quietly(Body body) noexcept {
    return Quietly(false, [&] {
        body();
        return true;
    });
}

}  // namespace host::util

// The text, its forms as they are asked for, and the host string that shows it.
//
// `shown` comes from InArg, or from a callee through OutArg. Whoever holds it
// may have changed it, so its text is looked at again at every use. Reading
// operations are const and may come from several threads at once, as for texts
// in tables that are read only after loading: hence the mutex.
struct NMAString::State {
    mutable std::mutex mutex;
    std::u32string text;
    ncfUInt32 encoding = kNCFUTF16;
    host::Ref<INCFString> shown;
    std::optional<std::string> utf8;
    std::optional<std::u16string> utf16;
    std::optional<std::wstring> wide;

    void Take(std::u32string changed) {
        text = std::move(changed);
        utf8.reset();
        utf16.reset();
        wide.reset();
    }

    // Requires: the mutex is held. What pointers show stays while the text
    // does, so equal text leaves everything alone.
    void LookAtShown() {
        if (!shown) {
            return;
        }
        std::u32string current = host::text::Read(shown.get());
        if (current != text) {
            Take(std::move(current));
        }
    }

    // One of the forms, made when first asked for; `otherwise` without memory.
    template <class Form, class Convert>
    const typename Form::value_type* Shown(std::optional<Form> State::*form, Convert convert,
                                           const typename Form::value_type* otherwise) {
        const std::lock_guard<std::mutex> guard(mutex);
        return host::util::Quietly(otherwise, [&] {
            LookAtShown();
            std::optional<Form>& made = this->*form;
            if (!made) {
                made = convert(text);
            }
            return made->c_str();
        });
    }
};
