// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/framework/String.h"

#include <type_traits>

#include "reference_host/framework/Guard.h"
#include "reference_host/util/text/HostText.h"
#include "text/Encodings.h"

namespace host {

namespace {

// The caller's units, counted where they end with a zero.
template <class Unit>
std::basic_string_view<Unit> View(const Unit* text, ncfUInt32 units) {
    return text == nullptr               ? std::basic_string_view<Unit>()
           : units == kNCFZeroTerminated ? std::basic_string_view<Unit>(text)
                                         : std::basic_string_view<Unit>(text, units);
}

template <class Text, class Variant>
NCFRESULT RawBuffer(Variant& units, typename Text::value_type** out) {
    if (out == nullptr) {
        return NCF_E_POINTER;
    }
    Text* held = std::get_if<Text>(&units);
    *out = held == nullptr ? nullptr : held->data();
    return held == nullptr ? NCF_E_FAIL : NCF_OK;
}

}  // namespace

ncfUInt32 String::GetLength() {
    return std::visit([](const auto& text) { return static_cast<ncfUInt32>(text.size()); }, units_);
}

ncfBool String::IsEmpty() {
    return GetLength() == 0 ? 1 : 0;
}

std::u32string String::Text() const {
    return std::visit(
        [](const auto& text) -> std::u32string {
            using Held = std::decay_t<decltype(text)>;
            if constexpr (std::is_same_v<Held, std::string>) {
                return encodings::FromUtf8(text);
            } else if constexpr (std::is_same_v<Held, std::u16string>) {
                return encodings::FromUtf16(text);
            } else if constexpr (std::is_same_v<Held, std::wstring>) {
                return encodings::FromWide(text);
            } else {
                return text;
            }
        },
        units_);
}

NCFRESULT String::SetText(std::u32string_view text, ncfUInt32 encoding) {
    Units made;
    bool placed = false;
    switch (encoding) {
        case kNCFASCII:
            placed = encodings::ToAscii(text, made.emplace<std::string>());
            break;
        case kNCFUTF8:
            placed = encodings::ToUtf8(text, made.emplace<std::string>());
            break;
        case kNCFUTF16:
            placed = encodings::ToUtf16(text, made.emplace<std::u16string>());
            break;
        case kNCFUTF32:
            placed = encodings::ToUtf32(text, made.emplace<std::u32string>());
            break;
        case kNCFWCHAR:
            placed = encodings::ToWide(text, made.emplace<std::wstring>());
            break;
        default:
            return NCF_E_INVALIDARG;
    }
    if (!placed) {
        return NCF_E_FAIL;
    }
    units_ = std::move(made);
    encoding_ = encoding;
    return NCF_OK;
}

NCFRESULT String::Assign(INCFString* source) {
    return Guarded([&]() -> NCFRESULT {
        Need(source);
        return SetText(text::Read(source), source->GetEncoding());
    });
}

template <class Unit, class Decode>
NCFRESULT String::AssignUnits(ncfUInt32 keepAs, const Unit* text, ncfUInt32 units, Decode decode) {
    return Guarded([&] {
        Need(text != nullptr || units == 0);
        return SetText(decode(View(text, units)), keepAs);
    });
}

void String::HoldUtf8(std::string_view text) {
    if (auto* const held = std::get_if<std::string>(&units_)) {
        held->assign(text);  // which may be its own
    } else {
        units_ = std::string(text);
    }
    encoding_ = kNCFUTF8;
}

NCFRESULT String::AssignUTF8(ncfUInt32 keepAs, const ncfUTF8* text, ncfUInt32 units) {
    if (keepAs == kNCFUTF8) {
        return Guarded([&] {
            Need(text != nullptr || units == 0);
            HoldUtf8(View(text, units));
            return NCF_OK;
        });
    }
    return AssignUnits(keepAs, text, units, encodings::FromUtf8);
}

NCFRESULT String::AssignUTF16(ncfUInt32 keepAs, const ncfUTF16* text, ncfUInt32 units) {
    return AssignUnits(keepAs, text, units, encodings::FromUtf16);
}

NCFRESULT String::AssignWCHAR(ncfUInt32 keepAs, const ncfWCHAR* text, ncfUInt32 units) {
    return AssignUnits(keepAs, text, units, encodings::FromWide);
}

NCFRESULT String::ConvertTo(ncfUInt32 encoding) {
    if (encoding == encoding_) {
        return NCF_OK;
    }
    return Guarded([&] { return SetText(Text(), encoding); });
}

NCFRESULT String::ConvertCopy(ncfUInt32 encoding, INCFString** out) {
    return Guarded([&] {
        Need(out);
        *out = nullptr;
        Ref<String> copy = MakeRef<String>();
        const NCFRESULT result = copy->SetText(Text(), encoding);
        if (result >= 0) {
            *out = copy.Detach();
        }
        return result;
    });
}

NCFRESULT String::GetRawUTF8(ncfUTF8** out) {
    return RawBuffer<std::string>(units_, out);
}

NCFRESULT String::GetRawUTF16(ncfUTF16** out) {
    return RawBuffer<std::u16string>(units_, out);
}

NCFRESULT String::GetRawUTF32(ncfUTF32** out) {
    return RawBuffer<std::u32string>(units_, out);
}

NCFRESULT String::GetRawWCHAR(ncfWCHAR** out) {
    return RawBuffer<std::wstring>(units_, out);
}

Ref<String> MakeString(std::u32string_view text, ncfUInt32 encoding) {
    Ref<String> string = MakeRef<String>();
    string->SetText(text, encoding);
    return string;
}

Ref<String> MakeString(std::string_view utf8, ncfUInt32 encoding) {
    if (encoding == kNCFUTF8) {
        Ref<String> string = MakeRef<String>();
        string->HoldUtf8(utf8);
        return string;
    }
    return MakeString(encodings::FromUtf8(utf8), encoding);
}

template <class Text>
static NCFRESULT GiveMade(Text text, INCFString** out) {
    return Guarded([&] {
        Need(out);
        *out = nullptr;
        *out = MakeString(text).Detach();
        return NCF_OK;
    });
}

NCFRESULT GiveString(std::u32string_view text, INCFString** out) {
    return GiveMade(text, out);
}

NCFRESULT GiveString(std::string_view utf8, INCFString** out) {
    return GiveMade(utf8, out);
}

}  // namespace host
