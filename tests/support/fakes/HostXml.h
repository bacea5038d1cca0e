// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/xml/SaxParser.h"
#include "host_interfaces/xml/XmlDocument.h"
#include "host_interfaces/xml/XmlWriter.h"
#include "reference_host/framework/Component.h"
#include "reference_host/xml/SaxParser.h"
#include "reference_host/xml/XmlDocument.h"
#include "reference_host/xml/XmlWriter.h"
#include "tests/support/fakes/FakeHost.h"

// Lets a fake host make the reference host's XML components.
inline void UseHostXml(FakeHost& fake) {
    const auto give = [](auto object, const GUID& iid, void** out) {
        return object->QueryInterface(iid, out);
    };
    fake.maker(kCLSID_SaxParser, [give](const GUID& iid, void** out) {
        return give(host::MakeRef<host::SaxParser>(), iid, out);
    });
    fake.maker(kCLSID_XmlDocument, [give](const GUID& iid, void** out) {
        return give(host::MakeRef<host::XmlDocument>(), iid, out);
    });
    fake.maker(kCLSID_XmlWriter, [give](const GUID& iid, void** out) {
        return give(host::MakeRef<host::XmlWriter>(), iid, out);
    });
}
