// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <string>

#include "tests/support/fakes/FakeHost.h"
#include "tests/support/fakes/FakeObject.h"

// A host string that refuses one of its operations and else does what a real
// one does.
class StubbornString final : public FakeObject<INCFString> {
public:
    StubbornString(const std::string& text, std::string refused, NCFRESULT answer)
        : text_(MakeHostString(text)), refused_(std::move(refused)), answer_(answer) {}
    ~StubbornString() override { text_->Release(); }

    ncfUInt32 GetEncoding() override { return text_->GetEncoding(); }
    ncfUInt32 GetLength() override { return text_->GetLength(); }
    ncfBool IsEmpty() override { return text_->IsEmpty(); }
    NCFRESULT ConvertTo(ncfUInt32 encoding) override {
        return refused_ == "ConvertTo" ? answer_ : text_->ConvertTo(encoding);
    }
    NCFRESULT GetRawWCHAR(ncfWCHAR** out) override {
        if (refused_ == "GetRawWCHAR") {
            *out = nullptr;
            return answer_;
        }
        return text_->GetRawWCHAR(out);
    }
    NCFRESULT FindWCHAR(const ncfWCHAR* text, ncfUInt32 units, ncfUInt32 from,
                        ncfSInt32* at) override {
        return refused_ == "FindWCHAR" ? answer_ : text_->FindWCHAR(text, units, from, at);
    }

    // No codec's name is asked these.
    NCFRESULT Assign(INCFString*) override { return NCF_E_NOTIMPL; }
    NCFRESULT AssignUTF8(ncfUInt32, const ncfUTF8*, ncfUInt32) override { return NCF_E_NOTIMPL; }
    NCFRESULT AssignUTF16(ncfUInt32, const ncfUTF16*, ncfUInt32) override { return NCF_E_NOTIMPL; }
    NCFRESULT AssignWCHAR(ncfUInt32, const ncfWCHAR*, ncfUInt32) override { return NCF_E_NOTIMPL; }
    NCFRESULT ConvertCopy(ncfUInt32, INCFString**) override { return NCF_E_NOTIMPL; }
    NCFRESULT GetRawUTF8(ncfUTF8**) override { return NCF_E_NOTIMPL; }
    NCFRESULT GetRawUTF16(ncfUTF16**) override { return NCF_E_NOTIMPL; }
    NCFRESULT GetRawUTF32(ncfUTF32**) override { return NCF_E_NOTIMPL; }
    NCFRESULT FindCharacter(ncfUTF32, ncfSInt32, ncfBool, ncfSInt32*) override {
        return NCF_E_NOTIMPL;
    }

private:
    INCFString* text_;
    std::string refused_;
    NCFRESULT answer_;
};
