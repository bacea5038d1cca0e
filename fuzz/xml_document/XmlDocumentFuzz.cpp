// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Any bytes as the text of a document; what is taken is walked whole.
#include <cstdint>
#include <cstdlib>
#include <string_view>

#include "fuzz/support/RunLimits.h"
#include "reference_host/framework/String.h"
#include "reference_host/xml/XmlDocument.h"

namespace {

void Touch(IXmlNode& node) {
    host::Ref<INCFString> text;
    if (node.GetName(text.Out()) < 0 || node.GetValue(text.Out()) < 0) {
        std::abort();
    }
}

void Walk(IXmlNode& node, int depth) {
    if (depth > 257) {
        std::abort();  // deeper than documents may be
    }
    Touch(node);
    host::Ref<IXmlAttributeList> attributes;
    if (node.GetAttributes(attributes.Out()) >= 0) {
        for (ncfUInt32 i = 0; i < attributes->GetCount(); ++i) {
            host::Ref<IXmlNode> attribute;
            if (attributes->GetItem(i, attribute.Out()) < 0) {
                std::abort();
            }
            Touch(*attribute);
        }
    }
    for (ncfUInt32 i = 0; i < node.GetChildCount(); ++i) {
        host::Ref<IXmlNode> child;
        if (node.GetChild(i, child.Out()) < 0) {
            std::abort();
        }
        Walk(*child, depth + 1);
    }
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    const fuzz::TimeLimit limit;
    const std::int64_t before = host::LiveObjectCount();
    {
        const auto document = host::MakeRef<host::XmlDocument>();
        const std::string_view bytes(reinterpret_cast<const char*>(data), size);
        host::Ref<INCFUnknown> root;
        const NCFRESULT loaded = document->LoadFromText(host::MakeString(bytes).get());
        if ((document->GetRootNode(root.Out()) >= 0) != (loaded >= 0)) {
            std::abort();
        }
        host::Ref<IXmlNode> node;
        if (root && host::Query(root.get(), node) >= 0) {
            Walk(*node, 1);
        }
    }
    if (host::LiveObjectCount() != before) {
        std::abort();
    }
    return 0;
}
