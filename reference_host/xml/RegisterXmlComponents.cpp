// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/xml/RegisterXmlComponents.h"

#include "reference_host/framework/Host.h"
#include "reference_host/xml/SaxParser.h"
#include "reference_host/xml/XmlDocument.h"
#include "reference_host/xml/XmlWriter.h"

namespace host {

void RegisterXmlComponents(Host& host) {
    host.RegisterComponent(kCLSID_SaxParser,
                           MakerOf([](INCFUnknown*) { return MakeRef<SaxParser>(); }));
    host.RegisterComponent(kCLSID_XmlDocument,
                           MakerOf([](INCFUnknown*) { return MakeRef<XmlDocument>(); }));
    host.RegisterComponent(kCLSID_XmlWriter,
                           MakerOf([](INCFUnknown*) { return MakeRef<XmlWriter>(); }));
}

}  // namespace host
