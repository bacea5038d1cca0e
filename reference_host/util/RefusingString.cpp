// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/util/RefusingString.h"

namespace host::util {

namespace {

template <class T>
NCFRESULT RefuseOutput(T** out) {
    if (out != nullptr) {
        *out = nullptr;
    }
    return NMA_E_NOTINITIALIZED;
}

class Refusing final : public INCFString {
public:
    NCFRESULT QueryInterface(const GUID& iid, void** out) override {
        if (out == nullptr) {
            return NCF_E_INVALIDARG;
        }
        const bool known = iid == IID_INCFString || iid == IID_INCFUnknown;
        *out = known ? static_cast<INCFString*>(this) : nullptr;
        return known ? NCF_OK : NCF_E_NOINTERFACE;
    }
    ncfUInt32 AddRef() override { return 2; }
    ncfUInt32 Release() override { return 1; }

    ncfUInt32 GetEncoding() override { return kNCFUTF16; }
    ncfUInt32 GetLength() override { return 0; }
    ncfBool IsEmpty() override { return 1; }
    NCFRESULT Assign(INCFString*) override { return NMA_E_NOTINITIALIZED; }
    NCFRESULT AssignUTF8(ncfUInt32, const ncfUTF8*, ncfUInt32) override {
        return NMA_E_NOTINITIALIZED;
    }
    NCFRESULT AssignUTF16(ncfUInt32, const ncfUTF16*, ncfUInt32) override {
        return NMA_E_NOTINITIALIZED;
    }
    NCFRESULT AssignWCHAR(ncfUInt32, const ncfWCHAR*, ncfUInt32) override {
        return NMA_E_NOTINITIALIZED;
    }
    NCFRESULT ConvertTo(ncfUInt32) override { return NMA_E_NOTINITIALIZED; }
    NCFRESULT ConvertCopy(ncfUInt32, INCFString** out) override { return RefuseOutput(out); }
    NCFRESULT GetRawUTF8(ncfUTF8** out) override { return RefuseOutput(out); }
    NCFRESULT GetRawUTF16(ncfUTF16** out) override { return RefuseOutput(out); }
    NCFRESULT GetRawUTF32(ncfUTF32** out) override { return RefuseOutput(out); }
    NCFRESULT GetRawWCHAR(ncfWCHAR** out) override { return RefuseOutput(out); }
    NCFRESULT FindCharacter(ncfUTF32, ncfSInt32, ncfBool, ncfSInt32*) override {
        return NMA_E_NOTINITIALIZED;
    }
    NCFRESULT FindWCHAR(const ncfWCHAR*, ncfUInt32, ncfUInt32, ncfSInt32*) override {
        return NMA_E_NOTINITIALIZED;
    }
};

}  // namespace

INCFString* RefusingString() {
    static Refusing string;
    return &string;
}

}  // namespace host::util
