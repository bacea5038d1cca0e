// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/parameters/RegisterParameterComponents.h"

#include "reference_host/framework/Host.h"
#include "reference_host/parameters/ParameterSuite.h"
#include "reference_host/parameters/ParameterValue.h"
#include "reference_host/parameters/ParametersReader.h"

namespace host {

void RegisterParameterComponents(Host& host) {
    host.RegisterComponent(CompID_ParameterSuite,
                           MakerOf([](INCFUnknown*) { return MakeRef<ParameterSuite>(); }));
    host.RegisterComponent(CompID_ParametersReader, MakerOf([](INCFUnknown* unknown) {
                               Ref<INCFConsole> console;
                               Query(unknown, console);
                               return MakeRef<ParametersReader>(std::move(console));
                           }));
    host.RegisterComponent(kValueTypeUInt32,
                           MakerOf([](INCFUnknown*) { return MakeRef<ValueFactory>(); }));
}

}  // namespace host
