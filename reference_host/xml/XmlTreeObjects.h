// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <memory>

#include "reference_host/xml/XmlTree.h"

namespace host {

// New objects for parts of a tree. Only the tree calls these: it sees to it
// that there is one object at most for each node.
Ref<IXmlNode> MakeNodeObject(std::shared_ptr<XmlTree> tree, pugi::xml_node node);
Ref<IXmlNode> MakeAttributeObject(std::shared_ptr<XmlTree> tree, pugi::xml_attribute attribute);

}  // namespace host
