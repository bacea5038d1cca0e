// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <memory>

#include "host_interfaces/xml/XmlDocument.h"
#include "reference_host/framework/Component.h"

namespace host {

class XmlTree;

// The XML document component. A second load replaces the document, while nodes
// that were handed out keep the former one.
class XmlDocument final : public Component<IXmlDocument> {
public:
    NCFRESULT Load(INCFString* path) override;
    NCFRESULT LoadFromText(INCFString* text) override;
    NCFRESULT GetRootNode(INCFUnknown** out) override;

private:
    std::shared_ptr<XmlTree> tree_;
};

}  // namespace host
