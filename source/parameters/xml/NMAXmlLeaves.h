// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "source/parameters/xml/NMAXmlNode.h"

// The nodes without children: attributes, texts and CDATA sections.

namespace NMA::XMLUtils {

class NMAXmlAttribute final : public NMAXmlNode {
public:
    NMAXmlAttribute() = default;
    NMAXmlAttribute(const NMAString& name, const NMAString& value) : name_(name), value_(value) {}
    explicit NMAXmlAttribute(IXmlNode* hostNode) : NMAXmlNode(hostNode) {}

    void CopyTo(NMAXmlNode& target) override;
    NCFRESULT WriteTo(IXmlWriter* writer) override;
    // The stored text of an attribute that was made or changed in memory, else
    // the host's. A deleted one throws NMA_E_NODATA.
    void GetNodeName(NMAString& out) override;
    void GetNodeValue(NMAString& out) override;

    void SetValue(const NMAString& value);

private:
    NMAString name_;
    NMAString value_;
};

class NMAXmlText final : public NMAXmlNode {
public:
    NMAXmlText() = default;
    explicit NMAXmlText(const NMAString& text) : text_(text) {}
    explicit NMAXmlText(IXmlNode* hostNode) : NMAXmlNode(hostNode) {}

    void CopyTo(NMAXmlNode& target) override;
    NCFRESULT WriteTo(IXmlWriter* writer) override;

    // Empty when the node is deleted.
    NMAString GetText();

private:
    NMAString text_;
};

// Kept while the document lives; saving drops it.
class NMAXmlCDATA final : public NMAXmlNode {
public:
    NMAXmlCDATA() = default;
    explicit NMAXmlCDATA(IXmlNode* hostNode) : NMAXmlNode(hostNode) {}

    NCFRESULT WriteTo(IXmlWriter* writer) override;
};

}  // namespace NMA::XMLUtils
