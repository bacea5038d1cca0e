// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <gtest/gtest.h>

#include <string>

#include "host_interfaces/util/NMAUtil.h"
#include "source/parameters/xml/NMAXmlDoc.h"
#include "source/parameters/xml/NMAXmlLeaves.h"
#include "tests/support/fakes/HostXml.h"

// A fake host with the reference host's XML components, and short forms for
// texts.
class XmlTest : public ::testing::Test {
protected:
    XmlTest() {
        UseHostXml(host);
        NMAInitialize(host.factory());
    }
    ~XmlTest() override { NMATerminate(); }

    using Doc = NMA::XMLUtils::NMAXmlDoc;
    using Element = NMA::XMLUtils::NMAXmlElement;

    static NMAString S(const char* text) { return NMAString(text); }

    static std::string TagOf(Element* element) {
        NMAString tag;
        element->GetTagName(tag);
        return tag.GetUTF8String();
    }
    static std::string TextOf(Element* element) {
        NMAString text;
        element->GetText(text);
        return text.GetUTF8String();
    }
    static std::string AttributeOf(Element* element, const char* name) {
        NMAString value;
        element->GetAttribute(S(name), value);
        return value.GetUTF8String();
    }
    static std::string Saved(Doc& doc) {
        NMAString text;
        doc.SaveToString(text);
        return text.GetUTF8String();
    }

    template <class Body>
    static NCFRESULT Thrown(Body body) {
        try {
            body();
        } catch (NCFRESULT thrown) {
            return thrown;
        }
        return NCF_OK;
    }

    FakeHost host;
};
