// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <string>
#include <string_view>
#include <variant>

#include "host_interfaces/framework/String.h"
#include "reference_host/framework/Component.h"
#include "reference_host/util/Ref.h"

namespace host {

// The host's string component. Text is held in one encoding at a time, in a
// buffer that callers may write to.
class String final : public Component<INCFString> {
public:
    ncfUInt32 GetEncoding() override { return encoding_; }
    ncfUInt32 GetLength() override;
    ncfBool IsEmpty() override;
    NCFRESULT Assign(INCFString* source) override;
    NCFRESULT AssignUTF8(ncfUInt32 keepAs, const ncfUTF8* text, ncfUInt32 units) override;
    NCFRESULT AssignUTF16(ncfUInt32 keepAs, const ncfUTF16* text, ncfUInt32 units) override;
    NCFRESULT AssignWCHAR(ncfUInt32 keepAs, const ncfWCHAR* text, ncfUInt32 units) override;
    NCFRESULT ConvertTo(ncfUInt32 encoding) override;
    NCFRESULT ConvertCopy(ncfUInt32 encoding, INCFString** out) override;
    NCFRESULT GetRawUTF8(ncfUTF8** out) override;
    NCFRESULT GetRawUTF16(ncfUTF16** out) override;
    NCFRESULT GetRawUTF32(ncfUTF32** out) override;
    NCFRESULT GetRawWCHAR(ncfWCHAR** out) override;
    NCFRESULT FindCharacter(ncfUTF32 character, ncfSInt32 from, ncfBool forward,
                            ncfSInt32* at) override;
    NCFRESULT FindWCHAR(const ncfWCHAR* text, ncfUInt32 units, ncfUInt32 from,
                        ncfSInt32* at) override;

    // The text, one element for each character.
    std::u32string Text() const;
    // Holds `text` in `encoding`; NCF_E_FAIL, unchanged, when it has no place.
    NCFRESULT SetText(std::u32string_view text, ncfUInt32 encoding);
    // The same of a text that is to stay in UTF-8: its bytes as they are.
    void HoldUtf8(std::string_view text);

private:
    template <class Unit, class Decode>
    NCFRESULT AssignUnits(ncfUInt32 keepAs, const Unit* text, ncfUInt32 units, Decode decode);

    // ASCII and UTF-8 share the first.
    using Units = std::variant<std::string, std::u16string, std::u32string, std::wstring>;

    Units units_ = std::u16string();
    ncfUInt32 encoding_ = kNCFUTF16;
};

Ref<String> MakeString(std::u32string_view text, ncfUInt32 encoding = kNCFUTF16);
Ref<String> MakeString(std::string_view utf8, ncfUInt32 encoding = kNCFUTF16);

// Puts a new string into an interface output.
NCFRESULT GiveString(std::u32string_view text, INCFString** out);
NCFRESULT GiveString(std::string_view utf8, INCFString** out);

}  // namespace host
