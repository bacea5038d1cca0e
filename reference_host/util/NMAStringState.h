// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <memory>
#include <mutex>
#include <optional>
#include <string>

#include "host_interfaces/util/NMAString.h"
#include "reference_host/util/Ref.h"
#include "reference_host/util/text/HostText.h"
#include "text/Encodings.h"

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

// The text in the form that it came in, further forms as they are asked for, and the host string
// that shows it. UTF-8 is a form to come in because most texts do and are only ever read so: it
// tells apart whatever characters do, bytes that are no UTF-8 included.
//
// `shown` comes from InArg, or from a callee through OutArg. Whoever holds it
// may have changed it, so its text is looked at again at every use. Reading
// operations are const and may come from several threads at once, as for texts
// in tables that are read only after loading: hence the mutex. Whoever
// calls what is here holds it; Shown alone takes it itself.
struct NMAString::State {
    mutable std::mutex mutex;
    ncfUInt32 encoding = kNCFUTF16;
    host::Ref<INCFString> shown;

    void Take(std::u32string changed) {
        characters_ = std::move(changed);
        utf8_.reset();
        wider_.reset();
    }

    void TakeUtf8(std::string changed) {
        utf8_ = std::move(changed);
        characters_.reset();
        wider_.reset();
    }

    void TakeFrom(const State& other) {
        if (other.characters_) {
            Take(*other.characters_);
        } else {
            TakeUtf8(*other.utf8_);
        }
    }

    void TakeOver(State& other) {
        utf8_ = std::move(other.utf8_);
        characters_ = std::move(other.characters_);
        wider_.reset();
    }

    const std::u32string& Characters() {
        if (!characters_) {
            characters_ = encodings::FromUtf8(*utf8_);
        }
        return *characters_;
    }

    bool IsEmpty() const { return utf8_ ? utf8_->empty() : characters_->empty(); }

    bool Equals(State& other) {
        return characters_ || other.characters_ ? Characters() == other.Characters()
                                                : *utf8_ == *other.utf8_;
    }

    // What pointers show stays while the text does, so equal text leaves everything alone.
    void LookAtShown() {
        if (!shown) {
            return;
        }
        State current;
        current.Read(shown.get());
        if (!Equals(current)) {
            TakeOver(current);
        }
    }

    // Takes the text of a host string.
    void Read(INCFString* string) {
        host::text::AsHeld held = host::text::ReadAsHeld(string);
        if (auto* const utf8 = std::get_if<std::string>(&held)) {
            TakeUtf8(std::move(*utf8));
        } else {
            Take(std::move(std::get<std::u32string>(held)));
        }
    }

    // The forms that are shown, made when first asked for.
    const std::string& Utf8() {
        if (!utf8_) {
            utf8_ = encodings::ToUtf8Lossy(*characters_);
        }
        return *utf8_;
    }
    const std::u16string& Utf16() { return Wider(&WiderForms::utf16, encodings::ToUtf16Lossy); }
    const std::wstring& Wide() { return Wider(&WiderForms::wide, encodings::ToWideLossy); }

    // One of the forms as its units; `otherwise` without memory.
    template <class Unit>
    const Unit* Shown(const std::basic_string<Unit>& (State::*form)(), const Unit* otherwise) {
        const std::lock_guard<std::mutex> guard(mutex);
        return host::util::Quietly(otherwise, [&] {
            LookAtShown();
            return (this->*form)().c_str();
        });
    }

private:
    struct WiderForms {
        std::optional<std::u16string> utf16;
        std::optional<std::wstring> wide;
    };

    template <class Form, class Convert>
    const Form& Wider(std::optional<Form> WiderForms::*form, Convert convert) {
        if (!wider_) {
            wider_ = std::make_unique<WiderForms>();
        }
        std::optional<Form>& made = (*wider_).*form;
        if (!made) {
            made = convert(Characters());
        }
        return *made;
    }

    // One of these two is always there. Characters, where they are, are the text; UTF-8 beside
    // them may have replaced what has no place in it.
    std::optional<std::string> utf8_ = std::string();
    std::optional<std::u32string> characters_;
    std::unique_ptr<WiderForms> wider_;  // few texts have any
};
