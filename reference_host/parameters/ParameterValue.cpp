// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/parameters/ParameterValue.h"

#include <cstring>

#include "reference_host/framework/Guard.h"

namespace host {

NCFRESULT ParameterValue::Clear() {
    number_.reset();
    return NCF_OK;
}

NCFRESULT ParameterValue::SetData(const GUID& type, const void* data, ncfUInt32 bytes, ncfUInt32) {
    return Guarded([&] {
        ncfUInt32 number = 0;
        Need(data);
        Need(type == kValueTypeUInt32, NCF_E_NOTSUPPORTED);
        Need(bytes == sizeof number, NCF_E_INVALIDARG);
        std::memcpy(&number, data, sizeof number);
        number_ = number;
        return NCF_OK;
    });
}

NCFRESULT ParameterValue::GetData(void* data, ncfUInt32 bytes) {
    return Guarded([&] {
        const ncfUInt32 number = number_.value_or(0);
        Need(data);
        Need(bytes <= (number_ ? sizeof number : 0), NCF_E_FAIL);
        std::memcpy(data, &number, bytes);
        return NCF_OK;
    });
}

NCFRESULT ValueFactory::CreateValue(IParameterValue** out) {
    return Guarded([&] {
        Need(out);
        *out = nullptr;
        *out = MakeRef<ParameterValue>().Detach();
        return NCF_OK;
    });
}

}  // namespace host
