// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/parameters/RegisterParameterComponents.h"

#include <gtest/gtest.h>

#include "host_interfaces/parameters/ParameterIds.h"
#include "host_interfaces/parameters/ParameterSuite.h"
#include "host_interfaces/parameters/ParametersReader.h"
#include "reference_host/framework/Host.h"
#include "reference_host/framework/String.h"

namespace {

TEST(RegisterParameterComponents, MakesSuiteReaderAndFactory) {
    host::Host host;
    host::RegisterParameterComponents(host);
    {
        host::Ref<IParameterSuite> suite;
        EXPECT_EQ(host.Create(CompID_ParameterSuite, suite), NCF_OK);
        host::Ref<IParametersReader> reader;
        EXPECT_EQ(host.Create(CompID_ParametersReader, reader), NCF_OK);
        host::Ref<IValueFactory> factory;
        EXPECT_EQ(host.Create(kValueTypeUInt32, factory), NCF_OK);
        host::Ref<IParameterSuite> another;
        EXPECT_EQ(host.Create(CompID_ParameterSuite, another), NCF_OK);
        EXPECT_NE(suite.get(), another.get());
        host::Ref<IParametersReader> wrong;
        EXPECT_EQ(host.Create(CompID_ParameterSuite, wrong), NCF_E_NOINTERFACE);
    }
    EXPECT_EQ(host.LiveObjects(), 0);
}

}  // namespace
