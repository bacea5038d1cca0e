// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/xml/RegisterXmlComponents.h"

#include <gtest/gtest.h>

#include "host_interfaces/xml/SaxParser.h"
#include "host_interfaces/xml/XmlDocument.h"
#include "host_interfaces/xml/XmlWriter.h"
#include "reference_host/framework/Host.h"

TEST(RegisterXmlComponents, MakesThemKnownToAHost) {
    host::Host host;
    host::Ref<INCFSaxParser> parser;
    EXPECT_EQ(NCF_CLASS_E_CLASSNOTAVAILABLE, host.Create(kCLSID_SaxParser, parser));
    host::RegisterXmlComponents(host);
    host::Ref<IXmlDocument> document;
    host::Ref<IXmlWriter> writer;
    EXPECT_EQ(NCF_OK, host.Create(kCLSID_SaxParser, parser));
    EXPECT_EQ(NCF_OK, host.Create(kCLSID_XmlDocument, document));
    EXPECT_EQ(NCF_OK, host.Create(kCLSID_XmlWriter, writer));
}
