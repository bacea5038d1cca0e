// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <optional>

#include "host_interfaces/parameters/ParameterIds.h"
#include "host_interfaces/parameters/ParameterValue.h"
#include "reference_host/framework/Component.h"
#include "reference_host/util/Ref.h"

namespace host {

// A value of 32 bits, or none: the one type that this host carries.
class ParameterValue final : public Component<IParameterValue> {
public:
    ParameterValue() = default;
    explicit ParameterValue(std::optional<ncfUInt32> number) : number_(number) {}

    NCFRESULT Clear() override;
    // NCF_E_NOTSUPPORTED for another type, NCF_E_INVALIDARG for another size; the
    // value is then as it was.
    NCFRESULT SetData(const GUID& type, const void* data, ncfUInt32 bytes, ncfUInt32 zero) override;
    NCFRESULT GetData(void* data, ncfUInt32 bytes) override;

private:
    std::optional<ncfUInt32> number_;
};

class ValueFactory final : public Component<IValueFactory> {
public:
    NCFRESULT CreateValue(IParameterValue** out) override;
};

}  // namespace host
