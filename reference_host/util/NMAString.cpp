// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "host_interfaces/util/NMAString.h"

#include <new>

#include "reference_host/util/Factory.h"
#include "reference_host/util/NMAStringState.h"
#include "reference_host/util/RefusingString.h"

namespace text = host::text;
using host::util::Quietly;

NMAString::NMAString() : state_(new (std::nothrow) State) {}

NMAString::NMAString(const NMAString& other) : NMAString() {
    *this = other;
}

NMAString::NMAString(const char* utf8) : NMAString() {
    if (state_ == nullptr) {
        return;
    }
    state_->encoding = kNCFUTF8;
    Quietly([&] { state_->TakeUtf8(utf8 == nullptr ? "" : utf8); });
}

NMAString::NMAString(INCFString* source, ncfUInt32 encoding) : NMAString() {
    if (state_ == nullptr) {
        return;
    }
    state_->encoding = encoding <= kNCFWCHAR ? encoding : kNCFUTF16;
    Quietly([&] { state_->Read(source); });
}

NMAString::~NMAString() {
    delete state_;
}

NMAString& NMAString::operator=(const NMAString& other) {
    if (this == &other || state_ == nullptr) {
        return *this;
    }
    State copy;
    if (other.state_ != nullptr) {
        const std::lock_guard<std::mutex> guard(other.state_->mutex);
        Quietly([&] {
            other.state_->LookAtShown();
            copy.TakeFrom(*other.state_);
        });
        copy.encoding = other.state_->encoding;
    }
    const std::lock_guard<std::mutex> guard(state_->mutex);
    state_->shown.Reset();
    state_->TakeOver(copy);
    state_->encoding = copy.encoding;
    return *this;
}

bool NMAString::operator==(const NMAString& other) const {
    if (this == &other) {
        return true;
    }
    const auto copyOf = [](const NMAString& string, State& copy) {
        if (string.state_ == nullptr) {
            return;
        }
        const std::lock_guard<std::mutex> guard(string.state_->mutex);
        string.state_->LookAtShown();
        copy.TakeFrom(*string.state_);
    };
    return Quietly(false, [&] {
        State mine;
        State others;
        copyOf(*this, mine);
        copyOf(other, others);
        return mine.Equals(others);
    });
}

NMAString& NMAString::operator+=(const NMAString& tail) {
    const NMAString copy(tail);  // the two may be one object
    if (state_ == nullptr || copy.state_ == nullptr) {
        return *this;
    }
    const std::lock_guard<std::mutex> guard(state_->mutex);
    Quietly([&] {
        state_->LookAtShown();
        // By characters: bytes that are no UTF-8 stay apart even where together they were some.
        std::u32string joined = state_->Characters() + copy.state_->Characters();
        state_->shown.Reset();
        state_->Take(std::move(joined));
    });
    return *this;
}

bool NMAString::IsEmpty() const {
    if (state_ == nullptr) {
        return true;
    }
    const std::lock_guard<std::mutex> guard(state_->mutex);
    return Quietly(true, [&] {
        state_->LookAtShown();
        return state_->IsEmpty();
    });
}

NCFRESULT NMAString::CreateString(INCFString** out) {
    if (out == nullptr) {
        return NCF_E_POINTER;
    }
    host::Ref<INCFString> made;
    const NCFRESULT result = host::util::CreateHostString(made);
    *out = made.Detach();
    return result;
}

INCFString* NMAString::InArg() const {
    if (state_ == nullptr) {
        return host::util::RefusingString();
    }
    const std::lock_guard<std::mutex> guard(state_->mutex);
    if (state_->shown) {
        return state_->shown.get();
    }
    host::Ref<INCFString> made;
    if (host::util::CreateHostString(made) < 0) {
        return host::util::RefusingString();
    }
    const NCFRESULT filled = Quietly(NCF_E_OUTOFMEMORY, [&] {
        const NCFRESULT result = text::Assign(made.get(), state_->Characters(), state_->encoding);
        // Text that has no form in the wanted encoding is shown all the same.
        return result >= 0 ? result : text::Assign(made.get(), state_->Characters(), kNCFUTF16);
    });
    if (filled < 0) {
        return host::util::RefusingString();
    }
    state_->shown = std::move(made);
    return state_->shown.get();
}

INCFString** NMAString::OutArg() {
    if (state_ == nullptr) {
        static INCFString* nowhere = nullptr;
        return &nowhere;
    }
    const std::lock_guard<std::mutex> guard(state_->mutex);
    state_->TakeUtf8({});
    return state_->shown.Out();
}

const char* NMAString::GetUTF8String() const {
    return state_ == nullptr ? "" : state_->Shown(&State::Utf8, "");
}

const ncfUTF16* NMAString::GetUTF16String() const {
    return state_ == nullptr ? u"" : state_->Shown(&State::Utf16, u"");
}

const wchar_t* NMAString::GetWCHARString() const {
    return state_ == nullptr ? L"" : state_->Shown(&State::Wide, L"");
}
