// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/framework/Console.h"
#include "host_interfaces/parameters/ParametersReader.h"
#include "reference_host/framework/Component.h"
#include "reference_host/parameters/ParameterDocument.h"
#include "reference_host/util/Ref.h"

namespace host {

// The reader component. A document is read whole before its handler hears of
// it, so one that is refused changes nothing; why it was refused goes to the
// console as a line for the user.
class ParametersReader final : public Component<IParametersReader> {
public:
    // The console may be missing.
    explicit ParametersReader(Ref<INCFConsole> console) : console_(std::move(console)) {}

    NCFRESULT SetHandler(NMA::IParametersHandler* handler) override;
    // NMA_E_NOTINITIALIZED without a handler.
    NCFRESULT Parse(INCFString* xml) override;

private:
    Ref<INCFConsole> console_;
    Ref<NMA::IParametersHandler> handler_;
};

}  // namespace host
